// Code-view projects filed by their model component's language, their
// components and members told apart by identity, the binding of a project
// to its component by unique identifier, and the entries' trace lines; the
// projects are the description add-in's.
#include "selection/kel_sorted_cv_projects.h"

#include <gtest/gtest.h>

#include <algorithm>
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

// The code-view component at `position` of a project.
Object Part(const Object& project, int32_t position) {
  return automation::CObj(
      automation::Call(automation::GetObject(project, cv::project::kComponents),
                       automation::Collection::kItem, position));
}

std::string NameOf(const Object& code_view_object) {
  return automation::CStr(
      automation::Get(code_view_object, cv::project::kName));
}

Strings ComponentNames(const kelSortedCVProject& entry) {
  Strings names;
  for (const auto& component : *entry.Components()) {
    names.push_back(NameOf(component->Component()));
  }
  return names;
}

Strings Languages(const kelSortedCVProjects& selection) {
  auto names = selection.GetIncludedLanguages();
  return Strings(names.begin(), names.end());
}

class KelSortedCVProjectsTest : public SelectionTest {};

TEST_F(KelSortedCVProjectsTest, ProjectsAreFiledOnceUnderTheirComponent) {
  // Gui's code is read by the VC++ add-in: its project's own language is
  // not its component's.
  auto gui = ComponentWithCode("Gui", "Visual Basic", {"Form", "Module"},
                               nullptr, "VC++");
  auto engine = NewComponent("Engine", "VC++");
  Object gui_project = CodeViewProjectOf(gui, "VC++");
  kelSortedCVProjects selection;
  EXPECT_TRUE(selection.GetProjects("VC++")->Empty());

  auto entry = selection.AddProject(gui_project, gui);
  ASSERT_NE(entry, nullptr);
  EXPECT_EQ(ComponentNames(*entry), (Strings{"Form", "Module"}));
  EXPECT_EQ(entry->OrelComponent(), Object(gui));
  entry->RemoveComponent(Part(gui_project, 1));
  EXPECT_EQ(selection.AddProject(gui_project, gui), nullptr);
  EXPECT_EQ(ComponentNames(*entry), (Strings{"Module"}));
  // A project to be opened later may be added more than once.
  auto later = selection.AddProject(nullptr, engine);
  ASSERT_NE(later, nullptr);
  EXPECT_NE(selection.AddProject(nullptr, engine), nullptr);
  auto other = ComponentWithCode("Other", "Visual Basic", {"Form"});
  Object other_project = CodeViewProjectOf(other, "Visual Basic");
  EXPECT_EQ(ErrorOf([&] { selection.AddProject(other_project, nullptr); }),
            automation::kObjectNotSet);

  EXPECT_EQ(Languages(selection), (Strings{"Visual Basic", "VC++"}));
  EXPECT_EQ(selection.GetProjects("visual basic")->Item(1), entry);
  EXPECT_EQ(selection.FindProject(gui_project), entry);
  EXPECT_EQ(selection.FindProject(other_project), nullptr);
  EXPECT_EQ(selection.FindProject(nullptr), later);
  EXPECT_EQ(selection.FindProjectWithUniqueID(gui->UniqueId()), entry);
  std::string lower = gui->UniqueId();
  lower[0] = 'i';
  EXPECT_EQ(selection.FindProjectWithUniqueID(lower), nullptr);

  // Removal: from where the entry is filed, though the project's own
  // language differs; by identifier, the first of each language.
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
  Object project = CodeViewProjectOf(
      ComponentWithCode("Engine", "VC++", {"Shape", "Circle"}), "VC++");
  Object shape = Part(project, 1);
  Object circle = Part(project, 2);
  Object member = automation::Collection::Create();
  Object twin = automation::Collection::Create();
  kelSortedCVProjects selection;

  // A component of a project not selected yet brings the project along,
  // without model component, under the project's own language.
  ASSERT_NE(selection.AddComponentToProject(shape), nullptr);
  EXPECT_EQ(selection.AddComponentToProject(shape), nullptr);
  auto entry = selection.FindProject(project);
  ASSERT_NE(entry, nullptr);
  EXPECT_EQ(entry->OrelComponent(), nullptr);
  EXPECT_EQ(Languages(selection), (Strings{"VC++"}));
  EXPECT_TRUE(selection.IsComponentInProject(shape, project));
  EXPECT_FALSE(selection.IsComponentInProject(circle, project));
  selection.AddComponentToProject(circle);
  EXPECT_EQ(ComponentNames(*entry), (Strings{"Shape", "Circle"}));

  Object stranger =
      Part(CodeViewProjectOf(ComponentWithCode("Gui", "Visual Basic", {"Form"}),
                             "Visual Basic"),
           1);
  const struct {
    const char* what;
    bool add;
    Object member;
    Object component;
    bool result;
  } steps[] = {
      {"add", true, member, shape, true},
      {"again", true, member, shape, false},
      {"Nothing", true, nullptr, shape, false},
      {"no entry", true, member, stranger, false},
      {"twin", true, twin, shape, true},
      {"absent", false, automation::Collection::Create(), shape, false},
      {"remove", false, member, shape, true},
      {"remove the last", false, twin, shape, true},
  };
  for (const auto& step : steps) {
    bool result =
        step.add
            ? entry->AddMemberInComponent(step.member, step.component)
            : entry->RemoveMemberFromComponent(step.member, step.component);
    EXPECT_EQ(result, step.result) << step.what;
  }
  EXPECT_EQ(ComponentNames(*entry), (Strings{"Circle"}));
  EXPECT_EQ(entry->GetCodeViewComponents().Item(1), circle);

  // The last component takes its project, and the language, along.
  selection.RemoveComponentFromProject(shape);  // not selected: nothing
  selection.RemoveComponentFromProject(circle);
  EXPECT_EQ(selection.FindProject(project), nullptr);
  EXPECT_TRUE(Languages(selection).empty());
}

