// Numbers read from text and written as text, with the same bytes on every platform.
#ifndef MORVEX_RUNTIME_NUMBER_TEXT_H
#define MORVEX_RUNTIME_NUMBER_TEXT_H

#include <cstdint>
#include <string>

namespace morvex::runtime {

// The C integer reading of a text (atoi): white space, a sign, digits; no digits give 0.
// A missing text gives 0; a number beyond 32 bits saturates to the 32-bit limits.
std::int32_t readInteger(const char *text);

// The C number reading of a text (atof), nearest 32-bit float; beyond its range, an
// infinity. A missing text gives 0.0.
float readFloat(const char *text);

// A float truncated toward zero, saturated to the 32-bit limits; NaN gives 0.
std::int32_t truncateToInteger(float value);

// Decimal digits with a leading "-" when negative; zero gives "".
std::string integerText(std::int32_t value);

// Significant digits of a float's text.
inline constexpr int kFloatTextDigits = 14;

// The float widened to double and written by doubleText: 3 gives "3.", 0.05 gives
// "5.0000000745058e-002".
std::string floatText(float value);

// 14 significant digits, correctly rounded. With the decimal exponent e of the rounded
// value (d.ddd... times 10 to the e) from -1 to 13, and for zero, fixed notation with 13 - e
// digits after the point; otherwise one digit, the point, 13 digits, "e", a sign and three
// exponent digits. Trailing zeros of the fraction are removed, the point is kept. A leading
// "-" for values below zero (negative zero gives "0."); infinities give "inf" and "-inf",
// a NaN "nan".
std::string doubleText(double value);

} // namespace morvex::runtime

#endif
