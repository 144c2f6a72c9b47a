// The user's settings of the "VisualStudio" add-in (ReadSetting and
// WriteSetting): texts by section and key, kept in a JSON file
// {"section": {"key": "value", ...}, ...}. Sections and keys match without
// regard to case. Every write goes to the file at once, atomically.
#ifndef KELQLN_HOST_MODELTOOL_SETTINGS_STORE_H_
#define KELQLN_HOST_MODELTOOL_SETTINGS_STORE_H_

#include <string>

namespace host::modeltool {

class SettingsStore {
 public:
  explicit SettingsStore(std::string path) : path_(std::move(path)) {}

  // $KELQLN_SETTINGS, else $XDG_CONFIG_HOME/kelqln/settings.json, else
  // $HOME/.config/kelqln/settings.json.
  static std::string DefaultPath();

  const std::string& Path() const { return path_; }

  // The stored text, or `fallback` when there is none (also when the file
  // does not exist). A file that is no settings file is
  // automation::kBadFileFormat "<file>: <what is wrong>".
  std::string Read(const std::string& section, const std::string& key,
                   const std::string& fallback) const;
  // Stores the text, making the file and its directory when needed.
  void Write(const std::string& section, const std::string& key,
             const std::string& value);

 private:
  std::string path_;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_SETTINGS_STORE_H_
