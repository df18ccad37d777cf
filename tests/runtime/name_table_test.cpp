// Finding a name among declared function or member names.
#include "runtime/name_table.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace morvex::tests {
namespace {

using namespace morvex::runtime;

std::vector<NameEntry> tableOf(const std::vector<std::string> &names) {
  std::vector<NameEntry> table(names.size());
  for (std::size_t i = 0; i < names.size(); ++i) {
    names[i].copy(table[i].text, sizeof table[i].text - 1);
    table[i].text[names[i].size()] = '\0';
  }
  return table;
}

TEST(LookupNameIndex, FindsTheFirstEntryEqualToTheLowerCasedName) {
  const std::vector<NameEntry> table =
      tableOf({"hp", "speed", "Jump", "speed", std::string(25, 'z')});
  const auto count = static_cast<std::int32_t>(table.size());
  EXPECT_EQ(lookupNameIndex(table.data(), count, "Speed"), 1);
  EXPECT_EQ(lookupNameIndex(table.data(), count, "SPEED"), 1);
  EXPECT_EQ(lookupNameIndex(table.data(), count, "hp"), 0);
  EXPECT_EQ(lookupNameIndex(table.data(), count, std::string(25, 'Z').c_str()), 4);
  // Entries are compared as stored: an upper-case entry is never matched.
  EXPECT_EQ(lookupNameIndex(table.data(), count, "Jump"), -1);
  EXPECT_EQ(lookupNameIndex(table.data(), count, "spee"), -1);
  EXPECT_EQ(lookupNameIndex(table.data(), count, "speedy"), -1);
  EXPECT_EQ(lookupNameIndex(table.data(), count, std::string(26, 'z').c_str()), -1);
  EXPECT_EQ(lookupNameIndex(table.data(), count, ""), -1);
  EXPECT_EQ(lookupNameIndex(table.data(), count, nullptr), -1);
  // Only the first `count` entries are looked at.
  EXPECT_EQ(lookupNameIndex(table.data(), 1, "speed"), -1);
  EXPECT_EQ(lookupNameIndex(table.data(), 0, "hp"), -1);
  EXPECT_EQ(lookupNameIndex(nullptr, 0, "hp"), -1);
}

} // namespace
} // namespace morvex::tests
