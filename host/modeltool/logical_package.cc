#include "host/modeltool/logical_package.h"

#include <utility>

#include "external/orel.h"
#include "host/modeltool/class.h"
#include "host/modeltool/element_collection.h"
#include "host/modeltool/model.h"

namespace host::modeltool {

using automation::Args;
using automation::CallKind;
using automation::Variant;
namespace orel = external::orel;

std::shared_ptr<Class> LogicalPackage::NewClass(std::string name,
                                                const std::string& unique_id) {
  auto model = RequireModel();
  auto cls = std::make_shared<Class>(std::move(name));
  model->Register(*cls, unique_id);
  cls->package_ = Self();
  classes_.push_back(cls);
  model->AddClass(cls);
  return cls;
}

std::shared_ptr<LogicalPackage> LogicalPackage::NewPackage(
    std::string name, const std::string& unique_id) {
  auto model = RequireModel();
  auto package = std::make_shared<LogicalPackage>(std::move(name));
  model->Register(*package, unique_id);
  package->parent_ = Self();
  packages_.push_back(package);
  return package;
}

bool LogicalPackage::DeleteClass(std::shared_ptr<Class> cls) {
  if (!cls || cls->Package().get() != this) return false;
  RequireModel()->DestroyClass(cls);
  return true;
}

const automation::MemberTable<LogicalPackage>& LogicalPackage::Members() {
  static const automation::MemberTable<LogicalPackage> table(
      "LogicalPackage",
      WithElementMembers({
          {orel::logical_package::kClasses, "Classes", CallKind::kMethod,
           [](LogicalPackage& self, Args&) {
             return Variant(
                 ElementCollection<Class>::Of(self.Self(), self.classes_));
           }},
          {orel::logical_package::kDeleteClass, "DeleteClass",
           CallKind::kMethod,
           [](LogicalPackage& self, Args& args) {
             return Variant(self.DeleteClass(
                 ElementArg<Class>(automation::RequiredArg(args, 0))));
           }},
          {orel::logical_package::kIsModifiable, "IsModifiable",
           CallKind::kPropertyGet,
           [](LogicalPackage& self, Args&) {
             return Variant(self.modifiable_);
           }},
          {orel::logical_package::kIsModifiable, "IsModifiable",
           CallKind::kPropertyPut,
           [](LogicalPackage& self, Args& args) {
             self.modifiable_ = automation::CBool(automation::PutValue(args));
             return Variant();
           }},
          {automation::kNamedOnly, "Packages", CallKind::kPropertyGet,
           [](LogicalPackage& self, Args&) {
             return Variant(ElementCollection<LogicalPackage>::Of(
                 self.Self(), self.packages_));
           }},
          {automation::kNamedOnly, "ParentPackage", CallKind::kPropertyGet,
           [](LogicalPackage& self, Args&) { return Variant(self.Parent()); }},
      }));
  return table;
}

}  // namespace host::modeltool
