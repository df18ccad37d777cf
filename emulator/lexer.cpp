// Tokens of sheet expressions: numbers, texts, names and operators.
#include "emulator/lexer.h"

#include <charconv>
#include <system_error>

namespace morvex::emulator {

namespace {

bool isDigit(char c) {
  return c >= '0' && c <= '9';
}
bool isNameStart(char c) {
  return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z') || c == '_';
}
bool isNamePart(char c) {
  return isNameStart(c) || isDigit(c);
}

} // namespace

Lexer::Lexer(std::string_view line, int lineNumber, std::size_t begin, std::size_t end)
    : line_(line), lineNumber_(lineNumber), position_(begin), end_(end), consumedTo_(begin) {
  current_ = scan();
}

Location Lexer::locationOf(std::size_t offset) const {
  return {lineNumber_, static_cast<int>(offset) + 1};
}

Token Lexer::take() {
  Token taken = current_;
  if (taken.kind != Token::Kind::End) {
    consumedTo_ = taken.end;
  }
  current_ = scan();
  return taken;
}

Token Lexer::invalid(Token &token, std::size_t end, const char *why) {
  token.kind = Token::Kind::Invalid;
  token.text = why;
  token.end = end;
  position_ = end;
  return token;
}

Token Lexer::scan() {
  while (position_ < end_ && (line_[position_] == ' ' || line_[position_] == '\t')) {
    ++position_;
  }
  Token token;
  token.begin = position_;
  if (position_ >= end_) {
    token.end = position_;
    return token;
  }
  const char c = line_[position_];
  if (isDigit(c)) {
    std::size_t i = position_;
    std::int64_t value = 0;
    while (i < end_ && isDigit(line_[i])) {
      if (value <= kLargestIntegerLiteral) {
        value = value * 10 + (line_[i] - '0');
      }
      ++i;
    }
    if (i < end_ && line_[i] == '.') {
      ++i;
      while (i < end_ && isDigit(line_[i])) {
        ++i;
      }
      if (i < end_ && (line_[i] == 'e' || line_[i] == 'E')) {
        std::size_t j = i + 1;
        if (j < end_ && (line_[j] == '+' || line_[j] == '-')) {
          ++j;
        }
        if (j < end_ && isDigit(line_[j])) {
          while (j < end_ && isDigit(line_[j])) {
            ++j;
          }
          i = j;
        }
      }
      token.kind = Token::Kind::Float;
      const auto result = std::from_chars(line_.data() + position_, line_.data() + i, token.real);
      if (result.ec != std::errc() || result.ptr != line_.data() + i) {
        return invalid(token, i, "float literal out of the 32-bit float range");
      }
    } else {
      token.kind = Token::Kind::Integer;
      if (value > kLargestIntegerLiteral) {
        return invalid(token, i, "integer literal out of the 32-bit range");
      }
      token.integer = value;
    }
    position_ = i;
  } else if (c == '"') {
    std::size_t i = position_ + 1;
    for (;;) {
      if (i >= end_) {
        return invalid(token, i, "unterminated string literal");
      }
      if (line_[i] == '"') {
        if (i + 1 < end_ && line_[i + 1] == '"') {
          token.text += '"';
          i += 2;
          continue;
        }
        ++i;
        break;
      }
      token.text += line_[i++];
    }
    token.kind = Token::Kind::Text;
    position_ = i;
  } else if (isNameStart(c)) {
    std::size_t i = position_;
    while (i < end_ && isNamePart(line_[i])) {
      ++i;
    }
    if (i < end_ && line_[i] == '$') {
      ++i;
    }
    token.kind = Token::Kind::Name;
    token.text = std::string(line_.substr(position_, i - position_));
    position_ = i;
  } else {
    switch (c) {
    case '(':
      token.kind = Token::Kind::LeftParen;
      break;
    case ')':
      token.kind = Token::Kind::RightParen;
      break;
    case ',':
      token.kind = Token::Kind::Comma;
      break;
    case '+':
      token.kind = Token::Kind::Plus;
      break;
    case '-':
      token.kind = Token::Kind::Minus;
      break;
    case '*':
      token.kind = Token::Kind::Star;
      break;
    case '/':
      token.kind = Token::Kind::Slash;
      break;
    default:
      token.kind = Token::Kind::Other;
      break;
    }
    token.text = std::string(1, c);
    ++position_;
  }
  token.end = position_;
  return token;
}

} // namespace morvex::emulator
