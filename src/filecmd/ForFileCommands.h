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
  static bool IsDwgPath(const char *path);
};
