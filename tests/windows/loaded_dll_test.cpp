// The 64-bit DLL loaded as a host loads it: entry points by ordinal, and the texts, menus
// and setup dialog that come from its own resources through the module handle it keeps.
#include "host/contract.h"
#include "tests/editor/edit_block.h"
#include "tests/host/export_table.h"
#include "tests/windows/host_window.h"
#include "tests/windows/test_files.h"
#include "tests/windows/win32_dialog_driver.h"

#include <windows.h>

#include <gtest/gtest.h>

#include <set>
#include <string>

namespace morvex::tests {
namespace {

using editor::NameListId;
using editor::SetupDialogDriver;

std::uint32_t MORVEX_CALL compatibleHost() {
  return 0x0200'0000u | 228u;
}

class LoadedDll : public ::testing::Test {
protected:
  static void SetUpTestSuite() { module = LoadLibraryA(fileFromEnvironment("MORVEX_DLL").c_str()); }
  static void TearDownTestSuite() {
    if (module != nullptr) {
      FreeLibrary(module);
      module = nullptr;
    }
  }
  void SetUp() override {
    ASSERT_NE(module, nullptr) << "LoadLibraryA failed: " << GetLastError();
    context.HostVersion = &compatibleHost;
    context.mainWindow = window.handle();
  }

  template <class Function>
  static Function entry(int ordinal) {
    return reinterpret_cast<Function>(
        reinterpret_cast<void *>(GetProcAddress(module, MAKEINTRESOURCEA(ordinal))));
  }

  static HMODULE module;
  HostWindow window;
  host::EditorContext context{};
};
HMODULE LoadedDll::module = nullptr;

TEST_F(LoadedDll, EveryEntryPointIsFoundByItsOrdinal) {
  std::set<FARPROC> distinct;
  for (const Export &entry : kExports) {
    const FARPROC byOrdinal = GetProcAddress(module, MAKEINTRESOURCEA(entry.ordinal));
    const FARPROC byName = GetProcAddress(module, std::string(entry.name).c_str());
    EXPECT_NE(byOrdinal, nullptr) << entry.ordinal;
    EXPECT_EQ(byOrdinal, byName) << entry.ordinal << " " << entry.name;
    distinct.insert(byOrdinal);
  }
  EXPECT_EQ(distinct.size(), kExports.size()); // no two ordinals share an entry point
}

TEST_F(LoadedDll, NoOtherOrdinalIsAssigned) {
  std::set<int> assigned;
  for (const Export &entry : kExports) {
    assigned.insert(entry.ordinal);
  }
  for (int ordinal = 1; ordinal < 512; ++ordinal) {
    if (!assigned.count(ordinal)) {
      EXPECT_EQ(GetProcAddress(module, MAKEINTRESOURCEA(ordinal)), nullptr) << ordinal;
    }
  }
}

TEST_F(LoadedDll, ObjectInformationIsLoadedFromTheDll) {
  char name[256] = {}, author[256] = {}, copyright[256] = {}, comment[1025] = {}, web[256] = {};
  entry<host::GetObjInfosFn>(36)(&context, nullptr, name, author, copyright, comment, web);
  EXPECT_STREQ(name, "Morvex Object");
  EXPECT_STREQ(comment, "Create your own objects within Zeltra.");
}

TEST_F(LoadedDll, EventMenusAndTextsComeFromTheDllsResources) {
  auto menu = static_cast<HMENU>(entry<host::GetMenuFn>(61)(&context, 0, 0)); // GetActionMenu
  ASSERT_NE(menu, nullptr);
  EXPECT_EQ(GetMenuItemCount(menu), 11);
  HMENU miscellaneous = GetSubMenu(menu, 10);
  ASSERT_NE(miscellaneous, nullptr);
  char text[80] = {};
  GetMenuStringA(miscellaneous, 0, text, sizeof text, MF_BYPOSITION);
  EXPECT_STREQ(text, "Count Selected Objects");
  EXPECT_EQ(GetMenuItemID(miscellaneous, 0), 25270u);
  EXPECT_TRUE(DestroyMenu(menu));

  char display[256] = {};
  entry<host::GetStringFn>(67)(&context, 9, display, sizeof display); // GetActionString
  EXPECT_STREQ(display, "Destroy Instance %0");
}

TEST_F(LoadedDll, CreateObjectShowsTheSetupDialogAndStoresWhatTheAuthorEntered) {
  EditBlock block(host::kMaxEditStructureSize);
  block.putU32(kSizeOffset, 68);
  block.putU32(kVersionOffset, 2);
  const auto createObject = entry<host::CreateObjectFn>(14);
  const std::intptr_t result = driveSetupDialog(
      window.handle(),
      [](SetupDialogDriver &dialog) {
        dialog.clickNew(NameListId::functions, {"Jump", true});
        dialog.clickNew(NameListId::members, {"Speed", true});
        dialog.toggle(editor::SetupOption::loopUntilReturn);
        dialog.clickOk();
      },
      [&] { return createObject(&context, 0, &block.edit()); });
  EXPECT_EQ(result, 0);
  EXPECT_EQ(block.functionNames(), (std::vector<std::string>{"jump"}));
  EXPECT_EQ(block.memberNames(), (std::vector<std::string>{"speed"}));
  EXPECT_EQ(block.bytes()[kLoopOffset], 1);
  EXPECT_EQ(block.u32(kSizeOffset), host::editStructureSize(1, 1));
}

TEST_F(LoadedDll, EditObjectCancelledLeavesTheBlockAlone) {
  EditBlock block = EditBlock::holding({"walk"}, {"hp"});
  const std::vector<unsigned char> before = block.snapshot();
  const auto editObject = entry<host::EditObjectFn>(18);
  const std::intptr_t result = driveSetupDialog(
      window.handle(),
      [](SetupDialogDriver &dialog) {
        dialog.select(NameListId::functions, 0);
        dialog.clickRemove(NameListId::functions);
        dialog.clickCancel();
      },
      [&] { return editObject(&context, 0, 0, &block.edit()); });
  EXPECT_EQ(result, 0);
  EXPECT_EQ(block.snapshot(), before);
}

} // namespace
} // namespace morvex::tests
