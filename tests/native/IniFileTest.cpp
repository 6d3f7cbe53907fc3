#include "settings/IniFile.h"

#include <gtest/gtest.h>

#include <chrono>
#include <cstdint>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <tuple>

namespace fs = std::filesystem;

namespace {
// A folder of its own per case and run, so builds testing side by side do not share one.
class IniFileTest : public ::testing::Test {
 protected:
  void SetUp() override {
    m_folder = fs::temp_directory_path() /
               ("IniFileTest-" + std::to_string(std::chrono::steady_clock::now().time_since_epoch().count()));
    fs::create_directories(m_folder);
    m_file = (m_folder / "datains.ini").string();
  }
  void TearDown() override { fs::remove_all(m_folder); }

  void Write(const std::string &bytes) const { std::ofstream(m_file, std::ios::binary) << bytes; }
  std::string Read() const {
    std::ifstream in(m_file, std::ios::binary);
    return std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
  }
  CIniFile LoadBytes(const std::string &bytes) const {
    Write(bytes);
    CIniFile ini;
    ini.SetFilePath(m_file);
    EXPECT_TRUE(ini.Load());
    return ini;
  }
  std::string SaveBytes(CIniFile &ini) const {
    ini.SetFilePath(m_file);
    ini.Save();
    return Read();
  }

  fs::path m_folder;
  std::string m_file;
};
}  // namespace

TEST_F(IniFileTest, SaveWritesCrLfAndAnEmptyLineAfterEverySectionWithEntries) {
  CIniFile ini;
  ini.SetString("Default Parameters", "Layer", "WALLS", true);
  ini.SetString("Default Parameters", "Lisp command", "MYCMD", true);
  ini.SetInt("Default Parameters", "Color", 1, true);
  ini.SetString("Emptied", "gone", "1", true);
  ini.DeleteEntry("Emptied", "gone");
  ini.SetString("", "loose", " spaced = text ", true);

  EXPECT_EQ(SaveBytes(ini),
            "[Default Parameters]\r\nLayer=WALLS\r\nLisp command=MYCMD\r\nColor=1\r\n\r\n"
            "[]\r\nloose= spaced = text \r\n\r\n");
}

TEST_F(IniFileTest, RepeatedSectionsAndRepeatedLoadsMergeInFirstCreationOrder) {
  CIniFile ini;
  ini.SetString("B", "x", "old", true);
  ini.SetString("Kept", "k", "v", true);
  Write("[A]\r\nx=1\r\n[B]\r\nx=2\r\n[A]\r\nx=3\r\n");
  ini.SetFilePath(m_file);
  ASSERT_TRUE(ini.Load());
  ASSERT_TRUE(ini.Load());
  EXPECT_EQ(ini.SectionCount(), 3);
  EXPECT_EQ(SaveBytes(ini), "[B]\r\nx=2\r\n\r\n[Kept]\r\nk=v\r\n\r\n[A]\r\nx=3\r\n\r\n");
}

TEST_F(IniFileTest, LineRules) {
  CIniFile ini = LoadBytes(
      "before=1\n"
      "\n"
      "[S]\n"
      "a=b=c\n"
      "abc\n"
      " [A]\n"
      "Layer = 0\n"
      ";note=x\n"
      "=lead\n"
      "[[a]]\n"
      "k=v\n"
      "[]\n"
      "e=1\n"
      "[lonely]\n");
  EXPECT_EQ(ini.GetString("", "before"), "1");
  EXPECT_EQ(ini.GetString("", "e"), "1");
  EXPECT_EQ(ini.GetString("S", "a"), "b=c");
  EXPECT_EQ(ini.GetString("S", "Layer "), " 0");
  EXPECT_EQ(ini.GetString("S", ";note"), "x");
  // "abc", " [A]" and "=lead" all set the entry with the empty name; the last wins.
  EXPECT_EQ(ini.EntryCount("S"), 4);
  EXPECT_EQ(ini.GetString("S", ""), "lead");
  EXPECT_EQ(ini.GetString("a", "k"), "v");
  EXPECT_EQ(ini.FindSection("lonely"), -1) << "a header alone creates no section";

  EXPECT_EQ(LoadBytes("abc\n").GetString("", ""), "bc");
  EXPECT_EQ(LoadBytes(" [A]\n").GetString("", ""), "[A]");
}

