// Recursive-descent parsing of sheet expressions:
//   sum     := product (("+" | "-") product)*
//   product := unary (("*" | "/") unary)*
//   unary   := "-" unary | primary
//   primary := integer | float | text | "(" sum ")" | NAME "(" arguments ")"
#include "emulator/expression_parser.h"

#include "emulator/lexer.h"

#include <algorithm>
#include <cctype>
#include <cstdint>
#include <limits>
#include <utility>

namespace morvex::emulator {

int ParseContext::findObject(std::string_view name) const {
  if (objects == nullptr) {
    return -1;
  }
  for (std::size_t i = 0; i < objects->size(); ++i) {
    if ((*objects)[i] == name) {
      return static_cast<int>(i);
    }
  }
  return -1;
}

const char *typeName(StaticType type) {
  return type == StaticType::Text ? "a text" : "a number";
}

namespace {

bool equalIgnoringCase(std::string_view a, std::string_view b) {
  if (a.size() != b.size()) {
    return false;
  }
  for (std::size_t i = 0; i < a.size(); ++i) {
    if (std::tolower(static_cast<unsigned char>(a[i])) !=
        std::tolower(static_cast<unsigned char>(b[i]))) {
      return false;
    }
  }
  return true;
}

std::string quoted(std::string_view text) {
  return "\"" + std::string(text) + "\"";
}

class Parser {
public:
  Parser(const ParseContext &context, std::string_view line, int lineNumber, std::size_t begin,
         std::size_t end)
      : context_(context), lexer_(line, lineNumber, begin, end) {}

  ExpressionPtr parseSum() {
    ExpressionPtr left = parseProduct();
    for (;;) {
      const Token::Kind kind = lexer_.peek().kind;
      if (kind != Token::Kind::Plus && kind != Token::Kind::Minus) {
        return left;
      }
      const Token op = lexer_.take();
      ExpressionPtr right = parseProduct();
      left = binary(kind == Token::Kind::Plus ? Expression::Kind::Add : Expression::Kind::Subtract,
                    op, std::move(left), std::move(right));
    }
  }

  Lexer &lexer() { return lexer_; }

private:
  ExpressionPtr parseProduct() {
    ExpressionPtr left = parseUnary();
    for (;;) {
      const Token::Kind kind = lexer_.peek().kind;
      if (kind != Token::Kind::Star && kind != Token::Kind::Slash) {
        return left;
      }
      const Token op = lexer_.take();
      ExpressionPtr right = parseUnary();
      left =
          binary(kind == Token::Kind::Star ? Expression::Kind::Multiply : Expression::Kind::Divide,
                 op, std::move(left), std::move(right));
    }
  }

  ExpressionPtr parseUnary() {
    if (lexer_.peek().kind != Token::Kind::Minus) {
      return parsePrimary();
    }
    const Token op = lexer_.take();
    DepthGuard guard(*this, op);
    // -2147483648 is the one place where 2^31 may be written.
    if (lexer_.peek().kind == Token::Kind::Integer &&
        lexer_.peek().integer == kLargestIntegerLiteral) {
      lexer_.take();
      return integer(op, std::numeric_limits<std::int32_t>::min());
    }
    ExpressionPtr operand = parseUnary();
    if (operand->type != StaticType::Number) {
      throw ParseError{operand->where, "\"-\" needs a number, not a text"};
    }
    auto negate = node(Expression::Kind::Negate, op, StaticType::Number);
    adopt(*negate, std::move(operand));
    return negate;
  }

  ExpressionPtr parsePrimary() {
    const Token token = lexer_.take();
    switch (token.kind) {
    case Token::Kind::Integer:
      if (token.integer == kLargestIntegerLiteral) {
        throw ParseError{at(token), "integer literal out of the 32-bit range"};
      }
      return integer(token, static_cast<std::int32_t>(token.integer));
    case Token::Kind::Float: {
      auto literal = node(Expression::Kind::Float, token, StaticType::Number);
      literal->real = token.real;
      return literal;
    }
    case Token::Kind::Text: {
      auto literal = node(Expression::Kind::Text, token, StaticType::Text);
      literal->text = token.text;
      return literal;
    }
    case Token::Kind::LeftParen: {
      DepthGuard guard(*this, token);
      ExpressionPtr inner = parseSum();
      expect(Token::Kind::RightParen, "\")\"");
      return inner;
    }
    case Token::Kind::Name:
      return parseCall(token);
    case Token::Kind::Invalid:
      throw ParseError{at(token), token.text};
    case Token::Kind::End:
      throw ParseError{at(token), "expected an expression"};
    default:
      break;
    }
    throw ParseError{at(token), "expected an expression"};
  }

