// Linux only: the module's resources, compiled into the library from the resource script
// (rc2cpp.py), in the form the stand-in Windows services read through a module handle.
#ifndef MORVEX_EDITOR_EMBEDDED_RESOURCES_H
#define MORVEX_EDITOR_EMBEDDED_RESOURCES_H

#include <windows.h>

namespace morvex::editor {

// The handle through which LoadStringA, LoadMenuA and the dialogs find this library's
// resources. It points at static data that lives as long as the library; never freed.
HINSTANCE embeddedResources();

} // namespace morvex::editor

#endif
