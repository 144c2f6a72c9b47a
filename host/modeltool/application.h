// The modelling tool's application object: the current model, the add-in
// manager, the tool's log and the main window.
#ifndef KELQLN_HOST_MODELTOOL_APPLICATION_H_
#define KELQLN_HOST_MODELTOOL_APPLICATION_H_

#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "automation/member_table.h"

namespace host::modeltool {

class AddInManager;
class Model;

class Application : public automation::DispatchImpl<Application> {
 public:
  using LogSink = std::function<void(const std::string& line)>;

  // Use Create.
  Application();
  // An application with an empty current model and no add-ins.
  static std::shared_ptr<Application> Create();

  static const automation::MemberTable<Application>& Members();

  const std::shared_ptr<Model>& CurrentModel() const { return model_; }
  // Makes `model` current and this application its application.
  void SetCurrentModel(std::shared_ptr<Model> model);
  // Reads a model file and makes it current; when reading fails, the error
  // reaches the caller and the current model stays.
  std::shared_ptr<Model> OpenModel(const std::string& path);

  const std::shared_ptr<AddInManager>& AddIns() const { return add_ins_; }

  // A line of the tool's log: kept, and handed to the sink when there is one
  // (a command-line host prints the lines as they come).
  void Log(const std::string& line);
  const std::vector<std::string>& LogLines() const { return log_; }
  void SetLogSink(LogSink sink) { sink_ = std::move(sink); }

  // Set by the system before it shows a save dialog.
  bool SaveDialogPending() const { return save_dialog_pending_; }
  void SetSaveDialogPending(bool pending) { save_dialog_pending_ = pending; }

  // The main window's handle; 0 when the tool runs without a window.
  int32_t MainWindow() const { return main_window_; }
  void SetMainWindow(int32_t handle) { main_window_ = handle; }

 private:
  std::shared_ptr<Model> model_;
  std::shared_ptr<AddInManager> add_ins_;
  std::vector<std::string> log_;
  LogSink sink_;
  bool save_dialog_pending_ = false;
  int32_t main_window_ = 0;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_APPLICATION_H_
