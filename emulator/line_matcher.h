// Reads an extension condition or action line by matching it against the extension's
// display templates: the fixed texts must stand as written, each hole holds a parameter.
#ifndef MORVEX_EMULATOR_LINE_MATCHER_H
#define MORVEX_EMULATOR_LINE_MATCHER_H

#include "emulator/catalog.h"
#include "emulator/expression.h"
#include "emulator/expression_parser.h"

#include <cstddef>
#include <string_view>
#include <vector>

namespace morvex::emulator {

// A condition or action of the extension as a line writes it.
struct RoutineCall {
  int object = -1; // the object's number in the sheet
  int code = 0;
  std::vector<ExpressionPtr> arguments; // by parameter number, one per parameter
};

// Matches line[begin, end), the text after "NAME: ", against every routine of `kind`.
// Exactly one template must match the whole text. Throws ParseError otherwise, saying
// where the nearest template stopped matching and which part of it did not match.
RoutineCall matchRoutine(const ParseContext &context, RoutineKind kind, std::string_view line,
                         int lineNumber, std::size_t begin, std::size_t end);

} // namespace morvex::emulator

#endif
