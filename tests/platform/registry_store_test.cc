#include "platform/registry_store.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "automation/error.h"

namespace platform {
namespace {

using namespace std::string_literals;

constexpr char kHead[] = "Windows Registry Editor Version 5.00\n";

std::vector<uint8_t> Bytes(const std::string& text) {
  return std::vector<uint8_t>(text.begin(), text.end());
}

TEST(RegistryStoreTest, ParsesEachKindOfValue) {
  struct Case {
    std::string lines;  // below "[HKLM\A]"
    std::string key;
    std::string name;
    uint32_t type;
    std::string data;
  };
  const std::vector<Case> cases = {
      {R"("Path"="C:\\Tools\\\"Q\"\\")", "A", "Path", kRegSz,
       "C:\\Tools\\\"Q\"\\\0"s},
      {R"("E"="")", "A", "E", kRegSz, "\0"s},
      {R"(@="d")", "A", "", kRegSz, "d\0"s},
      {R"("@"="n")", "A", "@", kRegSz, "n\0"s},
      {R"("N"=dword:0000000a)", "A", "N", kRegDword, "\x0a\0\0\0"s},
      {R"("N"=dword:1234ABCD)", "A", "N", kRegDword, "\xcd\xab\x34\x12"s},
      {R"("B"=hex:01,02,ff)", "A", "B", kRegBinary, "\x01\x02\xff"s},
      {"\"B\"=hex:01,02,\\\n  03,\\\n  04\n", "A", "B", kRegBinary,
       "\x01\x02\x03\x04"s},
      {R"("B"=hex:)", "A", "B", kRegBinary, ""},
      {R"("X"=hex(2):41,00,00,00)", "A", "X", kRegExpandSz, "A\0\0\0"s},
      {"[hklm\\Software\\Vendor]\n\"Debug\"=\"1\"", "SOFTWARE\\VENDOR", "debug",
       kRegSz, "1\0"s},
      {"\"S\"=\"1\"\n[HKLM\\B]\n[HKEY_LOCAL_MACHINE\\a]\n\"s\"=\"2\"", "A", "S",
       kRegSz, "2\0"s},
  };
  for (const Case& test : cases) {
    SCOPED_TRACE(test.lines);
    RegistryStore store =
        RegistryStore::Parse(kHead + "[HKLM\\A]\n"s + test.lines, "t.reg");
    const RegistryStore::Value* value =
        store.FindValue(kHkeyLocalMachine, test.key, test.name);
    ASSERT_NE(value, nullptr);
    EXPECT_EQ(value->type, test.type);
    EXPECT_EQ(value->data, Bytes(test.data));
  }
}

TEST(RegistryStoreTest, ReadsWindowsFileConventions) {
  RegistryStore store = RegistryStore::Parse(
      "\xEF\xBB\xBFREGEDIT4\r\n\r\n; note\r\n[HKCU]\r\n  ; more\r\n"
      "\"S\"=\"v\"\r\n[HKEY_CURRENT_USER\\Gone\\Child]\r\n[HKCU\\Kept]\r\n"
      "\"a\"=\"b\"\r\n\"c\"=\"d\"\r\n[-HKCU\\GONE]\r\n[HKCU\\Kept]\r\n"
      "\"A\"=-\r\n",
      "t.reg");
  const RegistryStore::Value* value =
      store.FindValue(kHkeyCurrentUser, "", "S");
  ASSERT_NE(value, nullptr);
  EXPECT_EQ(value->data, Bytes("v\0"s));
  EXPECT_FALSE(store.HasKey(kHkeyCurrentUser, "Gone"));
  EXPECT_EQ(store.FindValue(kHkeyCurrentUser, "Kept", "a"), nullptr);
  EXPECT_NE(store.FindValue(kHkeyCurrentUser, "Kept", "c"), nullptr);
  EXPECT_FALSE(store.HasKey(kHkeyLocalMachine, "Kept"));
}

TEST(RegistryStoreTest, MalformedFilesNameTheLine) {
  struct Case {
    std::string text;
    int line;
    std::string problem;
  };
  const std::string head = kHead + "[HKLM\\A]\n"s;
  const std::vector<Case> cases = {
      {"REGEDIT5\n", 1, "expected \"Windows Registry"},
      {"\n\n[HKLM\\A]\n", 3, "expected \"Windows Registry"},
      {head + "[HKLM\\A\n", 3, "closing ']'"},
      {head + "[HKEY_CLASSES_ROOT\\A]\n", 3, "unknown root"},
      {head + "[HKLM\\A\\\\B]\n", 3, "empty key name"},
      {kHead + "\"a\"=\"b\"\n"s, 2, "outside a key"},
      {head + "[-HKLM\\A]\n\"a\"=\"b\"\n", 4, "outside a key"},
      {head + "\"a\"=\"b\\n\"\n", 3, "bad escape"},
      {head + "\"a\"=\"b\n", 3, "without a closing quote"},
      {head + "\"a\"=\"b\" x\n", 3, "unexpected text"},
      {head + "a=\"b\"\n", 3, "quoted value name"},
      {head + "\"a\" \"b\"\n", 3, "expected '='"},
      {head + "\"a\"=text\n", 3, "unknown kind"},
      {head + "\"a\"=dword:100000000\n", 3, "out of range"},
      {head + "\"a\"=dword:-1\n", 3, "bad dword"},
      {head + "\"a\"=hex:01,zz\n", 3, "bad hex byte \"zz\""},
      {head + "\"a\"=hex:01,\n", 3, "missing byte"},
      {head + "\"a\"=hex(zz):00\n", 3, "bad value type"},
      {head + "\"a\"=hex:01,\\\n  02,\\\n  1x\n", 5, "bad hex"},
      {head + "\"a\"=hex:01,\\\n", 3, "past the end"},
      {head + "\"a\"=hex:01,\\\n\n\"b\"=\"\"\n", 4, "blank line"},
  };
  for (const Case& test : cases) {
    SCOPED_TRACE(test.text);
    try {
      RegistryStore::Parse(test.text, "dir/bad.reg");
      ADD_FAILURE() << "no error";
    } catch (const automation::Error& error) {
      EXPECT_EQ(error.Number(), automation::kBadFileFormat);
      const std::string where = "dir/bad.reg:" + std::to_string(test.line);
      EXPECT_EQ(error.Description().rfind(where + ": ", 0), 0u)
          << error.Description();
      EXPECT_NE(error.Description().find(test.problem), std::string::npos)
          << error.Description();
    }
  }
}

TEST(RegistryStoreTest, TextReadsBackAsTheSameStore) {
  std::string long_binary(60, '\0');
  for (size_t i = 0; i < long_binary.size(); ++i) long_binary[i] = char(i);
  const std::vector<RegistryStore::Value> values = {
      {"Path \"q\"", kRegSz, Bytes("C:\\a \"b\" \\\\c\\\0"s)},
      {"", kRegSz, Bytes("default\0"s)},
      {"Empty", kRegSz, Bytes("\0"s)},
      {"Line break", kRegSz, Bytes("line\r\nbreak\0"s)},
      {"Inner zero", kRegSz, Bytes("a\0b\0"s)},
      {"Mask", kRegDword, Bytes("\x10\0\0\x41"s)},
      {"Short dword", kRegDword, Bytes("\x01\x02"s)},
      {"Long", kRegBinary, Bytes(long_binary)},
      {"Qword", kRegQword, Bytes("\1\2\3\4\5\6\7\x08"s)},
  };
  RegistryStore store;
  for (const RegistryStore::Value& value : values) {
    store.Set(kHkeyLocalMachine, "SOFTWARE\\V", value.name, value.type,
              value.data);
  }
  store.SetDword(kHkeyCurrentUser, "", "Root", 7);
  store.AddKey(kHkeyCurrentUser, "Only\\A key");

  const std::string text = store.ToText();
  RegistryStore read = RegistryStore::Parse(text, "round.reg");
  for (const RegistryStore::Value& value : values) {
    SCOPED_TRACE(value.name);
    const RegistryStore::Value* back =
        read.FindValue(kHkeyLocalMachine, "software\\v", value.name);
    ASSERT_NE(back, nullptr);
    EXPECT_EQ(back->name, value.name);
    EXPECT_EQ(back->type, value.type);
    EXPECT_EQ(back->data, value.data);
  }
  EXPECT_NE(read.FindValue(kHkeyCurrentUser, "", "Root"), nullptr);
  EXPECT_TRUE(read.HasKey(kHkeyCurrentUser, "Only\\A key"));
  EXPECT_EQ(read.ToText(), text);
  EXPECT_NE(text.find(",\\\n  "), std::string::npos) << "long data wraps";
}

TEST(RegistryStoreTest, RejectsWhatTheTextCannotHold) {
  RegistryStore store;
  EXPECT_THROW(store.SetString(nullptr, "A", "n", "v"), automation::Error);
  EXPECT_THROW(store.AddKey(kHkeyLocalMachine, "A\\"), automation::Error);
  EXPECT_THROW(store.AddKey(kHkeyLocalMachine, "A\nB"), automation::Error);
  EXPECT_THROW(store.SetDword(kHkeyLocalMachine, "A", "n\r", 1),
               automation::Error);
}

}  // namespace
}  // namespace platform
