// Parameter fetching: each routine reads its own frame, also when routines nest, and a
// fetch the routine has no parameter for is a fault, not a read past the frame.
#include "emulator/parameter_stack.h"

#include <gtest/gtest.h>

#include <cstring>

namespace morvex::tests {
namespace {

using emulator::ParameterFrame;
using emulator::ParameterStack;
using emulator::RoutineInfo;
using emulator::RoutineKind;
using emulator::Value;
using host::HostWord;

std::string textAt(HostWord word) {
  return reinterpret_cast<const char *>(word);
}

class ParameterStackTest : public ::testing::Test {
protected:
  ParameterFrame frame(RoutineKind kind, std::vector<Value> values, HostWord cookie = 0) {
    ParameterFrame made;
    made.routine = kind == RoutineKind::Action ? &action_ : &expression_;
    made.values = std::move(values);
    made.cookie = cookie;
    return made;
  }

  HostWord fetch(HostWord mode = host::kFetchAsIs) {
    const std::optional<HostWord> word = stack_.fetchAction(mode, fault_);
    EXPECT_TRUE(word.has_value()) << fault_;
    return word.value_or(0);
  }

  RoutineInfo action_{RoutineKind::Action, 0, "Do %0 %1 %2", 0, {}, {}};
  RoutineInfo expression_{RoutineKind::Expression, 0, "Get(", 0, {}, {}};
  ParameterStack stack_;
  std::string fault_;
};

TEST_F(ParameterStackTest, ANestedActionDoesNotMoveTheOuterActionsPlace) {
  ParameterFrame outer = frame(RoutineKind::Action, {std::string("a"), std::int32_t{2}, 2.5f});
  ParameterStack::Scope outerScope(stack_, outer);
  EXPECT_EQ(textAt(fetch()), "a");
  {
    ParameterFrame inner =
        frame(RoutineKind::Action, {std::string("x"), std::string("y"), std::int32_t{9}});
    ParameterStack::Scope innerScope(stack_, inner);
    EXPECT_EQ(textAt(fetch()), "x");
    EXPECT_EQ(textAt(fetch()), "y");
    {
      ParameterFrame expression = frame(RoutineKind::Expression, {std::int32_t{4}}, 77);
      ParameterStack::Scope expressionScope(stack_, expression);
      EXPECT_EQ(stack_.fetchFirstExpression(host::kParamInteger, 77, fault_), 4);
    }
    EXPECT_EQ(fetch(), 9);
  }
  EXPECT_EQ(fetch(), 2);
  EXPECT_EQ(host::floatFromWord(fetch(host::kFetchFloat)), 2.5f);
  EXPECT_EQ(stack_.depth(), 1u);
}

TEST_F(ParameterStackTest, ConvertsNumbersByTheModeAsked) {
  ParameterFrame action = frame(RoutineKind::Action, {2.7f, std::int32_t{-3}, -2.7f});
  ParameterStack::Scope scope(stack_, action);
  EXPECT_EQ(fetch(), 2) << "as-is: a float is truncated";
  EXPECT_EQ(host::floatFromWord(fetch(host::kFetchFloat)), -3.0f);
  EXPECT_EQ(fetch(), -2);
  // By index, without moving the place.
  EXPECT_EQ(host::floatFromWord(*stack_.fetchActionFloat(1, fault_)), -3.0f);
  EXPECT_EQ(host::floatFromWord(*stack_.fetchActionFloat(0, fault_)), 2.7f);
  EXPECT_EQ(stack_.fetchAction(host::kFetchAsIs, fault_), std::nullopt);
}

TEST_F(ParameterStackTest, RefusesParametersTheRoutineDoesNotHave) {
  ParameterFrame action = frame(RoutineKind::Action, {std::int32_t{1}});
  ParameterStack::Scope scope(stack_, action);
  fetch();
  EXPECT_EQ(stack_.fetchAction(host::kFetchAsIs, fault_), std::nullopt);
  EXPECT_EQ(fault_, "action \"Do %0 %1 %2\" fetched parameter 2 with FetchActionParam, but it "
                    "has 1");
  EXPECT_EQ(stack_.fetchActionFloat(-1, fault_), std::nullopt);
  EXPECT_EQ(stack_.fetchActionFloat(5, fault_), std::nullopt);

  ParameterFrame text = frame(RoutineKind::Action, {std::string("t")});
  ParameterStack::Scope textScope(stack_, text);
  EXPECT_EQ(stack_.fetchAction(host::kFetchFloat, fault_), std::nullopt);
  EXPECT_EQ(fault_, "action \"Do %0 %1 %2\" fetched parameter 1 as a number with "
                    "FetchActionParam, but it is a text");
}

TEST_F(ParameterStackTest, ExpressionsFetchInOrderWithTheirCookie) {
  ParameterFrame expression =
      frame(RoutineKind::Expression, {std::string("hero"), std::string("hp")}, 5);
  ParameterStack::Scope scope(stack_, expression);
  EXPECT_EQ(stack_.fetchNextExpression(host::kParamString, 5, fault_), std::nullopt)
      << "the next before the first";
  EXPECT_EQ(textAt(*stack_.fetchFirstExpression(host::kParamString, 5, fault_)), "hero");
  EXPECT_EQ(textAt(*stack_.fetchNextExpression(host::kParamString, 5, fault_)), "hp");
  EXPECT_EQ(stack_.fetchNextExpression(host::kParamString, 5, fault_), std::nullopt);
  // The first parameter again, as often as asked.
  EXPECT_EQ(textAt(*stack_.fetchFirstExpression(host::kParamString, 5, fault_)), "hero");
  EXPECT_EQ(stack_.fetchFirstExpression(host::kParamString, 6, fault_), std::nullopt);
  EXPECT_EQ(fault_, "expression \"Get(\" passed FetchFirstExpressionParam another value than the "
                    "one it got");
  EXPECT_EQ(stack_.fetchFirstExpression(host::kParamInteger, 5, fault_), std::nullopt);
}

TEST_F(ParameterStackTest, RefusesFetchesFromTheWrongKindOfRoutineOrFromNone) {
  EXPECT_EQ(stack_.fetchAction(host::kFetchAsIs, fault_), std::nullopt);
  EXPECT_EQ(fault_, "FetchActionParam was called while no routine runs");
  ParameterFrame expression = frame(RoutineKind::Expression, {std::int32_t{1}}, 1);
  ParameterStack::Scope scope(stack_, expression);
  EXPECT_EQ(stack_.fetchAction(host::kFetchAsIs, fault_), std::nullopt);
  EXPECT_EQ(fault_, "FetchActionParam was called by expression \"Get(\"");
}

TEST_F(ParameterStackTest, TextsStayPutWhileTheirFrameIsPushed) {
  ParameterFrame outer = frame(RoutineKind::Action, {std::string("short")});
  ParameterStack::Scope outerScope(stack_, outer);
  const HostWord first = fetch();
  std::vector<ParameterFrame> inner;
  for (int i = 0; i < 100; ++i) { // pushes that would move frames kept by value
    inner.push_back(frame(RoutineKind::Action, {std::string("inner")}));
  }
  {
    ParameterStack::Scope innerScope(stack_, inner.back());
    EXPECT_EQ(textAt(fetch()), "inner");
  }
  EXPECT_EQ(textAt(first), "short");
}

} // namespace
} // namespace morvex::tests
