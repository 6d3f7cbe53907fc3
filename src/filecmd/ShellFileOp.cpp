#include "filecmd/ShellFileOp.h"

#include "filecmd/ShellList.h"
#include "fw/WinApp.h"

#include <cstdlib>
#include <cstring>
#include <string>

CShellFileOp::CShellFileOp() { std::memset(&m_op, 0, sizeof m_op); }

CShellFileOp::CShellFileOp(HWND owner, int kind, const char *from, const char *to, FILEOP_FLAGS flags, const char *title)
    : CShellFileOp() {
  if (from) AddFile(0, from);
  if (to) AddFile(1, to);
  SetOwner(owner);
  SetFlags(flags);
  SetTitle(title);
  switch (kind) {
    case 1: Run(FO_MOVE); break;
    case 2: Run(FO_COPY); break;
    case 3: DeleteFiles(); break;
    case 4: Run(FO_RENAME); break;
    default: break;
  }
}

CShellFileOp::~CShellFileOp() {
  std::free(m_pToBuf);
  std::free(m_pFromBuf);
  std::free(m_pTitle);
}

bool CShellFileOp::AddFile(int which, const char *path) {
  const bool added = which == 0 ? AppendShellListPath(m_pFromBuf, m_nFromCap, m_nFromLen, m_pFromEnd, path, std::realloc)
                                : AppendShellListPath(m_pToBuf, m_nToCap, m_nToLen, m_pToEnd, path, std::realloc);
  if (which == 0) {
    m_op.pFrom = m_pFromBuf;
    m_bFromIncomplete = m_bFromIncomplete || !added;
  } else {
    m_op.pTo = m_pToBuf;
    m_bToIncomplete = m_bToIncomplete || !added;
  }
  return added;
}

void CShellFileOp::ClearFiles(int which) {
  if (which == 0) {
    std::free(m_pFromBuf);
    m_pFromBuf = m_pFromEnd = nullptr;
    m_nFromCap = m_nFromLen = 0;
    m_op.pFrom = nullptr;
    m_bFromIncomplete = false;
  } else {
    std::free(m_pToBuf);
    m_pToBuf = m_pToEnd = nullptr;
    m_nToCap = m_nToLen = 0;
    m_op.pTo = nullptr;
    m_bToIncomplete = false;
  }
}

int CShellFileOp::CopyFiles() { return Run(FO_COPY); }

int CShellFileOp::DeleteFiles() {
  m_op.fFlags = FOF_ALLOWUNDO;
  return Run(FO_DELETE);
}

int CShellFileOp::RenameFiles() { return Run(FO_RENAME); }

void CShellFileOp::SetTitle(const char *text) {
  std::free(m_pTitle);
  m_pTitle = nullptr;
  m_op.lpszProgressTitle = nullptr;
  if (!text || !*text) return;
  const size_t size = std::strlen(text) + 1;
  m_pTitle = static_cast<char *>(std::malloc(size));
  if (!m_pTitle) return;
  std::memcpy(m_pTitle, text, size);
  m_op.lpszProgressTitle = m_pTitle;
}

void CShellFileOp::SetTitle(UINT stringId) { SetTitle(fw::AfxLoadString(stringId).c_str()); }

int CShellFileOp::Run(UINT function) {
  m_op.fAnyOperationsAborted = FALSE;
  m_op.wFunc = function;
  // The shell is never handed a null source list (a delete with nothing marked comes here):
  // the answer is the one the shell itself gives for it, invalid parameter, and nothing runs.
  if (!m_pFromBuf) return ERROR_INVALID_PARAMETER;
  // A list that lost a path to a failed allocation would copy, delete or rename only part of
  // what was asked: report no memory and leave the files alone.
  if (m_bFromIncomplete || m_bToIncomplete) return ERROR_NOT_ENOUGH_MEMORY;
  return SHFileOperationA(&m_op);
}
