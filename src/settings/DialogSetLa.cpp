#include "settings/DialogSetLa.h"

#include "explorer/MainFrame.h"
#include "res/resource.h"

#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace {
constexpr const char *kSettingsFileName = "\\datains.ini";
constexpr const char *kSection = "Default Parameters";

int DecimalOrZero(const std::string &text) { return static_cast<int>(std::strtol(text.c_str(), nullptr, 10)); }
}  // namespace

CDialogSetLa::CDialogSetLa(fw::CWnd *parent) : CDialog(IDD_FOLDER_SETTINGS, parent) {}

bool CDialogSetLa::SetFolder(const std::string &folder) {
  if (folder.size() + std::strlen(kSettingsFileName) >= sizeof m_szFolder) return false;
  std::memcpy(m_szFolder, folder.c_str(), folder.size() + 1);
  return true;
}

void CDialogSetLa::DoDataExchange(fw::CDataExchange *dx) {
  fw::DDX_Control(dx, IDC_LISP_COMMAND, m_editLisp);
  fw::DDX_Control(dx, IDC_COLOR_SWATCH, m_color);
  fw::DDX_Control(dx, IDC_LAYER_NAME, m_editLayer);
}

BOOL CDialogSetLa::OnInitDialog() {
  CDialog::OnInitDialog();
  // SetFolder leaves room for the file name.
  std::strcat(m_szFolder, kSettingsFileName);
  m_ini.SetFilePath(m_szFolder);
  if (m_ini.Load()) {
    const std::string layer = m_ini.GetString(kSection, "Layer");
    const std::string command = m_ini.GetString(kSection, "Lisp command");
    const std::string color = m_ini.GetString(kSection, "Color");
    if (layer.empty()) {
      CheckDlgButton(m_hWnd, IDC_USE_CURRENT_LAYER, BST_CHECKED);
      EnableLayer(false);
    } else {
      m_editLayer.SetWindowText(layer);
      m_color.SetColorIndex(DecimalOrZero(color));
    }
    m_editLisp.SetWindowText(command);
  } else {
    CheckDlgButton(m_hWnd, IDC_USE_CURRENT_LAYER, BST_CHECKED);
    EnableLayer(false);
  }
  return TRUE;
}

bool CDialogSetLa::UsesCurrentLayer() const { return IsDlgButtonChecked(m_hWnd, IDC_USE_CURRENT_LAYER) == BST_CHECKED; }

void CDialogSetLa::EnableLayer(bool enable) {
  m_editLayer.EnableWindow(enable);
  m_color.EnableWindow(enable);
}

void CDialogSetLa::OnUseCurrentLayer() { EnableLayer(!UsesCurrentLayer()); }

BOOL CDialogSetLa::OnCmdMsg(UINT id, int code, fw::CCmdUI *cmdUI) {
  if (id == IDC_USE_CURRENT_LAYER && code == BN_CLICKED) {
    OnUseCurrentLayer();
    return TRUE;
  }
  return CDialog::OnCmdMsg(id, code, cmdUI);
}

void CDialogSetLa::OnOK() {
  const std::string command = m_editLisp.GetWindowText();
  std::string layer;
  if (UsesCurrentLayer()) {
    if (command.empty()) {
      // Nothing left to keep: the whole settings file goes, whatever else it held.
      std::remove(m_szFolder);
      EndDialog(IDOK);
      return;
    }
  } else {
    layer = m_editLayer.GetWindowText();
    if (layer.empty()) {
      acedAlert(L"Name of layer is empty");
      m_editLayer.SetFocus();
      return;
    }
  }
  char color[16];
  std::snprintf(color, sizeof color, "%i", m_color.GetColorIndex());
  m_ini.SetFilePath(m_szFolder);
  m_ini.SetString(kSection, "Layer", layer, true);
  m_ini.SetString(kSection, "Lisp command", command, true);
  m_ini.SetString(kSection, "Color", color, true);
  m_ini.Save();
  if (g_pMainFrame) g_pMainFrame->UpdateLayerLabel();
  EndDialog(IDOK);
}
