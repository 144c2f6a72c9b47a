// The modelling tool as the program plays it for the add-in library: the
// registry loaded, the classes of the host components registered (string
// service, save dialog, language add-ins), the application with the add-ins
// the registry installs, and the model read from its file.
#ifndef KELQLN_HOST_CLI_TOOL_HOST_H_
#define KELQLN_HOST_CLI_TOOL_HOST_H_

#include <memory>
#include <string>

namespace host::modeltool {
class Application;
class Model;
}  // namespace host::modeltool

namespace host::cli {

class ToolHost {
 public:
  // Loads `registry_file` and installs its add-ins. A malformed file raises
  // automation::Error naming the file and the line.
  explicit ToolHost(const std::string& registry_file);

  // Reads the model file and makes it the current model. automation::Error
  // naming the file when it is missing or no valid model.
  std::shared_ptr<modeltool::Model> OpenModel(const std::string& path);

  const std::shared_ptr<modeltool::Application>& App() const { return app_; }

 private:
  std::shared_ptr<modeltool::Application> app_;
};

}  // namespace host::cli

#endif  // KELQLN_HOST_CLI_TOOL_HOST_H_
