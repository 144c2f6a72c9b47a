#include "host/codeview/description_reader.h"

#include <filesystem>
#include <fstream>
#include <initializer_list>
#include <nlohmann/json.hpp>
#include <set>
#include <system_error>
#include <utility>

#include "automation/error.h"

namespace host::codeview {
namespace {

using Json = nlohmann::json;

constexpr const char* kVisibilities[] = {"public", "protected", "private",
                                         "package"};

// Walks the parsed file into a CodeProject; every complaint names the place
// in the file, e.g. "components[0].classes[2].attributes[1].type".
class Parser {
 public:
  explicit Parser(std::string file_name) : file_name_(std::move(file_name)) {}

  [[noreturn]] void Fail(const std::string& where, const std::string& what) {
    throw automation::Error(automation::kBadFileFormat,
                            file_name_ + ": " + where + ": " + what);
  }

  CodeProject Project(const Json& file) {
    const std::string top = "(file)";
    Fields(file, top, {"format", "version", "name", "id", "components"});
    if (Text(file, "format", top, true) != DescriptionReader::kFormatName) {
      Fail(top, std::string("\"format\" is not \"") +
                    DescriptionReader::kFormatName + "\"");
    }
    auto version = file.find("version");
    if (version == file.end() || !version->is_number_integer() ||
        version->get<int64_t>() != DescriptionReader::kVersion) {
      Fail(top,
           "\"version\" is not " + std::to_string(DescriptionReader::kVersion));
    }
    CodeProject project;
    project.name = Text(file, "name", top, false);
    project.unique_id = Text(file, "id", top, false);
    std::set<std::string> components;
    // Class names are unique in the whole project: a class is matched to
    // its model class by name.
    std::set<std::string> classes;
    Each(file, "components", top, [&](const Json& item, const std::string& at) {
      CodeComponent component = Component(item, at, classes);
      Unique(components, component.name, at, "component");
      project.components.push_back(std::move(component));
    });
    return project;
  }

 private:
  static std::string At(const std::string& where, const char* field) {
    return where == "(file)" ? field : where + "." + field;
  }

  void Fields(const Json& value, const std::string& where,
              std::initializer_list<const char*> allowed) {
    if (!value.is_object()) {
      Fail(where,
           std::string("expected an object, found ") + value.type_name());
    }
    for (const auto& [key, item] : value.items()) {
      bool known = false;
      for (const char* name : allowed) known = known || key == name;
      if (!known) Fail(where, "unknown field \"" + key + "\"");
    }
  }

  std::string Text(const Json& object, const char* field,
                   const std::string& where, bool required) {
    auto value = object.find(field);
    if (value == object.end()) {
      if (required) Fail(where, std::string("\"") + field + "\" is missing");
      return "";
    }
    if (!value->is_string()) {
      Fail(At(where, field),
           std::string("expected a text, found ") + value->type_name());
    }
    const auto& text = value->get_ref<const std::string&>();
    if (required && text.empty()) Fail(At(where, field), "is empty");
    return text;
  }

  std::string Name(const Json& object, const std::string& where) {
    return Text(object, "name", where, true);
  }

  bool Flag(const Json& object, const char* field, const std::string& where) {
    auto value = object.find(field);
    if (value == object.end()) return false;
    if (!value->is_boolean()) {
      Fail(At(where, field),
           std::string("expected true or false, found ") + value->type_name());
    }
    return value->get<bool>();
  }

  std::string Visibility(const Json& object, const std::string& where) {
    std::string text = Text(object, "visibility", where, false);
    if (text.empty()) return kPublic;
    for (const char* known : kVisibilities) {
      if (text == known) return text;
    }
    Fail(At(where, "visibility"), "\"" + text +
                                      "\" is none of public, protected, "
                                      "private, package");
  }

  // Calls `visit` for each item of the array `field` (a missing field is an
  // empty list).
  template <class Visit>
  void Each(const Json& object, const char* field, const std::string& where,
            Visit visit) {
    auto list = object.find(field);
    if (list == object.end()) return;
    std::string at = At(where, field);
    if (!list->is_array()) {
      Fail(at, std::string("expected a list, found ") + list->type_name());
    }
    for (size_t i = 0; i < list->size(); ++i) {
      visit((*list)[i], at + "[" + std::to_string(i) + "]");
    }
  }

  std::vector<std::string> Names(const Json& object, const char* field,
                                 const std::string& where, const char* what) {
    std::vector<std::string> names;
    std::set<std::string> seen;
    Each(object, field, where, [&](const Json& item, const std::string& at) {
      if (!item.is_string() || item.get_ref<const std::string&>().empty()) {
        Fail(at, "expected a class name");
      }
      Unique(seen, item.get<std::string>(), at, what);
      names.push_back(item.get<std::string>());
    });
    return names;
  }

  void Unique(std::set<std::string>& seen, const std::string& name,
              const std::string& where, const char* what) {
    if (!seen.insert(name).second) {
      Fail(where, std::string(what) + " \"" + name + "\" is described twice");
    }
  }

  CodeComponent Component(const Json& item, const std::string& at,
                          std::set<std::string>& class_names) {
    Fields(item, at, {"name", "classes"});
    CodeComponent component{Name(item, at), {}};
    Each(item, "classes", at, [&](const Json& value, const std::string& where) {
      CodeClass cls = Class(value, where);
      Unique(class_names, cls.name, where, "class");
      component.classes.push_back(std::move(cls));
    });
    return component;
  }

