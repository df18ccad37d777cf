// One-shot thread timers that run a test's work from inside a running message loop.
#include "tests/windows/deferred_action.h"

#include <gtest/gtest.h>

#include <map>

namespace morvex::tests {
namespace {

// The armed actions of this thread, by timer.
std::map<UINT_PTR, DeferredAction *> &armed() {
  static std::map<UINT_PTR, DeferredAction *> actions;
  return actions;
}

} // namespace

DeferredAction::DeferredAction(std::function<void()> action) : action_(std::move(action)) {
  timer_ = SetTimer(nullptr, 0, USER_TIMER_MINIMUM, &DeferredAction::fire);
  if (timer_ == 0) {
    ADD_FAILURE() << "SetTimer failed: " << GetLastError();
    return;
  }
  armed()[timer_] = this;
}

DeferredAction::~DeferredAction() {
  if (timer_ != 0 && armed().erase(timer_) != 0) {
    KillTimer(nullptr, timer_);
  }
}

void CALLBACK DeferredAction::fire(HWND, UINT, UINT_PTR timer, DWORD) {
  KillTimer(nullptr, timer);
  const auto found = armed().find(timer);
  if (found == armed().end()) {
    return;
  }
  DeferredAction &deferred = *found->second;
  armed().erase(found);
  deferred.ran_ = true;
  deferred.action_();
}

} // namespace morvex::tests
