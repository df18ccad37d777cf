// The statements of a sheet: "object NAME" with its setting lines, conditions ("*") and
// actions ("->"). Comments start with "#" outside string literals.
#include "emulator/sheet_parser.h"

#include "emulator/expression_parser.h"

#include <optional>
#include <string>
#include <utility>

namespace morvex::emulator {

namespace {

constexpr std::size_t kMaxNamesPerList = 500;
constexpr std::string_view kObjectWord = "object";
constexpr std::string_view kCompareWord = "Compare";
constexpr std::string_view kDisplayWord = "Display";

bool isNamePart(char c) {
  return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z') || (c >= '0' && c <= '9') || c == '_';
}
bool isBlank(char c) {
  return c == ' ' || c == '\t';
}

std::string quoted(std::string_view text) {
  return "\"" + std::string(text) + "\"";
}

// One line of the sheet with its comment cut off and its trailing blanks removed.
struct SourceLine {
  int number = 0;
  std::string_view text;
  std::size_t start = 0; // the first non-blank character

  Location at(std::size_t offset) const { return {number, static_cast<int>(offset) + 1}; }
  bool startsWith(std::string_view word, std::size_t from) const {
    return text.substr(from, word.size()) == word;
  }
  std::size_t skipBlanks(std::size_t from) const {
    while (from < text.size() && isBlank(text[from])) {
      ++from;
    }
    return from;
  }
};

std::string_view withoutComment(std::string_view text) {
  bool inString = false;
  for (std::size_t i = 0; i < text.size(); ++i) {
    if (text[i] == '"') {
      inString = !inString;
    } else if (text[i] == '#' && !inString) {
      return text.substr(0, i);
    }
  }
  return text;
}

std::vector<SourceLine> splitLines(std::string_view text) {
  std::vector<SourceLine> lines;
  int number = 0;
  while (!text.empty() || number == 0) {
    const std::size_t newline = text.find('\n');
    std::string_view raw = text.substr(0, newline);
    text = newline == std::string_view::npos ? std::string_view() : text.substr(newline + 1);
    ++number;
    if (!raw.empty() && raw.back() == '\r') {
      raw.remove_suffix(1);
    }
    SourceLine line{number, withoutComment(raw), 0};
    while (!line.text.empty() && isBlank(line.text.back())) {
      line.text.remove_suffix(1);
    }
    line.start = line.skipBlanks(0);
    lines.push_back(line);
    if (newline == std::string_view::npos) {
      break;
    }
  }
  return lines;
}

// Whether the line starts with the word "object".
bool isObjectLine(const SourceLine &line) {
  const std::size_t after = line.start + kObjectWord.size();
  return line.startsWith(kObjectWord, line.start) &&
         (after == line.text.size() || isBlank(line.text[after]));
}

std::size_t nameEnd(const SourceLine &line, std::size_t from) {
  while (from < line.text.size() && isNamePart(line.text[from])) {
    ++from;
  }
  return from;
}

class SheetParser {
public:
  SheetParser(std::string_view text, const Catalog &catalog)
      : lines_(splitLines(text)), context_{&catalog, &objectNames_} {}

  Sheet parse() {
    collectObjectNames();
    for (const SourceLine &line : lines_) {
      if (line.start < line.text.size()) {
        parseStatement(line);
      }
    }
    return std::move(sheet_);
  }

private:
  // Objects may be named before the line that declares them.
  void collectObjectNames() {
    for (const SourceLine &line : lines_) {
      if (isObjectLine(line)) {
        const std::size_t begin = line.skipBlanks(line.start + kObjectWord.size());
        const std::size_t end = nameEnd(line, begin);
        if (end > begin && end == line.text.size()) {
          objectNames_.emplace_back(line.text.substr(begin, end - begin));
        }
      }
    }
  }

  void parseStatement(const SourceLine &line) {
    const std::size_t start = line.start;
    if (line.text[start] == '*') {
      parseCondition(line, line.skipBlanks(start + 1));
    } else if (line.startsWith("->", start)) {
      parseAction(line, line.skipBlanks(start + 2));
    } else if (isObjectLine(line)) {
      parseObject(line);
    } else if (const std::optional<Setting> setting = settingAt(line)) {
      parseSetting(line, *setting);
    } else {
      throw ParseError{line.at(start), "expected a condition (\"*\"), an action (\"->\"), "
                                       "\"object NAME\" or an object's setting"};
    }
  }

