// A late-bound object for tests that must see what the system calls on a
// component outside it: every call is recorded, members known by name get
// numbers on first use, and an optional responder gives the answers.
#ifndef KELQLN_TESTS_SUPPORT_RECORDING_OBJECT_H_
#define KELQLN_TESTS_SUPPORT_RECORDING_OBJECT_H_

#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "automation/case_folding.h"
#include "automation/dispatch.h"

namespace testing_support {

class RecordingObject : public automation::Dispatch {
 public:
  struct Call {
    automation::DispId id;
    automation::CallKind kind;
    automation::Args args;  // as the callee received them
  };
  // Answers a call; it may write into by-reference arguments.
  using Responder = std::function<automation::Variant(
      automation::DispId, automation::CallKind, automation::Args&)>;

  static std::shared_ptr<RecordingObject> Create(Responder responder = {}) {
    auto object = std::make_shared<RecordingObject>();
    object->responder = std::move(responder);
    return object;
  }

  automation::Variant Invoke(automation::DispId id, automation::CallKind kind,
                             automation::Args& args) override {
    calls.push_back({id, kind, args});
    return responder ? responder(id, kind, args) : automation::Variant();
  }

  automation::DispId IdOfName(std::string_view name) const override {
    auto [at, added] = names_.try_emplace(
        automation::FoldCase(name),
        kFirstNameId + static_cast<automation::DispId>(names_.size()));
    return at->second;
  }

  std::string TypeName() const override { return "RecordingObject"; }

  // The calls of member `id`, or of the member called `name`.
  std::vector<Call> CallsTo(automation::DispId id) const {
    std::vector<Call> found;
    for (const Call& call : calls) {
      if (call.id == id) found.push_back(call);
    }
    return found;
  }
  std::vector<Call> CallsTo(std::string_view name) const {
    return CallsTo(IdOfName(name));
  }

  std::vector<Call> calls;
  Responder responder;

 private:
  static constexpr automation::DispId kFirstNameId = 0x70000000;
  mutable std::unordered_map<std::string, automation::DispId> names_;
};

}  // namespace testing_support

#endif  // KELQLN_TESTS_SUPPORT_RECORDING_OBJECT_H_
