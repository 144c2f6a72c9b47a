#include "shared/model_element_utilities.h"

#include <memory>
#include <string>

#include "automation/call.h"
#include "automation/case_folding.h"
#include "automation/error.h"
#include "external/orel.h"
#include "platform/picture.h"

namespace kelqln {
namespace {

namespace orel = external::orel;
using automation::CStr;
using automation::EqualsIgnoreCase;
using automation::Get;
using automation::GetObject;
using automation::Object;

struct MinWindowSize {
  int32_t width = 0;
  int32_t height = 0;
};

MinWindowSize& MinSize() {
  static MinWindowSize size;
  return size;
}

std::string NameOf(const Object& element) {
  return CStr(Get(element, orel::element::kName));
}

std::string UniqueIdOf(const Object& element) {
  return CStr(Get(element, orel::element::kUniqueId));
}

int32_t CountOf(const Object& collection) {
  return automation::CLng(Get(collection, orel::collection::kCount));
}

Object ItemAt(const Object& collection, int32_t position) {
  return GetObject(collection, orel::collection::kGetAt, position);
}

Object FirstNamed(const Object& collection, std::string_view name) {
  return GetObject(collection, orel::collection::kFindByName, name);
}

bool MatchesComponentName(const Object& candidate, std::string_view name) {
  if (EqualsIgnoreCase(NameOf(candidate), name)) return true;
  std::string oca_name = CStr(
      Get(candidate, orel::element::kToolPropertyValue, "COM", "_OCAName"));
  return !oca_name.empty() && EqualsIgnoreCase(oca_name, name);
}

bool Implements(const Object& candidate, const Object& component) {
  Object dependency = FindImplementsDependency(candidate, component);
  return dependency &&
         EqualsIgnoreCase(CStr(Get(dependency, orel::dependency::kStereotype)),
                          "Implements");
}

}  // namespace

bool FindClassByNames(const Object& application, std::string_view class_name,
                      std::string_view component_name, Object& found_class,
                      Object& component) {
  found_class = nullptr;
  component = nullptr;
  if (component_name.empty()) return false;

  Object components =
      GetObject(GetObject(application, orel::application::kCurrentModel),
                orel::model::kAllComponents);
  component = FirstNamed(components, component_name);
  if (!component) {
    int32_t count = CountOf(components);
    for (int32_t i = 1; i <= count && !component; ++i) {
      Object candidate = ItemAt(components, i);
      if (MatchesComponentName(candidate, component_name)) {
        component = candidate;
      }
    }
  }
  if (!component) return false;

  component = ResolveImplementingComponent(component);
  found_class =
      FirstNamed(GetObject(component, orel::component::kClasses), class_name);
  return found_class != nullptr;
}

Object ResolveImplementingComponent(const Object& component) {
  Object components = GetObject(GetObject(component, orel::component::kModel),
                                orel::model::kAllComponents);
  const std::string name = NameOf(component);
  Object found = FirstNamed(components, name);
  if (found && Implements(found, component)) return found;

  int32_t count = CountOf(components);
  for (int32_t i = 1; i <= count; ++i) {
    Object candidate = ItemAt(components, i);
    if (EqualsIgnoreCase(NameOf(candidate), name) &&
        Implements(candidate, component)) {
      return candidate;
    }
  }
  return component;
}

Object FindImplementsDependency(const Object& candidate,
                                const Object& component) {
  try {
    const std::string unique_id = UniqueIdOf(component);
    Object dependencies = GetObject(candidate, orel::component::kDependencies);
    int32_t count = CountOf(dependencies);
    for (int32_t i = 1; i <= count; ++i) {
      Object dependency = ItemAt(dependencies, i);
      if (automation::CBool(
              Get(dependency, orel::dependency::kIsComponentDependency)) &&
          EqualsIgnoreCase(
              UniqueIdOf(GetObject(dependency, orel::dependency::kSupplier)),
              unique_id)) {
        return dependency;
      }
    }
  } catch (const automation::Error&) {
    // A component whose dependencies cannot be read implements nothing.
  }
  return nullptr;
}

Object GetOtherRole(const Object& role) {
  Object association = GetObject(role, orel::role::kAssociation);
  Object first = GetObject(association, orel::association::kRole1);
  if (UniqueIdOf(first) != UniqueIdOf(role)) return first;
  return GetObject(association, orel::association::kRole2);
}

Object IconToPicture(int32_t icon_handle) {
  if (icon_handle == 0) return nullptr;
  return std::make_shared<platform::Picture>(platform::kPicTypeIcon,
                                             icon_handle);
}

Object GetExclamationPicture() {
  return IconToPicture(platform::LoadStandardIcon(platform::kIdiExclamation));
}

void SetMinWindowSize(int32_t width, int32_t height) {
  MinSize() = MinWindowSize{width, height};
}

int32_t GetMinWindowWidth() { return MinSize().width; }

int32_t GetMinWindowHeight() { return MinSize().height; }

}  // namespace kelqln
