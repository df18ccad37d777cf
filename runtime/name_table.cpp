// Finding a name among a RunObject's declared function or member names.
#include "runtime/name_table.h"

#include <cstring>

namespace morvex::runtime {

std::int32_t lookupNameIndex(const NameEntry *table, std::int32_t count, const char *name) {
  if (!name || !table) {
    return -1;
  }
  const std::string lowered = lowerCased(name);
  if (lowered.size() >= host::kNameEntrySize) {
    return -1; // longer than any entry can hold
  }
  for (std::int32_t i = 0; i < count; ++i) {
    // Both sides end within the entry: the name is shorter than it, the entry is terminated.
    if (std::strncmp(table[i].text, lowered.c_str(), host::kNameEntrySize) == 0) {
      return i;
    }
  }
  return -1;
}

} // namespace morvex::runtime
