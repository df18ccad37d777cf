// The values a sheet's expressions compute: a 32-bit integer, a 32-bit float or a text,
// and the host's two ways of turning them into text and back (Str$ and Val).
#ifndef MORVEX_EMULATOR_VALUE_H
#define MORVEX_EMULATOR_VALUE_H

#include <cstdint>
#include <string>
#include <string_view>
#include <variant>

namespace morvex::emulator {

using Value = std::variant<std::int32_t, float, std::string>;

inline bool isText(const Value &value) {
  return std::holds_alternative<std::string>(value);
}
inline bool isNumber(const Value &value) {
  return !isText(value);
}

// A float as the shortest text that reads back as the same 32-bit float (2.5, 3, 1e+20).
std::string formatFloat(float value);

// A value as Display shows it and Str$ writes it: integers in decimal, floats as
// formatFloat, texts as they are.
std::string formatValue(const Value &value);

// Val: an integer when the text is a whole decimal number that fits in 32 bits, else the
// text's leading number read as a float (0 when there is none).
Value readNumber(std::string_view text);

// A number as an integer: floats truncate toward zero; NaN gives 0 and values beyond the
// 32-bit range give the nearest end of it.
std::int32_t toInteger(const Value &number);
float toFloat(const Value &number);

// A 64-bit intermediate result wrapped to 32 bits, as the host's integer arithmetic does.
std::int32_t wrapInteger(std::int64_t value);

} // namespace morvex::emulator

#endif
