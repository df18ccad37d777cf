// Number reading and conversion beyond what the sheets show through Display, Str$ and Val.
#include "emulator/value.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace morvex::tests {
namespace {

using emulator::Value;

TEST(ReadNumber, GivesAnIntegerOnlyForAWholeDecimalNumberWithin32Bits) {
  EXPECT_EQ(emulator::readNumber("+5"), Value(std::int32_t{5}));
  EXPECT_EQ(emulator::readNumber("-2147483648"), Value(std::int32_t{-2147483648}));
  EXPECT_EQ(emulator::readNumber("2147483648"), Value(2147483648.0f));
  EXPECT_EQ(emulator::readNumber("1.5x"), Value(1.5f));
  EXPECT_EQ(emulator::readNumber(" 12"), Value(12.0f));
  EXPECT_EQ(emulator::readNumber(""), Value(0.0f));
  EXPECT_EQ(emulator::readNumber("-"), Value(0.0f));
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
