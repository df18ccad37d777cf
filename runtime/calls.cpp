// Function calls: the call frame, the body loop, return actions, slots and conditions.
#include "runtime/call_frame.h"
#include "runtime/errors.h"
#include "runtime/host_services.h"
#include "runtime/instances.h"
#include "runtime/name_table.h"
#include "runtime/number_text.h"
#include "runtime/parameters.h"
#include "runtime/routines.h"

#include <cstdint>

namespace morvex::runtime {
namespace {

// Who a call is for: the running call's instance, or an instance by name.
struct CallTarget {
  bool current = false;
  const char *instanceName = nullptr; // "" or missing: the default instance
};

// Runs the body until it returns or no further run is wanted. loopNumber counts the
// completed runs; it wraps rather than overflows in an endless loop.
void runBody(RunObject &object) {
  while (object.functionReturned != 1 &&
         (object.loopUntilReturn != 0 || object.loopRequested != 0)) {
    object.loopRequested = 0;
    generateEvent(object, host::kOnFunction);
    object.loopNumber =
        static_cast<std::int32_t>(static_cast<std::uint32_t>(object.loopNumber) + 1u);
  }
}

// Calls `functionName` for the target instance: refuses with error 4, 1 or 2 before
// anything changes; otherwise runs the body in the callee's frame, raises error 11 there
// when the body never returned, and restores the caller's frame on the way out.
void callFunction(RunObject &object, const CallTarget &target, const char *functionName,
                  const char *parameters, std::int32_t returnType) {
  if (object.functionReturned == 1) {
    raiseActionError(object, kAlreadyReturnedCall);
    return;
  }
  InstanceRecord *instance =
      target.current ? object.currentInstance : resolveInstance(object, target.instanceName);
  if (instance == object.noInstance()) {
    raiseActionError(object, kNoSuchInstance);
    return;
  }
  if (object.verifyFunctionNames != 0 &&
      lookupNameIndex(object.functionNames.data(), object.functionCount, functionName) < 0) {
    raiseActionError(object, kUndeclaredFunction);
    return;
  }
  const CallFrame frame(object, *instance, functionName, returnType);
  object.parameterCount = bindParameters(parameters, *object.localVariables);
  runBody(object);
  if (object.functionReturned == 0) {
    raiseActionError(object, kNoReturn);
  }
}

bool validSlot(std::int32_t slot) {
  return slot >= 0 && slot < kSlotCount;
}

// Copies the part of returnValue that `returnType` names into `slot` (already checked).
void storeResult(RunObject &object, std::int32_t returnType, std::int32_t slot) {
  const auto index = static_cast<std::size_t>(slot);
  switch (returnType) {
  case kReturnInteger:
    object.slotIntegers[index] = object.returnValue.intValue;
    break;
  case kReturnFloat:
    object.slotFloats[index] = object.returnValue.floatValue;
    break;
  case kReturnString:
    object.slotStrings[index] = object.returnValue.stringValue;
    break;
  default:
    break;
  }
}

// The rest of a call action, once its target is known: the slot check, the call, the
// slot write (also after a refused call).
void callAndStore(RunObject &object, const CallTarget &target) {
  const char *functionName = fetchActionText(object);
  const char *parameters = fetchActionText(object);
  const std::int32_t returnType = fetchActionInteger(object);
  const std::int32_t slot = fetchActionInteger(object);
  if (returnType != kReturnVoid && !validSlot(slot)) {
    raiseActionError(object, kBadSlot);
    return;
  }
  callFunction(object, target, functionName, parameters, returnType);
  storeResult(object, returnType, slot);
}

// Whether a return action may store its value: raises 10, then 9, when it may not.
bool mayReturn(RunObject &object) {
  if (object.functionReturned == 1) {
    raiseActionError(object, kAlreadyReturned);
    return false;
  }
  if (object.returnType == kNoFunction) {
    raiseActionError(object, kNoFunctionRunning);
    return false;
  }
  return true;
}

// The running function has returned: later lines of its body no longer match.
void markReturned(RunObject &object) {
  object.functionReturned = 1;
  object.currentFunctionName.reset();
}

} // namespace

bool onFunction(RunObject &object, HostWord name, HostWord) {
  const auto *text = reinterpret_cast<const char *>(name);
  return object.currentFunctionName && text &&
         equalIgnoringCase(object.currentFunctionName->c_str(), text);
}

bool alwaysTrue(RunObject &, HostWord, HostWord) {
  return true;
}

void callFunctionForInstance(RunObject &object, HostWord, HostWord) {
  CallTarget target;
  target.instanceName = fetchActionText(object);
  callAndStore(object, target);
}

void callFunctionForCurrent(RunObject &object, HostWord, HostWord) {
  CallTarget target;
  target.current = true;
  callAndStore(object, target);
}

void returnVoid(RunObject &object, HostWord, HostWord) {
  if (!mayReturn(object)) {
    return;
  }
  Value &result = object.returnValue;
  switch (object.returnType) {
  case kReturnInteger:
    result.intValue = 0;
    break;
  case kReturnFloat:
    result.floatValue = 0.0f;
    break;
  case kReturnString:
    result.stringValue.clear();
    break;
  default:
    break;
  }
  markReturned(object);
}

void returnInteger(RunObject &object, HostWord value, HostWord) {
  const auto integer = static_cast<std::int32_t>(value);
  if (!mayReturn(object)) {
    return;
  }
  Value &result = object.returnValue;
  switch (object.returnType) {
  case kReturnFloat:
    result.floatValue = static_cast<float>(integer);
    break;
  case kReturnString:
    result.stringValue = integerText(integer);
    break;
  default:
    break;
  }
  markReturned(object);
  result.intValue = integer;
}

void returnFloat(RunObject &object, HostWord, HostWord) {
  const float real = fetchActionParamFloat(object, 0);
  if (!mayReturn(object)) {
    return;
  }
  Value &result = object.returnValue;
  switch (object.returnType) {
  case kReturnInteger:
    result.intValue = truncateToInteger(real);
    break;
  case kReturnFloat:
    result.floatValue = real;
    break;
  case kReturnString:
    result.stringValue = floatText(real);
    break;
  default:
    break;
  }
  markReturned(object);
}

void returnString(RunObject &object, HostWord text, HostWord) {
  const auto *string = reinterpret_cast<const char *>(text);
  if (!mayReturn(object)) {
    return;
  }
  Value &result = object.returnValue;
  switch (object.returnType) {
  case kReturnInteger:
    result.intValue = readInteger(string);
    break;
  case kReturnFloat:
    result.floatValue = readFloat(string);
    break;
  case kReturnString:
    result.stringValue = string ? string : "";
    break;
  default:
    break;
  }
  markReturned(object);
}

void loopCurrentFunction(RunObject &object, HostWord, HostWord) {
  if (object.functionReturned == 1) {
    raiseActionError(object, kAlreadyReturnedLoop);
    return;
  }
  object.loopRequested = 1;
}

HostWord integerSlot(RunObject &object, HostWord cookie) {
  const auto slot = static_cast<std::int32_t>(fetchFirstExpressionInteger(object, cookie));
  if (!validSlot(slot)) {
    raiseExpressionError(object, kBadSlot);
    return 0;
  }
  return object.slotIntegers[static_cast<std::size_t>(slot)];
}

HostWord floatSlot(RunObject &object, HostWord cookie) {
  const auto slot = static_cast<std::int32_t>(fetchFirstExpressionInteger(object, cookie));
  markFloatResult(object);
  if (!validSlot(slot)) {
    raiseExpressionError(object, kBadSlot);
    return floatResult(0.0f);
  }
  return floatResult(object.slotFloats[static_cast<std::size_t>(slot)]);
}

// The slot's own text, owned by the object: valid until the slot is written again or the
// object is destroyed.
HostWord stringSlot(RunObject &object, HostWord cookie) {
  const auto slot = static_cast<std::int32_t>(fetchFirstExpressionInteger(object, cookie));
  markStringResult(object);
  if (!validSlot(slot)) {
    raiseExpressionError(object, kBadSlot);
    return emptyTextResult();
  }
  return textResult(object.slotStrings[static_cast<std::size_t>(slot)]);
}

HostWord functionLoopNumber(RunObject &object, HostWord) {
  return object.loopNumber;
}

HostWord getReturnType(RunObject &object, HostWord) {
  return object.returnType;
}

HostWord numberOfParameters(RunObject &object, HostWord) {
  return object.parameterCount;
}

} // namespace morvex::runtime
