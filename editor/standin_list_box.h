// A sorted list box as the stand-in dialogs keep it: entries in the system's
// case-insensitive ascending order, and at most one selected entry.
#ifndef MORVEX_EDITOR_STANDIN_LIST_BOX_H
#define MORVEX_EDITOR_STANDIN_LIST_BOX_H

#include <string>
#include <string_view>
#include <vector>

namespace morvex::editor {

// The order of a sorted list box: letters compared without case, and by character class
// first (other signs before digits before letters before bytes above 127), as the
// system's sort places them. Negative, zero or positive as for strcmp.
int compareListText(std::string_view left, std::string_view right);

class StandinListBox {
public:
  // Inserts `text` before the first entry that does not sort before it; answers its index.
  // The selected entry stays selected.
  int add(const std::string &text);
  // Deletes entry `index` (nothing when out of range). Deleting the selected entry leaves
  // none selected; the selection otherwise stays on its entry.
  void remove(int index);
  int count() const { return static_cast<int>(items_.size()); }
  // Entry `index`, which must be within 0..count() - 1; the reference lives until the
  // list next changes.
  const std::string &at(int index) const;
  // The selected index, or -1.
  int selected() const { return selected_; }
  // Selects entry `index`; an index out of range selects none.
  void select(int index);
  const std::vector<std::string> &texts() const { return items_; }

private:
  std::vector<std::string> items_;
  int selected_ = -1;
};

} // namespace morvex::editor

#endif
