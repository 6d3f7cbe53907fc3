// The paths the module takes apart and builds: the path splitter every caller shares, the start
// folder's shell path, the state file beside the module, drawings on the clipboard and the
// paths of marked drawings.
#include "catalogue/StateFilePath.h"
#include "filecmd/DwgPath.h"
#include "filecmd/MarkedPaths.h"
#include "host/ShellPathCompose.h"
#include "host/SplitPath.h"

#include <gtest/gtest.h>

namespace {
TEST(SplitPath, PartsAsTheRunTimeSplitsThem) {
  const struct {
    const char *path, *drive, *directory, *baseName, *extension;
  } rows[] = {{"C:\\Proj\\", "C:", "\\Proj\\", "", ""},
              {"C:\\Proj", "C:", "\\", "Proj", ""},  // without a separator Proj is a file name
              {"C:\\Proj\\plan.dwg", "C:", "\\Proj\\", "plan", ".dwg"},
              {"c:relative\\x.dwg", "c:", "relative\\", "x", ".dwg"},
              {"c:x.dwg", "c:", "", "x", ".dwg"},
              {"C:", "C:", "", "", ""},
              {"C:\\dir.x/sub\\name.tar.gz", "C:", "\\dir.x/sub\\", "name.tar", ".gz"},
              {"\\\\server\\share\\dwg\\", "", "\\\\server\\share\\dwg\\", "", ""},
              {"plan.dwg.old", "", "", "plan.dwg", ".old"},
              {".dwg", "", "", "", ".dwg"},
              {"x", "", "", "x", ""},
              {"", "", "", "", ""}};
  for (const auto &row : rows) {
    const PathParts parts = SplitPath(row.path);
    EXPECT_EQ(parts.drive, row.drive) << row.path;
    EXPECT_EQ(parts.directory, row.directory) << row.path;
    EXPECT_EQ(parts.baseName, row.baseName) << row.path;
    EXPECT_EQ(parts.extension, row.extension) << row.path;
  }
}

// Code page 932: "\x95\x5c" is one character whose second byte is the code of a backslash.
TEST(SplitPath, DoubleByteCharactersAreNeverTakenApart) {
  const CharacterStep shiftJis = [](const char *at) -> const char * {
    const unsigned char lead = static_cast<unsigned char>(*at);
    return at + ((lead >= 0x81 && lead <= 0x9F) || (lead >= 0xE0 && lead <= 0xFC) ? (at[1] ? 2 : 1) : 1);
  };
  const struct {
    const char *path, *directory, *baseName;
  } rows[] = {{"C:\\x\\\x95\x5c", "\\x\\", "\x95\x5c"},
              {"C:\\\x95\x5c\\\x95\x5cy.dwg", "\\\x95\x5c\\", "\x95\x5cy"},
              {"\x95\x5c.dwg", "", "\x95\x5c"},
              {"C:\\x\\\x95", "\\x\\", "\x95"}};  // a lead byte cut off at the end
  for (const auto &row : rows) {
    const PathParts parts = SplitPath(row.path, shiftJis);
    EXPECT_EQ(parts.directory, row.directory) << row.path;
    EXPECT_EQ(parts.baseName, row.baseName) << row.path;
  }
}

TEST(StartShellPath, DriveFoldersGoThroughTheDrivesFolderOthersThroughTheNetwork) {
  const ShellFolderNames names{"Desktop", "My Computer", "My Network Places"};
  EXPECT_EQ(ComposeStartShellPath(names, " (C:)", "\\Proj\\"), "Desktop\\My Computer\\ (C:)\\Proj\\");
  EXPECT_EQ(ComposeStartShellPath(names, " (C:)", ""), "Desktop\\My Computer\\ (C:)");
  EXPECT_EQ(ComposeStartShellPath(names, "", "\\\\server\\share\\dwg\\"), "Desktop\\My Network Places\\\\server\\share\\dwg\\");
}

TEST(StateFilePath, ModuleNameWithExtensionIni) {
  for (const auto &[module, state] : std::initializer_list<std::pair<const char *, const char *>>{
           {"C:\\Program Files\\Lumvex\\Lumvex1.arx", "C:\\Program Files\\Lumvex\\Lumvex1.ini"},
           {"Z:\\work\\build.v2\\bin\\lumvex.test.arx", "Z:\\work\\build.v2\\bin\\lumvex.test.ini"},
           {"C:\\a\\Lumvex1", "C:\\a\\Lumvex1.ini"},
           {"\\\\server\\share\\Lumvex1.arx", "\\\\server\\share\\Lumvex1.ini"},
           {"C:Lumvex1.arx", "C:Lumvex1.ini"}})
    EXPECT_EQ(ComposeStateFilePath(module), state);
}

TEST(DwgPath, DrawingsByTheirLastExtensionInAnyCase) {
  for (const char *path : {"C:\\work\\x.DWG", "z:/tmp/Mixed.DwG", "C:\\work\\.dwg", "d:plan.1.dwg", "\\\\server\\v1.2\\x.dwg"})
    EXPECT_TRUE(IsDwgPath(path)) << path;
  for (const char *path : {"C:\\work\\notes.txt", "C:\\work\\plan.dwgx", "C:\\work\\plan.dw", "C:\\work.dwg\\plan",
                           "z:/x.dwg/plan", "C:\\work\\plandwg", ""})
    EXPECT_FALSE(IsDwgPath(path)) << path;
}

TEST(MarkedPaths, FolderWithOneSeparatorThenEachMarkedNameInCatalogueOrder) {
  DwgCatalogue catalogue;
  for (const char *name : {"a.dwg", "b.dwg", "c.dwg"}) catalogue.Add(DwgData(name, 0, 0));
  EXPECT_TRUE(MarkedPaths(catalogue, "C:\\Work").empty());
  catalogue[2].Select();
  catalogue[0].Select();
  EXPECT_EQ(MarkedPaths(catalogue, "C:\\Work"), (std::vector<std::string>{"C:\\Work\\a.dwg", "C:\\Work\\c.dwg"}));
  EXPECT_EQ(MarkedPaths(catalogue, "C:\\"), (std::vector<std::string>{"C:\\a.dwg", "C:\\c.dwg"}));
  EXPECT_EQ(FolderWithSeparator(""), "\\");
}
}  // namespace
