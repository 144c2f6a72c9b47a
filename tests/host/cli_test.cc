// The kelqln program run as a user runs it, on copies of the example in
// examples/library (a model deliberately out of date with its code).
#include <gtest/gtest.h>
#include <unistd.h>

#include <chrono>
#include <filesystem>
#include <nlohmann/json.hpp>
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
  void SetModel(const std::string& text) const {
    WriteText(directory_ / "library.json", text);
  }
  // Inserts `text` into the model's text after the first `after`.
  void EditModel(const std::string& after, const std::string& text) const {
    std::string model = Model();
    model.insert(model.find(after) + after.size(), text);
    SetModel(model);
  }
  // What `kelqln show` prints of the model.
  std::string Tree() const { return Run({"show", "library.json"}).out; }

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
  std::vector<std::string> args = {
      "new",        "models/shop.json", "--component", "Shop",
      "--project",  "lending.json",     "--registry",  "registry.reg",
      "--language", "Visual Basic"};
  Result made = Run(args);
  ASSERT_EQ(made.code, 0) << made.err;
  EXPECT_EQ(made.out,
            "Created models/shop.json: component Shop (Visual Basic, project "
            "../lending.json).\n");
  Result update = Run(
      {"update", "models/shop.json", "--registry", "registry.reg", "--quiet"});
  EXPECT_EQ(update.code, 0) << update.out << update.err;
  EXPECT_EQ(LinesOf(Run({"show", "models/shop.json"}).out)[2],
            "  component Shop (Visual Basic, project ../lending.json)");
  EXPECT_NE(Run({"show", "models/shop.json"}).out.find("class Catalog"),
            std::string::npos);

  const std::string made_model = ReadText(directory_ / "models/shop.json");
  Result again = Run(args);
  EXPECT_EQ(again.code, 2);
  EXPECT_EQ(again.err, "kelqln: models/shop.json: the file exists already\n");
  args[1] = "models/other.json";
  args.back() = "Cobol";
  Result unknown = Run(args);
  EXPECT_EQ(unknown.code, 2);
  EXPECT_EQ(unknown.err,
            "kelqln: --language Cobol: no language add-in of that name is "
            "installed (installed: VC++, Visual Basic)\n");
  EXPECT_EQ(ReadText(directory_ / "models/shop.json"), made_model);
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

// The log of a run of the example that deletes everything that vanished.
const Lines kUpdateLog = {
    "----------------------------------------",
    "Language VC++",
    "Updating component Lending from project Lending",
    "Reading book.h",
    "Class Catalog added to package Lending and component Lending",
    "Book.Describe: parameters changed from () to (verbose: bool)",
    "Catalog: operation Find(isbn: std::string) added",
    "Catalog: has-relationship books to Book added",
    "Reading member.h",
    "Deleting class Fine - done",
    "Deleting attribute pages - done",
    "Deleting role reservations - done",
    "Deleting association reserves - done",
    "Deleting role borrower - done",
    "The model update is finished.",
    "The summary lists the result of every component.",
    "The update finished with 0 error(s) and 0 warning(s)."};

TEST_F(CliTest, UpdatePrintsTheLogThenSummaryWarningsAndErrors) {
  // One component without code, one whose code file is missing.
  EditModel("\"components\": [",
            R"({"id": "{C-UNBOUND}", "name": "Unbound", "language": "VC++"},
               {"id": "{C-BROKEN}", "name": "Broken", "language": "VC++",
                "toolProperties": [{"tool": "VC++", "name": "ProjectFile",
                  "value": "missing.json", "type": "String"}]},)");
  const std::string warning =
      "Warning: The component Unbound has no project file: its tool property "
      "ProjectFile of the tool VC++ is not set";
  const std::string error =
      "Error: Cannot read the code of component Broken: missing.json: the "
      "file does not exist";
  Lines expected = {warning, kUpdateLog[0], kUpdateLog[1],
                    "Updating component Broken from project missing", error};
  expected.insert(expected.end(), kUpdateLog.begin() + 2, kUpdateLog.end());
  expected.insert(
      expected.end(),
      {"", "Components updated:", "Broken", "Lending", "Lending: updated",
       kUpdateLog.back(), warning, error, "Saved library.json."});

  Result run = Update();
  EXPECT_EQ(run.code, 1);
  EXPECT_EQ(LinesOf(run.out), expected);
  EXPECT_EQ(run.err, "");
  // What the run did reached the file, errors or not.
  std::string tree = Tree();
  EXPECT_EQ(tree.find("class Fine"), std::string::npos);
  EXPECT_NE(tree.find("class Catalog"), std::string::npos);

  Result quiet = Update({"--quiet"});
  EXPECT_EQ(quiet.code, 1);
  EXPECT_EQ(LinesOf(quiet.out), (Lines{warning, error}));
}

