#include "settings/DialogSetLa.h"

#include "explorer/MainFrame.h"
#include "res/resource.h"

#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace {
constexpr const char *kSettingsFileName = "\\datains.ini";
constexpr const char *kSection = "Default Parameters";
constexpr const char *kLayerKey = "Layer";
constexpr const char *kCommandKey = "Lisp command";
constexpr const char *kColorKey = "Color";

int DecimalOrZero(const std::string &text) { return static_cast<int>(std::strtol(text.c_str(), nullptr, 10)); }

// The most characters an edit may take so that its line, "key=" and the value, is read back
// whole: the loader leaves out longer lines, and every setting after them with the next save.
UINT LongestValue(const char *key) {
  CPINFO codePage{};
  const UINT bytesPerCharacter = GetCPInfo(CP_ACP, &codePage) && codePage.MaxCharSize > 1 ? codePage.MaxCharSize : 1;
  return static_cast<UINT>((CIniFile::kLongestLine - std::strlen(key) - 1) / bytesPerCharacter);
}

bool HoldsEntries(const CIniFile &ini) {
  for (const CIniFile::key &section : ini.m_keys)
    if (!section.names.empty()) return true;
  return false;
}
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
  m_editLayer.SetLimitText(LongestValue(kLayerKey));
  m_editLisp.SetLimitText(LongestValue(kCommandKey));
  // SetFolder leaves room for the file name.
  std::strcat(m_szFolder, kSettingsFileName);
  m_ini.SetFilePath(m_szFolder);
  m_bLoaded = m_ini.Load();
  std::string layer;
  if (m_bLoaded) {
    layer = m_ini.GetString(kSection, kLayerKey);
    // The swatch shows the stored colour whatever the layer, so that accepting keeps it.
    const std::string color = m_ini.GetString(kSection, kColorKey);
    if (!color.empty()) m_color.SetColorIndex(DecimalOrZero(color));
    m_editLayer.SetWindowText(layer);
    m_editLisp.SetWindowText(m_ini.GetString(kSection, kCommandKey));
  }
  if (layer.empty()) {
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
      RemoveSettings();
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
  m_ini.SetFilePath(m_szFolder);
  m_ini.SetString(kSection, kLayerKey, layer, true);
  m_ini.SetString(kSection, kCommandKey, command, true);
  // A colour nobody chose stays as the file had it, missing or not; a new file gets the swatch's.
  if (m_color.WasChosen() || !m_bLoaded) {
    char color[16];
    std::snprintf(color, sizeof color, "%i", m_color.GetColorIndex());
    m_ini.SetString(kSection, kColorKey, color, true);
  }
  if (!m_ini.Save()) {
    acedAlert(L"The folder settings could not be saved");
    return;
  }
  if (g_pMainFrame) g_pMainFrame->UpdateLayerLabel();
  EndDialog(IDOK);
}

// With the current layer and no command the folder has no settings left: the section goes, and
// the file with it unless it holds other sections.
void CDialogSetLa::RemoveSettings() {
  m_ini.SetFilePath(m_szFolder);
  m_ini.DeleteSection(kSection);
  bool removed;
  if (HoldsEntries(m_ini)) {
    removed = m_ini.Save();
  } else {
    const DWORD error = DeleteFileA(m_szFolder) ? ERROR_SUCCESS : GetLastError();
    removed = error == ERROR_SUCCESS || error == ERROR_FILE_NOT_FOUND || error == ERROR_PATH_NOT_FOUND;
  }
  if (!removed) {
    acedAlert(L"The folder settings could not be saved");
    return;
  }
  if (g_pMainFrame) g_pMainFrame->UpdateLayerLabel();
  EndDialog(IDOK);
}
