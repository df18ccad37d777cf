// Reading numbers from text the way the C conversions do, and the two fixed number-to-text
// rules, without the C library's locale or its platform-specific formatting.
#include "runtime/number_text.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <limits>
#include <system_error>

namespace morvex::runtime {
namespace {

// The white space of the C locale, which the conversions skip.
bool isSpace(char c) {
  return c == ' ' || c == '\t' || c == '\n' || c == '\v' || c == '\f' || c == '\r';
}

bool isDigit(char c) {
  return c >= '0' && c <= '9';
}

const char *skipSpace(const char *text) {
  while (isSpace(*text)) {
    ++text;
  }
  return text;
}

// The largest double that still rounds to a finite float: halfway between FLT_MAX and the
// next power of two rounds to even, which is the infinity.
constexpr double kFloatOverflow = 340282356779733661637539395458142568448.0; // 2^128 - 2^103

// A double as the nearest float, an infinity beyond the float range.
float nearestFloat(double value) {
  if (std::isnan(value)) {
    return std::numeric_limits<float>::quiet_NaN();
  }
  if (std::fabs(value) >= kFloatOverflow) {
    const float infinity = std::numeric_limits<float>::infinity();
    return value > 0 ? infinity : -infinity;
  }
  if (std::fabs(value) > std::numeric_limits<float>::max()) {
    return value > 0 ? std::numeric_limits<float>::max() : -std::numeric_limits<float>::max();
  }
  return static_cast<float>(value);
}

// The unsigned decimal number at `text` (digits, a point, digits, an exponent), read to the
// nearest double; `end` receives where it stops (at `text` when there is none).
double readUnsignedDecimal(const char *text, const char *&end) {
  const char *at = text;
  std::int64_t leadingPlaces = 0; // decimal places of the first non-zero digit, from the point
  bool seenNonZero = false;
  bool anyDigit = false;
  while (isDigit(*at)) {
    anyDigit = true;
    if (*at != '0') {
      seenNonZero = true;
    }
    if (seenNonZero) {
      ++leadingPlaces;
    }
    ++at;
  }
  if (*at == '.') {
    ++at;
    while (isDigit(*at)) {
      anyDigit = true;
      if (!seenNonZero) {
        if (*at != '0') {
          seenNonZero = true;
        } else {
          --leadingPlaces;
        }
      }
      ++at;
    }
  }
  if (!anyDigit) {
    end = text;
    return 0.0;
  }
  // An exponent counts only when at least one digit follows its sign.
  std::int64_t exponent = 0;
  if (*at == 'e' || *at == 'E') {
    const char *mark = at + 1;
    bool negative = false;
    if (*mark == '+' || *mark == '-') {
      negative = *mark == '-';
      ++mark;
    }
    if (isDigit(*mark)) {
      while (isDigit(*mark)) {
        if (exponent < 100000) { // far beyond any double; stops the count from overflowing
          exponent = exponent * 10 + (*mark - '0');
        }
        ++mark;
      }
      if (negative) {
        exponent = -exponent;
      }
      at = mark;
    }
  }
  end = at;
  double value = 0.0;
  const std::errc error = std::from_chars(text, at, value, std::chars_format::general).ec;
  if (error == std::errc::result_out_of_range) {
    // Too large or too small for a double: which one follows from the magnitude.
    const bool large = leadingPlaces + exponent > 0;
    return large ? std::numeric_limits<double>::infinity() : 0.0;
  }
  if (error != std::errc()) {
    return 0.0;
  }
  return seenNonZero ? value : 0.0;
}

} // namespace

std::int32_t readInteger(const char *text) {
  if (!text) {
    return 0;
  }
  const char *at = skipSpace(text);
  bool negative = false;
  if (*at == '+' || *at == '-') {
    negative = *at == '-';
    ++at;
  }
  // Accumulated as a magnitude; one past INT32_MAX is the magnitude of INT32_MIN.
  constexpr std::int64_t kLimit = std::int64_t{std::numeric_limits<std::int32_t>::max()} + 1;
  std::int64_t magnitude = 0;
  while (isDigit(*at)) {
    magnitude = std::min<std::int64_t>(magnitude * 10 + (*at - '0'), kLimit);
    ++at;
  }
  if (negative) {
    return static_cast<std::int32_t>(-magnitude);
  }
  return static_cast<std::int32_t>(std::min<std::int64_t>(magnitude, kLimit - 1));
}

float readFloat(const char *text) {
  if (!text) {
    return 0.0f;
  }
  const char *at = skipSpace(text);
  bool negative = false;
  if (*at == '+' || *at == '-') {
    negative = *at == '-';
    ++at;
  }
  const char *end = at;
  const double magnitude = readUnsignedDecimal(at, end);
  if (end == at) {
    return 0.0f;
  }
  return nearestFloat(negative ? -magnitude : magnitude);
}

std::int32_t truncateToInteger(float value) {
  if (std::isnan(value)) {
    return 0;
  }
  // 2^31 is exact as a float; every float below it truncates into range.
  constexpr float kTwoTo31 = 2147483648.0f;
  if (value >= kTwoTo31) {
    return std::numeric_limits<std::int32_t>::max();
  }
  if (value < -kTwoTo31) {
    return std::numeric_limits<std::int32_t>::min();
  }
  return static_cast<std::int32_t>(value);
}

std::string integerText(std::int32_t value) {
  if (value == 0) {
    return {};
  }
  std::array<char, 16> buffer{};
  // 16 bytes hold every 32-bit integer.
  char *end = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value).ptr;
  return std::string(buffer.data(), end);
}

std::string doubleText(double value) {
  if (std::isnan(value)) {
    return "nan";
  }
  if (std::isinf(value)) {
    return value > 0 ? "inf" : "-inf";
  }
  if (value == 0) {
    return "0.";
  }
  // "d.ddddddddddddde+xx": 14 significant digits, correctly rounded, so that a carry out of
  // the last digit has already moved into the exponent. 40 bytes hold every double so.
  std::array<char, 40> buffer{};
  char *end = std::to_chars(buffer.data(), buffer.data() + buffer.size(), std::fabs(value),
                            std::chars_format::scientific, kFloatTextDigits - 1)
                  .ptr;
  const std::string scientific(buffer.data(), end);
  const std::size_t mark = scientific.find('e');
  std::string digits = scientific.substr(0, 1) + scientific.substr(2, mark - 2);
  int exponent = 0;
  std::from_chars(scientific.data() + mark + (scientific[mark + 1] == '+' ? 2 : 1),
                  scientific.data() + scientific.size(), exponent);

  std::string text = value < 0 ? "-" : "";
  std::string fraction;
  if (exponent >= -1 && exponent < kFloatTextDigits) {
    if (exponent == -1) {
      text += '0';
      fraction = digits;
    } else {
      const auto whole = static_cast<std::size_t>(exponent) + 1;
      text += digits.substr(0, whole);
      fraction = digits.substr(whole);
    }
  } else {
    text += digits[0];
    fraction = digits.substr(1);
  }
  while (!fraction.empty() && fraction.back() == '0') {
    fraction.pop_back();
  }
  text += '.';
  text += fraction;
  if (exponent < -1 || exponent >= kFloatTextDigits) {
    const int size = exponent < 0 ? -exponent : exponent;
    text += exponent < 0 ? "e-" : "e+";
    text += static_cast<char>('0' + size / 100);
    text += static_cast<char>('0' + size / 10 % 10);
    text += static_cast<char>('0' + size % 10);
  }
  return text;
}

std::string floatText(float value) {
  return doubleText(static_cast<double>(value));
}

} // namespace morvex::runtime
