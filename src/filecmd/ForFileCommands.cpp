#include "filecmd/ForFileCommands.h"

#include "filecmd/DwgPath.h"
#include "filecmd/FileListBlock.h"
#include "filecmd/ShellFileOp.h"
#include "fw/OleDataObject.h"
#include "host/TextConvert.h"

#include <shellapi.h>

#include <functional>
#include <string>

namespace {
// Hands each path of the clipboard's file list to visit, in order, until visit returns false.
// A wide list (the Windows shell writes those) comes as ANSI text like a narrow one. False
// when the clipboard cannot be read or offers no file list.
bool ForEachClipboardPath(const std::function<bool(const std::string &)> &visit) {
  fw::COleDataObject clipboard;
  if (!clipboard.AttachClipboard() || !clipboard.IsDataAvailable(CF_HDROP)) return false;
  const fw::CGlobalMemory block = clipboard.GetGlobalData(CF_HDROP);
  clipboard.Release();
  const fw::CGlobalLock lock(block.get());
  if (!lock.Data()) return false;
  FileListReader reader(lock.Data(), lock.Size());
  if (reader.IsWide()) {
    std::u16string wide;
    while (reader.NextWide(wide)) {
      if (!visit(ToAnsi(reinterpret_cast<const wchar_t *>(wide.c_str())))) break;
    }
  } else {
    std::string narrow;
    while (reader.NextNarrow(narrow)) {
      if (!visit(narrow)) break;
    }
  }
  return true;
}
}  // namespace

bool ForFileCommands::CanPaste() {
  bool found = false;
  ForEachClipboardPath([&found](const std::string &path) {
    found = IsDwgPath(path.c_str());
    return !found;
  });
  return found;
}

bool ForFileCommands::Paste() {
  CShellFileOp operation;
  const bool read = ForEachClipboardPath([&operation](const std::string &path) {
    operation.AddFile(0, path.c_str());
    return true;
  });
  char destination[MAX_PATH];
  const DWORD length = GetCurrentDirectoryA(MAX_PATH, destination);
  if (!read || length == 0 || length >= MAX_PATH) return false;
  operation.AddFile(1, destination);
  return operation.CopyFiles() == 0;
}

int ForFileCommands::RenameFile(const char *from, const char *to, HWND) {
  CShellFileOp operation;
  operation.AddFile(0, from);
  operation.AddFile(1, to);
  return operation.RenameFiles();
}

bool ForFileCommands::IsDwgPath(const char *path) { return path && ::IsDwgPath(std::string(path)); }
