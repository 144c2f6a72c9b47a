#include "host/codeview/reporter_link.h"

#include "automation/call.h"
#include "automation/error.h"
#include "external/reporter_api.h"

namespace host::codeview {

namespace api = external::reporter_api;

ReporterLink::ReporterLink(const automation::Variant& reporter) {
  // Late-bound callers pass 0 for "no reporter" as well.
  if (reporter.IsEmpty() || reporter.IsMissing() || reporter.IsNull() ||
      (reporter.IsNumeric() && automation::CDbl(reporter) == 0)) {
    return;
  }
  reporter_ = automation::CObj(reporter);
}

void ReporterLink::Log(const std::string& text) const { Send(api::kLog, text); }

void ReporterLink::Warning(const std::string& text) const {
  Send(api::kWarning, text);
}

void ReporterLink::Error(const std::string& text) const {
  Send(api::kError, text);
}

void ReporterLink::Send(const char* operation, const std::string& text) const {
  if (reporter_) automation::CallByName(reporter_, operation, text);
}

}  // namespace host::codeview
