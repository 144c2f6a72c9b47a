// What has-, inherit- and realize-relations share: the class that owns the
// relation (the client) and the class it points to (the supplier), which may
// lie outside the model and then is known by name only.
#ifndef KELQLN_HOST_MODELTOOL_CLASS_RELATION_H_
#define KELQLN_HOST_MODELTOOL_CLASS_RELATION_H_

#include <memory>
#include <string>

#include "host/modeltool/element.h"

namespace host::modeltool {

class Class;

class ClassRelation : public Element {
 public:
  std::shared_ptr<Class> ContextClass() const override { return owner_.lock(); }
  std::shared_ptr<Class> Owner() const { return owner_.lock(); }

  // The supplier class of the model, or nullptr.
  std::shared_ptr<Class> Supplier() const { return supplier_.lock(); }
  // The supplier's name: the supplier class's when there is one.
  std::string SupplierName() const;
  // Points the relation at a class of the same model, or (nullptr) at a
  // class outside it called `supplier_name`. kInvalidProcedureCall for a
  // class of another model; kObjectNotSet once the relation is deleted.
  void SetSupplier(const std::shared_ptr<Class>& supplier,
                   std::string supplier_name = "");

 protected:
  explicit ClassRelation(std::string name) : Element(std::move(name)) {}

 private:
  friend class Class;
  friend class Model;
  std::weak_ptr<Class> owner_;
  std::weak_ptr<Class> supplier_;
  std::string supplier_name_;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_CLASS_RELATION_H_
