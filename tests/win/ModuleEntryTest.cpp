// The module's entry point as the host drives it: start-up, drawings, calls, other messages.
#include "ModuleHarness.h"

#include <gtest/gtest.h>

namespace {

TEST(ModuleEntry, LoadingDeclaresTheModuleUnloadableAndMdiAwareAndRegistersTheDataManager) {
  {
    LoadedModule module;
    ASSERT_EQ(module.LoadResult(), kDevhostLoaded);
    EXPECT_TRUE(devhostModuleUnlocked());
    EXPECT_TRUE(devhostModuleMdiAware());
    EXPECT_EQ(devhostReactorCount(), 1);
  }
  EXPECT_EQ(devhostReactorCount(), 0) << "the data manager leaves with the module";
}

TEST(ModuleEntry, TheFunctionIsDefinedInEachDrawingAndUndefinedWhenOneCloses) {
  LoadedModule module(2);
  ASSERT_EQ(module.LoadResult(), kDevhostLoaded);
  EXPECT_TRUE(devhostIsDefined(0, L"Lumvex"));
  EXPECT_TRUE(devhostIsDefined(1, L"LUMVEX"));

  const int third = devhostOpenDrawing();
  EXPECT_TRUE(devhostIsDefined(third, L"Lumvex")) << "a drawing opened later gets it too";

  devhostCloseDrawing(0);
  ASSERT_EQ(devhostDrawingCount(), 2);
  EXPECT_TRUE(devhostIsDefined(0, L"Lumvex"));
  EXPECT_TRUE(devhostIsDefined(1, L"Lumvex"));
}

TEST(ModuleEntry, UnloadMessageLeavesOpenDrawingsUntilTheirOwnUnload) {
  LoadedModule module(2);
  EXPECT_EQ(devhostSendEntryMessage(kUnloadAppMsg), kRetOK);
  EXPECT_TRUE(devhostIsDefined(0, L"Lumvex"));
  EXPECT_TRUE(devhostIsDefined(1, L"Lumvex"));
  devhostActivateDrawing(1);
  EXPECT_EQ(devhostSendEntryMessage(kUnloadDwgMsg), kRetOK);
  EXPECT_TRUE(devhostIsDefined(0, L"Lumvex"));
  EXPECT_FALSE(devhostIsDefined(1, L"Lumvex"));
}

TEST(ModuleEntry, OtherMessagesAreAnsweredWithoutAction) {
  LoadedModule module(1);
  for (int code : {0, 6, 7, 8, 9, 10, 20, 99, -1}) {
    EXPECT_EQ(devhostSendEntryMessage(code), kRetOK) << code;
  }
  EXPECT_TRUE(HostEvents().empty());
  EXPECT_TRUE(devhostIsDefined(0, L"Lumvex"));
}

TEST(ModuleEntry, FunctionCodeZeroRunsTheBrowseCallCodesOutsideTheTableRunNothingAndLeaveAVoidResult) {
  LoadedModule module;
  for (int code : {-1, 1, 2, 1000}) {
    EXPECT_TRUE(devhostInvokeCode(code, nullptr));
    EXPECT_EQ(devhostResultKind(), RTNONE) << "code " << code << ": the module set a void result first";
  }
  EXPECT_TRUE(HostEvents().empty());
  EXPECT_TRUE(devhostInvokeCode(0, nullptr));
  EXPECT_EQ(HostEvents(), (std::vector<HostEvent>{Printed(L"\nMissing parametrs\n"), Alerted(L"\nMissing parametrs\n")}));
}

TEST(ModuleEntry, CallsGoOnlyToDrawingsThatDefinedTheFunction) {
  LoadedModule module(2);
  devhostActivateDrawing(0);
  devhostSendEntryMessage(kUnloadDwgMsg);
  EXPECT_FALSE(devhostInvoke(L"Lumvex", nullptr));
  devhostActivateDrawing(1);
  EXPECT_TRUE(devhostInvoke(L"lumvex", nullptr));
}

}  // namespace
