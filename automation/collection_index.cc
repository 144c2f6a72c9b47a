#include "automation/collection_index.h"

#include "automation/error.h"

namespace automation {

CollectionIndex CollectionIndex::FromVariant(const Variant& value) {
  if (value.IsString()) return CollectionIndex(value.StringValue());
  if (value.IsNumeric()) return CollectionIndex(CLng(value));
  throw Error(kTypeMismatch);
}

}  // namespace automation
