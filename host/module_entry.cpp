// The library's entry routine: it keeps the module handle that every resource is loaded
// through.
#include "editor/module.h"

#if defined(_WIN32)

// Answers success for every reason; only attaching to a process does anything.
extern "C" BOOL WINAPI DllMain(HINSTANCE instance, DWORD reason, LPVOID) {
  if (reason == DLL_PROCESS_ATTACH) {
    morvex::editor::setModuleHandle(instance);
  }
  return TRUE;
}

#else

#include "editor/embedded_resources.h"

namespace morvex::host {
namespace {

// Runs when the library is loaded: its resources are compiled into it.
__attribute__((constructor)) void attachModule() {
  editor::setModuleHandle(editor::embeddedResources());
}

} // namespace
} // namespace morvex::host

#endif
