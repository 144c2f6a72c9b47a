// Model files: the round trip through a file, the atomic save, and the
// refusal of malformed or hostile files.
#include <gtest/gtest.h>
#include <signal.h>
#include <sys/resource.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <sstream>
#include <string>

#include "automation/call.h"
#include "external/orel.h"
#include "host/modeltool/model_reader.h"
#include "host/modeltool/model_writer.h"
#include "sample_model.h"

namespace host::modeltool {
namespace {

namespace fs = std::filesystem;
namespace orel = external::orel;
using automation::CStr;
using automation::Object;

std::string ReadText(const fs::path& path) {
  std::ifstream in(path, std::ios::binary);
  std::ostringstream text;
  text << in.rdbuf();
  return text.str();
}

void WriteText(const fs::path& path, const std::string& text) {
  std::ofstream(path, std::ios::binary) << text;
}

class ModelFileTest : public ::testing::Test {
 protected:
  void SetUp() override {
    directory_ =
        fs::temp_directory_path() /
        ("kelqln-model-" + std::to_string(::getpid()) + "-" +
         ::testing::UnitTest::GetInstance()->current_test_info()->name());
    fs::remove_all(directory_);
    fs::create_directories(directory_);
  }
  void TearDown() override { fs::remove_all(directory_); }

