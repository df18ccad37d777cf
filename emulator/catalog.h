// What the extension tells the host about its routines: for each condition, action and
// expression its display template, parameter types, prompts and result type. Read from
// the extension's entry points by extension.cpp; the sheet parser and the menus use it.
#ifndef MORVEX_EMULATOR_CATALOG_H
#define MORVEX_EMULATOR_CATALOG_H

#include "host/contract.h"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace morvex::emulator {

enum class RoutineKind { Condition, Action, Expression };

// Parameter and result types of the extension's records.
using host::eventinfo::kFloatResult;
using host::eventinfo::kIntegerArgument;
using host::eventinfo::kIntegerResult;
using host::eventinfo::kNumberParam;
using host::eventinfo::kObjectParam;
using host::eventinfo::kStringArgument;
using host::eventinfo::kStringParam;
using host::eventinfo::kStringResult;

struct RoutineInfo {
  RoutineKind kind = RoutineKind::Action;
  int code = 0;
  std::string display;                       // the template: "%o: On Function %0", "LocalInt("
  std::uint16_t flags = 0;                   // expressions: the result type
  std::vector<std::uint16_t> parameterTypes; // in parameter order
  std::vector<std::string> prompts;          // one per parameter; "" for none
};

struct Catalog {
  std::vector<RoutineInfo> conditions; // by code
  std::vector<RoutineInfo> actions;
  std::vector<RoutineInfo> expressions;

  const std::vector<RoutineInfo> &of(RoutineKind kind) const;
  // The expression whose display name (with its "(") is `name`; null when there is none.
  // The record belongs to this catalog and lives as long as it does.
  const RoutineInfo *findExpression(const std::string &name) const;
};

const char *kindName(RoutineKind kind); // "condition", "action", "expression"

} // namespace morvex::emulator

#endif
