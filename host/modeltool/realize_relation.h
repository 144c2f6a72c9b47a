// A realize relation: the owner class realizes its supplier (an interface).
#ifndef KELQLN_HOST_MODELTOOL_REALIZE_RELATION_H_
#define KELQLN_HOST_MODELTOOL_REALIZE_RELATION_H_

#include <string>

#include "host/modeltool/class_relation.h"

namespace host::modeltool {

class RealizeRelation : public ElementImpl<RealizeRelation, ClassRelation> {
 public:
  // Made by Class::NewRealizeRelation.
  explicit RealizeRelation(std::string name) : ElementImpl(std::move(name)) {}

  static const automation::MemberTable<RealizeRelation>& Members();
  const char* KindName() const override;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_REALIZE_RELATION_H_