  void parseObject(const SourceLine &line) {
    const std::size_t begin = line.skipBlanks(line.start + kObjectWord.size());
    const std::size_t end = nameEnd(line, begin);
    if (begin == line.text.size()) {
      throw ParseError{line.at(begin), "expected the object's name"};
    }
    if (end == begin || end != line.text.size()) {
      throw ParseError{line.at(end), "an object's name is made of letters, digits and \"_\""};
    }
    const std::string name(line.text.substr(begin, end - begin));
    for (const ObjectSetup &object : sheet_.objects) {
      if (object.name == name) {
        throw ParseError{line.at(begin), "object " + quoted(name) +
                                             " is already declared on line " +
                                             std::to_string(object.where.line)};
      }
    }
    sheet_.objects.push_back({name, line.at(begin), {}, {}, false, false});
    settingsOpen_ = true;
    seenSettings_.clear();
    event_ = nullptr;
  }

  enum class Setting { Functions, Members, Verify, Loop };

  static std::optional<Setting> settingAt(const SourceLine &line) {
    static constexpr std::pair<std::string_view, Setting> kSettings[] = {
        {"functions:", Setting::Functions},
        {"members:", Setting::Members},
        {"verify:", Setting::Verify},
        {"loop:", Setting::Loop},
    };
    for (const auto &[word, setting] : kSettings) {
      if (line.startsWith(word, line.start)) {
        return setting;
      }
    }
    return std::nullopt;
  }

  void parseSetting(const SourceLine &line, Setting setting) {
    const std::size_t colon = line.text.find(':', line.start);
    const std::string_view word = line.text.substr(line.start, colon - line.start);
    if (!settingsOpen_) {
      throw ParseError{line.at(line.start),
                       quoted(word) + " belongs right after its \"object\" line"};
    }
    for (const Setting seen : seenSettings_) {
      if (seen == setting) {
        throw ParseError{line.at(line.start), quoted(word) + " is given twice for object " +
                                                  quoted(sheet_.objects.back().name)};
      }
    }
    seenSettings_.push_back(setting);
    ObjectSetup &object = sheet_.objects.back();
    const std::size_t begin = line.skipBlanks(colon + 1);
    switch (setting) {
    case Setting::Functions:
      object.functions = parseNames(line, begin, "functions");
      break;
    case Setting::Members:
      object.members = parseNames(line, begin, "members");
      break;
    case Setting::Verify:
      object.verify = parseSwitch(line, begin);
      break;
    case Setting::Loop:
      object.loop = parseSwitch(line, begin);
      break;
    }
  }

  static bool parseSwitch(const SourceLine &line, std::size_t begin) {
    const std::string_view value = line.text.substr(begin);
    if (value == "on" || value == "off") {
      return value == "on";
    }
    throw ParseError{line.at(begin), "expected \"on\" or \"off\""};
  }

  // Names separated by commas; the blanks around each name are not part of it.
  static std::vector<std::string> parseNames(const SourceLine &line, std::size_t begin,
                                             const char *what) {
    std::vector<std::string> names;
    if (begin == line.text.size()) {
      return names;
    }
    std::size_t from = begin;
    for (;;) {
      const std::size_t comma = std::min(line.text.find(',', from), line.text.size());
      std::size_t first = line.skipBlanks(from);
      std::size_t last = comma;
      while (last > first && isBlank(line.text[last - 1])) {
        --last;
      }
      if (last == first) {
        throw ParseError{line.at(first), "empty name in the list of " + std::string(what)};
      }
      names.emplace_back(line.text.substr(first, last - first));
      if (names.size() > kMaxNamesPerList) {
        throw ParseError{line.at(first), "at most 500 " + std::string(what) + " per object"};
      }
      if (comma == line.text.size()) {
        return names;
      }
      from = comma + 1;
    }
  }

  void parseCondition(const SourceLine &line, std::size_t begin) {
    settingsOpen_ = false;
    if (event_ == nullptr || !event_->actions.empty()) {
      sheet_.events.emplace_back();
      event_ = &sheet_.events.back();
      event_->where = line.at(line.start);
    }
    Condition condition;
    condition.where = line.at(begin);
    if (const std::optional<int> object = extensionPrefix(line, begin)) {
      if (!event_->conditions.empty()) {
        throw ParseError{line.at(begin),
                         "an extension condition may only stand first in its event line"};
      }
      condition.kind = Condition::Kind::Extension;
      condition.call = matchAfterPrefix(line, begin, *object, RoutineKind::Condition);
    } else if (line.text.substr(begin) == "Start of Frame") {
      condition.kind = Condition::Kind::StartOfFrame;
    } else if (line.text.substr(begin) == "Always") {
      condition.kind = Condition::Kind::Always;
    } else if (keywordAt(line, begin, kCompareWord)) {
      condition.kind = Condition::Kind::Compare;
      parseCompare(line, begin + kCompareWord.size(), condition);
    } else {
      throw ParseError{line.at(begin), "unknown condition; the host's are \"Start of Frame\", "
                                       "\"Always\" and \"Compare A OP B\", and the extension's "
                                       "are written \"OBJECT: ...\""};
    }
    event_->conditions.push_back(std::move(condition));
  }

