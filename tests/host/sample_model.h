// A small model for the modelling tool's tests, built through the tool's C++
// API with predictable unique ids ("ID1", "ID2", ...).
#ifndef KELQLN_TESTS_HOST_SAMPLE_MODEL_H_
#define KELQLN_TESTS_HOST_SAMPLE_MODEL_H_

#include <functional>
#include <memory>
#include <string>

#include "automation/error.h"
#include "tests/support/error_of.h"
#include "host/modeltool/application.h"
#include "host/modeltool/association.h"
#include "host/modeltool/attribute.h"
#include "host/modeltool/class.h"
#include "host/modeltool/component.h"
#include "host/modeltool/component_package.h"
#include "host/modeltool/dependency.h"
#include "host/modeltool/has_relationship.h"
#include "host/modeltool/inherit_relation.h"
#include "host/modeltool/logical_package.h"
#include "host/modeltool/model.h"
#include "host/modeltool/operation.h"
#include "host/modeltool/parameter.h"
#include "host/modeltool/realize_relation.h"
#include "host/modeltool/role.h"

namespace host::modeltool {

// Components App (C++, in package Core), Lib (C++), Gui (VB); classes Shape,
// Circle, Canvas, IDrawable in package Domain. Circle inherits Shape and
// realizes IDrawable; Canvas has Shapes and is associated with Shape; App
// depends on ("Implements") Lib.
struct SampleModel {
  std::shared_ptr<Application> app = Application::Create();
  std::shared_ptr<Model> model = Model::Create(SequentialUniqueIds("ID"));
  std::shared_ptr<ComponentPackage> core;
  std::shared_ptr<Component> app_component, lib, gui;
  std::shared_ptr<LogicalPackage> domain;
  std::shared_ptr<Class> shape, circle, canvas, drawable;
  std::shared_ptr<Attribute> x, y;
  std::shared_ptr<Operation> draw;
  std::shared_ptr<InheritRelation> circle_is_shape;
  std::shared_ptr<RealizeRelation> circle_draws;
  std::shared_ptr<HasRelationship> canvas_has_shapes;
  std::shared_ptr<Association> canvas_shapes;
  std::shared_ptr<Dependency> app_implements_lib;

  SampleModel() {
    app->SetCurrentModel(model);
    model->SetName("Sample");
    model->SetDefaultLanguage("C++");
    core = model->RootComponentPackage()->NewPackage("Core");
    app_component = core->NewComponent("App");
    app_component->SetLanguage("C++");
    lib = model->RootComponentPackage()->NewComponent("Lib");
    lib->SetLanguage("C++");
    gui = model->RootComponentPackage()->NewComponent("Gui");
    gui->SetLanguage("VB");
    domain = model->RootLogicalPackage()->NewPackage("Domain");
    shape = domain->NewClass("Shape");
    circle = domain->NewClass("Circle");
    canvas = domain->NewClass("Canvas");
    drawable = domain->NewClass("IDrawable");
    drawable->SetStereotype("interface");
    x = shape->NewAttribute("x");
    x->SetType("int");
    y = shape->NewAttribute("y");
    draw = shape->NewOperation("Draw");
    draw->SetReturnType("void");
    draw->NewParameter("context", "Context&");
    circle_is_shape = circle->NewInheritRelation("Shape", shape);
    circle_draws = circle->NewRealizeRelation("IDrawable", drawable);
    canvas_has_shapes = canvas->NewHasRelationship("shapes", shape);
    canvas_shapes = model->NewAssociation(canvas, shape, "holds");
    canvas_shapes->Role1()->SetName("canvas");
    canvas_shapes->Role2()->SetName("items");
    for (const auto& cls : {shape, circle, drawable}) cls->AssignTo(lib);
    canvas->AssignTo(app_component);
    drawable->AssignTo(app_component);
    app_implements_lib = app_component->NewDependency(lib, "uses");
    app_implements_lib->SetStereotype("Implements");
  }
};

// The error number a call raises, 0 when it raises none; `description`
// receives the error's text.
using testing_support::ErrorOf;

}  // namespace host::modeltool

#endif  // KELQLN_TESTS_HOST_SAMPLE_MODEL_H_
