// Look-ups in the routine catalog.
#include "emulator/catalog.h"

namespace morvex::emulator {

const std::vector<RoutineInfo> &Catalog::of(RoutineKind kind) const {
  switch (kind) {
  case RoutineKind::Condition:
    return conditions;
  case RoutineKind::Action:
    return actions;
  case RoutineKind::Expression:
    break;
  }
  return expressions;
}

const RoutineInfo *Catalog::findExpression(const std::string &name) const {
  for (const RoutineInfo &info : expressions) {
    if (info.display == name) {
      return &info;
    }
  }
  return nullptr;
}

const char *kindName(RoutineKind kind) {
  switch (kind) {
  case RoutineKind::Condition:
    return "condition";
  case RoutineKind::Action:
    return "action";
  case RoutineKind::Expression:
    break;
  }
  return "expression";
}

} // namespace morvex::emulator
