// Global and local variables: one part of a named variable, written or read.
#ifndef MORVEX_RUNTIME_VARIABLES_H
#define MORVEX_RUNTIME_VARIABLES_H

#include "host/contract.h"
#include "runtime/run_object.h"

#include <cstdint>

namespace morvex::runtime {

// Value types: which part of a Value a set or get works on.
inline constexpr std::int32_t kIntegerPart = 1;
inline constexpr std::int32_t kFloatPart = 2;
inline constexpr std::int32_t kStringPart = 3;

// Writes one part of the existing variable `name` of `list`: an integer, a float's bit
// pattern or a text (missing stored as ""). Raises error 3 when there is no such variable.
void setVariable(RunObject &object, VariableList &list, const char *name, host::HostWord value,
                 std::int32_t valueType);

// Reads one part: the integer, the float's bit pattern or the variable's own text (valid
// until the variable's text is set again or the variable is destroyed). Raises expression
// error 3 and gives 0 or "" when there is no such variable.
host::HostWord getVariable(RunObject &object, VariableList &list, const char *name,
                           std::int32_t valueType);

} // namespace morvex::runtime

#endif
