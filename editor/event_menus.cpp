// Building the event menus: the resource's first pop-up, copied item by item.
#include "editor/event_menus.h"

#include "editor/host_compatibility.h"
#include "editor/module.h"

namespace morvex::editor {
namespace {

// The state flags an item keeps when it is copied.
constexpr UINT kCopiedStates =
    MF_GRAYED | MF_DISABLED | MF_CHECKED | MF_MENUBARBREAK | MF_MENUBREAK;

// Appends to `target` a copy of every item of `source`, in order. False when something
// could not be made; what was appended so far stays in `target`.
bool copyItems(HMENU source, HMENU target) {
  auto *text = static_cast<char *>(LocalAlloc(LPTR, kMenuTextSize));
  if (text == nullptr) {
    return false;
  }
  bool copied = true;
  const int count = GetMenuItemCount(source);
  for (int position = 0; copied && position < count; ++position) {
    const UINT command = GetMenuItemID(source, position);
    if (command == 0) {
      copied = AppendMenuA(target, MF_SEPARATOR, 0, nullptr) != FALSE;
      continue;
    }
    text[0] = '\0';
    GetMenuStringA(source, static_cast<UINT>(position), text, kMenuTextSize, MF_BYPOSITION);
    text[kMenuTextSize - 1] = '\0'; // a longer text may fill the buffer without its zero
    if (HMENU inner = GetSubMenu(source, position)) {
      HMENU popup = CreatePopupMenu();
      copied = popup != nullptr && copyItems(inner, popup) &&
               AppendMenuA(target, MF_POPUP, reinterpret_cast<UINT_PTR>(popup), text) != FALSE;
      if (!copied && popup != nullptr) {
        DestroyMenu(popup);
      }
    } else {
      const UINT state = GetMenuState(source, static_cast<UINT>(position), MF_BYPOSITION);
      copied = AppendMenuA(target, MF_STRING | (state & kCopiedStates), command, text) != FALSE;
    }
  }
  LocalFree(text);
  return copied;
}

} // namespace

HMENU buildEventMenu(const host::EditorContext *context, EventKind kind) {
  if (!isCompatibleHost(context)) {
    return nullptr;
  }
  HMENU loaded = LoadMenuA(moduleHandle(), MAKEINTRESOURCEA(eventTable(kind).menuResource));
  if (loaded == nullptr) {
    return nullptr;
  }
  HMENU menu = nullptr;
  if (HMENU source = GetSubMenu(loaded, 0)) {
    menu = CreatePopupMenu();
    if (menu != nullptr && !copyItems(source, menu)) {
      DestroyMenu(menu);
      menu = nullptr;
    }
  }
  DestroyMenu(loaded);
  return menu;
}

} // namespace morvex::editor
