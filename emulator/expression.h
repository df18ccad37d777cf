// The expressions of a sheet, as parsed: literals, arithmetic, the host's Str$ and Val,
// and calls of the extension's expressions.
#ifndef MORVEX_EMULATOR_EXPRESSION_H
#define MORVEX_EMULATOR_EXPRESSION_H

#include "emulator/source.h"

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

namespace morvex::emulator {

// What an expression gives, as far as the parser can tell: the extension's expressions
// answer by the result type of their record.
enum class StaticType { Number, Text };

struct Expression {
  enum class Kind {
    Integer,   // `integer`
    Float,     // `real`
    Text,      // `text`
    Object,    // an object's name where a parameter chooses an object: `integer` is its number
    Negate,    // operands[0]
    Add,       // operands[0], operands[1]
    Subtract,  // likewise
    Multiply,  // likewise
    Divide,    // likewise
    Str,       // Str$(operands[0])
    Val,       // Val(operands[0])
    Extension, // the extension's expression `code` for object number `integer`, parameters
               // in `operands`; `text` is its display name
  };

  Kind kind = Kind::Integer;
  Location where;
  StaticType type = StaticType::Number;
  std::int32_t integer = 0;
  float real = 0.0f;
  std::string text;
  int code = 0;
  std::vector<std::unique_ptr<Expression>> operands;
  int height = 1; // nodes on the longest path from here down to a leaf, this one included
};

using ExpressionPtr = std::unique_ptr<Expression>;

} // namespace morvex::emulator

#endif
