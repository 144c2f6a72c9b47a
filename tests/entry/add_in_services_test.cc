// The add-in services against the modelling tool, with its add-ins described
// in a registry file that each test writes.
#include "entry/add_in_services.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <memory>
#include <string>
#include <vector>

#include "automation/class_registry.h"
#include "automation/error.h"
#include "automation/member_table.h"
#include "host/modeltool/add_in_manager.h"
#include "host/modeltool/add_in_registry.h"
#include "host/modeltool/application.h"
#include "platform/registry.h"
#include "platform/registry_store.h"
#include "tests/support/error_of.h"

namespace kelqln {
namespace {

namespace fs = std::filesystem;
using automation::Object;
using host::modeltool::Application;

constexpr char kServerProgId[] = "kelqlntest.AddInServer";

class AddInServer : public automation::DispatchImpl<AddInServer> {
 public:
  static const automation::MemberTable<AddInServer>& Members() {
    static const automation::MemberTable<AddInServer> table("AddInServer", {});
    return table;
  }
};

// The registry text of add-in `name`: its key with `values` (lines of a .reg
// file such as "\"IsRTEAddIn\"=\"Yes\"").
std::string AddInKey(const std::string& name,
                     const std::vector<std::string>& values) {
  std::string text =
      "[HKEY_LOCAL_MACHINE\\SOFTWARE\\Quenta Software\\Orel\\"
      "AddIns\\" +
      name + "]\n";
  for (const std::string& value : values) text += value + "\n";
  return text + "\n";
}

// A language add-in that passes every round-trip test, plus `more` values.
std::vector<std::string> RoundTrip(std::vector<std::string> more = {}) {
  std::vector<std::string> values = {
      "\"LanguageAddIn\"=dword:00000001",
      std::string("\"ServerProgId\"=\"") + kServerProgId + "\"",
      "\"RteText\"=\"round trip\"", "\"IsRTEAddIn\"=\"Yes\""};
  values.insert(values.end(), more.begin(), more.end());
  return values;
}

class AddInServicesTest : public ::testing::Test {
 protected:
  void SetUp() override {
    dir_ =
        fs::path(::testing::TempDir()) /
        ("kelqln_add_in_services_" +
         std::string(
             ::testing::UnitTest::GetInstance()->current_test_info()->name()));
    fs::remove_all(dir_);
    fs::create_directories(dir_);
    automation::RegisterClass(kServerProgId, "", [] {
      return Object(std::make_shared<AddInServer>());
    });
  }

  void TearDown() override {
    automation::UnregisterClass(kServerProgId);
    platform::UseRegistryStore(platform::RegistryStore());
    fs::remove_all(dir_);
  }

  // Writes the registry file: the tool's list of `names` and the add-in keys
  // in `keys`, then starts a modelling tool that reads its add-ins from it.
  void Install(const std::vector<std::string>& names, const std::string& keys) {
    std::string text =
        "Windows Registry Editor Version 5.00\n\n"
        "[HKEY_LOCAL_MACHINE\\SOFTWARE\\Quenta Software\\Orel\\AddIns]\n";
    for (size_t i = 0; i < names.size(); ++i) {
      text += "\"" + std::to_string(i + 1) + "\"=\"" + names[i] + "\"\n";
    }
    text += "\n" + keys;
    const std::string path = (dir_ / "registry.reg").string();
    std::ofstream(path) << text;
    platform::UseRegistryFile(path);
    tool_ = Application::Create();
    host::modeltool::LoadAddInsFromRegistry(*tool_->AddIns(),
                                            (dir_ / "settings.json").string());
    app_ = tool_;
  }

  Object AddIn(const std::string& name) const {
    return tool_->AddIns()->Find(name);
  }
  Object ServerOf(const std::string& name) const {
    return tool_->AddIns()->Find(name)->Server();
  }

