// Unique identifiers of model elements: texts, unique within one model and
// compared exactly. A model takes new ones from its generator; tests and
// benchmarks install a deterministic one.
#ifndef KELQLN_HOST_MODELTOOL_UNIQUE_ID_H_
#define KELQLN_HOST_MODELTOOL_UNIQUE_ID_H_

#include <functional>
#include <string>

namespace host::modeltool {

using UniqueIdGenerator = std::function<std::string()>;

// A random identifier shaped "{XXXXXXXX-XXXX-XXXX-XXXX-XXXXXXXXXXXX}" (upper
// case hexadecimal digits).
std::string NewGuidText();

// prefix + "1", prefix + "2", ... : the same ids on every run.
UniqueIdGenerator SequentialUniqueIds(std::string prefix);

}  // namespace host::modeltool

#endif  // KELQLN_HOST_MODELTOOL_UNIQUE_ID_H_
