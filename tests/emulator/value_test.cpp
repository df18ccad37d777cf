// Number formatting and reading: what Display, Str$ and Val produce.
#include "emulator/value.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace morvex::tests {
namespace {

using emulator::Value;

TEST(FormatFloat, WritesTheShortestTextThatReadsBack) {
  EXPECT_EQ(emulator::formatFloat(2.5f), "2.5");
  EXPECT_EQ(emulator::formatFloat(3.0f), "3");
  EXPECT_EQ(emulator::formatFloat(0.1f), "0.1");
  EXPECT_EQ(emulator::formatFloat(1.06f), "1.06");
  EXPECT_EQ(emulator::formatFloat(-0.5f), "-0.5");
  EXPECT_EQ(emulator::formatFloat(1e20f), "1e+20");
}

TEST(FormatValue, ShowsEachKindAsDisplayDoes) {
  EXPECT_EQ(emulator::formatValue(Value(std::int32_t{-12})), "-12");
  EXPECT_EQ(emulator::formatValue(Value(std::int32_t{0})), "0");
  EXPECT_EQ(emulator::formatValue(Value(7.0f)), "7");
  EXPECT_EQ(emulator::formatValue(Value(std::string("a\\b"))), "a\\b");
}

TEST(ReadNumber, GivesAnIntegerForAWholeDecimalNumber) {
  EXPECT_EQ(emulator::readNumber("12"), Value(std::int32_t{12}));
  EXPECT_EQ(emulator::readNumber("-7"), Value(std::int32_t{-7}));
  EXPECT_EQ(emulator::readNumber("+5"), Value(std::int32_t{5}));
  EXPECT_EQ(emulator::readNumber("-2147483648"), Value(std::int32_t{-2147483648}));
}

TEST(ReadNumber, GivesAFloatForEverythingElse) {
  EXPECT_EQ(emulator::readNumber("1.5"), Value(1.5f));
  EXPECT_EQ(emulator::readNumber("1.5x"), Value(1.5f));
  EXPECT_EQ(emulator::readNumber(" 12"), Value(12.0f));
  EXPECT_EQ(emulator::readNumber("abc"), Value(0.0f));
  EXPECT_EQ(emulator::readNumber(""), Value(0.0f));
  EXPECT_EQ(emulator::readNumber("-"), Value(0.0f));
  // Beyond 32 bits a whole number is no integer any more.
  EXPECT_EQ(emulator::readNumber("2147483648"), Value(2147483648.0f));
}

TEST(ToInteger, TruncatesTowardZeroAndClampsWhatDoesNotFit) {
  EXPECT_EQ(emulator::toInteger(Value(2.7f)), 2);
  EXPECT_EQ(emulator::toInteger(Value(-2.7f)), -2);
  EXPECT_EQ(emulator::toInteger(Value(3e9f)), std::numeric_limits<std::int32_t>::max());
  EXPECT_EQ(emulator::toInteger(Value(-3e9f)), std::numeric_limits<std::int32_t>::min());
  EXPECT_EQ(emulator::toInteger(Value(-2147483648.0f)), std::numeric_limits<std::int32_t>::min());
  EXPECT_EQ(emulator::toInteger(Value(std::nanf(""))), 0);
  EXPECT_EQ(emulator::toInteger(Value(std::numeric_limits<float>::infinity())),
            std::numeric_limits<std::int32_t>::max());
}

TEST(WrapInteger, WrapsLikeThirtyTwoBitArithmetic) {
  EXPECT_EQ(emulator::wrapInteger(2147483648LL), std::numeric_limits<std::int32_t>::min());
  EXPECT_EQ(emulator::wrapInteger(-2147483649LL), std::numeric_limits<std::int32_t>::max());
  EXPECT_EQ(emulator::wrapInteger(4294967296LL + 5), 5);
}

} // namespace
} // namespace morvex::tests