  fs::path directory_;
};

// A model with every kind of field set, so a round trip can lose none.
void FillEveryField(SampleModel& s) {
  s.model->SetAskForBackup(true);
  s.core->SetModifiable(false);
  s.domain->SetModifiable(false);
  s.lib->SetStereotype("DLL");
  s.lib->CreateToolProperty("VC++", "Kind", "MIDL", "String");
  s.lib->CreateToolProperty("COM", "Registered", "True", "Boolean");
  s.shape->SetAddInName("VisualStudio");
  s.circle->SetExcludedFromSelection(true);
  s.x->SetInitialValue("0");
  s.x->SetStereotype("const");
  s.draw->Parameters().front()->SetDefaultValue("nullptr");
  s.canvas_shapes->Role1()->SetNavigable(false);
  s.canvas_shapes->Role2()->SetCardinality("0..*");
  s.canvas_shapes->Role2()->SetAggregate(true);
  s.canvas->NewInheritRelation("CWindow", nullptr, "CWindow");
  s.model->Select(s.gui);
  s.model->Select(s.core);
  s.model->Select(s.circle);
  s.model->Select(s.domain);
}

TEST_F(ModelFileTest, RoundTripKeepsEveryFieldAndId) {
  SampleModel s;
  FillEveryField(s);
  fs::path file = directory_ / "sample.json";
  Object model = s.model;
  automation::Call(model, orel::model::kSaveAs, file.string());
  EXPECT_EQ(CStr(automation::Get(model, orel::model::kFilePath)),
            file.string());

  auto loaded = Model::Load(file.string());
  EXPECT_EQ(loaded->FilePath(), file.string());
  EXPECT_EQ(loaded->IntegrityProblems(), std::vector<std::string>());
  EXPECT_EQ(loaded->ElementCount(), s.model->ElementCount());
  // Writing what was read gives the same file: nothing was lost or changed.
  EXPECT_EQ(ModelWriter::ToText(*loaded), ReadText(file));

  // Spot checks through the late-bound members, by the original ids.
  auto lib = loaded->Find<Component>(s.lib->UniqueId());
  ASSERT_NE(lib, nullptr);
  EXPECT_EQ(
      automation::CStr(automation::Call(
          Object(lib), orel::element::kToolPropertyValue, "VC++", "Kind")),
      "MIDL");
  auto items = loaded->Find<Role>(s.canvas_shapes->Role2()->UniqueId());
  ASSERT_NE(items, nullptr);
  EXPECT_EQ(items->GetClass()->UniqueId(), s.shape->UniqueId());
  EXPECT_EQ(items->Cardinality(), "0..*");
  EXPECT_FALSE(items->GetAssociation()->Role1()->IsNavigable());
  auto canvas = loaded->Find<Class>(s.canvas->UniqueId());
  EXPECT_EQ(canvas->InheritRelations().front()->SupplierName(), "CWindow");
  EXPECT_EQ(canvas->InheritRelations().front()->Supplier(), nullptr);
  EXPECT_EQ(loaded->SelectedComponentPackages().front().lock()->UniqueId(),
            s.core->UniqueId());
  EXPECT_TRUE(loaded->AskForBackup());

  // Save in place writes the change to the same file.
  loaded->SetDefaultLanguage("VB");
  automation::Call(Object(loaded), orel::model::kSave);
  EXPECT_EQ(Model::Load(file.string())->DefaultLanguage(), "VB");
}

TEST_F(ModelFileTest, TheDocumentedExampleLoads) {
  std::string doc =
      ReadText(fs::path(KELQLN_SOURCE_ROOT) / "docs" / "model-format.md");
  size_t begin = doc.find("```json\n");
  ASSERT_NE(begin, std::string::npos);
  begin += 8;
  std::string example = doc.substr(begin, doc.find("```", begin) - begin);
  auto model = ModelReader::ReadText(example, "example");
  EXPECT_EQ(model->IntegrityProblems(), std::vector<std::string>());
  auto canvas = model->Find<Class>("{K-CANVAS}");
  ASSERT_NE(canvas, nullptr);
  EXPECT_EQ(canvas->Roles().front()->UniqueId(), "{R-ITEMS}");
  EXPECT_EQ(model->Find<Component>("{C-APP}")->ToolPropertyValue("VC++",
                                                                 "ProjectFile"),
            "app/app.vcxproj");
}

TEST_F(ModelFileTest, SaveWithoutAFileAndIntoAMissingDirectoryFail) {
  SampleModel s;
  Object model = s.model;
  EXPECT_EQ(ErrorOf([&] { automation::Call(model, orel::model::kSave); }),
            automation::kPathFileAccessError);
  std::string missing = (directory_ / "no" / "such" / "m.json").string();
  std::string text;
  EXPECT_EQ(
      ErrorOf([&] { automation::Call(model, orel::model::kSaveAs, missing); },
              &text),
      automation::kPathFileAccessError);
  EXPECT_NE(text.find(missing), std::string::npos) << text;
  EXPECT_EQ(s.model->FilePath(), "");
}

// A full disk, simulated with a file size limit: the write fails midway and
// the file on disk stays the one before, with no temporary left beside it.
TEST_F(ModelFileTest, AFailedWriteLeavesTheOldFileIntact) {
  SampleModel s;
  fs::path file = directory_ / "model.json";
  s.model->SaveAs(file.string());
  std::string before = ReadText(file);
  for (int i = 0; i < 200; ++i) s.domain->NewClass("Extra" + std::to_string(i));

  struct rlimit saved;
  ASSERT_EQ(getrlimit(RLIMIT_FSIZE, &saved), 0);
  auto* old_handler = signal(SIGXFSZ, SIG_IGN);
  struct rlimit small = saved;
  small.rlim_cur = before.size() + 100;
  ASSERT_EQ(setrlimit(RLIMIT_FSIZE, &small), 0);
  int error = ErrorOf([&] { s.model->Save(); });
  setrlimit(RLIMIT_FSIZE, &saved);
  signal(SIGXFSZ, old_handler);

  EXPECT_EQ(error, automation::kPathFileAccessError);
  EXPECT_EQ(ReadText(file), before);
  int entries = 0;
  for (const auto& entry : fs::directory_iterator(directory_)) {
    ++entries;
    EXPECT_EQ(entry.path().filename(), "model.json");
  }
  EXPECT_EQ(entries, 1);
  // Without the limit the same save goes through.
  s.model->Save();
  EXPECT_EQ(Model::Load(file.string())->Classes().size(), 204u);
}

const char kMinimal[] =
    R"({"format": "kelqln-model", "version": 1,
        "componentView": {"id": "CV", "components": [COMPONENTS]},
        "logicalView": {"id": "LV", "classes": [CLASSES]} EXTRA})";

std::string Minimal(std::string components, std::string classes,
                    std::string extra = "") {
  std::string text = kMinimal;
  text.replace(text.find("COMPONENTS"), 10, components);
  text.replace(text.find("CLASSES"), 7, classes);
  text.replace(text.find("EXTRA"), 5, extra);
  return text;
}

