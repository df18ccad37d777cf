// LoadStringA: copying a string resource into the caller's buffer.
#include "winapi/resources.h"

#include <algorithm>
#include <cstring>

extern "C" int WINAPI LoadStringA(HINSTANCE module, UINT id, LPSTR buffer, int size) {
  if (buffer == nullptr || size <= 0) {
    return 0;
  }
  const morvex::winapi::StringResource *found = morvex::winapi::findString(module, id);
  if (found == nullptr || found->text == nullptr) {
    buffer[0] = '\0';
    return 0;
  }
  const std::size_t room = static_cast<std::size_t>(size) - 1;
  const std::size_t length = std::min(std::strlen(found->text), room);
  std::memcpy(buffer, found->text, length);
  buffer[length] = '\0';
  return static_cast<int>(length);
}
