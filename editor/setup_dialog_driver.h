// How a scripted user works an open setup dialog. The Linux stand-in dialogs hand one to
// the user a test installs; a test of the real dialogs drives them through the same calls.
#ifndef MORVEX_EDITOR_SETUP_DIALOG_DRIVER_H
#define MORVEX_EDITOR_SETUP_DIALOG_DRIVER_H

#include "editor/setup_dialog_logic.h"

#include <functional>
#include <optional>
#include <string>
#include <vector>

namespace morvex::editor {

// What the user does in a name dialog once it is open.
struct NameInput {
  // Typed over the whole field, one key at a time; none leaves the field as it opened.
  std::optional<std::string> keys;
  // "OK", else "Cancel".
  bool pressOk = true;
};

// A message box the setup dialog showed, as the user saw it.
struct ShownMessage {
  std::string caption;
  std::string text;
  bool warningIcon = false;
  bool okButtonOnly = false;
};

class SetupDialogDriver {
public:
  virtual ~SetupDialogDriver() = default;
  // Click "New" or "Edit" under a list; if a name dialog opens, `input` is worked in it.
  // Answer the text the name dialog's field held as it opened, or none when no name
  // dialog opened. Every message box shown is answered with OK.
  virtual std::optional<std::string> clickNew(NameListId list, const NameInput &input) = 0;
  virtual std::optional<std::string> clickEdit(NameListId list, const NameInput &input) = 0;
  virtual void clickRemove(NameListId list) = 0;
  // Selects entry `index` of a list in its shown order; -1 selects none.
  virtual void select(NameListId list, int index) = 0;
  virtual void toggle(SetupOption option) = 0;
  virtual bool isChecked(SetupOption option) const = 0;
  // The entries of a list as shown, top to bottom.
  virtual std::vector<std::string> names(NameListId list) const = 0;
  // The message boxes shown so far, oldest first.
  virtual std::vector<ShownMessage> messages() const = 0;
  // The window the setup dialog is modal over (not owned by the driver).
  virtual void *owner() const = 0;
  // Close the dialog; nothing else has an effect afterwards.
  virtual void clickOk() = 0;
  virtual void clickCancel() = 0;
};

// A user working one setup dialog from the moment it is open.
using SetupDialogUser = std::function<void(SetupDialogDriver &dialog)>;

} // namespace morvex::editor

#endif
