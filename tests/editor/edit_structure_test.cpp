// The edit structure's bytes: creation defaults, the stored layout of the lists, the
// conversion from version 1 (damaged blocks included) and the object's rectangle.
#include "editor/edit_structure.h"

#include "tests/editor/edit_block.h"

#include <gtest/gtest.h>
#include <windows.h>

#include <climits>
#include <string>
#include <vector>

namespace morvex::tests {
namespace {

using editor::EditSettings;

// A converted block, freed as the host frees it.
struct GlobalBlock {
  explicit GlobalBlock(void *block) : block(static_cast<unsigned char *>(block)) {}
  ~GlobalBlock() { GlobalFree(block); }
  GlobalBlock(const GlobalBlock &) = delete;
  GlobalBlock &operator=(const GlobalBlock &) = delete;

  std::uint32_t u32(std::size_t offset) const {
    std::uint32_t value = 0;
    std::memcpy(&value, block + offset, sizeof value);
    return value;
  }
  std::string name(std::size_t entry) const {
    const char *at = reinterpret_cast<const char *>(block + EditBlock::entryOffset(entry));
    return std::string(at, strnlen(at, host::kNameEntrySize));
  }

  unsigned char *block;
};

TEST(EditStructureCreation, SetsTheDefaultsAndLeavesEveryOtherByteAsTheHostWroteIt) {
  EditBlock block(host::editStructureSize(1, 0), 0xAB);
  block.putU32(kSizeOffset, 68);
  block.putU32(kVersionOffset, 2);
  std::vector<unsigned char> expected = block.snapshot();
  for (std::size_t offset : {20, 21, 22, 23, 25, 27, 28, 32, 33, 34, 35, 36, 37, 38, 39}) {
    expected[offset] = 0;
  }
  expected[24] = 32;
  expected[26] = 32;

  editor::writeCreationDefaults(block.edit());

  EXPECT_EQ(block.snapshot(), expected); // size, version, header, options, padding untouched
}

TEST(EditStructureRect, ExtendsTheGivenCornerByTheObjectsSize) {
  EditBlock block(host::editStructureSize(1, 0));
  editor::writeCreationDefaults(block.edit());
  host::Rect rect{10, 20, -1, -1};
  editor::getObjectRect(block.edit(), rect);
  EXPECT_EQ(rect.left, 10);
  EXPECT_EQ(rect.top, 20);
  EXPECT_EQ(rect.right, 42);
  EXPECT_EQ(rect.bottom, 52);

  // Past the largest coordinate the sum wraps as the host's own addition does.
  rect = {INT_MAX, INT_MIN, 0, 0};
  block.edit().height = -1;
  editor::getObjectRect(block.edit(), rect);
  EXPECT_EQ(rect.right, INT_MIN + 31);
  EXPECT_EQ(rect.bottom, INT_MAX);
}

TEST(EditStructureLists, WriteBackLaysOutCountsNamesAndSize) {
  EditBlock block(host::kMaxEditStructureSize, 0xCD);
  EditSettings settings;
  settings.verifyFunctionNames = true;
  settings.functionNames = {"alpha", "beta", "gamma"};
  settings.memberNames = {"x", "y"};
  editor::writeSettings(block.edit(), settings);

  EXPECT_EQ(block.u32(kSizeOffset), 172u);
  EXPECT_EQ(block.bytes()[kVerifyOffset], 1);
  EXPECT_EQ(block.bytes()[kLoopOffset], 0);
  EXPECT_EQ(block.i32(kFunctionCountOffset), 3);
  EXPECT_EQ(block.i32(kMemberCountOffset), 2);
  EXPECT_EQ(block.name(0), "alpha");
  EXPECT_EQ(block.name(2), "gamma");
  EXPECT_EQ(std::string(reinterpret_cast<char *>(block.bytes() + 118)), "x");
  EXPECT_EQ(block.name(4), "y");
  // A name is copied with its zero; the rest of its entry keeps what it held.
  EXPECT_EQ(block.bytes()[EditBlock::entryOffset(0) + 6], 0xCD);
  EXPECT_EQ(block.bytes()[EditBlock::entryOffset(0) + 25], 0xCD);
}

TEST(EditStructureLists, WriteBackCutsLongNamesAndListsToTheirLimits) {
  EditBlock block; // exactly the largest block: nothing may be written past it
  EditSettings settings;
  settings.functionNames = numberedNames("f", 501);
  settings.functionNames[0] = std::string(40, 'q');
  settings.memberNames = numberedNames("m", 600);
  editor::writeSettings(block.edit(), settings);

  EXPECT_EQ(block.i32(kFunctionCountOffset), 500);
  EXPECT_EQ(block.i32(kMemberCountOffset), 500);
  EXPECT_EQ(block.u32(kSizeOffset), 26042u);
  EXPECT_EQ(block.name(0), std::string(25, 'q'));
  EXPECT_EQ(block.name(499), "f499");
  EXPECT_EQ(block.name(500), "m0");
  EXPECT_EQ(block.name(999), "m499");
}

TEST(EditStructureLists, ReadingADamagedBlockStaysWithinItsSizeAndLimits) {
  // Counts beyond the limit and below zero.
  EditBlock wild = EditBlock::holding(numberedNames("f", 500), {});
  wild.putU32(kFunctionCountOffset, 600);
  wild.putU32(kMemberCountOffset, static_cast<std::uint32_t>(-3));
  wild.putU32(kSizeOffset, static_cast<std::uint32_t>(host::kMaxEditStructureSize));
  EditSettings read = editor::readSettings(wild.edit());
  EXPECT_EQ(read.functionNames.size(), 500u);
  EXPECT_TRUE(read.memberNames.empty());

  // Lists that run past the size field are cut there, function names first.
  EditBlock cut = EditBlock::holding({"a", "b", "c"}, {"d", "e"}, host::editStructureSize(3, 2));
  cut.putU32(kSizeOffset, kFirstNameOffset + 3 * host::kNameEntrySize + 1); // 3 entries fit
  read = editor::readSettings(cut.edit());
  EXPECT_EQ(read.functionNames, (std::vector<std::string>{"a", "b", "c"}));
  EXPECT_TRUE(read.memberNames.empty());

  // An entry without its zero gives its first 25 characters.
  EditBlock full = EditBlock::holding({"x"}, {}, host::editStructureSize(1, 0));
  std::memset(full.bytes() + kFirstNameOffset, 'z', host::kNameEntrySize);
  EXPECT_EQ(editor::readSettings(full.edit()).functionNames.at(0), std::string(25, 'z'));
}

TEST(EditStructureConversion, AVersionOneBlockBecomesTheSameBlockOfVersionTwo) {
  EditBlock stored =
      EditBlock::holding({"alpha", "beta", "gamma"}, {"x", "y"}, 172, editor::kOldEditVersion);
  for (std::size_t offset : {4, 12, 19, 24, 29, 30, 31}) {
    stored.bytes()[offset] = static_cast<unsigned char>(offset);
  }
  GlobalBlock converted(editor::updateEditStructure(&stored.edit()));
  ASSERT_NE(converted.block, nullptr);
  ASSERT_EQ(GlobalSize(converted.block), 172u);

  std::vector<unsigned char> expected = stored.snapshot();
  expected[kVersionOffset] = 2;
  expected[170] = expected[171] = 0;
  EXPECT_EQ(std::vector<unsigned char>(converted.block, converted.block + 172), expected);
}

TEST(EditStructureConversion, TheLargestVersionOneBlockKeepsEveryName) {
  EditBlock stored =
      EditBlock::holding(numberedNames("function", 500), numberedNames("member", 500),
                         host::kMaxEditStructureSize, editor::kOldEditVersion);
  GlobalBlock converted(editor::updateEditStructure(&stored.edit()));
  ASSERT_NE(converted.block, nullptr);
  ASSERT_EQ(GlobalSize(converted.block), 26042u);
  EXPECT_EQ(converted.u32(kSizeOffset), 26042u);
  EXPECT_EQ(converted.u32(kVersionOffset), 2u);
  EXPECT_EQ(converted.u32(kFunctionCountOffset), 500u);
  EXPECT_EQ(converted.u32(kMemberCountOffset), 500u);
  EXPECT_EQ(std::memcmp(converted.block + kFirstNameOffset, stored.bytes() + kFirstNameOffset,
                        1000 * host::kNameEntrySize),
            0);
}

TEST(EditStructureConversion, OnlyVersionOneIsConverted) {
  EXPECT_EQ(editor::updateEditStructure(nullptr), nullptr);
  for (std::uint32_t version : {0u, 2u, 3u, 0xFFFFFFFFu}) {
    EditBlock stored = EditBlock::holding({"a"}, {}, host::editStructureSize(1, 0), version);
    const std::vector<unsigned char> before = stored.snapshot();
    EXPECT_EQ(editor::updateEditStructure(&stored.edit()), nullptr) << version;
    EXPECT_EQ(stored.snapshot(), before);
  }
}

TEST(EditStructureConversion, ADamagedBlockConvertsToWhatCanBeReadOfIt) {
  // Counts past the limit: clamped, and the new block says so.
  EditBlock wild =
      EditBlock::holding(numberedNames("f", 500), {"m"}, host::kMaxEditStructureSize, 1);
  wild.putU32(kFunctionCountOffset, 0x7FFFFFFF);
  wild.putU32(kMemberCountOffset, static_cast<std::uint32_t>(-1));
  wild.putU32(kSizeOffset, static_cast<std::uint32_t>(host::kMaxEditStructureSize));
  GlobalBlock clamped(editor::updateEditStructure(&wild.edit()));
  ASSERT_NE(clamped.block, nullptr);
  EXPECT_EQ(clamped.u32(kFunctionCountOffset), 500u);
  EXPECT_EQ(clamped.u32(kMemberCountOffset), 0u);
  EXPECT_EQ(clamped.u32(kSizeOffset), host::editStructureSize(500, 0));
  EXPECT_EQ(clamped.name(499), "f499");

  // Lists past the size field: cut where the stored bytes end (the block is exactly that
  // long, so reading further would be reported).
  const std::size_t storedSize = host::editStructureSize(4, 0) - 3; // 3 whole entries fit
  EditBlock cut = EditBlock::holding({"a", "b"}, {"c", "d"}, host::editStructureSize(4, 0), 1);
  EditBlock shortBlock(storedSize);
  std::memcpy(shortBlock.bytes(), cut.bytes(), storedSize);
  shortBlock.putU32(kSizeOffset, static_cast<std::uint32_t>(storedSize));
  GlobalBlock cutBack(editor::updateEditStructure(&shortBlock.edit()));
  ASSERT_NE(cutBack.block, nullptr);
  EXPECT_EQ(cutBack.u32(kFunctionCountOffset), 2u);
  EXPECT_EQ(cutBack.u32(kMemberCountOffset), 1u);
  EXPECT_EQ(cutBack.u32(kSizeOffset), host::editStructureSize(3, 0));
  EXPECT_EQ(cutBack.name(2), "c");

  // A head without its padding: no names, and only the stored bytes are copied.
  EditBlock bare(41);
  bare.putU32(kSizeOffset, 41);
  bare.putU32(kVersionOffset, 1);
  bare.putU32(kFunctionCountOffset, 1);
  GlobalBlock empty(editor::updateEditStructure(&bare.edit()));
  ASSERT_NE(empty.block, nullptr);
  EXPECT_EQ(empty.u32(kSizeOffset), 42u);
  EXPECT_EQ(empty.u32(kFunctionCountOffset), 0u);

  // A size field too small for the head itself: nothing is converted.
  EditBlock tiny = EditBlock::holding({}, {}, host::editStructureSize(0, 0), 1);
  tiny.putU32(kSizeOffset, 39);
  EXPECT_EQ(editor::updateEditStructure(&tiny.edit()), nullptr);
}

} // namespace
} // namespace morvex::tests
