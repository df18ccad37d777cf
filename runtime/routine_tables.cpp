// The routine tables: every routine of routines.h, in code order, behind an adapter that
// gives it the host's calling convention and finds the RunObject behind the host's header.
#include "runtime/routine_tables.h"

#include "runtime/routines.h"

#include <array>

namespace morvex::runtime {
namespace {

// The adapters are where the host calls in: nothing a routine throws (only running out of
// memory can) crosses into the host. The routine's frames have been put back by then; the
// host sees a condition that does not hold, an action done, an expression giving 0.
template <class Work>
HostWord answerGuarded(Work &&work) noexcept {
  try {
    return work();
  } catch (...) {
    return 0;
  }
}

template <bool (*Routine)(RunObject &, HostWord, HostWord)>
HostWord MORVEX_CALL condition(host::ObjectHeader *object, HostWord first, HostWord second) {
  return answerGuarded(
      [&]() -> HostWord { return Routine(runObjectOf(object), first, second) ? 1 : 0; });
}

template <void (*Routine)(RunObject &, HostWord, HostWord)>
HostWord MORVEX_CALL action(host::ObjectHeader *object, HostWord first, HostWord second) {
  return answerGuarded([&]() -> HostWord {
    Routine(runObjectOf(object), first, second);
    return 0;
  });
}

template <HostWord (*Routine)(RunObject &, HostWord)>
HostWord MORVEX_CALL expression(host::ObjectHeader *object, HostWord cookie) {
  return answerGuarded([&]() -> HostWord { return Routine(runObjectOf(object), cookie); });
}

// A table of the given routines behind their adapters, and the null entry after them.
// Every entry but the last is an adapter's address, so only the count needs checking.
template <bool (*...Routines)(RunObject &, HostWord, HostWord)>
constexpr std::array<host::ConditionRoutine, sizeof...(Routines) + 1> conditions() {
  return {condition<Routines>..., nullptr};
}
template <void (*...Routines)(RunObject &, HostWord, HostWord)>
constexpr std::array<host::ActionRoutine, sizeof...(Routines) + 1> actions() {
  return {action<Routines>..., nullptr};
}
template <HostWord (*...Routines)(RunObject &, HostWord)>
constexpr std::array<host::ExpressionRoutine, sizeof...(Routines) + 1> expressions() {
  return {expression<Routines>..., nullptr};
}

constexpr auto kConditions = conditions<onFunction, // 0 On Function
                                        alwaysTrue, // 1 On Error
                                        alwaysTrue, // 2 On Creation of an Instance
                                        alwaysTrue  // 3 On Destruction of an Instance
                                        >();

constexpr auto kActions = actions<callFunctionForInstance,  // 0
                                  setMemberInteger,         // 1
                                  setMemberFloat,           // 2
                                  setMemberString,          // 3
                                  callFunctionForCurrent,   // 4
                                  setCurrentMemberInteger,  // 5
                                  setCurrentMemberFloat,    // 6
                                  setCurrentMemberString,   // 7
                                  createInstance,           // 8
                                  destroyInstance,          // 9
                                  returnVoid,               // 10
                                  returnInteger,            // 11
                                  returnFloat,              // 12
                                  returnString,             // 13
                                  createGlobalVariable,     // 14
                                  setGlobalInteger,         // 15
                                  setGlobalFloat,           // 16
                                  setGlobalString,          // 17
                                  createLocalVariable,      // 18
                                  setLocalInteger,          // 19
                                  setLocalFloat,            // 20
                                  setLocalString,           // 21
                                  clearExpressionErrorCode, // 22
                                  loopCurrentFunction,      // 23
                                  setDefaultInstance,       // 24
                                  generateError,            // 25
                                  destroyAllInstances,      // 26
                                  countAllSelected          // 27
                                  >();

constexpr auto kExpressions = expressions<integerSlot,          // 0
                                          floatSlot,            // 1
                                          stringSlot,           // 2
                                          intOfInstance,        // 3
                                          floatOfInstance,      // 4
                                          stringOfInstance,     // 5
                                          intOfCurrInstance,    // 6
                                          floatOfCurrInstance,  // 7
                                          stringOfCurrInstance, // 8
                                          globalInt,            // 9
                                          globalFloat,          // 10
                                          globalString,         // 11
                                          localInt,             // 12
                                          localFloat,           // 13
                                          localString,          // 14
                                          functionLoopNumber,   // 15
                                          currentError,         // 16
                                          formatString,         // 17
                                          unformatString,       // 18
                                          getInstanceName,      // 19
                                          getReturnType,        // 20
                                          expressionError,      // 21
                                          numberOfParameters,   // 22
                                          objectVersion,        // 23
                                          countSelected         // 24
                                          >();

static_assert(kConditions.size() == kConditionTableSize);
static_assert(kActions.size() == kActionTableSize);
static_assert(kExpressions.size() == kExpressionTableSize);

} // namespace

std::span<const host::ConditionRoutine, kConditionTableSize> conditionTable() {
  return kConditions;
}

std::span<const host::ActionRoutine, kActionTableSize> actionTable() {
  return kActions;
}

std::span<const host::ExpressionRoutine, kExpressionTableSize> expressionTable() {
  return kExpressions;
}

} // namespace morvex::runtime
