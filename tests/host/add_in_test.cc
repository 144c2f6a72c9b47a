// The add-ins the registry describes, their server objects and the settings
// store of the "VisualStudio" add-in.
#include <gtest/gtest.h>
#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

#include "automation/call.h"
#include "automation/class_registry.h"
#include "automation/collection.h"
#include "external/orel.h"
#include "host/modeltool/add_in_manager.h"
#include "host/modeltool/add_in_registry.h"
#include "platform/registry.h"
#include "platform/registry_store.h"
#include "sample_model.h"

namespace host::modeltool {
namespace {

namespace fs = std::filesystem;
namespace orel = external::orel;
using automation::CBool;
using automation::CStr;
using automation::Object;

class AddInTest : public ::testing::Test {
 protected:
  void SetUp() override {
    directory_ =
        fs::temp_directory_path() /
        ("kelqln-addin-" + std::to_string(::getpid()) + "-" +
         ::testing::UnitTest::GetInstance()->current_test_info()->name());
    fs::remove_all(directory_);
    fs::create_directories(directory_);
  }
  void TearDown() override {
    platform::UseRegistryStore(platform::RegistryStore());
    fs::remove_all(directory_);
  }

  std::string SettingsPath() const {
    return (directory_ / "settings" / "settings.json").string();
  }

