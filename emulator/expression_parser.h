// Parses the expressions of sheet lines, checking names, parameter counts and whether
// each operand is a number or a text.
#ifndef MORVEX_EMULATOR_EXPRESSION_PARSER_H
#define MORVEX_EMULATOR_EXPRESSION_PARSER_H

#include "emulator/catalog.h"
#include "emulator/expression.h"

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace morvex::emulator {

// What expressions may name: the extension's expressions and the sheet's objects. Both
// are borrowed and must outlive the parse.
struct ParseContext {
  const Catalog *catalog = nullptr;
  const std::vector<std::string> *objects = nullptr;

  // The number of the object called `name`, or -1.
  int findObject(std::string_view name) const;
};

// Expressions nest at most this deep (parentheses, unary minus, calls).
inline constexpr int kMaxExpressionDepth = 200;

// A parsed expression is at most this many nodes tall, so that evaluating and destroying
// it stays within the stack: a sum of as many terms, or operators and calls nested so.
inline constexpr int kMaxExpressionHeight = 1000;

// Parses the longest expression that starts at `begin` and ends by `end` in `line`, and
// sets `stop` to the offset just after its last token. Throws ParseError when no
// expression starts there or a part of it is malformed.
ExpressionPtr parseExpressionPrefix(const ParseContext &context, std::string_view line,
                                    int lineNumber, std::size_t begin, std::size_t end,
                                    std::size_t &stop);

// Parses line[begin, end) as exactly one expression. Throws ParseError otherwise.
ExpressionPtr parseExpression(const ParseContext &context, std::string_view line, int lineNumber,
                              std::size_t begin, std::size_t end);

// "a number" or "a text".
const char *typeName(StaticType type);

} // namespace morvex::emulator

#endif
