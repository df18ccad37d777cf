// Number formatting and reading for sheet values.
#include "emulator/value.h"

#include <charconv>
#include <cmath>
#include <cstdlib>
#include <limits>

namespace morvex::emulator {

std::string formatFloat(float value) {
  char buffer[64];
  const auto result = std::to_chars(buffer, buffer + sizeof buffer, value);
  return std::string(buffer, result.ptr);
}

std::string formatValue(const Value &value) {
  if (const auto *integer = std::get_if<std::int32_t>(&value)) {
    return std::to_string(*integer);
  }
  if (const auto *real = std::get_if<float>(&value)) {
    return formatFloat(*real);
  }
  return std::get<std::string>(value);
}

namespace {

bool isDigit(char c) {
  return c >= '0' && c <= '9';
}

bool isWholeNumber(std::string_view text) {
  std::size_t i = 0;
  if (i < text.size() && (text[i] == '-' || text[i] == '+')) {
    ++i;
  }
  if (i == text.size()) {
    return false;
  }
  for (; i < text.size(); ++i) {
    if (!isDigit(text[i])) {
      return false;
    }
  }
  return true;
}

} // namespace

Value readNumber(std::string_view text) {
  if (isWholeNumber(text)) {
    std::int64_t whole = 0;
    const char *first = text.data() + (text[0] == '+' ? 1 : 0);
    const auto result = std::from_chars(first, text.data() + text.size(), whole);
    if (result.ec == std::errc() && whole >= std::numeric_limits<std::int32_t>::min() &&
        whole <= std::numeric_limits<std::int32_t>::max()) {
      return static_cast<std::int32_t>(whole);
    }
  }
  // strtod needs a terminated text; it reads as atof does and stops at the first
  // character that does not belong to the number.
  const std::string terminated(text);
  return static_cast<float>(std::strtod(terminated.c_str(), nullptr));
}

std::int32_t toInteger(const Value &number) {
  if (const auto *integer = std::get_if<std::int32_t>(&number)) {
    return *integer;
  }
  const auto *real = std::get_if<float>(&number);
  if (real == nullptr || std::isnan(*real)) {
    return 0;
  }
  constexpr float kUpper = 2147483648.0f; // 2^31, the first float beyond the range
  if (*real >= kUpper) {
    return std::numeric_limits<std::int32_t>::max();
  }
  if (*real < -kUpper) {
    return std::numeric_limits<std::int32_t>::min();
  }
  return static_cast<std::int32_t>(*real);
}

float toFloat(const Value &number) {
  if (const auto *integer = std::get_if<std::int32_t>(&number)) {
    return static_cast<float>(*integer);
  }
  if (const auto *real = std::get_if<float>(&number)) {
    return *real;
  }
  return 0.0f;
}

std::int32_t wrapInteger(std::int64_t value) {
  return static_cast<std::int32_t>(static_cast<std::uint32_t>(static_cast<std::uint64_t>(value)));
}

} // namespace morvex::emulator
