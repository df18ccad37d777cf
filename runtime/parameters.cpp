// Parameter lists: finding separators outside escapes, escaping and unescaping items,
// binding a list as p1 ... pN, and the two expressions that escape and unescape texts.
#include "runtime/parameters.h"

#include "runtime/host_services.h"
#include "runtime/number_text.h"
#include "runtime/routines.h"

#include <cstring>
#include <limits>

namespace morvex::runtime {
namespace {

constexpr char kEscape = '\\';
constexpr char kSeparator = ',';

// The position of the first `wanted` outside escapes in [from, to], or `none`.
std::size_t scanUnescaped(const char *text, char wanted, std::size_t from, std::size_t to,
                          std::size_t none) {
  for (std::size_t i = from; i <= to;) {
    if (text[i] == kEscape) {
      i += 2;
    } else if (text[i] == wanted) {
      return i;
    } else {
      ++i;
    }
  }
  return none;
}

} // namespace

std::int32_t findUnescaped(const char *text, char wanted, std::int32_t first, std::int32_t last) {
  if (!text) {
    return -1;
  }
  // Indices are 32-bit: a longer text is searched only as far as they reach.
  const std::size_t length =
      std::min<std::size_t>(std::strlen(text), std::numeric_limits<std::int32_t>::max());
  const auto size = static_cast<std::int32_t>(length);
  if (first < 0) {
    first = 0;
  }
  if (last < first || last >= size) {
    last = size - 1;
  }
  if (last < first) {
    return -1;
  }
  const std::size_t found =
      scanUnescaped(text, wanted, static_cast<std::size_t>(first), static_cast<std::size_t>(last),
                    static_cast<std::size_t>(-1));
  return found == static_cast<std::size_t>(-1) ? -1 : static_cast<std::int32_t>(found);
}

std::string escapeText(const char *text) {
  if (!text) {
    return {};
  }
  const std::size_t length = std::strlen(text);
  std::size_t specials = 0;
  for (std::size_t i = 0; i < length; ++i) {
    specials += (text[i] == kEscape || text[i] == kSeparator) ? 1 : 0;
  }
  std::string escaped;
  escaped.reserve(length + specials);
  for (std::size_t i = 0; i < length; ++i) {
    if (text[i] == kEscape || text[i] == kSeparator) {
      escaped += kEscape;
    }
    escaped += text[i];
  }
  return escaped;
}

void unescapeText(std::string &text) {
  std::size_t write = 0;
  for (std::size_t read = 0; read < text.size(); ++read) {
    if (text[read] == kEscape) {
      ++read; // drop the backslash, keep what follows (nothing at the very end)
      if (read == text.size()) {
        break;
      }
    }
    text[write++] = text[read];
  }
  text.resize(write);
}

std::int32_t bindParameters(const char *list, VariableList &variables) {
  if (!list || *list == '\0') {
    return 0;
  }
  const std::size_t length = std::strlen(list);
  std::size_t start = 0;
  std::int32_t count = 0;
  for (;;) {
    const std::size_t stop = scanUnescaped(list, kSeparator, start, length - 1, length);
    ++count;
    const std::string raw(list + start, stop - start);
    auto record = std::make_unique<VariableRecord>(("p" + integerText(count)).c_str());
    Value &value = record->value;
    value.intValue = readInteger(raw.c_str());
    value.floatValue = readFloat(raw.c_str());
    value.stringValue = raw;
    unescapeText(value.stringValue);
    variables.insertOrReplace(std::move(record));
    if (stop == length || count == std::numeric_limits<std::int32_t>::max()) {
      return count;
    }
    start = stop + 1;
  }
}

namespace {

// Keeps `result` as the latest escape result: the previous one is released, the latest
// becomes the previous (its text keeps its address), and the new text is handed out,
// owned by the object until two more evaluations have run.
HostWord keepStringResult(RunObject &object, std::string result) {
  object.previousStringResult = std::move(object.stringResult);
  object.stringResult = std::make_unique<std::string>(std::move(result));
  markStringResult(object);
  return textResult(*object.stringResult);
}

} // namespace

HostWord formatString(RunObject &object, HostWord cookie) {
  const char *text = fetchFirstExpressionText(object, cookie);
  return keepStringResult(object, escapeText(text));
}

HostWord unformatString(RunObject &object, HostWord cookie) {
  const char *text = fetchFirstExpressionText(object, cookie);
  std::string result = text ? text : "";
  unescapeText(result);
  return keepStringResult(object, std::move(result));
}

} // namespace morvex::runtime
