#include "selection/construction_trace.h"

#include <utility>

#include "automation/call.h"
#include "automation/case_folding.h"
#include "automation/error.h"
#include "entry/debug_log.h"
#include "platform/files.h"

namespace kelqln {
namespace {

constexpr int32_t kSynCategory = 2;

// Any object of this module serves to name the module.
const char kModuleAnchor = 0;

struct ModuleTag {
  std::string tag;
  int32_t category;
};

const ModuleTag& TagOfThisModule() {
  static const ModuleTag tag = [] {
    std::string name = platform::ModuleBaseName(&kModuleAnchor);
    if (automation::StartsWithIgnoreCase(name, "kelsyn")) {
      return ModuleTag{"SYN", kSynCategory};
    }
    if (automation::StartsWithIgnoreCase(name, "kelqln")) {
      return ModuleTag{"QLN", kDebugCategoryQln};
    }
    return ModuleTag{name, 0};
  }();
  return tag;
}

}  // namespace

ConstructionTrace::ConstructionTrace(std::string_view class_name,
                                     const void* object)
    : class_name_(class_name), object_(object) {
  on_ = ShouldLog(kDebugCategoryQln, kDebugLevelTrace) ||
        ShouldLog(kSynCategory, kDebugLevelTrace);
  if (!on_) return;
  const ModuleTag& module = TagOfThisModule();
  tag_ = module.tag;
  category_ = module.category;
  DebugLog("FinalConstruct " + class_name_ + " " + tag_ + ":" +
               std::to_string(reinterpret_cast<uintptr_t>(object_)),
           category_, kDebugLevelTrace);
}

void ConstructionTrace::Release(const automation::Object& held,
                                automation::DispId name_id) const noexcept {
  if (!on_) return;
  std::string name = "<Nothing>";
  if (held) {
    try {
      name = automation::CStr(automation::Get(held, name_id));
    } catch (const automation::Error&) {
      name = "<UNKNOWN>";
    }
  }
  DebugLog("    FinalRelease " + class_name_ + " " + tag_ + ":" +
               std::to_string(reinterpret_cast<uintptr_t>(object_)) + " " +
               name,
           category_, kDebugLevelTrace);
}

}  // namespace kelqln
