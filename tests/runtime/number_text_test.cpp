// Reading numbers from text (C conversion rules, saturating) and the two number-to-text
// rules, including their limits and a float's round trip through its own text.
#include "runtime/number_text.h"

#include <gtest/gtest.h>

#include <cmath>
#include <cstring>
#include <limits>
#include <random>
#include <string>

namespace morvex::tests {
namespace {

using namespace morvex::runtime;

constexpr std::int32_t kMax = std::numeric_limits<std::int32_t>::max();
constexpr std::int32_t kMin = std::numeric_limits<std::int32_t>::min();
constexpr float kInf = std::numeric_limits<float>::infinity();

float floatFromBits(std::uint32_t bits) {
  float value = 0;
  std::memcpy(&value, &bits, sizeof value);
  return value;
}

TEST(ReadInteger, FollowsTheCReadingOfText) {
  EXPECT_EQ(readInteger("42"), 42);
  EXPECT_EQ(readInteger(" \t\n\v\f\r-17abc"), -17);
  EXPECT_EQ(readInteger("+5"), 5);
  EXPECT_EQ(readInteger("12.9"), 12);
  EXPECT_EQ(readInteger("0x1A"), 0);
  EXPECT_EQ(readInteger("007"), 7);
  // No digits right after the sign: no number.
  EXPECT_EQ(readInteger("- 5"), 0);
  EXPECT_EQ(readInteger("abc"), 0);
  EXPECT_EQ(readInteger(""), 0);
  EXPECT_EQ(readInteger(nullptr), 0);
  // An escape in front of a number stops the reading.
  EXPECT_EQ(readInteger("\\-5"), 0);
}

TEST(ReadInteger, SaturatesNumbersBeyondThirtyTwoBits) {
  EXPECT_EQ(readInteger("2147483647"), kMax);
  EXPECT_EQ(readInteger("2147483648"), kMax);
  EXPECT_EQ(readInteger("-2147483648"), kMin);
  EXPECT_EQ(readInteger("-2147483649"), kMin);
  EXPECT_EQ(readInteger(std::string(300, '9').c_str()), kMax);
  EXPECT_EQ(readInteger(("-" + std::string(300, '9')).c_str()), kMin);
  EXPECT_EQ(readInteger(("000000000000000000000" + std::string("123")).c_str()), 123);
}

TEST(ReadFloat, FollowsTheCReadingOfDecimalText) {
  EXPECT_EQ(readFloat("2.5"), 2.5f);
  EXPECT_EQ(readFloat("  -1.5e2x"), -150.0f);
  EXPECT_EQ(readFloat("+.5"), 0.5f);
  EXPECT_EQ(readFloat("5."), 5.0f);
  EXPECT_EQ(readFloat("1E3"), 1000.0f);
  EXPECT_EQ(readFloat("2e-1"), 0.2f);
  // An exponent without digits is not part of the number.
  EXPECT_EQ(readFloat("1e"), 1.0f);
  EXPECT_EQ(readFloat("7e-x"), 7.0f);
  EXPECT_EQ(readFloat("."), 0.0f);
  EXPECT_EQ(readFloat("e5"), 0.0f);
  EXPECT_EQ(readFloat("-"), 0.0f);
  EXPECT_EQ(readFloat(""), 0.0f);
  EXPECT_EQ(readFloat(nullptr), 0.0f);
  EXPECT_EQ(readFloat("\\2.5"), 0.0f);
  // Only decimal numbers are read: no hexadecimal, infinity or NaN words.
  EXPECT_EQ(readFloat("0x10"), 0.0f);
  EXPECT_EQ(readFloat("inf"), 0.0f);
  EXPECT_EQ(readFloat("nan"), 0.0f);
}

TEST(ReadFloat, ReadsADoubleThenTakesTheNearestFloat) {
  EXPECT_EQ(readFloat("0.1"), static_cast<float>(0.1));
  EXPECT_EQ(readFloat("1.06"), floatFromBits(0x3F87AE14));
  EXPECT_EQ(readFloat("3.4028235e38"), std::numeric_limits<float>::max());
  // Above the largest float but below the rounding boundary: still the largest float.
  EXPECT_EQ(readFloat("3.40282356e38"), std::numeric_limits<float>::max());
  EXPECT_EQ(readFloat("1.4e-45"), std::numeric_limits<float>::denorm_min());
  // Digits far beyond a double's precision, and long runs of zeros, are all taken into
  // account.
  EXPECT_EQ(readFloat(("0." + std::string(400, '0') + "1e401").c_str()), 1.0f);
  EXPECT_EQ(readFloat(("1" + std::string(400, '0') + "e-400").c_str()), 1.0f);
  EXPECT_EQ(readFloat(("2." + std::string(500, '0') + "1").c_str()), 2.0f);
}

TEST(ReadFloat, GivesInfinitiesAndZerosBeyondTheFloatRange) {
  EXPECT_EQ(readFloat("3.4028236e38"), kInf);
  EXPECT_EQ(readFloat("1e39"), kInf);
  EXPECT_EQ(readFloat("1e400"), kInf); // beyond a double too
  EXPECT_EQ(readFloat("1e99999999999999999999"), kInf);
  EXPECT_EQ(readFloat(std::string(400, '9').c_str()), kInf);
  EXPECT_EQ(readFloat("1e-50"), 0.0f);
  EXPECT_EQ(readFloat("1e-400"), 0.0f);
  const float negativeTiny = readFloat("-1e-400");
  EXPECT_EQ(negativeTiny, 0.0f);
  EXPECT_TRUE(std::signbit(negativeTiny));
  EXPECT_EQ(readFloat("0e99999"), 0.0f);
}

TEST(TruncateToInteger, TruncatesTowardZeroAndSaturates) {
  EXPECT_EQ(truncateToInteger(-2.7f), -2);
  EXPECT_EQ(truncateToInteger(-0.5f), 0);
  EXPECT_EQ(truncateToInteger(2147483520.0f), 2147483520); // the largest float below 2^31
  EXPECT_EQ(truncateToInteger(2147483648.0f), kMax);
  EXPECT_EQ(truncateToInteger(-2147483648.0f), kMin);
  EXPECT_EQ(truncateToInteger(kInf), kMax);
  EXPECT_EQ(truncateToInteger(-kInf), kMin);
  EXPECT_EQ(truncateToInteger(std::numeric_limits<float>::quiet_NaN()), 0);
}

TEST(IntegerText, WritesDigitsAndGivesNothingForZero) {
  EXPECT_EQ(integerText(0), "");
  EXPECT_EQ(integerText(-12), "-12");
  EXPECT_EQ(integerText(kMax), "2147483647");
  EXPECT_EQ(integerText(kMin), "-2147483648");
}

TEST(FloatText, WritesTheTableOfExamples) {
  EXPECT_EQ(floatText(3.0f), "3.");
  EXPECT_EQ(floatText(2.5f), "2.5");
  EXPECT_EQ(floatText(0.1f), "0.10000000149012");
  EXPECT_EQ(floatText(0.05f), "5.0000000745058e-002");
  EXPECT_EQ(floatText(1e20f), "1.0000000200409e+020");
  EXPECT_EQ(floatText(0.0f), "0.");
}

TEST(FloatText, ChoosesFixedNotationForExponentsFromMinusOneToThirteen) {
  EXPECT_EQ(floatText(0.5f), "0.5");                                // e = -1
  EXPECT_EQ(floatText(0.03125f), "3.125e-002");                     // e = -2
  EXPECT_EQ(floatText(123456789.0f), "123456792.");                 // the float's own value
  EXPECT_EQ(floatText(8796093022208.0f), "8796093022208.");         // 2^43, e = 12
  EXPECT_EQ(floatText(17592186044416.0f), "17592186044416.");       // 2^44, e = 13
  EXPECT_EQ(floatText(140737488355328.0f), "1.4073748835533e+014"); // 2^47, e = 14
}

TEST(FloatText, WritesSignsLimitsAndSpecialValues) {
  EXPECT_EQ(floatText(-2.5f), "-2.5");
  EXPECT_EQ(floatText(-0.05f), "-5.0000000745058e-002");
  EXPECT_EQ(floatText(-0.0f), "0.");
  EXPECT_EQ(floatText(std::numeric_limits<float>::max()), "3.4028234663853e+038");
  EXPECT_EQ(floatText(std::numeric_limits<float>::min()), "1.1754943508223e-038");
  EXPECT_EQ(floatText(std::numeric_limits<float>::denorm_min()), "1.4012984643248e-045");
  EXPECT_EQ(floatText(kInf), "inf");
  EXPECT_EQ(floatText(-kInf), "-inf");
  EXPECT_EQ(floatText(std::numeric_limits<float>::quiet_NaN()), "nan");
}

TEST(FloatText, PlacesTheNotationByTheRoundedValue) {
  // Rounding to 14 digits carries into a new leading digit: the exponent of the rounded
  // value chooses the notation and the number of decimals.
  EXPECT_EQ(doubleText(9.999999999999996), "10.");
  EXPECT_EQ(doubleText(99999999999999.9), "1.e+014");
  EXPECT_EQ(doubleText(0.09999999999999999), "0.1");
  EXPECT_EQ(doubleText(0.009999999999999999), "1.e-002");
  EXPECT_EQ(doubleText(1234567.8901234567), "1234567.8901235");
  EXPECT_EQ(doubleText(1e308), "1.e+308");
  EXPECT_EQ(doubleText(5e-324), "4.9406564584125e-324");
}

TEST(FloatText, ReadsBackAsTheSameFloatAndIntegersAsTheSameInteger) {
  std::mt19937 random(20240611);
  for (int i = 0; i < 20000; ++i) {
    const float value = floatFromBits(static_cast<std::uint32_t>(random()));
    if (!std::isfinite(value)) {
      continue;
    }
    const std::string text = floatText(value);
    EXPECT_EQ(readFloat(text.c_str()), value) << text;
    const auto integer = static_cast<std::int32_t>(random());
    if (integer != 0) {
      EXPECT_EQ(readInteger(integerText(integer).c_str()), integer);
    }
  }
}

} // namespace
} // namespace morvex::tests
