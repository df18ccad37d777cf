// The setup and name dialogs on Windows: the module's dialog resources, run modally, with
// their buttons handed to the dialog logic.
#include "editor/setup_dialog.h"

#include "editor/module.h"
#include "editor/resource_ids.h"
#include "editor/setup_dialog_logic.h"

#include <windows.h>

#include <string>
#include <vector>

namespace morvex::editor {

namespace {

// What the dialog procedures end their dialogs with. Neither is 0 or -1, which
// DialogBoxParamA answers when it could not show the dialog at all.
constexpr INT_PTR kClosedWithOk = 1;
constexpr INT_PTR kClosedWithCancel = 2;

int listControl(NameListId list) {
  return list == NameListId::functions ? IDC_FUNCTION_LIST : IDC_VARIABLE_LIST;
}

int checkControl(SetupOption option) {
  return option == SetupOption::verifyFunctionNames ? IDC_VERIFY_NAMES : IDC_LOOP_UNTIL_RETURN;
}

// Text of a control, as long as it is.
std::string controlText(HWND control) {
  std::vector<char> text(static_cast<std::size_t>(GetWindowTextLengthA(control)) + 1);
  GetWindowTextA(control, text.data(), static_cast<int>(text.size()));
  return text.data();
}

// What a name dialog works on; it lives on the stack of runNameDialog for the dialog's run.
struct NameDialogState {
  int field;
  std::optional<NameBuffer> given;
  std::optional<NameBuffer> result;
};

class Win32NameView : public NameView {
public:
  explicit Win32NameView(HWND field) : field_(field) {}
  void setFieldText(const std::string &text) override { SetWindowTextA(field_, text.c_str()); }
  void limitField(std::size_t characters) override {
    SendMessageA(field_, EM_LIMITTEXT, static_cast<WPARAM>(characters), 0);
  }
  std::string fieldText() const override { return controlText(field_); }

private:
  HWND field_;
};

INT_PTR CALLBACK nameDialogProc(HWND dialog, UINT message, WPARAM wParam, LPARAM lParam) {
  if (message == WM_INITDIALOG) {
    SetWindowLongPtrA(dialog, DWLP_USER, lParam);
    auto &state = *reinterpret_cast<NameDialogState *>(lParam);
    Win32NameView view(GetDlgItem(dialog, state.field));
    openNameDialog(view, state.given);
    return TRUE;
  }
  if (message != WM_COMMAND) {
    return FALSE;
  }
  auto *state = reinterpret_cast<NameDialogState *>(GetWindowLongPtrA(dialog, DWLP_USER));
  if (state == nullptr) {
    return FALSE;
  }
  switch (LOWORD(wParam)) {
  case IDOK: {
    const Win32NameView view(GetDlgItem(dialog, state->field));
    state->result = acceptNameDialog(view, state->given);
    EndDialog(dialog, kClosedWithOk);
    return TRUE;
  }
  case IDCANCEL:
    state->result = cancelNameDialog(state->given);
    EndDialog(dialog, kClosedWithCancel);
    return TRUE;
  default:
    return FALSE;
  }
}

class Win32SetupView : public SetupView {
public:
  explicit Win32SetupView(HWND dialog) : dialog_(dialog) {}

