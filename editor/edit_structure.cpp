// The edit structure's defaults, rectangle, conversion and name lists.
#include "editor/edit_structure.h"

#include "editor/global_heap.h"

#include <algorithm>
#include <cstring>

namespace morvex::editor {

namespace {

// Bytes of the head that a conversion copies: the 40-byte head and the two bytes after it
// (the padding of a block without names, else the start of the first name entry).
constexpr std::size_t kCopiedHeadSize = host::kEditHeadSize + 2;

constexpr std::int16_t kDefaultExtent = 32;

std::int32_t clampCount(std::int32_t count) {
  return std::clamp(count, 0, host::kMaxNames);
}

// How many whole name entries lie between the head and the end given by the size field.
std::size_t entriesWithinSize(std::uint32_t size) {
  return size < host::kEditHeadSize ? 0 : (size - host::kEditHeadSize) / host::kNameEntrySize;
}

unsigned char *bytesOf(host::EditStructure &edit) {
  return reinterpret_cast<unsigned char *>(&edit);
}
const unsigned char *bytesOf(const host::EditStructure &edit) {
  return reinterpret_cast<const unsigned char *>(&edit);
}

// Copies `name`, cut to kMaxNameLength characters, and a zero into a name entry.
void writeEntry(char *entry, const std::string &name) {
  const std::size_t length = std::min(std::strlen(name.c_str()), kMaxNameLength);
  std::memcpy(entry, name.data(), length);
  entry[length] = '\0';
}

std::int32_t writtenCount(const std::vector<std::string> &names) {
  return static_cast<std::int32_t>(std::min(names.size(), std::size_t{host::kMaxNames}));
}

} // namespace

void writeCreationDefaults(host::EditStructure &edit) {
  edit.unused20 = 0;
  edit.unused22 = 0;
  edit.width = kDefaultExtent;
  edit.height = kDefaultExtent;
  edit.unused28 = 0;
  edit.functionCount = 0;
  edit.memberCount = 0;
}

void getObjectRect(const host::EditStructure &edit, host::Rect &rect) {
  // Wraps as the host's 32-bit addition would rather than overflowing.
  rect.right = static_cast<std::int32_t>(std::int64_t{rect.left} + edit.width);
  rect.bottom = static_cast<std::int32_t>(std::int64_t{rect.top} + edit.height);
}

NameCounts readableCounts(const host::EditStructure &edit) {
  const std::size_t room = entriesWithinSize(edit.size);
  NameCounts counts;
  counts.functions = static_cast<std::int32_t>(
      std::min<std::size_t>(static_cast<std::size_t>(clampCount(edit.functionCount)), room));
  counts.members = static_cast<std::int32_t>(
      std::min<std::size_t>(static_cast<std::size_t>(clampCount(edit.memberCount)),
                            room - static_cast<std::size_t>(counts.functions)));
  return counts;
}

char *nameEntry(host::EditStructure &edit, std::size_t index) {
  return reinterpret_cast<char *>(bytesOf(edit) + host::kEditHeadSize +
                                  index * host::kNameEntrySize);
}

const char *nameEntry(const host::EditStructure &edit, std::size_t index) {
  return reinterpret_cast<const char *>(bytesOf(edit) + host::kEditHeadSize +
                                        index * host::kNameEntrySize);
}

std::string entryText(const char *entry) {
  const void *zero = std::memchr(entry, '\0', kMaxNameLength);
  const auto length =
      zero ? static_cast<std::size_t>(static_cast<const char *>(zero) - entry) : kMaxNameLength;
  return std::string(entry, length);
}

void *updateEditStructure(const host::EditStructure *stored) {
  if (!stored || stored->version != kOldEditVersion || stored->size < host::kEditHeadSize) {
    return nullptr;
  }
  const NameCounts counts = readableCounts(*stored);
  const auto entries = static_cast<std::size_t>(counts.functions + counts.members);
  const std::size_t newSize = host::editStructureSize(entries, 0);
  void *block = allocateGlobalZeroed(newSize);
  if (!block) {
    return nullptr;
  }
  auto *target = static_cast<unsigned char *>(block);
  std::memcpy(target, bytesOf(*stored), std::min<std::size_t>(kCopiedHeadSize, stored->size));
  std::memcpy(target + host::kEditHeadSize, bytesOf(*stored) + host::kEditHeadSize,
              entries * host::kNameEntrySize);

  auto &converted = *static_cast<host::EditStructure *>(block);
  converted.functionCount = counts.functions;
  converted.memberCount = counts.members;
  converted.version = host::kEditVersion;
  converted.size = static_cast<std::uint32_t>(newSize);
  return block;
}

EditSettings readSettings(const host::EditStructure &edit) {
  EditSettings settings;
  settings.verifyFunctionNames = edit.verifyFunctionNames != 0;
  settings.loopUntilReturn = edit.loopUntilReturn != 0;
  const NameCounts counts = readableCounts(edit);
  std::size_t index = 0;
  for (std::int32_t i = 0; i < counts.functions; ++i) {
    settings.functionNames.push_back(entryText(nameEntry(edit, index++)));
  }
  for (std::int32_t i = 0; i < counts.members; ++i) {
    settings.memberNames.push_back(entryText(nameEntry(edit, index++)));
  }
  return settings;
}

void writeSettings(host::EditStructure &edit, const EditSettings &settings) {
  edit.verifyFunctionNames = settings.verifyFunctionNames ? 1 : 0;
  edit.loopUntilReturn = settings.loopUntilReturn ? 1 : 0;

  const std::int32_t functions = writtenCount(settings.functionNames);
  edit.functionCount = functions;
  std::size_t index = 0;
  for (std::int32_t i = 0; i < functions; ++i) {
    writeEntry(nameEntry(edit, index++), settings.functionNames[static_cast<std::size_t>(i)]);
  }

  const std::int32_t members = writtenCount(settings.memberNames);
  edit.memberCount = members;
  for (std::int32_t i = 0; i < members; ++i) {
    writeEntry(nameEntry(edit, index++), settings.memberNames[static_cast<std::size_t>(i)]);
  }

  edit.size = static_cast<std::uint32_t>(host::editStructureSize(index, 0));
}

} // namespace morvex::editor
