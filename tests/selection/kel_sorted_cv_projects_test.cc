// Code-view projects filed by their model component's language, their
// components and members told apart by identity, the binding of a project
// to its component by unique identifier, and the entries' trace lines.
#include "selection/kel_sorted_cv_projects.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <string>
#include <vector>

#include "automation/collection.h"
#include "entry/run_globals.h"
#include "selection/kel_sorted_component.h"
#include "selection/kel_sorted_components.h"
#include "selection/kel_sorted_cv_component.h"
#include "selection/kel_sorted_cv_project.h"
#include "selection_test_support.h"
#include "tests/support/error_of.h"
#include "tests/support/recording_object.h"

namespace kelqln::testing {
namespace {

namespace cv = external::code_view;
using testing_support::ErrorOf;
using Strings = std::vector<std::string>;

// A code-view project, component or workspace: members by number, each a
// value to read and, for the identifier, to write. A component refers to
// its project without keeping it, as the project keeps its components.
class CodeViewObject : public automation::Dispatch {
 public:
  Variant Invoke(automation::DispId id, CallKind kind, Args& args) override {
    if (id == cv::component::kProject && !project.expired()) {
      return Variant(Object(project.lock()));
    }
    if (kind == CallKind::kPropertyPut) {
      values[id] = automation::PutValue(args);
      return Variant();
    }
    auto found = values.find(id);
    if (found == values.end())
      throw automation::Error(automation::kNoSuchMember);
    return found->second;
  }
  automation::DispId IdOfName(std::string_view) const override {
    throw automation::Error(automation::kNoSuchMember);
  }
  std::string TypeName() const override { return "CodeViewObject"; }

