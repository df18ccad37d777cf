// Points the editor's resource loads at the resources built into the test program: the
// generated tables on Linux, the program's own compiled script on Windows.
#ifndef MORVEX_TESTS_EDITOR_MODULE_RESOURCES_H
#define MORVEX_TESTS_EDITOR_MODULE_RESOURCES_H

#include "editor/module.h"

#if !defined(_WIN32)
#include "editor/embedded_resources.h"
#endif

namespace morvex::tests {

inline void useModuleResources() {
#if defined(_WIN32)
  editor::setModuleHandle(GetModuleHandleA(nullptr));
#else
  editor::setModuleHandle(editor::embeddedResources());
#endif
}

} // namespace morvex::tests

#endif
