#include "selection/identity_changes.h"

#include <atomic>

namespace kelqln {
namespace {

std::atomic<uint64_t> identity_changes{0};

}  // namespace

void CountIdentityChange() { ++identity_changes; }

uint64_t IdentityChangeCount() { return identity_changes.load(); }

}  // namespace kelqln
