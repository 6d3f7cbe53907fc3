// Delete to the recycle bin and rename, through the real shell: its confirmation is answered
// by a watcher that finds the dialog and presses a button, as a person would.
#include "DialogAnswerer.h"
#include "ScratchFolder.h"
#include "filecmd/ForFileCommands.h"
#include "filecmd/SelectionCommands.h"
#include "filecmd/ShellFileOp.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

namespace {
namespace fs = std::filesystem;

constexpr int kYes = 6;
constexpr int kNo = 7;

DwgCatalogue Catalogue(std::initializer_list<const char *> names) {
  DwgCatalogue catalogue;
  for (const char *name : names) catalogue.Add(DwgData(name, 0, 0));
  return catalogue;
}

TEST(FileCommandDelete, ConfirmedDeleteMovesTheMarkedDrawingToTheTrash) {
  ScratchFolder folder("filecmd");
  const std::string name = "gone-" + std::to_string(GetTickCount64()) + ".dwg";
  folder.File(name, "drawing");
  folder.File("kept.dwg", "other");
  DwgCatalogue catalogue = Catalogue({"kept.dwg", name.c_str()});
  catalogue[1].Select();

  DialogAnswerer yes(kYes);
  EXPECT_EQ(DeleteSelected(catalogue, folder.Path()), 0);
  EXPECT_EQ(yes.Caption(), "Confirm file deletion");
  EXPECT_FALSE(fs::exists(folder.File(name)));
  EXPECT_TRUE(fs::exists(folder.File("kept.dwg")));
  EXPECT_TRUE(fs::exists(TrashFiles() / name)) << (TrashFiles() / name).string();
  EXPECT_EQ(Content((TrashFiles() / name).string()), "drawing");
  RemoveFromTrash(name);
}

TEST(FileCommandDelete, AnsweringNoKeepsTheFileAndSetsTheAbortedFlag) {
  ScratchFolder folder("filecmd");
  const std::string path = folder.File("plan.dwg", "plan");
  CShellFileOp operation;
  operation.AddFile(0, path.c_str());
  DialogAnswerer no(kNo);
  EXPECT_EQ(operation.DeleteFiles(), 0);
  EXPECT_EQ(no.Caption(), "Confirm file deletion");
  EXPECT_TRUE(operation.AnyOperationsAborted());
  EXPECT_EQ(Content(path), "plan");
}

TEST(FileCommandDelete, NothingMarkedDeletesNothingAndAsksNothing) {
  ScratchFolder folder("filecmd");
  folder.File("a.dwg", "a");
  const DwgCatalogue catalogue = Catalogue({"a.dwg"});
  DialogAnswerer yes(kYes);
  EXPECT_NE(DeleteSelected(catalogue, folder.Path() + "\\"), 0);
  EXPECT_EQ(yes.Caption(), "");
  EXPECT_TRUE(fs::exists(folder.File("a.dwg")));
}

TEST(FileCommandRename, ToAFreeNameMovesTheFileOntoATakenNameIsRefusedAndLosesNothing) {
  ScratchFolder folder("filecmd");
  const std::string from = folder.File("plan.dwg", "plan");
  const std::string taken = folder.File("site.dwg", "site");
  DialogAnswerer yes(kYes);
  EXPECT_NE(ForFileCommands().RenameFile(from.c_str(), taken.c_str(), nullptr), 0);
  EXPECT_EQ(yes.Caption(), "");
  EXPECT_EQ(Content(from), "plan");
  EXPECT_EQ(Content(taken), "site");

  const std::string to = folder.File("plan2.dwg");
  EXPECT_EQ(ForFileCommands().RenameFile(from.c_str(), to.c_str(), nullptr), 0);
  EXPECT_FALSE(fs::exists(from));
  EXPECT_EQ(Content(to), "plan");
}
}  // namespace
