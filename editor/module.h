// The module handle from which every string, menu and dialog resource is loaded.
#ifndef MORVEX_EDITOR_MODULE_H
#define MORVEX_EDITOR_MODULE_H

#include <windows.h>

namespace morvex::editor {

// The handle the library's entry routine stored; null before that. The module owns it.
HINSTANCE moduleHandle();
void setModuleHandle(HINSTANCE module);

} // namespace morvex::editor

#endif
