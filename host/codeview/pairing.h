// Pairs the items the code has with the elements the model has, by keys.
//
// Keys are tried in turn: each pass pairs every code item still alone with
// the first model element still alone whose key is equal (in the model's
// order), so a pairing found by a stronger key (an exact signature) is never
// undone by a weaker one (a bare name). Elements a key function answers ""
// for take no part in that pass. The result depends only on the two lists
// and their order, which is what makes a second identical update find
// exactly the same pairs.
#ifndef KELQLN_HOST_CODEVIEW_PAIRING_H_
#define KELQLN_HOST_CODEVIEW_PAIRING_H_

#include <deque>
#include <functional>
#include <memory>
#include <string>
#include <unordered_map>
#include <vector>

namespace host::codeview {

template <class Code, class Element>
struct Pairing {
  // For each code item, in order: its model element, or nullptr.
  std::vector<std::shared_ptr<Element>> element_of;
  // The model elements no code item took, in the model's order.
  std::vector<std::shared_ptr<Element>> unpaired;
};

template <class Code, class Element>
struct PairingKey {
  std::function<std::string(const Code&)> of_code;
  std::function<std::string(const Element&)> of_element;
};

template <class Code, class Element>
Pairing<Code, Element> Pair(
    const std::vector<Code>& code,
    const std::vector<std::shared_ptr<Element>>& elements,
    const std::vector<PairingKey<Code, Element>>& keys) {
  Pairing<Code, Element> result;
  result.element_of.resize(code.size());
  std::vector<bool> taken(elements.size(), false);
  for (const auto& key : keys) {
    std::unordered_map<std::string, std::deque<size_t>> free;
    for (size_t e = 0; e < elements.size(); ++e) {
      if (taken[e]) continue;
      std::string text = key.of_element(*elements[e]);
      if (!text.empty()) free[text].push_back(e);
    }
    for (size_t c = 0; c < code.size(); ++c) {
      if (result.element_of[c]) continue;
      std::string text = key.of_code(code[c]);
      if (text.empty()) continue;
      auto found = free.find(text);
      if (found == free.end() || found->second.empty()) continue;
      size_t e = found->second.front();
      found->second.pop_front();
      taken[e] = true;
      result.element_of[c] = elements[e];
    }
  }
  for (size_t e = 0; e < elements.size(); ++e) {
    if (!taken[e]) result.unpaired.push_back(elements[e]);
  }
  return result;
}

}  // namespace host::codeview

#endif  // KELQLN_HOST_CODEVIEW_PAIRING_H_
