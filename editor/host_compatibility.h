// Whether the host's editor is recent enough for this extension's menus and display strings.
#ifndef MORVEX_EDITOR_HOST_COMPATIBILITY_H
#define MORVEX_EDITOR_HOST_COMPATIBILITY_H

#include "host/contract.h"

#include <cstdint>

namespace morvex::editor {

inline constexpr std::uint32_t kMinimumHostBuild = 228;      // bits 0-11 of the word
inline constexpr std::uint32_t kMinimumHostVersion = 0x0200; // bits 16-31
inline constexpr std::uint32_t kIncompatibleHostBit = 0x8000;

// True when the context offers HostVersion and its word has a build of at least 228, a
// version of at least 0x0200 and bit 0x8000 clear. The word is asked for afresh for each
// of the three conditions. A null context or service fails.
bool isCompatibleHost(const host::EditorContext *context);

} // namespace morvex::editor

#endif
