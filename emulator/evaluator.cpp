// Host arithmetic: 32-bit integers that wrap, 32-bit floats as soon as one side is a
// float, "+" joining texts; division by zero stops the game.
#include "emulator/evaluator.h"

#include <cstdint>
#include <limits>
#include <utility>

namespace morvex::emulator {

namespace {

const char *symbolOf(Expression::Kind kind) {
  switch (kind) {
  case Expression::Kind::Add:
    return "+";
  case Expression::Kind::Subtract:
    return "-";
  case Expression::Kind::Multiply:
    return "*";
  default:
    break;
  }
  return "/";
}

std::optional<Value> arithmetic(Expression::Kind kind, const Value &left, const Value &right,
                                ExpressionCalls &calls) {
  if (isText(left) || isText(right)) {
    if (kind == Expression::Kind::Add && isText(left) && isText(right)) {
      return std::get<std::string>(left) + std::get<std::string>(right);
    }
    calls.fail(std::string("\"") + symbolOf(kind) + "\" was given a text where it needs a number");
    return std::nullopt;
  }
  const auto *a = std::get_if<std::int32_t>(&left);
  const auto *b = std::get_if<std::int32_t>(&right);
  if (a != nullptr && b != nullptr) {
    const std::int64_t x = *a;
    const std::int64_t y = *b;
    switch (kind) {
    case Expression::Kind::Add:
      return wrapInteger(x + y);
    case Expression::Kind::Subtract:
      return wrapInteger(x - y);
    case Expression::Kind::Multiply:
      return wrapInteger(x * y);
    default:
      break;
    }
    if (y == 0) {
      calls.fail("division by zero");
      return std::nullopt;
    }
    return wrapInteger(x / y); // the 64-bit quotient of -2^31 / -1 wraps back to -2^31
  }
  const float x = toFloat(left);
  const float y = toFloat(right);
  switch (kind) {
  case Expression::Kind::Add:
    return x + y;
  case Expression::Kind::Subtract:
    return x - y;
  case Expression::Kind::Multiply:
    return x * y;
  default:
    break;
  }
  if (y == 0.0f) {
    calls.fail("division by zero");
    return std::nullopt;
  }
  return x / y;
}

double asDouble(const Value &number) {
  if (const auto *integer = std::get_if<std::int32_t>(&number)) {
    return *integer;
  }
  return toFloat(number);
}

class Evaluator {
public:
  explicit Evaluator(ExpressionCalls &calls) : calls_(calls) {}

  std::optional<Value> evaluate(const Expression &expression) {
    switch (expression.kind) {
    case Expression::Kind::Integer:
    case Expression::Kind::Object:
      return expression.integer;
    case Expression::Kind::Float:
      return expression.real;
    case Expression::Kind::Text:
      return expression.text;
    case Expression::Kind::Negate:
      return negate(expression);
    case Expression::Kind::Add:
    case Expression::Kind::Subtract:
    case Expression::Kind::Multiply:
    case Expression::Kind::Divide: {
      std::optional<Value> left = evaluate(*expression.operands[0]);
      if (!left) {
        return std::nullopt;
      }
      std::optional<Value> right = evaluate(*expression.operands[1]);
      if (!right) {
        return std::nullopt;
      }
      return arithmetic(expression.kind, *left, *right, calls_);
    }
    case Expression::Kind::Str:
      return str(expression);
    case Expression::Kind::Val:
      return val(expression);
    case Expression::Kind::Extension:
      return extension(expression);
    }
    return std::nullopt;
  }

private:
  std::optional<Value> negate(const Expression &expression) {
    std::optional<Value> operand = evaluate(*expression.operands[0]);
    if (!operand) {
      return std::nullopt;
    }
    if (const auto *integer = std::get_if<std::int32_t>(&*operand)) {
      return wrapInteger(-static_cast<std::int64_t>(*integer));
    }
    if (const auto *real = std::get_if<float>(&*operand)) {
      return -*real;
    }
    calls_.fail("\"-\" was given a text where it needs a number");
    return std::nullopt;
  }

  std::optional<Value> str(const Expression &expression) {
    std::optional<Value> operand = evaluate(*expression.operands[0]);
    if (!operand) {
      return std::nullopt;
    }
    if (isText(*operand)) {
      calls_.fail("\"Str$(\" was given a text where it needs a number");
      return std::nullopt;
    }
    return formatValue(*operand);
  }

  std::optional<Value> val(const Expression &expression) {
    std::optional<Value> operand = evaluate(*expression.operands[0]);
    if (!operand) {
      return std::nullopt;
    }
    if (!isText(*operand)) {
      calls_.fail("\"Val(\" was given a number where it needs a text");
      return std::nullopt;
    }
    return readNumber(std::get<std::string>(*operand));
  }

  std::optional<Value> extension(const Expression &expression) {
    std::vector<Value> parameters;
    parameters.reserve(expression.operands.size());
    for (const ExpressionPtr &operand : expression.operands) {
      std::optional<Value> value = evaluate(*operand);
      if (!value) {
        return std::nullopt;
      }
      parameters.push_back(std::move(*value));
    }
    return calls_.callExtension(expression, std::move(parameters));
  }

  ExpressionCalls &calls_;
};

} // namespace

std::optional<Value> evaluate(const Expression &expression, ExpressionCalls &calls) {
  return Evaluator(calls).evaluate(expression);
}

std::optional<bool> compareValues(const Value &left, CompareOp op, const Value &right,
                                  ExpressionCalls &calls) {
  int order = 0;
  if (isText(left) && isText(right)) {
    const int compared = std::get<std::string>(left).compare(std::get<std::string>(right));
    order = compared < 0 ? -1 : (compared > 0 ? 1 : 0);
  } else if (isNumber(left) && isNumber(right)) {
    // Doubles hold every 32-bit integer and every float exactly.
    const double a = asDouble(left);
    const double b = asDouble(right);
    if (a != a || b != b) { // NaN: unordered, only "<>" holds
      return op == CompareOp::NotEqual;
    }
    order = a < b ? -1 : (a > b ? 1 : 0);
  } else {
    calls.fail("\"Compare\" was given a text and a number");
    return std::nullopt;
  }
  switch (op) {
  case CompareOp::Equal:
    return order == 0;
  case CompareOp::NotEqual:
    return order != 0;
  case CompareOp::Less:
    return order < 0;
  case CompareOp::LessEqual:
    return order <= 0;
  case CompareOp::Greater:
    return order > 0;
  case CompareOp::GreaterEqual:
    break;
  }
  return order >= 0;
}

} // namespace morvex::emulator
