// The document's explorer state: read beside the module when it is made, written when it goes.
#include "catalogue/Ombra3Doc.h"
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

std::string ReadFile(const std::string &path) {
  std::ifstream file(path, std::ios::binary);
  std::ostringstream content;
  content << file.rdbuf();
  return content.str();
}

void WriteFile(const std::string &path, const std::string &content) { std::ofstream(path, std::ios::binary) << content; }

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

const char kDefaultFile[] =
    "[CurrentPath]\r\nPath=\r\nName=\r\nShellPath=\r\n\r\n"
    "[Size]\r\nSplitterSize=100\r\nWindowWidth=0\r\nWindowHeight=0\r\n\r\n"
    "[View]\r\nPictureWidth=0\r\nPictureHeight=0\r\nSort=0\r\n\r\n";

TEST_F(ExplorerState, WithoutAFileTheDefaultsAreUsedAndEveryKeyIsWritten) {
  auto document = std::make_unique<COmbra3Doc>();
  EXPECT_EQ(g_pDoc, document.get());
  EXPECT_EQ(document->m_iniFile.m_path, StateFile());
  EXPECT_EQ(document->m_strPath, "");
  EXPECT_EQ(document->m_strName, "");
  EXPECT_EQ(document->m_strShellPath, "");
  EXPECT_EQ(document->m_nSplitterSize, 100);
  EXPECT_EQ(document->m_nWindowWidth, 0);
  EXPECT_EQ(document->m_nWindowHeight, 0);
  EXPECT_EQ(document->m_nPictureWidth, 0);
  EXPECT_EQ(document->m_nPictureHeight, 0);
  EXPECT_EQ(document->m_nSort, 0);
  EXPECT_FALSE(Exists(StateFile()));  // read only; written when the call ends

  document.reset();
  EXPECT_EQ(g_pDoc, nullptr);
  EXPECT_EQ(ReadFile(StateFile()), kDefaultFile);
}

TEST_F(ExplorerState, ValuesTravelToTheNextCall) {
  {
    COmbra3Doc document;
    document.m_strPath = "C:\\Work\\";
    document.m_strName = "plan.dwg";
    document.m_strShellPath = "Desktop\\My Computer\\ (C:)\\Work";
    document.m_nSplitterSize = 250;
    document.m_nWindowWidth = 800;
    document.m_nWindowHeight = 600;
    document.m_nPictureWidth = 200;
    document.m_nPictureHeight = 150;
    document.m_nSort = 2;
  }
  COmbra3Doc next;
  EXPECT_EQ(next.m_strPath, "C:\\Work\\");
  EXPECT_EQ(next.m_strName, "plan.dwg");
  EXPECT_EQ(next.m_strShellPath, "Desktop\\My Computer\\ (C:)\\Work");
  EXPECT_EQ(next.m_nSplitterSize, 250);
  EXPECT_EQ(next.m_nWindowWidth, 800);
  EXPECT_EQ(next.m_nWindowHeight, 600);
  EXPECT_EQ(next.m_nPictureWidth, 200);
  EXPECT_EQ(next.m_nPictureHeight, 150);
  EXPECT_EQ(next.m_nSort, 2);
}

TEST_F(ExplorerState, NumbersAreReadAsPlainDecimalsAndKeptWithoutCorrection) {
  WriteFile(StateFile(),
            "[Size]\r\nSplitterSize=wide\r\nWindowWidth=640px\r\nWindowHeight=-3\r\n"
            "[View]\r\nPictureWidth=0\r\nPictureHeight=200\r\nSort=7\r\n");
  {
    COmbra3Doc document;
    EXPECT_EQ(document.m_nSplitterSize, 100);
    EXPECT_EQ(document.m_nWindowWidth, 640);
    EXPECT_EQ(document.m_nWindowHeight, -3);
    EXPECT_EQ(document.m_nPictureWidth, 0);
    EXPECT_EQ(document.m_nPictureHeight, 200);
    EXPECT_EQ(document.m_nSort, 7);
  }
  const std::string saved = ReadFile(StateFile());
  EXPECT_NE(saved.find("SplitterSize=100\r\nWindowWidth=640\r\nWindowHeight=-3\r\n"), std::string::npos) << saved;
  EXPECT_NE(saved.find("PictureWidth=0\r\nPictureHeight=200\r\nSort=7\r\n"), std::string::npos) << saved;
}

TEST_F(ExplorerState, AnExistingFileKeepsItsOrderAndItsOtherEntries) {
  WriteFile(StateFile(),
            "[View]\r\nSort=1\r\nTheme=dark\r\n\r\n"
            "[Notes]\r\nowner=me\r\n\r\n"
            "[CurrentPath]\r\nName=door.dwg\r\nPath=Z:\\blocks\r\n");
  {
    COmbra3Doc document;
    EXPECT_EQ(document.m_nSort, 1);
    EXPECT_EQ(document.m_strName, "door.dwg");
    EXPECT_EQ(document.m_strPath, "Z:\\blocks");
    document.m_strName = "window.dwg";
  }
  EXPECT_EQ(ReadFile(StateFile()),
            "[View]\r\nSort=1\r\nTheme=dark\r\nPictureWidth=0\r\nPictureHeight=0\r\n\r\n"
            "[Notes]\r\nowner=me\r\n\r\n"
            "[CurrentPath]\r\nName=window.dwg\r\nPath=Z:\\blocks\r\nShellPath=\r\n\r\n"
            "[Size]\r\nSplitterSize=100\r\nWindowWidth=0\r\nWindowHeight=0\r\n\r\n");
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
