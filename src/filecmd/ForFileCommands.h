// Reading the clipboard's file list, paste into a folder, and rename: stateless, made
// on the stack around each use.
#pragma once

#include <windows.h>

#include <string>

class ForFileCommands {
 public:
  virtual ~ForFileCommands() = default;

  // True when the clipboard offers a file list holding at least one drawing.
  bool CanPaste();
  // Copies every file of the clipboard's list into the folder through the shell; true when the
  // shell reports success. A list holding a name with no exact ANSI form is refused whole, and
  // the user is told which files could not be pasted.
  bool Paste(const std::string &folder);
  // Renames through the shell and returns its result, 0 for success. The owner is not used.
  int RenameFile(const char *from, const char *to, HWND owner);
  // Renames the drawing oldName of folder to newName, which must be a plain file name that
  // names no other file; otherwise a message owned by owner says which rule the name breaks,
  // and nothing is touched. 0 when renamed (or the name is unchanged).
  int RenameInFolder(const std::string &folder, const std::string &oldName, const std::string &newName, HWND owner);
  static bool IsDwgPath(const char *path);
};
