// Shows the built DLL's setup dialog and a name dialog and holds each still while
// take_screenshots takes its picture: dialog_pictures DLL FOLDER.
#include "host/contract.h"
#include "tests/editor/edit_block.h"
#include "tests/windows/deferred_action.h"
#include "tests/windows/host_window.h"
#include "tests/windows/win32_dialog_driver.h"

#include <windows.h>

#include <cstdio>
#include <fstream>
#include <string>

namespace morvex::tests {
namespace {

constexpr DWORD kSettleMilliseconds = 500;
constexpr DWORD kPictureTimeoutMilliseconds = 60000;

// Lets the windows paint for a while.
void pumpMessages(DWORD milliseconds) {
  const ULONGLONG until = GetTickCount64() + milliseconds;
  while (GetTickCount64() < until) {
    MSG message;
    while (PeekMessageA(&message, nullptr, 0, 0, PM_REMOVE)) {
      TranslateMessage(&message);
      DispatchMessageA(&message);
    }
    Sleep(10);
  }
}

// Places `window` at `x`, `y` and lets it paint; then writes FOLDER/NAME.rect, the window's
// "WxH+X+Y" on the screen, and waits until FOLDER/NAME.done says its picture was taken.
bool holdForPicture(HWND window, int x, int y, const std::string &folder, const char *name) {
  SetWindowPos(window, HWND_TOP, x, y, 0, 0, SWP_NOSIZE | SWP_SHOWWINDOW);
  pumpMessages(kSettleMilliseconds);
  RECT rect{};
  GetWindowRect(window, &rect);
  std::ofstream(folder + "\\" + name + ".rect")
      << rect.right - rect.left << 'x' << rect.bottom - rect.top << '+' << rect.left << '+'
      << rect.top << '\n';
  const std::string done = folder + "\\" + name + ".done";
  const ULONGLONG until = GetTickCount64() + kPictureTimeoutMilliseconds;
  while (GetFileAttributesA(done.c_str()) == INVALID_FILE_ATTRIBUTES) {
    if (GetTickCount64() > until) {
      std::fprintf(stderr, "dialog_pictures: no picture of %s was taken\n", name);
      return false;
    }
    pumpMessages(50);
  }
  return true;
}

// The setup dialog on a sample object with one entry selected, then the function name
// dialog with a name being typed; everything is cancelled at the end.
int showDialogs(const std::string &dll, const std::string &folder) {
  HMODULE module = LoadLibraryA(dll.c_str());
  if (module == nullptr) {
    std::fprintf(stderr, "dialog_pictures: cannot load %s\n", dll.c_str());
    return 1;
  }
  const auto editObject = reinterpret_cast<host::EditObjectFn>(
      reinterpret_cast<void *>(GetProcAddress(module, MAKEINTRESOURCEA(18))));
  HostWindow host;
  host::EditorContext context{};
  context.mainWindow = host.handle();
  EditBlock block = EditBlock::holding({"attack", "heal", "move_to", "respawn"},
                                       {"hp", "mana", "name", "speed", "target"});
  block.bytes()[kVerifyOffset] = 1;

  bool taken = false;
  driveSetupDialog(
      host.handle(),
      [&](editor::SetupDialogDriver &driver) {
        HWND setup = static_cast<Win32SetupDialogDriver &>(driver).window();
        driver.select(editor::NameListId::functions, 1);
        if (!holdForPicture(setup, 16, 16, folder, "setup_dialog")) {
          return;
        }
        DeferredAction nameDialog([&] {
          HWND dialog = findOwnedDialog(setup);
          if (dialog == nullptr) {
            std::fprintf(stderr, "dialog_pictures: no name dialog opened\n");
            return;
          }
          SetDlgItemTextA(dialog, 20009, "jump");
          taken = holdForPicture(dialog, 16, 16, folder, "name_dialog");
          SendMessageA(GetDlgItem(dialog, IDCANCEL), BM_CLICK, 0, 0);
        });
        SetActiveWindow(setup);
        SendMessageA(GetDlgItem(setup, 20013), BM_CLICK, 0, 0); // "New" function
        driver.clickCancel();
      },
      [&] { return editObject(&context, 0, 0, &block.edit()); });
  FreeLibrary(module);
  return taken ? 0 : 1;
}

} // namespace
} // namespace morvex::tests

int main(int argc, char **argv) {
  if (argc != 3) {
    std::fprintf(stderr, "usage: dialog_pictures DLL FOLDER\n");
    return 2;
  }
  return morvex::tests::showDialogs(argv[1], argv[2]);
}
