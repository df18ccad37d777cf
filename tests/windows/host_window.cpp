// The stand-in for the host's main window.
#include "tests/windows/host_window.h"

#include <gtest/gtest.h>

namespace morvex::tests {

HostWindow::HostWindow()
    : window_(CreateWindowExA(0, "STATIC", "Host", WS_OVERLAPPEDWINDOW, 0, 0, 640, 480, nullptr,
                              nullptr, GetModuleHandleA(nullptr), nullptr)) {
  EXPECT_NE(window_, nullptr) << "CreateWindowExA failed: " << GetLastError();
}

HostWindow::~HostWindow() {
  if (window_ != nullptr) {
    DestroyWindow(window_);
  }
}

} // namespace morvex::tests
