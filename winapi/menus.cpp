// Menus: pop-ups built at run time or loaded from a module's menu templates, and the
// queries an editor walks them with. Handles are checked: an unknown or destroyed menu is
// refused rather than read.
#include "winapi/resources.h"

#include <algorithm>
#include <cstring>
#include <memory>
#include <string>
#include <unordered_set>
#include <vector>

struct HMENU__;

namespace morvex::winapi {
namespace {

struct MenuItem {
  UINT flags = 0; // MF_POPUP, MF_SEPARATOR and the state flags
  UINT id = 0;
  std::string text;
  HMENU popup = nullptr; // owned by this item's menu
};

constexpr UINT kStateFlags = MF_GRAYED | MF_DISABLED | MF_CHECKED | MF_MENUBARBREAK | MF_MENUBREAK |
                             MF_HILITE | MF_DEFAULT | MF_HELP;

} // namespace
} // namespace morvex::winapi

struct HMENU__ {
  std::vector<morvex::winapi::MenuItem> items;
  HMENU parent = nullptr; // the menu this one is appended to, which owns it
};

namespace morvex::winapi {
namespace {

std::unordered_set<HMENU> &liveMenus() {
  static std::unordered_set<HMENU> menus;
  return menus;
}

bool isLive(HMENU menu) {
  return menu != nullptr && liveMenus().contains(menu);
}

HMENU newMenu() {
  auto menu = std::make_unique<HMENU__>();
  liveMenus().insert(menu.get());
  return menu.release();
}

void destroy(HMENU menu) {
  for (MenuItem &item : menu->items) {
    if (item.popup != nullptr) {
      destroy(item.popup);
    }
  }
  liveMenus().erase(menu);
  delete menu;
}

// Builds the items of a template into `menu`.
void build(HMENU menu, const MenuItemTemplate *items, std::size_t count) {
  menu->items.reserve(count); // so that a new pop-up always finds its place
  for (std::size_t i = 0; i < count; ++i) {
    const MenuItemTemplate &source = items[i];
    MenuItem item;
    item.flags = source.flags;
    item.id = (source.flags & (MF_POPUP | MF_SEPARATOR)) != 0 ? 0 : source.id;
    item.text = (source.flags & MF_SEPARATOR) != 0 || source.text == nullptr ? "" : source.text;
    if ((source.flags & MF_POPUP) != 0) {
      item.popup = newMenu();
      item.popup->parent = menu;
      menu->items.push_back(std::move(item));
      build(menu->items.back().popup, source.items, source.itemCount);
    } else {
      menu->items.push_back(std::move(item));
    }
  }
}

// The item at `position`, or the first item with command `id` in the menu or any of its
// pop-ups; null when there is none.
MenuItem *itemAt(HMENU menu, int position) {
  if (!isLive(menu) || position < 0 || static_cast<std::size_t>(position) >= menu->items.size()) {
    return nullptr;
  }
  return &menu->items[static_cast<std::size_t>(position)];
}

MenuItem *itemWithCommand(HMENU menu, UINT id) {
  for (MenuItem &item : menu->items) {
    if (item.popup != nullptr) {
      if (MenuItem *inner = itemWithCommand(item.popup, id)) {
        return inner;
      }
    } else if ((item.flags & MF_SEPARATOR) == 0 && item.id == id) {
      return &item;
    }
  }
  return nullptr;
}

MenuItem *findItem(HMENU menu, UINT item, UINT flags) {
  if ((flags & MF_BYPOSITION) != 0) {
    return item > static_cast<UINT>(INT32_MAX) ? nullptr : itemAt(menu, static_cast<int>(item));
  }
  return isLive(menu) ? itemWithCommand(menu, item) : nullptr;
}

} // namespace
} // namespace morvex::winapi

using morvex::winapi::MenuItem;