  fs::path dir_;
  std::shared_ptr<Application> tool_;
  Object app_;
};

TEST_F(AddInServicesTest, AddInsAreFoundByTheirExactName) {
  Install({"VisualStudio", "C++", "Java"}, AddInKey("C++", RoundTrip()));
  EXPECT_EQ(FindAddIn(app_, "C++"), AddIn("C++"));
  EXPECT_EQ(FindAddIn(app_, "Java"), AddIn("Java"));
  EXPECT_EQ(FindAddIn(app_, "c++"), nullptr);
  EXPECT_EQ(FindAddIn(app_, "Java "), nullptr);
  EXPECT_EQ(FindAddIn(app_, ""), nullptr);
  EXPECT_EQ(GetVSAddIn(app_), AddIn("VisualStudio"));
  EXPECT_EQ(FindAddIn(nullptr, "C++"), nullptr);
}

TEST_F(AddInServicesTest, OnlyEnableTextNoKeepsAnAddInOut) {
  struct Case {
    std::string value;  // the line of "EnableQLN", "" for none
    bool enabled;
  };
  const Case cases[] = {
      {"", true},
      {"\"EnableQLN\"=\"Yes\"", true},
      {"\"EnableQLN\"=\"no\"", true},
      {"\"EnableQLN\"=\"NO\"", true},
      {"\"EnableQLN\"=\"No \"", true},
      {"\"EnableQLN\"=\"\"", true},
      {"\"EnableQLN\"=dword:00000000", true},
      {"\"EnableQLN\"=\"No\"", false},
      {"\"enableqln\"=\"No\"", false},  // value names ignore case
  };
  for (const Case& c : cases) {
    std::vector<std::string> more;
    if (!c.value.empty()) more.push_back(c.value);
    Install({"C++"}, AddInKey("C++", RoundTrip(more)));
    EXPECT_EQ(IsAddInEnabled(AddIn("C++"), "QLN"), c.enabled) << c.value;
    // Another tool's tag reads another value.
    EXPECT_TRUE(IsAddInEnabled(AddIn("C++"), "DOC")) << c.value;
    EXPECT_EQ(GetAddInServer(app_, "C++", "QLN"),
              c.enabled ? ServerOf("C++") : nullptr)
        << c.value;
    EXPECT_EQ(GetAddInServer(app_, "C++", ""), ServerOf("C++")) << c.value;
    EXPECT_EQ(IsRTEAddIn(app_, "C++", "QLN"), c.enabled) << c.value;
    EXPECT_TRUE(IsRTEAddIn(app_, "C++", "")) << c.value;
  }
}

TEST_F(AddInServicesTest, ServerOfAMissingAddInRaisesOnlyWithATag) {
  Install({"NoServer", "Unregistered"},
          AddInKey("Unregistered", {"\"ServerProgId\"=\"kelqlntest.None\""}));
  EXPECT_EQ(GetAddInServer(app_, "Missing", ""), nullptr);
  EXPECT_EQ(
      testing_support::ErrorOf([&] { GetAddInServer(app_, "Missing", "QLN"); }),
      automation::kObjectNotSet);
  // Servers that cannot be made are no server.
  EXPECT_EQ(GetAddInServer(app_, "NoServer", "QLN"), nullptr);
  EXPECT_EQ(GetAddInServer(app_, "Unregistered", ""), nullptr);
}

TEST_F(AddInServicesTest, RoundTripAddInNeedsEverySign) {
  struct Case {
    const char* name;
    std::vector<std::string> values;
    bool rte;
  };
  const Case cases[] = {
      {"all signs", RoundTrip(), true},
      {"no round-trip text",
       {"\"LanguageAddIn\"=dword:00000001", "\"IsRTEAddIn\"=\"Yes\""},
       false},
      {"no language add-in",
       {"\"RteText\"=\"round trip\"", "\"IsRTEAddIn\"=\"Yes\""},
       false},
      {"IsRTEAddIn missing",
       {"\"LanguageAddIn\"=dword:00000001", "\"RteText\"=\"round trip\""},
       false},
      {"IsRTEAddIn yes",
       {"\"LanguageAddIn\"=dword:00000001", "\"RteText\"=\"round trip\"",
        "\"IsRTEAddIn\"=\"yes\""},
       false},
      {"inactive", RoundTrip({"\"Active\"=dword:00000000"}), false},
  };
  for (const Case& c : cases) {
    Install({"Lang"}, AddInKey("Lang", c.values));
    EXPECT_EQ(IsRTEAddIn(app_, "Lang", ""), c.rte) << c.name;
    EXPECT_EQ(IsRTEAddIn(app_, "Lang", "QLN"), c.rte) << c.name;
  }
  EXPECT_FALSE(IsRTEAddIn(app_, "Missing", ""));
  EXPECT_FALSE(IsRTEAddIn(nullptr, "Lang", ""));
}

TEST_F(AddInServicesTest, FurtherAddInsAreReadUpToTheFirstGap) {
  const std::string list_key =
      "[HKEY_LOCAL_MACHINE\\SOFTWARE\\Quenta Software\\Orel\\AddIns\\C++\\"
      "AddIns]\n";
  Install({"C++", "Helper", "Other", "Off", "Late", "NoServer"},
          AddInKey("C++", RoundTrip()) + AddInKey("Helper", RoundTrip()) +
              AddInKey("Other", RoundTrip()) +
              AddInKey("Off", RoundTrip({"\"EnableQLN\"=\"No\""})) +
              AddInKey("Late", RoundTrip()) + list_key +
              "\"1\"=\"Helper\"\n"
              "\"2\"=\"Ghost\"\n"     // no such add-in
              "\"3\"=\"helper\"\n"    // the same key again
              "\"4\"=\"NoServer\"\n"  // no server to tell
              "\"5\"=\"Off\"\n"       // not for this tool
              "\"6\"=\"Other\"\n"
              "\"8\"=\"Late\"\n\n");  // after the gap
  struct Case {
    std::string tag;
    std::vector<std::string> names;
  };
  const Case cases[] = {{"", {"Helper", "Off", "Other"}},
                        {"QLN", {"Helper", "Other"}}};
  for (const Case& c : cases) {
    auto servers = GetAddInServers(app_, "C++", c.tag);
    ASSERT_EQ(servers->Items().Count(), static_cast<int32_t>(c.names.size()))
        << c.tag;
    for (size_t i = 0; i < c.names.size(); ++i) {
      const int32_t position = static_cast<int32_t>(i + 1);
      EXPECT_EQ(servers->Items().KeyAt(position), c.names[i]) << c.tag;
      EXPECT_EQ(automation::CObj(servers->Items().Item(position)),
                ServerOf(c.names[i]))
          << c.tag;
    }
  }
  EXPECT_EQ(GetAddInServers(app_, "Helper", "")->Items().Count(), 0);
  EXPECT_EQ(GetAddInServers(app_, "Missing", "")->Items().Count(), 0);
}

TEST_F(AddInServicesTest, ExcludedStereotypesAreTrimmedAndKeptOnce) {
  struct Case {
    std::string value;  // "" for no value
    std::vector<std::string> names;
  };
  const Case cases[] = {
      {"", {}},
      {"\"ExcludeClassStereotypes\"=\"   \"", {}},
      {"\"ExcludeClassStereotypes\"=\"Interface\"", {"Interface"}},
      {"\"ExcludeClassStereotypes\"=\" Interface ; Utility \"",
       {"Interface", "Utility"}},
      {"\"ExcludeClassStereotypes\"=\"A;;B;\"", {"A", "B"}},
      {"\"ExcludeClassStereotypes\"=\";A; ;\"", {"A"}},
      {"\"ExcludeClassStereotypes\"=\"Utility;utility; UTILITY;Form\"",
       {"Utility", "Form"}},
      {"\"ExcludeClassStereotypes\"=\"Two Words;x\"", {"Two Words", "x"}},
  };
  for (const Case& c : cases) {
    std::vector<std::string> values;
    if (!c.value.empty()) values.push_back(c.value);
    Install({"VisualStudio"}, AddInKey("VisualStudio", values));
    auto stereotypes = GetExcludedClassStereotypes(app_);
    ASSERT_EQ(stereotypes->Items().Count(),
              static_cast<int32_t>(c.names.size()))
        << c.value;
    for (size_t i = 0; i < c.names.size(); ++i) {
      const int32_t position = static_cast<int32_t>(i + 1);
      EXPECT_EQ(stereotypes->Items().KeyAt(position), c.names[i]) << c.value;
      EXPECT_EQ(automation::CStr(stereotypes->Items().Item(position)),
                c.names[i])
          << c.value;
    }
  }
  // Without the settings add-in nothing is excluded.
  Install({"C++"},
          AddInKey("VisualStudio", {"\"ExcludeClassStereotypes\"=\"A\""}));
  EXPECT_EQ(GetExcludedClassStereotypes(app_)->Items().Count(), 0);
}

}  // namespace
}  // namespace kelqln
