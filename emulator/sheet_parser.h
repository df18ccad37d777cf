// Reads the text of an event sheet (.events) into a Sheet.
#ifndef MORVEX_EMULATOR_SHEET_PARSER_H
#define MORVEX_EMULATOR_SHEET_PARSER_H

#include "emulator/catalog.h"
#include "emulator/sheet.h"

#include <string_view>

namespace morvex::emulator {

// Parses a whole sheet; extension lines are read through the catalog's templates.
// Throws ParseError at the first line that does not parse.
Sheet parseSheet(std::string_view text, const Catalog &catalog);

} // namespace morvex::emulator

#endif