extern "C" {

HMENU WINAPI CreatePopupMenu(void) {
  return morvex::winapi::newMenu();
}

HMENU WINAPI CreateMenu(void) {
  return morvex::winapi::newMenu();
}

HMENU WINAPI LoadMenuA(HINSTANCE module, LPCSTR name) {
  const morvex::winapi::MenuTemplate *source = morvex::winapi::findMenu(module, name);
  if (source == nullptr) {
    return nullptr;
  }
  HMENU menu = morvex::winapi::newMenu();
  morvex::winapi::build(menu, source->items, source->itemCount);
  return menu;
}

// A pop-up appended to another menu is destroyed with it, not on its own.
BOOL WINAPI DestroyMenu(HMENU menu) {
  if (!morvex::winapi::isLive(menu) || menu->parent != nullptr) {
    return FALSE;
  }
  morvex::winapi::destroy(menu);
  return TRUE;
}

BOOL WINAPI AppendMenuA(HMENU menu, UINT flags, UINT_PTR item, LPCSTR text) try {
  if (!morvex::winapi::isLive(menu)) {
    return FALSE;
  }
  MenuItem entry;
  if ((flags & MF_SEPARATOR) != 0) {
    entry.flags = MF_SEPARATOR | (flags & morvex::winapi::kStateFlags);
  } else if ((flags & MF_POPUP) != 0) {
    const auto popup = reinterpret_cast<HMENU>(item);
    // A pop-up can hang in one place only, and never inside itself.
    if (!morvex::winapi::isLive(popup) || popup->parent != nullptr) {
      return FALSE;
    }
    for (HMENU outer = menu; outer != nullptr; outer = outer->parent) {
      if (outer == popup) {
        return FALSE;
      }
    }
    entry.flags = MF_POPUP | (flags & morvex::winapi::kStateFlags);
    entry.popup = popup;
    entry.text = text == nullptr ? "" : text;
  } else {
    entry.flags = flags & morvex::winapi::kStateFlags;
    entry.id = static_cast<UINT>(item);
    entry.text = text == nullptr ? "" : text;
  }
  menu->items.reserve(menu->items.size() + 1); // may throw: before the pop-up changes hands
  if (entry.popup != nullptr) {
    entry.popup->parent = menu;
  }
  menu->items.push_back(std::move(entry));
  return TRUE;
} catch (...) {
  return FALSE;
}

int WINAPI GetMenuItemCount(HMENU menu) {
  return morvex::winapi::isLive(menu) ? static_cast<int>(menu->items.size()) : -1;
}

HMENU WINAPI GetSubMenu(HMENU menu, int position) {
  const MenuItem *item = morvex::winapi::itemAt(menu, position);
  return item == nullptr ? nullptr : item->popup;
}

UINT WINAPI GetMenuItemID(HMENU menu, int position) {
  const MenuItem *item = morvex::winapi::itemAt(menu, position);
  if (item == nullptr || item->popup != nullptr) {
    return static_cast<UINT>(-1);
  }
  return item->id;
}

UINT WINAPI GetMenuState(HMENU menu, UINT item, UINT flags) {
  const MenuItem *found = morvex::winapi::findItem(menu, item, flags);
  if (found == nullptr) {
    return static_cast<UINT>(-1);
  }
  if (found->popup != nullptr) {
    const auto count = static_cast<UINT>(std::min<std::size_t>(found->popup->items.size(), 0xFF));
    return (count << 8) | (found->flags & 0xFF);
  }
  return found->flags;
}

int WINAPI GetMenuStringA(HMENU menu, UINT item, LPSTR buffer, int size, UINT flags) {
  const MenuItem *found = morvex::winapi::findItem(menu, item, flags);
  if (found == nullptr) {
    return 0;
  }
  if (buffer == nullptr || size <= 0) {
    return static_cast<int>(found->text.size());
  }
  const std::size_t length = std::min(found->text.size(), static_cast<std::size_t>(size) - 1);
  std::memcpy(buffer, found->text.data(), length);
  buffer[length] = '\0';
  return static_cast<int>(length);
}

} // extern "C"
