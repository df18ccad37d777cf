// MessageBoxA: handed to the installed hook, else answered with OK at once.
#include "winapi/hooks.h"

namespace morvex::winapi {
namespace {
MessageBoxHook currentHook = nullptr;
} // namespace

MessageBoxHook setMessageBoxHook(MessageBoxHook hook) {
  const MessageBoxHook previous = currentHook;
  currentHook = hook;
  return previous;
}

} // namespace morvex::winapi

extern "C" int WINAPI MessageBoxA(HWND owner, LPCSTR text, LPCSTR caption, UINT type) {
  const morvex::winapi::MessageBoxHook hook = morvex::winapi::currentHook;
  return hook == nullptr ? IDOK : hook(owner, text, caption, type);
}
