#include "selection/model_reads.h"

#include <algorithm>

#include "automation/call.h"
#include "external/orel.h"

namespace kelqln {

namespace orel = external::orel;
using automation::CStr;
using automation::Get;
using automation::Object;

std::string UniqueIdOf(const Object& element) {
  return CStr(Get(element, orel::element::kUniqueId));
}

std::string NameOf(const Object& element) {
  return CStr(Get(element, orel::element::kName));
}

std::string StereotypeOf(const Object& element) {
  return CStr(Get(element, orel::element::kStereotype));
}

std::string LanguageOf(const Object& component) {
  return CStr(Get(component, orel::component::kLanguage));
}

Object ApplicationOf(const Object& element) {
  return automation::GetObject(element, orel::element::kApplication);
}

std::vector<Object> ModelItems(const Object& collection) {
  int32_t count = automation::CLng(Get(collection, orel::collection::kCount));
  std::vector<Object> items;
  items.reserve(static_cast<size_t>(std::max(count, 0)));
  for (int32_t i = 1; i <= count; ++i) {
    items.push_back(automation::CObj(
        automation::Call(collection, orel::collection::kGetAt, i)));
  }
  return items;
}

std::vector<Object> ItemsOf(const Object& owner, automation::DispId id) {
  return ModelItems(automation::CObj(automation::Call(owner, id)));
}

}  // namespace kelqln
