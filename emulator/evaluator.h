// Computes the value of a parsed expression. The extension's expressions are called
// through ExpressionCalls; any failure stops the game through it.
#ifndef MORVEX_EMULATOR_EVALUATOR_H
#define MORVEX_EMULATOR_EVALUATOR_H

#include "emulator/expression.h"
#include "emulator/sheet.h"
#include "emulator/value.h"

#include <optional>
#include <string>
#include <vector>

namespace morvex::emulator {

// What evaluating needs from the running game.
class ExpressionCalls {
public:
  virtual ~ExpressionCalls() = default;
  // Runs expression `call` of the extension with its evaluated parameters; nothing when
  // the game stopped meanwhile.
  virtual std::optional<Value> callExtension(const Expression &call,
                                             std::vector<Value> parameters) = 0;
  // Stops the game with `message` (division by zero, a value of the wrong type).
  virtual void fail(std::string message) = 0;
};

// The expression's value; nothing when the game stopped while computing it.
std::optional<Value> evaluate(const Expression &expression, ExpressionCalls &calls);

// Whether `left op right` holds; nothing (after calls.fail) when a text meets a number.
std::optional<bool> compareValues(const Value &left, CompareOp op, const Value &right,
                                  ExpressionCalls &calls);

} // namespace morvex::emulator

#endif
