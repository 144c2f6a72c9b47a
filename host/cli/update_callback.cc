#include "host/cli/update_callback.h"

#include "automation/collection.h"
#include "automation/error.h"
#include "host/modeltool/element.h"

namespace host::cli {

void UpdateCallback::OnSynchronize(automation::Args& args) {
  if (args.size() < 2) throw automation::Error(automation::kWrongArgumentCount);
  auto kept = automation::Collection::Create();
  for (const automation::Variant& item :
       automation::CollectionItems(automation::CObj(args[1]))) {
    // Only the tool's own elements can be shown to the user; anything else
    // stays where it is.
    auto element = modeltool::ElementArg<modeltool::Element>(item);
    if (!element) continue;
    ElementSummary summary = ElementSummary::Of(*element);
    if (!policy_.Confirms(summary)) continue;
    kept->Items().Add(item);
    confirmed_.push_back({element, std::move(summary)});
  }
  args[1] = automation::Variant(automation::Object(kept));
}

std::vector<ElementSummary> UpdateCallback::Deleted() const {
  std::vector<ElementSummary> deleted;
  for (const Confirmed& confirmed : confirmed_) {
    if (!confirmed.element->GetModel()) deleted.push_back(confirmed.summary);
  }
  return deleted;
}

const automation::MemberTable<UpdateCallback>& UpdateCallback::Members() {
  using automation::Args;
  using automation::CallKind;
  using automation::Variant;
  static const automation::MemberTable<UpdateCallback> table(
      "UpdateCallback",
      {
          {automation::kNamedOnly, "OnSynchronize", CallKind::kMethod,
           [](UpdateCallback& self, Args& args) {
             self.OnSynchronize(args);
             return Variant();
           }},
          {automation::kNamedOnly, "OnCompleted", CallKind::kMethod,
           [](UpdateCallback& self, Args&) {
             self.OnCompleted();
             return Variant();
           }},
      });
  return table;
}

}  // namespace host::cli