  ExpressionPtr parseCall(const Token &name) {
    if (lexer_.peek().kind != Token::Kind::LeftParen) {
      throw ParseError{at(name), "expected an expression, found the name " + quoted(name.text) +
                                     " (expressions end in \"(\"; objects are named by texts)"};
    }
    lexer_.take();
    DepthGuard guard(*this, name);
    const std::string display = name.text + "(";
    if (display == "Str$(" || display == "Val(") {
      const bool isStr = display == "Str$(";
      auto call = node(isStr ? Expression::Kind::Str : Expression::Kind::Val, name,
                       isStr ? StaticType::Text : StaticType::Number);
      ExpressionPtr argument = parseSum();
      const StaticType wanted = isStr ? StaticType::Number : StaticType::Text;
      if (argument->type != wanted) {
        throw ParseError{argument->where, quoted(display) + " takes " + typeName(wanted) +
                                              ", not " + typeName(argument->type)};
      }
      adopt(*call, std::move(argument));
      expect(Token::Kind::RightParen, "\")\"");
      return call;
    }
    const RoutineInfo *info =
        context_.catalog ? context_.catalog->findExpression(display) : nullptr;
    if (info == nullptr) {
      throw ParseError{at(name), "unknown expression " + quoted(display) + suggestion(display)};
    }
    return parseExtensionCall(name, *info);
  }

  ExpressionPtr parseExtensionCall(const Token &name, const RoutineInfo &info) {
    auto call = node(Expression::Kind::Extension, name,
                     info.flags == kStringResult ? StaticType::Text : StaticType::Number);
    call->code = info.code;
    call->text = info.display;
    const Token object = lexer_.take();
    if (object.kind != Token::Kind::Text) {
      throw ParseError{at(object), quoted(info.display) +
                                       " takes the object's name first, as a string literal"};
    }
    call->integer = context_.findObject(object.text);
    if (call->integer < 0) {
      throw ParseError{at(object), "no object named " + quoted(object.text)};
    }
    for (std::size_t i = 0; i < info.parameterTypes.size(); ++i) {
      if (lexer_.peek().kind == Token::Kind::RightParen) {
        throw ParseError{at(lexer_.peek()), quoted(info.display) + " takes " +
                                                countText(info.parameterTypes.size()) +
                                                " after the object's name"};
      }
      expect(Token::Kind::Comma, "\",\"");
      ExpressionPtr argument = parseSum();
      const StaticType wanted =
          info.parameterTypes[i] == kStringArgument ? StaticType::Text : StaticType::Number;
      if (argument->type != wanted) {
        throw ParseError{argument->where, "parameter " + std::to_string(i + 1) + " of " +
                                              quoted(info.display) + " is " + typeName(wanted) +
                                              ", not " + typeName(argument->type)};
      }
      adopt(*call, std::move(argument));
    }
    if (lexer_.peek().kind == Token::Kind::Comma) {
      throw ParseError{at(lexer_.peek()), quoted(info.display) + " takes " +
                                              countText(info.parameterTypes.size()) +
                                              " after the object's name"};
    }
    expect(Token::Kind::RightParen, "\")\"");
    return call;
  }

  // A hint for a name that differs from a known one only in letter case.
  std::string suggestion(const std::string &display) const {
    for (const char *host : {"Str$(", "Val("}) {
      if (equalIgnoringCase(display, host)) {
        return std::string(" (did you mean ") + quoted(host) + "?)";
      }
    }
    if (context_.catalog != nullptr) {
      for (const RoutineInfo &info : context_.catalog->expressions) {
        if (equalIgnoringCase(display, info.display)) {
          return " (did you mean " + quoted(info.display) + "?)";
        }
      }
    }
    return "";
  }

