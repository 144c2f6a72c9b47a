// Each deletion member removes its element and everything that hangs on it,
// so that nothing in the model refers to a deleted element afterwards.
#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include "automation/call.h"
#include "external/orel.h"
#include "sample_model.h"

namespace host::modeltool {
namespace {

namespace orel = external::orel;
using automation::Call;
using automation::CBool;
using automation::CLng;
using automation::Get;
using automation::GetObject;
using automation::Object;

int32_t CountOf(const Object& owner, automation::DispId collection) {
  return CLng(Get(GetObject(owner, collection), orel::collection::kCount));
}

int32_t CountByName(const Object& owner, const char* collection) {
  return CLng(Get(automation::CObj(automation::GetByName(owner, collection)),
                  orel::collection::kCount));
}

bool InModel(const SampleModel& s, const std::shared_ptr<Element>& element) {
  return s.model->FindElement(element->UniqueId()) == element;
}

// One row per deletion member: the call, and what must hold afterwards
// besides the model's own invariants.
struct DeletionCase {
  const char* name;
  std::function<Object(SampleModel&)> owner;
  automation::DispId member;
  std::function<Object(SampleModel&)> element;
  std::function<void(SampleModel&)> check;
};

TEST(ModelDeletionTest, EachDeletionMemberRemovesItsElement) {
  const DeletionCase kCases[] = {
      {"attribute", [](SampleModel& s) -> Object { return s.shape; },
       orel::class_::kDeleteAttribute,
       [](SampleModel& s) -> Object { return s.x; },
       [](SampleModel& s) {
         EXPECT_EQ(CountByName(s.shape, "Attributes"), 1);
         EXPECT_FALSE(InModel(s, s.x));
       }},
      {"operation", [](SampleModel& s) -> Object { return s.shape; },
       orel::class_::kDeleteOperation,
       [](SampleModel& s) -> Object { return s.draw; },
       [](SampleModel& s) {
         EXPECT_EQ(CountByName(s.shape, "Operations"), 0);
         EXPECT_FALSE(InModel(s, s.draw));
         EXPECT_FALSE(InModel(s, s.draw->Parameters().front()));
       }},
      {"has-relationship", [](SampleModel& s) -> Object { return s.canvas; },
       orel::class_::kDeleteHasRelationship,
       [](SampleModel& s) -> Object { return s.canvas_has_shapes; },
       [](SampleModel& s) {
         EXPECT_EQ(CountByName(s.canvas, "HasRelationships"), 0);
         EXPECT_TRUE(s.shape->SupplierOf().size() == 1);  // the inherit one
       }},
      {"inherit relation", [](SampleModel& s) -> Object { return s.circle; },
       orel::class_::kDeleteInheritRelation,
       [](SampleModel& s) -> Object { return s.circle_is_shape; },
       [](SampleModel& s) {
         EXPECT_EQ(CountByName(s.circle, "InheritRelations"), 0);
         EXPECT_EQ(CountByName(s.circle, "RealizeRelations"), 1);
       }},
      {"realize relation", [](SampleModel& s) -> Object { return s.circle; },
       orel::class_::kDeleteRealizeRelation,
       [](SampleModel& s) -> Object { return s.circle_draws; },
       [](SampleModel& s) {
         EXPECT_EQ(CountByName(s.circle, "RealizeRelations"), 0);
         EXPECT_TRUE(s.drawable->SupplierOf().empty());
       }},
      {"association", [](SampleModel& s) -> Object { return s.shape; },
       orel::class_::kDeleteAssociation,
       [](SampleModel& s) -> Object { return s.canvas_shapes; },
       [](SampleModel& s) {
         EXPECT_EQ(CountByName(s.model, "Associations"), 0);
         EXPECT_EQ(CountByName(s.canvas, "Associations"), 0);
         EXPECT_EQ(CountByName(s.shape, "Roles"), 0);
         EXPECT_FALSE(InModel(s, s.canvas_shapes->Role1()));
         EXPECT_FALSE(InModel(s, s.canvas_shapes->Role2()));
       }},
      {"class", [](SampleModel& s) -> Object { return s.domain; },
       orel::logical_package::kDeleteClass,
       [](SampleModel& s) -> Object { return s.shape; },
       [](SampleModel& s) {
         // Its members, the relations of other classes to it, its
         // association and its assignment all went with it.
         EXPECT_FALSE(InModel(s, s.x));
         EXPECT_FALSE(InModel(s, s.draw));
         EXPECT_EQ(CountByName(s.circle, "InheritRelations"), 0);
         EXPECT_EQ(CountByName(s.canvas, "HasRelationships"), 0);
         EXPECT_EQ(CountByName(s.canvas, "Associations"), 0);
         EXPECT_EQ(CountByName(s.model, "Associations"), 0);
         EXPECT_EQ(CountOf(s.lib, orel::component::kClasses), 2);
         EXPECT_EQ(CountOf(s.domain, orel::logical_package::kClasses), 3);
         EXPECT_EQ(CountOf(s.model, orel::model::kAllClasses), 3);
         EXPECT_EQ(CountOf(s.model, orel::model::kSelectedClasses), 0);
         EXPECT_EQ(
             GetObject(GetObject(s.model, orel::model::kAllClasses),
                       orel::collection::kFindByUniqueId, s.shape->UniqueId()),
             nullptr);
       }},
  };
  for (const auto& row : kCases) {
    SCOPED_TRACE(row.name);
    SampleModel s;
    s.model->Select(s.shape);
    size_t before = s.model->ElementCount();
    Object owner = row.owner(s);
    Object element = row.element(s);
    EXPECT_TRUE(CBool(Call(owner, row.member, element)));
    row.check(s);
    EXPECT_EQ(s.model->IntegrityProblems(), std::vector<std::string>());
    EXPECT_LT(s.model->ElementCount(), before);
    // The element is gone: asking again answers False.
    EXPECT_FALSE(CBool(Call(owner, row.member, element)));
  }
}

TEST(ModelDeletionTest, AnElementOfAnotherOwnerIsNotDeleted) {
  SampleModel s;
  const struct {
    Object owner;
    automation::DispId member;
    Object element;
  } kRows[] = {
      {s.circle, orel::class_::kDeleteAttribute, s.x},
      {s.canvas, orel::class_::kDeleteOperation, s.draw},
      {s.shape, orel::class_::kDeleteHasRelationship, s.canvas_has_shapes},
      {s.shape, orel::class_::kDeleteInheritRelation, s.circle_is_shape},
      {s.drawable, orel::class_::kDeleteRealizeRelation, s.circle_draws},
      {s.circle, orel::class_::kDeleteAssociation, s.canvas_shapes},
      {s.model->RootLogicalPackage(), orel::logical_package::kDeleteClass,
       s.shape},
      // Another kind, or Nothing.
      {s.shape, orel::class_::kDeleteAttribute, s.draw},
      {s.shape, orel::class_::kDeleteAttribute, nullptr},
  };
  size_t before = s.model->ElementCount();
  for (const auto& row : kRows) {
    EXPECT_FALSE(CBool(Call(row.owner, row.member, row.element)));
  }
  EXPECT_EQ(s.model->ElementCount(), before);
  EXPECT_EQ(CountByName(s.shape, "Attributes"), 2);
}

TEST(ModelDeletionTest, ADeletedElementIsCutLoose) {
  SampleModel s;
  std::shared_ptr<Class> shape = s.shape;
  EXPECT_TRUE(s.domain->DeleteClass(shape));
  EXPECT_EQ(shape->GetModel(), nullptr);
  EXPECT_EQ(shape->Package(), nullptr);
  EXPECT_TRUE(shape->Components().empty());
  EXPECT_EQ(GetObject(shape, orel::element::kApplication), nullptr);
  // Making members of a deleted class is refused, not half done.
  EXPECT_EQ(ErrorOf([&] { shape->NewAttribute("z"); }),
            automation::kObjectNotSet);
  // Nor can a live element be pointed at it.
  EXPECT_EQ(ErrorOf([&] { s.circle_draws->SetSupplier(shape); }),
            automation::kInvalidProcedureCall);
  EXPECT_EQ(ErrorOf([&] { s.model->NewAssociation(s.canvas, shape); }),
            automation::kInvalidProcedureCall);
  EXPECT_EQ(ErrorOf([&] {
              automation::CallByName(shape, orel::element::kSetUniqueId, "X");
            }),
            automation::kObjectNotSet);
}

TEST(ModelDeletionTest, TheListEntryItselfMayBePassedToTheDeletion) {
  // The caller's reference is the entry the deletion erases; the deletion
  // must still finish on a live element (caught by the sanitizer build).
  SampleModel s;
  s.draw.reset();
  s.x.reset();
  s.y.reset();
  auto draw = s.shape->Operations().front();
  draw->NewParameter("scale", "double");
  EXPECT_TRUE(draw->DeleteParameter(draw->Parameters().back()));
  draw.reset();
  EXPECT_TRUE(s.shape->DeleteAttribute(s.shape->Attributes().front()));
  EXPECT_TRUE(s.shape->DeleteOperation(s.shape->Operations().front()));
  EXPECT_TRUE(s.domain->DeleteClass(s.domain->Classes().back()));
  EXPECT_EQ(s.model->IntegrityProblems(), std::vector<std::string>());
}

TEST(ModelDeletionTest, AClassRelatedToItselfAndAssociatedWithItself) {
  SampleModel s;
  auto node = s.domain->NewClass("Node");
  node->NewHasRelationship("next", node);
  auto tree = s.model->NewAssociation(node, node, "tree");
  EXPECT_EQ(node->Roles().size(), 2u);
  EXPECT_TRUE(s.domain->DeleteClass(node));
  EXPECT_FALSE(InModel(s, tree));
  EXPECT_EQ(s.model->IntegrityProblems(), std::vector<std::string>());
}

TEST(ModelDeletionTest, DeletingAComponentRemovesAssignmentsAndDependencies) {
  SampleModel s;
  s.model->Select(s.lib);
  EXPECT_TRUE(s.model->RootComponentPackage()->DeleteComponent(s.lib));
  EXPECT_FALSE(s.model->RootComponentPackage()->DeleteComponent(s.lib));
  EXPECT_TRUE(s.shape->Components().empty());
  EXPECT_EQ(CountOf(s.drawable, orel::class_::kComponents), 1);
  EXPECT_EQ(CountOf(s.app_component, orel::component::kDependencies), 0);
  EXPECT_FALSE(InModel(s, s.app_implements_lib));
  EXPECT_EQ(CountOf(s.model, orel::model::kSelectedComponents), 0);
  EXPECT_EQ(s.model->IntegrityProblems(), std::vector<std::string>());
}

}  // namespace
}  // namespace host::modeltool
