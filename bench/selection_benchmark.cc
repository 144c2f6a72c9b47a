// Filing a whole model into a selection, and looking its components up, at
// two sizes: the work per element stays the same when the model grows
// tenfold (the time per element rises somewhat once the model outgrows the
// processor's caches, see BM_ReadModelOnly). The model has 10 classes per
// component, in three languages, with every tenth class assigned to two
// components and every twentieth to none. Run build/bench/bench_selection.
#include <benchmark/benchmark.h>

#include <map>
#include <memory>
#include <string>
#include <vector>

#include "automation/call.h"
#include "external/orel.h"
#include "host/modeltool/application.h"
#include "host/modeltool/class.h"
#include "host/modeltool/component.h"
#include "host/modeltool/component_package.h"
#include "host/modeltool/logical_package.h"
#include "host/modeltool/model.h"
#include "selection/kel_sorted_component.h"
#include "selection/kel_sorted_components.h"

namespace kelqln {
namespace {

using host::modeltool::Model;

struct World {
  std::shared_ptr<host::modeltool::Application> app;
  std::shared_ptr<Model> model;
};

// One model per size, built once.
const World& ModelOf(int components) {
  static std::map<int, World> worlds;
  World& world = worlds[components];
  if (world.model) return world;
  world.app = host::modeltool::Application::Create();
  world.model = Model::Create(host::modeltool::SequentialUniqueIds("ID"));
  world.app->SetCurrentModel(world.model);
  const char* languages[] = {"VB", "C++", "Java"};
  std::vector<std::shared_ptr<host::modeltool::Component>> modules;
  for (int c = 0; c < components; ++c) {
    modules.push_back(world.model->RootComponentPackage()->NewComponent(
        "Module" + std::to_string(c)));
    modules.back()->SetLanguage(languages[c % 3]);
  }
  auto package = world.model->RootLogicalPackage()->NewPackage("Generated");
  for (int i = 0; i < components * 10; ++i) {
    auto cls = package->NewClass("Class" + std::to_string(i));
    if (i % 20 == 19) continue;
    cls->AssignTo(modules[i % components]);
    if (i % 10 == 0) cls->AssignTo(modules[(i + 1) % components]);
  }
  return world;
}

void BM_GetAllComponentsAndClassesFromModel(benchmark::State& state) {
  const World& world = ModelOf(static_cast<int>(state.range(0)));
  for (auto _ : state) {
    kelSortedComponents selection;
    selection.SetIncludeALLComponents(true);
    selection.GetAllComponentsAndClassesFromModel(world.model);
    benchmark::DoNotOptimize(selection.GetIncludedLanguages());
  }
  state.SetItemsProcessed(
      state.iterations() *
      static_cast<int64_t>(world.model->Components().size() +
                           world.model->Classes().size()));
}
BENCHMARK(BM_GetAllComponentsAndClassesFromModel)
    ->Arg(500)
    ->Arg(5000)
    ->Unit(benchmark::kMillisecond);

// For comparison: only reading, late-bound, a few of the members filing
// reads of each class. A larger model no longer fits the processor's caches,
// which costs the tool's objects and the selection's alike; the number of
// instructions filing takes grows linearly.
void BM_ReadModelOnly(benchmark::State& state) {
  const World& world = ModelOf(static_cast<int>(state.range(0)));
  namespace orel = external::orel;
  for (auto _ : state) {
    automation::Object classes =
        automation::GetObject(world.model, orel::model::kAllClasses);
    int32_t count =
        automation::CLng(automation::Get(classes, orel::collection::kCount));
    for (int32_t i = 1; i <= count; ++i) {
      automation::Object cls = automation::CObj(
          automation::Call(classes, orel::collection::kGetAt, i));
      automation::Object comps =
          automation::CObj(automation::Call(cls, orel::class_::kComponents));
      benchmark::DoNotOptimize(
          automation::Get(comps, orel::collection::kCount));
      benchmark::DoNotOptimize(automation::Get(cls, orel::element::kUniqueId));
      benchmark::DoNotOptimize(
          automation::Get(cls, orel::element::kStereotype));
      benchmark::DoNotOptimize(automation::Get(cls, orel::class_::kAddInName));
    }
  }
}
BENCHMARK(BM_ReadModelOnly)->Arg(500)->Arg(5000)->Unit(benchmark::kMillisecond);

// Every component of the model found once by FindComponent, and once by
// FindComponentFromUniqueID with an identifier that is not there.
void BM_FindEveryComponent(benchmark::State& state) {
  const World& world = ModelOf(static_cast<int>(state.range(0)));
  kelSortedComponents selection;
  selection.SetIncludeALLComponents(true);
  selection.GetAllComponentsAndClassesFromModel(world.model);
  for (auto _ : state) {
    for (const auto& component : world.model->Components()) {
      benchmark::DoNotOptimize(selection.FindComponent(component));
      benchmark::DoNotOptimize(selection.FindComponentFromUniqueID("none"));
    }
  }
  state.SetItemsProcessed(
      state.iterations() *
      static_cast<int64_t>(world.model->Components().size()));
}
BENCHMARK(BM_FindEveryComponent)
    ->Arg(500)
    ->Arg(5000)
    ->Unit(benchmark::kMillisecond);

}  // namespace
}  // namespace kelqln
