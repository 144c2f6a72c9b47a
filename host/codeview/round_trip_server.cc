#include "host/codeview/round_trip_server.h"

#include <functional>
#include <string>
#include <utility>

#include "automation/error.h"
#include "external/code_view.h"
#include "host/codeview/code_view_project.h"
#include "host/codeview/project_file.h"
#include "host/codeview/statement_generator.h"
#include "host/modeltool/application.h"
#include "host/modeltool/class.h"
#include "host/modeltool/component.h"
#include "host/modeltool/component_package.h"
#include "host/modeltool/model.h"
#include "platform/picture.h"
#include "shared/model_element_utilities.h"

namespace host::codeview {
namespace {

using automation::Args;
using automation::CallKind;
using automation::Error;
using automation::OptionalArg;
using automation::RequiredArg;
using automation::Variant;
using modeltool::Component;
namespace rte = external::code_view::rte_server;

std::shared_ptr<Component> ComponentArg(const Variant& value,
                                        std::string_view member) {
  auto component = modeltool::ElementArg<Component>(value);
  if (!component) {
    throw Error(
        automation::kTypeMismatch,
        std::string(member) + " takes a component of the modelling tool");
  }
  return component;
}

// A member row of the server: answers only when Answer lets it.
using Row = automation::MemberTable<RoundTripServer>::Row;
Row Member(const char* name, CallKind kind,
           std::function<Variant(RoundTripServer&, Args&)> handler) {
  return {
      automation::kNamedOnly, name, kind,
      [name, handler = std::move(handler)](RoundTripServer& self, Args& args) {
        self.Answer(name);
        return handler(self, args);
      }};
}

}  // namespace

RoundTripServer::RoundTripServer(std::shared_ptr<const ProjectReader> reader)
    : reader_(std::move(reader)) {}

void RoundTripServer::Connect(std::string add_in_name,
                              std::string registry_key) {
  settings_ = std::make_shared<AddInSettings>(std::move(add_in_name),
                                              std::move(registry_key));
}

void RoundTripServer::Answer(std::string_view member) const {
  if (!settings_->IsConnected()) {
    throw Error(automation::kObjectNotSet,
                "The code-view server is not connected to a language add-in");
  }
  if (settings_->Fails(member)) {
    throw Error(automation::kInvalidProcedureCall,
                std::string(member) + " of the " + settings_->Name() +
                    " add-in fails (registry value FailingMembers)");
  }
}

std::shared_ptr<CodeViewProject> RoundTripServer::ProjectFor(
    const Variant& component_arg, const ReporterLink& reporter) {
  auto component = ComponentArg(component_arg, rte::kCodeViewProject);
  std::string file = ProjectFileOf(*component, settings_->Name());
  if (file.empty()) {
    reporter.Warning("The component " + component->Name() +
                     " has no project file: its tool property " +
                     kProjectFileProperty + " of the tool " +
                     settings_->Name() + " is not set");
    return nullptr;
  }
  std::erase_if(projects_, [](const auto& weak) { return weak.expired(); });
  for (const auto& weak : projects_) {
    auto project = weak.lock();
    if (project->ModelComponent() == component &&
        project->ProjectFile() == file) {
      return project;
    }
  }
  auto project = std::make_shared<CodeViewProject>(settings_->Name(), file,
                                                   component, reader_);
  projects_.push_back(project);
  return project;
}

std::shared_ptr<automation::Collection> RoundTripServer::CodeIcons() const {
  auto icons = automation::Collection::Create();
  auto add = [&icons](const std::string& key, int32_t icon) {
    if (icons->Items().Contains(key)) return;
    icons->Items().Add(
        Variant(kelqln::IconToPicture(platform::LoadStandardIcon(icon))), key);
  };
  add("LANGUAGE", platform::kIdiApplication);
  add("PROJECT", platform::kIdiAsterisk);
  add("COMPONENT", platform::kIdiQuestion);
  for (const std::string& stereotype : settings_->IconStereotypes()) {
    add(stereotype, platform::kIdiExclamation);
  }
  return icons;
}

std::string RoundTripServer::ComponentInfo(const Variant& component_arg) {
  auto component = ComponentArg(component_arg, rte::kComponentInfo);
  std::string text =
      settings_->Name() + " component " + component->Name() + "\n";
  auto project = ProjectFor(component_arg, ReporterLink());
  if (!project) return text + "No project file";
  text += "Project file " + project->ProjectFile() + "\n";
  const ProjectCode* code = project->Code();
  if (!code) return text + "The code cannot be read: " + project->LoadProblem();
  return text + "Project " + project->Name() + ": " +
         std::to_string(code->Code().components.size()) + " components, " +
         std::to_string(code->Classes().size()) + " classes";
}

std::shared_ptr<automation::Collection> RoundTripServer::NewComponent(
    const Variant& model_arg) const {
  if (!settings_->SupportsNewComponent()) {
    throw Error(
        automation::kNoSuchMember,
        "The " + settings_->Name() + " add-in does not make new components");
  }
  auto object = automation::CObj(model_arg);
  auto model = std::dynamic_pointer_cast<modeltool::Model>(object);
  if (auto app = std::dynamic_pointer_cast<modeltool::Application>(object)) {
    model = app->CurrentModel();
  }
  if (!model) {
    throw Error(automation::kTypeMismatch,
                "OnNewComponent takes a model or the application of the "
                "modelling tool");
  }
  const auto& package = model->RootComponentPackage();
  std::string base = settings_->NewComponentName();
  std::string name = base;
  for (int n = 2;; ++n) {
    bool taken = false;
    for (const auto& present : package->Components()) {
      taken = taken || present->Name() == name;
    }
    if (!taken) break;
    name = base + " " + std::to_string(n);
  }
  auto component = package->NewComponent(name);
  component->SetLanguage(settings_->Name());
  auto list = automation::Collection::Create();
  list->Items().Add(Variant(component));
  return list;
}

const automation::MemberTable<RoundTripServer>& RoundTripServer::Members() {
  static const automation::MemberTable<RoundTripServer> table(
      "RoundTripServer",
      {
          Member(rte::kCodeViewProject, CallKind::kMethod,
                 [](RoundTripServer& self, Args& args) {
                   return Variant(
                       self.ProjectFor(RequiredArg(args, 0),
                                       ReporterLink(OptionalArg(args, 1))));
                 }),
          Member(rte::kStatementGenerator, CallKind::kPropertyGet,
                 [](RoundTripServer& self, Args&) {
                   return Variant(
                       std::make_shared<StatementGenerator>(self.settings_));
                 }),
          Member(rte::kLanguageInfo, CallKind::kPropertyGet,
                 [](RoundTripServer& self, Args&) {
                   std::string info = self.settings_->LanguageInfo();
                   if (info.empty()) {
                     info = self.settings_->Name() + ": " +
                            self.reader_->WhatItReads();
                   }
                   return Variant(info);
                 }),
          Member(rte::kCodeIcons, CallKind::kPropertyGet,
                 [](RoundTripServer& self, Args&) {
                   return Variant(self.CodeIcons());
                 }),
          Member(rte::kShouldBackupModel, CallKind::kMethod,
                 [](RoundTripServer& self, Args&) {
                   return Variant(self.settings_->ShouldBackupModel());
                 }),
          Member(rte::kOnModelUpdateStart, CallKind::kMethod,
                 [](RoundTripServer& self, Args&) {
                   self.updating_ = true;
                   return Variant();
                 }),
          Member(rte::kOnModelUpdateEnd, CallKind::kMethod,
                 [](RoundTripServer& self, Args&) {
                   self.updating_ = false;
                   return Variant();
                 }),
          Member("IsModelUpdating", CallKind::kPropertyGet,
                 [](RoundTripServer& self, Args&) {
                   return Variant(self.updating_);
                 }),
          Member(rte::kGetComponentFromProject, CallKind::kMethod,
                 [](RoundTripServer&, Args& args) {
                   auto project = std::dynamic_pointer_cast<CodeViewProject>(
                       automation::CObj(RequiredArg(args, 0)));
                   automation::Object component;
                   if (project) component = project->ModelComponent();
                   return Variant(component);
                 }),
          Member(rte::kComponentInfo, CallKind::kMethod,
                 [](RoundTripServer& self, Args& args) {
                   return Variant(self.ComponentInfo(RequiredArg(args, 0)));
                 }),
          Member(rte::kOnNewComponent, CallKind::kMethod,
                 [](RoundTripServer& self, Args& args) {
                   return Variant(self.NewComponent(RequiredArg(args, 0)));
                 }),
          Member(rte::kOnProperties, CallKind::kMethod,
                 [](RoundTripServer&, Args&) { return Variant(); }),
          Member(rte::kGetContextClass, CallKind::kMethod,
                 [](RoundTripServer&, Args& args) {
                   auto member = modeltool::ElementArg<modeltool::Element>(
                       RequiredArg(args, 0));
                   automation::Object owner;
                   if (member) {
                     if (auto cls = member->ContextClass()) {
                       owner = cls->AsObject();
                     }
                   }
                   return Variant(owner);
                 }),
      });
  return table;
}

}  // namespace host::codeview
