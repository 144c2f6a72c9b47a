// The MIDL companion of VC++ components: interfaces and coclasses without a
// MIDL component are assigned to "<component>.idl", made or reused in the
// component's package.
#include <gtest/gtest.h>

#include <fstream>
#include <string>
#include <vector>

#include "host/modeltool/tool_property.h"
#include "selection/kel_sorted_class.h"
#include "selection/kel_sorted_component.h"
#include "selection/kel_sorted_components.h"
#include "selection_test_support.h"

namespace kelqln::testing {
namespace {

using host::modeltool::Class;
using host::modeltool::Component;
using host::modeltool::ComponentPackage;
using Strings = std::vector<std::string>;

class MidlCompanionTest : public SelectionTest {
 protected:
  // A VC++ component `name` in a new package, with an interface, a coclass
  // and a plain class.
  std::shared_ptr<Component> NewVcComponent(const std::string& name) {
    package_ = model_->RootComponentPackage()->NewPackage("Pkg" + name);
    auto component = package_->NewComponent(name);
    component->SetLanguage("VC++");
    component->CreateToolProperty("VC++", "Custom", "yes");
    component->CreateToolProperty("VC++", "Kind", "EXE");
    classes_ = {NewClass("I" + name, {component}, "Interface"),
                NewClass("C" + name, {component}, "coclass"),
                NewClass("P" + name, {component})};
    return component;
  }

  void Touch(const std::string& file) { std::ofstream(directory_ / file); }

  static std::vector<std::string> ComponentNames(
      const std::shared_ptr<Class>& cls) {
    std::vector<std::string> names;
    for (const auto& component : cls->Components()) {
      names.push_back(component.lock()->Name());
    }
    return names;
  }

  std::shared_ptr<ComponentPackage> package_;
  std::vector<std::shared_ptr<Class>> classes_;
};

TEST_F(MidlCompanionTest, IsMadeBesideTheComponentWithItsInterfaceFile) {
  const std::string dir = directory_.string() + "/";
  struct Case {
    std::vector<std::string> files;
    std::string file_properties;  // after the copied and the Kind property
  };
  const std::vector<Case> cases = {
      {{"s0.idl", "s0.odl"},
       "VC++:ProjectFile=" + dir + "s0.dsp VC++:FileName=" + dir + "s0.idl"},
      {{"s1.odl"},
       "VC++:ProjectFile=" + dir + "s1.dsp VC++:FileName=" + dir + "s1.odl"},
      {{},
       "VC++:ProjectFile= VC++:WorkspaceFile= VC++:ProjectName= "
       "VC++:FileName="},
  };
  for (size_t i = 0; i < cases.size(); ++i) {
    std::string name = "Shapes" + std::to_string(i);
    for (const auto& file : cases[i].files) Touch(file);
    auto component = NewVcComponent(name);
    component->CreateToolProperty("VC++", "ProjectFile",
                                  dir + "s" + std::to_string(i) + ".dsp");
    kelSortedComponents selection;
    ASSERT_NE(selection.AddComponent(component), nullptr);

    ASSERT_EQ(package_->Components().size(), 2u) << name;
    auto midl = package_->Components()[1];
    std::string properties;
    for (const auto& property : midl->ToolProperties()) {
      properties += property->Tool() + ":" + property->Name() + "=" +
                    property->Value() + " ";
    }
    EXPECT_EQ(properties, "VC++:Custom=yes VC++:Kind=MIDL " +
                              cases[i].file_properties + " ");
    EXPECT_EQ(midl->Name() + " " + midl->Language() + " " + midl->Stereotype(),
              name + ".idl VC++ MIDL");
    EXPECT_EQ(ComponentNames(classes_[0]), (Strings{name, name + ".idl"}));
    EXPECT_EQ(ComponentNames(classes_[1]), (Strings{name, name + ".idl"}));
    EXPECT_EQ(ComponentNames(classes_[2]), (Strings{name}));
    EXPECT_EQ(selection.FindComponent(midl)->Classes()->Count(), 2);
    EXPECT_EQ(LogMessages().back(),
              "AddClass: Assign to MIDL " + name + ".idl\r\n\tCreate=True");
  }
}

TEST_F(MidlCompanionTest, IsReusedOnlyWhenUsableInAModifiablePackage) {
  struct Case {
    const char* what;
    const char* language;  // of a present "<name>.idl"; null: none there
    const char* kind;
    bool package_modifiable;
    bool root_modifiable;
    const char* log;  // the last debug line
  };
  const Case cases[] = {
      {"same language", "VC++", "MIDL", true, true, "Create=False"},
      {"no language", "", "MIDL", true, true, "Create=False"},
      {"other language", "Visual Basic", "MIDL", true, true, "CAN NOT"},
      {"no Kind", "VC++", nullptr, true, true, "CAN NOT"},
      {"in the root", nullptr, nullptr, false, true, "Create=True"},
      {"nowhere", nullptr, nullptr, false, false, "CAN NOT"},
  };
  int i = 0;
  for (const Case& c : cases) {
    std::string name = "Lib" + std::to_string(i++);
    auto component = NewVcComponent(name);
    std::shared_ptr<Component> present;
    if (c.language) {
      present = package_->NewComponent(name + ".idl");
      present->SetLanguage(c.language);
      if (c.kind) present->CreateToolProperty("VC++", "Kind", c.kind);
    }
    package_->SetModifiable(c.package_modifiable);
    model_->RootComponentPackage()->SetModifiable(c.root_modifiable);
    size_t root_components =
        model_->RootComponentPackage()->Components().size();

    kelSortedComponents selection;
    selection.AddComponent(component);

    std::string log = LogMessages().back();
    EXPECT_NE(log.find(c.log), std::string::npos) << c.what << ": " << log;
    bool assigned = std::string(c.log) != "CAN NOT";
    EXPECT_EQ(classes_[0]->Components().size(), assigned ? 2u : 1u) << c.what;
    if (present && assigned) {
      EXPECT_EQ(classes_[0]->Components()[1].lock(), present) << c.what;
    }
    size_t made = std::string(c.what) == "in the root" ? 1 : 0;
    EXPECT_EQ(model_->RootComponentPackage()->Components().size(),
              root_components + made)
        << c.what;
  }
}

TEST_F(MidlCompanionTest, AClassAddedAloneGoesToItsLastComponentsCompanion) {
  auto first = NewVcComponent("First");
  auto last = NewVcComponent("Last");
  auto shared = NewClass("IShared", {first, last}, "interface");
  auto midl = NewClass("IHasMidl", {first}, "interface");
  auto own = model_->RootComponentPackage()->NewComponent("Own.idl");
  own->SetStereotype("MIDL");
  midl->AssignTo(own);

  kelSortedComponents selection;
  selection.AddClass(midl);
  EXPECT_EQ(midl->Components().size(), 2u);  // it has a MIDL component
  selection.AddClass(shared);
  EXPECT_EQ(LogMessages().back(),
            "AddClass: Assign to MIDL Last.idl\r\n\tCreate=True");
  auto companion = package_->Components().back();
  EXPECT_EQ(shared->Components().back().lock(), companion);
  // The companion is filed with all its classes.
  auto entry = selection.FindComponent(companion);
  ASSERT_NE(entry, nullptr);
  EXPECT_TRUE(entry->IncludesClass(shared->UniqueId()));
}

}  // namespace
}  // namespace kelqln::testing