  static std::string countText(std::size_t count) {
    if (count == 0) {
      return "no parameters";
    }
    return std::to_string(count) + (count == 1 ? " parameter" : " parameters");
  }

  ExpressionPtr binary(Expression::Kind kind, const Token &op, ExpressionPtr left,
                       ExpressionPtr right) {
    StaticType type = StaticType::Number;
    if (kind == Expression::Kind::Add && left->type == StaticType::Text &&
        right->type == StaticType::Text) {
      type = StaticType::Text;
    } else if (left->type != StaticType::Number || right->type != StaticType::Number) {
      throw ParseError{at(op), kind == Expression::Kind::Add
                                   ? std::string("\"+\" mixes a text and a number")
                                   : "\"" + op.text + "\" needs numbers, not texts"};
    }
    auto result = node(kind, op, type);
    adopt(*result, std::move(left));
    adopt(*result, std::move(right));
    return result;
  }

  // Makes `child` the next operand of `parent`. A chain of operators adds one node per
  // operator to the tree's height, parentheses or not; a tree taller than the limit is
  // refused here rather than overflowing the stack when it is evaluated or destroyed.
  void adopt(Expression &parent, ExpressionPtr child) const {
    parent.height = std::max(parent.height, child->height + 1);
    if (parent.height > kMaxExpressionHeight) {
      throw ParseError{parent.where, "expression nested too deeply"};
    }
    parent.operands.push_back(std::move(child));
  }

  void expect(Token::Kind kind, const char *what) {
    const Token &next = lexer_.peek();
    if (next.kind != kind) {
      if (next.kind == Token::Kind::Invalid) {
        throw ParseError{at(next), next.text};
      }
      throw ParseError{at(next), std::string("expected ") + what};
    }
    lexer_.take();
  }

  ExpressionPtr node(Expression::Kind kind, const Token &token, StaticType type) const {
    auto result = std::make_unique<Expression>();
    result->kind = kind;
    result->where = at(token);
    result->type = type;
    return result;
  }

  ExpressionPtr integer(const Token &token, std::int32_t value) const {
    auto literal = node(Expression::Kind::Integer, token, StaticType::Number);
    literal->integer = value;
    return literal;
  }

  Location at(const Token &token) const { return lexer_.locationOf(token.begin); }

  // Counts nesting so that a line of ten thousand parentheses is an error, not a crash.
  class DepthGuard {
  public:
    DepthGuard(Parser &parser, const Token &token) : parser_(parser) {
      if (++parser_.depth_ > kMaxExpressionDepth) {
        throw ParseError{parser_.at(token), "expression nested too deeply"};
      }
    }
    ~DepthGuard() { --parser_.depth_; }
    DepthGuard(const DepthGuard &) = delete;
    DepthGuard &operator=(const DepthGuard &) = delete;

  private:
    Parser &parser_;
  };

  const ParseContext &context_;
  Lexer lexer_;
  int depth_ = 0;
};

} // namespace

ExpressionPtr parseExpressionPrefix(const ParseContext &context, std::string_view line,
                                    int lineNumber, std::size_t begin, std::size_t end,
                                    std::size_t &stop) {
  Parser parser(context, line, lineNumber, begin, end);
  ExpressionPtr result = parser.parseSum();
  stop = parser.lexer().consumedTo();
  return result;
}

ExpressionPtr parseExpression(const ParseContext &context, std::string_view line, int lineNumber,
                              std::size_t begin, std::size_t end) {
  Parser parser(context, line, lineNumber, begin, end);
  ExpressionPtr result = parser.parseSum();
  const Token &rest = parser.lexer().peek();
  if (rest.kind == Token::Kind::Invalid) {
    throw ParseError{parser.lexer().locationOf(rest.begin), rest.text};
  }
  if (rest.kind != Token::Kind::End) {
    throw ParseError{parser.lexer().locationOf(rest.begin), "unexpected text after the expression"};
  }
  return result;
}

} // namespace morvex::emulator