TEST_F(IniFileTest, LookupsAreExactAndReportWhatIsMissing) {
  CIniFile ini = LoadBytes("[Size]\nWindowWidth=640\n");
  const char *const key = "Unable to locate specified key.", *const value = "Unable to locate specified value.";
  // The last row finds its value and leaves the error as it was: it is never cleared.
  for (const auto &[section, entry, found, error] : {std::tuple{"size", "WindowWidth", "", key}, {"Size", "windowwidth", "", value},
                                                     {"Size ", "WindowWidth", "", key}, {"Size", "WindowWidth", "640", key}}) {
    EXPECT_EQ(ini.GetString(section, entry), found) << section << "/" << entry;
    EXPECT_EQ(ini.m_error, error) << section << "/" << entry;
  }
}

TEST_F(IniFileTest, LoadFailures) {
  CIniFile ini;
  ini.m_error = "earlier";
  ini.SetFilePath((m_folder / "missing.ini").string());
  EXPECT_FALSE(ini.Load());
  EXPECT_EQ(ini.m_error, "earlier") << "a missing file is not an error";

  ini.SetFilePath(m_folder.string());
  EXPECT_FALSE(ini.Load());
  EXPECT_EQ(ini.m_error, "Unable to open ini file.");
  EXPECT_EQ(ini.SectionCount(), 0);
}

TEST_F(IniFileTest, ALineTooLongIsLeftOutAndTheLinesAfterItAreRead) {
  CIniFile ini = LoadBytes("[A]\r\nx=1\r\nc=" + std::string(3000, 'y') + "\r\nz=2\r\n[B]\r\nkept=1\r\n");
  EXPECT_EQ(ini.EntryCount("A"), 2);
  EXPECT_EQ(ini.GetString("A", "x"), "1");
  EXPECT_EQ(ini.GetString("A", "z"), "2");
  EXPECT_EQ(ini.GetString("B", "kept"), "1");

  // 2047 characters is the longest line kept, whatever its line end.
  const std::string longest = "v=" + std::string(2045, 'w');
  for (const auto &[bytes, entries] : {std::pair{longest + "\r\nlast=1", 2}, {longest + "\nlast=1", 2}, {longest, 1},
                                       {"a=1\n" + longest + "w\r\nlast=1", 2}, {"a=1\n" + longest + "w", 1}})
    EXPECT_EQ(LoadBytes(bytes).EntryCount(""), entries) << bytes.size();
}

TEST_F(IniFileTest, LineEndsAndOddBytes) {
  CIniFile ini = LoadBytes("[A]\r\ncrlf=1\r\nlf=2\ninner=a\rb\r\ntwo=3\r\r\nlast=4");
  EXPECT_EQ(ini.GetString("A", "crlf"), "1");
  EXPECT_EQ(ini.GetString("A", "lf"), "2");
  EXPECT_EQ(ini.GetString("A", "inner"), "a\rb");
  EXPECT_EQ(ini.GetString("A", "two"), "3\r") << "only the CR right before the LF goes";
  EXPECT_EQ(ini.GetString("A", "last"), "4");

  const std::string withNul("[N]\nna\0me=va\0lue\n", 17);
  CIniFile nul = LoadBytes(withNul);
  EXPECT_EQ(nul.GetString("N", std::string("na\0me", 5)), std::string("va\0lue", 6));
  EXPECT_EQ(SaveBytes(nul), std::string("[N]\r\nna\0me=va\0lue\r\n\r\n", 21));
}

