// Every text number the system asks for must be in the string table.
//
// The convention the system's sources follow, so this test can find the
// numbers: a text is asked for either by calling StringResText(N) or
// StringResNumber(N) with the number written as a decimal literal, or
// through a constant whose name is kText followed by the number (kText3609).
// The test reads every .h and .cc file below the system's folders.
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <map>
#include <regex>
#include <set>
#include <string>

#include "host/strings/string_table.h"

namespace host::strings {
namespace {

const char* const kSystemFolders[] = {"entry",     "selection", "engine",
                                      "reporting", "shared",    "wizard"};

// The numbers a source text asks for.
std::set<int32_t> NumbersAskedFor(const std::string& source) {
  static const std::regex kAsk(
      R"((?:StringResText|StringResNumber)\(\s*(\d+)\s*\)|\bkText(\d+)\b)");
  std::set<int32_t> numbers;
  for (std::sregex_iterator it(source.begin(), source.end(), kAsk), end;
       it != end; ++it) {
    const auto& digits = (*it)[1].matched ? (*it)[1] : (*it)[2];
    numbers.insert(std::stoi(digits.str()));
  }
  return numbers;
}

TEST(StringCoverageTest, FindsTheNumbersOfEachConvention) {
  const struct {
    const char* source;
    std::set<int32_t> numbers;
  } kRows[] = {
      {"Log(StringResText(3609));", {3609}},
      {"int w = StringResNumber( 3600 );", {3600}},
      {"constexpr int32_t kText30106 = 30106;", {30106}},
      {"StringResText(number); kTextBox; StringResText(kText1621)", {1621}},
      {"std::string StringResText(int32_t number);", {}},
  };
  for (const auto& row : kRows) {
    EXPECT_EQ(NumbersAskedFor(row.source), row.numbers) << row.source;
  }
}

TEST(StringCoverageTest, EveryNumberTheSystemAsksForIsInTheTable) {
  auto table = StringTable::ForThisProcess();
  std::map<int32_t, std::string> missing;
  int folders = 0;
  for (const char* folder : kSystemFolders) {
    std::filesystem::path root =
        std::filesystem::path(KELQLN_SOURCE_ROOT) / folder;
    if (!std::filesystem::is_directory(root)) continue;
    ++folders;
    for (const auto& entry :
         std::filesystem::recursive_directory_iterator(root)) {
      auto extension = entry.path().extension();
      if (extension != ".h" && extension != ".cc") continue;
      std::ifstream in(entry.path(), std::ios::binary);
      std::string source((std::istreambuf_iterator<char>(in)),
                         std::istreambuf_iterator<char>());
      for (int32_t number : NumbersAskedFor(source)) {
        if (table->Find(number) == nullptr) {
          missing.emplace(number, entry.path().string());
        }
      }
    }
  }
  EXPECT_GT(folders, 0) << "no system folder under " << KELQLN_SOURCE_ROOT;
  for (const auto& [number, file] : missing) {
    ADD_FAILURE() << file << " asks for text " << number
                  << ", which host/strings/strings.tsv lacks";
  }
}

}  // namespace
}  // namespace host::strings
