// The shell's file operation (SHFileOperationA) with its source and destination lists built
// path by path; the shell does the work with its own confirmations, progress, recycle bin and
// error messages.
#pragma once

#include <windows.h>
#include <shellapi.h>

class CShellFileOp {
 public:
  CShellFileOp();
  // One call: adds the paths (a null path is left out), sets flags and title and runs kind
  // 1 move, 2 copy, 3 delete (flags become FOF_ALLOWUNDO) or 4 rename; another kind runs nothing.
  CShellFileOp(HWND owner, int kind, const char *from, const char *to, FILEOP_FLAGS flags, const char *title);
  virtual ~CShellFileOp();
  CShellFileOp(const CShellFileOp &) = delete;
  CShellFileOp &operator=(const CShellFileOp &) = delete;

  // which 0: the source list, any other value: the destination list. False when the path could
  // not be added (null or empty, or no memory); the list is then kept as it was but refuses to
  // run.
  bool AddFile(int which, const char *path);
  void ClearFiles(int which);

  int CopyFiles();
  // Always to the recycle bin with the shell's confirmation: the flags become FOF_ALLOWUNDO.
  int DeleteFiles();
  int RenameFiles();

  void SetOwner(HWND owner) { m_op.hwnd = owner; }
  void SetFlags(FILEOP_FLAGS flags) { m_op.fFlags = flags; }
  FILEOP_FLAGS GetFlags() const { return m_op.fFlags; }
  bool AnyOperationsAborted() const { return m_op.fAnyOperationsAborted != FALSE; }
  void SetTitle(const char *text);
  void SetTitle(UINT stringId);

  // What the shell is handed: lists, flags, title.
  const SHFILEOPSTRUCTA &GetOperation() const { return m_op; }
  int GetListSize(int which) const { return which == 0 ? m_nFromCap : m_nToCap; }

 private:
  int Run(UINT function);

  int m_nFromCap = 0;
  int m_nToCap = 0;
  int m_nFromLen = 0;
  int m_nToLen = 0;
  SHFILEOPSTRUCTA m_op;
  char *m_pToBuf = nullptr;
  char *m_pFromBuf = nullptr;
  char *m_pFromEnd = nullptr;
  char *m_pToEnd = nullptr;
  char *m_pTitle = nullptr;
  // A path that could not be added: running would act on a list short of what was asked.
  bool m_bFromIncomplete = false;
  bool m_bToIncomplete = false;
};
