#include "filecmd/ForFileCommands.h"

#include "filecmd/DwgPath.h"
#include "filecmd/FileListBlock.h"
#include "filecmd/MarkedPaths.h"
#include "filecmd/PlainFileName.h"
#include "filecmd/ShellFileOp.h"
#include "fw/OleDataObject.h"
#include "host/TextConvert.h"

#include <shellapi.h>

#include <functional>
#include <string>
#include <vector>

namespace {
// One path of the clipboard's file list. A wide list (the Windows shell writes those) is
// converted to ANSI; a name with a character outside the code page has no exact ANSI form.
struct ClipboardPath {
  std::string ansi;
  std::wstring wide;
  bool exact = true;
};

// Hands each path of the clipboard's file list to visit, in order, until visit returns false.
// False when the clipboard cannot be read or offers no file list.
bool ForEachClipboardPath(const std::function<bool(const ClipboardPath &)> &visit) {
  fw::COleDataObject clipboard;
  if (!clipboard.AttachClipboard() || !clipboard.IsDataAvailable(CF_HDROP)) return false;
  const fw::CGlobalMemory block = clipboard.GetGlobalData(CF_HDROP);
  clipboard.Release();
  const fw::CGlobalLock lock(block.get());
  if (!lock.Data()) return false;
  FileListReader reader(lock.Data(), lock.Size());
  ClipboardPath path;
  if (reader.IsWide()) {
    std::u16string units;
    while (reader.NextWide(units)) {
      path.wide.assign(units.begin(), units.end());
      path.exact = ToAnsiExact(path.wide, path.ansi);
      if (!visit(path)) break;
    }
  } else {
    while (reader.NextNarrow(path.ansi)) {
      if (!visit(path)) break;
    }
  }
  return true;
}

// A name that does not convert exactly would reach the shell as another name, or as a
// wildcard ("?" matches any character): the whole paste is refused and the user told which.
void ReportUnpastable(const std::vector<std::wstring> &paths) {
  std::wstring text =
      L"Nothing was pasted. The names of these files contain characters that this "
      L"system's code page cannot hold:\n";
  for (const std::wstring &path : paths) text += L"\n" + path;
  text += L"\n\nRename them and paste again.";
  MessageBoxW(GetActiveWindow(), text.c_str(), L"Paste", MB_OK | MB_ICONWARNING);
}

void ReportRefusedName(HWND owner, const std::string &oldName, const std::string &rule) {
  const std::string text = "\"" + oldName + "\" was not renamed. " + rule;
  MessageBoxA(owner, text.c_str(), "Rename", MB_OK | MB_ICONWARNING);
}
}  // namespace

bool ForFileCommands::CanPaste() {
  bool found = false;
  ForEachClipboardPath([&found](const ClipboardPath &path) {
    // A drawing whose name cannot be pasted still offers the paste, which then tells why not.
    found = IsDwgPath((path.exact ? path.ansi : ToAnsi(path.wide.c_str())).c_str());
    return !found;
  });
  return found;
}

bool ForFileCommands::Paste(const std::string &folder) {
  std::vector<std::string> sources;
  std::vector<std::wstring> unpastable;
  const bool read = ForEachClipboardPath([&](const ClipboardPath &path) {
    if (path.exact)
      sources.push_back(path.ansi);
    else
      unpastable.push_back(path.wide);
    return true;
  });
  if (!unpastable.empty()) {
    ReportUnpastable(unpastable);
    return false;
  }
  if (!read || folder.empty()) return false;
  CShellFileOp operation;
  for (const std::string &source : sources) operation.AddFile(0, source.c_str());
  operation.AddFile(1, folder.c_str());
  return operation.CopyFiles() == 0;
}

int ForFileCommands::RenameFile(const char *from, const char *to, HWND) {
  CShellFileOp operation;
  operation.AddFile(0, from);
  operation.AddFile(1, to);
  return operation.RenameFiles();
}

int ForFileCommands::RenameInFolder(const std::string &folder, const std::string &oldName, const std::string &newName,
                                    HWND owner) {
  if (newName == oldName) return 0;
  const NameRule rule = CheckPlainFileName(newName);
  if (rule != NameRule::Plain) {
    ReportRefusedName(owner, oldName, NameRuleText(rule));
    return ERROR_INVALID_NAME;
  }
  const std::string from = FolderWithSeparator(folder) + oldName;
  const std::string to = FolderWithSeparator(folder) + newName;
  // Only a change of case may land on a name that exists: the file found is the one renamed.
  if (GetFileAttributesA(to.c_str()) != INVALID_FILE_ATTRIBUTES && lstrcmpiA(oldName.c_str(), newName.c_str()) != 0) {
    ReportRefusedName(owner, oldName, "A file named \"" + newName + "\" is already in this folder.");
    return ERROR_ALREADY_EXISTS;
  }
  return RenameFile(from.c_str(), to.c_str(), owner);
}

bool ForFileCommands::IsDwgPath(const char *path) { return path && ::IsDwgPath(std::string(path)); }
