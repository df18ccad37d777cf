// The setup dialog scenarios on the real Win32 dialogs, loaded from this program's
// resources and worked with clicks and keystrokes. Windows only.
#if defined(_WIN32)

#include "tests/editor/module_resources.h"
#include "tests/editor/setup_dialog_scenarios.h"
#include "tests/windows/host_window.h"
#include "tests/windows/win32_dialog_driver.h"

#include <gtest/gtest.h>

namespace morvex::tests {
namespace {

// Shows the dialogs over a hidden window that stands for the host's.
class Win32Binding {
public:
  Win32Binding() {
    useModuleResources();
    context_.mainWindow = window_.handle();
  }

  host::EditorContext &context() { return context_; }
  bool run(host::EditStructure &edit, editor::SetupDialogUser user) {
    return driveSetupDialog(window_.handle(), user,
                            [&] { return editor::runSetupDialog(&context_, edit) ? 1 : 0; }) != 0;
  }

private:
  HostWindow window_;
  host::EditorContext context_{};
};

INSTANTIATE_TYPED_TEST_SUITE_P(Win32, SetupDialogScenarios, Win32Binding);

} // namespace
} // namespace morvex::tests

#endif
