// Name comparison shared by every NameList.
#include "runtime/name_list.h"

namespace morvex::runtime {

int compareLowered(const std::string &stored, const char *name) {
  if (!name) {
    name = "";
  }
  for (std::size_t i = 0;; ++i) {
    const auto a = i < stored.size() ? static_cast<unsigned char>(stored[i]) : 0u;
    auto b = static_cast<unsigned char>(name[i]);
    if (b >= 'A' && b <= 'Z') {
      b = static_cast<unsigned char>(b - 'A' + 'a');
    }
    if (a != b) {
      return a < b ? -1 : 1;
    }
    if (a == 0) {
      return 0;
    }
  }
}

} // namespace morvex::runtime
