// Parameter lists: comma-separated items with backslash escapes, bound as p1, p2, ...
#ifndef MORVEX_RUNTIME_PARAMETERS_H
#define MORVEX_RUNTIME_PARAMETERS_H

#include "runtime/run_object.h"

#include <cstdint>
#include <string>

namespace morvex::runtime {

// The index of the first `wanted` outside escapes between `first` and `last` inclusive
// (a `last` below `first` or past the end means the end of the text); -1 when none.
std::int32_t findUnescaped(const char *text, char wanted, std::int32_t first, std::int32_t last);

// The text with a backslash put before every backslash and comma (missing counts as "").
std::string escapeText(const char *text);

// Drops every escaping backslash, keeping the character after it; never grows the text.
void unescapeText(std::string &text);

// Binds the items of `list` (missing counts as "") into the empty `variables` as p1 ... pN,
// each read as an integer, a float and its unescaped text. Returns N.
std::int32_t bindParameters(const char *list, VariableList &variables);

} // namespace morvex::runtime

#endif
