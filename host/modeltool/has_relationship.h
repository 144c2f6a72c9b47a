// A has-relationship: a class holds instances of its supplier.
#ifndef KELQLN_HOST_MODELTOOL_HAS_RELATIONSHIP_H_
#define KELQLN_HOST_MODELTOOL_HAS_RELATIONSHIP_H_

#include <string>

#include "host/modeltool/class_relation.h"

namespace host::modeltool {

class HasRelationship : public ElementImpl<HasRelationship, ClassRelation> {
 public:
  // Made by Class::NewHasRelationship.
  explicit HasRelationship(std::string name) : ElementImpl(std::move(name)) {}

  static const automation::MemberTable<HasRelationship>& Members();
  const char* KindName() const override;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_HAS_RELATIONSHIP_H_
