// A reporter without displays: it gathers error, warning, log and summary
// lines into one text and counts errors and warnings, for callers that only
// want the text a component reported.
#ifndef KELQLN_REPORTING_SHARED_SIMPLEREPORTER_H_
#define KELQLN_REPORTING_SHARED_SIMPLEREPORTER_H_

#include <cstdint>
#include <memory>
#include <string>

#include "automation/member_table.h"
#include "automation/server_module.h"
#include "entry/server_module.h"
#include "reporting/kel_reporter_api.h"

namespace kelqln {

class shared_simplereporter
    : public automation::DispatchImpl<shared_simplereporter>,
      public kelReporterApi {
 public:
  static constexpr char kProgId[] = "kelQLN.shared_simplereporter";
  static constexpr char kClassId[] = "{6B0C2E42-7A3D-4F1B-9C55-0E2A61D4B702}";

  // _shared_simplereporter
  static constexpr automation::DispId kReset = 0x60030004;
  static constexpr automation::DispId kText = 0x68030003;
  static constexpr automation::DispId kWarnings = 0x68030002;
  static constexpr automation::DispId kErrors = 0x68030001;

  static std::shared_ptr<shared_simplereporter> Create() {
    return std::make_shared<shared_simplereporter>();
  }
  static const automation::MemberTable<shared_simplereporter>& Members();

  void Reset();
  const std::string& Text() const { return text_; }
  int16_t Warnings() const { return warnings_; }
  int16_t Errors() const { return errors_; }

  // kelReporterApi. Only errors and warnings start a new line, and only
  // when some text is already there; log and summary texts are appended as
  // they are. The texts given are never changed.
  bool Cancel() override { return false; }
  void SetCancel(automation::Object) override {}
  void TickCount(int16_t, bool) override {}
  void TickText(const std::string&, bool) override {}
  void Tick(const std::string&) override {}
  int16_t Task(int16_t, int16_t, int16_t) override { return 0; }
  void ClearTask() override {}
  void ComponentCount(int16_t) override {}
  void Component(const std::string&) override {}
  void TotalClassCount(int16_t) override {}
  void ClassCount(int16_t) override {}
  void Class(const std::string&) override {}
  void TotalMemberCount(int16_t) override {}
  void MemberCount(int16_t) override {}
  void Member(const std::string&) override {}
  void Log(const std::string& text) override { text_ += text; }
  void Summary(const std::string& text) override { text_ += text; }
  // The 32768th warning or error is an overflow (6): its text is kept, the
  // count stays at 32767.
  void Warning(std::string& text) override;
  void Error(std::string& text) override;
  int16_t WarningCount() override { return warnings_; }
  int16_t ErrorCount() override { return errors_; }
  void ClearStatusCounts() override {}
  void ClearStatus() override {}
  void SetInformationType(int32_t) override {}
  int32_t InformationType() override { return 0; }

 private:
  void AppendLine(const std::string& text);

  std::string text_;
  int16_t errors_ = 0;
  int16_t warnings_ = 0;
  automation::ServerModule::LiveObject live_{KelQLNModule()};
};

}  // namespace kelqln

#endif  // KELQLN_REPORTING_SHARED_SIMPLEREPORTER_H_
