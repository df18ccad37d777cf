// Linux-only hooks of the stand-in services, through which tests and the emulator play the
// part of the user: answering message boxes.
#ifndef MORVEX_WINAPI_HOOKS_H
#define MORVEX_WINAPI_HOOKS_H

#include <windows.h>

namespace morvex::winapi {

// Called by MessageBoxA with its arguments; its answer is MessageBoxA's. The texts live
// only for the call. Null (the default) answers IDOK.
using MessageBoxHook = int (*)(HWND owner, LPCSTR text, LPCSTR caption, UINT type);

// Installs `hook` and answers the one it replaces.
__attribute__((visibility("default"))) MessageBoxHook setMessageBoxHook(MessageBoxHook hook);

} // namespace morvex::winapi

#endif
