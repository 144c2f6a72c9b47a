#include "host/codeview/model_synchronizer.h"

#include <unordered_set>
#include <utility>

#include "host/codeview/class_updater.h"
#include "host/codeview/home_package.h"

namespace host::codeview {

using modeltool::Class;

ModelSynchronizer::ModelSynchronizer(
    const ProjectCode& code, ClassMatch& match, modeltool::Model& model,
    const std::shared_ptr<modeltool::Component>& component, std::string tool,
    const ReporterLink& reporter, VanishedElementCollector& collector)
    : code_(code),
      match_(match),
      model_(model),
      component_(component),
      tool_(std::move(tool)),
      reporter_(reporter),
      collector_(collector) {}

void ModelSynchronizer::CollectVanishedClasses() {
  for (const auto& cls : match_.vanished) {
    if (cls->GetModel().get() == &model_) collector_.AddClass(cls->AsObject());
  }
}

void ModelSynchronizer::UpdateClasses(const std::vector<size_t>& classes) {
  // All classes first, so relations among them find each other.
  std::vector<std::shared_ptr<Class>> targets;
  for (size_t index : classes) {
    auto cls = ModelClassOf(index);
    if (!cls) {
      cls = MakeClass(index);
    } else if (cls->AssignTo(component_)) {
      reporter_.Log("Class " + cls->Name() + " assigned to component " +
                    component_->Name());
    }
    targets.push_back(cls);
  }
  ClassUpdater updater(
      model_, tool_, [this](const std::string& name) { return Resolve(name); },
      reporter_, collector_);
  for (size_t i = 0; i < classes.size(); ++i) {
    updater.Update(*code_.Classes()[classes[i]], *targets[i]);
  }
}

std::shared_ptr<Class> ModelSynchronizer::ModelClassOf(size_t index) {
  auto& cls = match_.model_of_code[index];
  if (cls && cls->GetModel().get() != &model_) cls.reset();
  return cls;
}

std::shared_ptr<Class> ModelSynchronizer::MakeClass(size_t index) {
  const CodeClass& code = *code_.Classes()[index];
  auto package = HomePackage();
  // The code's record of its model element is kept when the id is free.
  std::string id = code.unique_id;
  if (!id.empty() && model_.FindElement(id)) id.clear();
  auto cls = package->NewClass(code.name, id);
  cls->AssignTo(component_);
  match_.model_of_code[index] = cls;
  reporter_.Log("Class " + code.name + " added to package " + package->Name() +
                " and component " + component_->Name());
  return cls;
}

std::shared_ptr<Class> ModelSynchronizer::Resolve(const std::string& name) {
  if (auto index = code_.FindClass(name)) {
    if (auto cls = ModelClassOf(*index)) return cls;
    return MakeClass(*index);
  }
  if (!model_classes_ready_) {
    std::unordered_set<const Class*> vanished;
    for (const auto& cls : match_.vanished) vanished.insert(cls.get());
    for (const auto& cls : model_.Classes()) {
      if (vanished.count(cls.get()) == 0) {
        model_classes_.emplace(cls->Name(), cls);
      }
    }
    model_classes_ready_ = true;
  }
  auto found = model_classes_.find(name);
  return found == model_classes_.end() ? nullptr : found->second;
}

std::shared_ptr<modeltool::LogicalPackage> ModelSynchronizer::HomePackage() {
  if (auto package = FindHomePackage(model_, *component_)) return package;
  auto package = model_.RootLogicalPackage()->NewPackage(component_->Name());
  reporter_.Log("Package " + package->Name() + " added");
  return package;
}

}  // namespace host::codeview
