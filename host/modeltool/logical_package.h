// A package of classes: the model's logical tree. The model has one root
// package; packages nest.
#ifndef KELQLN_HOST_MODELTOOL_LOGICAL_PACKAGE_H_
#define KELQLN_HOST_MODELTOOL_LOGICAL_PACKAGE_H_

#include <memory>
#include <string>
#include <vector>

#include "host/modeltool/element.h"

namespace host::modeltool {

class Class;

class LogicalPackage : public ElementImpl<LogicalPackage> {
 public:
  // Made by the model (the root) or by NewPackage.
  explicit LogicalPackage(std::string name) : ElementImpl(std::move(name)) {}

  static const automation::MemberTable<LogicalPackage>& Members();
  const char* KindName() const override { return "LogicalPackage"; }

  // A new class of this package; `unique_id` "" takes a new one.
  std::shared_ptr<Class> NewClass(std::string name,
                                  const std::string& unique_id = "");
  std::shared_ptr<LogicalPackage> NewPackage(std::string name,
                                             const std::string& unique_id = "");
  // Deletes a class of this package with everything that hangs on it: its
  // members, the relations of other classes to it, the associations it takes
  // part in, its component assignments and its place in the selection.
  // False when the class is not this package's.
  bool DeleteClass(std::shared_ptr<Class> cls);

  const std::vector<std::shared_ptr<Class>>& Classes() const {
    return classes_;
  }
  const std::vector<std::shared_ptr<LogicalPackage>>& Packages() const {
    return packages_;
  }
  // The enclosing package; nullptr for the root.
  std::shared_ptr<LogicalPackage> Parent() const { return parent_.lock(); }

  bool IsModifiable() const { return modifiable_; }
  void SetModifiable(bool modifiable) { modifiable_ = modifiable; }

 private:
  friend class Model;
  std::weak_ptr<LogicalPackage> parent_;
  std::vector<std::shared_ptr<Class>> classes_;
  std::vector<std::shared_ptr<LogicalPackage>> packages_;
  bool modifiable_ = true;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_LOGICAL_PACKAGE_H_
