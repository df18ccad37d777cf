// Evaluating expressions: host arithmetic, failures that stop the evaluation, comparisons,
// and how the extension's expressions receive their evaluated parameters. (The sheets
// expressions and host_conditions show the arithmetic and comparisons end to end.)
#include "emulator/evaluator.h"

#include "emulator/expression_parser.h"
#include "tests/emulator/test_catalog.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <optional>
#include <string>

namespace morvex::tests {
namespace {

using emulator::CompareOp;
using emulator::Expression;
using emulator::Value;

// Answers the extension's expressions with a fixed value and records every call.
class FakeCalls : public emulator::ExpressionCalls {
public:
  std::optional<Value> callExtension(const Expression &call,
                                     std::vector<Value> parameters) override {
    calls.push_back(call.text);
    received.push_back(std::move(parameters));
    if (stopOnCall) {
      return std::nullopt;
    }
    return answer;
  }
  void fail(std::string message) override { failures.push_back(std::move(message)); }

  Value answer = std::int32_t{0};
  bool stopOnCall = false;
  std::vector<std::string> calls;
  std::vector<std::vector<Value>> received;
  std::vector<std::string> failures;
};

class EvaluatorTest : public ::testing::Test {
protected:
  std::optional<Value> eval(const std::string &text) {
    line_ = text;
    const emulator::ExpressionPtr parsed =
        emulator::parseExpression(context_, line_, 1, 0, line_.size());
    return emulator::evaluate(*parsed, calls_);
  }

  Catalog catalog_ = testCatalog();
  std::vector<std::string> objects_ = {"Funcs"};
  emulator::ParseContext context_{&catalog_, &objects_};
  std::string line_;
  FakeCalls calls_;
};

TEST_F(EvaluatorTest, FollowsTheHostsArithmetic) {
  constexpr std::int32_t kMin = std::numeric_limits<std::int32_t>::min();
  const std::pair<const char *, Value> cases[] = {
      {"-7 / 2", std::int32_t{-3}},
      {"2 + 3 * 4 - 1", std::int32_t{13}},
      {"-(-2147483648)", kMin},
      {"-2147483648 / -1", kMin},
      {"1 + 0.5", 1.5f},
      {"Str$(-12) + \"|\" + Str$(2.5) + \"|\" + Str$(3.0)", std::string("-12|2.5|3")},
      {"Val(\"0.5\") * 2", 1.0f},
  };
  for (const auto &[text, expected] : cases) {
    EXPECT_EQ(eval(text), expected) << text;
  }
  EXPECT_TRUE(calls_.failures.empty());
}

TEST_F(EvaluatorTest, DivisionByZeroStopsTheEvaluationWhereItHappens) {
  EXPECT_EQ(eval("1.0 / 0"), std::nullopt);
  EXPECT_EQ(eval("1 + 2 / (3 - 3) + IntegerSlot(\"Funcs\", 0)"), std::nullopt);
  EXPECT_EQ(calls_.failures, (std::vector<std::string>{"division by zero", "division by zero"}));
  EXPECT_TRUE(calls_.calls.empty()) << "nothing after the failure is evaluated";
}

TEST_F(EvaluatorTest, PassesTheExtensionItsParametersInOrder) {
  calls_.answer = std::string("seven");
  EXPECT_EQ(eval("IntOfInstance(\"Funcs\", \"he\" + \"ro\", StringSlot$(\"Funcs\", 2 * 3))"),
            Value(std::string("seven")));
  // The inner call runs first, with its own parameter; the outer one gets its result.
  ASSERT_EQ(calls_.calls, (std::vector<std::string>{"StringSlot$(", "IntOfInstance("}));
  EXPECT_EQ(calls_.received[0], (std::vector<Value>{std::int32_t{6}}));
  EXPECT_EQ(calls_.received[1], (std::vector<Value>{std::string("hero"), std::string("seven")}));
}

TEST_F(EvaluatorTest, AResultOfTheWrongTypeStopsTheGameInsteadOfBeingMisread) {
  calls_.answer = std::string("not a number");
  EXPECT_EQ(eval("IntegerSlot(\"Funcs\", 0) + 1"), std::nullopt);
  EXPECT_EQ(eval("Str$(IntegerSlot(\"Funcs\", 0))"), std::nullopt);
  calls_.answer = std::int32_t{3};
  EXPECT_EQ(eval("Val(StringSlot$(\"Funcs\", 0))"), std::nullopt);
  EXPECT_EQ(calls_.failures.size(), 3u);

  calls_.stopOnCall = true; // a stopped call ends the evaluation too
  EXPECT_EQ(eval("IntegerSlot(\"Funcs\", 0) + IntegerSlot(\"Funcs\", 1)"), std::nullopt);
  EXPECT_EQ(calls_.calls.size(), 4u);
}

TEST(CompareValues, ComparesNumbersByValueAndTextsByBytes) {
  FakeCalls calls;
  const auto holds = [&](const Value &a, CompareOp op, const Value &b) {
    return emulator::compareValues(a, op, b, calls);
  };
  EXPECT_EQ(holds(std::int32_t{2}, CompareOp::Less, 2.5f), true);
  EXPECT_EQ(holds(16777217, CompareOp::Greater, 16777216.0f), true) << "no rounding to float";
  EXPECT_EQ(holds(std::int32_t{3}, CompareOp::GreaterEqual, std::int32_t{4}), false);
  EXPECT_EQ(holds(std::string("B"), CompareOp::Less, std::string("a")), true);
  EXPECT_EQ(holds(std::nanf(""), CompareOp::Equal, std::nanf("")), false);
  EXPECT_EQ(holds(std::nanf(""), CompareOp::NotEqual, 1.0f), true);
  EXPECT_TRUE(calls.failures.empty());
  EXPECT_EQ(holds(std::string("1"), CompareOp::Equal, std::int32_t{1}), std::nullopt);
  EXPECT_EQ(calls.failures.size(), 1u);
}

} // namespace
} // namespace morvex::tests
