// Reading extension lines through their templates: whole-line matches, holes that hold
// any expression, and errors that name the nearest template and the part that differs.
#include "emulator/line_matcher.h"

#include "tests/emulator/test_catalog.h"

#include <gtest/gtest.h>

#include <string>

namespace morvex::tests {
namespace {

using emulator::Expression;
using emulator::ParseError;
using emulator::RoutineCall;

class LineMatcherTest : public ::testing::Test {
protected:
  RoutineCall match(RoutineKind kind, const std::string &text) {
    line_ = text;
    return emulator::matchRoutine(context_, kind, line_, 5, 0, line_.size());
  }

  std::string errorOf(RoutineKind kind, const std::string &text) {
    try {
      match(kind, text);
    } catch (const ParseError &error) {
      EXPECT_EQ(error.where.line, 5);
      return std::to_string(error.where.column) + ": " + error.message;
    }
    return "no error";
  }

  Catalog catalog_ = testCatalog();
  std::vector<std::string> objects_ = {"Funcs", "Hero"};
  emulator::ParseContext context_{&catalog_, &objects_};
  std::string line_;
};

TEST_F(LineMatcherTest, FillsEachParameterFromItsHole) {
  const RoutineCall call =
      match(RoutineKind::Action, "Call Function \"fib\" with Parameters Str$(3 - 1) and with "
                                 "Return Type 1 for Instance \"\" and Store Result in Slot 2 + 1");
  EXPECT_EQ(call.code, 0);
  ASSERT_EQ(call.arguments.size(), 5u);
  EXPECT_EQ(call.arguments[0]->text, "");    // %0, written fourth
  EXPECT_EQ(call.arguments[1]->text, "fib"); // %1, written first
  EXPECT_EQ(call.arguments[2]->kind, Expression::Kind::Str);
  EXPECT_EQ(call.arguments[3]->integer, 1);
  EXPECT_EQ(call.arguments[4]->kind, Expression::Kind::Add);
}

TEST_F(LineMatcherTest, ATemplateMustMatchTheWholeLine) {
  EXPECT_EQ(match(RoutineKind::Action, "Jump 5 to").code, 5);
  EXPECT_EQ(match(RoutineKind::Action, "Jump 5 to ground").code, 6);
}

TEST_F(LineMatcherTest, AHoleHoldsAnyExpressionEvenWithTheTemplatesTextInside) {
  const RoutineCall call = match(RoutineKind::Action, "Set Global String \"a to b\" to \" to \"");
  EXPECT_EQ(call.code, 3);
  EXPECT_EQ(call.arguments[0]->text, "a to b");
  EXPECT_EQ(call.arguments[1]->text, " to ");
  const RoutineCall jump =
      match(RoutineKind::Action, "Jump (1 + IntegerSlot(\"Funcs\", Val(\" to \"))) * 2 to");
  EXPECT_EQ(jump.code, 5);
  EXPECT_EQ(jump.arguments[0]->kind, Expression::Kind::Multiply);
}

TEST_F(LineMatcherTest, AnObjectParameterIsWrittenAsTheObjectsName) {
  EXPECT_EQ(match(RoutineKind::Action, "Count all Selected Hero").arguments[0]->integer, 1);
  EXPECT_EQ(errorOf(RoutineKind::Action, "Count all Selected Villain"),
            "20: in %0 of \"Count all Selected %0\": no object named \"Villain\"");
}

TEST_F(LineMatcherTest, NamesTheNearestTemplateAndWhereItStopsMatching) {
  EXPECT_EQ(errorOf(RoutineKind::Action, "Set Global Strong \"a\" to \"b\""),
            "12: no action reads like this; the nearest, \"Set Global String %0 to %1\", expects "
            "\"String\" here");
  EXPECT_EQ(errorOf(RoutineKind::Action, "Set Global String \"a\" too \"b\""),
            "23: no action reads like this; the nearest, \"Set Global String %0 to %1\", expects "
            "\"to\" here");
  EXPECT_EQ(errorOf(RoutineKind::Action, "Return from Current Function now"),
            "30: no action reads like this; the nearest, \"Return from Current Function with "
            "Integer %0\", expects \"with Integer\" here");
  EXPECT_EQ(errorOf(RoutineKind::Condition, "On Function"),
            "12: no condition reads like this; the nearest, \"On Function %0\", goes on after "
            "the end of the line");
  EXPECT_EQ(errorOf(RoutineKind::Action, "Fly away"),
            "1: no action of the extension begins like this (\"morvex menus\" lists them)");
}

TEST_F(LineMatcherTest, ReportsAnExpressionErrorOrAWrongTypeInsideAHole) {
  EXPECT_EQ(errorOf(RoutineKind::Action, "Set Global String \"a\" to Nope(1)"),
            "26: in %1 of \"Set Global String %0 to %1\": unknown expression \"Nope(\"");
  EXPECT_EQ(errorOf(RoutineKind::Action, "Return from Current Function with Integer 1 +"),
            "46: in %0 of \"Return from Current Function with Integer %0\": expected an "
            "expression");
  EXPECT_EQ(errorOf(RoutineKind::Action, "Return from Current Function with Integer \"5\""),
            "43: in %0 of \"Return from Current Function with Integer %0\": expected a number, "
            "not a text");
  EXPECT_EQ(errorOf(RoutineKind::Action, "Set Global String 1 to \"b\""),
            "19: in %0 of \"Set Global String %0 to %1\": expected a text, not a number");
}

TEST_F(LineMatcherTest, GivesUpOnALineCrowdedWithTheTemplatesTexts) {
  // Every " with Parameters " could end the first hole; each is tried, up to a bound.
  std::string crowded = "Call Function 1";
  for (int i = 0; i < 10003; ++i) {
    crowded += " with Parameters";
  }
  const std::string error = errorOf(RoutineKind::Action, crowded);
  EXPECT_NE(error.find("the line can be read in too many ways"), std::string::npos) << error;
}

TEST_F(LineMatcherTest, RefusesALineThatReadsAsTwoRoutines) {
  catalog_.actions.push_back(routine(RoutineKind::Action, 7, "Jump %0 to", {22}));
  EXPECT_EQ(errorOf(RoutineKind::Action, "Jump 1 to"),
            "1: the line reads as more than one action: \"Jump %0 to\" and \"Jump %0 to\"");
}

} // namespace
} // namespace morvex::tests
