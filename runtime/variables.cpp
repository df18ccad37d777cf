// Global and local variables: creating them, setting and reading one part of a variable,
// and the fourteen routines that events use for it.
#include "runtime/variables.h"

#include "runtime/errors.h"
#include "runtime/host_services.h"
#include "runtime/routines.h"

#include <cstring>

namespace morvex::runtime {
namespace {

const char *textOf(HostWord word) {
  return reinterpret_cast<const char *>(word);
}

// The list that `localVariables` names at this moment: the running call's or event's, or
// the object's own.
VariableList &localsOf(RunObject &object) {
  return *object.localVariables;
}

void createVariable(RunObject &object, VariableList &list, const char *name) {
  if (list.find(name) != list.end()) {
    raiseActionError(object, kVariableExists);
    return;
  }
  list.insertOrReplace(std::make_unique<VariableRecord>(name));
}

// Parameter 1 of the running action as the float's bit pattern, fetched by index; kept as
// bits so that the value is stored exactly as the host gave it.
HostWord fetchFloatBits(RunObject &object) {
  return static_cast<HostWord>(
      static_cast<std::uint32_t>(object.runHeader->FetchActionParamFloat(&object, 1, 0)));
}

HostWord readVariable(RunObject &object, VariableList &list, HostWord cookie,
                      std::int32_t valueType) {
  const char *name = fetchFirstExpressionText(object, cookie);
  const HostWord result = getVariable(object, list, name, valueType);
  if (valueType == kFloatPart) {
    markFloatResult(object);
  } else if (valueType == kStringPart) {
    markStringResult(object);
  }
  return result;
}

} // namespace

void setVariable(RunObject &object, VariableList &list, const char *name, HostWord value,
                 std::int32_t valueType) {
  VariableRecord *variable = list.find(name);
  if (variable == list.end()) {
    raiseActionError(object, kNoSuchVariable);
    return;
  }
  Value &target = variable->value;
  switch (valueType) {
  case kIntegerPart:
    target.intValue = static_cast<std::int32_t>(value);
    break;
  case kFloatPart: {
    const auto bits = static_cast<std::uint32_t>(value);
    std::memcpy(&target.floatValue, &bits, sizeof bits);
    break;
  }
  case kStringPart: {
    const char *text = textOf(value);
    target.stringValue = text ? text : "";
    break;
  }
  default:
    break;
  }
}

HostWord getVariable(RunObject &object, VariableList &list, const char *name,
                     std::int32_t valueType) {
  VariableRecord *variable = list.find(name);
  if (variable == list.end()) {
    raiseExpressionError(object, kNoSuchVariable);
    return valueType == kStringPart ? emptyTextResult() : 0;
  }
  const Value &source = variable->value;
  switch (valueType) {
  case kIntegerPart:
    return source.intValue;
  case kFloatPart: {
    std::uint32_t bits = 0;
    std::memcpy(&bits, &source.floatValue, sizeof bits);
    return static_cast<HostWord>(bits);
  }
  case kStringPart:
    return textResult(source.stringValue);
  default:
    return 0;
  }
}

void createGlobalVariable(RunObject &object, HostWord name, HostWord) {
  createVariable(object, globalVariables(), textOf(name));
}

void setGlobalInteger(RunObject &object, HostWord name, HostWord value) {
  setVariable(object, globalVariables(), textOf(name), value, kIntegerPart);
}

void setGlobalFloat(RunObject &object, HostWord name, HostWord) {
  setVariable(object, globalVariables(), textOf(name), fetchFloatBits(object), kFloatPart);
}

void setGlobalString(RunObject &object, HostWord name, HostWord text) {
  setVariable(object, globalVariables(), textOf(name), text, kStringPart);
}

void createLocalVariable(RunObject &object, HostWord name, HostWord) {
  createVariable(object, localsOf(object), textOf(name));
}

void setLocalInteger(RunObject &object, HostWord name, HostWord value) {
  setVariable(object, localsOf(object), textOf(name), value, kIntegerPart);
}

void setLocalFloat(RunObject &object, HostWord name, HostWord) {
  setVariable(object, localsOf(object), textOf(name), fetchFloatBits(object), kFloatPart);
}

void setLocalString(RunObject &object, HostWord name, HostWord text) {
  setVariable(object, localsOf(object), textOf(name), text, kStringPart);
}

HostWord globalInt(RunObject &object, HostWord cookie) {
  return readVariable(object, globalVariables(), cookie, kIntegerPart);
}

HostWord globalFloat(RunObject &object, HostWord cookie) {
  return readVariable(object, globalVariables(), cookie, kFloatPart);
}

HostWord globalString(RunObject &object, HostWord cookie) {
  return readVariable(object, globalVariables(), cookie, kStringPart);
}

HostWord localInt(RunObject &object, HostWord cookie) {
  return readVariable(object, localsOf(object), cookie, kIntegerPart);
}

HostWord localFloat(RunObject &object, HostWord cookie) {
  return readVariable(object, localsOf(object), cookie, kFloatPart);
}

HostWord localString(RunObject &object, HostWord cookie) {
  return readVariable(object, localsOf(object), cookie, kStringPart);
}

} // namespace morvex::runtime