  CodeClass Class(const Json& item, const std::string& at) {
    Fields(item, at,
           {"name", "id", "stereotype", "attributes", "operations", "bases",
            "realizes", "has", "roles"});
    CodeClass cls;
    cls.name = Name(item, at);
    cls.unique_id = Text(item, "id", at, false);
    cls.stereotype = Text(item, "stereotype", at, false);
    std::set<std::string> seen;
    Each(item, "attributes", at, [&](const Json& value, const std::string& w) {
      Fields(value, w, {"name", "type", "visibility", "initialValue"});
      CodeAttribute attribute{Name(value, w), Text(value, "type", w, false),
                              Visibility(value, w),
                              Text(value, "initialValue", w, false)};
      Unique(seen, attribute.name, w, "attribute");
      cls.attributes.push_back(std::move(attribute));
    });
    seen.clear();
    Each(item, "operations", at, [&](const Json& value, const std::string& w) {
      CodeOperation operation = Operation(value, w);
      std::string signature = operation.name + "(";
      for (const CodeParameter& parameter : operation.parameters) {
        signature += parameter.type + ",";
      }
      Unique(seen, signature + ")", w, "operation");
      cls.operations.push_back(std::move(operation));
    });
    cls.bases = Names(item, "bases", at, "base");
    cls.realizes = Names(item, "realizes", at, "realized interface");
    seen.clear();
    Each(item, "has", at, [&](const Json& value, const std::string& w) {
      Fields(value, w, {"name", "class"});
      CodeHas has{Name(value, w), Text(value, "class", w, true)};
      Unique(seen, has.name, w, "has-relationship");
      cls.has.push_back(std::move(has));
    });
    seen.clear();
    Each(item, "roles", at, [&](const Json& value, const std::string& w) {
      Fields(value, w,
             {"name", "class", "association", "cardinality", "aggregate"});
      CodeRole role{Name(value, w), Text(value, "class", w, true),
                    Text(value, "association", w, false),
                    Text(value, "cardinality", w, false),
                    Flag(value, "aggregate", w)};
      Unique(seen, role.name, w, "role");
      cls.roles.push_back(std::move(role));
    });
    return cls;
  }

  CodeOperation Operation(const Json& item, const std::string& at) {
    Fields(item, at, {"name", "returnType", "visibility", "parameters"});
    CodeOperation operation{Name(item, at),
                            Text(item, "returnType", at, false),
                            Visibility(item, at),
                            {}};
    std::set<std::string> seen;
    Each(item, "parameters", at, [&](const Json& value, const std::string& w) {
      Fields(value, w, {"name", "type"});
      CodeParameter parameter{Name(value, w), Text(value, "type", w, false)};
      Unique(seen, parameter.name, w, "parameter");
      operation.parameters.push_back(std::move(parameter));
    });
    return operation;
  }

  std::string file_name_;
};

// The parser's message without its "[json.exception...] " prefix.
std::string ParseProblem(const std::exception& error) {
  std::string text = error.what();
  if (!text.empty() && text.front() == '[') {
    size_t end = text.find("] ");
    if (end != std::string::npos) text.erase(0, end + 2);
  }
  return text;
}

}  // namespace

CodeProject DescriptionReader::ReadText(std::string_view text,
                                        const std::string& file_name) {
  Parser parser(file_name);
  if (text.size() > kMaxFileSize) {
    parser.Fail("(file)",
                "larger than " + std::to_string(kMaxFileSize >> 20) + " MiB");
  }
  Json file;
  try {
    // Refused while parsing, before a hostile nesting costs anything.
    file = Json::parse(text, [&parser](int depth, Json::parse_event_t, Json&) {
      if (depth > kMaxNesting) {
        parser.Fail("(file)", "nested more than " +
                                  std::to_string(kMaxNesting) + " levels deep");
      }
      return true;
    });
  } catch (const Json::exception& error) {
    parser.Fail("(file)", "not JSON: " + ParseProblem(error));
  }
  return parser.Project(file);
}

CodeProject DescriptionReader::Read(const std::string& path) const {
  namespace fs = std::filesystem;
  std::error_code ignored;
  fs::file_status status = fs::status(path, ignored);
  if (!fs::exists(status)) {
    throw automation::Error(automation::kFileNotFound,
                            path + ": the file does not exist");
  }
  if (fs::is_directory(status)) {
    throw automation::Error(automation::kPathFileAccessError,
                            path + ": a directory, not a file");
  }
  std::ifstream in(path, std::ios::binary);
  if (!in) {
    throw automation::Error(automation::kPathFileAccessError,
                            path + ": the file cannot be read");
  }
  std::string text;
  char buffer[1 << 16];
  while (in.read(buffer, sizeof buffer) || in.gcount() > 0) {
    text.append(buffer, static_cast<size_t>(in.gcount()));
    if (text.size() > kMaxFileSize) break;
  }
  if (in.bad()) {
    throw automation::Error(automation::kPathFileAccessError,
                            path + ": the file cannot be read");
  }
  return ReadText(text, path);
}

}  // namespace host::codeview
