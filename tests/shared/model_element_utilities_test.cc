// The model-element look-ups against models of the modelling tool.
#include "shared/model_element_utilities.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "host/modeltool/application.h"
#include "host/modeltool/association.h"
#include "host/modeltool/class.h"
#include "host/modeltool/component.h"
#include "host/modeltool/component_package.h"
#include "host/modeltool/dependency.h"
#include "host/modeltool/logical_package.h"
#include "host/modeltool/model.h"
#include "host/modeltool/role.h"

namespace kelqln {
namespace {

using automation::Object;
using host::modeltool::Application;
using host::modeltool::Class;
using host::modeltool::Component;
using host::modeltool::Model;

class ModelElementUtilitiesTest : public ::testing::Test {
 protected:
  void SetUp() override {
    tool_ = Application::Create();
    model_ = Model::Create();
    tool_->SetCurrentModel(model_);
  }

  std::shared_ptr<Component> NewComponent(const std::string& name) {
    return model_->RootComponentPackage()->NewComponent(name);
  }

  // A class of that name assigned to `component`.
  std::shared_ptr<Class> NewClassIn(const std::string& name,
                                    const std::shared_ptr<Component>& owner) {
    auto cls = model_->RootLogicalPackage()->NewClass(name);
    cls->AssignTo(owner);
    return cls;
  }

  // `client` implements `supplier`.
  static void Implement(const std::shared_ptr<Component>& client,
                        const std::shared_ptr<Component>& supplier,
                        const std::string& stereotype = "Implements") {
    client->NewDependency(supplier)->SetStereotype(stereotype);
  }

  std::shared_ptr<Application> tool_;
  std::shared_ptr<Model> model_;
};

TEST_F(ModelElementUtilitiesTest, ClassesAreFoundByComponentAndClassName) {
  auto core = NewComponent("Core");
  auto widget = NewClassIn("Widget", core);
  auto lib = NewComponent("CoreLib");
  lib->OverrideToolProperty("COM", "_OCAName", "CoreServer");
  auto gadget = NewClassIn("Gadget", lib);
  auto other_tool = NewComponent("Other");
  other_tool->OverrideToolProperty("VC++", "_OCAName", "OtherServer");
  NewClassIn("Gadget", other_tool);

  struct Case {
    const char* class_name;
    const char* component_name;
    Object component;
    Object cls;
  };
  const Case cases[] = {
      {"Widget", "Core", core, widget},
      {"Widget", "cORE", core, widget},
      {"Gadget", "CoreServer", lib, gadget},
      {"Gadget", "coreserver", lib, gadget},
      {"Gadget", "OtherServer", nullptr, nullptr},
      {"widget", "Core", core, nullptr},  // class names match exactly
      {"Missing", "Core", core, nullptr},
      {"Widget", "Nowhere", nullptr, nullptr},
  };
  for (const Case& c : cases) {
    Object found_class = widget;
    Object found_component = core;
    EXPECT_EQ(FindClassByNames(tool_, c.class_name, c.component_name,
                               found_class, found_component),
              c.cls != nullptr)
        << c.class_name << " in " << c.component_name;
    EXPECT_EQ(found_component, c.component)
        << c.class_name << " in " << c.component_name;
    EXPECT_EQ(found_class, c.cls) << c.class_name << " in " << c.component_name;
  }
}

TEST_F(ModelElementUtilitiesTest, EmptyComponentNameNeedsNoModel) {
  Object found_class;
  Object found_component;
  // Without an application any model access would raise.
  EXPECT_FALSE(
      FindClassByNames(nullptr, "Widget", "", found_class, found_component));
  EXPECT_EQ(found_class, nullptr);
  EXPECT_EQ(found_component, nullptr);
}

TEST_F(ModelElementUtilitiesTest, ImplementingComponentStandsForTheOther) {
  struct Case {
    const char* name;
    bool implementer_first;  // made before the component it implements
    const char* implementer_name;
    const char* stereotype;
    bool resolves;
  };
  const Case cases[] = {
      {"made after", false, "Engine", "Implements", true},
      {"made before", true, "Engine", "Implements", true},
      {"stereotype in other case", false, "Engine", "implements", true},
      {"name in other case", false, "ENGINE", "Implements", true},
      {"other stereotype", false, "Engine", "Uses", false},
      {"other name", false, "EngineImpl", "Implements", false},
  };
  for (const Case& c : cases) {
    SetUp();
    std::shared_ptr<Component> implementer;
    if (c.implementer_first) implementer = NewComponent(c.implementer_name);
    auto engine = NewComponent("Engine");
    if (!c.implementer_first) implementer = NewComponent(c.implementer_name);
    Implement(implementer, engine, c.stereotype);
    NewClassIn("Motor", engine);
    auto motor = NewClassIn("Motor", implementer);
    Object expected = c.resolves ? Object(implementer) : Object(engine);

    EXPECT_EQ(ResolveImplementingComponent(engine), expected) << c.name;
    EXPECT_EQ(ResolveImplementingComponent(implementer), Object(implementer))
        << c.name;
    Object found_class;
    Object found_component;
    EXPECT_TRUE(FindClassByNames(tool_, "Motor", "Engine", found_class,
                                 found_component))
        << c.name;
    EXPECT_EQ(found_component, expected) << c.name;
    EXPECT_EQ(found_class == Object(motor), c.resolves) << c.name;
  }
}

TEST_F(ModelElementUtilitiesTest, ImplementsDependencyIsTheOneOnTheComponent) {
  auto engine = NewComponent("Engine");
  auto tools = NewComponent("Tools");
  auto client = NewComponent("Engine");
  client->NewDependency(tools);
  auto on_engine = client->NewDependency(engine);

  EXPECT_EQ(FindImplementsDependency(client, engine), Object(on_engine));
  EXPECT_EQ(FindImplementsDependency(engine, client), nullptr);
  EXPECT_EQ(FindImplementsDependency(client, client), nullptr);
  EXPECT_EQ(FindImplementsDependency(nullptr, engine), nullptr);
  EXPECT_EQ(FindImplementsDependency(client, nullptr), nullptr);
}

TEST_F(ModelElementUtilitiesTest, OtherRoleIsTheOppositeEnd) {
  auto order = model_->RootLogicalPackage()->NewClass("Order");
  auto line = model_->RootLogicalPackage()->NewClass("Line");
  auto lines = model_->NewAssociation(order, line, "lines");
  auto self = model_->NewAssociation(order, order, "next");
  for (const auto& association : {lines, self}) {
    EXPECT_EQ(GetOtherRole(association->Role1()), Object(association->Role2()));
    EXPECT_EQ(GetOtherRole(association->Role2()), Object(association->Role1()));
  }
}

}  // namespace
}  // namespace kelqln