TEST_F(CliTest, DeletionPolicies) {
  struct Case {
    std::vector<std::string> options;
    std::string answers;
    Lines deleted;  // by the report
    int questions;
    bool borrower_navigable;
  };
  const std::string original = Model();
  for (const Case& c : std::vector<Case>{
           {{}, "", {"Fine", "pages", "reservations"}, 0, false},
           {{"--delete", "all"},
            "",
            {"Fine", "pages", "reservations"},
            0,
            false},
           {{"--delete", "none"}, "", {}, 0, true},
           // Fine, pages, reservations and borrower are asked in turn; an
           // answer that is none of the four asks again.
           {{"--delete", "ask"},
            "y\nmaybe\nn\nyes\nNO\n",
            {"Fine", "reservations"},
            5,
            true},
           {{"--delete", "ask"}, "n\na\n", {"pages", "reservations"}, 2, false},
           {{"--delete", "ask"}, "Y\nN\n", {"Fine"}, 2, true},
           {{"--delete", "ask"}, "", {}, 1, true},
       }) {
    SetModel(original);
    std::vector<std::string> options = c.options;
    options.insert(options.end(), {"--report", "report.json"});
    Result run = Update(options, c.answers);
    std::string label = ::testing::PrintToString(c.options) + c.answers;
    EXPECT_EQ(run.code, 0) << label << run.err;
    nlohmann::json report =
        nlohmann::json::parse(ReadText(directory_ / "report.json"));
    Lines deleted;
    for (const auto& element : report["deleted"]) {
      deleted.push_back(element["name"]);
    }
    EXPECT_EQ(deleted, c.deleted) << label;
    int questions = 0;
    for (size_t at = 0; (at = run.err.find("? [y]es", at)) != std::string::npos;
         ++at) {
      ++questions;
    }
    EXPECT_EQ(questions, c.questions) << label << run.err;
    // The saved file holds what the report says.
    std::string tree = Tree();
    for (const std::string& name : {"Fine", "pages", "reservations"}) {
      bool gone =
          std::find(deleted.begin(), deleted.end(), name) != deleted.end();
      EXPECT_EQ(tree.find(" " + name) == std::string::npos, gone)
          << label << name;
    }
    EXPECT_EQ(
        tree.find("(association borrows, not navigable)") == std::string::npos,
        c.borrower_navigable)
        << label;
  }
  SetModel(original);
  Result asked = Update({"--delete", "ask"}, "y\nN\n");
  EXPECT_EQ(asked.err,
            "Delete Class \"Fine\" of Lending? [y]es, [n]o, [a]ll, [N]one: "
            "Delete Attribute \"pages\" of Book? [y]es, [n]o, [a]ll, [N]one: ");
}