TEST_F(KelSortedCVProjectsTest, InitCodeViewProjectBindsTheIdentifiers) {
  auto other =
      model_->RootComponentPackage()->NewPackage("Pkg")->NewComponent("Other");
  auto reporter = testing_support::RecordingObject::Create();
  const struct {
    const char* what;
    const char* code_id;  // the project's identifier in the code
    bool component_adopts;
  } cases[] = {
      {"empty", nullptr, false},
      {"same", "SAME-ID", false},
      {"free", "FREE-ID", true},
      {"taken", other->UniqueId().c_str(), false},
  };
  for (const auto& c : cases) {
    auto component = ComponentWithCode(std::string("Gui") + c.what,
                                       "Visual Basic", {"Form"}, c.code_id);
    if (std::string(c.what) == "same") component->SetUniqueId("SAME-ID");
    std::string own = component->UniqueId();
    kelSortedComponents components;
    components.AddComponent(component);
    kelSortedCVProjects selection;
    auto entry = selection.AddProject(nullptr, component);

    Object project = entry->InitCodeViewProject(reporter);
    ASSERT_NE(project, nullptr) << c.what;
    EXPECT_EQ(project, CodeViewProjectOf(component, "Visual Basic"));
    std::string project_id =
        automation::CStr(automation::Get(project, cv::project::kUniqueId));
    EXPECT_EQ(project_id, c.code_id ? c.code_id : own) << c.what;
    EXPECT_EQ(component->UniqueId(), c.component_adopts ? project_id : own)
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
            "Could not change unique ID of \"Guitaken\" to \"" +
                other->UniqueId() +
                "\" because \"Pkg::Other\" already has that unique ID.");

  // No project file (the add-in warns the code view given), or no add-in:
  // Nothing, and a line in the debug log.
  for (const char* language : {"Visual Basic", "Cobol"}) {
    kelSortedCVProject lost(nullptr, NewComponent("Lost", language));
    EXPECT_EQ(lost.InitCodeViewProject(reporter), nullptr);
    EXPECT_EQ(LogMessages().back().rfind("ERROR kelQLN.InitCodeViewProject(" +
                                             std::string(language) + "): ",
                                         0),
              0u);
  }
  EXPECT_EQ(reporter->CallsTo("Warning").size(), 1u);
}

TEST_F(KelSortedCVProjectsTest, SortProjectsFilesThoseWithAComponent) {
  auto gui = ComponentWithCode("Gui", "Visual Basic", {}, "GUI-ID");
  gui->SetUniqueId("GUI-ID");
  auto stray = ComponentWithCode("Stray", "Visual Basic", {}, "NO-SUCH-ID");
  auto projects = automation::Collection::Create();
  for (const auto& component : {gui, stray, gui}) {
    projects->Items().Add(
        Variant(CodeViewProjectOf(component, "Visual Basic")));
  }
  auto workspace = testing_support::RecordingObject::Create(
      [&](automation::DispId id, CallKind, Args&) {
        return id == cv::workspace::kProjects ? Variant(projects) : Variant();
      });
  SetOrelModel(model_);
  kelSortedCVProjects selection;
  selection.SortProjects(workspace);
  ResetRunGlobals();

  auto filed = selection.GetProjects("Visual Basic");
  ASSERT_EQ(filed->Count(), 1);
  EXPECT_EQ(filed->Item(1)->OrelComponent(), Object(gui));
  Strings log = LogMessages();
  EXPECT_NE(std::find(log.begin(), log.end(),
                      "kelQLN.SortProjects: no model component has the unique "
                      "ID \"NO-SUCH-ID\" of project \"Stray\""),
            log.end());
}

TEST_F(KelSortedCVProjectsTest, EntriesTraceTheirConstructionAndRelease) {
  Object project = CodeViewProjectOf(
      ComponentWithCode("Traced", "Visual Basic", {"Named"}), "Visual Basic");
  const struct {
    Object held;
    std::string name;
  } cases[] = {{Part(project, 1), "Named"},
               {nullptr, "<Nothing>"},
               {NewClass("Nameless"), "<UNKNOWN>"}};  // no member 2
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
  { kelSortedCVProject entry(project, nullptr); }
  std::string released = LogMessages().back();
  EXPECT_EQ(released.rfind("    FinalRelease kelSortedCVProject QLN:", 0), 0u);
  EXPECT_TRUE(released.ends_with(" Traced")) << released;

  // Without the trace's categories at level 4 nothing is written.
  EditRegistry([](platform::RegistryStore& store) {
    store.SetDword(platform::kHkeyLocalMachine, kSettingsKey, "Debug",
                   0x0f000024);
  });
  size_t before = LogMessages().size();
  { kelSortedCVComponent quiet(project); }
  EXPECT_EQ(LogMessages().size(), before);
}

}  // namespace
}  // namespace kelqln::testing
