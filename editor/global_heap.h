// Blocks from the system's global heap, the memory a host takes over from the extension.
#ifndef MORVEX_EDITOR_GLOBAL_HEAP_H
#define MORVEX_EDITOR_GLOBAL_HEAP_H

#include <cstddef>

namespace morvex::editor {

// A zero-filled fixed block of `size` bytes from the global heap (GlobalAlloc), or null
// when the heap has no room. Whoever receives it owns it and frees it with GlobalFree.
void *allocateGlobalZeroed(std::size_t size);

} // namespace morvex::editor

#endif
