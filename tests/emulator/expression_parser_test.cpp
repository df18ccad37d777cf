// Parsing expressions: literals, the types of operands, names, limits and where errors
// are. (Precedence and associativity show in the results of the sheet expressions.)
#include "emulator/expression_parser.h"

#include "tests/emulator/test_catalog.h"

#include <gtest/gtest.h>

#include <string>

namespace morvex::tests {
namespace {

using emulator::Expression;
using emulator::ExpressionPtr;
using emulator::ParseError;
using emulator::StaticType;
using Kind = Expression::Kind;

class ExpressionParserTest : public ::testing::Test {
protected:
  ExpressionPtr parse(const std::string &text) {
    line_ = text;
    return emulator::parseExpression(context_, line_, 3, 0, line_.size());
  }

  // The error parsing `text` gives, as "COLUMN: MESSAGE".
  std::string errorOf(const std::string &text) {
    try {
      parse(text);
    } catch (const ParseError &error) {
      EXPECT_EQ(error.where.line, 3);
      return std::to_string(error.where.column) + ": " + error.message;
    }
    return "no error";
  }

  Catalog catalog_ = testCatalog();
  std::vector<std::string> objects_ = {"Funcs", "Other"};
  emulator::ParseContext context_{&catalog_, &objects_};
  std::string line_;
};

TEST_F(ExpressionParserTest, ReadsLiterals) {
  EXPECT_EQ(parse("2147483647")->integer, 2147483647);
  EXPECT_EQ(parse("-2147483648")->integer, -2147483647 - 1);
  EXPECT_EQ(parse("3.")->real, 3.0f);
  EXPECT_EQ(parse("1.5e3")->real, 1500.0f);
}

TEST_F(ExpressionParserTest, TypesFollowTheOperands) {
  EXPECT_EQ(parse("Str$(1)")->type, StaticType::Text);
  EXPECT_EQ(parse("StringSlot$(\"Funcs\", 0)")->type, StaticType::Text);
  EXPECT_EQ(parse("GlobalFloat(\"Funcs\", \"x\")")->type, StaticType::Number);
}

TEST_F(ExpressionParserTest, AnExtensionExpressionNamesItsObjectFirst) {
  const ExpressionPtr call = parse("IntOfInstance(\"Other\", \"hero\", StringSlot$(\"Funcs\", 1))");
  ASSERT_EQ(call->kind, Kind::Extension);
  EXPECT_EQ(call->code, 4);
  EXPECT_EQ(call->integer, 1); // Other
  ASSERT_EQ(call->operands.size(), 2u);
  EXPECT_EQ(call->operands[0]->text, "hero");
  EXPECT_EQ(call->operands[1]->kind, Kind::Extension);
  EXPECT_EQ(parse("GetReturnType(\"Funcs\")")->operands.size(), 0u);
}

TEST_F(ExpressionParserTest, ReportsMalformedLiteralsWhereTheyStart) {
  EXPECT_EQ(errorOf("1 + \"abc"), "5: unterminated string literal");
  EXPECT_EQ(errorOf("2147483648"), "1: integer literal out of the 32-bit range");
  EXPECT_EQ(errorOf("1.0e50"), "1: float literal out of the 32-bit float range");
}

TEST_F(ExpressionParserTest, ReportsMissingAndUnexpectedParts) {
  EXPECT_EQ(errorOf(""), "1: expected an expression");
  EXPECT_EQ(errorOf("1 +"), "4: expected an expression");
  EXPECT_EQ(errorOf("(1 + 2"), "7: expected \")\"");
  EXPECT_EQ(errorOf("1 2"), "3: unexpected text after the expression");
  EXPECT_EQ(errorOf("hero"),
            "1: expected an expression, found the name \"hero\" (expressions end in \"(\"; "
            "objects are named by texts)");
}

TEST_F(ExpressionParserTest, ReportsNamesItDoesNotKnow) {
  EXPECT_EQ(errorOf("Foo(1)"), "1: unknown expression \"Foo(\"");
  EXPECT_EQ(errorOf("integerslot(\"Funcs\", 1)"),
            "1: unknown expression \"integerslot(\" (did you mean \"IntegerSlot(\"?)");
  EXPECT_EQ(errorOf("str$(1)"), "1: unknown expression \"str$(\" (did you mean \"Str$(\"?)");
  EXPECT_EQ(errorOf("IntegerSlot(\"Nobody\", 1)"), "13: no object named \"Nobody\"");
  EXPECT_EQ(errorOf("IntegerSlot(Funcs, 1)"),
            "13: \"IntegerSlot(\" takes the object's name first, as a string literal");
}

TEST_F(ExpressionParserTest, ChecksParameterCounts) {
  EXPECT_EQ(errorOf("IntegerSlot(\"Funcs\")"),
            "20: \"IntegerSlot(\" takes 1 parameter after the object's name");
  EXPECT_EQ(errorOf("IntegerSlot(\"Funcs\", 1, 2)"),
            "23: \"IntegerSlot(\" takes 1 parameter after the object's name");
  EXPECT_EQ(errorOf("GetReturnType(\"Funcs\", 1)"),
            "22: \"GetReturnType(\" takes no parameters after the object's name");
}

TEST_F(ExpressionParserTest, RejectsTextsAndNumbersMixed) {
  EXPECT_EQ(errorOf("\"a\" + 1"), "5: \"+\" mixes a text and a number");
  EXPECT_EQ(errorOf("\"a\" * \"b\""), "5: \"*\" needs numbers, not texts");
  EXPECT_EQ(errorOf("-\"a\""), "2: \"-\" needs a number, not a text");
  EXPECT_EQ(errorOf("Str$(\"a\")"), "6: \"Str$(\" takes a number, not a text");
  EXPECT_EQ(errorOf("Val(1)"), "5: \"Val(\" takes a text, not a number");
  EXPECT_EQ(errorOf("IntegerSlot(\"Funcs\", \"0\")"),
            "22: parameter 1 of \"IntegerSlot(\" is a number, not a text");
}

TEST_F(ExpressionParserTest, RefusesNestingBeyondTheLimitInsteadOfOverflowing) {
  const std::string deep = std::string(100000, '(') + "1" + std::string(100000, ')');
  const std::string error = errorOf(deep);
  EXPECT_NE(error.find("expression nested too deeply"), std::string::npos) << error;
  const std::string ok = std::string(100, '(') + "1" + std::string(100, ')');
  EXPECT_EQ(parse(ok)->integer, 1);

  // A chain of operators nests one node per operator, without any parenthesis.
  std::string chain = "1";
  for (int i = 0; i < 100000; ++i) {
    chain += "+1";
  }
  EXPECT_NE(errorOf(chain).find("expression nested too deeply"), std::string::npos);
  // Calls nested well within the limit of parentheses, each around a chain of 20 terms.
  std::string calls = "1";
  for (int i = 0; i < 60; ++i) {
    std::string terms = calls;
    for (int j = 0; j < 20; ++j) {
      terms += "+1";
    }
    calls = "Val(Str$(" + terms + "))";
  }
  EXPECT_NE(errorOf(calls).find("expression nested too deeply"), std::string::npos);
  std::string sum = "1";
  for (int i = 0; i < 500; ++i) {
    sum += "+1";
  }
  EXPECT_EQ(parse(sum)->height, 501);
}

TEST_F(ExpressionParserTest, APrefixStopsWhereTheExpressionCannotGoOn) {
  line_ = "\"x\" to 5";
  std::size_t stop = 0;
  const ExpressionPtr value =
      emulator::parseExpressionPrefix(context_, line_, 1, 0, line_.size(), stop);
  EXPECT_EQ(value->text, "x");
  EXPECT_EQ(stop, 3u);
  // A malformed literal after the end of the expression does not matter to it.
  line_ = "1 \"open";
  EXPECT_EQ(emulator::parseExpressionPrefix(context_, line_, 1, 0, line_.size(), stop)->integer, 1);
  EXPECT_EQ(stop, 1u);
}

} // namespace
} // namespace morvex::tests
