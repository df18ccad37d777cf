// The stored edit structure: names as the setup dialog keeps them, in its list box's
// order, and the layout the run time reads.
#include "emulator/edit_structure.h"

#include "host/contract.h"

#include <gtest/gtest.h>

#include <cstring>

namespace morvex::tests {
namespace {

using emulator::ObjectSetup;

std::string entry(const std::vector<std::uint8_t> &block, std::size_t index) {
  const char *text = reinterpret_cast<const char *>(block.data()) + host::kEditHeadSize +
                     index * host::kNameEntrySize;
  return std::string(text, strnlen(text, host::kNameEntrySize));
}

const host::EditStructure &header(const std::vector<std::uint8_t> &block) {
  return *reinterpret_cast<const host::EditStructure *>(block.data());
}

// (Lower-casing and the cut at 25 characters are played by the sheet setup.)
TEST(StoredList, SortsAsTheListBoxDoesAndLowerCasesOnlyAToZ) {
  // Other signs before digits before letters before bytes above 127; shorter first.
  EXPECT_EQ(emulator::storedList({"b", "\xE9t\xE9", "1a", "_x", "ab", "a"}),
            (std::vector<std::string>{"_x", "1a", "a", "ab", "b", "\xE9t\xE9"}));
  EXPECT_EQ(emulator::storedList({"Same", "same"}), (std::vector<std::string>{"same", "same"}));
  EXPECT_EQ(emulator::storedName("\xC4pfel"), "\xC4pfel");
}

TEST(BuildEditStructure, WritesTheBlockTheSetupDialogWouldLeave) {
  ObjectSetup object;
  object.functions = {"Zeta", "alpha", "Mid"};
  object.members = {"Speed", "hp"};
  object.verify = true;
  const std::vector<std::uint8_t> block = emulator::buildEditStructure(object);
  ASSERT_EQ(block.size(), host::kMaxEditStructureSize) << "room for 500 + 500 names";
  const host::EditStructure &edit = header(block);
  EXPECT_EQ(edit.size, 172u);
  EXPECT_EQ(edit.version, 2u);
  EXPECT_EQ(edit.width, 32);
  EXPECT_EQ(edit.height, 32);
  EXPECT_EQ(edit.verifyFunctionNames, 1);
  EXPECT_EQ(edit.loopUntilReturn, 0);
  EXPECT_EQ(edit.functionCount, 3);
  EXPECT_EQ(edit.memberCount, 2);
  EXPECT_EQ(entry(block, 0), "alpha");
  EXPECT_EQ(entry(block, 1), "mid");
  EXPECT_EQ(entry(block, 2), "zeta");
  EXPECT_EQ(std::string(reinterpret_cast<const char *>(block.data()) + 118), "hp");
  EXPECT_EQ(entry(block, 4), "speed");
}

TEST(BuildEditStructure, StoresAnEmptyObjectAndTheLoopOptionAndAFullLongName) {
  ObjectSetup object;
  object.loop = true;
  const std::vector<std::uint8_t> empty = emulator::buildEditStructure(object);
  EXPECT_EQ(header(empty).size, 42u);
  EXPECT_EQ(header(empty).functionCount, 0);
  EXPECT_EQ(header(empty).memberCount, 0);
  EXPECT_EQ(header(empty).verifyFunctionNames, 0);
  EXPECT_EQ(header(empty).loopUntilReturn, 1);

  object.functions = {std::string(30, 'Q')};
  const std::vector<std::uint8_t> block = emulator::buildEditStructure(object);
  EXPECT_EQ(entry(block, 0), std::string(25, 'q'));
  EXPECT_EQ(block[host::kEditHeadSize + 25], 0);
}

} // namespace
} // namespace morvex::tests
