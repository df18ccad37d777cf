// The real dialogs, worked through their windows.
#include "tests/windows/win32_dialog_driver.h"

#include "tests/windows/deferred_action.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace morvex::tests {
namespace {

using editor::NameListId;
using editor::SetupOption;

// The controls of the setup and name dialogs, by the numbers the host knows them by.
constexpr int kFunctionList = 20007;
constexpr int kVariableList = 20008;
constexpr int kFunctionNameField = 20009;
constexpr int kVariableNameField = 20011;
constexpr int kNewFunction = 20013;
constexpr int kEditFunction = 20014;
constexpr int kNewVariable = 20015;
constexpr int kEditVariable = 20016;
constexpr int kRemoveFunction = 20017;
constexpr int kRemoveVariable = 20018;
constexpr int kVerifyNames = 20020;
constexpr int kLoopUntilReturn = 20021;

bool isFunctions(NameListId list) {
  return list == NameListId::functions;
}
int listControl(NameListId list) {
  return isFunctions(list) ? kFunctionList : kVariableList;
}
int nameField(NameListId list) {
  return isFunctions(list) ? kFunctionNameField : kVariableNameField;
}

std::string windowText(HWND window) {
  std::vector<char> text(static_cast<std::size_t>(GetWindowTextLengthA(window)) + 1);
  GetWindowTextA(window, text.data(), static_cast<int>(text.size()));
  return text.data();
}

std::string className(HWND window) {
  char name[64] = {};
  GetClassNameA(window, name, sizeof name);
  return name;
}

std::vector<HWND> children(HWND parent) {
  std::vector<HWND> found;
  EnumChildWindows(
      parent,
      [](HWND child, LPARAM list) -> BOOL {
        reinterpret_cast<std::vector<HWND> *>(list)->push_back(child);
        return TRUE;
      },
      reinterpret_cast<LPARAM>(&found));
  return found;
}

// Sends a button the press and release of a left click.
void clickButton(HWND button) {
  SetActiveWindow(GetAncestor(button, GA_ROOT));
  SendMessageA(button, BM_CLICK, 0, 0);
}

// Types `keys` over the whole text of an edit field, one character at a time.
void typeOver(HWND field, const std::string &keys) {
  SetFocus(field);
  SendMessageA(field, EM_SETSEL, 0, -1);
  if (keys.empty()) {
    SendMessageA(field, WM_CHAR, VK_BACK, 1);
  }
  for (const char key : keys) {
    SendMessageA(field, WM_CHAR, static_cast<WPARAM>(static_cast<unsigned char>(key)), 1);
  }
}

} // namespace

HWND findOwnedDialog(HWND owner) {
  struct Search {
    HWND owner;
    HWND found;
  } search{owner, nullptr};
  EnumThreadWindows(
      GetCurrentThreadId(),
      [](HWND window, LPARAM state) -> BOOL {
        auto &wanted = *reinterpret_cast<Search *>(state);
        if (GetWindow(window, GW_OWNER) == wanted.owner && className(window) == "#32770") {
          wanted.found = window;
          return FALSE;
        }
        return TRUE;
      },
      reinterpret_cast<LPARAM>(&search));
  return search.found;
}

std::intptr_t driveSetupDialog(HWND owner, const editor::SetupDialogUser &user,
                               const std::function<std::intptr_t()> &show) {
  DeferredAction work([&] {
    HWND dialog = findOwnedDialog(owner);
    if (dialog == nullptr) {
      ADD_FAILURE() << "no setup dialog over the host's window";
      return;
    }
    Win32SetupDialogDriver driver(dialog);
    user(driver);
    if (driver.isOpen()) {
      driver.clickCancel(); // the user walked away
    }
  });
  const std::intptr_t result = show();
  EXPECT_TRUE(work.ran()) << "the setup dialog did not open";
  return result;
}

std::optional<std::string> Win32SetupDialogDriver::clickNew(NameListId list,
                                                            const editor::NameInput &input) {
  return clickOpening(isFunctions(list) ? kNewFunction : kNewVariable, list, input);
}

std::optional<std::string> Win32SetupDialogDriver::clickEdit(NameListId list,
                                                             const editor::NameInput &input) {
  return clickOpening(isFunctions(list) ? kEditFunction : kEditVariable, list, input);
}

void Win32SetupDialogDriver::clickRemove(NameListId list) {
  // Opens nothing but a message box, if anything: a name dialog would be cancelled.
  clickOpening(isFunctions(list) ? kRemoveFunction : kRemoveVariable, list,
               editor::NameInput{std::nullopt, false});
}

