// The stand-in sorted list box and its order.
#include "editor/standin_list_box.h"

#include <algorithm>

namespace morvex::editor {

namespace {

// Where a byte sorts: its class first, then its place within the class.
int sortWeight(unsigned char byte) {
  if (byte >= 'A' && byte <= 'Z') {
    byte = static_cast<unsigned char>(byte - 'A' + 'a');
  }
  if (byte >= 'a' && byte <= 'z') {
    return 0x300 + byte;
  }
  if (byte >= '0' && byte <= '9') {
    return 0x200 + byte;
  }
  if (byte >= 0x80) {
    return 0x400 + byte;
  }
  return 0x100 + byte;
}

} // namespace

int compareListText(std::string_view left, std::string_view right) {
  const std::size_t common = std::min(left.size(), right.size());
  for (std::size_t i = 0; i < common; ++i) {
    const int difference = sortWeight(static_cast<unsigned char>(left[i])) -
                           sortWeight(static_cast<unsigned char>(right[i]));
    if (difference != 0) {
      return difference;
    }
  }
  return left.size() < right.size() ? -1 : (left.size() > right.size() ? 1 : 0);
}

int StandinListBox::add(const std::string &text) {
  const auto place = std::find_if(items_.begin(), items_.end(), [&](const std::string &item) {
    return compareListText(item, text) >= 0;
  });
  const auto index = static_cast<int>(place - items_.begin());
  items_.insert(place, text);
  if (selected_ >= index) {
    ++selected_;
  }
  return index;
}

void StandinListBox::remove(int index) {
  if (index < 0 || index >= count()) {
    return;
  }
  items_.erase(items_.begin() + index);
  if (selected_ == index) {
    selected_ = -1;
  } else if (selected_ > index) {
    --selected_;
  }
}

const std::string &StandinListBox::at(int index) const {
  return items_.at(static_cast<std::size_t>(index));
}

void StandinListBox::select(int index) {
  selected_ = (index >= 0 && index < count()) ? index : -1;
}

} // namespace morvex::editor
