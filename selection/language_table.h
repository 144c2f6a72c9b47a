// What both selections are made of: entries filed by language, the languages
// in the order first met, and an index that says where each entry is filed.
#ifndef KELQLN_SELECTION_LANGUAGE_TABLE_H_
#define KELQLN_SELECTION_LANGUAGE_TABLE_H_

#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "automation/basic_collection.h"
#include "automation/case_folding.h"
#include "selection/selection_collections.h"

namespace kelqln {

template <class Entry>
struct LanguageEntries {
  std::string name;
  std::shared_ptr<automation::BasicCollection<std::shared_ptr<Entry>>> entries;
};

// Keyed by language name (letter case ignored), in first-met order.
template <class Entry>
using LanguageTable = automation::BasicCollection<LanguageEntries<Entry>>;

// Where an entry is filed: its language's key and, in a keyed collection,
// its own key.
template <class Entry>
struct Placement {
  std::shared_ptr<Entry> entry;
  std::string language;
  std::string key;
};

// The languages that hold entries, in order, each keyed by itself, except
// `left_out` (letter case ignored).
template <class Entry>
NameCollection IncludedLanguages(const LanguageTable<Entry>& languages,
                                 std::string_view left_out = {}) {
  NameCollection names;
  for (const auto& language : languages) {
    if (language.entries->Empty()) continue;
    if (automation::EqualsIgnoreCase(language.name, left_out)) continue;
    names.Add(language.name, language.name);
  }
  return names;
}

// Of several placements, the one whose entry comes first in a walk of the
// languages and their entries; null for none.
template <class Entry>
const Placement<Entry>* FirstInListOrder(
    const LanguageTable<Entry>& languages,
    const std::vector<const Placement<Entry>*>& placements) {
  if (placements.size() <= 1) {
    return placements.empty() ? nullptr : placements.front();
  }
  for (const auto& language : languages) {
    for (const auto& entry : *language.entries) {
      for (const Placement<Entry>* placement : placements) {
        if (placement->entry == entry) return placement;
      }
    }
  }
  return nullptr;
}

}  // namespace kelqln

#endif  // KELQLN_SELECTION_LANGUAGE_TABLE_H_
