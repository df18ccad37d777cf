// The texts written into the host's buffers: display strings behind the compatibility
// test, titles and prompts, and the limits of the buffer they are given.
#include "editor/event_texts.h"
#include "editor/resource_ids.h"
#include "tests/editor/editor_context.h"
#include "tests/editor/module_resources.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <string>

namespace morvex::tests {
namespace {

using editor::EventKind;

// A host buffer: `size` characters handed over, with guard bytes behind them that must
// stay untouched.
class HostBuffer {
public:
  static constexpr char kUntouched = '\x5A';
  HostBuffer() { bytes.fill(kUntouched); }
  char *data() { return bytes.data(); }
  std::string text() const { return std::string(bytes.data()); }
  bool untouchedFrom(std::size_t position) const {
    for (std::size_t i = position; i < bytes.size(); ++i) {
      if (bytes[i] != kUntouched) {
        return false;
      }
    }
    return true;
  }

private:
  std::array<char, 300> bytes{};
};

class EventTexts : public ::testing::Test {
protected:
  void SetUp() override { useModuleResources(); }

  std::string title(EventKind kind, int code, std::size_t parameter) {
    HostBuffer buffer;
    editor::loadParameterTitle(kind, code, parameter, buffer.data(), 256);
    return buffer.text();
  }
  std::string expressionTitle(int code) {
    HostBuffer buffer;
    editor::loadExpressionTitle(code, buffer.data(), 256);
    return buffer.text();
  }
  std::string displayString(const host::EditorContext *editor, EventKind kind, int code) {
    HostBuffer buffer;
    editor::loadDisplayString(editor, kind, code, buffer.data(), 256);
    return buffer.untouchedFrom(0) ? "(untouched)" : buffer.text();
  }

  host::EditorContext context = scriptedContext();
};

TEST_F(EventTexts, TitlesArePromptsElseTheMenuItemText) {
  EXPECT_EQ(title(EventKind::condition, 0, 0), "Enter the Function Name");
  EXPECT_EQ(title(EventKind::condition, 0, 1), "On Function"); // past the record's parameters
  EXPECT_EQ(title(EventKind::condition, 1, 0), "On Error");    // no parameters at all
  EXPECT_EQ(title(EventKind::action, 0, 5), "Call a Function");
  EXPECT_EQ(title(EventKind::action, 28, 0), ""); // no such action
  EXPECT_EQ(expressionTitle(15), "Get Loop Index of Current Function");
  EXPECT_EQ(expressionTitle(23), ""); // the menu does not offer it
  EXPECT_EQ(expressionTitle(25), "");
}

TEST_F(EventTexts, ExpressionParametersHaveNoPrompt) {
  for (int code = 0; code < 25; ++code) {
    for (std::size_t parameter = 0; parameter < 3; ++parameter) {
      HostBuffer buffer;
      editor::loadExpressionParam(code, parameter, buffer.data(), 50);
      EXPECT_EQ(buffer.text(), "") << code;
      EXPECT_TRUE(buffer.untouchedFrom(1));
    }
  }
}

TEST_F(EventTexts, DisplayStringsFollowTheCodes) {
  EXPECT_EQ(displayString(&context, EventKind::condition, 0), "%o: On Function %0");
  EXPECT_EQ(displayString(&context, EventKind::expression, 23), "ObjectVersion(");
  EXPECT_EQ(displayString(&context, EventKind::expression, 25), "");
}

// A failing host loses its display strings, but keeps its titles.
TEST_F(EventTexts, IncompatibleHostsGetNoDisplayStringsButTitles) {
  for (const std::uint32_t word :
       {0x0200'0000u | 227u, 0x0100'0000u | 228u, kGoodHostWord | 0x8000u}) {
    host::EditorContext old = scriptedContext({word});
    EXPECT_EQ(displayString(&old, EventKind::condition, 0), "(untouched)");
    EXPECT_EQ(displayString(&old, EventKind::action, 10), "(untouched)");
    EXPECT_EQ(displayString(&old, EventKind::expression, 0), "(untouched)");
    EXPECT_EQ(title(EventKind::condition, 0, 0), "Enter the Function Name");
  }
  EXPECT_EQ(displayString(nullptr, EventKind::condition, 0), "(untouched)");
}

TEST_F(EventTexts, BuffersAreFilledWithinTheirSize) {
  // "Enter the Function Name" is 23 characters.
  struct Case {
    std::size_t size;
    std::string expected;
  };
  for (const Case &c :
       {Case{1, ""}, Case{2, "E"}, Case{10, "Enter the"}, Case{23, "Enter the Function Nam"},
        Case{24, "Enter the Function Name"}, Case{255, "Enter the Function Name"}}) {
    HostBuffer buffer;
    editor::loadParameterTitle(EventKind::condition, 0, 0, buffer.data(), c.size);
    EXPECT_EQ(buffer.text(), c.expected) << c.size;
    EXPECT_TRUE(buffer.untouchedFrom(std::min(c.size, c.expected.size() + 1))) << c.size;

    HostBuffer menuText; // "On Function", from the menu resource
    editor::loadParameterTitle(EventKind::condition, 0, 1, menuText.data(), c.size);
    EXPECT_EQ(menuText.text(), std::string("On Function").substr(0, c.size - 1)) << c.size;
    EXPECT_TRUE(menuText.untouchedFrom(c.size)) << c.size;
  }
}

// (The object's name and comment are read through the library's GetObjInfos by host_tests.)
TEST_F(EventTexts, SizeZeroOrNoBufferWritesNothingAndMissingStringsAreEmpty) {
  HostBuffer buffer;
  editor::loadParameterTitle(EventKind::condition, 0, 0, buffer.data(), 0);
  editor::loadParameterTitle(EventKind::condition, 0, 1, buffer.data(), 0);
  editor::loadParameterTitle(EventKind::condition, 9, 0, buffer.data(), 0);
  editor::loadExpressionTitle(0, buffer.data(), 0);
  editor::loadExpressionParam(0, 0, buffer.data(), 0);
  editor::loadDisplayString(&context, EventKind::action, 0, buffer.data(), 0);
  editor::loadResourceString(IDS_OBJECT_NAME, buffer.data(), 0);
  EXPECT_TRUE(buffer.untouchedFrom(0));
  editor::loadResourceString(3, buffer.data(), 255); // no string 3: empty
  EXPECT_EQ(buffer.text(), "");

  editor::loadParameterTitle(EventKind::condition, 0, 0, nullptr, 10);
  editor::loadExpressionTitle(0, nullptr, 10);
  editor::loadDisplayString(&context, EventKind::action, 0, nullptr, 10);
}

} // namespace
} // namespace morvex::tests