TEST_F(CliTest, DryRunAndCheckNeverWrite) {
  // The run asks the add-in about a backup, and the add-in wants the model
  // saved first: still nothing may be written.
  EditModel("\"version\": 1,", "\"askForBackup\": true,");
  WriteText(directory_ / "registry.reg",
            ReadText(directory_ / "registry.reg") +
                "\n[HKEY_LOCAL_MACHINE\\SOFTWARE\\Quenta Software\\Orel\\"
                "AddIns\\VC++]\n\"ShouldBackupModel\"=dword:00000001\n");
  const std::string original = Model();
  Result dry = Update({"--dry-run"});
  EXPECT_EQ(dry.code, 0) << dry.err;
  EXPECT_EQ(LinesOf(dry.out).back(), "Dry run: library.json was not saved.");
  EXPECT_EQ(Model(), original);

  Result before = Update({"--check"});
  EXPECT_EQ(before.code, 3) << before.err;
  EXPECT_EQ(LinesOf(before.out).back(),
            "library.json is out of date with its code.");
  EXPECT_EQ(Model(), original);
  EXPECT_EQ(Update({"--check", "--delete", "none", "--quiet"}).code, 3);

  ASSERT_EQ(Update().code, 0);
  const std::string updated = Model();
  EXPECT_NE(updated, original);
  Result after = Update({"--check"});
  EXPECT_EQ(after.code, 0) << after.err;
  EXPECT_EQ(LinesOf(after.out).back(),
            "library.json is in sync with its code.");
  Result again = Update();
  EXPECT_EQ(LinesOf(again.out).back(),
            "No changes: library.json was left as it was.");
  EXPECT_EQ(Model(), updated);
}

TEST_F(CliTest, ReportHoldsTheFourCollectionsAndTheDeletedElements) {
  ASSERT_EQ(Update({"--quiet", "--report", "report.json"}).code, 0);
  nlohmann::json expected = nlohmann::json::parse(R"({
    "errors": [], "warnings": [],
    "summaries": ["Components updated:", "Lending", "Lending: updated",
                  "The update finished with 0 error(s) and 0 warning(s)."],
    "deleted": [
      {"kind": "Class", "owner": "Lending", "name": "Fine", "id": "{K-FINE}"},
      {"kind": "Attribute", "owner": "Book", "name": "pages",
       "id": "{A-PAGES}"},
      {"kind": "Role", "owner": "Member", "name": "reservations",
       "id": "{R-RESERVATIONS}"}]})");
  expected["logs"] = kUpdateLog;
  EXPECT_EQ(nlohmann::json::parse(ReadText(directory_ / "report.json")),
            expected);
}

// The system hands back no reporter when a run breaks off: here the
// component's language has no active add-in.
TEST_F(CliTest, FailedRunIsReportedAndNeverSaved) {
  WriteText(directory_ / "registry.reg",
            ReadText(directory_ / "registry.reg") +
                "\n[HKEY_LOCAL_MACHINE\\SOFTWARE\\Quenta Software\\Orel\\"
                "AddIns\\VC++]\n\"Active\"=dword:00000000\n");
  const std::string original = Model();
  Result run = Update({"--report", "report.json"});
  EXPECT_EQ(run.code, 1);
  EXPECT_EQ(run.out, "");
  EXPECT_EQ(run.err,
            "kelqln: the update failed: Invalid procedure call or argument "
            "(error 5); library.json was left as it was\n");
  EXPECT_EQ(
      nlohmann::json::parse(ReadText(directory_ / "report.json"))["errors"],
      nlohmann::json::array(
          {"The update failed: Invalid procedure call or argument (error 5)"}));
  EXPECT_EQ(Model(), original);
}

// A run killed while it updates leaves the model file as it was: nothing is
// written before the run has finished, and the save replaces the file whole.
TEST_F(CliTest, KilledRunLeavesTheModelIntact) {
  nlohmann::json attributes = nlohmann::json::parse(
      R"([{"name": "a", "type": "int"}, {"name": "b"}, {"name": "c"}])");
  nlohmann::json code = nlohmann::json::parse(
      R"({"format": "kelqln-code-description", "version": 1,
          "components": [{"name": "big.h", "classes": []}]})");
  for (int i = 0; i < 3000; ++i) {
    code["components"][0]["classes"].push_back(
        {{"name", "C" + std::to_string(i)}, {"attributes", attributes}});
  }
  WriteText(directory_ / "lending.json", code.dump());
  const std::string original = Model();
  ProgramRun run(directory_,
                 {"update", "library.json", "--registry", "registry.reg"});
  ASSERT_TRUE(run.AwaitFirstLine(std::chrono::seconds(60)));
  run.Kill();
  if (run.ExitCode() == -1) {
    EXPECT_EQ(Model(), original);
  } else {
    // The run was quicker than the kill: then the file is a whole model.
    EXPECT_EQ(Run({"show", "library.json"}).code, 0);
  }
}

}  // namespace
