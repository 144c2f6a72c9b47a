#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "automation/error.h"
#include "automation/member_table.h"
#include "entry/add_in_services.h"

namespace kelqln {
namespace {

using automation::Args;
using automation::CallKind;
using automation::MemberTable;
using automation::Object;
using automation::Variant;

// A server object without round-trip operations.
class PlainServer : public automation::DispatchImpl<PlainServer> {
 public:
  static const MemberTable<PlainServer>& Members() {
    static const MemberTable<PlainServer> table("PlainServer", {});
    return table;
  }
};

// A server whose "GetRTEServer" answers `answer`, or raises when `fails`.
class RteHolder : public automation::DispatchImpl<RteHolder> {
 public:
  static const MemberTable<RteHolder>& Members() {
    static const MemberTable<RteHolder> table(
        "RteHolder",
        {{1, "GetRTEServer", CallKind::kMethod, [](RteHolder& self, Args&) {
            if (self.fails) throw automation::Error(5);
            return self.answer;
          }}});
    return table;
  }
  Variant answer;
  bool fails = false;
};

TEST(GetRTEServerOfTest, GivesTheRoundTripServerOrTheServerItself) {
  auto rte = std::make_shared<PlainServer>();
  auto plain = std::make_shared<PlainServer>();
  auto gives_rte = std::make_shared<RteHolder>();
  gives_rte->answer = Variant(rte);
  auto gives_nothing = std::make_shared<RteHolder>();
  gives_nothing->answer = Variant(nullptr);
  auto gives_text = std::make_shared<RteHolder>();
  gives_text->answer = Variant("server");
  auto fails = std::make_shared<RteHolder>();
  fails->fails = true;

  struct Case {
    const char* name;
    Object server;
    Object expected;
  };
  const Case cases[] = {
      {"has one", gives_rte, rte},
      {"no such operation", plain, plain},
      {"answers Nothing", gives_nothing, gives_nothing},
      {"answers no object", gives_text, gives_text},
      {"operation fails", fails, fails},
      {"Nothing", nullptr, nullptr},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(GetRTEServerOf(c.server), c.expected) << c.name;
  }
}

}  // namespace
}  // namespace kelqln
