// A silent update of a generated model: 200 components of 100 classes each
// (20,000 classes, two attributes and one operation each), whose code (read
// by the description add-in) adds an attribute to every class, one new class
// per component, and drops one class per component, which the run deletes.
// No pause between projects. The add-in's server is wrapped so that every
// call into the add-in's objects is timed: the counters split each run into
// the add-in's model updates, its reading of the code (the projects' open),
// the rest of its calls (the code-view projects and components asked for,
// which reads the code once more), and the engine's own work (selection,
// progress, reporting, deletions).
// Run build/bench/bench_engine.
#include <benchmark/benchmark.h>

#include <chrono>
#include <memory>
#include <string>
#include <utility>

#include "automation/call.h"
#include "automation/class_registry.h"
#include "automation/collection.h"
#include "entry/api.h"
#include "entry/run_globals.h"
#include "external/code_view.h"
#include "host/modeltool/attribute.h"
#include "host/modeltool/class.h"
#include "host/modeltool/component.h"
#include "host/modeltool/logical_package.h"
#include "host/modeltool/model.h"
#include "host/modeltool/operation.h"
#include "tests/support/update_scene.h"

namespace kelqln {
namespace {

using automation::Object;
using automation::Variant;
using Clock = std::chrono::steady_clock;

constexpr int kComponents = 200;
constexpr int kClassesEach = 100;
constexpr char kLanguage[] = "Bench";
constexpr char kTimedServer[] = "kelqlnBench.TimedDescription";

// Seconds spent inside the add-in, counted at the outermost call only.
struct AddInTime {
  double model_updates = 0;
  double opens = 0;  // reading the code
  double other = 0;
  int depth = 0;
};

AddInTime& Spent() {
  static AddInTime spent;
  return spent;
}

// Stands in front of an object of the add-in, and of every object it hands
// out, timing each call.
class Timed : public automation::Dispatch {
 public:
  explicit Timed(Object inner) : inner_(std::move(inner)) {}

  static Variant Wrap(Variant value) {
    if (!value.IsObject() || !value.ObjectValue()) return value;
    return Variant(Object(std::make_shared<Timed>(value.ObjectValue())));
  }

  Variant Invoke(automation::DispId id, automation::CallKind kind,
                 automation::Args& args) override {
    AddInTime& spent = Spent();
    bool outermost = spent.depth++ == 0;
    Clock::time_point start = Clock::now();
    Variant result;
    try {
      result = inner_->Invoke(id, kind, args);
    } catch (...) {
      --spent.depth;
      throw;
    }
    --spent.depth;
    if (outermost) {
      double seconds =
          std::chrono::duration<double>(Clock::now() - start).count();
      // Projects and components update the model through the same member.
      if (id == external::code_view::project::kUpdateModel) {
        spent.model_updates += seconds;
      } else if (id == external::code_view::project::kOpen) {
        spent.opens += seconds;
      } else {
        spent.other += seconds;
      }
    }
    return Wrap(std::move(result));
  }
  automation::DispId IdOfName(std::string_view name) const override {
    return inner_->IdOfName(name);
  }
  std::string TypeName() const override { return inner_->TypeName(); }

