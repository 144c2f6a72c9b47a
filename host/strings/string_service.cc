#include "host/strings/string_service.h"

#include <utility>

#include "automation/class_registry.h"
#include "automation/error.h"
#include "external/string_service.h"

namespace host::strings {
namespace {

constexpr char kClassId[] = "{5B0E6C1A-2F47-4C1D-9A3E-7D2B8C4F6E10}";
constexpr char kSource[] = "kelres.Strings";

}  // namespace

StringService::StringService(std::shared_ptr<const StringTable> table)
    : table_(std::move(table)) {}

const automation::MemberTable<StringService>& StringService::Members() {
  using automation::Args;
  using automation::CallKind;
  using automation::Variant;
  namespace names = external::string_service;
  static const automation::MemberTable<StringService> table(
      "Strings",
      {
          {names::kNumber, "Number", CallKind::kMethod,
           [](StringService& self, Args& args) {
             return Variant(self.Number(
                 automation::CLng(automation::RequiredArg(args, 0))));
           }},
          {names::kText, "Text", CallKind::kMethod,
           [](StringService& self, Args& args) {
             return Variant(
                 self.Text(automation::CLng(automation::RequiredArg(args, 0))));
           }},
      });
  return table;
}

const std::string& StringService::Text(int32_t number) const {
  const std::string* text = table_->Find(number);
  if (text == nullptr) {
    throw automation::Error(
        automation::kInvalidProcedureCall,
        "The string service has no text number " + std::to_string(number),
        kSource);
  }
  return *text;
}

int32_t StringService::Number(int32_t number) const {
  const std::string& text = Text(number);
  try {
    return automation::CLng(automation::Variant(text));
  } catch (const automation::Error& error) {
    throw automation::Error(error.Number(),
                            "Text number " + std::to_string(number) +
                                " of the string service is not a number: '" +
                                text + "'",
                            kSource);
  }
}

void RegisterStringService() {
  automation::RegisterClass(external::string_service::kProgId, kClassId, [] {
    return std::make_shared<StringService>(StringTable::ForThisProcess());
  });
}

}  // namespace host::strings
