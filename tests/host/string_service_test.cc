#include "external/string_service.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <set>
#include <string>

#include "automation/call.h"
#include "automation/class_registry.h"
#include "automation/error.h"
#include "external/orel.h"
#include "host/strings/string_service.h"
#include "host/strings/string_table.h"

namespace host::strings {
namespace {

namespace names = external::string_service;
using automation::Object;

int ErrorNumberOf(const std::function<void()>& call, std::string* text) {
  try {
    call();
  } catch (const automation::Error& error) {
    if (text) *text = error.Description();
    return error.Number();
  }
  return 0;
}

Object NewService() {
  RegisterStringService();
  return automation::CreateObject(names::kProgId);
}

TEST(StringServiceTest, AnswersTextsAndNumbersLateBound) {
  Object service = NewService();
  EXPECT_EQ(automation::CStr(automation::Call(service, names::kText, 3000)),
            "Model Update Wizard");
  automation::Variant width = automation::Call(service, names::kNumber, 3600);
  EXPECT_EQ(width.Type(), automation::VarType::kLong);
  EXPECT_EQ(automation::CLng(width), 7500);
  // The number may come as any numeric type or as numeric text.
  EXPECT_EQ(
      automation::CStr(automation::Call(service, names::kText, int16_t{3609})),
      " - done");
  EXPECT_EQ(automation::CStr(automation::Call(service, names::kText, "3610")),
            " - failed");
}

TEST(StringServiceTest, UnknownNumberIsAnErrorNamingIt) {
  Object service = NewService();
  for (automation::DispId member : {names::kText, names::kNumber}) {
    std::string text;
    EXPECT_NE(
        ErrorNumberOf([&] { automation::Call(service, member, 4711); }, &text),
        0);
    EXPECT_NE(text.find("4711"), std::string::npos) << text;
  }
}

TEST(StringServiceTest, ANonNumericTextReadAsNumberNamesTheNumber) {
  Object service = NewService();
  std::string text;
  EXPECT_EQ(
      ErrorNumberOf([&] { automation::Call(service, names::kNumber, 3000); },
                    &text),
      automation::kTypeMismatch);
  EXPECT_NE(text.find("3000"), std::string::npos) << text;
}

// Texts the system compares with the tool's kind names, prefixes it puts in
// front of lines, and numbers it reads as numbers.
TEST(StringServiceTest, TextsTheSystemReliesOn) {
  auto table = StringTable::ForThisProcess();
  namespace kind = external::orel::kind;
  const struct {
    int32_t number;
    std::string text;
  } kExact[] = {
      {30100, kind::kAttribute},
      {30101, kind::kHasRelationship},
      {30102, kind::kInheritRelation},
      {30103, kind::kOperation},
      {30104, kind::kRole},
      {30114, kind::kInheritRelation},
      {30115, kind::kRealizeRelation},
      {30106, "Error: "},
      {30107, "Warning: "},
  };
  for (const auto& row : kExact) {
    ASSERT_NE(table->Find(row.number), nullptr) << row.number;
    EXPECT_EQ(*table->Find(row.number), row.text) << row.number;
  }
  StringService service(table);
  for (int32_t number : {101, 3600, 3601, 3602, 5003, 5004}) {
    EXPECT_GT(service.Number(number), 0) << number;
  }
  // Page keys are told apart by their text.
  std::set<std::string> keys;
  for (int32_t number = 3531; number <= 3536; ++number) {
    keys.insert(service.Text(number));
  }
  EXPECT_EQ(keys.size(), 6u);
  EXPECT_NE(service.Text(30001), service.Text(30003));
}

// Each text holds exactly the placeholders its callers fill.
TEST(StringServiceTest, PlaceholdersAreTheOnesTheCallersFill) {
  auto table = StringTable::ForThisProcess();
  const struct {
    int32_t number;
    const char* placeholders;
  } kRows[] = {
      {1619, "12"}, {1621, "12"}, {3607, "1"}, {3615, "1"}, {3620, "1"},
      {3625, "12"}, {3626, "1"},  {3628, "1"}, {3630, "1"}, {3631, "1"},
      {3633, "1"},  {3634, "1"},  {3635, "1"}, {3636, "1"}, {3637, "1"},
      {3638, "1"},  {3639, "1"},  {3640, "1"}, {3642, "1"}, {3643, "1"},
      {3646, "12"}, {3647, "2"},  {3652, "1"}, {3653, "1"}, {3654, "1"},
      {3000, ""},   {3609, ""},   {3641, ""},  {3645, ""},  {30106, ""},
  };
  for (const auto& row : kRows) {
    const std::string* text = table->Find(row.number);
    ASSERT_NE(text, nullptr) << row.number;
    std::string found;
    for (char digit : std::string("123")) {
      if (text->find(std::string("%") + digit) != std::string::npos) {
        found += digit;
      }
    }
    EXPECT_EQ(found, row.placeholders) << row.number << ": " << *text;
  }
}

TEST(StringTableTest, MalformedTablesAreRefusedWithTheLine) {
  const struct {
    const char* text;
    const char* expected;
  } kRows[] = {
      {"1\tone\n2 two\n", "t.tsv:2: no tab"},
      {"1\tone\nx1\tbad\n", "t.tsv:2: 'x1' is not a number"},
      {"1\tone\n# note\n1\tagain\n", "t.tsv:3: number 1 is given twice"},
      {"\tno number\n", "t.tsv:1: '' is not a number"},
      {"7\tbad \\q escape\n", "t.tsv:1: unknown escape \\q"},
      {"99999999999\ttoo big\n", "t.tsv:1: '99999999999' is not a number"},
  };
  for (const auto& row : kRows) {
    std::string text;
    EXPECT_EQ(
        ErrorNumberOf([&] { StringTable::Parse(row.text, "t.tsv"); }, &text),
        automation::kBadFileFormat)
        << row.text;
    EXPECT_EQ(text.rfind(row.expected, 0), 0u) << text;
  }
}

TEST(StringTableTest, EscapesCommentsAndLineEnds) {
  StringTable table = StringTable::Parse(
      "# comment\r\n\r\n5\ta\\tb\\nc\\\\\r\n6\tends in blank\\s\n7\t\n",
      "t.tsv");
  EXPECT_EQ(*table.Find(5), "a\tb\nc\\");
  EXPECT_EQ(*table.Find(6), "ends in blank ");
  EXPECT_EQ(*table.Find(7), "");
  EXPECT_EQ(table.Find(8), nullptr);
  EXPECT_EQ(table.Numbers(), (std::vector<int32_t>{5, 6, 7}));
}

TEST(StringTableTest, EnvironmentOverridesTheBuiltInTable) {
  auto file = std::filesystem::temp_directory_path() /
              ("kelqln-strings-" + std::to_string(::getpid()) + ".tsv");
  std::ofstream(file) << "3000\tAnother Title\n";
  setenv("KELQLN_STRINGS", file.c_str(), 1);
  Object service = NewService();
  EXPECT_EQ(automation::CStr(automation::Call(service, names::kText, 3000)),
            "Another Title");
  EXPECT_NE(
      ErrorNumberOf([&] { automation::Call(service, names::kText, 3001); },
                    nullptr),
      0);
  std::filesystem::remove(file);
  EXPECT_EQ(ErrorNumberOf([] { NewService(); }, nullptr),
            automation::kFileNotFound);
  unsetenv("KELQLN_STRINGS");
  EXPECT_EQ(
      automation::CStr(automation::Call(NewService(), names::kText, 3000)),
      "Model Update Wizard");
}

// The table built into the library is the file in the repository.
TEST(StringTableTest, BuiltInTableIsTheRepositoryFile) {
  std::ifstream in(KELQLN_STRING_TABLE, std::ios::binary);
  std::string file((std::istreambuf_iterator<char>(in)),
                   std::istreambuf_iterator<char>());
  EXPECT_EQ(EmbeddedStringTable(), file);
}

}  // namespace
}  // namespace host::strings
