// The edit structure: an object's stored edit-time settings, its defaults, its conversion
// from version 1, its rectangle on screen, and reading and writing back its name lists.
//
// Every function here stays inside the block's bytes even when the block is damaged:
// counts are clamped to 0..kMaxNames and name lists are cut where they would pass the
// block's size field (see readableCounts).
#ifndef MORVEX_EDITOR_EDIT_STRUCTURE_H
#define MORVEX_EDITOR_EDIT_STRUCTURE_H

#include "host/contract.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace morvex::editor {

// The longest name a 26-byte entry holds before its terminating zero.
inline constexpr std::size_t kMaxNameLength = host::kNameEntrySize - 1;

// The version a block carried before the current one; it has the same layout.
inline constexpr std::uint32_t kOldEditVersion = 1;

// Writes what a new object starts with: bytes 20 and 22 zero, width and height 32, byte 28
// zero, no function and no member names. The size, the version, the host's header bytes
// and both option bytes keep the host's values.
void writeCreationDefaults(host::EditStructure &edit);

// Sets rect.right to rect.left + width and rect.bottom to rect.top + height.
void getObjectRect(const host::EditStructure &edit, host::Rect &rect);

// Converts a version-1 block into a new version-2 block with the same head and names, from
// the global heap (GlobalAlloc), zero-filled; the caller (the host) owns it and frees it
// with GlobalFree. Null when `stored` is null, is not of version 1, has a size field too
// small for the 40-byte head, or the heap has no room. A damaged block converts to what
// readableCounts can read of it, and the new counts say so.
void *updateEditStructure(const host::EditStructure *stored);

// How many function and member names can be read from a block.
struct NameCounts {
  std::int32_t functions = 0;
  std::int32_t members = 0;
};

// The stored counts, each clamped to 0..kMaxNames, then cut (function names first, then
// member names) so that every entry read lies within the block's size field.
NameCounts readableCounts(const host::EditStructure &edit);

// The bytes of name entry `index`, counting from the first function name through the
// member names that follow the function names. The pointer points into the block: the
// host owns it and it lives as long as the block. The caller keeps `index` within the
// entries the block holds.
char *nameEntry(host::EditStructure &edit, std::size_t index);
const char *nameEntry(const host::EditStructure &edit, std::size_t index);

// The name a 26-byte entry holds: its bytes up to the first zero, at most kMaxNameLength.
std::string entryText(const char *entry);

// What the setup dialog shows and writes back.
struct EditSettings {
  bool verifyFunctionNames = false;
  bool loopUntilReturn = false;
  std::vector<std::string> functionNames;
  std::vector<std::string> memberNames;
};

// The options and the readable names of a block, in stored order.
EditSettings readSettings(const host::EditStructure &edit);

// Writes `settings` back, in this order: option bytes 29 and 30, the function count and
// names, the member count and names, and last the size field. Each list is cut to
// kMaxNames names and each name to kMaxNameLength characters; a name is copied with its
// terminating zero and the rest of its entry keeps the bytes it held.
//
// The block must have room for kMaxEditStructureSize bytes whatever its size field says:
// hosts hand CreateObject and EditObject blocks that large (host/contract.h), so the
// lists never pass the end of the block.
void writeSettings(host::EditStructure &edit, const EditSettings &settings);

} // namespace morvex::editor

#endif
