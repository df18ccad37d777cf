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

// 14 significant digits, fixed or exponent notation by the decimal exponent, trailing
// zeros of the fraction removed, the point kept: 3 gives "3.", 0.05 "5.0000000745058e-002".
std::string floatText(float value);

} // namespace morvex::runtime

#endif
