// The application's side of the explorer: the frame resource it opens, the creation of the
// document and the explorer frame for a browse call, and what the browse call reads back.
#pragma once

#include "fw/WinApp.h"

#include <string>

namespace fw {
class CDialog;
}

class CMdiMixin : public fw::CWinApp {
 public:
  virtual bool SetFrameResource(UINT resourceId);
  // Creates the document and the frame owned by the dialog, disables the host's main window
  // and shows the frame where it was last, with the drawing of the last browse chosen when the
  // search finds it; false when the frame could not be made.
  virtual bool CreateExplorerFrame(fw::CDialog *dialog);

  std::string GetFolderPath() const;
  std::string GetFileName() const;
  // Makes the document's folder path end in "\" and returns it followed by the file name.
  std::string GetFullPath() const;
  void DeleteDocument();

 private:
  UINT m_nFrameResource = static_cast<UINT>(-1);
};
