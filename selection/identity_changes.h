// The selection finds its entries through indexes of the identities they
// stand for: the model component's (or project's) object and unique
// identifier. Anything that changes such an identity once an entry exists --
// a caller giving an entry another object, a project handing its identifier
// to its model component -- counts the change here; every selection
// collection rebuilds its indexes before its next look-up after a change,
// so its answers stay those of a walk through its lists.
#ifndef KELQLN_SELECTION_IDENTITY_CHANGES_H_
#define KELQLN_SELECTION_IDENTITY_CHANGES_H_

#include <cstdint>

namespace kelqln {

void CountIdentityChange();
uint64_t IdentityChangeCount();

}  // namespace kelqln

#endif  // KELQLN_SELECTION_IDENTITY_CHANGES_H_
