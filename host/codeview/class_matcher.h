// Which model class stands for each class of a project's code.
//
// A code class takes, in this order: the class of the model component with
// the unique id the code records; the component's class of the same name;
// any class of the model with the recorded id; a class of the same name in
// the component's home package (home_package.h). Each model class stands
// for one code class at most. The component's classes that no code class
// took have vanished from the code.
//
// Matching only reads the model, so it can run before anything is changed
// (the element index uses it to learn the model's ids) and again at each
// update with the same result for the same code and model.
#ifndef KELQLN_HOST_CODEVIEW_CLASS_MATCHER_H_
#define KELQLN_HOST_CODEVIEW_CLASS_MATCHER_H_

#include <memory>
#include <vector>

#include "host/codeview/code_model.h"
#include "host/modeltool/class.h"
#include "host/modeltool/component.h"
#include "host/modeltool/model.h"

namespace host::codeview {

struct ClassMatch {
  // For each code class, in order: its model class, or nullptr.
  std::vector<std::shared_ptr<modeltool::Class>> model_of_code;
  // The component's classes that have no code class, in assignment order.
  std::vector<std::shared_ptr<modeltool::Class>> vanished;
};

ClassMatch MatchClasses(const std::vector<const CodeClass*>& code,
                        const modeltool::Component& component,
                        const modeltool::Model& model);

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_CLASS_MATCHER_H_
