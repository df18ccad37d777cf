// The stand-in sorted list box: the system's order, and a selection that follows its entry.
#include "editor/standin_list_box.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace morvex::tests {
namespace {

using editor::StandinListBox;
using Texts = std::vector<std::string>;

TEST(StandinListBox, SortsWithoutCaseAndByCharacterClass) {
  StandinListBox list;
  for (const char *text : {"beta", "Alpha", "gamma", "alp", "a_b", "a1", "ALPHA", ""}) {
    list.add(text);
  }
  // Signs before digits before letters; a prefix before its longer names.
  EXPECT_EQ(list.texts(), (Texts{"", "a_b", "a1", "alp", "ALPHA", "Alpha", "beta", "gamma"}));
}

TEST(StandinListBox, TheSelectionStaysOnItsEntryUntilTheEntryIsDeleted) {
  StandinListBox list;
  list.add("m");
  list.add("z");
  list.select(1);
  EXPECT_EQ(list.add("a"), 0);
  EXPECT_EQ(list.at(list.selected()), "z");
  list.remove(0);
  EXPECT_EQ(list.at(list.selected()), "z");
  list.remove(list.selected());
  EXPECT_EQ(list.selected(), -1);

  list.select(5); // out of range: none
  EXPECT_EQ(list.selected(), -1);
  list.remove(7); // out of range: nothing
  EXPECT_EQ(list.texts(), (Texts{"m"}));
}

} // namespace
} // namespace morvex::tests
