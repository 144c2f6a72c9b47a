// The construction and release trace of the code-view selection's entries:
// with the debug log on for category 5 or 2 at level 4, an entry writes one
// line when it is made and one when it goes, so leaked or early-released
// entries show in the log. The lines carry the name of the module the
// selection is built into ("QLN" for this library, "SYN" for the
// synchronising sibling, which shares this code), and that module's debug
// category.
#ifndef KELQLN_SELECTION_CONSTRUCTION_TRACE_H_
#define KELQLN_SELECTION_CONSTRUCTION_TRACE_H_

#include <cstdint>
#include <string>
#include <string_view>

#include "automation/dispatch.h"

namespace kelqln {

class ConstructionTrace {
 public:
  // Writes "FinalConstruct <class_name> <tag>:<address>" for `object` when
  // the trace is on.
  ConstructionTrace(std::string_view class_name, const void* object);

  // Writes "    FinalRelease <class_name> <tag>:<address> <name>" when the
  // trace was on at construction: the name (member `name_id`) of `held`,
  // "<Nothing>" without object, "<UNKNOWN>" when the name cannot be read.
  void Release(const automation::Object& held,
               automation::DispId name_id) const noexcept;

 private:
  std::string class_name_;
  const void* object_;
  bool on_ = false;
  std::string tag_;
  int32_t category_ = 0;
};

}  // namespace kelqln

#endif  // KELQLN_SELECTION_CONSTRUCTION_TRACE_H_