  void addName(NameListId list, const std::string &name) override {
    sendToList(list, LB_ADDSTRING, 0, reinterpret_cast<LPARAM>(name.c_str()));
  }
  void deleteName(NameListId list, int index) override {
    sendToList(list, LB_DELETESTRING, static_cast<WPARAM>(index), 0);
  }
  int nameCount(NameListId list) const override {
    return static_cast<int>(sendToList(list, LB_GETCOUNT, 0, 0));
  }
  std::string nameAt(NameListId list, int index) const override {
    const LRESULT length = sendToList(list, LB_GETTEXTLEN, static_cast<WPARAM>(index), 0);
    if (length == LB_ERR) {
      return {};
    }
    std::vector<char> text(static_cast<std::size_t>(length) + 1);
    sendToList(list, LB_GETTEXT, static_cast<WPARAM>(index), reinterpret_cast<LPARAM>(text.data()));
    return text.data();
  }
  int selectedName(NameListId list) const override {
    return static_cast<int>(sendToList(list, LB_GETCURSEL, 0, 0));
  }
  bool isChecked(SetupOption option) const override {
    return IsDlgButtonChecked(dialog_, checkControl(option)) == BST_CHECKED;
  }
  void setChecked(SetupOption option, bool checked) override {
    CheckDlgButton(dialog_, checkControl(option), checked ? BST_CHECKED : BST_UNCHECKED);
  }
  void showError(const char *text) override {
    MessageBoxA(dialog_, text, kErrorCaption, MB_OK | MB_ICONWARNING);
  }
  std::optional<NameBuffer> runNameDialog(NameListId list,
                                          const std::optional<NameBuffer> &given) override {
    const bool functions = list == NameListId::functions;
    NameDialogState state{functions ? IDC_FUNCTION_NAME : IDC_VARIABLE_NAME, given, std::nullopt};
    const INT_PTR closed = DialogBoxParamA(
        moduleHandle(), MAKEINTRESOURCEA(functions ? IDD_EDIT_FUNCTION : IDD_EDIT_VARIABLE),
        dialog_, nameDialogProc, reinterpret_cast<LPARAM>(&state));
    // A name dialog that could not be shown counts as cancelled.
    return closed == kClosedWithOk ? state.result : cancelNameDialog(given);
  }

private:
  LRESULT sendToList(NameListId list, UINT message, WPARAM wParam, LPARAM lParam) const {
    return SendDlgItemMessageA(dialog_, listControl(list), message, wParam, lParam);
  }

  HWND dialog_;
};

INT_PTR CALLBACK setupDialogProc(HWND dialog, UINT message, WPARAM wParam, LPARAM lParam) {
  if (message == WM_INITDIALOG) {
    SetWindowLongPtrA(dialog, DWLP_USER, lParam);
    Win32SetupView view(dialog);
    openSetupDialog(view, *reinterpret_cast<const host::EditStructure *>(lParam));
    return TRUE;
  }
  if (message != WM_COMMAND || HIWORD(wParam) != BN_CLICKED) {
    return FALSE;
  }
  auto *edit = reinterpret_cast<host::EditStructure *>(GetWindowLongPtrA(dialog, DWLP_USER));
  if (edit == nullptr) {
    return FALSE;
  }
  Win32SetupView view(dialog);
  switch (LOWORD(wParam)) {
  case IDC_NEW_FUNCTION:
    pressNew(view, NameListId::functions);
    return TRUE;
  case IDC_EDIT_FUNCTION:
    pressEdit(view, NameListId::functions);
    return TRUE;
  case IDC_REMOVE_FUNCTION:
    pressRemove(view, NameListId::functions);
    return TRUE;
  case IDC_NEW_VARIABLE:
    pressNew(view, NameListId::members);
    return TRUE;
  case IDC_EDIT_VARIABLE:
    pressEdit(view, NameListId::members);
    return TRUE;
  case IDC_REMOVE_VARIABLE:
    pressRemove(view, NameListId::members);
    return TRUE;
  case IDOK:
    acceptSetupDialog(view, *edit);
    EndDialog(dialog, kClosedWithOk);
    return TRUE;
  case IDCANCEL:
    EndDialog(dialog, kClosedWithCancel);
    return TRUE;
  default:
    return FALSE;
  }
}

} // namespace

bool runSetupDialog(host::EditorContext *context, host::EditStructure &edit) {
  HWND owner = context ? static_cast<HWND>(context->mainWindow) : nullptr;
  return DialogBoxParamA(moduleHandle(), MAKEINTRESOURCEA(IDD_SETUP), owner, setupDialogProc,
                         reinterpret_cast<LPARAM>(&edit)) == kClosedWithOk;
}

} // namespace morvex::editor
