// The reporter a code view is handed, reached late-bound by its operation
// names ("Log", "Warning", "Error"). A code view may be given Nothing (or no
// reporter at all): then it reports nothing. A reporter that fails passes
// its error on.
#ifndef KELQLN_HOST_CODEVIEW_REPORTER_LINK_H_
#define KELQLN_HOST_CODEVIEW_REPORTER_LINK_H_

#include <string>

#include "automation/variant.h"

namespace host::codeview {

class ReporterLink {
 public:
  ReporterLink() = default;
  // The reporter passed as an argument: an object, or Nothing, Empty,
  // Missing, Null or 0 for none; anything else is "Object required" (424).
  explicit ReporterLink(const automation::Variant& reporter);

  void Log(const std::string& text) const;
  void Warning(const std::string& text) const;
  void Error(const std::string& text) const;

 private:
  void Send(const char* operation, const std::string& text) const;

  automation::Object reporter_;
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_REPORTER_LINK_H_
