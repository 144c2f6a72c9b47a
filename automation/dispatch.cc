#include "automation/dispatch.h"

#include "automation/error.h"

namespace automation {

const Variant& RequiredArg(const Args& args, size_t index) {
  if (index >= args.size() || args[index].IsMissing()) {
    throw Error(kArgumentNotOptional);
  }
  return args[index];
}

Variant OptionalArg(const Args& args, size_t index, Variant fallback) {
  if (index >= args.size() || args[index].IsMissing()) return fallback;
  return args[index];
}

const Variant& PutValue(const Args& args) {
  if (args.empty()) throw Error(kWrongArgumentCount);
  return args.back();
}

}  // namespace automation
