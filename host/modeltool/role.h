// One end of an association: the class at that end, and whether the
// association can be followed towards it. The role belongs, as a member, to
// the class at the other end (its owner class): that class "has" the role.
#ifndef KELQLN_HOST_MODELTOOL_ROLE_H_
#define KELQLN_HOST_MODELTOOL_ROLE_H_

#include <memory>
#include <string>

#include "host/modeltool/element.h"

namespace host::modeltool {

class Association;

class Role : public ElementImpl<Role> {
 public:
  // Made with its association by Model::NewAssociation.
  explicit Role(std::string name) : ElementImpl(std::move(name)) {}

  static const automation::MemberTable<Role>& Members();
  const char* KindName() const override;
  // The owner class.
  std::shared_ptr<Class> ContextClass() const override;

  std::shared_ptr<Association> GetAssociation() const {
    return association_.lock();
  }
  // The class at this end.
  std::shared_ptr<Class> GetClass() const { return class_.lock(); }

  bool IsNavigable() const { return navigable_; }
  void SetNavigable(bool navigable) { navigable_ = navigable; }
  // A multiplicity text such as "0..*"; "" when unset.
  const std::string& Cardinality() const { return cardinality_; }
  void SetCardinality(std::string text) { cardinality_ = std::move(text); }
  // True when the owner class contains the class at this end.
  bool IsAggregate() const { return aggregate_; }
  void SetAggregate(bool aggregate) { aggregate_ = aggregate; }

 private:
  friend class Model;
  std::weak_ptr<Association> association_;
  std::weak_ptr<Class> class_;
  bool navigable_ = true;
  std::string cardinality_;
  bool aggregate_ = false;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_ROLE_H_
