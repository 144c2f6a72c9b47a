#include "host/codeview/class_matcher.h"

#include <unordered_set>

#include "host/codeview/home_package.h"
#include "host/codeview/pairing.h"
#include "host/modeltool/logical_package.h"

namespace host::codeview {

using modeltool::Class;

ClassMatch MatchClasses(const std::vector<const CodeClass*>& code,
                        const modeltool::Component& component,
                        const modeltool::Model& model) {
  std::vector<std::shared_ptr<Class>> assigned;
  for (const auto& weak : component.Classes()) {
    if (auto cls = weak.lock()) assigned.push_back(cls);
  }
  auto pairing = Pair<const CodeClass*, Class>(
      code, assigned,
      {{[](const CodeClass* c) { return c->unique_id; },
        [](const Class& m) { return m.UniqueId(); }},
       {[](const CodeClass* c) { return c->name; },
        [](const Class& m) { return m.Name(); }}});

  ClassMatch match{std::move(pairing.element_of), std::move(pairing.unpaired)};
  std::unordered_set<const Class*> taken;
  for (const auto& cls : match.model_of_code) {
    if (cls) taken.insert(cls.get());
  }
  auto take = [&taken](const std::shared_ptr<Class>& cls) {
    return cls && taken.insert(cls.get()).second;
  };
  auto home = FindHomePackage(model, component);
  for (size_t i = 0; i < code.size(); ++i) {
    if (match.model_of_code[i]) continue;
    if (!code[i]->unique_id.empty()) {
      auto by_id = model.Find<Class>(code[i]->unique_id);
      if (take(by_id)) {
        match.model_of_code[i] = by_id;
        continue;
      }
    }
    if (!home) continue;
    for (const auto& cls : home->Classes()) {
      if (cls->Name() == code[i]->name && take(cls)) {
        match.model_of_code[i] = cls;
        break;
      }
    }
  }
  // A class the component has but the code took by another way (a class of
  // the home package that is also assigned) is not vanished.
  std::erase_if(match.vanished, [&taken](const std::shared_ptr<Class>& cls) {
    return taken.count(cls.get()) != 0;
  });
  return match;
}

}  // namespace host::codeview
