// A component entry's classes and a class entry's members.
#include "selection/kel_sorted_component.h"

#include <gtest/gtest.h>

#include <cctype>
#include <string>

#include "host/modeltool/operation.h"
#include "selection/kel_sorted_class.h"
#include "selection/kel_sorted_components.h"
#include "selection_test_support.h"

namespace kelqln::testing {
namespace {

class KelSortedComponentTest : public SelectionTest {};

TEST_F(KelSortedComponentTest, MembersComeAndGoByUniqueIdentifier) {
  auto gui = NewComponent("Gui", "VB");
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

TEST_F(KelSortedComponentTest, ClassEntryRefusesWhatItCannotKey) {
  auto form = NewClass("Form");
  auto y = form->NewAttribute("y");
  kelSortedClass entry;
  EXPECT_TRUE(entry.AddMember(y));
  EXPECT_FALSE(entry.AddMember(y));
  EXPECT_FALSE(entry.AddMember(nullptr));
  EXPECT_FALSE(entry.RemoveMember(nullptr));
  EXPECT_TRUE(entry.RemoveMember(y));
  EXPECT_FALSE(entry.RemoveMember(y));
  EXPECT_TRUE(entry.Members()->Empty());
}

}  // namespace
}  // namespace kelqln::testing
