// Template matching with backtracking: each hole may end at any place where the next
// fixed text of the template stands (outside string literals); the first reading in
// which every hole is a well-formed expression of its parameter's type wins.
#include "emulator/line_matcher.h"

#include "emulator/display_template.h"

#include <algorithm>
#include <optional>
#include <string>
#include <utility>

namespace morvex::emulator {

namespace {

std::string quoted(std::string_view text) {
  return "\"" + std::string(text) + "\"";
}

std::string_view trimmed(std::string_view text) {
  while (!text.empty() && text.front() == ' ') {
    text.remove_prefix(1);
  }
  while (!text.empty() && text.back() == ' ') {
    text.remove_suffix(1);
  }
  return text;
}

// Readings of holes tried per template and line: a line crowded with the template's own
// texts could otherwise take time exponential in its length.
constexpr int kMaxReadings = 10'000;

bool isNamePart(char c) {
  return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z') || (c >= '0' && c <= '9') || c == '_';
}

// Why one template did not match, at the furthest place its reading got to.
struct Failure {
  std::size_t at = 0; // where the error is reported
  std::string why;    // completes "the nearest, TEMPLATE, ..." or "in %N of TEMPLATE: ..."
  bool inHole = false;
  int parameter = 0;
  std::size_t reach = 0; // how far the reading got, when further than `at`
  std::size_t furthest() const { return std::max(at, reach); }
};

class TemplateMatcher {
public:
  TemplateMatcher(const ParseContext &context, const RoutineInfo &info, std::string_view line,
                  int lineNumber, std::size_t end)
      : context_(context), info_(info), form_(lineForm(info.display)), parts_(splitTemplate(form_)),
        line_(line), lineNumber_(lineNumber), end_(end), arguments_(info.parameterTypes.size()) {}

  bool match(std::size_t begin) { return matchFrom(0, begin); }

  std::vector<ExpressionPtr> takeArguments() {
    for (std::size_t i = 0; i < arguments_.size(); ++i) {
      if (!arguments_[i]) { // a parameter the template shows no hole for
        arguments_[i] = std::make_unique<Expression>();
        if (info_.parameterTypes[i] == kStringParam) {
          arguments_[i]->kind = Expression::Kind::Text;
          arguments_[i]->type = StaticType::Text;
        }
      }
    }
    return std::move(arguments_);
  }

  const std::optional<Failure> &failure() const { return failure_; }
  std::string_view form() const { return form_; }

private:
  bool matchFrom(std::size_t part, std::size_t position) {
    if (part == parts_.size()) {
      if (position == end_) {
        return true;
      }
      fail({position, "ends here"});
      return false;
    }
    const TemplatePart &piece = parts_[part];
    if (!piece.isHole) {
      return matchText(part, position);
    }
    if (piece.parameter == TemplatePart::kObject ||
        (static_cast<std::size_t>(piece.parameter) < info_.parameterTypes.size() &&
         info_.parameterTypes[static_cast<std::size_t>(piece.parameter)] == kObjectParam)) {
      return matchObject(part, position);
    }
    return matchExpression(part, position);
  }

  bool matchText(std::size_t part, std::size_t position) {
    if (!textStandsAt(part, position)) {
      return false;
    }
    return matchFrom(part + 1, position + parts_[part].text.size());
  }

  // Whether the fixed text of `part` stands at `position`; records where it parts ways.
  bool textStandsAt(std::size_t part, std::size_t position) {
    const std::string &text = parts_[part].text;
    std::size_t same = 0;
    while (same < text.size() && position + same < end_ && line_[position + same] == text[same]) {
      ++same;
    }
    if (same < text.size()) {
      if (position + same == end_) {
        fail({end_, "goes on after the end of the line"});
      } else {
        // Point at the word that differs, and name the template's words from there on.
        const std::size_t space = text.rfind(' ', same == 0 ? 0 : same - 1);
        const std::size_t word = space == std::string::npos || space >= same ? 0 : space + 1;
        fail({position + word, "expects " + quoted(trimmed(text.substr(word))) + " here", false, 0,
              position + same});
      }
      return false;
    }
    return true;
  }

  bool matchObject(std::size_t part, std::size_t position) {
    std::size_t stop = position;
    while (stop < end_ && isNamePart(line_[stop])) {
      ++stop;
    }
    const std::string_view name = line_.substr(position, stop - position);
    const int object = context_.findObject(name);
    if (object < 0) {
      const int parameter = parts_[part].parameter;
      fail({position,
            name.empty() ? "expected an object's name" : "no object named " + quoted(name), true,
            parameter});
      return false;
    }
    auto reference = std::make_unique<Expression>();
    reference->kind = Expression::Kind::Object;
    reference->where = {lineNumber_, static_cast<int>(position) + 1};
    reference->integer = object;
    return bind(part, std::move(reference), stop);
  }

  bool matchExpression(std::size_t part, std::size_t position) {
    const bool last = part + 1 == parts_.size();
    const bool textFollows = !last && !parts_[part + 1].isHole;
    // The greedy reading: the longest expression from here. Its error, or the place where
    // the next fixed text should stand after it, is what a failure reports.
    std::optional<std::size_t> greedyStop;
    try {
      std::size_t stop = position;
      parseExpressionPrefix(context_, line_, lineNumber_, position, end_, stop);
      greedyStop = stop;
    } catch (const ParseError &error) {
      failInHole(part, error);
    }
    std::vector<std::size_t> ends;
    if (last) {
      ends.push_back(end_);
    } else if (textFollows) {
      ends = placesOf(parts_[part + 1].text, position);
      if (greedyStop && !containsEnd(ends, *greedyStop)) {
        textStandsAt(part + 1, *greedyStop); // records where the greedy reading parted ways
      }
    } else if (greedyStop) {
      ends.push_back(*greedyStop); // two holes in a row: the first takes what it can
    }
    for (const std::size_t stop : ends) {
      if (++readings_ > kMaxReadings) {
        fail({position, "the line can be read in too many ways", true, parts_[part].parameter,
              end_});
        return false;
      }
      ExpressionPtr argument;
      try {
        argument = parseExpression(context_, line_, lineNumber_, position, stop);
      } catch (const ParseError &error) {
        failInHole(part, error);
        continue;
      }
      if (!fitsParameter(part, *argument)) {
        continue;
      }
      if (bind(part, std::move(argument), stop)) {
        return true;
      }
    }
    return false;
  }

