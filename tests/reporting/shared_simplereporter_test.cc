#include "reporting/shared_simplereporter.h"

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include "automation/call.h"
#include "automation/error.h"
#include "external/reporter_api.h"
#include "tests/support/error_of.h"

namespace kelqln {
namespace {

using automation::Args;
using automation::CallKind;
using automation::CInt;
using automation::CStr;
using automation::Variant;
namespace names = external::reporter_api;

// One operation of a script: 'E'rror, 'W'arning, 'L'og, 'S'ummary.
struct Step {
  char kind;
  std::string text;
};

void Play(kelReporterApi& reporter, const std::vector<Step>& steps) {
  for (const Step& step : steps) {
    std::string text = step.text;
    switch (step.kind) {
      case 'E':
        reporter.Error(text);
        break;
      case 'W':
        reporter.Warning(text);
        break;
      case 'L':
        reporter.Log(text);
        break;
      case 'S':
        reporter.Summary(text);
        break;
    }
    EXPECT_EQ(text, step.text) << "the reporter changed the caller's text";
  }
}

TEST(SharedSimpleReporterTest, OnlyErrorsAndWarningsStartANewLine) {
  struct Case {
    std::vector<Step> steps;
    std::string text;
    int16_t errors;
    int16_t warnings;
  };
  const std::vector<Case> cases = {
      {{{'E', "A"}, {'E', "B"}}, "A\r\nB", 2, 0},
      {{{'L', "A"}, {'E', "B"}}, "A\r\nB", 1, 0},
      {{{'E', "A"}, {'L', "B"}}, "AB", 1, 0},
      {{{'W', "A"}, {'S', "B"}, {'W', "C"}}, "AB\r\nC", 0, 2},
      {{{'L', "A"}, {'S', "B"}}, "AB", 0, 0},
      {{{'E', ""}, {'W', "B"}}, "B", 1, 1},
      {{}, "", 0, 0},
  };
  for (const Case& test : cases) {
    auto reporter = shared_simplereporter::Create();
    Play(*reporter, test.steps);
    EXPECT_EQ(reporter->Text(), test.text);
    EXPECT_EQ(reporter->ErrorCount(), test.errors);
    EXPECT_EQ(reporter->WarningCount(), test.warnings);
  }
}

TEST(SharedSimpleReporterTest, ResetClearsTheStatusOperationsDoNot) {
  auto reporter = shared_simplereporter::Create();
  Play(*reporter, {{'E', "A"}, {'W', "B"}});
  reporter->ClearStatus();
  reporter->ClearStatusCounts();
  reporter->ClearTask();
  EXPECT_EQ(reporter->Text(), "A\r\nB");
  EXPECT_EQ(reporter->Errors(), 1);
  EXPECT_EQ(reporter->Warnings(), 1);

  automation::Call(reporter, shared_simplereporter::kReset);
  EXPECT_EQ(reporter->Text(), "");
  EXPECT_EQ(reporter->Errors(), 0);
  EXPECT_EQ(reporter->Warnings(), 0);
  Play(*reporter, {{'E', "C"}});
  EXPECT_EQ(reporter->Text(), "C");
}

TEST(SharedSimpleReporterTest, TheCountsOverflowAt32768) {
  for (bool errors : {true, false}) {
    SCOPED_TRACE(errors ? "errors" : "warnings");
    auto reporter = shared_simplereporter::Create();
    std::function<void(std::string&)> report = [&](std::string& text) {
      if (errors) {
        reporter->Error(text);
      } else {
        reporter->Warning(text);
      }
    };
    std::string text = "x";
    for (int i = 0; i < 32767; ++i) report(text);
    EXPECT_EQ(testing_support::ErrorOf([&] { report(text); }),
              automation::kOverflow);
    EXPECT_EQ(errors ? reporter->ErrorCount() : reporter->WarningCount(),
              32767);
  }
}

TEST(SharedSimpleReporterTest, AnswersLateBound) {
  auto reporter = shared_simplereporter::Create();
  Args error{Variant("A")};
  automation::InvokeByName(reporter, names::kError, CallKind::kMethod, error);
  automation::CallByName(reporter, names::kWarning, "B");
  automation::LetByName(reporter, names::kInformationType, int32_t{7});

  EXPECT_EQ(CStr(error[0]), "A");
  EXPECT_EQ(CStr(automation::Get(reporter, shared_simplereporter::kText)),
            "A\r\nB");
  EXPECT_EQ(CInt(automation::Get(reporter, shared_simplereporter::kErrors)), 1);
  EXPECT_EQ(CInt(automation::Get(reporter, shared_simplereporter::kWarnings)),
            1);
  EXPECT_EQ(CInt(automation::GetByName(reporter, names::kInformationType)), 0);
  EXPECT_FALSE(
      automation::CBool(automation::CallByName(reporter, names::kCancel)));
}

}  // namespace
}  // namespace kelqln