 private:
  Object inner_;
};

std::string Code(int component) {
  std::string prefix = "K" + std::to_string(component) + "_";
  std::string classes;
  // The last class of the model is gone from the code; one is new.
  for (int i = 0; i < kClassesEach; ++i) {
    std::string name = i + 1 < kClassesEach ? prefix + std::to_string(i)
                                            : "New" + std::to_string(component);
    classes += (i ? ",\n" : "") + std::string(R"({"name": ")") + name +
               R"(", "attributes": [{"name": "a", "type": "int"},
                 {"name": "b", "type": "int"}, {"name": "c", "type": "int"}],
               "operations": [{"name": "Run", "returnType": "void"}]})";
  }
  return R"({"format": "kelqln-code-description", "version": 1,
    "components": [{"name": "unit", "classes": [)" +
         classes + "]}]}";
}

class EngineBenchmark {
 public:
  EngineBenchmark() : scene_("bench-engine", {{kLanguage, kTimedServer}}) {
    // Tracing every selection entry would measure the log file.
    scene_.SetSetting(testing_support::UpdateScene::kSettingsAddIn, "Debug", 0);
    auto& model = *scene_.Model();
    auto package = model.RootLogicalPackage()->NewPackage("Generated");
    for (int c = 0; c < kComponents; ++c) {
      std::string name = "Component" + std::to_string(c);
      auto component = scene_.AddComponent(name, kLanguage);
      scene_.WriteCode(name, Code(c));
      for (int i = 0; i < kClassesEach; ++i) {
        auto cls = package->NewClass("K" + std::to_string(c) + "_" +
                                     std::to_string(i));
        cls->AssignTo(component);
        // As a first update would have left them: typed, and public.
        for (const char* name : {"a", "b"}) {
          auto attribute = cls->NewAttribute(name);
          attribute->SetType("int");
          attribute->OverrideToolProperty(kLanguage, "Visibility", "public");
        }
        auto operation = cls->NewOperation("Run");
        operation->SetReturnType("void");
        operation->OverrideToolProperty(kLanguage, "Visibility", "public");
      }
    }
    model.Save();
  }

  // A fresh copy of the generated model, and a selection of its components.
  Object Prepare() {
    auto model = scene_.App()->OpenModel(scene_.ModelPath());
    auto selection = automation::Collection::Create();
    for (const auto& component : model->Components()) {
      selection->Items().Add(Variant(Object(component)));
    }
    return selection;
  }

  // One silent run; its reporter, Nothing when it failed.
  std::shared_ptr<IReporter> Run(const Object& selection) {
    return API::Create()->Start(scene_.App(), selection, nullptr);
  }

  // Whether the run did all it should: no error, and one vanished class
  // deleted per component.
  static bool DidItAll(const std::shared_ptr<IReporter>& reporter) {
    if (!reporter || !reporter->Errors()->Items().Empty()) return false;
    int deleted = 0;
    for (const Variant& line : reporter->Logs()->Items()) {
      deleted += automation::CStr(line).rfind("Deleting class ", 0) == 0;
    }
    return deleted == kComponents;
  }

 private:
  testing_support::UpdateScene scene_;
};

void BM_SilentUpdate(benchmark::State& state) {
  automation::RegisterClass(kTimedServer, "", [] {
    return Object(std::make_shared<Timed>(
        automation::CreateObject(host::codeview::kDescriptionProgId)));
  });
  EngineBenchmark bench;
  double total = 0;
  Spent() = AddInTime();
  for (auto _ : state) {
    state.PauseTiming();
    Object selection = bench.Prepare();
    state.ResumeTiming();
    Clock::time_point start = Clock::now();
    std::shared_ptr<IReporter> reporter = bench.Run(selection);
    total += std::chrono::duration<double>(Clock::now() - start).count();
    state.PauseTiming();
    if (!EngineBenchmark::DidItAll(reporter)) {
      state.SkipWithError("the run did not do all it should");
    }
    state.ResumeTiming();
  }
  double runs = static_cast<double>(state.iterations());
  const AddInTime& spent = Spent();
  double in_add_in = spent.model_updates + spent.opens + spent.other;
  state.counters["addin_updates_s"] = spent.model_updates / runs;
  state.counters["addin_opens_s"] = spent.opens / runs;
  state.counters["addin_other_s"] = spent.other / runs;
  state.counters["engine_s"] = (total - in_add_in) / runs;
  state.counters["engine_share"] = (total - in_add_in) / total;
  ResetRunGlobals();
}
BENCHMARK(BM_SilentUpdate)->Unit(benchmark::kSecond)->Iterations(3);

}  // namespace
}  // namespace kelqln
