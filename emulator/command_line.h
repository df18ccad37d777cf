// The command line of `morvex`.
#ifndef MORVEX_EMULATOR_COMMAND_LINE_H
#define MORVEX_EMULATOR_COMMAND_LINE_H

#include "emulator/game.h"

#include <optional>
#include <string>
#include <vector>

namespace morvex::emulator {

struct CommandLine {
  enum class Command { Play, Menus, Help };

  Command command = Command::Help;
  std::string sheet;   // play: the .events file
  std::string library; // --library PATH; empty: look for it
  PlayOptions play;
};

// Reads the arguments after the program's name. Nothing, with `error` set, when they are
// wrong.
std::optional<CommandLine> parseCommandLine(const std::vector<std::string> &arguments,
                                            std::string &error);

extern const char *const kUsage;

} // namespace morvex::emulator

#endif
