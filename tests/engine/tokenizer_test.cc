#include "engine/tokenizer.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace kelqln {
namespace {

struct Call {
  std::string separators;
  std::string token;
};

struct Case {
  std::string name;
  std::string text;
  std::vector<Call> calls;
};

TEST(TokenizerTest, TokensFollowTheSeparators) {
  const Case cases[] = {
      {"component and class", "A\\B", {{"\\", "A"}, {"\\", "B"}, {"\\", ""}}},
      {"adjacent separators", "A\\\\B", {{"\\", "A"}, {"\\", ""}, {"\\", "B"}}},
      {"leading separator", "\\B", {{"\\", ""}, {"\\", "B"}}},
      {"trailing separator", "A\\", {{"\\", "A"}, {"\\", ""}, {"\\", ""}}},
      {"first of several", "X;Y,Z", {{",;", "X"}, {",;", "Y"}, {",;", "Z"}}},
      {"blank keeps the stored", "X;Y;Z", {{";", "X"}, {" ", "Y"}, {"", "Z"}}},
      {"default is a blank", "one two", {{"", "one"}, {"", "two"}}},
      {"changed between calls", "a,b;c", {{";", "a,b"}, {",", "c"}}},
      {"no separator", "plain", {{"\\", "plain"}, {"\\", ""}}},
      {"empty text", "", {{"\\", ""}}},
      {"multi-byte separator",
       "a\xC2\xA7"
       "b\xC2\xA7",
       {{"\xC2\xA7", "a"}, {"", "b"}, {"", ""}}},
  };
  for (const Case& c : cases) {
    Tokenizer tokenizer(c.text);
    for (size_t i = 0; i < c.calls.size(); ++i) {
      EXPECT_EQ(tokenizer.Token(c.calls[i].separators), c.calls[i].token)
          << c.name << ", call " << i + 1;
    }
  }
}

TEST(TokenizerTest, SkipDropsOneTokenWithTheStoredSeparators) {
  Tokenizer tokenizer("a;b;c");
  EXPECT_EQ(tokenizer.Token(";"), "a");
  tokenizer.Skip();
  EXPECT_EQ(tokenizer.Token(""), "c");
}

TEST(TokenizerTest, ReloadingStartsAgainWithABlankSeparator) {
  Tokenizer tokenizer("x\\y");
  EXPECT_EQ(tokenizer.Token("\\"), "x");
  tokenizer = Tokenizer("p q\\r");
  EXPECT_EQ(tokenizer.Token(""), "p");
  EXPECT_EQ(tokenizer.Token(""), "q\\r");
}

TEST(TokenizerTest, DefaultTokenizerGivesEmptyTokens) {
  Tokenizer tokenizer;
  EXPECT_EQ(tokenizer.Token("\\"), "");
  tokenizer.Skip();
  EXPECT_EQ(tokenizer.Token(""), "");
}

TEST(TokenizerTest, SeparatorsAreFoundAnywhereInLongTexts) {
  // Long generated selection texts once lost their class part here.
  for (size_t length : {9999u, 10000u, 32767u, 32768u, 100000u}) {
    std::string component(length, 'c');
    Tokenizer tokenizer(component + "\\Class\\" + component);
    EXPECT_EQ(tokenizer.Token("\\"), component) << length;
    EXPECT_EQ(tokenizer.Token("\\"), "Class") << length;
    EXPECT_EQ(tokenizer.Token("\\"), component) << length;
    EXPECT_EQ(tokenizer.Token("\\"), "") << length;
  }
}

}  // namespace
}  // namespace kelqln
