// The code view of one model component: the component's project as a
// language add-in reads it, and the model updates made from it.
//
// Members (external/code_view.h): Language 1, Name 2, Components 3,
// UniqueID 4 (get and put), ElementIndex 5, Open 6 (reporter),
// UpdateModel 7 (model, reporter, collector, flag), Finish 8 (reporter),
// Release 9 (reporter). The flag of UpdateModel (False for a project, True
// for a component, as the system passes it) changes nothing: which part of
// the update is made follows from the object asked.
//
// The code is read when first needed and again at each Open. Open and the
// model updates report code that cannot be read: one error line on the
// reporter, then the error. The other members do not fail for it: such a
// project has no components and its element index finds nothing.
//
// Code-view components and elements are kept by name: the same name gives
// the same object as long as someone holds it, also across Open, so a
// selection made of them stays valid when the code is read again.
#ifndef KELQLN_HOST_CODEVIEW_CODE_VIEW_PROJECT_H_
#define KELQLN_HOST_CODEVIEW_CODE_VIEW_PROJECT_H_

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

#include "automation/collection.h"
#include "automation/error.h"
#include "automation/member_table.h"
#include "host/codeview/class_matcher.h"
#include "host/codeview/project_code.h"
#include "host/codeview/project_reader.h"
#include "host/codeview/reporter_link.h"
#include "host/modeltool/component.h"
#include "host/modeltool/model.h"

namespace host::codeview {

class CodeViewClass;
class CodeViewComponent;
class ElementIndex;

class CodeViewProject : public automation::DispatchImpl<CodeViewProject> {
 public:
  // `language` is the add-in's name; `project_file` the path the code is
  // read from.
  CodeViewProject(std::string language, std::string project_file,
                  const std::shared_ptr<modeltool::Component>& component,
                  std::shared_ptr<const ProjectReader> reader);

  static const automation::MemberTable<CodeViewProject>& Members();

  const std::string& Language() const { return language_; }
  const std::string& ProjectFile() const { return project_file_; }
  // The model component the project was made for; nullptr once it is gone.
  std::shared_ptr<modeltool::Component> ModelComponent() const {
    return component_.lock();
  }

  // The code's project name, else the project file's name without
  // extension.
  std::string Name();
  // The identifier given with the put, else the one the code records.
  std::string UniqueId();
  // The code as last read (read now when it has not been), or nullptr when
  // it cannot be read.
  const ProjectCode* Code();
  // Why the code cannot be read; "" when it can or has not been tried.
  std::string LoadProblem() const {
    return load_error_ ? load_error_->Description() : "";
  }

  // Reads the code again. A failure writes one error line on the reporter
  // and raises.
  void Open(const ReporterLink& reporter);
  // The project's part of a model update: collects the classes of the
  // model component that are gone from the code.
  void UpdateModel(const automation::Variant& model,
                   const ReporterLink& reporter,
                   const automation::Variant& collector);
  // A component's (or one class's) part: the classes of the code component
  // `name` (or the class `name`).
  void UpdateComponent(const std::string& name,
                       const automation::Variant& model,
                       const ReporterLink& reporter,
                       const automation::Variant& collector);
  void UpdateClass(const std::string& name, const automation::Variant& model,
                   const ReporterLink& reporter,
                   const automation::Variant& collector);
  // Lets go of the code read; the next use reads it again.
  void Release();

  std::shared_ptr<automation::Collection> Components();
  std::shared_ptr<ElementIndex> Index();
  std::shared_ptr<CodeViewComponent> ComponentObject(const std::string& name);
  std::shared_ptr<CodeViewClass> ClassObject(const std::string& name);
  // The id of the model class code class `index` stands for, once matched;
  // else the id the code records.
  std::string ClassUniqueId(size_t index);
  // The name of the code component holding the class `name`; "" when none.
  std::string ComponentOfClass(const std::string& name);

 private:
  std::shared_ptr<CodeViewProject> Self() {
    return std::static_pointer_cast<CodeViewProject>(shared_from_this());
  }
  const ProjectCode& RequireCode(const ReporterLink& reporter);
  void Load();
  void Failed(const ReporterLink& reporter, const automation::Error& error);
  // The model component, which must be in `model`.
  std::shared_ptr<modeltool::Component> RequireComponent(
      const modeltool::Model& model);
  // The matching of the code against `model`, made when none is kept for
  // this model and this reading of the code (or `fresh` asks for it).
  ClassMatch& Match(const modeltool::Model& model,
                    const modeltool::Component& component, bool fresh);
  void UpdateClasses(const std::vector<size_t>& classes,
                     const automation::Variant& model,
                     const ReporterLink& reporter,
                     const automation::Variant& collector);

  std::string language_;
  std::string project_file_;
  std::weak_ptr<modeltool::Component> component_;
  std::shared_ptr<const ProjectReader> reader_;
  std::optional<std::string> unique_id_;

  std::optional<ProjectCode> code_;
  std::optional<automation::Error> load_error_;
  // Counts the readings of the code, so a matching outlives none.
  uint64_t reading_ = 0;

  ClassMatch match_;
  std::weak_ptr<const automation::Dispatch> matched_model_;
  uint64_t matched_reading_ = 0;
  bool matched_ = false;

  std::weak_ptr<ElementIndex> index_;
  std::unordered_map<std::string, std::weak_ptr<CodeViewComponent>> components_;
  std::unordered_map<std::string, std::weak_ptr<CodeViewClass>> classes_;
};

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_CODE_VIEW_PROJECT_H_
