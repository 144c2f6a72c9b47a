// A inherit relation: the owner class inherits from its supplier.
#ifndef KELQLN_HOST_MODELTOOL_INHERIT_RELATION_H_
#define KELQLN_HOST_MODELTOOL_INHERIT_RELATION_H_

#include <string>

#include "host/modeltool/class_relation.h"

namespace host::modeltool {

class InheritRelation : public ElementImpl<InheritRelation, ClassRelation> {
 public:
  // Made by Class::NewInheritRelation.
  explicit InheritRelation(std::string name) : ElementImpl(std::move(name)) {}

  static const automation::MemberTable<InheritRelation>& Members();
  const char* KindName() const override;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_INHERIT_RELATION_H_