TEST_F(IniFileTest, SaveReplacesTheWholeFileOrNothing) {
  Write(std::string(10000, 'x'));
  CIniFile ini;
  ini.SetString("A", "b", "c", true);
  EXPECT_EQ(SaveBytes(ini), "[A]\r\nb=c\r\n\r\n");
  EXPECT_TRUE(ini.Save());
  EXPECT_FALSE(fs::exists(m_file + ".tmp"));

  // The temporary file cannot be created: the old file stays as it was.
  const std::string old = "[Old]\r\nkeep=1\r\n\r\n";
  Write(old);
  fs::create_directory(m_file + ".tmp");
  EXPECT_FALSE(ini.Save()) << "a failed save says so";
  EXPECT_EQ(Read(), old);
  fs::remove(m_file + ".tmp");

  // The target cannot be replaced: no temporary file is left behind.
  const fs::path folderTarget = m_folder / "folder.ini";
  fs::create_directories(folderTarget / "inside");
  ini.SetFilePath(folderTarget.string());
  EXPECT_FALSE(ini.Save());
  EXPECT_TRUE(fs::is_directory(folderTarget / "inside"));
  EXPECT_FALSE(fs::exists(folderTarget.string() + ".tmp"));
}

TEST_F(IniFileTest, NumbersAsText) {
  CIniFile ini;
  ini.SetInt("N", "int", -5, true);
  ini.SetDouble("N", "double", 1.5, true);
  EXPECT_EQ(ini.GetString("N", "int"), "-5");
  EXPECT_EQ(ini.GetString("N", "double"), "1.500000e+00");
  EXPECT_DOUBLE_EQ(ini.GetDouble("N", "double"), 1.5);

  const std::pair<const char *, int> ints[] = {
      {" \t-42abc", -42},      {"+7", 7}, {"x1", 0}, {"", 0}, {"99999999999999999999", INT32_MAX},
      {"-2147483648", INT32_MIN}, {"-99999999999999999999", INT32_MIN}};
  for (const auto &[text, number] : ints) {
    ini.SetString("N", "i", text, true);
    EXPECT_EQ(ini.GetInt("N", "i"), number) << '"' << text << '"';
  }
  ini.SetString("N", "d", " -2.5e1rest", true);
  EXPECT_DOUBLE_EQ(ini.GetDouble("N", "d"), -25.0);
  ini.SetString("N", "d", "none", true);
  EXPECT_EQ(ini.GetDouble("N", "d"), 0.0);
  EXPECT_EQ(ini.GetInt("missing", "i"), 0);
  EXPECT_EQ(ini.m_error, "Unable to locate specified key.");
}

TEST_F(IniFileTest, CreatingOnlyWhenAskedDeletingAndCounting) {
  CIniFile ini;
  ini.SetString("A", "x", "1", true);
  ini.SetString("A", "y", "2", true);
  ini.SetString("B", "z", "3", true);
  EXPECT_FALSE(ini.SetString("A", "new", "1", false)) << "a new entry only when asked for";
  EXPECT_FALSE(ini.SetString("C", "x", "1", false));
  EXPECT_TRUE(ini.SetString("A", "x", "1", false));
  EXPECT_EQ(ini.EntryCount("none"), -1);
  EXPECT_FALSE(ini.DeleteEntry("A", "none"));
  EXPECT_TRUE(ini.DeleteEntry("A", "x"));
  EXPECT_TRUE(ini.DeleteEntry("A", "y"));
  EXPECT_EQ(ini.EntryCount("A"), 0);
  EXPECT_EQ(SaveBytes(ini), "[B]\r\nz=3\r\n\r\n") << "a section without entries is not written";
  EXPECT_FALSE(ini.DeleteSection("none"));
  EXPECT_TRUE(ini.DeleteSection("A"));
  EXPECT_EQ(ini.m_names, std::vector<std::string>{"B"});
  ini.Clear();
  EXPECT_EQ(ini.SectionCount(), 0);
  EXPECT_EQ(ini.m_path, m_file) << "Clear keeps the path";
}
