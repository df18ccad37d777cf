// How a menu resource is copied, shown on menu templates of a test module: state flags,
// long texts, items without a command, and resources that give no menu. Linux only: on
// Windows the module's resources are compiled in and cannot be swapped.
#include "editor/event_menus.h"
#include "tests/editor/editor_context.h"
#include "tests/editor/module_resources.h"

#include <gtest/gtest.h>

#if !defined(_WIN32)
#include "winapi/resources.h"

#include <iterator>
#include <string>

namespace morvex::tests {
namespace {

using editor::buildEventMenu;
using editor::EventKind;
using winapi::MenuItemTemplate;
using winapi::MenuTemplate;

const std::string kLongText(100, 'x');

constexpr MenuItemTemplate kInner[] = {
    {MF_GRAYED, 26030, "Inner grayed", nullptr, 0},
};
const MenuItemTemplate kItems[] = {
    {MF_GRAYED, 26000, "Grayed", nullptr, 0},
    {MF_CHECKED | MF_DISABLED, 26010, "Checked", nullptr, 0},
    {0, 26020, kLongText.c_str(), nullptr, 0},
    {0, 0, "No command", nullptr, 0},
    {MF_POPUP, 0, "Inner", kInner, std::size(kInner)},
};
const MenuItemTemplate kMenuBar[] = {{MF_POPUP, 0, "", kItems, std::size(kItems)}};
constexpr MenuItemTemplate kNoPopup[] = {{0, 26000, "Loose item", nullptr, 0}};

class MenuCopy : public ::testing::Test {
protected:
  void TearDown() override { useModuleResources(); }

  // Makes the condition menu resource hold `items`.
  void useConditionMenu(const MenuItemTemplate *items, std::size_t count) {
    menus[0] = {IDR_CONDITION_MENU, items, count};
    module.resources = {nullptr, 0, menus, std::size(menus), nullptr, 0};
    editor::setModuleHandle(&module);
  }

  MenuTemplate menus[1] = {};
  HINSTANCE__ module{};
  host::EditorContext context = scriptedContext();
};

TEST_F(MenuCopy, ItemsKeepTheirStateFlagsAndTextsAreCutAt79Characters) {
  useConditionMenu(kMenuBar, std::size(kMenuBar));
  HMENU menu = buildEventMenu(&context, EventKind::condition);
  ASSERT_NE(menu, nullptr);
  ASSERT_EQ(GetMenuItemCount(menu), 5);

  EXPECT_EQ(GetMenuState(menu, 0, MF_BYPOSITION), UINT{MF_GRAYED});
  EXPECT_EQ(GetMenuState(menu, 1, MF_BYPOSITION), UINT{MF_CHECKED | MF_DISABLED});
  EXPECT_EQ(GetMenuItemID(menu, 1), 26010u);

  char text[200] = {};
  EXPECT_EQ(GetMenuStringA(menu, 2, text, sizeof text, MF_BYPOSITION), 79);
  EXPECT_EQ(std::string(text), kLongText.substr(0, 79));

  // An item without a command becomes a separator; a sub-menu keeps its items' states.
  EXPECT_EQ(GetMenuState(menu, 3, MF_BYPOSITION) & MF_SEPARATOR, UINT{MF_SEPARATOR});
  HMENU inner = GetSubMenu(menu, 4);
  ASSERT_NE(inner, nullptr);
  EXPECT_EQ(GetMenuState(inner, 0, MF_BYPOSITION), UINT{MF_GRAYED});
  EXPECT_EQ(GetMenuItemID(inner, 0), 26030u);
  EXPECT_TRUE(DestroyMenu(menu));
}

TEST_F(MenuCopy, NoMenuWhenTheResourceIsMissingOrHoldsNoPopup) {
  useConditionMenu(kNoPopup, std::size(kNoPopup));
  EXPECT_EQ(buildEventMenu(&context, EventKind::condition), nullptr);
  EXPECT_EQ(buildEventMenu(&context, EventKind::action), nullptr); // not in the module
  editor::setModuleHandle(nullptr);
  EXPECT_EQ(buildEventMenu(&context, EventKind::condition), nullptr);
}

} // namespace
} // namespace morvex::tests

#endif
