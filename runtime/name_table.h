// Positions of names in a RunObject's declared function and member tables.
#ifndef MORVEX_RUNTIME_NAME_TABLE_H
#define MORVEX_RUNTIME_NAME_TABLE_H

#include "runtime/run_object.h"

#include <cstdint>

namespace morvex::runtime {

// The index (0 to count - 1) of the first entry equal to the lower-cased `name`, or -1; a
// missing name is never found. Entries are compared as stored.
std::int32_t lookupNameIndex(const NameEntry *table, std::int32_t count, const char *name);

} // namespace morvex::runtime

#endif
