// Brings the model component of one project up to date with the project's
// code, in the two steps the system asks for:
//
// - the project's step collects the component's classes that no class of
//   the code stands for any more (class_matcher.h);
// - a component's step (or a single class's) makes sure each of its code
//   classes has a model class assigned to the model component, creating it
//   in the component's home package (home_package.h) when there is none,
//   and then updates each one (class_updater.h).
//
// Both steps work from the same matching, which the project keeps between
// them, so a class is never both updated and collected, and updating only
// some components never collects the classes of the others. A relation to a
// class of the project's code that has no model class yet creates that
// class at once (its own component's update fills it in), so one update
// makes every relation it can.
#ifndef KELQLN_HOST_CODEVIEW_MODEL_SYNCHRONIZER_H_
#define KELQLN_HOST_CODEVIEW_MODEL_SYNCHRONIZER_H_

#include <memory>
#include <string>
#include <unordered_map>
#include <vector>

#include "host/codeview/class_matcher.h"
#include "host/codeview/project_code.h"
#include "host/codeview/reporter_link.h"
#include "host/codeview/vanished_element_collector.h"
#include "host/modeltool/class.h"
#include "host/modeltool/component.h"
#include "host/modeltool/logical_package.h"
#include "host/modeltool/model.h"

namespace host::codeview {

class ModelSynchronizer {
 public:
  // `match` is the matching of `code` against this model and component; the
  // classes made here are entered into it. `tool` is the language's tool
  // name (for the tool properties the update writes).
  ModelSynchronizer(const ProjectCode& code, ClassMatch& match,
                    modeltool::Model& model,
                    const std::shared_ptr<modeltool::Component>& component,
                    std::string tool, const ReporterLink& reporter,
                    VanishedElementCollector& collector);

  void CollectVanishedClasses();
  // `classes` are positions in code.Classes().
  void UpdateClasses(const std::vector<size_t>& classes);

 private:
  // The model class of code class `index` while it is still in the model.
  std::shared_ptr<modeltool::Class> ModelClassOf(size_t index);
  std::shared_ptr<modeltool::Class> MakeClass(size_t index);
  std::shared_ptr<modeltool::Class> Resolve(const std::string& name);
  std::shared_ptr<modeltool::LogicalPackage> HomePackage();

  const ProjectCode& code_;
  ClassMatch& match_;
  modeltool::Model& model_;
  std::shared_ptr<modeltool::Component> component_;
  std::string tool_;
  const ReporterLink& reporter_;
  VanishedElementCollector& collector_;
  // The model's classes by name, made on first need; classes that vanished
  // from the code are left out, so nothing new refers to them.
  std::unordered_map<std::string, std::shared_ptr<modeltool::Class>>
      model_classes_;
  bool model_classes_ready_ = false;
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_MODEL_SYNCHRONIZER_H_
