// A hidden top-level window standing for the host's main window, which the setup dialog
// is modal over.
#ifndef MORVEX_TESTS_WINDOWS_HOST_WINDOW_H
#define MORVEX_TESTS_WINDOWS_HOST_WINDOW_H

#include <windows.h>

namespace morvex::tests {

class HostWindow {
public:
  HostWindow();
  ~HostWindow();
  HostWindow(const HostWindow &) = delete;
  HostWindow &operator=(const HostWindow &) = delete;

  HWND handle() const { return window_; }

private:
  HWND window_;
};

} // namespace morvex::tests

#endif
