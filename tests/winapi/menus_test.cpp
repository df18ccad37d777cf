// The stand-in menus: building, querying and destroying them, loading them from a
// module's templates, and refusing handles that are not live menus.
#include "winapi/resources.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>
#include <string>

namespace morvex::tests {
namespace {

std::string textAt(HMENU menu, UINT item, UINT flags) {
  char text[64] = {};
  GetMenuStringA(menu, item, text, sizeof text, flags);
  return text;
}

TEST(StandInMenus, ItemsAnswerTheirCommandsTextsAndStates) {
  HMENU menu = CreatePopupMenu();
  HMENU inner = CreatePopupMenu();
  ASSERT_TRUE(AppendMenuA(inner, MF_STRING, 7, "Seven"));
  ASSERT_TRUE(AppendMenuA(inner, MF_STRING | MF_CHECKED, 8, "Eight"));
  ASSERT_TRUE(AppendMenuA(menu, MF_STRING | MF_GRAYED, 5, "Five"));
  ASSERT_TRUE(AppendMenuA(menu, MF_SEPARATOR, 0, nullptr));
  ASSERT_TRUE(AppendMenuA(menu, MF_POPUP, reinterpret_cast<UINT_PTR>(inner), "Inner"));

  EXPECT_EQ(GetMenuItemCount(menu), 3);
  EXPECT_EQ(GetMenuItemID(menu, 0), 5u);
  EXPECT_EQ(GetMenuItemID(menu, 1), 0u);                    // separator
  EXPECT_EQ(GetMenuItemID(menu, 2), static_cast<UINT>(-1)); // pop-up
  EXPECT_EQ(GetMenuItemID(menu, 3), static_cast<UINT>(-1)); // no item
  EXPECT_EQ(GetSubMenu(menu, 2), inner);
  EXPECT_EQ(GetSubMenu(menu, 0), nullptr);

  EXPECT_EQ(GetMenuState(menu, 0, MF_BYPOSITION), UINT{MF_GRAYED});
  EXPECT_EQ(GetMenuState(menu, 1, MF_BYPOSITION), UINT{MF_SEPARATOR});
  EXPECT_EQ(GetMenuState(menu, 2, MF_BYPOSITION), UINT{(2u << 8) | MF_POPUP}); // item count above
  EXPECT_EQ(GetMenuState(menu, 8, MF_BYCOMMAND), UINT{MF_CHECKED}); // found in the pop-up
  EXPECT_EQ(GetMenuState(menu, 9, MF_BYCOMMAND), static_cast<UINT>(-1));

  EXPECT_EQ(textAt(menu, 2, MF_BYPOSITION), "Inner");
  EXPECT_EQ(textAt(menu, 7, MF_BYCOMMAND), "Seven");
  EXPECT_EQ(textAt(menu, 1, MF_BYPOSITION), "");
  EXPECT_EQ(textAt(menu, 99, MF_BYCOMMAND), "");
  EXPECT_EQ(GetMenuStringA(menu, 7, nullptr, 0, MF_BYCOMMAND), 5); // the length alone

  char small[3] = {'a', 'b', 'c'};
  EXPECT_EQ(GetMenuStringA(menu, 0, small, 3, MF_BYPOSITION), 2);
  EXPECT_STREQ(small, "Fi");

  EXPECT_TRUE(DestroyMenu(menu)); // takes the pop-up with it
  EXPECT_EQ(GetMenuItemCount(inner), -1);
}

TEST(StandInMenus, HandlesThatAreNotLiveMenusAreRefused) {
  HMENU menu = CreatePopupMenu();
  HMENU inner = CreatePopupMenu();
  ASSERT_TRUE(AppendMenuA(menu, MF_POPUP, reinterpret_cast<UINT_PTR>(inner), "Inner"));

  EXPECT_FALSE(DestroyMenu(inner)); // owned by `menu`
  EXPECT_FALSE(
      AppendMenuA(menu, MF_POPUP, reinterpret_cast<UINT_PTR>(inner), "Again")); // already placed
  EXPECT_FALSE(
      AppendMenuA(inner, MF_POPUP, reinterpret_cast<UINT_PTR>(menu), "Loop")); // its own parent
  EXPECT_FALSE(AppendMenuA(menu, MF_POPUP, reinterpret_cast<UINT_PTR>(menu), "Self"));
  EXPECT_EQ(GetMenuItemCount(menu), 1);

  EXPECT_TRUE(DestroyMenu(menu));
  EXPECT_FALSE(DestroyMenu(menu)); // already gone
  EXPECT_FALSE(AppendMenuA(menu, MF_STRING, 1, "Late"));
  EXPECT_EQ(GetMenuItemCount(nullptr), -1);
  EXPECT_EQ(GetMenuState(menu, 0, MF_BYPOSITION), static_cast<UINT>(-1));
  EXPECT_EQ(GetMenuStringA(menu, 0, nullptr, 0, MF_BYPOSITION), 0);
}

constexpr winapi::MenuItemTemplate kInner[] = {{MF_GRAYED, 11, "Eleven", nullptr, 0}};
constexpr winapi::MenuItemTemplate kBar[] = {
    {MF_POPUP, 0, "File", kInner, std::size(kInner)},
    {MF_SEPARATOR, 0, nullptr, nullptr, 0},
    {0, 12, "Twelve", nullptr, 0},
};
constexpr winapi::MenuTemplate kMenus[] = {{300, kBar, std::size(kBar)}};
constexpr winapi::StringResource kStrings[] = {{1, "One"}, {2, "Twenty-two"}};
HINSTANCE__ testModule{{kStrings, std::size(kStrings), kMenus, std::size(kMenus), nullptr, 0}};

// (Loading the templates is shown through the editor's menus in editor_tests.)
TEST(StandInMenus, OnlyNumberedMenusOfALiveModuleLoad) {
  HMENU menu = LoadMenuA(&testModule, MAKEINTRESOURCEA(300));
  EXPECT_EQ(GetMenuItemCount(menu), 3);
  EXPECT_TRUE(DestroyMenu(menu));
  EXPECT_EQ(LoadMenuA(&testModule, MAKEINTRESOURCEA(301)), nullptr);
  EXPECT_EQ(LoadMenuA(&testModule, "named"), nullptr);
  EXPECT_EQ(LoadMenuA(nullptr, MAKEINTRESOURCEA(300)), nullptr);
}

TEST(StandInStrings, CopiesWithinTheBufferSize) {
  char buffer[8];
  std::fill(std::begin(buffer), std::end(buffer), 'z');
  EXPECT_EQ(LoadStringA(&testModule, 2, buffer, 5), 4);
  EXPECT_STREQ(buffer, "Twen");
  EXPECT_EQ(buffer[5], 'z');
  EXPECT_EQ(LoadStringA(&testModule, 1, buffer, 8), 3);
  EXPECT_STREQ(buffer, "One");
  EXPECT_EQ(LoadStringA(&testModule, 3, buffer, 8), 0); // no such string: empty
  EXPECT_STREQ(buffer, "");

  buffer[0] = 'z';
  EXPECT_EQ(LoadStringA(&testModule, 1, buffer, 0), 0); // no room: nothing written
  EXPECT_EQ(buffer[0], 'z');
  EXPECT_EQ(LoadStringA(nullptr, 1, buffer, 8), 0);
}

} // namespace
} // namespace morvex::tests
