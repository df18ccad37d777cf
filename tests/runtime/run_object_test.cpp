// Creating and destroying run-time objects: the fresh state, the global variables that
// all objects share, and stored edit structures that are damaged.
#include "runtime/errors.h"
#include "runtime/name_table.h"
#include "runtime/routines.h"
#include "tests/support/test_host.h"

#include <gtest/gtest.h>

#include <cstring>
#include <string>
#include <vector>

namespace morvex::tests {
namespace {

using namespace morvex::runtime;

// A stored block of exactly `bytes` bytes, so that any read past it is caught; its size
// field and counts are given separately, as a damaged block may disagree with itself.
// Entry i of the names is filled with `fill(i)`, written without a terminator when it
// takes all 26 bytes.
std::vector<std::uint8_t> storedBlock(std::size_t bytes, std::uint32_t sizeField,
                                      std::int32_t functions, std::int32_t members,
                                      std::string (*fill)(std::size_t)) {
  std::vector<std::uint8_t> block(bytes, 0);
  auto put = [&](std::size_t offset, const void *from, std::size_t size) {
    std::memcpy(block.data() + offset, from, size);
  };
  put(0, &sizeField, sizeof sizeField);
  put(offsetof(host::EditStructure, functionCount), &functions, sizeof functions);
  put(offsetof(host::EditStructure, memberCount), &members, sizeof members);
  block[offsetof(host::EditStructure, verifyFunctionNames)] = 1;
  for (std::size_t i = 0; host::kEditHeadSize + (i + 1) * host::kNameEntrySize <= bytes; ++i) {
    const std::string name = fill(i);
    put(host::kEditHeadSize + i * host::kNameEntrySize, name.data(),
        std::min(name.size(), host::kNameEntrySize));
  }
  return block;
}

std::string numbered(std::size_t i) {
  return "n" + std::to_string(i);
}

const host::EditStructure *asEdit(const std::vector<std::uint8_t> &block) {
  return reinterpret_cast<const host::EditStructure *>(block.data());
}

std::vector<std::string> namesOf(const std::vector<NameEntry> &table) {
  std::vector<std::string> names;
  for (const NameEntry &entry : table) {
    EXPECT_NE(std::memchr(entry.text, 0, sizeof entry.text), nullptr);
    names.emplace_back(entry.text);
  }
  return names;
}

TEST(RunObject, StartsAtRestWithTheStoredNamesAndOptions) {
  TestHost host;
  RunObject &object =
      host.create({{"move", "jump"}, {"speed", "hp", "name"}, /*verify=*/false, /*loop=*/true});
  EXPECT_EQ(object.functionCount, 2);
  EXPECT_EQ(namesOf(object.functionNames), (std::vector<std::string>{"move", "jump"}));
  EXPECT_EQ(object.memberCount, 3);
  EXPECT_EQ(namesOf(object.memberNames), (std::vector<std::string>{"speed", "hp", "name"}));
  EXPECT_EQ(object.verifyFunctionNames, 0);
  EXPECT_EQ(object.loopUntilReturn, 1);

  // The pointers of a fresh object stand for "none", and no call runs.
  EXPECT_EQ(object.currentInstance, object.noInstance());
  EXPECT_EQ(object.defaultInstance, object.noInstance());
  ASSERT_TRUE(object.localVariables);
  EXPECT_EQ(object.returnType, kNoFunction);
}

TEST(RunObject, ObjectsShareTheGlobalVariablesUntilTheLastIsDestroyed) {
  TestHost host;
  RunObject &first = host.create();
  RunObject &second = host.create();
  EXPECT_EQ(runObjectCount(), 2);
  host.act(first, createGlobalVariable, {std::string("shared")});
  host.act(first, setGlobalInteger, {std::string("shared"), 11});
  EXPECT_EQ(host.eval(second, globalInt, {std::string("shared")}).integer(), 11);

  host.destroy(first);
  EXPECT_EQ(host.eval(second, globalInt, {std::string("shared")}).integer(), 11);
  host.destroy(second);
  EXPECT_EQ(runObjectCount(), 0);

  RunObject &later = host.create();
  EXPECT_EQ(globalVariables().size(), 0);
  EXPECT_EQ(host.eval(later, globalInt, {std::string("shared")}).integer(), 0);
  EXPECT_EQ(later.expressionErrorCode, kNoSuchVariable);
}

TEST(RunObject, DestroyingAnObjectFreesItsInstancesWithoutEvents) {
  TestHost host;
  RunObject &object = host.create({{}, {"a", "b"}});
  host.on(object, host::kOnDestruction, [] { FAIL() << "a destruction event ran"; });
  InstanceRecord *ship =
      object.instances.insertOrReplace(std::make_unique<InstanceRecord>("ship", 2));
  ship->values[1].stringValue = std::string(64, 's');
  object.instances.insertOrReplace(std::make_unique<InstanceRecord>("boat", 2));
  object.defaultInstance = ship;
  object.localVariables->insertOrReplace(std::make_unique<VariableRecord>("local"));
  object.slotStrings[10] = std::string(64, 'x');
  host.destroy(object);
  EXPECT_EQ(host.raised(host::kOnDestruction), 0);
}

TEST(RunObject, ClampsNegativeAndOversizedCounts) {
  TestHost host;
  const auto negative = storedBlock(42, 42, -3, -1, numbered);
  RunObject &none = host.createFrom(asEdit(negative));
  EXPECT_EQ(none.functionCount, 0);
  EXPECT_EQ(none.memberCount, 0);
  EXPECT_EQ(none.verifyFunctionNames, 1);

  const std::size_t bytes = host::editStructureSize(600, 0);
  const auto oversized = storedBlock(bytes, static_cast<std::uint32_t>(bytes), 600, 2, numbered);
  RunObject &many = host.createFrom(asEdit(oversized));
  EXPECT_EQ(many.functionCount, host::kMaxNames);
  ASSERT_EQ(many.functionNames.size(), 500u);
  EXPECT_STREQ(many.functionNames[499].text, "n499");
  EXPECT_EQ(many.memberCount, 2);
  EXPECT_EQ(namesOf(many.memberNames), (std::vector<std::string>{"n500", "n501"}));
}

TEST(RunObject, ReadsNoNameBeyondTheBlocksSizeField) {
  TestHost host;
  // Room for four entries: three function names, then one of the three member names.
  const std::size_t bytes = host::editStructureSize(4, 0);
  const auto cut = storedBlock(bytes, static_cast<std::uint32_t>(bytes), 3, 3, numbered);
  RunObject &object = host.createFrom(asEdit(cut));
  EXPECT_EQ(namesOf(object.functionNames), (std::vector<std::string>{"n0", "n1", "n2"}));
  EXPECT_EQ(namesOf(object.memberNames), (std::vector<std::string>{"n3"}));

  // Function names alone run past the end: they are cut, and no member is left.
  const auto functionsOnly = storedBlock(bytes, static_cast<std::uint32_t>(bytes), 9, 1, numbered);
  RunObject &short1 = host.createFrom(asEdit(functionsOnly));
  EXPECT_EQ(short1.functionCount, 4);
  EXPECT_EQ(short1.memberCount, 0);

  // A size field below the head leaves no room for any name.
  const auto tiny = storedBlock(host::kEditHeadSize, 12, 2, 2, numbered);
  RunObject &empty = host.createFrom(asEdit(tiny));
  EXPECT_EQ(empty.functionCount, 0);
  EXPECT_EQ(empty.memberCount, 0);
}

TEST(RunObject, TerminatesStoredNamesThatLackTheirZero) {
  TestHost host;
  const std::size_t bytes = host::editStructureSize(1, 1);
  const auto block = storedBlock(bytes, static_cast<std::uint32_t>(bytes), 1, 1,
                                 [](std::size_t i) { return std::string(26, i == 0 ? 'f' : 'm'); });
  RunObject &object = host.createFrom(asEdit(block));
  EXPECT_EQ(namesOf(object.functionNames), (std::vector<std::string>{std::string(25, 'f')}));
  EXPECT_EQ(namesOf(object.memberNames), (std::vector<std::string>{std::string(25, 'm')}));
  EXPECT_EQ(
      lookupNameIndex(object.memberNames.data(), object.memberCount, std::string(25, 'M').c_str()),
      0);
}

TEST(RunObject, WithoutAnEditStructureStartsEmpty) {
  TestHost host;
  RunObject &object = host.createFrom(nullptr);
  EXPECT_EQ(object.functionCount, 0);
  EXPECT_EQ(object.memberCount, 0);
  EXPECT_EQ(object.verifyFunctionNames, 0);
  EXPECT_EQ(object.loopUntilReturn, 0);
  EXPECT_EQ(object.returnType, kNoFunction);
}

} // namespace
} // namespace morvex::tests
