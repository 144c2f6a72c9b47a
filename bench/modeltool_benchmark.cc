// The modelling tool with a large model: 10,000 classes of 20 members each
// (10 attributes, 10 operations with one parameter), in 100 components, each
// class inheriting from the one before it. Run build/bench/bench_modeltool.
#include <benchmark/benchmark.h>
#include <unistd.h>

#include <filesystem>
#include <string>

#include "automation/call.h"
#include "external/orel.h"
#include "host/modeltool/attribute.h"
#include "host/modeltool/class.h"
#include "host/modeltool/component.h"
#include "host/modeltool/component_package.h"
#include "host/modeltool/inherit_relation.h"
#include "host/modeltool/logical_package.h"
#include "host/modeltool/model.h"
#include "host/modeltool/model_writer.h"
#include "host/modeltool/operation.h"
#include "host/modeltool/parameter.h"

namespace host::modeltool {
namespace {

constexpr int kClasses = 10000;
constexpr int kComponents = 100;
constexpr int kMembersEach = 20;

std::shared_ptr<Model> BuildLargeModel() {
  auto model = Model::Create();
  auto components = model->RootComponentPackage();
  auto package = model->RootLogicalPackage()->NewPackage("Generated");
  std::vector<std::shared_ptr<Component>> modules;
  for (int c = 0; c < kComponents; ++c) {
    modules.push_back(components->NewComponent("Module" + std::to_string(c)));
    modules.back()->SetLanguage("C++");
  }
  std::shared_ptr<Class> previous;
  for (int i = 0; i < kClasses; ++i) {
    auto cls = package->NewClass("Class" + std::to_string(i));
    cls->AssignTo(modules[i % kComponents]);
    cls->CreateToolProperty("C++", "HeaderFile",
                            "src/class" + std::to_string(i) + ".h");
    for (int m = 0; m < kMembersEach / 2; ++m) {
      auto attribute = cls->NewAttribute("field" + std::to_string(m));
      attribute->SetType("int");
      auto operation = cls->NewOperation("Method" + std::to_string(m));
      operation->SetReturnType("void");
      operation->NewParameter("value", "const std::string&");
    }
    if (previous) cls->NewInheritRelation(previous->Name(), previous);
    previous = cls;
  }
  return model;
}

std::string TemporaryFile() {
  return (std::filesystem::temp_directory_path() /
          ("kelqln-bench-" + std::to_string(::getpid()) + ".json"))
      .string();
}

void BM_BuildModel(benchmark::State& state) {
  for (auto _ : state) benchmark::DoNotOptimize(BuildLargeModel());
}
BENCHMARK(BM_BuildModel)->Unit(benchmark::kMillisecond)->Iterations(3);

void BM_SaveModel(benchmark::State& state) {
  auto model = BuildLargeModel();
  std::string file = TemporaryFile();
  for (auto _ : state) model->SaveAs(file);
  state.counters["file_MB"] =
      static_cast<double>(std::filesystem::file_size(file)) / 1e6;
  state.counters["elements"] = static_cast<double>(model->ElementCount());
  std::filesystem::remove(file);
}
BENCHMARK(BM_SaveModel)->Unit(benchmark::kMillisecond)->Iterations(3);

void BM_LoadModel(benchmark::State& state) {
  std::string file = TemporaryFile();
  BuildLargeModel()->SaveAs(file);
  for (auto _ : state) benchmark::DoNotOptimize(Model::Load(file));
  std::filesystem::remove(file);
}
BENCHMARK(BM_LoadModel)->Unit(benchmark::kMillisecond)->Iterations(3);

// Member 213 of the all-classes collection, late-bound, in a large model.
void BM_FindClassByUniqueId(benchmark::State& state) {
  auto model = BuildLargeModel();
  automation::Object classes =
      automation::GetObject(model, external::orel::model::kAllClasses);
  std::string id = model->Classes()[kClasses / 2]->UniqueId();
  for (auto _ : state) {
    benchmark::DoNotOptimize(automation::Call(
        classes, external::orel::collection::kFindByUniqueId, id));
  }
}
BENCHMARK(BM_FindClassByUniqueId);

// Deleting a class from a large model, with its members and relations.
void BM_DeleteClass(benchmark::State& state) {
  auto model = BuildLargeModel();
  auto package = model->Classes().front()->Package();
  for (auto _ : state) {
    auto cls = model->Classes()[model->Classes().size() / 2];
    benchmark::DoNotOptimize(package->DeleteClass(cls));
  }
}
BENCHMARK(BM_DeleteClass)->Iterations(1000);

}  // namespace
}  // namespace host::modeltool
