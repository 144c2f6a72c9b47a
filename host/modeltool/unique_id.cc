#include "host/modeltool/unique_id.h"

#include <cstdint>
#include <memory>
#include <random>
#include <utility>

namespace host::modeltool {

std::string NewGuidText() {
  thread_local std::mt19937_64 engine([] {
    std::random_device device;
    std::seed_seq seed{device(), device(), device(), device()};
    return std::mt19937_64(seed);
  }());
  static constexpr char kDigits[] = "0123456789ABCDEF";
  static constexpr int kGroups[] = {8, 4, 4, 4, 12};
  std::string text = "{";
  uint64_t bits = engine();
  int left = 16;
  for (int group = 0; group < 5; ++group) {
    if (group > 0) text += '-';
    for (int i = 0; i < kGroups[group]; ++i) {
      if (left == 0) {
        bits = engine();
        left = 16;
      }
      text += kDigits[bits & 0xf];
      bits >>= 4;
      --left;
    }
  }
  text += '}';
  return text;
}

UniqueIdGenerator SequentialUniqueIds(std::string prefix) {
  auto next = std::make_shared<uint64_t>(0);
  return [prefix = std::move(prefix), next] {
    return prefix + std::to_string(++*next);
  };
}

}  // namespace host::modeltool
