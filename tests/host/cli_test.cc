// The kelqln program run as a user runs it, on copies of the example in
// examples/library (a model deliberately out of date with its code).
#include <gtest/gtest.h>
#include <unistd.h>

#include <filesystem>
#include <string>
#include <vector>

#include "program_run.h"

namespace {

namespace fs = std::filesystem;
using testing_support::LinesOf;
using testing_support::ProgramRun;
using testing_support::ReadText;
using testing_support::WriteText;
using Lines = std::vector<std::string>;

struct Result {
  int code;
  std::string out;
  std::string err;
};

class CliTest : public ::testing::Test {
 protected:
  void SetUp() override {
    directory_ =
        fs::temp_directory_path() /
        ("kelqln-cli-" + std::to_string(::getpid()) + "-" +
         ::testing::UnitTest::GetInstance()->current_test_info()->name());
    fs::remove_all(directory_);
    fs::create_directories(directory_);
    for (const char* file : {"library.json", "lending.json"}) {
      fs::copy_file(fs::path(KELQLN_SOURCE_ROOT) / "examples/library" / file,
                    directory_ / file);
    }
    // The default registry, without the pause that lets people follow each
    // project on the progress page.
    WriteText(directory_ / "registry.reg",
              ReadText(fs::path(KELQLN_SOURCE_ROOT) / "data/registry.reg") +
                  "\n[HKEY_LOCAL_MACHINE\\SOFTWARE\\Quenta Software\\Orel\\"
                  "AddIns\\VisualStudio]\n\"ProjectPause\"=dword:00000000\n");
  }
  void TearDown() override { fs::remove_all(directory_); }

  Result Run(const std::vector<std::string>& args,
             const std::string& input = "") const {
    ProgramRun run(directory_, args, input);
    int code = run.ExitCode();
    return {code, run.Out(), run.Err()};
  }
  // `kelqln update library.json` with the test's registry and `options`.
  Result Update(std::vector<std::string> options = {},
                const std::string& input = "") const {
    options.insert(options.begin(),
                   {"update", "library.json", "--registry", "registry.reg"});
    return Run(options, input);
  }
  std::string Model() const { return ReadText(directory_ / "library.json"); }

  fs::path directory_;
};

TEST_F(CliTest, ShowPrintsTheModelAsATree) {
  Result show = Run({"show", "library.json"});
  EXPECT_EQ(show.code, 0) << show.err;
  EXPECT_EQ(LinesOf(show.out),
            (Lines{"Model Library",
                   "Component View",
                   "  component Lending (VC++, project lending.json)",
                   "    class Book",
                   "    class Member",
                   "    class Loan",
                   "    class Fine",
                   "Logical View",
                   "  package Lending",
                   "    class Book",
                   "      attribute title : std::string",
                   "      attribute isbn : std::string",
                   "      attribute pages : int = 0",
                   "      operation Describe() : std::string",
                   "      role -> Member (association reserves, not navigable)",
                   "    class Member",
                   "      attribute name : std::string",
                   "      operation Borrow(book : Book&) : Loan",
                   "      role loans -> Loan [0..*] (association borrows)",
                   "      role reservations -> Book [0..*] (association "
                   "reserves)",
                   "    class Loan",
                   "      attribute due : Date",
                   "      role borrower -> Member [1] (association borrows)",
                   "    class Fine",
                   "      attribute amount : double"}));
}

TEST_F(CliTest, NewMakesAModelReadyForUpdate) {
  fs::create_directories(directory_ / "models");
  Result made = Run({"new", "models/shop.json", "--component", "Shop",
                     "--language", "Visual Basic", "--project", "lending.json",
                     "--registry", "registry.reg"});
  ASSERT_EQ(made.code, 0) << made.err;
  EXPECT_EQ(made.out,
            "Created models/shop.json: component Shop (Visual Basic, project "
            "../lending.json).\n");
  Result show = Run({"show", "models/shop.json"});
  EXPECT_EQ(LinesOf(show.out),
            (Lines{"Model shop", "Component View",
                   "  component Shop (Visual Basic, project ../lending.json)",
                   "Logical View"}));

  std::string before = ReadText(directory_ / "models/shop.json");
  struct Refusal {
    std::vector<std::string> args;
    std::string message;
  };
  for (const Refusal& refusal : std::vector<Refusal>{
           {{"--language", "VC++"}, "models/shop.json: the file exists"},
           {{"--language", "Cobol"},
            "--language Cobol: no language add-in of that name is installed "
            "(installed: VC++, Visual Basic)"}}) {
    std::vector<std::string> args = {"new",
                                     refusal.message.starts_with("models")
                                         ? "models/shop.json"
                                         : "models/other.json",
                                     "--component",
                                     "Shop",
                                     "--project",
                                     "x.json",
                                     "--registry",
                                     "registry.reg"};
    args.insert(args.end(), refusal.args.begin(), refusal.args.end());
    Result refused = Run(args);
    EXPECT_EQ(refused.code, 2);
    EXPECT_NE(refused.err.find(refusal.message), std::string::npos)
        << refused.err;
  }
  EXPECT_EQ(ReadText(directory_ / "models/shop.json"), before);
  EXPECT_FALSE(fs::exists(directory_ / "models/other.json"));
}

// Input the program cannot use is refused with exit code 2 and a message
// naming the file and the problem, before anything runs: no file changes.
TEST_F(CliTest, UnusableInputIsRefusedAndLeavesTheFilesAlone) {
  WriteText(directory_ / "broken.json", "{\"format\": \"kelqln-model\",");
  WriteText(directory_ / "bad.reg",
            "Windows Registry Editor Version 5.00\n\n[HKEY_LOCAL_MACHINE\\A"
            "]\n\"Name\"=dword:zz\n");
  struct Case {
    std::vector<std::string> args;
    std::string message;
  };
  for (const Case& c : std::vector<Case>{
           {{"update", "broken.json", "--registry", "registry.reg"},
            "kelqln: broken.json: "},
           {{"update", "missing.json", "--registry", "registry.reg"},
            "kelqln: missing.json: "},
           {{"update", "library.json", "--registry", "bad.reg"},
            "kelqln: bad.reg:4: "},
           {{"update", "library.json", "--registry", "none.reg"},
            "kelqln: none.reg: no such registry file"},
           {{"update", "library.json", "--registry", "registry.reg", "--select",
             "Nothing"},
            "kelqln: --select Nothing: the model has no such component"},
           {{"update", "library.json", "--delete", "some"}, "--delete"},
           {{"update", "library.json", "--report", "no/dir/r.json"},
            "--report no/dir/r.json: "},
           {{"show", "broken.json"}, "kelqln: broken.json: "},
           {{"frobnicate"}, "A subcommand is required"},
       }) {
    std::string model = ReadText(directory_ / "library.json");
    std::string broken = ReadText(directory_ / "broken.json");
    Result refused = Run(c.args);
    EXPECT_EQ(refused.code, 2) << c.message;
    EXPECT_NE(refused.err.find(c.message), std::string::npos) << refused.err;
    EXPECT_EQ(refused.out, "");
    EXPECT_EQ(ReadText(directory_ / "library.json"), model);
    EXPECT_EQ(ReadText(directory_ / "broken.json"), broken);
  }
}

}  // namespace
