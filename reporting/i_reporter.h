// What the caller of a start operation holds afterwards: the run's errors,
// warnings, log lines and summary lines, and a way to add its own. The text
// operations take their text by value, so a reporter that rewrites the lines
// it is given never changes the caller's string.
#ifndef KELQLN_REPORTING_I_REPORTER_H_
#define KELQLN_REPORTING_I_REPORTER_H_

#include <memory>
#include <string>

#include "automation/collection.h"

namespace kelqln {

class IReporter {
 public:
  virtual ~IReporter() = default;

  virtual std::shared_ptr<automation::Collection> Errors() = 0;
  virtual std::shared_ptr<automation::Collection> Warnings() = 0;
  virtual std::shared_ptr<automation::Collection> Logs() = 0;
  virtual std::shared_ptr<automation::Collection> Summaries() = 0;
  virtual void Error(std::string text) = 0;
  virtual void Warning(std::string text) = 0;
  virtual void Log(std::string text) = 0;
  virtual void Summary(std::string text) = 0;
};

}  // namespace kelqln

#endif  // KELQLN_REPORTING_I_REPORTER_H_
