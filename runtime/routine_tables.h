// The three routine tables through which the host calls conditions, actions and
// expressions by code, in the host's calling convention.
#ifndef MORVEX_RUNTIME_ROUTINE_TABLES_H
#define MORVEX_RUNTIME_ROUTINE_TABLES_H

#include "host/contract.h"

#include <cstddef>
#include <span>

namespace morvex::runtime {

inline constexpr std::size_t kConditionTableSize = host::kConditionCount + 1u;
inline constexpr std::size_t kActionTableSize = host::kActionCount + 1u;
inline constexpr std::size_t kExpressionTableSize = host::kExpressionCount + 1u;

// Each table holds its routines in code order, then one null entry. The tables are static
// data of the module: unchanged, and valid as long as the module is loaded. Each routine
// takes the object's header, which must start a RunObject.
std::span<const host::ConditionRoutine, kConditionTableSize> conditionTable();
std::span<const host::ActionRoutine, kActionTableSize> actionTable();
std::span<const host::ExpressionRoutine, kExpressionTableSize> expressionTable();

} // namespace morvex::runtime

#endif
