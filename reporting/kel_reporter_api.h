// The reporter interface a run reports through: progress counts, the names of
// the elements being worked on, log, summary, warning and error lines, and
// cancellation. Callers outside the library implement it too, so its
// operations keep the order of the interface's table of functions.
#ifndef KELQLN_REPORTING_KEL_REPORTER_API_H_
#define KELQLN_REPORTING_KEL_REPORTER_API_H_

#include <cstdint>
#include <string>

#include "automation/variant.h"

namespace kelqln {

class kelReporterApi {
 public:
  virtual ~kelReporterApi() = default;

  // Whether the run has been cancelled.
  virtual bool Cancel() = 0;
  // The object told "doCancel" when the run is cancelled; Nothing for none.
  virtual void SetCancel(automation::Object target) = 0;
  virtual void TickCount(int16_t count, bool with_delay) = 0;
  virtual void TickText(const std::string& text, bool clear) = 0;
  // `name` is the item just done.
  virtual void Tick(const std::string& name) = 0;
  virtual int16_t Task(int16_t component_count, int16_t class_count,
                       int16_t member_count) = 0;
  virtual void ClearTask() = 0;
  virtual void ComponentCount(int16_t count) = 0;
  virtual void Component(const std::string& name) = 0;
  virtual void TotalClassCount(int16_t count) = 0;
  virtual void ClassCount(int16_t count) = 0;
  virtual void Class(const std::string& name) = 0;
  virtual void TotalMemberCount(int16_t count) = 0;
  virtual void MemberCount(int16_t count) = 0;
  virtual void Member(const std::string& name) = 0;
  virtual void Log(const std::string& text) = 0;
  virtual void Summary(const std::string& text) = 0;
  // The reporter may rewrite `text` (a reporter that marks its lines leaves
  // the marked line in the caller's variable).
  virtual void Warning(std::string& text) = 0;
  virtual void Error(std::string& text) = 0;
  virtual int16_t WarningCount() = 0;
  virtual int16_t ErrorCount() = 0;
  virtual void ClearStatusCounts() = 0;
  virtual void ClearStatus() = 0;
  // A value the caller stores and reads back.
  virtual void SetInformationType(int32_t value) = 0;
  virtual int32_t InformationType() = 0;
};

}  // namespace kelqln

#endif  // KELQLN_REPORTING_KEL_REPORTER_API_H_
