// The folder settings dialog: a folder's default layer (or the current layer), colour index and
// LISP command, kept in the folder's "datains.ini", section "Default Parameters".
#pragma once

#include "fw/Controls.h"
#include "fw/Dialog.h"
#include "settings/IniFile.h"
#include "settings/StaticColor.h"

#include <string>

class CDialogSetLa : public fw::CDialog {
 public:
  explicit CDialogSetLa(fw::CWnd *parent);

  // Copies the folder's path into m_szFolder; false, with nothing copied, when the path and the
  // settings file's name would not fit in it.
  bool SetFolder(const std::string &folder);

  CIniFile m_ini;
  char m_szFolder[260] = "";
  fw::CEdit m_editLisp;
  CStaticColor m_color;
  fw::CEdit m_editLayer;

 protected:
  void DoDataExchange(fw::CDataExchange *dx) override;
  BOOL OnInitDialog() override;
  void OnOK() override;
  BOOL OnCmdMsg(UINT id, int code, fw::CCmdUI *cmdUI) override;

 private:
  void OnUseCurrentLayer();
  bool UsesCurrentLayer() const;
  void EnableLayer(bool enable);
  void RemoveSettings();

  bool m_bLoaded = false;  // the settings file was read when the dialog opened
};
