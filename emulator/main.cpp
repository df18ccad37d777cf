// morvex: the host emulator. Loads the extension through its entry points and plays event
// sheets with it, or lists its menus.
#include "emulator/big_stack.h"
#include "emulator/command_line.h"
#include "emulator/extension.h"
#include "emulator/game.h"
#include "emulator/menus.h"
#include "emulator/sheet_parser.h"

#include <fstream>
#include <iostream>
#include <sstream>

namespace {

using namespace morvex::emulator;

constexpr int kBadInput = 2; // the sheet does not parse, or the command line is wrong

int play(const CommandLine &line) {
  std::ifstream file(line.sheet, std::ios::binary);
  if (!file) {
    std::cerr << line.sheet << ": error: cannot read the sheet\n";
    return kBadInput;
  }
  std::ostringstream text;
  text << file.rdbuf();
  std::unique_ptr<Extension> extension = Extension::load(locateExtension(line.library));
  Sheet sheet;
  try {
    sheet = parseSheet(text.str(), extension->catalog());
  } catch (const ParseError &error) {
    std::cerr << line.sheet << ':' << error.where.line << ':' << error.where.column
              << ": error: " << error.message << '\n';
    return kBadInput;
  }
  const std::optional<int> status = runOnBigStack(kGameStackSize, [&] {
    try {
      Game game(*extension, sheet, line.sheet, line.play, std::cout, std::cerr);
      return game.play();
    } catch (const std::exception &failure) {
      std::cerr << line.sheet << ": error: the emulator failed: " << failure.what() << '\n';
      return kStopped;
    }
  });
  if (!status) {
    std::cerr << "morvex: error: cannot start the game's thread\n";
    return kStopped;
  }
  return *status;
}

int run(const CommandLine &line) {
  switch (line.command) {
  case CommandLine::Command::Play:
    return play(line);
  case CommandLine::Command::Menus:
    printMenus(*Extension::load(locateExtension(line.library)), std::cout);
    return 0;
  case CommandLine::Command::Help:
    break;
  }
  std::cout << kUsage;
  return 0;
}

} // namespace

int main(int argc, char **argv) {
  std::ios::sync_with_stdio(false);
  const std::vector<std::string> arguments(argv + 1, argv + argc);
  std::string error;
  const std::optional<CommandLine> line = parseCommandLine(arguments, error);
  if (!line) {
    std::cerr << "morvex: error: " << error << '\n' << kUsage;
    return kBadInput;
  }
  try {
    return run(*line);
  } catch (const LoadError &failure) {
    std::cerr << "morvex: error: " << failure.what() << '\n';
    return kBadInput;
  } catch (const std::exception &failure) {
    std::cerr << "morvex: error: " << failure.what() << '\n';
    return kStopped;
  }
}