  fs::path directory_;
};

const std::string kKey = kAddInsKey;

std::shared_ptr<AddIn> NewAddIn(std::string name, std::string prog_id = "") {
  AddInDescription description;
  description.name = std::move(name);
  description.server_prog_id = std::move(prog_id);
  return std::make_shared<AddIn>(std::move(description));
}

TEST_F(AddInTest, TheRegistryDescribesTheAddIns) {
  platform::RegistryStore store;
  auto hklm = platform::kHkeyLocalMachine;
  store.SetString(hklm, kKey, "1", "VisualStudio");
  store.SetString(hklm, kKey, "2", "C++");
  store.SetString(hklm, kKey, "3", "Dormant");
  store.SetString(hklm, kKey, "5", "Unlisted");  // after the gap: not read
  store.SetDword(hklm, kKey + "\\C++", "LanguageAddIn", 1);
  store.SetString(hklm, kKey + "\\C++", "ServerProgId", "kelqln.TestServer");
  store.SetString(hklm, kKey + "\\C++", "RteText", "C++ round trip");
  store.SetString(hklm, kKey + "\\C++", "HelpText", "cpp.html");
  store.SetDword(hklm, kKey + "\\Dormant", "Active", 0);
  store.SetString(hklm, kKey + "\\Dormant", "LanguageAddIn",
                  "1");  // wrong type
  platform::UseRegistryStore(store);

  auto app = Application::Create();
  LoadAddInsFromRegistry(*app->AddIns(), SettingsPath());
  Object add_ins = automation::GetObject(
      automation::GetObject(Object(app), orel::application::kAddInManager),
      orel::add_in_manager::kAddIns);
  ASSERT_EQ(
      automation::CLng(automation::Get(add_ins, orel::collection::kCount)), 3);
  const struct {
    const char* name;
    bool active;
    bool language;
    const char* rte_text;
    const char* help_text;
  } kRows[] = {
      {"VisualStudio", true, false, "", ""},
      {"C++", true, true, "C++ round trip", "cpp.html"},
      {"Dormant", false, false, "", ""},
  };
  for (int i = 0; i < 3; ++i) {
    const auto& row = kRows[i];
    Object add_in =
        automation::GetObject(add_ins, orel::collection::kGetAt, i + 1);
    namespace a = orel::add_in;
    EXPECT_EQ(CStr(automation::Get(add_in, a::kName)), row.name);
    EXPECT_EQ(CStr(automation::Get(add_in, a::kRegistryKey)),
              kKey + "\\" + row.name);
    EXPECT_EQ(CBool(automation::Get(add_in, a::kIsActive)), row.active);
    EXPECT_EQ(CBool(automation::Get(add_in, a::kIsLanguageAddIn)),
              row.language);
    EXPECT_EQ(CStr(automation::Get(add_in, a::kRteText)), row.rte_text);
    EXPECT_EQ(CStr(automation::Get(add_in, a::kHelpText)), row.help_text);
  }
  EXPECT_EQ(CStr(automation::GetByName(app->AddIns()->Find("VisualStudio"),
                                       orel::add_in::kRootRegistryPath)),
            kKey + "\\VisualStudio");
}

TEST_F(AddInTest, TheServerIsMadeOnceByItsProgId) {
  int made = 0;
  automation::RegisterClass("kelqln.TestServer", "", [&made] {
    ++made;
    return automation::Object(automation::Collection::Create());
  });
  auto add_in = NewAddIn("C++", "kelqln.TestServer");
  Object first = automation::GetObject(add_in, orel::add_in::kServer);
  EXPECT_NE(first, nullptr);
  EXPECT_EQ(automation::GetObject(add_in, orel::add_in::kServer), first);
  EXPECT_EQ(made, 1);
  automation::UnregisterClass("kelqln.TestServer");

  auto unknown = NewAddIn("X", "kelqln.NoSuchServer");
  EXPECT_EQ(ErrorOf([&] { automation::Get(unknown, orel::add_in::kServer); }),
            automation::kCannotCreateObject);
  auto none = NewAddIn("Y");
  EXPECT_EQ(ErrorOf([&] { automation::Get(none, orel::add_in::kServer); }),
            automation::kCannotCreateObject);
}

// A server that records the add-ins it is connected to.
class ConnectingServer : public automation::DispatchImpl<ConnectingServer> {
 public:
  static const automation::MemberTable<ConnectingServer>& Members() {
    static const automation::MemberTable<ConnectingServer> table(
        "ConnectingServer",
        {{automation::kNamedOnly, "OnConnection", automation::CallKind::kMethod,
          [](ConnectingServer& self, automation::Args& args) {
            Object add_in = automation::CObj(automation::RequiredArg(args, 0));
            if (fail_next) {
              fail_next = false;
              throw automation::Error(automation::kInvalidProcedureCall);
            }
            self.connected.push_back(
                CStr(automation::Get(add_in, orel::add_in::kName)));
            return automation::Variant();
          }}});
    return table;
  }
  static inline bool fail_next = false;
  std::vector<std::string> connected;
};

TEST_F(AddInTest, AServerLearnsItsAddInFromOnConnection) {
  automation::RegisterClass("kelqln.ConnectingServer", "", [] {
    return automation::Object(std::make_shared<ConnectingServer>());
  });
  AddInManager manager;
  manager.Add(NewAddIn("VC++", "kelqln.ConnectingServer"));
  manager.Add(NewAddIn("Visual Basic", "kelqln.ConnectingServer"));
  for (const char* name : {"VC++", "Visual Basic"}) {
    auto add_in = manager.Find(name);
    Object server = automation::GetObject(add_in, orel::add_in::kServer);
    automation::GetObject(add_in, orel::add_in::kServer);
    auto connecting = std::dynamic_pointer_cast<ConnectingServer>(server);
    ASSERT_NE(connecting, nullptr);
    EXPECT_EQ(connecting->connected, std::vector<std::string>{name});
  }

  // A server that cannot connect is not kept: the next use tries again.
  auto add_in = NewAddIn("C#", "kelqln.ConnectingServer");
  ConnectingServer::fail_next = true;
  EXPECT_EQ(ErrorOf([&] { automation::Get(add_in, orel::add_in::kServer); }),
            automation::kInvalidProcedureCall);
  auto server = std::dynamic_pointer_cast<ConnectingServer>(
      automation::GetObject(add_in, orel::add_in::kServer));
  ASSERT_NE(server, nullptr);
  EXPECT_EQ(server->connected, std::vector<std::string>{"C#"});
  automation::UnregisterClass("kelqln.ConnectingServer");
}

TEST_F(AddInTest, SettingsAreWrittenAndReadBack) {
  auto add_in = NewAddIn("VisualStudio");
  add_in->SetSettingsStore(std::make_shared<SettingsStore>(SettingsPath()));
  Object object = add_in;
  namespace a = orel::add_in;
  EXPECT_EQ(CStr(automation::CallByName(object, a::kReadSetting, "Wizard",
                                        "Width", "9000")),
            "9000");
  automation::CallByName(object, a::kWriteSetting, "Wizard", "Width", "7000");
  automation::CallByName(object, a::kWriteSetting, "Wizard", "Left", 12.5f);
  automation::CallByName(object, a::kWriteSetting, "WIZARD", "width", "7100");
  // A new store on the same file sees what was written: it is on disk.
  SettingsStore again(SettingsPath());
  EXPECT_EQ(again.Read("wizard", "WIDTH", ""), "7100");
  EXPECT_EQ(again.Read("Wizard", "Left", ""), "12.5");
  EXPECT_EQ(again.Read("Other", "Width", "none"), "none");

  // An add-in without a store has no settings members.
  auto plain = NewAddIn("C++");
  EXPECT_EQ(ErrorOf([&] {
              automation::CallByName(plain, a::kReadSetting, "S", "K", "D");
            }),
            automation::kNoSuchMember);
}

TEST_F(AddInTest, AMalformedSettingsFileIsRefusedWithItsName) {
  fs::create_directories(fs::path(SettingsPath()).parent_path());
  const char* kFiles[] = {"{not json", "[1, 2]", R"({"Wizard": 5})",
                          R"({"Wizard": {"Width": 9000}})"};
  for (const char* text : kFiles) {
    std::ofstream(SettingsPath()) << text;
    SettingsStore store(SettingsPath());
    std::string description;
    EXPECT_EQ(ErrorOf([&] { store.Read("Wizard", "Width", ""); }, &description),
              automation::kBadFileFormat)
        << text;
    EXPECT_EQ(description.rfind(SettingsPath(), 0), 0u) << description;
    // Nor is it overwritten by a write.
    EXPECT_EQ(ErrorOf([&] { store.Write("Wizard", "Width", "1"); }),
              automation::kBadFileFormat);
  }
}

TEST_F(AddInTest, TheSettingsFileFollowsTheEnvironment) {
  setenv("KELQLN_SETTINGS", "/tmp/explicit.json", 1);
  EXPECT_EQ(SettingsStore::DefaultPath(), "/tmp/explicit.json");
  unsetenv("KELQLN_SETTINGS");
  setenv("XDG_CONFIG_HOME", "/tmp/config", 1);
  EXPECT_EQ(SettingsStore::DefaultPath(), "/tmp/config/kelqln/settings.json");
  unsetenv("XDG_CONFIG_HOME");
}

TEST_F(AddInTest, TheProjectsRegistryFileInstallsTheSettingsAddIn) {
  platform::UseRegistryFile(std::string(KELQLN_SOURCE_ROOT) +
                            "/data/registry.reg");
  auto app = Application::Create();
  LoadAddInsFromRegistry(*app->AddIns(), SettingsPath());
  auto visual_studio = app->AddIns()->Find(kSettingsAddInName);
  ASSERT_NE(visual_studio, nullptr);
  EXPECT_TRUE(visual_studio->Description().active);
  ASSERT_NE(visual_studio->Settings(), nullptr);
  automation::CallByName(visual_studio, orel::add_in::kWriteSetting, "S", "K",
                         "V");
  EXPECT_TRUE(fs::exists(SettingsPath()));
}

TEST_F(AddInTest, AddInNamesAreUnique) {
  AddInManager manager;
  manager.Add(NewAddIn("VB"));
  EXPECT_EQ(ErrorOf([&] { manager.Add(NewAddIn("VB")); }),
            automation::kDuplicateKey);
  EXPECT_NE(manager.Find("VB"), nullptr);
  EXPECT_EQ(manager.Find("vb"), nullptr);
}

}  // namespace
}  // namespace host::modeltool
