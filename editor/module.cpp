// The module handle, kept for the life of the process.
#include "editor/module.h"

namespace morvex::editor {
namespace {
HINSTANCE storedHandle = nullptr;
} // namespace

HINSTANCE moduleHandle() {
  return storedHandle;
}

void setModuleHandle(HINSTANCE module) {
  storedHandle = module;
}

} // namespace morvex::editor
