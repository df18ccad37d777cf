// The setup and name dialogs' handling of their buttons, apart from any window system.
#include "editor/setup_dialog_logic.h"

#include "editor/edit_structure.h"

#include <algorithm>
#include <cstring>
#include <vector>

namespace morvex::editor {

namespace {

const char *noSelectionMessage(NameListId list) {
  return list == NameListId::functions ? kNoFunctionSelected : kNoVariableSelected;
}

NameBuffer bufferFrom(const std::string &text) {
  NameBuffer buffer{};
  const std::size_t length = std::min(std::strlen(text.c_str()), kMaxNameLength);
  std::memcpy(buffer.data(), text.data(), length);
  return buffer;
}

std::vector<std::string> listNames(const SetupView &view, NameListId list) {
  const int count = std::min(view.nameCount(list), int{host::kMaxNames});
  std::vector<std::string> names;
  for (int i = 0; i < count; ++i) {
    names.push_back(view.nameAt(list, i));
  }
  return names;
}

} // namespace

std::string bufferText(const NameBuffer &buffer) {
  return entryText(buffer.data());
}

void openSetupDialog(SetupView &view, const host::EditStructure &edit) {
  const EditSettings settings = readSettings(edit);
  view.setChecked(SetupOption::verifyFunctionNames, settings.verifyFunctionNames);
  view.setChecked(SetupOption::loopUntilReturn, settings.loopUntilReturn);
  for (const std::string &name : settings.functionNames) {
    view.addName(NameListId::functions, name);
  }
  for (const std::string &name : settings.memberNames) {
    view.addName(NameListId::members, name);
  }
}

void pressNew(SetupView &view, NameListId list) {
  if (view.nameCount(list) >= host::kMaxNames) {
    view.showError(kLimitedTo500);
    return;
  }
  if (const std::optional<NameBuffer> name = view.runNameDialog(list, std::nullopt)) {
    view.addName(list, bufferText(*name));
  }
}

void pressEdit(SetupView &view, NameListId list) {
  const int selected = view.selectedName(list);
  if (selected < 0) {
    view.showError(noSelectionMessage(list));
    return;
  }
  const NameBuffer given = bufferFrom(view.nameAt(list, selected));
  view.deleteName(list, selected);
  // The entry goes back whatever the author does: changed on OK, as it was on Cancel.
  const std::optional<NameBuffer> name = view.runNameDialog(list, given);
  view.addName(list, bufferText(name.value_or(given)));
}

void pressRemove(SetupView &view, NameListId list) {
  const int selected = view.selectedName(list);
  if (selected < 0) {
    view.showError(noSelectionMessage(list));
    return;
  }
  view.deleteName(list, selected);
}

void acceptSetupDialog(const SetupView &view, host::EditStructure &edit) {
  EditSettings settings;
  settings.verifyFunctionNames = view.isChecked(SetupOption::verifyFunctionNames);
  settings.loopUntilReturn = view.isChecked(SetupOption::loopUntilReturn);
  settings.functionNames = listNames(view, NameListId::functions);
  settings.memberNames = listNames(view, NameListId::members);
  writeSettings(edit, settings);
}

void openNameDialog(NameView &view, const std::optional<NameBuffer> &given) {
  if (given) {
    view.setFieldText(bufferText(*given));
  }
  view.limitField(kMaxNameLength);
}

NameBuffer acceptNameDialog(const NameView &view, const std::optional<NameBuffer> &given) {
  NameBuffer buffer = given.value_or(NameBuffer{});
  const std::string text = view.fieldText();
  const std::size_t length = std::min(std::strlen(text.c_str()), kMaxNameLength);
  std::memcpy(buffer.data(), text.data(), length);
  buffer[length] = '\0';
  return buffer;
}

std::optional<NameBuffer> cancelNameDialog(const std::optional<NameBuffer> &given) {
  return given;
}

} // namespace morvex::editor
