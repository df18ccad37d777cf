// The stand-in setup and name dialogs of the Linux build, worked by a scripted user.
#ifndef _WIN32

#include "editor/setup_dialog_standin.h"

#include "editor/setup_dialog.h"
#include "editor/standin_list_box.h"

#include <utility>

namespace morvex::editor {

namespace {

SetupDialogUser &installedUser() {
  static SetupDialogUser user;
  return user;
}

// The name dialog's edit field: lower-cases the letters typed and refuses keys past its
// limit, as the field's styles make the system's edit control do.
class StandinNameField : public NameView {
public:
  void setFieldText(const std::string &text) override { text_ = text; }
  void limitField(std::size_t characters) override { limit_ = characters; }
  std::string fieldText() const override { return text_; }

  void typeOver(const std::string &keys) {
    text_.clear();
    for (char key : keys) {
      if (text_.size() < limit_) {
        text_.push_back(key >= 'A' && key <= 'Z' ? static_cast<char>(key - 'A' + 'a') : key);
      }
    }
  }

private:
  std::string text_;
  std::size_t limit_ = 30000; // the system's own limit until one is set
};

class StandinSetupDialog : public SetupView, public SetupDialogDriver {
public:
  StandinSetupDialog(void *owner, host::EditStructure &edit) : owner_(owner), edit_(edit) {}

  bool accepted() const { return state_ == State::accepted; }
  bool isOpen() const { return state_ == State::open; }

  // SetupView: what the logic sees.
  void addName(NameListId list, const std::string &name) override { listOf(list).add(name); }
  void deleteName(NameListId list, int index) override { listOf(list).remove(index); }
  int nameCount(NameListId list) const override { return listOf(list).count(); }
  std::string nameAt(NameListId list, int index) const override { return listOf(list).at(index); }
  int selectedName(NameListId list) const override { return listOf(list).selected(); }
  bool isChecked(SetupOption option) const override { return checkOf(option); }
  void setChecked(SetupOption option, bool checked) override { checkOf(option) = checked; }
  void showError(const char *text) override {
    messages_.push_back(ShownMessage{kErrorCaption, text, true, true});
  }
  std::optional<NameBuffer> runNameDialog(NameListId,
                                          const std::optional<NameBuffer> &given) override {
    StandinNameField field;
    openNameDialog(field, given);
    nameDialogOpenedWith_ = field.fieldText();
    // A name dialog opened without a user's input in hand is cancelled.
    const NameInput input = pendingInput_.value_or(NameInput{std::nullopt, false});
    if (input.keys) {
      field.typeOver(*input.keys);
    }
    return input.pressOk ? std::optional<NameBuffer>(acceptNameDialog(field, given))
                         : cancelNameDialog(given);
  }

  // SetupDialogDriver: what the user does.
  std::optional<std::string> clickNew(NameListId list, const NameInput &input) override {
    return clickWithNameDialog(input, [&] { pressNew(*this, list); });
  }
  std::optional<std::string> clickEdit(NameListId list, const NameInput &input) override {
    return clickWithNameDialog(input, [&] { pressEdit(*this, list); });
  }
  void clickRemove(NameListId list) override {
    if (isOpen()) {
      pressRemove(*this, list);
    }
  }
  void select(NameListId list, int index) override {
    if (isOpen()) {
      listOf(list).select(index);
    }
  }
  void toggle(SetupOption option) override {
    if (isOpen()) {
      checkOf(option) = !checkOf(option);
    }
  }
  std::vector<std::string> names(NameListId list) const override { return listOf(list).texts(); }
  std::vector<ShownMessage> messages() const override { return messages_; }
  void *owner() const override { return owner_; }
  void clickOk() override {
    if (isOpen()) {
      acceptSetupDialog(*this, edit_);
      state_ = State::accepted;
    }
  }
  void clickCancel() override {
    if (isOpen()) {
      state_ = State::cancelled;
    }
  }

private:
  enum class State { open, accepted, cancelled };

  template <class Click>
  std::optional<std::string> clickWithNameDialog(const NameInput &input, Click click) {
    if (!isOpen()) {
      return std::nullopt;
    }
    pendingInput_ = input;
    nameDialogOpenedWith_.reset();
    click();
    pendingInput_.reset();
    return std::exchange(nameDialogOpenedWith_, std::nullopt);
  }

  StandinListBox &listOf(NameListId list) {
    return list == NameListId::functions ? functions_ : members_;
  }
  const StandinListBox &listOf(NameListId list) const {
    return list == NameListId::functions ? functions_ : members_;
  }
  bool &checkOf(SetupOption option) {
    return option == SetupOption::verifyFunctionNames ? verify_ : loop_;
  }
  bool checkOf(SetupOption option) const {
    return option == SetupOption::verifyFunctionNames ? verify_ : loop_;
  }

  void *owner_;
  host::EditStructure &edit_;
  State state_ = State::open;
  StandinListBox functions_;
  StandinListBox members_;
  bool verify_ = false;
  bool loop_ = false;
  std::vector<ShownMessage> messages_;
  std::optional<NameInput> pendingInput_;
  std::optional<std::string> nameDialogOpenedWith_;
};

} // namespace

SetupDialogUser installStandinUser(SetupDialogUser user) {
  return std::exchange(installedUser(), std::move(user));
}

bool runSetupDialog(host::EditorContext *context, host::EditStructure &edit) {
  StandinSetupDialog dialog(context ? context->mainWindow : nullptr, edit);
  openSetupDialog(dialog, edit);
  // A copy: the user may install another user while working this dialog.
  const SetupDialogUser user = installedUser();
  if (user) {
    user(dialog);
  } else {
    dialog.clickOk();
  }
  dialog.clickCancel();
  return dialog.accepted();
}

} // namespace morvex::editor

#endif
