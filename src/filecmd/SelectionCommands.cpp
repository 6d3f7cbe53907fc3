#include "filecmd/SelectionCommands.h"

#include "filecmd/FileListBlock.h"
#include "filecmd/ForFileCommands.h"
#include "filecmd/MarkedPaths.h"
#include "filecmd/ShellFileOp.h"
#include "fw/OleDataSource.h"
#include "fw/SharedFile.h"

bool CopySelected(const DwgCatalogue &catalogue, const std::string &folder) {
  const std::string block = EncodeFileList(MarkedPaths(catalogue, folder));
  fw::CSharedFile file;
  if (!file.Write(block.data(), block.size())) return false;
  fw::COleDataSource source;
  source.CacheGlobalData(CF_HDROP, file.Detach());
  return source.SetClipboard();
}

int DeleteSelected(const DwgCatalogue &catalogue, const std::string &folder) {
  CShellFileOp operation;
  for (const std::string &path : MarkedPaths(catalogue, folder)) operation.AddFile(0, path.c_str());
  return operation.DeleteFiles();
}

bool PasteFiles(const std::string &folder) { return ForFileCommands().Paste(folder); }
