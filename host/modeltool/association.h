// An association between two classes, one role at each end. The model owns
// its associations; an association owns its two roles.
#ifndef KELQLN_HOST_MODELTOOL_ASSOCIATION_H_
#define KELQLN_HOST_MODELTOOL_ASSOCIATION_H_

#include <memory>
#include <string>

#include "host/modeltool/element.h"

namespace host::modeltool {

class Role;

class Association : public ElementImpl<Association> {
 public:
  // Made by Model::NewAssociation.
  explicit Association(std::string name) : ElementImpl(std::move(name)) {}

  static const automation::MemberTable<Association>& Members();
  const char* KindName() const override { return "Association"; }

  const std::shared_ptr<Role>& Role1() const { return role1_; }
  const std::shared_ptr<Role>& Role2() const { return role2_; }
  // The role at the other end from `role` (Role1 for Role2 and the reverse).
  std::shared_ptr<Role> OtherRole(const Role& role) const;

 private:
  friend class Model;
  std::shared_ptr<Role> role1_;
  std::shared_ptr<Role> role2_;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_ASSOCIATION_H_
