// The global heap through the system's GlobalAlloc (the winapi stand-in's on Linux).
#include "editor/global_heap.h"

#include <windows.h>

namespace morvex::editor {

void *allocateGlobalZeroed(std::size_t size) {
  return reinterpret_cast<void *>(GlobalAlloc(GMEM_FIXED | GMEM_ZEROINIT, size));
}

} // namespace morvex::editor
