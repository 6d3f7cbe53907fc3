// Printing of a view, as the class library's views print: the print dialog (or the default
// printer), then one printer document of one page that the view draws with OnDraw.
#include "fw/FrameworkIds.h"
#include "fw/SharedFile.h"
#include "fw/View.h"

#include <commdlg.h>

#include <memory>
#include <string>
#include <type_traits>

namespace fw {
namespace {
struct DeleteDCDeleter {
  void operator()(HDC dc) const { ::DeleteDC(dc); }
};
using CPrinterDC = std::unique_ptr<std::remove_pointer_t<HDC>, DeleteDCDeleter>;

// The printer's choice: the device context and the global blocks describing the printer.
struct PrinterChoice {
  CPrinterDC dc;
  CGlobalMemory devMode;
  CGlobalMemory devNames;
};

PrinterChoice ChoosePrinter(HWND owner, bool askUser) {
  PRINTDLGA dialog{};
  dialog.lStructSize = sizeof dialog;
  dialog.hwndOwner = owner;
  dialog.Flags = PD_RETURNDC | PD_NOSELECTION | PD_NOPAGENUMS | PD_HIDEPRINTTOFILE | PD_USEDEVMODECOPIESANDCOLLATE;
  if (!askUser) dialog.Flags |= PD_RETURNDEFAULT;
  // A cancelled dialog needs no word; without a printer the dialog has told the user itself.
  const BOOL chosen = ::PrintDlgA(&dialog);
  PrinterChoice choice{CPrinterDC(dialog.hDC), CGlobalMemory(dialog.hDevMode), CGlobalMemory(dialog.hDevNames)};
  if (!chosen) choice.dc.reset();
  return choice;
}

// One printer document: started here, ended when every page went out, abandoned otherwise.
class PrintDocument {
 public:
  PrintDocument(HDC dc, const std::string &name) : m_hDC(dc) {
    DOCINFOA info{};
    info.cbSize = sizeof info;
    info.lpszDocName = name.c_str();
    m_bStarted = ::StartDocA(dc, &info) > 0;
  }
  ~PrintDocument() {
    if (!m_bStarted) return;
    if (m_bComplete)
      ::EndDoc(m_hDC);
    else
      ::AbortDoc(m_hDC);
  }
  PrintDocument(const PrintDocument &) = delete;
  PrintDocument &operator=(const PrintDocument &) = delete;

  bool Started() const { return m_bStarted; }
  void Complete() { m_bComplete = true; }

 private:
  HDC m_hDC;
  bool m_bStarted = false;
  bool m_bComplete = false;
};

bool IsPrintCommand(UINT id) { return id == ID_FILE_PRINT || id == ID_FILE_PRINT_DIRECT || id == ID_FILE_PRINT_PREVIEW; }
}  // namespace

void CView::OnFilePrint(bool direct) {
  const HWND owner = ::GetAncestor(m_hWnd, GA_ROOT);
  PrinterChoice printer = ChoosePrinter(owner, !direct);
  // With no default printer the dialog is shown after all: it tells the user to install one.
  if (direct && !printer.dc) printer = ChoosePrinter(owner, true);
  if (!printer.dc) return;

  char title[256] = "";
  ::GetWindowTextA(owner, title, sizeof title);
  PrintDocument document(printer.dc.get(), title);
  if (!document.Started() || ::StartPage(printer.dc.get()) <= 0) return;
  // The page shows what the view shows, from its origin, not where the window is scrolled to.
  const int saved = ::SaveDC(printer.dc.get());
  OnDraw(printer.dc.get());
  ::RestoreDC(printer.dc.get(), saved);
  if (::EndPage(printer.dc.get()) > 0) document.Complete();
}

BOOL CView::OnCmdMsg(UINT id, int code, CCmdUI *cmdUI) {
  // There is no preview window: a preview request prints through the dialog, where the user
  // may still cancel.
  if (code == CN_COMMAND && IsPrintCommand(id)) {
    OnFilePrint(id == ID_FILE_PRINT_DIRECT);
    return TRUE;
  }
  return CWnd::OnCmdMsg(id, code, cmdUI);
}

}  // namespace fw
