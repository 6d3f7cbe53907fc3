#include "explorer/ShellAttributes.h"

ULONG ShellAttributes(IShellFolder *parent, LPCITEMIDLIST child, ULONG wanted) {
  ULONG attributes = wanted;
  if (!parent || FAILED(parent->GetAttributesOf(1, &child, &attributes))) return 0;
  return attributes & wanted;
}

int ChildrenButton(IShellFolder *parent, LPCITEMIDLIST child, bool listNonFolders) {
  // Removable media is asked for, not only looked for: a shell reports only what is asked.
  const ULONG attributes = ShellAttributes(parent, child, SFGAO_FOLDER | SFGAO_REMOVABLE);
  if (!(attributes & SFGAO_FOLDER)) return 0;
  if (listNonFolders || (attributes & SFGAO_REMOVABLE)) return 1;
  return (ShellAttributes(parent, child, SFGAO_HASSUBFOLDER) & SFGAO_HASSUBFOLDER) ? 1 : 0;
}
