// Model updates through the code view: what a first update makes, that a
// second one changes nothing, what goes to the collector when the code
// loses something, and that a partial update leaves the rest alone.
#include <algorithm>
#include <functional>

#include "code_view_fixture.h"

namespace host::codeview {
namespace {

using Vanishing = std::multiset<std::string>;

std::string Visibility(const modeltool::Element& element) {
  return element.ToolPropertyValue("VC++", "Visibility");
}

TEST_F(CodeViewTest, AFirstUpdateMakesTheClassesAndMembersOfTheCode) {
  WriteCode(BaseDescription());
  Object collector = Update(Project());

  EXPECT_TRUE(Vanished(collector).empty());
  EXPECT_TRUE(Warnings().empty()) << Report();
  EXPECT_TRUE(Errors().empty());
  EXPECT_FALSE(Logs().empty());

  for (const char* name : {"Shape", "IDrawable", "Circle", "Canvas"}) {
    auto cls = ModelClass(name);
    ASSERT_NE(cls, nullptr) << name;
    EXPECT_EQ(cls->Package()->Name(), "App") << name;
    EXPECT_EQ(cls->Components().size(), 1u) << name;
    EXPECT_EQ(cls->Components()[0].lock(), component_) << name;
  }
  EXPECT_EQ(model_->Classes().size(), 4u);
  EXPECT_EQ(ModelClass("IDrawable")->Stereotype(), "interface");

  auto shape = ModelClass("Shape");
  ASSERT_EQ(shape->Attributes().size(), 2u);
  EXPECT_EQ(shape->Attributes()[0]->Name(), "x");
  EXPECT_EQ(shape->Attributes()[0]->Type(), "int");
  EXPECT_EQ(Visibility(*shape->Attributes()[0]), "private");
  EXPECT_EQ(Visibility(*shape->Attributes()[1]), "public");
  ASSERT_EQ(shape->Operations().size(), 2u);
  const auto& draw = shape->Operations()[0];
  EXPECT_EQ(draw->Name(), "Draw");
  EXPECT_EQ(draw->ReturnType(), "void");
  ASSERT_EQ(draw->Parameters().size(), 1u);
  EXPECT_EQ(draw->Parameters()[0]->Name(), "context");
  EXPECT_EQ(draw->Parameters()[0]->Type(), "Context&");

  auto circle = ModelClass("Circle");
  ASSERT_EQ(circle->InheritRelations().size(), 1u);
  EXPECT_EQ(circle->InheritRelations()[0]->Supplier(), shape);
  ASSERT_EQ(circle->RealizeRelations().size(), 1u);
  EXPECT_EQ(circle->RealizeRelations()[0]->Supplier(), ModelClass("IDrawable"));

  auto canvas = ModelClass("Canvas");
  ASSERT_EQ(canvas->HasRelationships().size(), 1u);
  EXPECT_EQ(canvas->HasRelationships()[0]->Supplier(), shape);
  // Both classes' ends make one association, navigable both ways.
  ASSERT_EQ(model_->Associations().size(), 1u);
  const auto& holds = model_->Associations()[0];
  EXPECT_EQ(holds->Name(), "holds");
  auto items = canvas->Roles();
  ASSERT_EQ(items.size(), 1u);
  EXPECT_EQ(items[0]->Name(), "items");
  EXPECT_EQ(items[0]->GetClass(), shape);
  EXPECT_TRUE(items[0]->IsNavigable());
  EXPECT_EQ(items[0]->Cardinality(), "0..*");
  EXPECT_TRUE(items[0]->IsAggregate());
  auto back = shape->Roles();
  ASSERT_EQ(back.size(), 1u);
  EXPECT_EQ(back[0]->Name(), "canvas");
  EXPECT_TRUE(back[0]->IsNavigable());
  EXPECT_TRUE(model_->IntegrityProblems().empty());
}

TEST_F(CodeViewTest, ASecondIdenticalUpdateChangesAndCollectsNothing) {
  WriteCode(BaseDescription());
  Update(Project());
  model_->Save();
  std::string before = ReadFile(ModelPath());
  reporter_->calls.clear();

  Object collector = Update(Project());
  EXPECT_TRUE(Vanished(collector).empty());
  EXPECT_TRUE(reporter_->calls.empty()) << Report();
  model_->Save();
  EXPECT_EQ(ReadFile(ModelPath()), before);

  // The model file keeps all the update compares: a model read back from it
  // is up to date as well.
  model_ = modeltool::Model::Load(ModelPath());
  app_->SetCurrentModel(model_);
  component_ = model_->Find<modeltool::Component>(component_->UniqueId());
  collector = Update(Project());
  EXPECT_TRUE(Vanished(collector).empty());
  EXPECT_TRUE(reporter_->calls.empty()) << Report();
}

TEST_F(CodeViewTest, WhatTheCodeLosesGoesToTheCollectorAndStaysInTheModel) {
  const struct {
    const char* what;
    std::function<void(Json&)> change;
    Vanishing vanished;
  } kCases[] = {
      {"a class",
       [](Json& j) { j["components"][0]["classes"].erase(2); },
       {"Circle"}},
      {"an attribute",
       [](Json& j) { ClassIn(j, "Shape")["attributes"].erase(1); },
       {"Shape: Attribute y"}},
      {"an operation",
       [](Json& j) { ClassIn(j, "Shape")["operations"].erase(1); },
       {"Shape: Operation Area"}},
      {"a base",
       [](Json& j) { ClassIn(j, "Circle").erase("bases"); },
       {"Circle: InheritRelation Shape"}},
      {"a realized interface",
       [](Json& j) { ClassIn(j, "Circle").erase("realizes"); },
       {"Circle: RealizeRelation IDrawable"}},
      {"a has-relationship",
       [](Json& j) { ClassIn(j, "Canvas").erase("has"); },
       {"Canvas: HasRelationship background"}},
      {"an association end",
       [](Json& j) { ClassIn(j, "Canvas").erase("roles"); },
       {"Canvas: Role items"}},
      {"several members of two classes",
       [](Json& j) {
         ClassIn(j, "Shape").erase("attributes");
         ClassIn(j, "IDrawable").erase("operations");
       },
       {"Shape: Attribute x", "Shape: Attribute y",
        "IDrawable: Operation Draw"}},
  };
  for (const auto& test : kCases) {
    SCOPED_TRACE(test.what);
    NewModel();
    Json code = BaseDescription();
    WriteCode(code);
    Update(Project());
    size_t elements = model_->ElementCount();

    test.change(code);
    WriteCode(code);
    reporter_->calls.clear();
    Object collector = Update(Project());
    EXPECT_EQ(Vanished(collector), test.vanished);
    EXPECT_EQ(model_->ElementCount(), elements);
    EXPECT_TRUE(reporter_->calls.empty()) << Report();
  }
}

TEST_F(CodeViewTest, TheEndsTwoClassesDeclareMakeOneAssociation) {
  const struct {
    const char* what;
    std::function<void(Json&)> change;
    size_t associations;
    bool navigable_back;
  } kCases[] = {
      {"named", [](Json&) {}, 1, true},
      {"unnamed",
       [](Json& j) {
         ClassIn(j, "Shape")["roles"][0].erase("association");
         ClassIn(j, "Canvas")["roles"][0].erase("association");
       },
       1, true},
      {"one way", [](Json& j) { ClassIn(j, "Shape").erase("roles"); }, 1,
       false},
      {"another association",
       [](Json& j) { ClassIn(j, "Shape")["roles"][0]["association"] = "on"; },
       2, false},
  };
  for (const auto& test : kCases) {
    SCOPED_TRACE(test.what);
    NewModel();
    Json code = BaseDescription();
    test.change(code);
    WriteCode(code);
    Update(Project());
    ASSERT_EQ(model_->Associations().size(), test.associations);
    auto roles = ModelClass("Canvas")->Roles();
    auto items = std::find_if(roles.begin(), roles.end(), [](const auto& r) {
      return r->Name() == "items";
    });
    ASSERT_NE(items, roles.end());
    EXPECT_TRUE((*items)->IsNavigable());
    auto back = (*items)->GetAssociation()->OtherRole(**items);
    EXPECT_EQ(back->IsNavigable(), test.navigable_back);
    EXPECT_EQ(back->Name(), test.navigable_back ? "canvas" : "");

    reporter_->calls.clear();
    EXPECT_TRUE(Vanished(Update(Project())).empty());
    EXPECT_TRUE(reporter_->calls.empty()) << Report();
  }
}

TEST_F(CodeViewTest, ChangedMembersAreUpdatedInPlace) {
  Json code = BaseDescription();
  WriteCode(code);
  Update(Project());
  auto shape = ModelClass("Shape");
  auto x = shape->Attributes()[0];
  auto draw = shape->Operations()[0];
  auto items = ModelClass("Canvas")->Roles()[0];

  Json& shape_code = ClassIn(code, "Shape");
  shape_code["attributes"][0]["type"] = "long";
  shape_code["attributes"][0]["visibility"] = "protected";
  shape_code["operations"][0]["returnType"] = "bool";
  shape_code["operations"][0]["parameters"].push_back(
      {{"name", "scale"}, {"type", "double"}});
  ClassIn(code, "Circle")["stereotype"] = "entity";
  ClassIn(code, "Canvas")["roles"][0]["cardinality"] = "1..*";
  WriteCode(code);
  reporter_->calls.clear();
  Object collector = Update(Project());

  EXPECT_TRUE(Vanished(collector).empty());
  EXPECT_EQ(shape->Attributes()[0], x);
  EXPECT_EQ(x->Type(), "long");
  EXPECT_EQ(Visibility(*x), "protected");
  EXPECT_EQ(shape->Operations()[0], draw);
  EXPECT_EQ(draw->ReturnType(), "bool");
  ASSERT_EQ(draw->Parameters().size(), 2u);
  EXPECT_EQ(draw->Parameters()[1]->Type(), "double");
  EXPECT_EQ(ModelClass("Circle")->Stereotype(), "entity");
  EXPECT_EQ(items->Cardinality(), "1..*");
  Lines expected = {
      "Shape.x: type changed from \"int\" to \"long\"",
      "Shape.x: visibility changed from \"private\" to \"protected\"",
      "Shape.Draw: return type changed from \"void\" to \"bool\"",
      "Shape.Draw: parameters changed from (context: Context&) to (context: "
      "Context&, scale: double)",
      "Circle: stereotype changed from \"\" to \"entity\"",
      "Canvas.items: cardinality changed from \"0..*\" to \"1..*\""};
  EXPECT_EQ(Logs(), expected);
}

TEST_F(CodeViewTest, ARelationToAClassTheModelDoesNotKnowIsAWarning) {
  Json code = BaseDescription();
  ClassIn(code, "Circle")["bases"].push_back("CObject");
  ClassIn(code, "Canvas")["has"].push_back(
      {{"name", "name"}, {"class", "std::string"}});
  WriteCode(code);
  Update(Project());
  EXPECT_EQ(Warnings(),
            Lines{"Circle: CObject is not a class of the model; no inherit "
                  "relation to it"});
  EXPECT_EQ(ModelClass("Circle")->InheritRelations().size(), 1u);
  // A has-relationship may point outside the model, by name.
  auto has = ModelClass("Canvas")->HasRelationships();
  ASSERT_EQ(has.size(), 2u);
  EXPECT_EQ(has[1]->Supplier(), nullptr);
  EXPECT_EQ(has[1]->SupplierName(), "std::string");

  // Once the model has the class, the relation is made.
  model_->RootLogicalPackage()->NewClass("CObject");
  reporter_->calls.clear();
  Update(Project());
  EXPECT_TRUE(Warnings().empty());
  EXPECT_EQ(ModelClass("Circle")->InheritRelations().size(), 2u);
}

TEST_F(CodeViewTest, UpdatingSomeComponentsLeavesTheOthersAlone) {
  Json code = BaseDescription();
  WriteCode(code);
  // Only canvas.h: the classes it refers to are made, but not filled.
  Object collector = Update(Project(), {"canvas.h"});
  EXPECT_TRUE(Vanished(collector).empty());
  auto shape = ModelClass("Shape");
  ASSERT_NE(shape, nullptr);
  EXPECT_TRUE(shape->Attributes().empty());
  EXPECT_EQ(ModelClass("Circle"), nullptr);
  EXPECT_EQ(ModelClass("Canvas")->HasRelationships()[0]->Supplier(), shape);

  // shapes.h later fills the same Shape and joins the association.
  collector = Update(Project(), {"shapes.h"});
  EXPECT_TRUE(Vanished(collector).empty());
  EXPECT_EQ(ModelClass("Shape"), shape);
  EXPECT_EQ(shape->Attributes().size(), 2u);
  EXPECT_EQ(model_->Classes().size(), 4u);
  EXPECT_EQ(model_->Associations().size(), 1u);

  // What shapes.h lost is not collected by an update of canvas.h alone; a
  // class gone from the whole code is.
  ClassIn(code, "Shape").erase("attributes");
  code["components"][0]["classes"].erase(1);  // IDrawable
  ClassIn(code, "Circle").erase("realizes");
  WriteCode(code);
  collector = Update(Project(), {"canvas.h"});
  EXPECT_EQ(Vanished(collector), Vanishing{"IDrawable"});
  collector = Update(Project(), {"shapes.h"});
  EXPECT_EQ(Vanished(collector),
            (Vanishing{"IDrawable", "Shape: Attribute x", "Shape: Attribute y",
                       "Circle: RealizeRelation IDrawable"}));
}

TEST_F(CodeViewTest, ClassesAreMatchedByTheIdTheCodeRecords) {
  // The model class was renamed since the code was made from it.
  auto home = model_->RootLogicalPackage()->NewPackage("App");
  auto renamed = home->NewClass("Figure", "{SHAPE}");
  renamed->AssignTo(component_);
  Json code = BaseDescription();
  ClassIn(code, "Shape")["id"] = "{SHAPE}";
  // A new class keeps the id its code records while the model has none.
  ClassIn(code, "Canvas")["id"] = "{CANVAS}";
  WriteCode(code);
  Object collector = Update(Project());
  EXPECT_TRUE(Vanished(collector).empty());
  EXPECT_EQ(renamed->Attributes().size(), 2u);
  EXPECT_EQ(ModelClass("Shape"), nullptr);
  ASSERT_NE(ModelClass("Canvas"), nullptr);
  EXPECT_EQ(ModelClass("Canvas")->UniqueId(), "{CANVAS}");
}

}  // namespace
}  // namespace host::codeview
