// Work handed to the thread's message loop, whichever loop runs it: the way a test gets
// control back inside the modal loop of a dialog or message box it has just opened.
#ifndef MORVEX_TESTS_WINDOWS_DEFERRED_ACTION_H
#define MORVEX_TESTS_WINDOWS_DEFERRED_ACTION_H

#include <windows.h>

#include <functional>

namespace morvex::tests {

// Runs `action` once, from the next message loop of this thread that dispatches a timer
// message, unless it is destroyed first.
class DeferredAction {
public:
  explicit DeferredAction(std::function<void()> action);
  ~DeferredAction();
  DeferredAction(const DeferredAction &) = delete;
  DeferredAction &operator=(const DeferredAction &) = delete;

  bool ran() const { return ran_; }

private:
  static void CALLBACK fire(HWND, UINT, UINT_PTR timer, DWORD);

  std::function<void()> action_;
  UINT_PTR timer_ = 0;
  bool ran_ = false;
};

} // namespace morvex::tests

#endif
