// The event menus the host is given: their structure as the module's menu resources hold
// it, the compatibility test in front of them, and how the copy treats unusual items.
#include "editor/event_menus.h"
#include "editor/event_texts.h"
#include "tests/editor/editor_context.h"
#include "tests/editor/module_resources.h"

#include <gtest/gtest.h>

#include <string>

namespace morvex::tests {
namespace {

using editor::buildEventMenu;
using editor::EventKind;

// A menu written out as "text#code" items separated by ";", a separator as "-" and a
// sub-menu as "text(items)". Codes come from the menu commands; "#?" marks a command no
// record has.
std::string describe(HMENU menu, EventKind kind) {
  std::string text;
  for (int position = 0; position < GetMenuItemCount(menu); ++position) {
    if (position > 0) {
      text += ';';
    }
    char label[editor::kMenuTextSize] = {};
    GetMenuStringA(menu, static_cast<UINT>(position), label, sizeof label, MF_BYPOSITION);
    if (HMENU inner = GetSubMenu(menu, position)) {
      text += std::string(label) + "(" + describe(inner, kind) + ")";
    } else if (GetMenuItemID(menu, position) == 0) {
      text += "-";
    } else {
      const int code = editor::findCode(kind, GetMenuItemID(menu, position));
      text += std::string(label) + "#" + (code < 0 ? "?" : std::to_string(code));
    }
  }
  return text;
}

class EventMenus : public ::testing::Test {
protected:
  void SetUp() override { useModuleResources(); }

  // The menu of `kind` described, or "none"; the menu is destroyed.
  std::string menuOf(EventKind kind, const host::EditorContext *editor) {
    HMENU menu = buildEventMenu(editor, kind);
    if (menu == nullptr) {
      return "none";
    }
    std::string text = describe(menu, kind);
    EXPECT_TRUE(DestroyMenu(menu)); // a top-level menu: the caller's to destroy
    return text;
  }

