// The bytes of an edit structure, written the way the setup dialog writes them.
#include "emulator/edit_structure.h"

#include "host/contract.h"

#include <algorithm>
#include <cstring>

namespace morvex::emulator {

namespace {

char lowered(char c) {
  return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

// Other signs, then digits, then letters, then bytes above 127; within a class, byte order.
int collationClass(unsigned char c) {
  if (c >= '0' && c <= '9') {
    return 1;
  }
  if (c >= 'a' && c <= 'z') {
    return 2;
  }
  if (c >= 0x80) {
    return 3;
  }
  return 0;
}

void writeNames(char *entry, const std::vector<std::string> &names) {
  for (const std::string &name : names) {
    std::memcpy(entry, name.data(), name.size()); // at most 25 bytes; the zero is there
    entry += host::kNameEntrySize;
  }
}

} // namespace

std::string storedName(std::string_view typed) {
  std::string name(typed.substr(0, host::kNameEntrySize - 1));
  std::transform(name.begin(), name.end(), name.begin(), lowered);
  return name;
}

bool listBoxBefore(std::string_view a, std::string_view b) {
  const std::size_t common = std::min(a.size(), b.size());
  for (std::size_t i = 0; i < common; ++i) {
    const auto x = static_cast<unsigned char>(lowered(a[i]));
    const auto y = static_cast<unsigned char>(lowered(b[i]));
    if (x == y) {
      continue;
    }
    const int classX = collationClass(x);
    const int classY = collationClass(y);
    return classX != classY ? classX < classY : x < y;
  }
  return a.size() < b.size();
}

std::vector<std::string> storedList(const std::vector<std::string> &typed) {
  std::vector<std::string> names;
  names.reserve(typed.size());
  for (const std::string &name : typed) {
    names.push_back(storedName(name));
  }
  std::stable_sort(names.begin(), names.end(),
                   [](const std::string &a, const std::string &b) { return listBoxBefore(a, b); });
  return names;
}

std::vector<std::uint8_t> buildEditStructure(const ObjectSetup &object) {
  const std::vector<std::string> functions = storedList(object.functions);
  const std::vector<std::string> members = storedList(object.members);
  std::vector<std::uint8_t> block(host::kMaxEditStructureSize, 0);
  auto *edit = reinterpret_cast<host::EditStructure *>(block.data());
  // What the host and CreateObject put in a new block.
  edit->version = host::kEditVersion;
  edit->width = 32;
  edit->height = 32;
  // What the setup dialog writes back on OK, the size last.
  edit->verifyFunctionNames = object.verify ? 1 : 0;
  edit->loopUntilReturn = object.loop ? 1 : 0;
  edit->functionCount = static_cast<std::int32_t>(functions.size());
  char *entries = reinterpret_cast<char *>(block.data()) + host::kEditHeadSize;
  writeNames(entries, functions);
  edit->memberCount = static_cast<std::int32_t>(members.size());
  writeNames(entries + host::kNameEntrySize * functions.size(), members);
  edit->size =
      static_cast<std::uint32_t>(host::editStructureSize(functions.size(), members.size()));
  return block;
}

} // namespace morvex::emulator