std::optional<std::string> Win32SetupDialogDriver::clickOpening(int button, NameListId list,
                                                                const editor::NameInput &input) {
  if (!isOpen()) {
    return std::nullopt;
  }
  std::optional<std::string> openedWith;
  DeferredAction popup([&] { workPopup(list, input, openedWith); });
  click(button);
  return openedWith;
}

void Win32SetupDialogDriver::workPopup(NameListId list, const editor::NameInput &input,
                                       std::optional<std::string> &openedWith) {
  HWND popup = findOwnedDialog(dialog_);
  if (popup == nullptr) {
    ADD_FAILURE() << "a message loop ran, but no window opened over the setup dialog";
    return;
  }
  HWND field = GetDlgItem(popup, nameField(list));
  if (field == nullptr) {
    answerMessageBox(popup);
    return;
  }
  openedWith = windowText(field);
  if (input.keys) {
    typeOver(field, *input.keys);
  }
  clickButton(GetDlgItem(popup, input.pressOk ? IDOK : IDCANCEL));
}

// Reads a message box as the author sees it (caption, text, icon, buttons) and presses OK.
void Win32SetupDialogDriver::answerMessageBox(HWND box) {
  editor::ShownMessage shown;
  shown.caption = windowText(box);
  const HICON warning = LoadIconA(nullptr, IDI_WARNING);
  std::vector<int> buttons;
  for (HWND child : children(box)) {
    if (!IsWindowVisible(child)) {
      continue;
    }
    const std::string kind = className(child);
    const auto style = static_cast<DWORD>(GetWindowLongPtrA(child, GWL_STYLE));
    if (kind == "Button") {
      buttons.push_back(GetDlgCtrlID(child));
    } else if (kind == "Static" && (style & SS_TYPEMASK) == SS_ICON) {
      shown.warningIcon =
          reinterpret_cast<HICON>(SendMessageA(child, STM_GETICON, 0, 0)) == warning;
    } else if (kind == "Static" && !windowText(child).empty()) {
      shown.text = windowText(child);
    }
  }
  shown.okButtonOnly = buttons == std::vector<int>{IDOK};
  messages_.push_back(shown);
  HWND ok = GetDlgItem(box, IDOK);
  if (ok != nullptr) {
    clickButton(ok);
  } else {
    ADD_FAILURE() << "a window over the setup dialog without an OK button: " << shown.caption;
    SendMessageA(box, WM_COMMAND, IDCANCEL, 0);
  }
}

void Win32SetupDialogDriver::select(NameListId list, int index) {
  if (isOpen()) {
    SendDlgItemMessageA(dialog_, listControl(list), LB_SETCURSEL, static_cast<WPARAM>(index), 0);
  }
}

void Win32SetupDialogDriver::toggle(SetupOption option) {
  click(option == SetupOption::verifyFunctionNames ? kVerifyNames : kLoopUntilReturn);
}

bool Win32SetupDialogDriver::isChecked(SetupOption option) const {
  const int box = option == SetupOption::verifyFunctionNames ? kVerifyNames : kLoopUntilReturn;
  return IsDlgButtonChecked(dialog_, box) == BST_CHECKED;
}

std::vector<std::string> Win32SetupDialogDriver::names(NameListId list) const {
  HWND box = GetDlgItem(dialog_, listControl(list));
  std::vector<std::string> shown;
  const auto count = SendMessageA(box, LB_GETCOUNT, 0, 0);
  for (LRESULT i = 0; i < count; ++i) {
    std::vector<char> text(static_cast<std::size_t>(SendMessageA(box, LB_GETTEXTLEN, i, 0)) + 1);
    SendMessageA(box, LB_GETTEXT, static_cast<WPARAM>(i), reinterpret_cast<LPARAM>(text.data()));
    shown.emplace_back(text.data());
  }
  return shown;
}

void *Win32SetupDialogDriver::owner() const {
  return GetWindow(dialog_, GW_OWNER);
}

void Win32SetupDialogDriver::clickOk() {
  click(IDOK);
  closed_ = true;
}

void Win32SetupDialogDriver::clickCancel() {
  click(IDCANCEL);
  closed_ = true;
}

void Win32SetupDialogDriver::click(int control) {
  if (!isOpen()) {
    return;
  }
  HWND button = GetDlgItem(dialog_, control);
  if (button == nullptr) {
    ADD_FAILURE() << "the setup dialog has no control " << control;
    return;
  }
  clickButton(button);
}

} // namespace morvex::tests
