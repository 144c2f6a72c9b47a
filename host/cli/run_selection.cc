#include "host/cli/run_selection.h"

#include <memory>

#include "automation/collection.h"
#include "host/cli/usage_error.h"
#include "host/modeltool/component.h"
#include "host/modeltool/model.h"

namespace host::cli {
namespace {

std::shared_ptr<modeltool::Component> ComponentNamed(
    const modeltool::Model& model, const std::string& name) {
  std::shared_ptr<modeltool::Component> found;
  for (const auto& component : model.Components()) {
    if (component->Name() != name && component->DisplayName() != name) {
      continue;
    }
    if (found) {
      throw UsageError("--select " + name +
                       ": several components have that name; qualify it "
                       "with its packages (Package::Name)");
    }
    found = component;
  }
  if (!found) {
    throw UsageError("--select " + name + ": the model has no such component");
  }
  return found;
}

}  // namespace

automation::Object RunSelection(const modeltool::Model& model,
                                const std::vector<std::string>& selects) {
  auto selection = automation::Collection::Create();
  auto& items = selection->Items();
  if (selects.empty()) {
    for (const auto& component : model.Components()) {
      items.Add(automation::Variant(component->AsObject()));
    }
  }
  for (const std::string& select : selects) {
    size_t separator = select.find('\\');
    if (separator == std::string::npos) {
      items.Add(automation::Variant(ComponentNamed(model, select)->AsObject()));
    } else if (separator == 0 || separator + 1 == select.size()) {
      throw UsageError("--select " + select +
                       ": a class is selected as COMPONENT\\CLASS");
    } else {
      items.Add(automation::Variant(select));
    }
  }
  return selection;
}

}  // namespace host::cli
