// Splits the expression part of a sheet line into tokens.
#ifndef MORVEX_EMULATOR_LEXER_H
#define MORVEX_EMULATOR_LEXER_H

#include "emulator/source.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace morvex::emulator {

struct Token {
  enum class Kind {
    End,
    Integer, // `integer` holds the digits' value, up to 2^31 (checked by the parser)
    Float,   // `real`
    Text,    // `text` holds the literal with each "" turned into one "
    Name,    // `text` holds the name, with a trailing $ when it has one
             // (every other kind but Invalid holds its one character in `text`)
    LeftParen,
    RightParen,
    Comma,
    Plus,
    Minus,
    Star,
    Slash,
    Other,   // anything else: ends an expression
    Invalid, // a malformed literal: `text` says why; an error once the parser needs it
  };

  Kind kind = Kind::End;
  std::size_t begin = 0; // offsets in the line
  std::size_t end = 0;
  std::int64_t integer = 0;
  float real = 0.0f;
  std::string text;
};

// Reads tokens from line[begin, end). A malformed literal becomes an Invalid token, so that
// it is an error only where an expression needs it, not where one has already ended.
class Lexer {
public:
  Lexer(std::string_view line, int lineNumber, std::size_t begin, std::size_t end);

  const Token &peek() const { return current_; }
  Token take();
  // The offset just after the last token taken (the start when none was).
  std::size_t consumedTo() const { return consumedTo_; }
  Location locationOf(std::size_t offset) const;

private:
  Token scan();
  Token invalid(Token &token, std::size_t end, const char *why);

  std::string_view line_;
  int lineNumber_;
  std::size_t position_;
  std::size_t end_;
  std::size_t consumedTo_;
  Token current_;
};

// The largest integer literal: 2^31, allowed only right after a unary minus.
inline constexpr std::int64_t kLargestIntegerLiteral = 2147483648LL;

} // namespace morvex::emulator

#endif
