#include "host/codeview/code_view_project.h"

#include <filesystem>
#include <utility>

#include "external/code_view.h"
#include "host/codeview/code_view_class.h"
#include "host/codeview/code_view_component.h"
#include "host/codeview/element_index.h"
#include "host/codeview/model_synchronizer.h"
#include "host/codeview/vanished_element_collector.h"

namespace host::codeview {
namespace {

using automation::Args;
using automation::CallKind;
using automation::Error;
using automation::OptionalArg;
using automation::RequiredArg;
using automation::Variant;
namespace project = external::code_view::project;

std::shared_ptr<modeltool::Model> ModelArg(const Variant& value) {
  auto object = automation::CObj(value);
  if (!object) throw Error(automation::kObjectNotSet);
  auto model = std::dynamic_pointer_cast<modeltool::Model>(object);
  if (!model) {
    throw Error(automation::kTypeMismatch,
                "A code view updates models of the modelling tool only, not " +
                    object->TypeName());
  }
  return model;
}

std::shared_ptr<VanishedElementCollector> CollectorArg(const Variant& value) {
  auto object = automation::CObj(value);
  if (!object) throw Error(automation::kObjectNotSet);
  auto collector = std::dynamic_pointer_cast<VanishedElementCollector>(object);
  if (!collector) {
    throw Error(automation::kTypeMismatch,
                "A code view records what vanished in a "
                "kelcv.VanishedElementCollector, not a " +
                    object->TypeName());
  }
  return collector;
}

}  // namespace

CodeViewProject::CodeViewProject(
    std::string language, std::string project_file,
    const std::shared_ptr<modeltool::Component>& component,
    std::shared_ptr<const ProjectReader> reader)
    : language_(std::move(language)),
      project_file_(std::move(project_file)),
      component_(component),
      reader_(std::move(reader)) {}

std::string CodeViewProject::Name() {
  const ProjectCode* code = Code();
  if (code && !code->Code().name.empty()) return code->Code().name;
  return std::filesystem::path(project_file_).stem().string();
}

std::string CodeViewProject::UniqueId() {
  if (unique_id_) return *unique_id_;
  const ProjectCode* code = Code();
  return code ? code->Code().unique_id : "";
}

const ProjectCode* CodeViewProject::Code() {
  if (!code_ && !load_error_) Load();
  return code_ ? &*code_ : nullptr;
}

void CodeViewProject::Load() {
  code_.reset();
  load_error_.reset();
  ++reading_;
  try {
    code_.emplace(reader_->Read(project_file_));
  } catch (const Error& error) {
    load_error_ = error;
  }
}

void CodeViewProject::Failed(const ReporterLink& reporter, const Error& error) {
  auto component = ModelComponent();
  reporter.Error("Cannot read the code of component " +
                 (component ? component->Name() : Name()) + ": " +
                 error.Description());
}

const ProjectCode& CodeViewProject::RequireCode(const ReporterLink& reporter) {
  if (const ProjectCode* code = Code()) return *code;
  Failed(reporter, *load_error_);
  throw *load_error_;
}

void CodeViewProject::Open(const ReporterLink& reporter) {
  Load();
  if (load_error_) {
    Failed(reporter, *load_error_);
    throw *load_error_;
  }
}

void CodeViewProject::Release() {
  code_.reset();
  load_error_.reset();
  match_ = {};
  matched_ = false;
}

std::shared_ptr<modeltool::Component> CodeViewProject::RequireComponent(
    const modeltool::Model& model) {
  auto component = ModelComponent();
  if (!component || !component->GetModel()) {
    throw Error(automation::kObjectNotSet,
                "The model component of the code-view project " + Name() +
                    " no longer exists");
  }
  if (component->GetModel().get() != &model) {
    throw Error(automation::kInvalidProcedureCall,
                "The component " + component->Name() +
                    " is not in the model to update");
  }
  return component;
}

ClassMatch& CodeViewProject::Match(const modeltool::Model& model,
                                   const modeltool::Component& component,
                                   bool fresh) {
  const automation::Dispatch* model_object = &model;
  if (fresh || !matched_ || matched_reading_ != reading_ ||
      matched_model_.lock().get() != model_object) {
    match_ = MatchClasses(code_->Classes(), component, model);
    matched_model_ = model.weak_from_this();
    matched_reading_ = reading_;
    matched_ = true;
  }
  return match_;
}

void CodeViewProject::UpdateModel(const Variant& model_arg,
                                  const ReporterLink& reporter,
                                  const Variant& collector_arg) {
  auto model = ModelArg(model_arg);
  auto collector = CollectorArg(collector_arg);
  auto component = RequireComponent(*model);
  const ProjectCode& code = RequireCode(reporter);
  ModelSynchronizer(code, Match(*model, *component, true), *model, component,
                    language_, reporter, *collector)
      .CollectVanishedClasses();
}

void CodeViewProject::UpdateComponent(const std::string& name,
                                      const Variant& model,
                                      const ReporterLink& reporter,
                                      const Variant& collector) {
  auto classes = RequireCode(reporter).ClassesOf(name);
  if (!classes) {
    reporter.Warning("The component " + name + " is no longer in the code of " +
                     Name() + "; nothing was updated from it");
    return;
  }
  UpdateClasses(*classes, model, reporter, collector);
}

void CodeViewProject::UpdateClass(const std::string& name, const Variant& model,
                                  const ReporterLink& reporter,
                                  const Variant& collector) {
  auto index = RequireCode(reporter).FindClass(name);
  if (!index) {
    reporter.Warning("The class " + name + " is no longer in the code of " +
                     Name() + "; nothing was updated from it");
    return;
  }
  UpdateClasses({*index}, model, reporter, collector);
}

void CodeViewProject::UpdateClasses(const std::vector<size_t>& classes,
                                    const Variant& model_arg,
                                    const ReporterLink& reporter,
                                    const Variant& collector_arg) {
  auto model = ModelArg(model_arg);
  auto collector = CollectorArg(collector_arg);
  auto component = RequireComponent(*model);
  ModelSynchronizer(*code_, Match(*model, *component, false), *model, component,
                    language_, reporter, *collector)
      .UpdateClasses(classes);
}

std::shared_ptr<automation::Collection> CodeViewProject::Components() {
  auto list = automation::Collection::Create();
  if (const ProjectCode* code = Code()) {
    for (const CodeComponent& component : code->Code().components) {
      list->Items().Add(Variant(ComponentObject(component.name)));
    }
  }
  return list;
}

std::shared_ptr<ElementIndex> CodeViewProject::Index() {
  auto index = index_.lock();
  if (!index) {
    index = std::make_shared<ElementIndex>(Self());
    index_ = index;
  }
  return index;
}

std::shared_ptr<CodeViewComponent> CodeViewProject::ComponentObject(
    const std::string& name) {
  auto& weak = components_[name];
  auto component = weak.lock();
  if (!component) {
    component = std::make_shared<CodeViewComponent>(Self(), name);
    weak = component;
  }
  return component;
}

std::shared_ptr<CodeViewClass> CodeViewProject::ClassObject(
    const std::string& name) {
  auto& weak = classes_[name];
  auto cls = weak.lock();
  if (!cls) {
    cls = std::make_shared<CodeViewClass>(Self(), name);
    weak = cls;
  }
  return cls;
}

std::string CodeViewProject::ClassUniqueId(size_t index) {
  const ProjectCode* code = Code();
  if (!code || index >= code->Classes().size()) return "";
  auto component = ModelComponent();
  auto model = component ? component->GetModel() : nullptr;
  if (model) {
    const auto& cls = Match(*model, *component, false).model_of_code[index];
    if (cls && cls->GetModel() == model) return cls->UniqueId();
  }
  return code->Classes()[index]->unique_id;
}

std::string CodeViewProject::ComponentOfClass(const std::string& name) {
  if (const ProjectCode* code = Code()) {
    for (const CodeComponent& component : code->Code().components) {
      for (const CodeClass& cls : component.classes) {
        if (cls.name == name) return component.name;
      }
    }
  }
  return "";
}

const automation::MemberTable<CodeViewProject>& CodeViewProject::Members() {
  static const automation::MemberTable<CodeViewProject> table(
      "CodeViewProject",
      {
          {project::kLanguage, "Language", CallKind::kPropertyGet,
           [](CodeViewProject& self, Args&) {
             return Variant(self.language_);
           }},
          {project::kName, "Name", CallKind::kPropertyGet,
           [](CodeViewProject& self, Args&) { return Variant(self.Name()); }},
          {project::kComponents, "Components", CallKind::kPropertyGet,
           [](CodeViewProject& self, Args&) {
             return Variant(self.Components());
           }},
          {project::kUniqueId, "UniqueID", CallKind::kPropertyGet,
           [](CodeViewProject& self, Args&) {
             return Variant(self.UniqueId());
           }},
          {project::kUniqueId, "UniqueID", CallKind::kPropertyPut,
           [](CodeViewProject& self, Args& args) {
             self.unique_id_ = automation::CStr(automation::PutValue(args));
             return Variant();
           }},
          {project::kElementIndex, "ElementIndex", CallKind::kPropertyGet,
           [](CodeViewProject& self, Args&) { return Variant(self.Index()); }},
          {project::kOpen, "Open", CallKind::kMethod,
           [](CodeViewProject& self, Args& args) {
             self.Open(ReporterLink(OptionalArg(args, 0)));
             return Variant();
           }},
          {project::kUpdateModel, "UpdateModel", CallKind::kMethod,
           [](CodeViewProject& self, Args& args) {
             self.UpdateModel(RequiredArg(args, 0),
                              ReporterLink(OptionalArg(args, 1)),
                              RequiredArg(args, 2));
             return Variant();
           }},
          {project::kFinish, "Finish", CallKind::kMethod,
           [](CodeViewProject&, Args&) { return Variant(); }},
          {project::kRelease, "Release", CallKind::kMethod,
           [](CodeViewProject& self, Args&) {
             self.Release();
             return Variant();
           }},
      });
  return table;
}

}  // namespace host::codeview
