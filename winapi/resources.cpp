// Finding a module's resources by number.
#include "winapi/resources.h"

#include <algorithm>
#include <span>

namespace morvex::winapi {
namespace {

// Resources are named by number only; a text name finds nothing.
bool numberOf(LPCSTR name, UINT &id) {
  if (name == nullptr || !IS_INTRESOURCE(name)) {
    return false;
  }
  id = static_cast<UINT>(reinterpret_cast<ULONG_PTR>(name));
  return true;
}

template <class Resource>
const Resource *findById(const Resource *first, std::size_t count, UINT id) {
  if (first == nullptr) {
    return nullptr;
  }
  const std::span<const Resource> all(first, count);
  const auto found =
      std::find_if(all.begin(), all.end(), [id](const Resource &r) { return r.id == id; });
  return found == all.end() ? nullptr : &*found;
}

} // namespace

const StringResource *findString(HINSTANCE module, UINT id) {
  if (module == nullptr) {
    return nullptr;
  }
  return findById(module->resources.strings, module->resources.stringCount, id);
}

const MenuTemplate *findMenu(HINSTANCE module, LPCSTR name) {
  UINT id = 0;
  if (module == nullptr || !numberOf(name, id)) {
    return nullptr;
  }
  return findById(module->resources.menus, module->resources.menuCount, id);
}

const DialogTemplate *findDialog(HINSTANCE module, LPCSTR name) {
  UINT id = 0;
  if (module == nullptr || !numberOf(name, id)) {
    return nullptr;
  }
  return findById(module->resources.dialogs, module->resources.dialogCount, id);
}

} // namespace morvex::winapi
