// Places in a sheet and the error the parser reports at one.
#ifndef MORVEX_EMULATOR_SOURCE_H
#define MORVEX_EMULATOR_SOURCE_H

#include <string>

namespace morvex::emulator {

// A place in the sheet: line and column, both counted from 1 (columns in bytes).
struct Location {
  int line = 0;
  int column = 0;
};

// Why a sheet does not parse, and where. Thrown by the parsers; never leaves them
// except through parseSheet's caller.
struct ParseError {
  Location where;
  std::string message;
};

} // namespace morvex::emulator

#endif
