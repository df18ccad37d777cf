// The pop-up menus of conditions, actions and expressions that the host's event editor
// offers, copied from the module's menu resources.
#ifndef MORVEX_EDITOR_EVENT_MENUS_H
#define MORVEX_EDITOR_EVENT_MENUS_H

#include "editor/event_infos.h"
#include "host/contract.h"

#include <windows.h>

namespace morvex::editor {

// The longest item text copied, and the buffer it is read into.
inline constexpr int kMenuTextSize = 80;

// A new pop-up menu with the items of the kind's menu resource: the same texts, commands,
// state flags, sub-menus and separators. The caller (the host) owns it and frees it with
// DestroyMenu. Null when the host fails the compatibility test, when the resource cannot
// be loaded or holds no pop-up, or when the copy cannot be completed.
HMENU buildEventMenu(const host::EditorContext *context, EventKind kind);

} // namespace morvex::editor

#endif
