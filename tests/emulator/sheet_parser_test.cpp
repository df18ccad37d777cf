// Reading whole sheets: objects and their settings, event lines, comments, and the place
// of every error. (Every comparison operator is read by the sheet host_conditions.)
#include "emulator/sheet_parser.h"

#include "tests/emulator/test_catalog.h"

#include <gtest/gtest.h>

#include <string>

namespace morvex::tests {
namespace {

using emulator::Action;
using emulator::CompareOp;
using emulator::Condition;
using emulator::ParseError;
using emulator::Sheet;

class SheetParserTest : public ::testing::Test {
protected:
  Sheet parse(const std::string &text) { return emulator::parseSheet(text, catalog_); }

  // The error of `text` as "LINE:COLUMN: MESSAGE".
  std::string errorOf(const std::string &text) {
    try {
      parse(text);
    } catch (const ParseError &error) {
      return std::to_string(error.where.line) + ":" + std::to_string(error.where.column) + ": " +
             error.message;
    }
    return "no error";
  }

  Catalog catalog_ = testCatalog();
};

TEST_F(SheetParserTest, ReadsObjectsWithTheirSettings) {
  const Sheet sheet = parse("object Funcs\n"
                            "  functions: Fib,  Greet_All ,x\n"
                            "  members: hp\n"
                            "  verify: on\n"
                            "  loop: off\n"
                            "object Other_2\n"
                            "  members:\n");
  ASSERT_EQ(sheet.objects.size(), 2u);
  EXPECT_EQ(sheet.objects[0].name, "Funcs");
  EXPECT_EQ(sheet.objects[0].functions, (std::vector<std::string>{"Fib", "Greet_All", "x"}));
  EXPECT_EQ(sheet.objects[0].members, (std::vector<std::string>{"hp"}));
  EXPECT_TRUE(sheet.objects[0].verify);
  EXPECT_FALSE(sheet.objects[0].loop);
  EXPECT_EQ(sheet.objects[1].name, "Other_2");
  EXPECT_TRUE(sheet.objects[1].members.empty());
  EXPECT_FALSE(sheet.objects[1].verify);
}

TEST_F(SheetParserTest, GroupsConditionsAndActionsIntoEventLines) {
  const Sheet sheet = parse("object Funcs\n"
                            "* Start of Frame   # the first frame\n"
                            "\n"
                            "  * Always\n"
                            "-> Display 1\n"
                            "   -> End the Application\n"
                            "* Funcs: On Function \"f\"\n"
                            "* Compare 1 <= 2\n"
                            "->Funcs: Return from Current Function\n"
                            "* Compare \"#\" <> \"a\"\n");
  ASSERT_EQ(sheet.events.size(), 3u);
  const auto &first = sheet.events[0];
  EXPECT_EQ(first.where.line, 2);
  ASSERT_EQ(first.conditions.size(), 2u);
  EXPECT_EQ(first.conditions[0].kind, Condition::Kind::StartOfFrame);
  EXPECT_EQ(first.conditions[1].kind, Condition::Kind::Always);
  ASSERT_EQ(first.actions.size(), 2u);
  EXPECT_EQ(first.actions[0].kind, Action::Kind::Display);
  EXPECT_EQ(first.actions[1].kind, Action::Kind::EndApplication);
  EXPECT_FALSE(first.triggered());

  const auto &second = sheet.events[1];
  EXPECT_TRUE(second.triggered());
  EXPECT_EQ(second.conditions[0].call.object, 0);
  EXPECT_EQ(second.conditions[1].op, CompareOp::LessEqual);
  EXPECT_EQ(second.actions[0].call.code, 1);
  EXPECT_EQ(second.actions[0].where.line, 9);

  // A "#" inside a string literal starts no comment.
  EXPECT_EQ(sheet.events[2].conditions[0].left->text, "#");
  EXPECT_EQ(sheet.events[2].conditions[0].op, CompareOp::NotEqual);
}

TEST_F(SheetParserTest, LetsLinesNameObjectsDeclaredLater) {
  const Sheet sheet = parse("* Start of Frame\n-> Display GetReturnType(\"Late\")\nobject Late\n");
  EXPECT_EQ(sheet.events[0].actions[0].value->integer, 0);
}

TEST_F(SheetParserTest, AcceptsWindowsLineEndsAndAnEmptySheet) {
  EXPECT_EQ(parse("object A\r\n* Always\r\n-> Display 1\r\n").events.size(), 1u);
  EXPECT_TRUE(parse("").objects.empty());
  EXPECT_TRUE(parse("# nothing\n\n   \n").events.empty());
}

TEST_F(SheetParserTest, ReportsStatementErrorsWhereTheyAre) {
  EXPECT_EQ(errorOf("-> Display 1\n"),
            "1:1: an action needs the conditions (\"*\") of its event line before it");
  EXPECT_EQ(errorOf("* Always\nobject A\n-> Display 1\n"),
            "3:1: an action needs the conditions (\"*\") of its event line before it");
  EXPECT_EQ(errorOf("* Sometimes\n"),
            "1:3: unknown condition; the host's are \"Start of Frame\", \"Always\" and "
            "\"Compare A OP B\", and the extension's are written \"OBJECT: ...\"");
  EXPECT_EQ(errorOf("* Always\n-> Print 1\n"),
            "2:4: unknown action; the host's are \"Display EXPRESSION\" and \"End the "
            "Application\", and the extension's are written \"OBJECT: ...\"");
  EXPECT_EQ(errorOf("* Always\n-> Display\n"), "2:11: expected an expression");
  EXPECT_EQ(errorOf("object A\n* Always\n* A: On Error\n"),
            "3:3: an extension condition may only stand first in its event line");
  EXPECT_EQ(errorOf("object A\n* A: On Eror\n"),
            "2:9: no condition reads like this; the nearest, \"On Error\", expects \"Error\" here");
}

TEST_F(SheetParserTest, ReportsObjectErrorsWhereTheyAre) {
  EXPECT_EQ(errorOf("object\n"), "1:7: expected the object's name");
  EXPECT_EQ(errorOf("object my-object\n"),
            "1:10: an object's name is made of letters, digits and \"_\"");
  EXPECT_EQ(errorOf("object A\nobject A\n"), "2:8: object \"A\" is already declared on line 1");
  EXPECT_EQ(errorOf("* Nobody: On Error\n"), "1:3: no object named \"Nobody\"");
  EXPECT_EQ(errorOf("object A\n* A: On Error\n-> Display IntegerSlot(\"B\", 0)\n"),
            "3:24: no object named \"B\"");
}

TEST_F(SheetParserTest, ReportsSettingErrorsWhereTheyAre) {
  EXPECT_EQ(errorOf("functions: a\n"),
            "1:1: \"functions\" belongs right after its \"object\" line");
  EXPECT_EQ(errorOf("object A\n* Always\nmembers: a\n"),
            "3:1: \"members\" belongs right after its \"object\" line");
  EXPECT_EQ(errorOf("object A\nloop: on\nloop: off\n"),
            "3:1: \"loop\" is given twice for object \"A\"");
  EXPECT_EQ(errorOf("object A\nverify: yes\n"), "2:9: expected \"on\" or \"off\"");
  EXPECT_EQ(errorOf("object A\nfunctions: a,, b\n"), "2:14: empty name in the list of functions");
  EXPECT_EQ(errorOf("object A\nmembers: a,\n"), "2:12: empty name in the list of members");
  std::string many = "object A\nfunctions: f0";
  for (int i = 1; i <= 500; ++i) {
    many += ", f" + std::to_string(i);
  }
  const std::string error = errorOf(many + "\n");
  EXPECT_NE(error.find("at most 500 functions per object"), std::string::npos) << error;
  EXPECT_EQ(error.substr(0, 2), "2:");
}

TEST_F(SheetParserTest, ReportsComparisonErrorsWhereTheyAre) {
  EXPECT_EQ(errorOf("* Compare 1 2\n"), "1:13: expected a comparison: =, <>, <, <=, > or >=");
  EXPECT_EQ(errorOf("* Compare 1 = \"1\"\n"),
            "1:13: \"Compare\" compares two numbers or two texts, not a number and a text");
  EXPECT_EQ(errorOf("* Compare 1 = \n"), "1:14: expected an expression");
  EXPECT_EQ(errorOf("* Compare 1 == 1\n"), "1:14: expected an expression");
}

} // namespace
} // namespace morvex::tests
