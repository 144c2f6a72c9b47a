#include "host/codeview/statement_generator.h"

#include <string>
#include <utility>

#include "automation/call.h"
#include "automation/case_folding.h"
#include "external/code_view.h"
#include "external/orel.h"

namespace host::codeview {

using automation::Args;
using automation::CallKind;
using automation::OptionalArg;
using automation::Variant;
namespace orel = external::orel;

StatementGenerator::StatementGenerator(
    std::shared_ptr<const AddInSettings> settings)
    : settings_(std::move(settings)) {}

bool StatementGenerator::Includes(const Variant& element, const Variant& item,
                                  const ReporterLink& reporter) const {
  auto refused = settings_->RefusedStereotypes();
  if (refused.empty()) return true;
  for (const Variant* candidate : {&item, &element}) {
    if (!candidate->IsObject() || candidate->IsNothing()) continue;
    const automation::Object& object = candidate->ObjectValue();
    std::string stereotype =
        automation::CStr(automation::Get(object, orel::element::kStereotype));
    for (const std::string& name : refused) {
      if (!automation::EqualsIgnoreCase(stereotype, name)) continue;
      reporter.Log(
          automation::CStr(automation::Get(object, orel::element::kName)) +
          ": the " + settings_->Name() +
          " add-in leaves out elements with stereotype \"" + stereotype + "\"");
      return false;
    }
  }
  return true;
}

const automation::MemberTable<StatementGenerator>&
StatementGenerator::Members() {
  static const automation::MemberTable<StatementGenerator> table(
      "StatementGenerator",
      {
          {external::code_view::statement_generator::kProcess,
           external::code_view::statement_generator::kProcessName,
           CallKind::kMethod,
           [](StatementGenerator& self, Args& args) {
             bool include =
                 self.Includes(OptionalArg(args, 0), OptionalArg(args, 1),
                               ReporterLink(OptionalArg(args, 3)));
             if (args.size() > 4) args[4] = Variant(include);
             return Variant(include);
           }},
      });
  return table;
}

}  // namespace host::codeview
