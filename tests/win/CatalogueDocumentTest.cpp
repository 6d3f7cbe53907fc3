// The document's explorer state: read beside the module when it is made, written when it goes.
#include "catalogue/Ombra3Doc.h"
#include "ScratchFolder.h"
#include "catalogue/StateFilePath.h"

#include <gtest/gtest.h>

#include <windows.h>

#include <fstream>
#include <memory>
#include <sstream>
#include <string>

namespace {
// Linked into this program, the document keeps its state beside the program itself.
std::string StateFile() {
  char program[MAX_PATH] = "";
  GetModuleFileNameA(nullptr, program, MAX_PATH);
  return ComposeStateFilePath(program);
}

void WriteState(const std::string &content) { std::ofstream(StateFile(), std::ios::binary) << content; }

bool Exists(const std::string &path) { return GetFileAttributesA(path.c_str()) != INVALID_FILE_ATTRIBUTES; }

class ExplorerState : public ::testing::Test {
 protected:
  void SetUp() override { Clean(); }
  void TearDown() override { Clean(); }
  static void Clean() {
    DeleteFileA(StateFile().c_str());
    DeleteFileA((StateFile() + ".tmp").c_str());
    RemoveDirectoryA(StateFile().c_str());
  }
};

// Every value the document keeps, in the order of the file.
std::string Values(const COmbra3Doc &d) {
  std::ostringstream out;
  out << d.m_strPath << "|" << d.m_strName << "|" << d.m_strShellPath << "|" << d.m_nSplitterSize << "|" << d.m_nWindowWidth
      << "|" << d.m_nWindowHeight << "|" << d.m_nPictureWidth << "|" << d.m_nPictureHeight << "|" << d.m_nSort;
  return out.str();
}

TEST_F(ExplorerState, WithoutAFileTheDefaultsAreUsedAndEveryKeyIsWrittenAtTheEnd) {
  auto document = std::make_unique<COmbra3Doc>();
  EXPECT_EQ(g_pDoc, document.get());
  EXPECT_EQ(document->m_iniFile.m_path, StateFile());
  EXPECT_EQ(Values(*document), "|||100|0|0|0|0|0");
  EXPECT_FALSE(Exists(StateFile()));  // read only; written when the call ends
  document.reset();
  EXPECT_EQ(g_pDoc, nullptr);
  EXPECT_EQ(Content(StateFile()),
            "[CurrentPath]\r\nPath=\r\nName=\r\nShellPath=\r\n\r\n"
            "[Size]\r\nSplitterSize=100\r\nWindowWidth=0\r\nWindowHeight=0\r\n\r\n"
            "[View]\r\nPictureWidth=0\r\nPictureHeight=0\r\nSort=0\r\n\r\n");

  {
    COmbra3Doc changed;
    changed.m_strPath = "C:\\Work\\";
    changed.m_strName = "plan.dwg";
    changed.m_strShellPath = "Desktop\\My Computer\\ (C:)\\Work";
    changed.m_nSplitterSize = 250;
    changed.m_nWindowWidth = 800;
    changed.m_nWindowHeight = 600;
    changed.m_nPictureWidth = 200;
    changed.m_nPictureHeight = 150;
    changed.m_nSort = 2;
  }
  EXPECT_EQ(Values(COmbra3Doc()), "C:\\Work\\|plan.dwg|Desktop\\My Computer\\ (C:)\\Work|250|800|600|200|150|2")
      << "values travel to the next call";
}

TEST_F(ExplorerState, AnExistingFileKeepsItsOrderItsOtherEntriesAndItsNumbersWithinWhatCanBeShown) {
  WriteState(
      "[View]\r\nSort=7\r\nTheme=dark\r\nPictureHeight=200\r\n\r\n[Notes]\r\nowner=me\r\n\r\n"
      "[CurrentPath]\r\nName=door.dwg\r\nPath=Z:\\blocks\r\n\r\n"
      "[Size]\r\nSplitterSize=wide\r\nWindowWidth=640px\r\nWindowHeight=-3\r\n");
  {
    COmbra3Doc document;
    EXPECT_EQ(Values(document), "Z:\\blocks|door.dwg||100|640|0|0|200|7") << "numbers are read as plain decimals";
    document.m_strName = "window.dwg";
  }
  EXPECT_EQ(Content(StateFile()),
            "[View]\r\nSort=7\r\nTheme=dark\r\nPictureHeight=200\r\nPictureWidth=0\r\n\r\n[Notes]\r\nowner=me\r\n\r\n"
            "[CurrentPath]\r\nName=window.dwg\r\nPath=Z:\\blocks\r\nShellPath=\r\n\r\n"
            "[Size]\r\nSplitterSize=100\r\nWindowWidth=640\r\nWindowHeight=0\r\n\r\n");
}

TEST_F(ExplorerState, AStateFileThatCannotBeReadOrReplacedLosesOnlyThisCall) {
  // A folder in the state file's place: nothing can be read, and the save must not leave
  // a half-written file or a temporary beside it.
  ASSERT_TRUE(CreateDirectoryA(StateFile().c_str(), nullptr));
  {
    COmbra3Doc document;
    EXPECT_EQ(document.m_nSplitterSize, 100);
    document.m_nSort = 2;
  }
  EXPECT_EQ(GetFileAttributesA(StateFile().c_str()) & FILE_ATTRIBUTE_DIRECTORY, DWORD(FILE_ATTRIBUTE_DIRECTORY));
  EXPECT_FALSE(Exists(StateFile() + ".tmp"));
}
}  // namespace