  std::map<automation::DispId, Variant> values;
  std::weak_ptr<automation::Dispatch> project;
};

std::shared_ptr<CodeViewObject> NewProject(const std::string& name,
                                           const std::string& language,
                                           const std::string& id = "") {
  auto project = std::make_shared<CodeViewObject>();
  project->values = {
      {cv::project::kLanguage, Variant(language)},
      {cv::project::kName, Variant(name)},
      {cv::project::kComponents, Variant(automation::Collection::Create())},
      {cv::project::kUniqueId, Variant(id)}};
  return project;
}

std::shared_ptr<CodeViewObject> NewCodeComponent(
    const std::shared_ptr<CodeViewObject>& project, const std::string& name) {
  auto component = std::make_shared<CodeViewObject>();
  component->values = {{cv::component::kName, Variant(name)}};
  component->project = project;
  auto list = automation::CObj(project->values[cv::project::kComponents]);
  std::static_pointer_cast<automation::Collection>(list)->Items().Add(
      Variant(component));
  return component;
}

std::string UniqueIdOf(const Object& project) {
  return automation::CStr(automation::Get(project, cv::project::kUniqueId));
}

Strings ComponentNames(const kelSortedCVProject& entry) {
  Strings names;
  for (const auto& component : *entry.Components()) {
    names.push_back(automation::CStr(
        automation::Get(component->Component(), cv::component::kName)));
  }
  return names;
}

Strings Languages(const kelSortedCVProjects& selection) {
  auto names = selection.GetIncludedLanguages();
  return Strings(names.begin(), names.end());
}

class KelSortedCVProjectsTest : public SelectionTest {};

TEST_F(KelSortedCVProjectsTest, ProjectsAreFiledOnceUnderTheirComponent) {
  auto gui = NewComponent("Gui", "VB");
  auto engine = NewComponent("Engine", "VC++");
  auto gui_project = NewProject("GuiProject", "Basic");
  auto form = NewCodeComponent(gui_project, "Form");
  NewCodeComponent(gui_project, "Module");
  kelSortedCVProjects selection;
  EXPECT_TRUE(selection.GetProjects("VC++")->Empty());

  auto entry = selection.AddProject(gui_project, gui);
  ASSERT_NE(entry, nullptr);
  EXPECT_EQ(ComponentNames(*entry), (Strings{"Form", "Module"}));
  EXPECT_EQ(entry->OrelComponent(), Object(gui));
  entry->RemoveComponent(form);
  EXPECT_EQ(selection.AddProject(gui_project, gui), nullptr);
  EXPECT_EQ(ComponentNames(*entry), (Strings{"Module"}));
  // A project to be opened later may be added more than once.
  auto later = selection.AddProject(nullptr, engine);
  ASSERT_NE(later, nullptr);
  EXPECT_NE(selection.AddProject(nullptr, engine), nullptr);
  EXPECT_EQ(
      ErrorOf([&] { selection.AddProject(NewProject("P", "VB"), nullptr); }),
      automation::kObjectNotSet);

  EXPECT_EQ(Languages(selection), (Strings{"VB", "VC++"}));
  EXPECT_EQ(selection.GetProjects("vb")->Item(1), entry);
  EXPECT_EQ(selection.FindProject(gui_project), entry);
  EXPECT_EQ(selection.FindProject(NewProject("GuiProject", "Basic")), nullptr);
  EXPECT_EQ(selection.FindProject(nullptr), later);
  EXPECT_EQ(selection.FindProjectWithUniqueID(gui->UniqueId()), entry);
  std::string lower = gui->UniqueId();
  lower[0] = 'i';
  EXPECT_EQ(selection.FindProjectWithUniqueID(lower), nullptr);

  // Removal: from where the entry is filed, though the project's own
  // language differs; the first of each language by identifier.
  selection.RemoveProject(gui_project);
  selection.RemoveProject(gui_project);
  EXPECT_EQ(Languages(selection), (Strings{"VC++"}));
  EXPECT_EQ(ErrorOf([&] { selection.RemoveProject(nullptr); }),
            automation::kObjectNotSet);
  selection.RemoveProjectWithUniqueID(engine->UniqueId());
  EXPECT_EQ(selection.GetProjects("VC++")->Count(), 1);
  selection.RemoveProjectWithUniqueID(engine->UniqueId());
  EXPECT_TRUE(Languages(selection).empty());
}

TEST_F(KelSortedCVProjectsTest, ComponentsAndMembersGoByIdentity) {
  auto project = NewProject("Engine", "VC++");
  auto shape = NewCodeComponent(project, "Shape");
  auto circle = NewCodeComponent(project, "Circle");
  auto member = std::make_shared<CodeViewObject>();
  auto twin = std::make_shared<CodeViewObject>();
  kelSortedCVProjects selection;

  // A component of a project not selected yet brings the project along,
  // without model component, under the project's own language.
  auto entry = selection.AddComponentToProject(shape);
  ASSERT_NE(entry, nullptr);
  EXPECT_EQ(selection.AddComponentToProject(shape), nullptr);
  auto project_entry = selection.FindProject(project);
  ASSERT_NE(project_entry, nullptr);
  EXPECT_EQ(project_entry->OrelComponent(), nullptr);
  EXPECT_EQ(Languages(selection), (Strings{"VC++"}));
  EXPECT_TRUE(selection.IsComponentInProject(shape, project));
  EXPECT_FALSE(selection.IsComponentInProject(circle, project));
  selection.AddComponentToProject(circle);
  EXPECT_EQ(ComponentNames(*project_entry), (Strings{"Shape", "Circle"}));

  struct Step {
    const char* what;
    bool add;
    Object member;
    Object component;
    bool result;
  };
  const Step steps[] = {
      {"add", true, member, shape, true},
      {"again", true, member, shape, false},
      {"Nothing", true, nullptr, shape, false},
      {"no entry", true, member, NewCodeComponent(project, "Other"), false},
      {"twin", true, twin, shape, true},
      {"absent", false, std::make_shared<CodeViewObject>(), shape, false},
      {"remove", false, member, shape, true},
      {"remove the last", false, twin, shape, true},
  };
  for (const Step& step : steps) {
    bool result = step.add ? project_entry->AddMemberInComponent(step.member,
                                                                 step.component)
                           : project_entry->RemoveMemberFromComponent(
                                 step.member, step.component);
    EXPECT_EQ(result, step.result) << step.what;
  }
  EXPECT_EQ(ComponentNames(*project_entry), (Strings{"Circle"}));
  EXPECT_EQ(project_entry->GetCodeViewComponents().Item(1), Object(circle));

  // The last component takes its project, and the language, along.
  selection.RemoveComponentFromProject(shape);  // not selected: nothing
  selection.RemoveComponentFromProject(circle);
  EXPECT_EQ(selection.FindProject(project), nullptr);
  EXPECT_TRUE(Languages(selection).empty());
}

TEST_F(KelSortedCVProjectsTest, InitCodeViewProjectBindsTheIdentifiers) {
  auto other = NewComponent("Other", "VB");
  auto reporter = testing_support::RecordingObject::Create();
  struct Case {
    const char* what;
    std::string project_id;  // "own": the component's
    std::string project_after;
    bool component_adopts;
  };
  const Case cases[] = {
      {"empty", "", "own", false},
      {"same", "own", "own", false},
      {"free", "FREE-ID", "FREE-ID", true},
      {"taken", other->UniqueId(), other->UniqueId(), false},
  };
  for (const Case& c : cases) {
    auto package = model_->RootComponentPackage()->NewPackage("Pkg");
    auto component = package->NewComponent(std::string("Gui") + c.what);
    component->SetLanguage("VB");
    std::string own = component->UniqueId();
    auto project =
        NewProject(c.what, "VB", c.project_id == "own" ? own : c.project_id);
    Server("VB").code_view_project = [&](const Object& asked,
                                         const Object& view) {
      EXPECT_EQ(asked, Object(component));
      EXPECT_EQ(view, Object(reporter));
      return project;
    };
    kelSortedComponents components;
    components.AddComponent(component);
    kelSortedCVProjects selection;
    auto entry = selection.AddProject(nullptr, component);

    EXPECT_EQ(entry->InitCodeViewProject(reporter), Object(project)) << c.what;
    std::string expected = c.project_after == "own" ? own : c.project_after;
    EXPECT_EQ(UniqueIdOf(project), expected) << c.what;
    EXPECT_EQ(component->UniqueId(), c.component_adopts ? expected : own)
        << c.what;
    // Both selections follow the identities now held.
    EXPECT_EQ(selection.FindProject(project), entry) << c.what;
    EXPECT_EQ(selection.FindProjectWithUniqueID(component->UniqueId()), entry);
    EXPECT_NE(components.FindComponentFromUniqueID(component->UniqueId()),
              nullptr)
        << c.what;
  }
  auto errors = reporter->CallsTo("Error");
  ASSERT_EQ(errors.size(), 1u);
  EXPECT_EQ(automation::CStr(errors[0].args.at(0)),
            "Could not change unique ID of \"Pkg::Guitaken\" to \"" +
                other->UniqueId() +
                "\" because \"Other\" already has that "
                "unique ID.");

  // A language without add-in: nothing, and a line in the debug log.
  kelSortedCVProject lost(nullptr, NewComponent("Lost", "Cobol"));
  EXPECT_EQ(lost.InitCodeViewProject(reporter), nullptr);
  EXPECT_EQ(LogMessages().back().rfind(
                "ERROR kelQLN.InitCodeViewProject(Cobol): ", 0),
            0u);
}

TEST_F(KelSortedCVProjectsTest, SortProjectsFilesThoseWithAComponent) {
  auto gui = NewComponent("Gui", "VB");
  auto projects = automation::Collection::Create();
  for (const auto& project :
       {NewProject("Known", "Basic", gui->UniqueId()),
        NewProject("Unknown", "Basic", "NO-SUCH-ID"),
        NewProject("Known again", "Basic", gui->UniqueId())}) {
    projects->Items().Add(Variant(project));
  }
  auto workspace = std::make_shared<CodeViewObject>();
  workspace->values[cv::workspace::kProjects] = Variant(projects);
  SetOrelModel(model_);
  kelSortedCVProjects selection;
  selection.SortProjects(workspace);
  ResetRunGlobals();

  auto filed = selection.GetProjects("VB");
  ASSERT_EQ(filed->Count(), 2);
  EXPECT_EQ(filed->Item(1)->OrelComponent(), Object(gui));
  Strings log = LogMessages();
  EXPECT_NE(std::find(log.begin(), log.end(),
                      "kelQLN.SortProjects: no model component has the unique "
                      "ID \"NO-SUCH-ID\" of project \"Unknown\""),
            log.end());
}

TEST_F(KelSortedCVProjectsTest, EntriesTraceTheirConstructionAndRelease) {
  auto named = NewCodeComponent(NewProject("P", "VB"), "Named");
  auto nameless = std::make_shared<CodeViewObject>();
  const struct {
    Object held;
    std::string name;
  } cases[] = {
      {named, "Named"}, {nullptr, "<Nothing>"}, {nameless, "<UNKNOWN>"}};
  for (const auto& c : cases) {
    std::string address;
    {
      kelSortedCVComponent entry(c.held);
      address = std::to_string(reinterpret_cast<uintptr_t>(&entry));
    }
    Strings lines = LogMessages();
    ASSERT_GE(lines.size(), 2u);
    EXPECT_EQ(lines[lines.size() - 2],
              "FinalConstruct kelSortedCVComponent QLN:" + address);
    EXPECT_EQ(lines.back(), "    FinalRelease kelSortedCVComponent QLN:" +
                                address + " " + c.name);
  }
  { kelSortedCVProject project(NewProject("Traced", "VB"), nullptr); }
  EXPECT_NE(LogMessages().back().find("FinalRelease kelSortedCVProject QLN:"),
            std::string::npos);
  EXPECT_EQ(LogMessages().back().substr(LogMessages().back().size() - 7),
            " Traced");

  // Without the trace's categories at level 4 nothing is written.
  EditRegistry([](platform::RegistryStore& store) {
    store.SetDword(platform::kHkeyLocalMachine, kSettingsKey, "Debug",
                   0x0f000024);
  });
  size_t before = LogMessages().size();
  { kelSortedCVComponent quiet(named); }
  EXPECT_EQ(LogMessages().size(), before);
}

}  // namespace
}  // namespace kelqln::testing
