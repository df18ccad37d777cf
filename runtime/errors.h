// Numbered errors: action-side errors run "On Error" at once, expression-side ones are
// recorded for "ExpressionError(".
#ifndef MORVEX_RUNTIME_ERRORS_H
#define MORVEX_RUNTIME_ERRORS_H

#include "runtime/run_object.h"

#include <cstdint>

namespace morvex::runtime {

// The extension's own error codes.
enum ErrorCode : std::int32_t {
  kNoSuchInstance = 1,
  kUndeclaredFunction = 2,
  kNoSuchVariable = 3, // also an undeclared member
  kAlreadyReturnedCall = 4,
  kInstanceBusy = 5,
  kInstanceExists = 6,
  kVariableExists = 7,
  kBadSlot = 8,
  kNoFunctionRunning = 9,
  kAlreadyReturned = 10,
  kNoReturn = 11,
  kAlreadyReturnedLoop = 12,
  kEmptyInstanceName = 13,
  kNoCurrentInstance = 14,
  kBadObjectNumber = 15,
};

// Raises `code`. From an expression (low 8 bits of `fromExpression` not 0) it only records
// the code; otherwise the object's "On Error" lines run before this returns, with `code` in
// errorCode, which is 0 again afterwards.
void raiseError(RunObject &object, std::int32_t code, std::uint32_t fromExpression);

inline void raiseActionError(RunObject &object, std::int32_t code) { raiseError(object, code, 0); }
inline void raiseExpressionError(RunObject &object, std::int32_t code) {
  raiseError(object, code, 1);
}

} // namespace morvex::runtime

#endif
