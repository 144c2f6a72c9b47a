#include "reporting/shared_simplereporter.h"

#include "reporting/reporter_api_dispatch.h"

namespace kelqln {
namespace {

using automation::Args;
using automation::CallKind;
using automation::Variant;

// One more of a 16-bit count, with the language's overflow error.
int16_t Incremented(int16_t count) {
  return automation::CInt(Variant(int32_t{count} + 1));
}

}  // namespace

const automation::MemberTable<shared_simplereporter>&
shared_simplereporter::Members() {
  static const automation::MemberTable<shared_simplereporter> table(
      "shared_simplereporter",
      WithReporterApiRows<shared_simplereporter>({
          {kReset, "Reset", CallKind::kMethod,
           [](shared_simplereporter& self, Args&) {
             self.Reset();
             return Variant();
           }},
          {kText, "Text", CallKind::kPropertyGet,
           [](shared_simplereporter& self, Args&) {
             return Variant(self.text_);
           }},
          {kWarnings, "Warnings", CallKind::kPropertyGet,
           [](shared_simplereporter& self, Args&) {
             return Variant(self.warnings_);
           }},
          {kErrors, "Errors", CallKind::kPropertyGet,
           [](shared_simplereporter& self, Args&) {
             return Variant(self.errors_);
           }},
      }));
  return table;
}

void shared_simplereporter::Reset() {
  text_.clear();
  errors_ = 0;
  warnings_ = 0;
}

void shared_simplereporter::AppendLine(const std::string& text) {
  if (!text_.empty()) text_ += "\r\n";
  text_ += text;
}

void shared_simplereporter::Warning(std::string& text) {
  AppendLine(text);
  warnings_ = Incremented(warnings_);
}

void shared_simplereporter::Error(std::string& text) {
  AppendLine(text);
  errors_ = Incremented(errors_);
}

}  // namespace kelqln
