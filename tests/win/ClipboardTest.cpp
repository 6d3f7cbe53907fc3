// The file list on the real OLE clipboard: the view's copy read back by another process, and
// paste of lists written as this program and as the Windows shell write them.
#include "DialogAnswerer.h"
#include "ScratchFolder.h"
#include "filecmd/ForFileCommands.h"
#include "filecmd/SelectionCommands.h"
#include "fw/SharedFile.h"

#include <gtest/gtest.h>
#include <ole2.h>
#include <shlobj.h>

#include <algorithm>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

namespace {
namespace fs = std::filesystem;

class OleEnvironment : public ::testing::Environment {
 public:
  void SetUp() override { ASSERT_TRUE(SUCCEEDED(OleInitialize(nullptr))); }
  void TearDown() override { OleUninitialize(); }
};
const auto *const oleEnvironment = ::testing::AddGlobalTestEnvironment(new OleEnvironment);

// Runs the reader program beside this one and returns what it printed.
std::string ReadClipboardInAnotherProcess() {
  SECURITY_ATTRIBUTES inherit{sizeof inherit, nullptr, TRUE};
  HANDLE readEnd = nullptr, writeEnd = nullptr;
  if (!CreatePipe(&readEnd, &writeEnd, &inherit, 0)) return "no pipe";
  SetHandleInformation(readEnd, HANDLE_FLAG_INHERIT, 0);
  STARTUPINFOA startup{};
  startup.cb = sizeof startup;
  startup.dwFlags = STARTF_USESTDHANDLES;
  startup.hStdOutput = writeEnd;
  startup.hStdError = writeEnd;
  PROCESS_INFORMATION process{};
  char exe[MAX_PATH] = "";
  GetModuleFileNameA(nullptr, exe, MAX_PATH);
  std::string reader = exe;
  reader = reader.substr(0, reader.find_last_of('\\') + 1) + "ClipboardTestReader.exe";
  std::string commandLine = "\"" + reader + "\"";
  const BOOL started =
      CreateProcessA(reader.c_str(), commandLine.data(), nullptr, nullptr, TRUE, 0, nullptr, nullptr, &startup, &process);
  CloseHandle(writeEnd);
  std::string output;
  if (started) {
    // The reader asks this process's clipboard windows for the data: keep them answering while
    // it runs, then read what it printed (a few lines, well within the pipe's buffer).
    const DWORD deadline = GetTickCount() + 10000;
    while (MsgWaitForMultipleObjects(1, &process.hProcess, FALSE, 100, QS_ALLINPUT) != WAIT_OBJECT_0 &&
           GetTickCount() < deadline) {
      MSG message;
      while (PeekMessageA(&message, nullptr, 0, 0, PM_REMOVE)) DispatchMessageA(&message);
    }
    char buffer[512];
    DWORD got = 0;
    while (ReadFile(readEnd, buffer, sizeof buffer, &got, nullptr) && got) output.append(buffer, got);
    CloseHandle(process.hThread);
    CloseHandle(process.hProcess);
  } else {
    output = "reader did not start";
  }
  CloseHandle(readEnd);
  output.erase(std::remove(output.begin(), output.end(), '\r'), output.end());
  return output;
}

// Puts a file-list block on the clipboard with the plain clipboard calls, as other programs do.
void PutOnClipboard(UINT format, const std::string &bytes) {
  HWND owner = CreateWindowA("STATIC", "", 0, 0, 0, 0, 0, nullptr, nullptr, nullptr, nullptr);
  ASSERT_NE(owner, nullptr);
  ASSERT_TRUE(OpenClipboard(owner));
  EmptyClipboard();
  HGLOBAL block = GlobalAlloc(GMEM_MOVEABLE, bytes.size());
  std::memcpy(GlobalLock(block), bytes.data(), bytes.size());
  GlobalUnlock(block);
  EXPECT_NE(SetClipboardData(format, block), nullptr);
  CloseClipboard();
  DestroyWindow(owner);
}

std::string Header(uint32_t offset, uint32_t wide) {
  DROPFILES header{};
  header.pFiles = offset;
  header.fWide = wide;
  return std::string(reinterpret_cast<const char *>(&header), sizeof header);
}

std::string NarrowList(const std::vector<std::string> &paths) {
  std::string block = Header(sizeof(DROPFILES), 0);
  for (const std::string &path : paths) block += path + '\0';
  return block + '\0';
}

std::string WideList(const std::vector<std::wstring> &paths) {
  std::wstring list;
  for (const std::wstring &path : paths) list += path + L'\0';
  list += L'\0';
  return Header(sizeof(DROPFILES), 1) + std::string(reinterpret_cast<const char *>(list.data()), list.size() * 2);
}

DwgCatalogue Catalogue(std::initializer_list<const char *> names) {
  DwgCatalogue catalogue;
  for (const char *name : names) catalogue.Add(DwgData(name, 0, 0));
  return catalogue;
}

TEST(ClipboardBlock, SharedFileGrowsInWholeStepsOfZeroedMemory) {
  fw::CSharedFile file;
  const std::string header = Header(20, 0);
  ASSERT_TRUE(file.Write(header.data(), header.size()));
  const std::string longPath(5000, 'p');
  ASSERT_TRUE(file.Write(longPath.data(), longPath.size()));
  EXPECT_EQ(file.GetLength(), 5020u);
  const fw::CGlobalMemory block = file.Detach();
  EXPECT_EQ(file.GetLength(), 0u);
  ASSERT_NE(block, nullptr);
  const fw::CGlobalLock lock(block.get());
  ASSERT_NE(lock.Data(), nullptr);
  ASSERT_EQ(lock.Size(), 8192u);
  const std::string bytes(static_cast<const char *>(lock.Data()), lock.Size());
  EXPECT_EQ(bytes, header + longPath + std::string(8192 - 5020, '\0'));
}

TEST(ClipboardCopy, MarkedDrawingsAreReadBackByAnotherProcessAndPasteIntoAnotherFolder) {
  ScratchFolder source("copy-source"), target("copy-target");
  for (const char *name : {"a.dwg", "b.dwg", "c.dwg"}) source.File(name, name);
  DwgCatalogue catalogue = Catalogue({"a.dwg", "b.dwg", "c.dwg"});
  catalogue[0].Select();
  catalogue[2].Select();
  ASSERT_TRUE(CopySelected(catalogue, source.Path()));
  EXPECT_EQ(ReadClipboardInAnotherProcess(), "offset=20 wide=0\n" + source.File("a.dwg") + "\n" + source.File("c.dwg") + "\n");
  EXPECT_TRUE(ForFileCommands().CanPaste());
  EXPECT_TRUE(PasteFiles(target.Path()));
  EXPECT_EQ(Content(target.File("a.dwg")), "a.dwg");
  EXPECT_EQ(Content(target.File("c.dwg")), "c.dwg");
  EXPECT_FALSE(fs::exists(target.File("b.dwg")));
  EXPECT_EQ(Content(source.File("a.dwg")), "a.dwg");
}

TEST(ClipboardCopy, NothingMarkedLeavesAnEmptyListThatPastesNothing) {
  ScratchFolder target("paste-target");
  ASSERT_TRUE(CopySelected(Catalogue({"a.dwg"}), "C:\\Work\\"));
  EXPECT_EQ(ReadClipboardInAnotherProcess(), "offset=20 wide=0\n");
  EXPECT_FALSE(ForFileCommands().CanPaste());
  EXPECT_FALSE(PasteFiles(target.Path()));
  EXPECT_TRUE(fs::is_empty(target.Path()));
}

// Paste is offered when a drawing in any case is listed, and pastes every file listed.
TEST(ClipboardPaste, OfferedForADrawingInAnyCaseEveryFilePastes) {
  for (const bool withDrawing : {false, true}) {
    ScratchFolder source("notes-source"), target("notes-target");
    std::vector<std::string> listed{source.File("notes.txt", "notes")};
    if (withDrawing) listed.push_back(source.File("x.DWG", "x"));
    PutOnClipboard(CF_HDROP, NarrowList(listed));
    ForFileCommands commands;
    EXPECT_EQ(commands.CanPaste(), withDrawing);
    EXPECT_TRUE(commands.Paste(target.Path()));
    EXPECT_EQ(Content(target.File("notes.txt")), "notes");
    if (withDrawing) {
      EXPECT_EQ(Content(target.File("x.DWG")), "x");
    }
  }
}

TEST(ClipboardPaste, WideListFromTheShellIsReadAsAnsiPaths) {
  ScratchFolder source("wide-source"), target("wide-target");
  const std::string drawing = source.File("pl\xE4n.dwg", "plan");  // "plän.dwg" in code page 1252
  const std::string notes = source.File("notes.txt", "notes");
  ASSERT_EQ(GetACP(), 1252u);
  const std::wstring wideFolder = fs::path(source.Path()).wstring();
  PutOnClipboard(CF_HDROP, WideList({wideFolder + L"\\pl\u00e4n.dwg", wideFolder + L"\\notes.txt"}));
  ForFileCommands commands;
  EXPECT_TRUE(commands.CanPaste());
  EXPECT_TRUE(commands.Paste(target.Path()));
  EXPECT_EQ(Content(target.File("pl\xE4n.dwg")), "plan");
  EXPECT_EQ(Content(target.File("notes.txt")), "notes");
}

// A name outside the code page has no exact ANSI form: converted anyway, "図" would become the
// wildcard "?" and "plān" the other file "plan". Such a paste is refused as a whole, and the
// user is told which files could not be pasted.
TEST(ClipboardPaste, NamesOutsideTheCodePageRefuseThePasteAndAreNamed) {
  struct Row {
    std::vector<std::wstring> listed;
    std::vector<std::wstring> unpastable;
  };
  const std::vector<Row> rows{
      {{L"\u56f3.dwg"}, {L"\u56f3.dwg"}},
      {{L"pl\u0101n.dwg"}, {L"pl\u0101n.dwg"}},
      {{L"notes.txt", L"pl\u0101n.dwg", L"\u56f3.dwg"}, {L"pl\u0101n.dwg", L"\u56f3.dwg"}},
  };
  ScratchFolder source("codepage-source"), target("codepage-target");
  const std::wstring folder = fs::path(source.Path()).wstring() + L"\\";
  for (const wchar_t *name : {L"a.dwg", L"plan.dwg", L"notes.txt", L"\u56f3.dwg", L"pl\u0101n.dwg"})
    std::ofstream(fs::path(folder + name)) << "x";
  for (const Row &row : rows) {
    std::vector<std::wstring> paths;
    for (const std::wstring &name : row.listed) paths.push_back(folder + name);
    PutOnClipboard(CF_HDROP, WideList(paths));
    DialogAnswerer ok(IDOK);
    EXPECT_FALSE(ForFileCommands().Paste(target.Path()));
    EXPECT_EQ(ok.Caption(), "Paste");
    const std::wstring message = ok.Text();
    for (const std::wstring &name : row.listed) {
      const bool named = message.find(folder + name) != std::wstring::npos;
      EXPECT_EQ(named, std::count(row.unpastable.begin(), row.unpastable.end(), name) == 1)
          << std::string(name.begin(), name.end());
    }
    EXPECT_TRUE(fs::is_empty(target.Path())) << "nothing is pasted";
  }
}

TEST(ClipboardPaste, BrokenOrMissingListPastesNothing) {
  ScratchFolder source("broken-source"), target("broken-target");
  const std::string drawing = source.File("a.dwg", "a");
  ForFileCommands commands;

  std::string pastEnd = NarrowList({drawing});
  pastEnd.replace(0, 4, Header(4096, 0).substr(0, 4));
  PutOnClipboard(CF_HDROP, pastEnd);
  EXPECT_FALSE(commands.CanPaste());
  EXPECT_FALSE(commands.Paste(target.Path()));

  PutOnClipboard(CF_TEXT, drawing + '\0');
  EXPECT_FALSE(commands.CanPaste());
  EXPECT_FALSE(commands.Paste(target.Path()));
  EXPECT_TRUE(fs::is_empty(target.Path()));
}
}  // namespace
