// Where a model component's code is: the component's tool property
// "ProjectFile" of the language's tool. A relative path is taken from the
// directory of the model's file (from the current directory while the model
// has never been saved).
#ifndef KELQLN_HOST_CODEVIEW_PROJECT_FILE_H_
#define KELQLN_HOST_CODEVIEW_PROJECT_FILE_H_

#include <string>

#include "host/modeltool/component.h"

namespace host::codeview {

inline constexpr char kProjectFileProperty[] = "ProjectFile";

// The path of the project file, or "" when the component names none (a
// value of blanks names none).
std::string ProjectFileOf(const modeltool::Component& component,
                          const std::string& tool);

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_PROJECT_FILE_H_
