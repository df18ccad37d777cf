// What the setup dialog and its name dialogs do, apart from any window system: the views
// they talk through, and the handling of every button. The Win32 dialogs and the Linux
// stand-in are both bindings of this logic.
#ifndef MORVEX_EDITOR_SETUP_DIALOG_LOGIC_H
#define MORVEX_EDITOR_SETUP_DIALOG_LOGIC_H

#include "host/contract.h"

#include <array>
#include <cstddef>
#include <optional>
#include <string>

namespace morvex::editor {

// The two lists of the setup dialog.
enum class NameListId { functions, members };

// The two check boxes of the setup dialog.
enum class SetupOption { verifyFunctionNames, loopUntilReturn };

// A name as the name dialog takes and gives it: up to 25 characters and a zero.
using NameBuffer = std::array<char, host::kNameEntrySize>;

// The messages the setup dialog shows, each in a warning box with an OK button.
inline constexpr const char *kErrorCaption = "Error";
inline constexpr const char *kNoFunctionSelected = "No Function Selected";
inline constexpr const char *kNoVariableSelected = "No Variable Selected";
// Shown for either list: the variable list has no text of its own.
inline constexpr const char *kLimitedTo500 = "Limited to 500 Functions";

// The open setup dialog as its logic sees it. The lists keep themselves sorted the way a
// sorted list box of the system does; indices count entries in that order.
class SetupView {
public:
  virtual ~SetupView() = default;
  // Adds a name at its sorted place.
  virtual void addName(NameListId list, const std::string &name) = 0;
  virtual void deleteName(NameListId list, int index) = 0;
  virtual int nameCount(NameListId list) const = 0;
  virtual std::string nameAt(NameListId list, int index) const = 0;
  // The selected entry, or -1.
  virtual int selectedName(NameListId list) const = 0;
  virtual bool isChecked(SetupOption option) const = 0;
  virtual void setChecked(SetupOption option, bool checked) = 0;
  // A warning box with caption kErrorCaption, this text and an OK button.
  virtual void showError(const char *text) = 0;
  // Runs the list's name dialog (modal, over the setup dialog) on `given` and answers what
  // it returns: see openNameDialog, acceptNameDialog and cancelNameDialog.
  virtual std::optional<NameBuffer> runNameDialog(NameListId list,
                                                  const std::optional<NameBuffer> &given) = 0;
};

// The open name dialog as its logic sees it: one edit field.
class NameView {
public:
  virtual ~NameView() = default;
  virtual void setFieldText(const std::string &text) = 0;
  // The most characters the field lets the author type.
  virtual void limitField(std::size_t characters) = 0;
  virtual std::string fieldText() const = 0;
};

// The text a name buffer holds, up to its zero and at most 25 characters.
std::string bufferText(const NameBuffer &buffer);

// Setup dialog: checks the boxes from the block's option bytes and fills both lists with
// the block's readable names.
void openSetupDialog(SetupView &view, const host::EditStructure &edit);

// "New", "Edit" and "Remove" under a list.
void pressNew(SetupView &view, NameListId list);
void pressEdit(SetupView &view, NameListId list);
void pressRemove(SetupView &view, NameListId list);

// "OK": writes the options and both lists (at most kMaxNames each) back into `edit`, which
// must have room for kMaxEditStructureSize bytes. "Cancel" needs no logic: the block is
// left as it was.
void acceptSetupDialog(const SetupView &view, host::EditStructure &edit);

// Name dialog: puts the given name into the field and limits the field to 25 characters.
void openNameDialog(NameView &view, const std::optional<NameBuffer> &given);
// "OK": the given buffer (or a new, zero-filled one) holding the field's text, at most 25
// characters, and a zero.
NameBuffer acceptNameDialog(const NameView &view, const std::optional<NameBuffer> &given);
// "Cancel": the given buffer unchanged, or none.
std::optional<NameBuffer> cancelNameDialog(const std::optional<NameBuffer> &given);

} // namespace morvex::editor

#endif
