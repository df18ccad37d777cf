// The setup dialog as an author uses it, written once for every binding of the dialogs.
//
// A test program instantiates the suite with a Binding type that offers
//   host::EditorContext &context();  // the context handed to runSetupDialog
//   bool run(host::EditStructure &edit, editor::SetupDialogUser user);
// where run shows the setup dialog on `edit` through runSetupDialog(&context(), edit),
// has `user` work it through a SetupDialogDriver, and answers runSetupDialog's result:
//   INSTANTIATE_TYPED_TEST_SUITE_P(Name, SetupDialogScenarios, Binding);
#ifndef MORVEX_TESTS_EDITOR_SETUP_DIALOG_SCENARIOS_H
#define MORVEX_TESTS_EDITOR_SETUP_DIALOG_SCENARIOS_H

#include "editor/setup_dialog.h"
#include "editor/setup_dialog_driver.h"
#include "tests/editor/edit_block.h"

#include <gtest/gtest.h>

#include <cstring>
#include <string>
#include <utility>
#include <vector>

namespace morvex::tests {

using editor::NameInput;
using editor::NameListId;
using editor::SetupDialogDriver;
using editor::SetupOption;
using editor::ShownMessage;
using Names = std::vector<std::string>;

inline constexpr NameListId kFunctions = NameListId::functions;
inline constexpr NameListId kMembers = NameListId::members;

// Name dialog inputs: type these keys and press OK, or type them and press Cancel.
inline NameInput typed(std::string keys) {
  return NameInput{std::move(keys), true};
}
inline NameInput typedThenCancelled(std::string keys) {
  return NameInput{std::move(keys), false};
}

// The index of `name` in a list as shown, or -1.
inline int indexOf(const SetupDialogDriver &dialog, NameListId list, const std::string &name) {
  const Names shown = dialog.names(list);
  for (std::size_t i = 0; i < shown.size(); ++i) {
    if (shown[i] == name) {
      return static_cast<int>(i);
    }
  }
  return -1;
}

inline std::vector<std::string> messageTexts(const SetupDialogDriver &dialog) {
  std::vector<std::string> texts;
  for (const ShownMessage &message : dialog.messages()) {
    texts.push_back(message.text);
  }
  return texts;
}

template <class Binding>
class SetupDialogScenarios : public ::testing::Test {
protected:
  bool run(EditBlock &block, editor::SetupDialogUser user) {
    return binding_.run(block.edit(), std::move(user));
  }
  host::EditorContext &context() { return binding_.context(); }

private:
  Binding binding_;
};

TYPED_TEST_SUITE_P(SetupDialogScenarios);

TYPED_TEST_P(SetupDialogScenarios, NamesComeBackSortedAndLowerCased) {
  EditBlock block = EditBlock::holding({}, {});
  Names shown;
  const bool accepted = this->run(block, [&](SetupDialogDriver &dialog) {
    for (const char *name : {"Gamma", "beta", "Alpha"}) {
      EXPECT_EQ(dialog.clickNew(kFunctions, typed(name)), std::string());
    }
    dialog.clickNew(kMembers, typed("Zed"));
    dialog.clickNew(kMembers, typed("ALPHA"));
    shown = dialog.names(kFunctions);
    dialog.clickOk();
  });
  EXPECT_TRUE(accepted);
  EXPECT_EQ(shown, (Names{"alpha", "beta", "gamma"}));
  EXPECT_EQ(block.functionNames(), (Names{"alpha", "beta", "gamma"}));
  EXPECT_EQ(block.memberNames(), (Names{"alpha", "zed"}));
  EXPECT_EQ(block.u32(kSizeOffset), host::editStructureSize(3, 2));
}

TYPED_TEST_P(SetupDialogScenarios, OpensOnTheStoredListsAndOptionsAndWritesTheBoxesBack) {
  EditBlock block = EditBlock::holding({"walk", "jump"}, {"speed"});
  block.bytes()[kVerifyOffset] = 7; // any value but 0 checks the box
  Names functions, members;
  bool verify = false, loop = true;
  this->run(block, [&](SetupDialogDriver &dialog) {
    functions = dialog.names(kFunctions);
    members = dialog.names(kMembers);
    verify = dialog.isChecked(SetupOption::verifyFunctionNames);
    loop = dialog.isChecked(SetupOption::loopUntilReturn);
    dialog.toggle(SetupOption::verifyFunctionNames);
    dialog.toggle(SetupOption::loopUntilReturn);
    dialog.clickOk();
  });
  EXPECT_EQ(functions, (Names{"jump", "walk"}));
  EXPECT_EQ(members, (Names{"speed"}));
  EXPECT_TRUE(verify);
  EXPECT_FALSE(loop);
  EXPECT_EQ(block.bytes()[kVerifyOffset], 0);
  EXPECT_EQ(block.bytes()[kLoopOffset], 1);
  EXPECT_EQ(block.functionNames(), (Names{"jump", "walk"})); // the shown order
}

TYPED_TEST_P(SetupDialogScenarios, EditPutsTheRenamedEntryAtItsSortedPlace) {
  EditBlock block = EditBlock::holding({}, {"mango", "zeta"});
  std::optional<std::string> openedWith;
  Names afterEdit;
  std::vector<std::string> messages;
  this->run(block, [&](SetupDialogDriver &dialog) {
    dialog.select(kMembers, indexOf(dialog, kMembers, "zeta"));
    openedWith = dialog.clickEdit(kMembers, typed("Apple"));
    afterEdit = dialog.names(kMembers);
    dialog.clickRemove(kMembers); // the selection went with the edit
    messages = messageTexts(dialog);
    dialog.clickOk();
  });
  EXPECT_EQ(openedWith, "zeta");
  EXPECT_EQ(afterEdit, (Names{"apple", "mango"}));
  EXPECT_EQ(messages, (std::vector<std::string>{"No Variable Selected"}));
  EXPECT_EQ(block.memberNames(), (Names{"apple", "mango"}));
}

TYPED_TEST_P(SetupDialogScenarios, CancelInANameDialogChangesNoEntry) {
  EditBlock block = EditBlock::holding({"alpha", "omega"}, {});
  Names shown;
  this->run(block, [&](SetupDialogDriver &dialog) {
    EXPECT_EQ(dialog.clickNew(kFunctions, typedThenCancelled("dropped")), std::string());
    dialog.select(kFunctions, 0);
    EXPECT_EQ(dialog.clickEdit(kFunctions, typedThenCancelled("zzz")), "alpha");
    dialog.select(kFunctions, 1);
    dialog.clickEdit(kFunctions, NameInput{}); // OK on the name as it opened
    shown = dialog.names(kFunctions);
    dialog.clickOk();
  });
  EXPECT_EQ(shown, (Names{"alpha", "omega"}));
  EXPECT_EQ(block.functionNames(), (Names{"alpha", "omega"}));
}

TYPED_TEST_P(SetupDialogScenarios, RemoveDeletesTheSelectedEntryAtOnce) {
  EditBlock block = EditBlock::holding({"a", "b", "c"}, {"m"});
  this->run(block, [](SetupDialogDriver &dialog) {
    dialog.select(kFunctions, 1);
    dialog.clickRemove(kFunctions);
    dialog.select(kMembers, 0);
    dialog.clickRemove(kMembers);
    EXPECT_TRUE(dialog.messages().empty());
    dialog.clickOk();
  });
  EXPECT_EQ(block.functionNames(), (Names{"a", "c"}));
  EXPECT_TRUE(block.memberNames().empty());
  EXPECT_EQ(block.u32(kSizeOffset), host::editStructureSize(2, 0));
}

TYPED_TEST_P(SetupDialogScenarios, EditOrRemoveWithNothingSelectedShowsTheListsMessage) {
  EditBlock block = EditBlock::holding({"f"}, {"v"});
  const std::vector<unsigned char> before = block.snapshot();
  std::vector<ShownMessage> messages;
  this->run(block, [&](SetupDialogDriver &dialog) {
    EXPECT_EQ(dialog.clickEdit(kFunctions, typed("x")), std::nullopt);
    dialog.clickRemove(kFunctions);
    dialog.select(kMembers, -1);
    EXPECT_EQ(dialog.clickEdit(kMembers, typed("x")), std::nullopt);
    dialog.clickRemove(kMembers);
    EXPECT_EQ(dialog.names(kFunctions), (Names{"f"}));
    EXPECT_EQ(dialog.names(kMembers), (Names{"v"}));
    messages = dialog.messages();
    dialog.clickOk();
  });
  ASSERT_EQ(messages.size(), 4u);
  EXPECT_EQ(messages[0].text, "No Function Selected");
  EXPECT_EQ(messages[1].text, "No Function Selected");
  EXPECT_EQ(messages[2].text, "No Variable Selected");
  EXPECT_EQ(messages[3].text, "No Variable Selected");
  for (const ShownMessage &message : messages) {
    EXPECT_EQ(message.caption, "Error");
    EXPECT_TRUE(message.warningIcon);
    EXPECT_TRUE(message.okButtonOnly);
  }
  EXPECT_EQ(block.snapshot(), before); // OK on unchanged lists writes the same bytes
}

TYPED_TEST_P(SetupDialogScenarios, EachListIsLimitedTo500Names) {
  EditBlock block = EditBlock::holding(numberedNames("f", 500), numberedNames("m", 500));
  std::vector<ShownMessage> messages;
  int memberCount = 0;
  this->run(block, [&](SetupDialogDriver &dialog) {
    EXPECT_EQ(dialog.clickNew(kMembers, typed("more")), std::nullopt);
    EXPECT_EQ(dialog.clickNew(kFunctions, typed("more")), std::nullopt);
    messages = dialog.messages();
    // Edit takes the entry out before it puts it back: it works at the limit.
    dialog.select(kMembers, indexOf(dialog, kMembers, "m42"));
    EXPECT_EQ(dialog.clickEdit(kMembers, typed("answer")), "m42");
    memberCount = static_cast<int>(dialog.names(kMembers).size());
    dialog.clickOk();
  });
  ASSERT_EQ(messages.size(), 2u);
  for (const ShownMessage &message : messages) {
    EXPECT_EQ(message.text, "Limited to 500 Functions");
    EXPECT_EQ(message.caption, "Error");
    EXPECT_TRUE(message.warningIcon);
    EXPECT_TRUE(message.okButtonOnly);
  }
  EXPECT_EQ(memberCount, 500);
  EXPECT_EQ(block.i32(kFunctionCountOffset), 500);
  EXPECT_EQ(block.i32(kMemberCountOffset), 500);
  EXPECT_EQ(block.u32(kSizeOffset), 26042u);
  EXPECT_EQ(block.memberNames().front(), "answer");
}

TYPED_TEST_P(SetupDialogScenarios, NamesHoldAtMost25Characters) {
  EditBlock block = EditBlock::holding({}, {});
  const std::string longest = "AbcdefghijklmnopqrstuvwxY";
  ASSERT_EQ(longest.size(), 25u);
  this->run(block, [&](SetupDialogDriver &dialog) {
    dialog.clickNew(kFunctions, typed(longest));
    dialog.clickNew(kMembers, typed(longest + "TooMany"));
    dialog.clickOk();
  });
  EXPECT_EQ(block.functionNames(), (Names{"abcdefghijklmnopqrstuvwxy"}));
  EXPECT_EQ(block.memberNames(), (Names{"abcdefghijklmnopqrstuvwxy"}));
  EXPECT_EQ(block.bytes()[EditBlock::entryOffset(0) + 25], 0);
}

TYPED_TEST_P(SetupDialogScenarios, EmptyAndRepeatedNamesAreAccepted) {
  EditBlock block = EditBlock::holding({}, {});
  this->run(block, [](SetupDialogDriver &dialog) {
    EXPECT_EQ(dialog.clickNew(kFunctions, NameInput{}), std::string()); // OK on an empty field
    dialog.clickNew(kFunctions, typed("same"));
    dialog.clickNew(kFunctions, typed("Same"));
    dialog.clickNew(kMembers, typed("same"));
    dialog.clickOk();
  });
  EXPECT_EQ(block.functionNames(), (Names{"", "same", "same"}));
  EXPECT_EQ(block.memberNames(), (Names{"same"}));
  EXPECT_EQ(block.u32(kSizeOffset), host::editStructureSize(3, 1));
}

TYPED_TEST_P(SetupDialogScenarios, CancelLeavesTheBlockUntouched) {
  EditBlock block = EditBlock::holding({"alpha", "beta"}, {"x"});
  block.bytes()[kLoopOffset] = 1;
  const std::vector<unsigned char> before = block.snapshot();
  const bool accepted = this->run(block, [](SetupDialogDriver &dialog) {
    dialog.clickNew(kFunctions, typed("gamma"));
    dialog.select(kFunctions, 0);
    dialog.clickRemove(kFunctions);
    dialog.select(kMembers, 0);
    dialog.clickEdit(kMembers, typed("renamed"));
    dialog.clickNew(kMembers, typed("added"));
    dialog.toggle(SetupOption::verifyFunctionNames);
    dialog.toggle(SetupOption::loopUntilReturn);
    dialog.clickCancel();
  });
  EXPECT_FALSE(accepted);
  EXPECT_EQ(block.snapshot(), before);
}

TYPED_TEST_P(SetupDialogScenarios, TheDialogIsModalOverTheHostsMainWindow) {
  EditBlock block = EditBlock::holding({}, {});
  void *owner = nullptr;
  this->run(block, [&](SetupDialogDriver &dialog) {
    owner = dialog.owner();
    dialog.clickOk();
  });
  EXPECT_NE(owner, nullptr);
  EXPECT_EQ(owner, this->context().mainWindow);
}

TYPED_TEST_P(SetupDialogScenarios, ADamagedBlockOpensOnWhatCanBeRead) {
  // Counts past the limit and below zero, an entry without its zero, a size field that
  // ends the lists early: the dialog shows what lies within, and OK writes a sound block.
  EditBlock block = EditBlock::holding(numberedNames("f", 6), {});
  std::memset(block.bytes() + EditBlock::entryOffset(0), 'q', host::kNameEntrySize);
  block.putU32(kFunctionCountOffset, 9999);
  block.putU32(kMemberCountOffset, static_cast<std::uint32_t>(-2));
  block.putU32(kSizeOffset, static_cast<std::uint32_t>(host::editStructureSize(3, 0)));
  Names shown;
  this->run(block, [&](SetupDialogDriver &dialog) {
    shown = dialog.names(kFunctions);
    EXPECT_TRUE(dialog.names(kMembers).empty());
    dialog.clickOk();
  });
  EXPECT_EQ(shown, (Names{"f1", "f2", std::string(25, 'q')}));
  EXPECT_EQ(block.functionNames(), shown);
  EXPECT_TRUE(block.memberNames().empty());
  EXPECT_EQ(block.u32(kSizeOffset), host::editStructureSize(3, 0));
}

REGISTER_TYPED_TEST_SUITE_P(SetupDialogScenarios, NamesComeBackSortedAndLowerCased,
                            OpensOnTheStoredListsAndOptionsAndWritesTheBoxesBack,
                            EditPutsTheRenamedEntryAtItsSortedPlace,
                            CancelInANameDialogChangesNoEntry, RemoveDeletesTheSelectedEntryAtOnce,
                            EditOrRemoveWithNothingSelectedShowsTheListsMessage,
                            EachListIsLimitedTo500Names, NamesHoldAtMost25Characters,
                            EmptyAndRepeatedNamesAreAccepted, CancelLeavesTheBlockUntouched,
                            TheDialogIsModalOverTheHostsMainWindow,
                            ADamagedBlockOpensOnWhatCanBeRead);

} // namespace morvex::tests

#endif
