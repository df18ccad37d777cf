// Parsing `morvex play FILE [options]` and `morvex menus [options]`.
#include "emulator/command_line.h"

#include <charconv>
#include <limits>

namespace morvex::emulator {

const char *const kUsage =
    "usage: morvex play FILE.events [--frames N] [--trace] [--max-depth N] [--max-steps N]\n"
    "                               [--library PATH]\n"
    "       morvex menus [--library PATH]\n"
    "The extension is --library, else $MORVEX_LIBRARY, else the library beside morvex.\n";

namespace {

// The largest --max-depth: far beyond what any sheet needs, and within what the game's
// stack is checked for.
constexpr std::int64_t kDepthCeiling = 1'000'000;

std::optional<std::int64_t> readCount(const std::string &text, std::int64_t largest) {
  std::int64_t value = 0;
  const char *end = text.data() + text.size();
  const auto result = std::from_chars(text.data(), end, value);
  if (result.ec != std::errc() || result.ptr != end || value < 0 || value > largest) {
    return std::nullopt;
  }
  return value;
}

} // namespace

std::optional<CommandLine> parseCommandLine(const std::vector<std::string> &arguments,
                                            std::string &error) {
  CommandLine line;
  if (arguments.empty()) {
    error = "no command given";
    return std::nullopt;
  }
  const std::string &command = arguments[0];
  if (command == "play") {
    line.command = CommandLine::Command::Play;
  } else if (command == "menus") {
    line.command = CommandLine::Command::Menus;
  } else if (command == "help" || command == "--help" || command == "-h") {
    line.command = CommandLine::Command::Help;
    return line;
  } else {
    error = "unknown command \"" + command + "\"";
    return std::nullopt;
  }
  const bool playing = line.command == CommandLine::Command::Play;
  for (std::size_t i = 1; i < arguments.size(); ++i) {
    const std::string &argument = arguments[i];
    const auto value = [&]() -> std::optional<std::string> {
      if (i + 1 >= arguments.size()) {
        error = argument + " needs a value";
        return std::nullopt;
      }
      return arguments[++i];
    };
    const auto count = [&](std::int64_t largest, std::int64_t &into) {
      const std::optional<std::string> text = value();
      if (!text) {
        return false;
      }
      const std::optional<std::int64_t> number = readCount(*text, largest);
      if (!number) {
        error = argument + " takes a whole number" +
                (largest < kDepthCeiling * 1000 ? " from 0 to " + std::to_string(largest) : "") +
                ", not \"" + *text + "\"";
        return false;
      }
      into = *number;
      return true;
    };
    if (argument == "--library") {
      const std::optional<std::string> path = value();
      if (!path) {
        return std::nullopt;
      }
      line.library = *path;
    } else if (playing && argument == "--trace") {
      line.play.trace = true;
    } else if (playing && argument == "--frames") {
      if (!count(std::numeric_limits<std::int64_t>::max(), line.play.frames)) {
        return std::nullopt;
      }
    } else if (playing && argument == "--max-depth") {
      if (!count(kDepthCeiling, line.play.maxDepth)) {
        return std::nullopt;
      }
    } else if (playing && argument == "--max-steps") {
      if (!count(std::numeric_limits<std::int64_t>::max() - 1, line.play.maxSteps)) {
        return std::nullopt;
      }
    } else if (playing && line.sheet.empty() && !argument.empty() && argument[0] != '-') {
      line.sheet = argument;
    } else {
      error = "unexpected argument \"" + argument + "\"";
      return std::nullopt;
    }
  }
  if (playing && line.sheet.empty()) {
    error = "play needs a sheet to play";
    return std::nullopt;
  }
  return line;
}

} // namespace morvex::emulator
