#include "shared/string_utilities.h"

#include <gtest/gtest.h>

#include <string>

namespace kelqln {
namespace {

TEST(StringUtilitiesTest, IsBlankSeesOnlySpacesAsBlank) {
  struct Case {
    std::string text;
    bool blank;
  };
  const Case cases[] = {
      {"", true},   {"   ", true}, {" x ", false},
      {"x", false}, {"\t", false}, {"  .", false},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(IsBlank(c.text), c.blank) << "'" << c.text << "'";
  }
}

TEST(StringUtilitiesTest, ReplaceAllReplacesEveryOccurrenceOnce) {
  struct Case {
    std::string find;
    std::string replacement;
    std::string text;
    std::string expected;
  };
  const Case cases[] = {
      {".", "_", "a.b.c", "a_b_c"},
      {".", "_", "abc", "abc"},
      {"AA", "B", "AAA", "BA"},
      // Text produced by a replacement is not searched again.
      {"AB", "A", "ABB", "AB"},
      {"%1", "50%1", "Component %1 failed", "Component 50%1 failed"},
      {"%1", "%1%1", "%1 and %1", "%1%1 and %1%1"},
      // Matching is case-sensitive.
      {"a", "x", "aAa", "xAx"},
      {"%1", "", "%1x%1", "x"},
      {"", "x", "abc", "abc"},
      {"abc", "x", "", ""},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(ReplaceAll(c.find, c.replacement, c.text), c.expected)
        << "find '" << c.find << "' by '" << c.replacement << "' in '" << c.text
        << "'";
  }
}

}  // namespace
}  // namespace kelqln
