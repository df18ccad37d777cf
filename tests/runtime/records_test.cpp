// Instance and variable records: construction, lower-cased names and assignment.
#include "runtime/records.h"

#include <gtest/gtest.h>

namespace morvex::tests {
namespace {

using namespace morvex::runtime;

TEST(Records, LowerCaseOnlyTheLettersAToZ) {
  EXPECT_EQ(lowerCased("AbC-Z[@]"), "abc-z[@]");
  EXPECT_EQ(lowerCased("\xC4\xD6x"), "\xC4\xD6x"); // bytes above ASCII stay
  EXPECT_EQ(lowerCased(nullptr), "");
}

TEST(Records, InstancesStartWithOneEmptyValuePerMember) {
  const InstanceRecord ship("MyShip", 3);
  EXPECT_EQ(ship.name, "myship");
  ASSERT_EQ(ship.valueCount(), 3);
  EXPECT_EQ(ship.values[2].stringValue, "");
  EXPECT_EQ(InstanceRecord("x", -4).valueCount(), 0);
}

TEST(Records, InstanceAssignmentTakesValuesAndKeepsIdentity) {
  InstanceRecord target("target", 1);
  target.instanceBusy = 1;
  InstanceRecord neighbour("n", 0);
  target.next = target.prev = &neighbour;
  target.values[0].stringValue = "old";

  InstanceRecord source("source", 3);
  source.values[2] = {4, 2.5f, "four"};
  target.assign(source);
  EXPECT_EQ(target.name, "target");
  EXPECT_EQ(target.instanceBusy, 1);
  EXPECT_EQ(target.next, &neighbour);
  EXPECT_EQ(target.prev, &neighbour);
  ASSERT_EQ(target.valueCount(), 3);
  EXPECT_EQ(target.values[0].stringValue, "");
  EXPECT_EQ(target.values[2].intValue, 4);
  EXPECT_EQ(target.values[2].floatValue, 2.5f);
  // The strings are the target's own copies.
  source.values[2].stringValue = "changed";
  EXPECT_EQ(target.values[2].stringValue, "four");

  target.assign(InstanceRecord("none", 0));
  EXPECT_EQ(target.valueCount(), 0);
  target.assign(target);
  EXPECT_EQ(target.valueCount(), 0);
}

TEST(Records, VariableAssignmentTakesTheValueAndKeepsNameAndLinks) {
  VariableRecord target("Score");
  EXPECT_EQ(target.name, "score");
  VariableRecord neighbour("n");
  target.next = &neighbour;
  VariableRecord source("other");
  source.value = {-3, 1.5f, "text"};
  target.assign(source);
  EXPECT_EQ(target.name, "score");
  EXPECT_EQ(target.next, &neighbour);
  EXPECT_EQ(target.value.intValue, -3);
  EXPECT_EQ(target.value.floatValue, 1.5f);
  source.value.stringValue = "changed";
  EXPECT_EQ(target.value.stringValue, "text");
  EXPECT_EQ(VariableRecord(nullptr).name, "");
}

} // namespace
} // namespace morvex::tests