  bool fitsParameter(std::size_t part, const Expression &argument) {
    const auto parameter = static_cast<std::size_t>(parts_[part].parameter);
    if (parameter >= info_.parameterTypes.size()) {
      return true;
    }
    const std::uint16_t type = info_.parameterTypes[parameter];
    const bool wantsText = type == kStringParam;
    const bool wantsNumber = type == kNumberParam;
    if ((wantsText && argument.type != StaticType::Text) ||
        (wantsNumber && argument.type != StaticType::Number)) {
      const auto offset = static_cast<std::size_t>(argument.where.column - 1);
      fail({offset,
            std::string("expected ") + (wantsText ? "a text" : "a number") + ", not " +
                typeName(argument.type),
            true, parts_[part].parameter});
      return false;
    }
    return true;
  }

  bool bind(std::size_t part, ExpressionPtr argument, std::size_t stop) {
    const int parameter = parts_[part].parameter;
    ExpressionPtr *slot = nullptr;
    if (parameter >= 0 && static_cast<std::size_t>(parameter) < arguments_.size()) {
      slot = &arguments_[static_cast<std::size_t>(parameter)];
    }
    ExpressionPtr previous;
    if (slot != nullptr) {
      previous = std::exchange(*slot, std::move(argument));
    }
    if (matchFrom(part + 1, stop)) {
      return true;
    }
    if (slot != nullptr) {
      *slot = std::move(previous);
    }
    return false;
  }

  // Every place from `from` on where `text` stands outside a string literal.
  std::vector<std::size_t> placesOf(const std::string &text, std::size_t from) const {
    std::vector<std::size_t> places;
    bool inString = false;
    for (std::size_t i = from; i < end_; ++i) {
      if (line_[i] == '"') {
        inString = !inString; // a doubled quote toggles twice
        continue;
      }
      if (!inString && i > from && line_.substr(i, text.size()) == text &&
          i + text.size() <= end_) {
        places.push_back(i);
      }
    }
    return places;
  }

  static bool containsEnd(const std::vector<std::size_t> &ends, std::size_t stop) {
    for (const std::size_t end : ends) {
      if (end == stop) {
        return true;
      }
    }
    return false;
  }

  void failInHole(std::size_t part, const ParseError &error) {
    fail({static_cast<std::size_t>(error.where.column - 1), error.message, true,
          parts_[part].parameter});
  }

  void fail(Failure failure) {
    if (!failure_ || failure.furthest() > failure_->furthest()) {
      failure_ = std::move(failure);
    }
  }

  const ParseContext &context_;
  const RoutineInfo &info_;
  std::string_view form_;
  std::vector<TemplatePart> parts_;
  std::string_view line_;
  int lineNumber_;
  std::size_t end_;
  std::vector<ExpressionPtr> arguments_;
  std::optional<Failure> failure_;
  int readings_ = 0;
};

std::string holeName(int parameter) {
  return parameter == TemplatePart::kObject ? "%o" : "%" + std::to_string(parameter);
}

} // namespace

RoutineCall matchRoutine(const ParseContext &context, RoutineKind kind, std::string_view line,
                         int lineNumber, std::size_t begin, std::size_t end) {
  const std::vector<RoutineInfo> &routines = context.catalog->of(kind);
  std::optional<RoutineCall> found;
  std::string foundForm;
  std::optional<Failure> nearest;
  std::string nearestForm;
  for (const RoutineInfo &info : routines) {
    TemplateMatcher matcher(context, info, line, lineNumber, end);
    if (matcher.match(begin)) {
      if (found) {
        throw ParseError{{lineNumber, static_cast<int>(begin) + 1},
                         std::string("the line reads as more than one ") + kindName(kind) + ": " +
                             quoted(foundForm) + " and " + quoted(matcher.form())};
      }
      found = RoutineCall{-1, info.code, matcher.takeArguments()};
      foundForm = matcher.form();
    } else if (matcher.failure() &&
               (!nearest || matcher.failure()->furthest() > nearest->furthest())) {
      nearest = matcher.failure();
      nearestForm = matcher.form();
    }
  }
  if (found) {
    return std::move(*found);
  }
  if (!nearest || nearest->furthest() <= begin) {
    throw ParseError{{lineNumber, static_cast<int>(begin) + 1},
                     std::string("no ") + kindName(kind) +
                         " of the extension begins like this (\"morvex menus\" lists them)"};
  }
  const Location where{lineNumber, static_cast<int>(nearest->at) + 1};
  if (nearest->inHole) {
    throw ParseError{where, "in " + holeName(nearest->parameter) + " of " + quoted(nearestForm) +
                                ": " + nearest->why};
  }
  throw ParseError{where, std::string("no ") + kindName(kind) + " reads like this; the nearest, " +
                              quoted(nearestForm) + ", " + nearest->why};
}

} // namespace morvex::emulator