TEST_F(ModelFileTest, MalformedFilesAreRefusedWithAClearMessage) {
  const std::string big(ModelReader::kMaxTextSize + 1, 'a');
  const struct {
    std::string text;
    const char* message;
  } kRows[] = {
      {"not json", "not valid JSON"},
      {"[]", "(file): expected an object, found array"},
      {R"({"version": 1})", "\"format\" is missing"},
      {R"({"format": "other", "version": 1})", "\"format\" is not"},
      {R"({"format": "kelqln-model", "version": 2})", "\"version\" is not 1"},
      {R"({"format": "kelqln-model", "version": 1, "name": 5})",
       "(file).name: expected a text, found number"},
      {R"({"format": "kelqln-model", "version": 1, "logicalView": {"id": "L"}})",
       "\"componentView\" is missing"},
      {R"({"format": "kelqln-model", "version": 1, "componentView": 5})",
       "componentView: expected an object, found number"},
      {Minimal("", R"("K")"),
       "logicalView.classes[0]: expected an object, found string"},
      {Minimal("", R"({"id": "K", "name": "A", "colour": "red"})"),
       "logicalView.classes[0]: unknown field \"colour\""},
      {Minimal("", R"({"name": "A"})"),
       "logicalView.classes[0]: \"id\" is missing"},
      {Minimal("", R"({"id": "", "name": "A"})"), "an empty unique id"},
      {Minimal("", R"({"id": "K"}, {"id": "K"})"),
       "logicalView.classes[1].id: the unique id \"K\" is used twice"},
      {Minimal("", R"({"id": "CV"})"), "the unique id \"CV\" is used twice"},
      {Minimal("", R"({"id": "K", "attributes": {}})"),
       "logicalView.classes[0].attributes: expected an array, found object"},
      {Minimal("", R"({"id": "K", "excludedFromSelection": "yes"})"),
       "expected true or false, found string"},
      {Minimal(
           "",
           R"({"id": "K", "inheritRelations": [{"id": "I", "supplier": "Z"}]})"),
       "inheritRelations[0].supplier: no element has the unique id \"Z\""},
      {Minimal(R"({"id": "C", "classes": ["C"]})", ""),
       "\"C\" is a Module, not a Class"},
      {Minimal(R"({"id": "C", "classes": ["K"]})", R"({"id": "K"})"),
       "the class \"K\" does not list this component"},
      {Minimal(R"({"id": "C"})", R"({"id": "K", "components": ["C"]})"),
       "the component \"C\" does not list this class"},
      {Minimal(R"({"id": "C", "classes": ["K", "K"]})",
               R"({"id": "K", "components": ["C"]})"),
       "\"K\" is listed twice"},
      {Minimal(
           "", R"({"id": "K"})",
           R"(, "associations": [{"id": "AS", "roles": [{"id": "R", "class": "K"}]}])"),
       "associations[0]: an association has exactly two roles"},
      {Minimal(
           "",
           R"({"id": "K", "toolProperties": [{"tool": "T", "name": "N", "type": "String"}, {"tool": "t", "name": "n", "type": "String"}]})"),
       "the tool property t/n is given twice"},
      {Minimal("", R"({"id": "K"})", R"(, "selection": {"classes": ["CV"]})"),
       "selection.classes[0]: \"CV\" is a ComponentPackage, not a Class"},
      {Minimal("", "{\"id\": \"K\", \"name\": \"" + big + "\"}"),
       "a text longer than"},
      {std::string(300, '[') + std::string(300, ']'), "nested deeper than 200"},
  };
  for (const auto& row : kRows) {
    fs::path file = directory_ / "bad.json";
    WriteText(file, row.text);
    auto app = Application::Create();
    auto current = app->CurrentModel();
    std::string text;
    EXPECT_EQ(ErrorOf([&] { app->OpenModel(file.string()); }, &text),
              automation::kBadFileFormat)
        << row.message;
    EXPECT_EQ(text.rfind(file.string() + ": ", 0), 0u) << text;
    EXPECT_NE(text.find(row.message), std::string::npos)
        << "expected \"" << row.message << "\" in: " << text;
    // The application keeps the model it had.
    EXPECT_EQ(app->CurrentModel(), current);
  }
}

TEST_F(ModelFileTest, AMissingFileIsFileNotFound) {
  std::string path = (directory_ / "none.json").string();
  std::string text;
  EXPECT_EQ(ErrorOf([&] { Model::Load(path); }, &text),
            automation::kFileNotFound);
  EXPECT_NE(text.find(path), std::string::npos);
}

TEST_F(ModelFileTest, OpenModelMakesTheLoadedModelCurrent) {
  SampleModel s;
  fs::path file = directory_ / "open.json";
  s.model->SaveAs(file.string());
  auto app = Application::Create();
  Object opened = automation::CObj(
      automation::CallByName(Object(app), "OpenModel", file.string()));
  EXPECT_EQ(
      automation::GetObject(Object(app), orel::application::kCurrentModel),
      opened);
  EXPECT_EQ(app->CurrentModel()->GetApplication(), app);
  EXPECT_EQ(app->CurrentModel()->Classes().size(), 4u);
}

}  // namespace
}  // namespace host::modeltool
