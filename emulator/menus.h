// The `morvex menus` command: the three menus as the host's event editor offers them,
// each item with its code, display template and parameter prompts, then the routines no
// menu offers.
#ifndef MORVEX_EMULATOR_MENUS_H
#define MORVEX_EMULATOR_MENUS_H

#include "emulator/extension.h"

#include <ostream>

namespace morvex::emulator {

// Writes the reference to `out`. Answers the number of routines listed.
int printMenus(Extension &extension, std::ostream &out);

} // namespace morvex::emulator

#endif
