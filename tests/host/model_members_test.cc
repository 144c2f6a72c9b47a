// The modelling tool's members as the system calls them: late-bound, by the
// numbers and names of external/orel.h.
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "automation/call.h"
#include "automation/collection.h"
#include "external/orel.h"
#include "sample_model.h"

namespace host::modeltool {
namespace {

namespace orel = external::orel;
using automation::Call;
using automation::CallByName;
using automation::CBool;
using automation::CLng;
using automation::CStr;
using automation::Get;
using automation::GetByName;
using automation::GetObject;
using automation::Object;
using automation::Variant;

std::string NameOf(const Object& element) {
  return element ? CStr(Get(element, orel::element::kName)) : "(Nothing)";
}

// The names of a collection's items, in order, through 202 and 203.
std::vector<std::string> Names(const Object& collection) {
  std::vector<std::string> names;
  int32_t count = CLng(Get(collection, orel::collection::kCount));
  for (int32_t i = 1; i <= count; ++i) {
    names.push_back(NameOf(GetObject(collection, orel::collection::kGetAt, i)));
  }
  return names;
}

using Names_ = std::vector<std::string>;

TEST(ModelMembersTest, ApplicationReachesModelAddInsAndLog) {
  SampleModel s;
  Object app = s.app;
  EXPECT_EQ(GetObject(app, orel::application::kCurrentModel), s.model);
  Object add_ins = GetObject(GetObject(app, orel::application::kAddInManager),
                             orel::add_in_manager::kAddIns);
  EXPECT_EQ(CLng(Get(add_ins, orel::collection::kCount)), 0);

  std::vector<std::string> printed;
  s.app->SetLogSink([&](const std::string& line) { printed.push_back(line); });
  Call(app, orel::application::kLog, "first");
  Call(app, orel::application::kLog, "second");
  EXPECT_EQ(s.app->LogLines(), (Names_{"first", "second"}));
  EXPECT_EQ(printed, (Names_{"first", "second"}));

  EXPECT_FALSE(CBool(Get(app, orel::application::kSaveDialogPending)));
  automation::Let(app, orel::application::kSaveDialogPending, true);
  EXPECT_TRUE(s.app->SaveDialogPending());
  EXPECT_EQ(CLng(CallByName(app, orel::application::kGetMainWnd)), 0);
  s.app->SetMainWindow(0x1234);
  EXPECT_EQ(CLng(CallByName(app, orel::application::kGetMainWnd)), 0x1234);
  // Every element leads back to the application.
  EXPECT_EQ(GetObject(s.x, orel::element::kApplication), app);
}

TEST(ModelMembersTest, CollectionsCountIndexAndLookUp) {
  SampleModel s;
  Object model = s.model;
  Object components = GetObject(model, orel::model::kAllComponents);
  Object classes = GetObject(model, orel::model::kAllClasses);
  EXPECT_EQ(Names(components), (Names_{"App", "Lib", "Gui"}));
  EXPECT_EQ(Names(classes), (Names_{"Shape", "Circle", "Canvas", "IDrawable"}));

  namespace c = orel::collection;
  const struct {
    Object collection;
    const char* name;
    int32_t index;
  } kRows[] = {
      {classes, "Circle", 2},
      {classes, "circle", 0},  // names compare exactly
      {classes, "Nobody", 0},
      {components, "Gui", 3},
      {GetObject(s.lib, orel::component::kClasses), "IDrawable", 3},
      {GetObject(s.drawable, orel::class_::kComponents), "App", 2},
      {GetObject(s.model->RootComponentPackage(),
                 orel::component_package::kComponents),
       "Gui", 2},
      {GetObject(s.domain, orel::logical_package::kClasses), "Canvas", 3},
  };
  for (const auto& row : kRows) {
    EXPECT_EQ(CLng(Call(row.collection, c::kIndexOfName, row.name)), row.index)
        << row.name;
    Object found = GetObject(row.collection, c::kFindByName, row.name);
    EXPECT_EQ(found == nullptr, row.index == 0) << row.name;
    if (found) {
      EXPECT_EQ(found, GetObject(row.collection, c::kGetAt, row.index));
      // Look-up by unique id gives the same object again.
      std::string id = CStr(Get(found, orel::element::kUniqueId));
      EXPECT_EQ(GetObject(row.collection, c::kFindByUniqueId, id), found);
    }
  }
  // An id of the model that is not of this list, and an unknown one.
  Object lib_classes = GetObject(s.lib, orel::component::kClasses);
  EXPECT_EQ(GetObject(lib_classes, c::kFindByUniqueId, s.canvas->UniqueId()),
            nullptr);
  EXPECT_EQ(GetObject(classes, c::kFindByUniqueId, s.lib->UniqueId()), nullptr);
  EXPECT_EQ(GetObject(classes, c::kFindByUniqueId, "nothing"), nullptr);
  EXPECT_EQ(ErrorOf([&] { Call(classes, c::kGetAt, 5); }),
            automation::kSubscriptOutOfRange);
  EXPECT_EQ(ErrorOf([&] { Call(classes, c::kGetAt, 0); }),
            automation::kSubscriptOutOfRange);
  // A collection is a live view: it sees classes made after it was handed
  // out, and automation's generic walk reads it too.
  s.domain->NewClass("Late");
  EXPECT_EQ(CLng(Get(classes, c::kCount)), 5);
  EXPECT_EQ(automation::CollectionItems(classes).size(), 5u);
}

TEST(ModelMembersTest, ElementsAnswerTheirCommonMembers) {
  SampleModel s;
  namespace e = orel::element;
  const struct {
    Object element;
    const char* kind;
    const char* name;
  } kRows[] = {
      {s.lib, orel::kind::kComponent, "Lib"},
      {s.shape, orel::kind::kClass, "Shape"},
      {s.x, orel::kind::kAttribute, "x"},
      {s.draw, orel::kind::kOperation, "Draw"},
      {s.canvas_shapes->Role2(), orel::kind::kRole, "items"},
      {s.circle_is_shape, orel::kind::kInheritRelation, "Shape"},
      {s.circle_draws, orel::kind::kRealizeRelation, "IDrawable"},
      {s.canvas_has_shapes, orel::kind::kHasRelationship, "shapes"},
  };
  for (const auto& row : kRows) {
    EXPECT_EQ(CStr(Get(row.element, e::kKindName)), row.kind);
    EXPECT_EQ(CStr(GetByName(row.element, "Name")), row.name);
    EXPECT_FALSE(CStr(Get(row.element, e::kUniqueId)).empty());
    automation::Let(row.element, e::kStereotype, "st");
    EXPECT_EQ(CStr(Get(row.element, e::kStereotype)), "st");
  }
  automation::LetByName(s.gui, "Name", "Screens");
  EXPECT_EQ(s.gui->Name(), "Screens");
}

TEST(ModelMembersTest, MembersKnowTheirClass) {
  SampleModel s;
  namespace o = orel::owner;
  Object role = s.canvas_shapes->Role2();  // the end at Shape, owned by Canvas
  const struct {
    Object member;
    automation::DispId owner;
    const char* by_name;
    Object expected;
  } kRows[] = {
      {s.x, o::kOfAttribute, orel::element::kParentClass, s.shape},
      {s.draw, o::kOfOperation, orel::element::kParentClass, s.shape},
      {s.circle_is_shape, o::kOfInheritRelation,
       orel::element::kGetContextClass, s.circle},
      {s.canvas_has_shapes, o::kOfHasRelationship,
       orel::element::kGetContextClass, s.canvas},
      {s.circle_draws, o::kOfRealizeRelation, orel::element::kGetContextClass,
       s.circle},
      {role, o::kOfRole, orel::element::kGetContextClass, s.canvas},
  };
  for (const auto& row : kRows) {
    EXPECT_EQ(GetObject(row.member, row.owner), row.expected)
        << NameOf(row.member);
    EXPECT_EQ(automation::CObj(GetByName(row.member, row.by_name)),
              row.expected)
        << NameOf(row.member);
  }
  EXPECT_EQ(automation::CObj(GetByName(s.shape, orel::element::kParentClass)),
            nullptr);
}

TEST(ModelMembersTest, RolesAndTheirNavigability) {
  SampleModel s;
  Object association = s.canvas_shapes;
  Object role1 = GetObject(association, orel::association::kRole1);
  Object role2 =
      automation::CObj(GetByName(association, orel::association::kRole2Name));
  EXPECT_EQ(role1, s.canvas_shapes->Role1());
  EXPECT_EQ(role2, GetObject(association, orel::association::kRole2));
  EXPECT_EQ(CStr(GetByName(association, orel::association::kNameName)),
            "holds");
  EXPECT_EQ(automation::CObj(GetByName(role1, orel::role::kAssociationName)),
            association);
  EXPECT_EQ(GetObject(role2, orel::role::kAssociation), association);
  EXPECT_EQ(automation::CObj(GetByName(role1, orel::role::kClass)), s.canvas);
  EXPECT_EQ(automation::CObj(GetByName(role2, orel::role::kClass)), s.shape);

  EXPECT_TRUE(CBool(GetByName(role1, orel::role::kNavigable)));
  automation::LetByName(role2, orel::role::kNavigable, false);
  EXPECT_FALSE(CBool(GetByName(role2, orel::role::kNavigable)));
  EXPECT_TRUE(CBool(GetByName(role1, orel::role::kNavigable)));
  EXPECT_FALSE(s.canvas_shapes->Role2()->IsNavigable());
  // Each class owns the role at the other end.
  EXPECT_EQ(s.canvas->Roles(),
            (std::vector<std::shared_ptr<Role>>{s.canvas_shapes->Role2()}));
  EXPECT_EQ(s.shape->Roles(),
            (std::vector<std::shared_ptr<Role>>{s.canvas_shapes->Role1()}));
}

TEST(ModelMembersTest, ToolPropertiesCreateOverrideFindAll) {
  SampleModel s;
  Object element = s.lib;
  namespace e = orel::element;
  namespace p = orel::tool_property;
  EXPECT_EQ(GetObject(element, e::kFindToolProperty, "VC++", "Kind"), nullptr);
  EXPECT_EQ(CStr(Call(element, e::kToolPropertyValue, "VC++", "Kind")), "");
  EXPECT_TRUE(CBool(
      Call(element, e::kCreateToolProperty, "VC++", "Kind", "MIDL", "String")));
  // A second create changes nothing.
  EXPECT_FALSE(CBool(Call(element, e::kCreateToolProperty, "VC++", "Kind",
                          "Other", "String")));
  Call(element, e::kCreateToolProperty, "COM", "_OCAName", "Lib2", "String");
  Call(element, e::kOverrideToolProperty, "vc++", "KIND", "EXE");
  Call(element, e::kOverrideToolProperty, "VC++", "FileName", "lib.vcproj");

  Object found = GetObject(element, e::kFindToolProperty, "VC++", "kind");
  ASSERT_NE(found, nullptr);
  EXPECT_EQ(CStr(Get(found, p::kTool)), "VC++");
  EXPECT_EQ(CStr(Get(found, p::kName)), "Kind");
  EXPECT_EQ(CStr(Get(found, p::kValue)), "EXE");
  EXPECT_EQ(CStr(Get(found, p::kType)), "String");
  EXPECT_EQ(CStr(Call(element, e::kToolPropertyValue, "COM", "_OCAName")),
            "Lib2");

  Object all = GetObject(element, e::kToolProperties);
  ASSERT_EQ(CLng(Get(all, orel::collection::kCount)), 3);
  std::vector<std::string> listed;
  for (int32_t i = 1; i <= 3; ++i) {
    Object property = GetObject(all, orel::collection::kGetAt, i);
    listed.push_back(CStr(Get(property, p::kTool)) + "/" +
                     CStr(Get(property, p::kName)) + "=" +
                     CStr(Get(property, p::kValue)));
  }
  EXPECT_EQ(listed, (Names_{"VC++/Kind=EXE", "COM/_OCAName=Lib2",
                            "VC++/FileName=lib.vcproj"}));
}

TEST(ModelMembersTest, ClassToComponentAssignmentBothWays) {
  SampleModel s;
  Object canvas = s.canvas;
  Object lib = s.lib;
  EXPECT_EQ(Names(GetObject(canvas, orel::class_::kComponents)),
            (Names_{"App"}));
  EXPECT_TRUE(CBool(Call(canvas, orel::class_::kAssignToComponent, lib)));
  EXPECT_FALSE(CBool(Call(canvas, orel::class_::kAssignToComponent, lib)));
  EXPECT_EQ(Names(GetObject(canvas, orel::class_::kComponents)),
            (Names_{"App", "Lib"}));
  EXPECT_EQ(Names(GetObject(lib, orel::component::kClasses)),
            (Names_{"Shape", "Circle", "IDrawable", "Canvas"}));
  EXPECT_TRUE(s.canvas->UnassignFrom(s.app_component));
  EXPECT_EQ(Names(GetObject(s.app_component, orel::component::kClasses)),
            (Names_{"IDrawable"}));
  EXPECT_EQ(Names(GetObject(canvas, orel::class_::kComponents)),
            (Names_{"Lib"}));
  EXPECT_TRUE(s.model->IntegrityProblems().empty());
  // A class of another model cannot be assigned.
  SampleModel other;
  EXPECT_EQ(ErrorOf([&] { s.canvas->AssignTo(other.lib); }),
            automation::kInvalidProcedureCall);
}

TEST(ModelMembersTest, ComponentsPackagesAndModelSettings) {
  SampleModel s;
  Object model = s.model;
  Object root = GetObject(model, orel::model::kRootComponentPackage);
  EXPECT_EQ(root, s.model->RootComponentPackage());
  Object made = GetObject(root, orel::component_package::kNewComponent, "Net");
  EXPECT_EQ(CStr(Get(made, orel::element::kKindName)), orel::kind::kComponent);
  EXPECT_EQ(GetObject(made, orel::component::kComponentPackage), root);
  EXPECT_EQ(GetObject(made, orel::component::kModel), model);
  EXPECT_EQ(Names(GetObject(model, orel::model::kAllComponents)).back(), "Net");
  automation::Let(made, orel::component::kLanguage, "C#");
  EXPECT_EQ(CStr(Get(made, orel::component::kLanguage)), "C#");
  EXPECT_EQ(CStr(Get(s.app_component, orel::component::kDisplayName)),
            "Core::App");

  EXPECT_EQ(GetObject(s.shape, orel::class_::kPackage), s.domain);
  EXPECT_TRUE(CBool(Get(s.domain, orel::logical_package::kIsModifiable)));
  automation::Let(s.core, orel::component_package::kIsModifiable, false);
  EXPECT_FALSE(CBool(
      Get(s.app_component->Package(), orel::component_package::kIsModifiable)));
  EXPECT_EQ(CStr(Get(s.shape, orel::class_::kAddInName)), "C++");
  automation::Let(s.shape, orel::class_::kAddInName, "VisualStudio");
  EXPECT_EQ(CStr(Get(s.shape, orel::class_::kAddInName)), "VisualStudio");
  EXPECT_FALSE(CBool(Get(s.shape, orel::class_::kExcludedFromSelection)));
  automation::Let(s.shape, orel::class_::kExcludedFromSelection, true);
  EXPECT_TRUE(s.shape->IsExcludedFromSelection());

  EXPECT_EQ(CStr(Get(model, orel::model::kDefaultLanguage)), "C++");
  automation::Let(model, orel::model::kDefaultLanguage, "VB");
  EXPECT_EQ(s.model->DefaultLanguage(), "VB");
  EXPECT_FALSE(CBool(Get(model, orel::model::kAskForBackup)));
  automation::Let(model, orel::model::kAskForBackup, true);
  EXPECT_TRUE(CBool(Get(model, orel::model::kAskForBackup)));
  EXPECT_EQ(CStr(Get(model, orel::model::kFilePath)), "");
}

TEST(ModelMembersTest, ImplementsDependencyBetweenComponents) {
  SampleModel s;
  Object dependencies =
      GetObject(s.app_component, orel::component::kDependencies);
  ASSERT_EQ(CLng(Get(dependencies, orel::collection::kCount)), 1);
  Object dependency = GetObject(dependencies, orel::collection::kGetAt, 1);
  EXPECT_TRUE(CBool(Get(dependency, orel::dependency::kIsComponentDependency)));
  EXPECT_EQ(GetObject(dependency, orel::dependency::kSupplier), s.lib);
  EXPECT_EQ(CStr(Get(dependency, orel::dependency::kStereotype)), "Implements");
}

TEST(ModelMembersTest, TheSelection) {
  SampleModel s;
  s.model->Select(s.gui);
  s.model->Select(s.gui);  // once only
  s.model->Select(s.core);
  s.model->Select(s.circle);
  s.model->Select(s.domain);
  Object model = s.model;
  EXPECT_EQ(Names(GetObject(model, orel::model::kSelectedComponents)),
            (Names_{"Gui"}));
  EXPECT_EQ(Names(GetObject(model, orel::model::kSelectedComponentPackages)),
            (Names_{"Core"}));
  EXPECT_EQ(Names(GetObject(model, orel::model::kSelectedClasses)),
            (Names_{"Circle"}));
  EXPECT_EQ(Names(GetObject(model, orel::model::kSelectedLogicalPackages)),
            (Names_{"Domain"}));
  EXPECT_EQ(ErrorOf([&] { s.model->Select(s.x); }),
            automation::kInvalidProcedureCall);
  s.model->ClearSelection();
  EXPECT_EQ(CLng(Get(GetObject(model, orel::model::kSelectedClasses),
                     orel::collection::kCount)),
            0);
}

TEST(ModelMembersTest, UniqueIdsAreUniqueAndCanBeChanged) {
  SampleModel s;
  Object lib = s.lib;
  Object components = GetObject(s.model, orel::model::kAllComponents);
  std::string old_id = s.lib->UniqueId();
  CallByName(lib, orel::element::kSetUniqueId, "{PROJECT-1}");
  EXPECT_EQ(CStr(Get(lib, orel::element::kUniqueId)), "{PROJECT-1}");
  EXPECT_EQ(
      GetObject(components, orel::collection::kFindByUniqueId, "{PROJECT-1}"),
      lib);
  EXPECT_EQ(GetObject(components, orel::collection::kFindByUniqueId, old_id),
            nullptr);
  // Ids compare exactly, letter case included.
  EXPECT_EQ(
      GetObject(components, orel::collection::kFindByUniqueId, "{project-1}"),
      nullptr);
  std::string text;
  EXPECT_EQ(ErrorOf(
                [&] {
                  CallByName(lib, orel::element::kSetUniqueId,
                             s.gui->UniqueId());
                },
                &text),
            automation::kDuplicateKey);
  EXPECT_NE(text.find(s.gui->UniqueId()), std::string::npos);
  EXPECT_EQ(ErrorOf([&] { CallByName(lib, orel::element::kSetUniqueId, ""); }),
            automation::kInvalidProcedureCall);
  EXPECT_EQ(s.lib->UniqueId(), "{PROJECT-1}");
  // A generator that repeats itself cannot make two elements share an id.
  s.model->SetUniqueIdGenerator([] { return std::string("{SAME}"); });
  auto first = s.domain->NewClass("A");
  EXPECT_EQ(first->UniqueId(), "{SAME}");
  EXPECT_EQ(ErrorOf([&] { s.domain->NewClass("B"); }),
            automation::kDuplicateKey);
  EXPECT_TRUE(s.model->IntegrityProblems().empty());
}

TEST(ModelMembersTest, DefaultIdsLookLikeGuids) {
  auto model = Model::Create();
  auto cls = model->RootLogicalPackage()->NewClass("A");
  const std::string& id = cls->UniqueId();
  ASSERT_EQ(id.size(), 38u) << id;
  EXPECT_EQ(id.front(), '{');
  EXPECT_EQ(id.back(), '}');
  for (size_t dash : {9u, 14u, 19u, 24u}) EXPECT_EQ(id[dash], '-') << id;
  EXPECT_NE(id, model->RootLogicalPackage()->NewClass("B")->UniqueId());
}

}  // namespace
}  // namespace host::modeltool
