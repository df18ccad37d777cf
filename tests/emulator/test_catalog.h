// A small catalog of routines in the extension's style, for parsing tests that run
// without loading the extension.
#ifndef MORVEX_TESTS_EMULATOR_TEST_CATALOG_H
#define MORVEX_TESTS_EMULATOR_TEST_CATALOG_H

#include "emulator/catalog.h"

#include <string>
#include <vector>

namespace morvex::tests {

using emulator::Catalog;
using emulator::RoutineInfo;
using emulator::RoutineKind;

inline RoutineInfo routine(RoutineKind kind, int code, std::string display,
                           std::vector<std::uint16_t> types, std::uint16_t flags = 0) {
  RoutineInfo info;
  info.kind = kind;
  info.code = code;
  info.display = std::move(display);
  info.flags = flags;
  info.parameterTypes = std::move(types);
  info.prompts.assign(info.parameterTypes.size(), "");
  return info;
}

inline Catalog testCatalog() {
  constexpr std::uint16_t S = emulator::kStringParam;
  constexpr std::uint16_t N = emulator::kNumberParam;
  constexpr std::uint16_t O = emulator::kObjectParam;
  constexpr std::uint16_t I = emulator::kIntegerArgument;
  constexpr std::uint16_t T = emulator::kStringArgument;
  Catalog catalog;
  catalog.conditions = {
      routine(RoutineKind::Condition, 0, "%o: On Function %0", {S}),
      routine(RoutineKind::Condition, 1, "%o: On Error", {}),
  };
  catalog.actions = {
      routine(RoutineKind::Action, 0,
              "Call Function %1 with Parameters %2 and with Return Type %3 for Instance %0 and "
              "Store Result in Slot %4",
              {S, S, S, N, N}),
      routine(RoutineKind::Action, 1, "Return from Current Function", {}),
      routine(RoutineKind::Action, 2, "Return from Current Function with Integer %0", {N}),
      routine(RoutineKind::Action, 3, "Set Global String %0 to %1", {S, S}),
      routine(RoutineKind::Action, 4, "Count all Selected %0", {O}),
      routine(RoutineKind::Action, 5, "Jump %0 to", {N}),
      routine(RoutineKind::Action, 6, "Jump %0 to ground", {N}),
  };
  catalog.expressions = {
      routine(RoutineKind::Expression, 0, "IntegerSlot(", {I}, emulator::kIntegerResult),
      routine(RoutineKind::Expression, 1, "StringSlot$(", {I}, emulator::kStringResult),
      routine(RoutineKind::Expression, 2, "GlobalFloat(", {T}, emulator::kFloatResult),
      routine(RoutineKind::Expression, 3, "GetReturnType(", {}, emulator::kIntegerResult),
      routine(RoutineKind::Expression, 4, "IntOfInstance(", {T, T}, emulator::kIntegerResult),
  };
  return catalog;
}

} // namespace morvex::tests

#endif
