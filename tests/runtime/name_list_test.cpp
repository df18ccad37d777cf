// The sorted NameList: order, case-blind search, the last-hit cache through inserts,
// replacements and removals, and the end marker's part as "none".
#include "runtime/name_list.h"
#include "runtime/records.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

namespace morvex::tests {
namespace {

using namespace morvex::runtime;
using List = NameList<VariableRecord>;

std::unique_ptr<VariableRecord> variable(const char *name, std::int32_t integer = 0) {
  auto record = std::make_unique<VariableRecord>(name);
  record->value.intValue = integer;
  return record;
}

// The names from first to last, checking the links both ways and `last` on the way.
std::vector<std::string> namesOf(List &list) {
  std::vector<std::string> names;
  VariableRecord *previous = list.end();
  for (VariableRecord *at = list.first(); at != list.end(); at = at->next) {
    EXPECT_EQ(at->prev, previous);
    names.push_back(at->name);
    previous = at;
  }
  EXPECT_EQ(list.end()->prev, previous);
  EXPECT_EQ(list.last(), previous);
  EXPECT_EQ(static_cast<std::size_t>(list.size()), names.size());
  return names;
}

TEST(NameList, KeepsElementsInByteOrderOfTheirLowerCasedNames) {
  List list;
  for (const char *name : {"carl", "p2", "\x80x", "alice", "ab", "p10", "a", "Zed"}) {
    list.insertOrReplace(variable(name));
  }
  list.insertOrReplace(variable("Bob"));
  EXPECT_EQ(namesOf(list), (std::vector<std::string>{"a", "ab", "alice", "bob", "carl", "p10", "p2",
                                                     "zed", "\x80x"}));
}

TEST(NameList, FindsIgnoringCaseAndGivesTheEndMarkerForAbsentNames) {
  List list;
  VariableRecord *alice = list.insertOrReplace(variable("alice", 1));
  list.insertOrReplace(variable("carl", 2));
  EXPECT_EQ(list.find("ALICE"), alice);
  EXPECT_EQ(list.find("bob"), list.end());
  EXPECT_EQ(list.find("zzz"), list.end());
  EXPECT_EQ(list.find("alic"), list.end());
  // The end marker's own empty name is never a match.
  EXPECT_EQ(list.find(""), list.end());
  EXPECT_EQ(list.find(nullptr), list.end());
  VariableRecord *unnamed = list.insertOrReplace(variable(nullptr, 3));
  EXPECT_EQ(unnamed->name, "");
  EXPECT_EQ(list.first(), unnamed);
  EXPECT_EQ(list.find(""), unnamed);
  EXPECT_EQ(list.find(nullptr), unnamed);
}

TEST(NameList, ReplacesTheValuesOfAnExistingNameInPlace) {
  List list;
  list.insertOrReplace(variable("alice"));
  VariableRecord *bob = list.insertOrReplace(variable("bob", 1));
  list.insertOrReplace(variable("carl"));
  VariableRecord *before = list.find("alice");

  auto replacement = variable("BOB", 7);
  replacement->value.stringValue = "seven";
  EXPECT_EQ(list.insertOrReplace(std::move(replacement)), bob);
  EXPECT_EQ(bob->value.intValue, 7);
  EXPECT_EQ(bob->value.stringValue, "seven");
  EXPECT_EQ(bob->name, "bob");
  EXPECT_EQ(namesOf(list), (std::vector<std::string>{"alice", "bob", "carl"}));
  // Replacing leaves the cache where it was.
  EXPECT_EQ(list.lastHit(), before);
}

TEST(NameList, MovesTheLastHitToFoundAndLinkedElementsOnly) {
  List list;
  EXPECT_EQ(list.lastHit(), nullptr);
  VariableRecord *alice = list.insertOrReplace(variable("alice"));
  EXPECT_EQ(list.lastHit(), alice);
  VariableRecord *carl = list.insertOrReplace(variable("carl"));
  EXPECT_EQ(list.lastHit(), carl);
  EXPECT_EQ(list.find("ALICE"), alice);
  EXPECT_EQ(list.lastHit(), alice);
  list.find("nobody");
  EXPECT_EQ(list.lastHit(), alice);
  // A cached hit is found again, also when asked in another case.
  EXPECT_EQ(list.find("Alice"), alice);

  list.remove(alice);
  EXPECT_EQ(list.lastHit(), nullptr);
  EXPECT_EQ(list.find("alice"), list.end());
  EXPECT_EQ(list.lastHit(), nullptr);
  EXPECT_EQ(list.find("carl"), carl);
  list.remove(list.find("carl"));
  EXPECT_EQ(list.find("carl"), list.end());
}

TEST(NameList, RemovesElementsAndRelinksTheirNeighbours) {
  List list;
  VariableRecord *a = list.insertOrReplace(variable("a"));
  VariableRecord *b = list.insertOrReplace(variable("b"));
  VariableRecord *c = list.insertOrReplace(variable("c"));

  EXPECT_EQ(list.remove(list.end()), nullptr);
  EXPECT_EQ(list.remove(nullptr), nullptr);
  EXPECT_EQ(list.size(), 3);

  EXPECT_EQ(list.remove(b), c);
  EXPECT_EQ(namesOf(list), (std::vector<std::string>{"a", "c"}));
  EXPECT_EQ(list.remove(c), list.end());
  EXPECT_EQ(list.last(), a);
  EXPECT_EQ(list.remove(a), list.end());
  EXPECT_EQ(list.size(), 0);
  EXPECT_EQ(list.end()->next, list.end());
  EXPECT_EQ(list.end()->prev, list.end());
  EXPECT_EQ(list.first(), list.end());
  EXPECT_EQ(list.last(), list.end());
}

TEST(NameList, InsertsBeforeAPositionOrRefusesMissingArguments) {
  List list;
  VariableRecord *z = list.insertBefore(list.end(), variable("z"));
  VariableRecord *m = list.insertBefore(z, variable("m"));
  EXPECT_EQ(namesOf(list), (std::vector<std::string>{"m", "z"}));
  EXPECT_EQ(list.lastHit(), m);
  EXPECT_EQ(list.insertBefore(nullptr, variable("x")), nullptr);
  EXPECT_EQ(list.insertBefore(z, nullptr), nullptr);
  EXPECT_EQ(list.size(), 2);
  EXPECT_EQ(list.lastHit(), m);
}

TEST(NameList, ClearsEveryElementAndStaysUsable) {
  List list;
  for (const char *name : {"x", "y", "z"}) {
    list.insertOrReplace(variable(name));
  }
  list.clear();
  EXPECT_EQ(list.lastHit(), nullptr);
  EXPECT_EQ(list.find("x"), list.end());
  list.clear();
  EXPECT_EQ(namesOf(list), std::vector<std::string>{});
  list.insertOrReplace(variable("y"));
  EXPECT_EQ(namesOf(list), (std::vector<std::string>{"y"}));
}

} // namespace
} // namespace morvex::tests
