// The selection count read from the host's object table, the action that ignores it, and
// the version number.
#include "runtime/errors.h"
#include "runtime/routines.h"
#include "tests/support/test_host.h"

#include <gtest/gtest.h>

#include <array>
#include <cstring>
#include <vector>

namespace morvex::tests {
namespace {

using namespace morvex::runtime;

// A host object table of six entries, laid out as the host keeps it:
//   0: record 1 (7 selected)   1: record 3 (-2 selected)  2: no object
//   3: record 2 (42 selected)  4: a record number of 0    5: no record array
struct SelectionTable : ::testing::Test {
  TestHost host;
  RunObject &object = host.create();
  std::vector<std::uint8_t> records = std::vector<std::uint8_t>(3 * host::kSelectionRecordSize);
  std::array<host::HostObject, 5> objects{};
  std::array<host::ObjectTableEntry, 6> table{};

  void SetUp() override {
    const std::int32_t counts[] = {7, 42, -2};
    for (std::size_t k = 0; k < 3; ++k) {
      // Records are 114 bytes long, so the counts sit at unaligned addresses.
      std::memcpy(&records[k * host::kSelectionRecordSize + host::kSelectedCountOffset], &counts[k],
                  sizeof counts[k]);
    }
    const std::int16_t numbers[] = {1, 3, 2, 0, 1};
    for (std::size_t i = 0; i < objects.size(); ++i) {
      objects[i].selectionIndex = numbers[i];
      objects[i].selectionRecords = records.data();
    }
    objects[4].selectionRecords = nullptr;
    table = {{{&objects[0], 0},
              {&objects[1], 0},
              {nullptr, 0},
              {&objects[2], 0},
              {&objects[3], 0},
              {&objects[4], 0}}};
    host.runHeader().objectCount = static_cast<std::int32_t>(table.size());
    host.runHeader().objectTable = table.data();
  }

  Result count(HostWord number) {
    return host.eval(object, countSelected, {static_cast<std::int32_t>(number)});
  }
};

TEST_F(SelectionTable, ReadsTheCountOfAnEntrysRecord) {
  EXPECT_EQ(count(0).integer(), 7);
  EXPECT_EQ(count(1).integer(), -2);
  EXPECT_EQ(count(3).integer(), 42);
  EXPECT_EQ(count(3).flags, 0);
  EXPECT_EQ(object.expressionErrorCode, 0);
}

TEST_F(SelectionTable, GivesZeroForEntriesWithoutAnObjectOrRecord) {
  EXPECT_EQ(count(2).integer(), 0);
  EXPECT_EQ(count(4).integer(), 0);
  EXPECT_EQ(count(5).integer(), 0); // the last entry, count - 1
  host.runHeader().objectTable = nullptr;
  EXPECT_EQ(count(0).integer(), 0);
  EXPECT_EQ(object.expressionErrorCode, 0);
}

TEST_F(SelectionTable, RefusesNumbersOutsideTheTableWithError15) {
  for (const HostWord number : {HostWord{-1}, HostWord{6}, HostWord{32768}, HostWord{100}}) {
    object.expressionErrorCode = 0;
    const Result result = count(number);
    EXPECT_EQ(result.word, 0) << number;
    EXPECT_EQ(object.expressionErrorCode, kBadObjectNumber) << number;
  }
  EXPECT_EQ(host.raised(host::kOnError), 0);
  // A failing read leaves an earlier expression error in place until the next one.
  EXPECT_EQ(count(0).integer(), 7);
  EXPECT_EQ(object.expressionErrorCode, kBadObjectNumber);
}

TEST_F(SelectionTable, KeepsOnlyTheLowSixteenBitsOfTheNumber) {
  EXPECT_EQ(count(65539).integer(), 42);  // entry 3
  EXPECT_EQ(count(65536).integer(), 7);   // entry 0
  EXPECT_EQ(count(-65535).integer(), -2); // entry 1
  EXPECT_EQ(object.expressionErrorCode, 0);
  host.runHeader().objectCount = 0;
  EXPECT_EQ(count(0).integer(), 0);
  EXPECT_EQ(object.expressionErrorCode, kBadObjectNumber);
}

TEST(Selection, ObjectVersionIsOnePointZeroSixAsAFloat) {
  TestHost host;
  RunObject &object = host.create();
  const Result version = host.eval(object, objectVersion);
  EXPECT_EQ(version.flags, host::kFloatResult);
  EXPECT_EQ(static_cast<std::uint32_t>(version.word), 0x3F87AE14u);
}

} // namespace
} // namespace morvex::tests
