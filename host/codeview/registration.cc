#include "host/codeview/registration.h"

#include <memory>

#include "automation/class_registry.h"
#include "external/code_view.h"
#include "host/codeview/description_reader.h"
#include "host/codeview/language_add_in_server.h"
#include "host/codeview/vanished_element_collector.h"

namespace host::codeview {

void RegisterCodeViewClasses() {
  // One reader serves every description add-in: it keeps no state.
  auto reader = std::make_shared<const DescriptionReader>();
  automation::RegisterClass(kDescriptionProgId, "", [reader] {
    return automation::Object(std::make_shared<LanguageAddInServer>(reader));
  });
  automation::RegisterClass(external::code_view::collector::kProgId, "", [] {
    return automation::Object(std::make_shared<VanishedElementCollector>());
  });
}

}  // namespace host::codeview
