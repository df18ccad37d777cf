// Raising errors, and the routines that let events raise and read them.
#include "runtime/errors.h"

#include "runtime/host_services.h"
#include "runtime/routines.h"

namespace morvex::runtime {

void raiseError(RunObject &object, std::int32_t code, std::uint32_t fromExpression) {
  if ((fromExpression & 0xFF) != 0) {
    object.expressionErrorCode = code;
    return;
  }
  object.errorCode = code;
  generateEvent(object, host::kOnError);
  object.errorCode = 0;
}

void clearExpressionErrorCode(RunObject &object, HostWord, HostWord) {
  object.expressionErrorCode = 0;
}

void generateError(RunObject &object, HostWord code, HostWord) {
  raiseActionError(object, static_cast<std::int32_t>(code));
}

HostWord currentError(RunObject &object, HostWord) { return object.errorCode; }

HostWord expressionError(RunObject &object, HostWord) { return object.expressionErrorCode; }

} // namespace morvex::runtime
