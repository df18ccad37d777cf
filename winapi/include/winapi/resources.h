// The compiled resources of a Linux module: what a module handle points at. The resource
// script's generator fills one ResourceTable per module; LoadStringA, LoadMenuA and the
// dialog services read it through the module handle.
#ifndef MORVEX_WINAPI_RESOURCES_H
#define MORVEX_WINAPI_RESOURCES_H

#include <windows.h>

#include <cstddef>

namespace morvex::winapi {

struct StringResource {
  UINT id;
  const char *text;
};

// One item of a menu template: a separator (MF_SEPARATOR), a pop-up (MF_POPUP, with its
// items) or a text item with a command; the state flags (MF_GRAYED...) as written.
struct MenuItemTemplate {
  UINT flags;
  UINT id;
  const char *text;
  const MenuItemTemplate *items;
  std::size_t itemCount;
};

struct MenuTemplate {
  UINT id;
  const MenuItemTemplate *items;
  std::size_t itemCount;
};

// One control of a dialog template, in dialog units. `style` is complete: the control
// statement's default bits, WS_CHILD | WS_VISIBLE, and the bits the script adds or removes.
struct DialogItemTemplate {
  const char *windowClass; // "BUTTON", "STATIC", "EDIT", "LISTBOX"...
  const char *text;
  int id; // -1 for none
  DWORD style;
  short x, y, cx, cy;
};

struct DialogTemplate {
  UINT id;
  DWORD style; // DS_SETFONT included when a font is given
  short x, y, cx, cy;
  const char *caption;
  const char *fontName; // null when the script names no font
  WORD fontSize;
  const DialogItemTemplate *items;
  std::size_t itemCount;
};

struct ResourceTable {
  const StringResource *strings;
  std::size_t stringCount;
  const MenuTemplate *menus;
  std::size_t menuCount;
  const DialogTemplate *dialogs;
  std::size_t dialogCount;
};

// Lookups by number (a MAKEINTRESOURCEA name) in the module's table. Named resources do
// not exist here. The records are static and live as long as the module; null when absent
// or when `module` is null.
__attribute__((visibility("default"))) const StringResource *findString(HINSTANCE module, UINT id);
__attribute__((visibility("default"))) const MenuTemplate *findMenu(HINSTANCE module, LPCSTR name);
__attribute__((visibility("default"))) const DialogTemplate *findDialog(HINSTANCE module,
                                                                        LPCSTR name);

} // namespace morvex::winapi

// What a module handle points at on Linux.
struct HINSTANCE__ {
  morvex::winapi::ResourceTable resources;
};

#endif
