// The document of one browse call: the folder shown, the drawing chosen or found last, the
// folder-tree path, and the explorer's sizes and sort key, which live in the explorer state
// file beside the module from one call to the next.
#pragma once

#include "fw/Document.h"
#include "settings/IniFile.h"

#include <string>

class COmbra3Doc : public fw::CDocument {
 public:
  // Reads the state file; sets g_pDoc.
  COmbra3Doc();
  // Writes every value back to the state file; clears g_pDoc.
  ~COmbra3Doc() override;

  std::string m_strPath;
  std::string m_strName;
  std::string m_strShellPath;
  int m_nSplitterSize = 0;
  int m_nWindowWidth = 0;
  int m_nWindowHeight = 0;
  int m_nPictureWidth = 0;
  int m_nPictureHeight = 0;
  int m_nSort = 0;
  CIniFile m_iniFile;
  // Not kept between calls: the last scan listed a file-system folder, m_strPath; an item
  // without one (My Computer) shows none, and nothing may be pasted into it.
  bool m_bFolderShown = false;
  // Drawings of the shown folder whose names the ANSI code page cannot hold: left out of the
  // catalogue, as no narrow path would name them.
  int m_nDrawingsLeftOut = 0;

 private:
  void LoadState();
  void SaveState();
};

// The document of the running browse call, or null between calls.
extern COmbra3Doc *g_pDoc;