  host::EditorContext context = scriptedContext();
};

TEST_F(EventMenus, ConditionMenuHasItsItemsInOrderWithTheSeparator) {
  EXPECT_EQ(
      menuOf(EventKind::condition, &context),
      "On Creation of an Instance#2;On Function#0;On Destruction of an Instance#3;-;On Error#1");
}

TEST_F(EventMenus, ActionMenuHasItsSubMenusAndTheSeparatorInsideReturnsAndLoops) {
  EXPECT_EQ(
      menuOf(EventKind::action, &context),
      "Create Instance#8;Destroy Instance#9;Destroy All Instances#26;Set Default Instance#24;"
      "Specify an Instance(Call a Function#0;Set an Integer Variable#1;Set a Float Variable#2;"
      "Set a String Variable#3);"
      "Current Instance(Call a Function#4;Set an Integer Variable#5;Set a Float Variable#6;"
      "Set a String Variable#7);"
      "Returns and Loops(Return#10;Return an Integer#11;Return a Float#12;Return a String#13;-;"
      "Set Function to Loop#23);"
      "Global Variables(Create a Global Variable#14;Set an Integer Variable#15;"
      "Set a Float Variable#16;Set a String Variable#17);"
      "Local Variables(Create a Local Variable#18;Set an Integer Variable#19;"
      "Set a Float Variable#20;Set a String Variable#21);"
      "Errors(Generate an Error#25;Clear Expression Error Code#22);"
      "Miscellaneous(Count Selected Objects#27)");
}

TEST_F(EventMenus, ExpressionMenuOffersEveryExpressionButObjectVersion) {
  const std::string menu = menuOf(EventKind::expression, &context);
  EXPECT_EQ(menu,
            "Slot Data(Get an Integer from a Slot#0;Get a Float from a Slot#1;"
            "Get a String from a Slot#2);"
            "Specify an Instance(Get an Integer Variable#3;Get a Float Variable#4;"
            "Get a String Variable#5);"
            "Current Instance(Get Name of Instance#19;Get an Integer Variable#6;"
            "Get a Float Variable#7;Get a String Variable#8);"
            "Global Variables(Get an Integer Variable#9;Get a Float Variable#10;"
            "Get a String Variable#11);"
            "Local Variables(Get an Integer Variable#12;Get a Float Variable#13;"
            "Get a String Variable#14);"
            "Errors(Get Current Error Code#16;Get Current Expression Error Code#21);"
            "Miscellaneous(Get Loop Index of Current Function#15;"
            "Get Number of Parameters of Current Function#22;"
            "Get Return Type of Current Function#20;-;Format a String#17;Unformat a String#18;-;"
            "Get Number of Selected Objects#24)");
  EXPECT_EQ(menu.find("#23"), std::string::npos);
}

// Each item's text is what the titles answer for its record.
TEST_F(EventMenus, EveryItemTextIsItsRecordsTitle) {
  for (const EventKind kind : {EventKind::condition, EventKind::action, EventKind::expression}) {
    const auto table = editor::eventTable(kind);
    for (int code = 0; code < table.recordCount; ++code) {
      char title[editor::kMenuTextSize] = {};
      if (kind == EventKind::expression) {
        editor::loadExpressionTitle(code, title, sizeof title);
      } else {
        editor::loadParameterTitle(kind, code, 99, title, sizeof title);
      }
      const bool offered = !(kind == EventKind::expression && code == 23);
      EXPECT_EQ(title[0] != '\0', offered) << code;
      if (offered) {
        const std::string item = std::string(title) + "#" + std::to_string(code);
        EXPECT_NE(menuOf(kind, &context).find(item), std::string::npos) << item;
      }
    }
  }
}

TEST_F(EventMenus, IncompatibleHostsGetNoMenus) {
  constexpr std::uint32_t kVersion2 = 0x0200'0000u;
  for (const std::uint32_t word :
       {kVersion2 | 227u, 0x0100'0000u | 228u, kVersion2 | 0x8000u | 228u, 0xFFFF'F000u}) {
    host::EditorContext old = scriptedContext({word});
    EXPECT_EQ(menuOf(EventKind::condition, &old), "none") << std::hex << word;
    EXPECT_EQ(menuOf(EventKind::action, &old), "none") << std::hex << word;
    EXPECT_EQ(menuOf(EventKind::expression, &old), "none") << std::hex << word;
  }
  EXPECT_EQ(menuOf(EventKind::action, nullptr), "none");
  host::EditorContext withoutService{};
  EXPECT_EQ(menuOf(EventKind::action, &withoutService), "none");
}

// The word is asked for once for each of the three conditions, and each answer counts.
TEST_F(EventMenus, TheHostWordIsReadAfreshForEachCondition) {
  host::EditorContext good = scriptedContext();
  EXPECT_NE(menuOf(EventKind::condition, &good), "none");
  EXPECT_EQ(HostVersionScript::calls, 3);

  const std::uint32_t oldVersion = 0x0100'0000u | 228u;
  const std::uint32_t flagged = kGoodHostWord | 0x8000u;
  host::EditorContext changesToOld = scriptedContext({kGoodHostWord, oldVersion, kGoodHostWord});
  EXPECT_EQ(menuOf(EventKind::condition, &changesToOld), "none");
  host::EditorContext changesToFlagged = scriptedContext({kGoodHostWord, kGoodHostWord, flagged});
  EXPECT_EQ(menuOf(EventKind::condition, &changesToFlagged), "none");
}

// Each call gives a new menu: destroying one leaves the next intact.
TEST_F(EventMenus, EachCallGivesANewMenu) {
  HMENU first = buildEventMenu(&context, EventKind::condition);
  HMENU second = buildEventMenu(&context, EventKind::condition);
  EXPECT_TRUE(DestroyMenu(first));
  EXPECT_EQ(GetMenuItemCount(second), 5);
  EXPECT_TRUE(DestroyMenu(second));
}

} // namespace
} // namespace morvex::tests