  void parseCompare(const SourceLine &line, std::size_t begin, Condition &condition) {
    std::size_t stop = begin;
    condition.left =
        parseExpressionPrefix(context_, line.text, line.number, begin, line.text.size(), stop);
    const std::size_t opAt = line.skipBlanks(stop);
    static constexpr std::pair<std::string_view, CompareOp> kOperators[] = {
        {"<=", CompareOp::LessEqual}, {">=", CompareOp::GreaterEqual}, {"<>", CompareOp::NotEqual},
        {"=", CompareOp::Equal},      {"<", CompareOp::Less},          {">", CompareOp::Greater},
    };
    std::size_t opSize = 0;
    for (const auto &[symbol, op] : kOperators) {
      if (line.startsWith(symbol, opAt)) {
        condition.op = op;
        opSize = symbol.size();
        break;
      }
    }
    if (opSize == 0) {
      throw ParseError{line.at(opAt), "expected a comparison: =, <>, <, <=, > or >="};
    }
    condition.right =
        parseExpression(context_, line.text, line.number, opAt + opSize, line.text.size());
    if (condition.left->type != condition.right->type) {
      throw ParseError{line.at(opAt), "\"Compare\" compares two numbers or two texts, not " +
                                          std::string(typeName(condition.left->type)) + " and " +
                                          typeName(condition.right->type)};
    }
  }

  void parseAction(const SourceLine &line, std::size_t begin) {
    if (event_ == nullptr) {
      throw ParseError{line.at(line.start), "an action needs the conditions (\"*\") of its event "
                                            "line before it"};
    }
    Action action;
    action.where = line.at(begin);
    if (const std::optional<int> object = extensionPrefix(line, begin)) {
      action.kind = Action::Kind::Extension;
      action.call = matchAfterPrefix(line, begin, *object, RoutineKind::Action);
    } else if (line.text.substr(begin) == "End the Application") {
      action.kind = Action::Kind::EndApplication;
    } else if (keywordAt(line, begin, kDisplayWord)) {
      action.kind = Action::Kind::Display;
      action.value = parseExpression(context_, line.text, line.number, begin + kDisplayWord.size(),
                                     line.text.size());
    } else {
      throw ParseError{line.at(begin), "unknown action; the host's are \"Display EXPRESSION\" and "
                                       "\"End the Application\", and the extension's are written "
                                       "\"OBJECT: ...\""};
    }
    event_->actions.push_back(std::move(action));
  }

  static bool keywordAt(const SourceLine &line, std::size_t begin, std::string_view word) {
    const std::size_t after = begin + word.size();
    return line.startsWith(word, begin) && (after == line.text.size() || isBlank(line.text[after]));
  }

  // The object of an "OBJECT: ..." line; nothing when the line does not start so.
  std::optional<int> extensionPrefix(const SourceLine &line, std::size_t begin) const {
    const std::size_t end = nameEnd(line, begin);
    if (end == begin || end >= line.text.size() || line.text[end] != ':') {
      return std::nullopt;
    }
    const std::string_view name = line.text.substr(begin, end - begin);
    const int object = context_.findObject(name);
    if (object < 0) {
      throw ParseError{line.at(begin), "no object named " + quoted(name)};
    }
    return object;
  }

  RoutineCall matchAfterPrefix(const SourceLine &line, std::size_t begin, int object,
                               RoutineKind kind) const {
    const std::size_t colon = nameEnd(line, begin);
    const std::size_t rest = line.skipBlanks(colon + 1);
    RoutineCall call = matchRoutine(context_, kind, line.text, line.number, rest, line.text.size());
    call.object = object;
    return call;
  }

  std::vector<SourceLine> lines_;
  std::vector<std::string> objectNames_;
  ParseContext context_;
  Sheet sheet_;
  EventLine *event_ = nullptr; // the event line being read; points into sheet_.events
  bool settingsOpen_ = false;  // setting lines may follow
  std::vector<Setting> seenSettings_;
};

} // namespace

Sheet parseSheet(std::string_view text, const Catalog &catalog) {
  return SheetParser(text, catalog).parse();
}

} // namespace morvex::emulator
