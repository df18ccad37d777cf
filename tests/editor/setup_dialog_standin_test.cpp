// The setup dialog scenarios run on the Linux stand-in dialogs, and what only the stand-in
// has: its default user and a user who walks away. The stand-in exists on Linux only.
#ifndef _WIN32

#include "editor/setup_dialog_standin.h"

#include "tests/editor/setup_dialog_scenarios.h"

#include <gtest/gtest.h>

namespace morvex::tests {
namespace {

// Runs the stand-in dialogs with a scripted user, and puts the default user back after.
class StandinBinding {
public:
  StandinBinding() { context_.mainWindow = &mainWindow_; }
  ~StandinBinding() { editor::installStandinUser(nullptr); }

  host::EditorContext &context() { return context_; }
  bool run(host::EditStructure &edit, editor::SetupDialogUser user) {
    editor::installStandinUser(std::move(user));
    return editor::runSetupDialog(&context_, edit);
  }

private:
  int mainWindow_ = 0; // stands for the host's window: only its address matters
  host::EditorContext context_{};
};

INSTANTIATE_TYPED_TEST_SUITE_P(Standin, SetupDialogScenarios, StandinBinding);

TEST(StandinSetupDialog, TheDefaultUserPressesOkWithoutChanges) {
  editor::installStandinUser(nullptr);
  EditBlock block = EditBlock::holding({"b", "a"}, {});
  block.bytes()[kVerifyOffset] = 5;
  EXPECT_TRUE(editor::runSetupDialog(nullptr, block.edit()));
  EXPECT_EQ(block.functionNames(), (Names{"a", "b"}));
  EXPECT_EQ(block.bytes()[kVerifyOffset], 1);
}

TEST(StandinSetupDialog, AUserWhoWalksAwayCancels) {
  StandinBinding binding;
  EditBlock block = EditBlock::holding({"a"}, {});
  const std::vector<unsigned char> before = block.snapshot();
  EXPECT_FALSE(binding.run(
      block.edit(), [](SetupDialogDriver &dialog) { dialog.clickNew(kFunctions, typed("b")); }));
  EXPECT_EQ(block.snapshot(), before);
}

TEST(StandinSetupDialog, NothingHappensAfterTheDialogClosed) {
  StandinBinding binding;
  EditBlock block = EditBlock::holding({"a"}, {});
  binding.run(block.edit(), [](SetupDialogDriver &dialog) {
    dialog.clickOk();
    EXPECT_EQ(dialog.clickNew(kFunctions, typed("late")), std::nullopt);
    dialog.select(kFunctions, 0);
    dialog.clickRemove(kFunctions);
    EXPECT_EQ(dialog.names(kFunctions), (Names{"a"}));
  });
  EXPECT_EQ(block.functionNames(), (Names{"a"}));
}

} // namespace
} // namespace morvex::tests

#endif
