// Filing model components and classes: languages, the pseudo-component,
// statement generators, exclusions, removals and look-ups.
#include "selection/kel_sorted_components.h"

#include <gtest/gtest.h>

#include <cctype>
#include <string>
#include <vector>

#include "host/modeltool/operation.h"
#include "selection/kel_sorted_class.h"
#include "selection/kel_sorted_component.h"
#include "selection_test_support.h"

namespace kelqln::testing {
namespace {

using host::modeltool::Class;
using host::modeltool::Component;
using Strings = std::vector<std::string>;

std::string NameOf(const Object& element) {
  return element ? automation::CStr(automation::Get(element, 100))
                 : "<Unassigned>";
}

// "Component(Class Class)" for each entry of the language, in order.
Strings Filed(const kelSortedComponents& selection, const std::string& lang) {
  Strings filed;
  for (const auto& entry : *selection.GetComponents(lang)) {
    std::string text = NameOf(entry->Component()) + "(";
    for (const auto& cls : *entry->Classes()) {
      text += (text.back() == '(' ? "" : " ") + NameOf(cls->Class());
    }
    filed.push_back(text + ")");
  }
  return filed;
}

Strings Languages(const kelSortedComponents& selection) {
  auto names = selection.GetIncludedLanguages();
  return Strings(names.begin(), names.end());
}

class KelSortedComponentsTest : public SelectionTest {};

TEST_F(KelSortedComponentsTest, FilesByLanguageThenComponentInOrderMet) {
  auto gui = NewComponent("Gui", "Visual Basic");
  auto engine = NewComponent("Engine", "VC++");
  auto loose = NewComponent("Loose", "");
  auto tools = NewComponent("Tools", "Visual Basic");
  NewClass("Form", {gui});
  NewClass("Shape", {engine, gui});
  NewClass("Orphan");
  NewClass("Helper", {tools});
  NewClass("Note", {loose});

  kelSortedComponents selection;
  selection.SetIncludeALLComponents(true);  // "Loose" has no add-in
  // Asking for a language does not register it ahead of the others.
  EXPECT_TRUE(selection.GetComponents("VC++")->Empty());
  selection.GetAllComponentsAndClassesFromModel(model_);
  auto late = NewComponent("Late", "");
  selection.AddComponent(late);

  EXPECT_EQ(Languages(selection), (Strings{"Visual Basic", "VC++"}));
  EXPECT_EQ(Filed(selection, "Visual Basic"),
            (Strings{"Gui(Form Shape)", "Tools(Helper)"}));
  EXPECT_EQ(Filed(selection, "vc++"), (Strings{"Engine(Shape)"}));
  EXPECT_EQ(Filed(selection, ""),
            (Strings{"Loose(Note)", "<Unassigned>(Orphan)", "Late()"}));
  EXPECT_EQ(selection.GetUnassignedComponents(), selection.GetComponents(""));
  ASSERT_TRUE(selection.ContainsUnassignedClasses());
  EXPECT_EQ(NameOf(selection.GetUnassignedClasses()->Item(1)->Class()),
            "Orphan");

  ObjectCollection all = selection.GetAllOrelComponents();
  Strings names;
  for (const Object& component : all) names.push_back(NameOf(component));
  EXPECT_EQ(names, (Strings{"Gui", "Tools", "Engine", "Loose", "Late"}));

  // Found wherever they are filed, the pseudo-component included.
  for (const auto& component : {gui, engine, loose, tools, late}) {
    auto entry = selection.FindComponent(component);
    ASSERT_NE(entry, nullptr) << component->Name();
    EXPECT_EQ(entry->Component(), Object(component));
    EXPECT_EQ(selection.FindComponentFromUniqueID(component->UniqueId()),
              entry);
  }
  EXPECT_EQ(selection.FindComponent(nullptr)->Classes()->Count(), 1);
}

TEST_F(KelSortedComponentsTest, GeneratorsOrTheFlagDecide) {
  struct Case {
    const char* language;
    const char* failing;  // round-trip members of VC++ that fail
    bool include_all;
    const char* stereotype;
    bool filed;
  };
  const Case cases[] = {
      {"Visual Basic", "", false, "", true},
      {"Visual Basic", "", true, "refused", false},
      {"VC++", "StatementGenerator", false, "", false},
      {"VC++", "StatementGenerator", true, "", true},
      {"Cobol", "", false, "", false},
      {"Cobol", "", true, "", true},
  };
  for (const Case& c : cases) {
    SetAddInValue("VC++", "FailingMembers", c.failing);
    kelSortedComponents selection;
    selection.SetIncludeALLComponents(c.include_all);
    auto component = NewComponent("C", c.language, c.stereotype);
    auto entry = selection.AddComponent(component);
    EXPECT_EQ(entry != nullptr, c.filed) << c.language << " " << c.stereotype;
    EXPECT_EQ(selection.FindComponent(component), entry);
  }
}

class ObservedGeneratorsTest : public KelSortedComponentsTest {
 protected:
  ObservedGeneratorsTest() {
    observed_["Visual Basic"] = nullptr;
    observed_["VisualStudio"] = nullptr;
  }
};

TEST_F(ObservedGeneratorsTest, AreReadOnceAndAskedAboutTheElement) {
  NewComponent("First", "VC++", "Refused");
  auto a = NewComponent("A", "Visual Basic");
  NewClass("A", {a});
  NewClass("B", {NewComponent("B", "Visual Basic")});
  NewComponent("Later", "VC++");
  auto orphan = NewClass("Orphan");
  kelSortedComponents selection;
  selection.GetAllComponentsAndClassesFromModel(model_);

  EXPECT_EQ(observed_["Visual Basic"]->generator_reads, 1);
  const Args& query = observed_["Visual Basic"]->generator->queries.front();
  ASSERT_EQ(query.size(), 5u);
  EXPECT_EQ(automation::CObj(query[0]), Object(a));
  EXPECT_EQ(automation::CObj(query[1]), Object(a));
  EXPECT_EQ(automation::CLng(query[2]), 0);
  EXPECT_TRUE(query[4].IsNothing());
  // Unassigned classes are judged by the "VisualStudio" add-in.
  const Args& asked = observed_["VisualStudio"]->generator->queries.back();
  EXPECT_TRUE(asked[0].IsNothing());
  EXPECT_EQ(automation::CObj(asked[1]), Object(orphan));
  // A refused component's language keeps its place in first-met order.
  EXPECT_EQ(Languages(selection), (Strings{"VC++", "Visual Basic"}));
  EXPECT_EQ(Filed(selection, "Visual Basic"), (Strings{"A(A)", "B(B)"}));
  EXPECT_EQ(Filed(selection, "VC++"), (Strings{"Later()"}));
}

TEST_F(KelSortedComponentsTest, ExcludedStereotypesAndFlaggedClassesStayOut) {
  EditRegistry([](platform::RegistryStore& store) {
    store.SetString(platform::kHkeyLocalMachine, kSettingsKey,
                    "ExcludeClassStereotypes", " Utility ; enum ");
  });
  auto gui = NewComponent("Gui", "Visual Basic");
  NewClass("Util", {gui}, "UTILITY");
  NewClass("Colour", {}, "Enum");
  NewClass("Flagged", {gui})->SetExcludedFromSelection(true);
  NewClass("Entity", {gui}, "entity");
  NewClass("Loose");

  kelSortedComponents selection;
  selection.GetAllComponentsAndClassesFromModel(model_);
  EXPECT_EQ(Filed(selection, "Visual Basic"), (Strings{"Gui(Entity)"}));
  EXPECT_EQ(Filed(selection, "Unassigned"), (Strings{"<Unassigned>(Loose)"}));

  // The list is read once per selection.
  EditRegistry([](platform::RegistryStore& store) {
    store.RemoveValue(platform::kHkeyLocalMachine, kSettingsKey,
                      "ExcludeClassStereotypes");
  });
  auto util = NewClass("Util2", {gui}, "utility");
  EXPECT_FALSE(selection.ShouldAddClass(gui, util));
  EXPECT_TRUE(kelSortedComponents().ShouldAddClass(gui, util));
}

TEST_F(KelSortedComponentsTest, RemovalsDropEmptiedComponentsAndLanguages) {
  auto gui = NewComponent("Gui", "Visual Basic");
  auto tools = NewComponent("Tools", "Visual Basic");
  auto engine = NewComponent("Engine", "VC++");
  auto form = NewClass("Form", {gui, tools});
  auto shape = NewClass("Shape", {engine});
  auto orphan = NewClass("Orphan");
  kelSortedComponents selection;
  selection.GetAllComponentsAndClassesFromModel(model_);

  // The flag False leaves the emptied entry; True removes it, and the last
  // component of a language takes the language along.
  selection.RemoveClassFromComponent(form, gui, false);
  EXPECT_EQ(Filed(selection, "Visual Basic"),
            (Strings{"Gui()", "Tools(Form)"}));
  selection.RemoveClassFromAllComponents(form);
  EXPECT_EQ(Languages(selection), (Strings{"VC++"}));
  EXPECT_EQ(selection.FindComponent(gui), nullptr);
  selection.RemoveClassFromComponent(shape, engine, false);
  EXPECT_EQ(Filed(selection, "VC++"), (Strings{"Engine()"}));
  selection.RemoveComponent(engine);
  selection.RemoveComponent(engine);  // absent: ignored
  EXPECT_TRUE(Languages(selection).empty());
  EXPECT_TRUE(selection.GetComponents("VC++")->Empty());

  // A component without entry gets an empty one; so does the
  // pseudo-component, which is never removed by a class removal.
  selection.RemoveClassFromComponent(shape, engine, false);
  EXPECT_EQ(Filed(selection, "VC++"), (Strings{"Engine()"}));
  selection.RemoveClassFromAllComponents(orphan);
  selection.RemoveClassFromComponent(orphan, nullptr);
  EXPECT_EQ(Filed(selection, "Unassigned"), (Strings{"<Unassigned>()"}));
  EXPECT_FALSE(selection.ContainsUnassignedClasses());
  try {
    selection.RemoveComponent(nullptr);
    ADD_FAILURE() << "no error";
  } catch (const automation::Error& error) {
    EXPECT_EQ(error.Number(), automation::kObjectNotSet);
  }

  selection.AddComponent(NewComponent("Loose", ""));  // refused: no add-in
  selection.SetIncludeALLComponents(true);
  selection.AddComponent(NewComponent("Loose2", ""));
  selection.RemoveAllUnassignedItems();
  selection.RemoveAllUnassignedItems();
  EXPECT_TRUE(selection.GetComponents("")->Empty());
  EXPECT_EQ(selection.FindComponent(nullptr), nullptr);
}

TEST_F(KelSortedComponentsTest, LookUpsCompareIdentifiersExactly) {
  auto gui = NewComponent("Gui", "Visual Basic");
  auto form = NewClass("Form", {gui});
  auto other = NewComponent("Other", "Visual Basic");
  kelSortedComponents selection;
  selection.GetAllComponentsAndClassesFromModel(model_);
  std::string id = gui->UniqueId();  // "ID..."

  EXPECT_NE(selection.FindComponentFromUniqueID(id), nullptr);
  EXPECT_EQ(selection.FindComponentFromUniqueID("id" + id.substr(2)), nullptr);
  EXPECT_EQ(selection.FindClass("id" + form->UniqueId().substr(2)),
            Object(form));  // class keys ignore case
  EXPECT_TRUE(selection.IsClassInComponent(form, gui));
  EXPECT_FALSE(selection.IsClassInComponent(form, other));
  EXPECT_EQ(selection.FindClassInComponent(form, gui)->Class(), Object(form));

  // The same component filed under two languages: the first in list order.
  auto first = selection.FindComponent(gui);
  gui->SetLanguage("VC++");
  selection.SetIncludeALLComponents(true);
  ASSERT_NE(selection.AddComponent(gui), first);
  EXPECT_EQ(selection.FindComponent(gui), first);
  selection.RemoveComponent(gui);
  EXPECT_EQ(Filed(selection, "Visual Basic"), (Strings{"Other()"}));
  EXPECT_NE(selection.FindComponent(gui), nullptr);  // the VC++ entry

  // An entry given another component is found by that one only.
  auto entry = selection.FindComponent(other);
  auto stranger = NewComponent("Stranger", "Cobol");
  entry->SetComponent(stranger);
  EXPECT_EQ(selection.FindComponent(stranger), entry);
  EXPECT_EQ(selection.FindComponent(other), nullptr);
}

TEST_F(KelSortedComponentsTest, CloneRefilesFromTheModel) {
  auto gui = NewComponent("Gui", "Visual Basic");
  auto tools = NewComponent("Tools", "Visual Basic");
  auto form = NewClass("Form", {gui, tools});
  kelSortedComponents selection;
  selection.AddComponentNoClasses(gui);
  ASSERT_EQ(selection.AddComponentNoClasses(gui), nullptr);  // filed already
  selection.AddClassInComponent(form, gui)->AddMember(form->NewAttribute("x"));
  selection.SetIncludeALLComponents(true);
  selection.AddComponent(NewComponent("Loose", ""));
  selection.AddClass(NewClass("Orphan"));

  auto copy = selection.Clone();
  EXPECT_EQ(Filed(*copy, "Visual Basic"),
            (Strings{"Gui(Form)", "Tools(Form)"}));
  // Without the flag the component without add-in keeps no classes.
  EXPECT_EQ(Filed(*copy, ""), (Strings{"Loose()", "<Unassigned>(Orphan)"}));
  EXPECT_TRUE(copy->FindClassInComponent(form, gui)->Members()->Empty());
  EXPECT_EQ(Filed(selection, "Visual Basic"), (Strings{"Gui(Form)"}));
}

TEST_F(KelSortedComponentsTest, SortsTheSelectionInItsOrder) {
  auto gui = NewComponent("Gui", "Visual Basic");
  auto package = model_->RootComponentPackage()->NewPackage("Pkg");
  auto inner = package->NewComponent("Inner");
  inner->SetLanguage("Visual Basic");
  auto tools = NewComponent("Tools", "Visual Basic");
  auto logical = model_->RootLogicalPackage()->NewPackage("Logic");
  auto loose = logical->NewClass("Loose");
  auto picked = NewClass("Picked", {tools});
  for (const auto& element :
       std::vector<std::shared_ptr<host::modeltool::Element>>{logical, picked,
                                                              package, gui}) {
    model_->Select(element);
  }

  kelSortedComponents selection;
  selection.SortSelection(model_);
  EXPECT_EQ(Filed(selection, "Visual Basic"),
            (Strings{"Gui()", "Inner()", "Tools(Picked)"}));
  EXPECT_EQ(Filed(selection, ""), (Strings{"<Unassigned>(Loose)"}));

  // The modelling tool's failures reach the caller.
  EXPECT_THROW(selection.SortSelection(gui), automation::Error);
}

TEST_F(KelSortedComponentsTest, UnmodifiableUnassignedClassesGo) {
  auto locked = model_->RootLogicalPackage()->NewPackage("Locked");
  locked->NewClass("Frozen");
  NewClass("Free");
  kelSortedComponents selection;
  selection.GetAllClassesFromModel(model_);
  locked->SetModifiable(false);
  selection.RemoveAllUnmodifiableUnassignedClasses();
  EXPECT_EQ(Filed(selection, ""), (Strings{"<Unassigned>(Free)"}));
}

TEST_F(KelSortedComponentsTest, MembersComeAndGoByUniqueIdentifier) {
  auto gui = NewComponent("Gui", "Visual Basic");
  auto form = NewClass("Form", {gui});
  auto view = NewClass("View", {gui});
  auto x = form->NewAttribute("x");
  auto draw = form->NewOperation("Draw");
  kelSortedComponents selection;
  auto entry = selection.AddComponent(gui);
  ASSERT_NE(entry, nullptr);

  struct Step {
    const char* what;
    bool add;
    Object member;
    Object cls;
    bool result;
    int form_members;  // -1: Form has no entry
  };
  const Step steps[] = {
      {"add x", true, x, form, true, 1},
      {"add x again", true, x, form, false, 1},
      {"add Nothing", true, nullptr, form, false, 1},
      {"add draw", true, draw, form, true, 2},
      {"class without entry", true, x, NewClass("Other"), false, 2},
      {"remove absent", false, NewClass("Stray"), form, false, 2},
      {"remove x", false, x, form, true, 1},
      {"remove the last", false, draw, form, true, -1},
      {"entry gone", false, draw, form, false, -1},
  };
  for (const Step& step : steps) {
    bool result = step.add
                      ? entry->AddMemberInClass(step.member, step.cls)
                      : entry->RemoveMemberFromClass(step.member, step.cls);
    EXPECT_EQ(result, step.result) << step.what;
    auto* found = entry->Classes()->Find(form->UniqueId());
    EXPECT_EQ(found ? (*found)->Members()->Count() : -1, step.form_members)
        << step.what;
  }

  // The first class is gone; the other keeps its place.
  ObjectCollection classes = entry->GetOrelClasses();
  ASSERT_EQ(classes.Count(), 1);
  EXPECT_EQ(classes.Item(view->UniqueId()), Object(view));
  std::string key = view->UniqueId();
  for (char& c : key) c = static_cast<char>(std::tolower(c));
  EXPECT_TRUE(entry->IncludesClass(key));
  entry->RemoveClass("no such key");
  entry->RemoveClass(key);
  EXPECT_FALSE(entry->IncludesClass(view->UniqueId()));
}

}  // namespace
}  // namespace kelqln::testing
