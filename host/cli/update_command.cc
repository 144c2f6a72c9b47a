#include "host/cli/update_command.h"

#include <filesystem>
#include <iostream>
#include <memory>
#include <system_error>

#include "automation/call.h"
#include "automation/class_registry.h"
#include "automation/collection.h"
#include "automation/error.h"
#include "automation/server_module.h"
#include "host/cli/exit_code.h"
#include "host/cli/file_lookup.h"
#include "host/cli/run_report.h"
#include "host/cli/run_selection.h"
#include "host/cli/tool_host.h"
#include "host/cli/update_callback.h"
#include "host/cli/usage_error.h"
#include "host/modeltool/application.h"
#include "host/modeltool/model.h"
#include "host/modeltool/model_writer.h"

namespace host::cli {
namespace {

namespace fs = std::filesystem;
using automation::Object;
using automation::Variant;

constexpr char kApiProgId[] = "kelQLN.API";

// A report that could not be written at the end would lose the run's
// account, so its place is checked before anything runs.
void CheckReportPath(const std::string& path) {
  if (path.empty()) return;
  std::error_code error;
  fs::path directory = fs::absolute(path, error).parent_path();
  if (fs::is_directory(path, error) || !fs::is_directory(directory, error)) {
    throw UsageError("--report " + path +
                     ": not a file in an existing "
                     "directory");
  }
}

std::vector<std::string> Texts(const Object& reporter, const char* name) {
  std::vector<std::string> texts;
  for (const Variant& item : automation::CollectionItems(
           automation::CObj(automation::GetByName(reporter, name)))) {
    texts.push_back(automation::CStr(item));
  }
  return texts;
}

// Why Start handed back Nothing, as the API object keeps it.
std::string StartFailure(const Object& api) {
  try {
    return automation::CStr(automation::GetByName(api, "LastError")) +
           " (error " +
           automation::CStr(automation::GetByName(api, "LastErrorNumber")) +
           ")";
  } catch (const automation::Error&) {
    return "no reason given";
  }
}

}  // namespace

void UpdateCommand::PrintLines(const std::vector<std::string>& lines) {
  for (const std::string& line : lines) out_ << line << '\n';
}

void UpdateCommand::ReadReporter(const Object& reporter, RunReport& report) {
  report.errors = Texts(reporter, "Errors");
  report.warnings = Texts(reporter, "Warnings");
  report.logs = Texts(reporter, "Logs");
  report.summaries = Texts(reporter, "Summaries");
}

int UpdateCommand::Run() {
  CheckReportPath(options_.report);
  ToolHost host(FindRegistryFile(options_.registry));
  std::shared_ptr<modeltool::Model> model = host.OpenModel(options_.model);
  Object selection = RunSelection(*model, options_.selects);
  automation::ServerLibrary::Load(FindAddInLibrary());

  model->SetSavesSkipped(options_.dry_run || options_.check);
  const std::string before = modeltool::ModelWriter::ToText(*model);
  if (!options_.quiet) {
    host.App()->SetLogSink(
        [this](const std::string& line) { out_ << line << std::endl; });
  }
  DeletionPolicy policy(options_.deletion, in_, err_);
  auto callback = std::make_shared<UpdateCallback>(policy);
  RunReport report;
  std::string failure = StartRun(host.App(), selection, callback, report);
  host.App()->SetLogSink(nullptr);
  report.deleted = callback->Deleted();
  if (!options_.quiet && !report.summaries.empty()) {
    // The summary repeats lines of the log: a blank line sets it apart.
    out_ << '\n';
    PrintLines(report.summaries);
  }
  PrintLines(report.warnings);
  PrintLines(report.errors);

  int code = report.errors.empty() ? kDone : kRunErrors;
  if (!failure.empty()) {
    // A run that broke off may have left the model half updated in memory.
    err_ << "kelqln: the update failed: " << failure << "; " << options_.model
         << " was left as it was\n";
    report.errors.push_back("The update failed: " + failure);
    code = kRunErrors;
  } else {
    bool changed = modeltool::ModelWriter::ToText(*model) != before;
    code = Conclude(*model, changed, code, report);
  }
  if (!options_.report.empty()) {
    try {
      report.Write(options_.report);
    } catch (const automation::Error& error) {
      err_ << "kelqln: " << error.Description() << '\n';
      code = kRunErrors;
    }
  }
  return code;
}

std::string UpdateCommand::StartRun(
    const Object& app, const Object& selection,
    const std::shared_ptr<UpdateCallback>& callback, RunReport& report) {
  Object api = automation::CreateObject(kApiProgId);
  try {
    Object reporter = automation::CObj(
        automation::CallByName(api, "Start", app, selection, Object(callback)));
    if (!reporter) return StartFailure(api);
    ReadReporter(reporter, report);
  } catch (const automation::Error& error) {
    return error.Description() + " (error " + std::to_string(error.Number()) +
           ")";
  }
  return callback->Completed() ? "" : "the run did not come to its end";
}

int UpdateCommand::Conclude(modeltool::Model& model, bool changed, int code,
                            RunReport& report) {
  const std::string& path = options_.model;
  std::string verdict;
  if (!changed) {
    verdict = options_.check ? path + " is in sync with its code."
                             : "No changes: " + path + " was left as it was.";
  } else if (options_.check) {
    verdict = path + " is out of date with its code.";
    if (code == kDone) code = kDrift;
  } else if (options_.dry_run) {
    verdict = "Dry run: " + path + " was not saved.";
  } else {
    try {
      model.Save();
      verdict = "Saved " + path + ".";
    } catch (const automation::Error& error) {
      err_ << "kelqln: " << error.Description() << '\n';
      report.errors.push_back(error.Description());
      return kRunErrors;
    }
  }
  if (!options_.quiet) out_ << verdict << '\n';
  return code;
}

}  // namespace host::cli
