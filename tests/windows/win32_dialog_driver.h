// Works the real setup and name dialogs with an author's clicks and keystrokes: BM_CLICK,
// LB_SETCURSEL, WM_CHAR into the name field, OK on every message box.
#ifndef MORVEX_TESTS_WINDOWS_WIN32_DIALOG_DRIVER_H
#define MORVEX_TESTS_WINDOWS_WIN32_DIALOG_DRIVER_H

#include "editor/setup_dialog_driver.h"

#include <windows.h>

#include <cstdint>
#include <functional>

namespace morvex::tests {

// Shows a setup dialog through `show`, which must open it modally over `owner`, and has
// `user` work it once it is up. A user who leaves it open has it cancelled. Answers what
// `show` answered; a dialog that never opened fails the test.
std::intptr_t driveSetupDialog(HWND owner, const editor::SetupDialogUser &user,
                               const std::function<std::intptr_t()> &show);

// The dialog box of this thread owned by `owner` (a dialog over it), or null.
HWND findOwnedDialog(HWND owner);

// The driver of one open setup dialog.
class Win32SetupDialogDriver : public editor::SetupDialogDriver {
public:
  explicit Win32SetupDialogDriver(HWND dialog) : dialog_(dialog) {}

  std::optional<std::string> clickNew(editor::NameListId list,
                                      const editor::NameInput &input) override;
  std::optional<std::string> clickEdit(editor::NameListId list,
                                       const editor::NameInput &input) override;
  void clickRemove(editor::NameListId list) override;
  void select(editor::NameListId list, int index) override;
  void toggle(editor::SetupOption option) override;
  bool isChecked(editor::SetupOption option) const override;
  std::vector<std::string> names(editor::NameListId list) const override;
  std::vector<editor::ShownMessage> messages() const override { return messages_; }
  void *owner() const override;
  void clickOk() override;
  void clickCancel() override;

  bool isOpen() const { return IsWindow(dialog_) && !closed_; }
  HWND window() const { return dialog_; }

private:
  // Clicks `button`, which may open a name dialog for `list` or a message box; works it.
  // Answers the name field's text as it opened, or none when no name dialog opened.
  std::optional<std::string> clickOpening(int button, editor::NameListId list,
                                          const editor::NameInput &input);
  void workPopup(editor::NameListId list, const editor::NameInput &input,
                 std::optional<std::string> &openedWith);
  void answerMessageBox(HWND box);
  void click(int control);

  HWND dialog_;
  bool closed_ = false;
  std::vector<editor::ShownMessage> messages_;
};

} // namespace morvex::tests

#endif
