// The event-information tables: lookups by code and by menu command, and the layout of the
// records the host reads. (Every record's types, prompts and result type are listed through
// the library by the emulator's menus test.)
#include "editor/event_infos.h"

#include <gtest/gtest.h>

#include <vector>

namespace morvex::tests {
namespace {

using editor::EventKind;
using editor::findCode;
using editor::findRecord;

constexpr EventKind kKinds[] = {EventKind::condition, EventKind::action, EventKind::expression};

// The fields the host reads from a record's code field on.
std::vector<std::uint16_t> hostFields(EventKind kind, int code) {
  const auto record = findRecord(kind, code);
  if (!record) {
    return {};
  }
  const std::uint16_t *fields = record->hostView();
  return std::vector<std::uint16_t>(fields, fields + 3 + 2 * record->parameterCount());
}

TEST(EventInfos, MenuCommandsGiveTheirCodesAndNothingElseDoes) {
  EXPECT_EQ(findCode(EventKind::action, 25270), 27);
  EXPECT_EQ(findCode(EventKind::action, 25275), -1);
  EXPECT_EQ(findCode(EventKind::action, 26000), -1); // a condition's command
  EXPECT_EQ(findCode(EventKind::action, 25280), -1); // just past the last action
  EXPECT_EQ(findCode(EventKind::condition, 26030), 3);
  EXPECT_EQ(findCode(EventKind::condition, 26040), -1);
  EXPECT_EQ(findCode(EventKind::expression, 27240), 24);
  EXPECT_EQ(findCode(EventKind::expression, 0), -1);
  EXPECT_EQ(findCode(EventKind::expression, 0xFFFF), -1);
}

TEST(EventInfos, EveryCodeRoundTripsThroughItsMenuCommand) {
  for (const EventKind kind : kKinds) {
    const auto table = editor::eventTable(kind);
    for (int code = 0; code < table.recordCount; ++code) {
      const auto record = findRecord(kind, code);
      ASSERT_TRUE(record) << code;
      EXPECT_EQ(record->code(), code);
      EXPECT_EQ(findCode(kind, record->menuCommand()), code);
      EXPECT_EQ(record->displayString(), table.stringBase + 10 * code);
    }
  }
}

TEST(EventInfos, CodesOutsideTheTablesHaveNoRecord) {
  for (const EventKind kind : kKinds) {
    const int count = editor::eventTable(kind).recordCount;
    for (const int code : {-1, count, count + 1, 0xFFFF}) {
      EXPECT_FALSE(findRecord(kind, code)) << code;
    }
  }
}

TEST(EventInfos, RecordsGiveCodeFlagsCountTypesAndPrompts) {
  EXPECT_EQ(hostFields(EventKind::expression, 0), (std::vector<std::uint16_t>{0, 0, 1, 1, 0}));
  EXPECT_EQ(hostFields(EventKind::expression, 23), (std::vector<std::uint16_t>{23, 2, 0}));
  // On Function: one string expression, prompted for the function name.
  EXPECT_EQ(hostFields(EventKind::condition, 0), (std::vector<std::uint16_t>{0, 0, 1, 45, 24001}));
  // Call Function ... for Instance: S S S N N.
  EXPECT_EQ(
      hostFields(EventKind::action, 0),
      (std::vector<std::uint16_t>{0, 0, 5, 45, 45, 45, 22, 22, 24000, 24001, 24006, 24007, 24008}));
}

} // namespace
} // namespace morvex::tests
