// Printing the active view through its frame (Ctrl+P and the view's print commands): the print
// dialog answered by a watcher, then one page drawn by the view's OnDraw into a printer document. The printer is Wine's PostScript
// driver writing to a file, installed for this test only.
#include "DialogAnswerer.h"
#include "ScratchFolder.h"
#include "fw/FrameWnd.h"
#include "fw/View.h"

#include <gtest/gtest.h>
#include <winspool.h>

#include <string>

namespace {
constexpr UINT kPrint = 57607;
constexpr UINT kPrintDirect = 57608;
constexpr UINT kPrintPreview = 57609;
constexpr char kPrinter[] = "Lumvex test printer";

class DrawingView : public fw::CView {
 public:
  void OnDraw(HDC dc) override {
    if (GetDeviceCaps(dc, TECHNOLOGY) == DT_RASPRINTER) ++printedPages;
  }
  int printedPages = 0;
};

// A frame with one view, made the active view, as the explorer's panes are.
class PrintTest : public ::testing::Test {
 protected:
  void SetUp() override {
    frame = new fw::CFrameWnd;  // deletes itself with its window
    ASSERT_TRUE(frame->LoadFrame(1, WS_OVERLAPPEDWINDOW | WS_VISIBLE, nullptr));
    frame->SetWindowText("C:\\Drawings");
    ASSERT_TRUE(view.Create(nullptr, "", WS_VISIBLE, RECT{0, 0, 200, 200}, frame, AFX_IDW_PANE_FIRST));
    frame->SetActiveView(&view);
  }
  void TearDown() override { frame->DestroyWindow(); }

  // Runs the command through the frame; the watcher presses OK in the dialog that shows and
  // gives back its caption (empty when none showed).
  std::string Command(UINT id) {
    DialogAnswerer ok(IDOK);
    frame->SendMessage(WM_COMMAND, id);
    return ok.Caption();
  }

  fw::CFrameWnd *frame = nullptr;
  DrawingView view;
};

// The test printer, the default printer while it exists, printing into a file.
class TestPrinter {
 public:
  explicit TestPrinter(const std::string &output) {
    Remove();
    DRIVER_INFO_3A driver{};
    driver.cVersion = 3;
    driver.pName = const_cast<char *>("Wine PostScript Driver");
    driver.pDriverPath = driver.pDataFile = driver.pConfigFile = const_cast<char *>("wineps.drv");
    AddPrinterDriverExA(nullptr, 3, reinterpret_cast<BYTE *>(&driver), APD_COPY_NEW_FILES);
    PRINTER_INFO_2A info{};
    info.pPrinterName = const_cast<char *>(kPrinter);
    info.pPortName = const_cast<char *>(output.c_str());
    info.pDriverName = driver.pName;
    info.pPrintProcessor = const_cast<char *>("WinPrint");
    info.pDatatype = const_cast<char *>("RAW");
    if (HANDLE printer = AddPrinterA(nullptr, 2, reinterpret_cast<BYTE *>(&info))) ClosePrinter(printer);
    SetDefaultPrinterA(kPrinter);
  }
  ~TestPrinter() { Remove(); }
  TestPrinter(const TestPrinter &) = delete;
  TestPrinter &operator=(const TestPrinter &) = delete;

 private:
  static void Remove() {
    HANDLE printer = nullptr;
    if (!OpenPrinterA(const_cast<char *>(kPrinter), &printer, nullptr)) return;
    DeletePrinter(printer);
    ClosePrinter(printer);
  }
};

// Wine's printer ports are Unix paths.
std::string UnixPath(const std::string &path) {
  using Convert = char *(CDECL *)(LPCWSTR);
  const auto convert = reinterpret_cast<Convert>(
      reinterpret_cast<void *>(GetProcAddress(GetModuleHandleA("kernel32"), "wine_get_unix_file_name")));
  const std::wstring wide(path.begin(), path.end());
  char *unixPath = convert ? convert(wide.c_str()) : nullptr;
  const std::string result = unixPath ? unixPath : "";
  HeapFree(GetProcessHeap(), 0, unixPath);
  return result;
}

TEST_F(PrintTest, EachPrintCommandPrintsTheViewOnOnePageOfOneDocument) {
  ScratchFolder scratch("print");
  struct Row {
    UINT id;
    bool dialog;
  };
  for (const Row &row : {Row{kPrint, true}, Row{kPrintDirect, false}, Row{kPrintPreview, true}}) {
    const std::string output = scratch.File("page-" + std::to_string(row.id) + ".ps");
    TestPrinter printer(UnixPath(output));
    const int before = view.printedPages;
    EXPECT_EQ(Command(row.id), row.dialog ? "Print" : "") << row.id;
    EXPECT_EQ(view.printedPages, before + 1) << row.id;
    const std::string postScript = Content(output);
    EXPECT_NE(postScript.find("%%Title: C:\\Drawings"), std::string::npos) << row.id << " names the document after the frame";
    EXPECT_NE(postScript.find("%%Pages: 1\n%%EOF"), std::string::npos) << row.id << ": one page, and the document ended";
  }
}
}  // namespace
