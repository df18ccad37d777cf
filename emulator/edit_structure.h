// Builds an object's edit structure as the host's editor stores it in the game file after
// the author closed the setup dialog with OK.
#ifndef MORVEX_EMULATOR_EDIT_STRUCTURE_H
#define MORVEX_EMULATOR_EDIT_STRUCTURE_H

#include "emulator/sheet.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace morvex::emulator {

// A name as the setup dialog's edit field keeps it: at most 25 characters, A-Z lower-cased.
std::string storedName(std::string_view typed);

// The order of a sorted list box: letter case ignored, other signs before digits before
// letters before bytes above 127. True when `a` sorts before `b`.
bool listBoxBefore(std::string_view a, std::string_view b);

// The names of one list as the dialog writes them back: stored and sorted.
std::vector<std::string> storedList(const std::vector<std::string> &typed);

// The whole block: version 2, the creation defaults, both options, the counts, the names
// and the size field. The block has room for 500 + 500 names, as a host must give the
// setup dialog.
std::vector<std::uint8_t> buildEditStructure(const ObjectSetup &object);

} // namespace morvex::emulator

#endif
