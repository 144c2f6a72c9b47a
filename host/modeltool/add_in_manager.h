// The modelling tool's add-in manager: the add-ins in the order they were
// installed (see add_in_registry.h for the ones the registry describes).
#ifndef KELQLN_HOST_MODELTOOL_ADD_IN_MANAGER_H_
#define KELQLN_HOST_MODELTOOL_ADD_IN_MANAGER_H_

#include <memory>
#include <string_view>
#include <vector>

#include "automation/member_table.h"
#include "host/modeltool/add_in.h"

namespace host::modeltool {

class AddInManager : public automation::DispatchImpl<AddInManager> {
 public:
  static const automation::MemberTable<AddInManager>& Members();

  // Installs an add-in; kDuplicateKey when one of that name is installed.
  void Add(std::shared_ptr<AddIn> add_in);
  // The add-in of that name (compared exactly), or nullptr.
  std::shared_ptr<AddIn> Find(std::string_view name) const;
  const std::vector<std::shared_ptr<AddIn>>& AddIns() const { return add_ins_; }

 private:
  std::vector<std::shared_ptr<AddIn>> add_ins_;
};

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_ADD_IN_MANAGER_H_
