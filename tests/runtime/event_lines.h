// Shorthands for the event lines that the call, instance and scenario tests write as
// lambdas: calling functions, reading slots and logging the errors an object raises.
#ifndef MORVEX_TESTS_RUNTIME_EVENT_LINES_H
#define MORVEX_TESTS_RUNTIME_EVENT_LINES_H

#include "runtime/routines.h"
#include "tests/support/test_host.h"

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

namespace morvex::tests {

// "Call Function ... for Instance ...": instance, function, parameters, return type, slot.
inline void callFor(TestHost &host, RunObject &object, Param instance, Param function,
                    Param parameters = std::string(), std::int32_t returnType = 0,
                    std::int32_t slot = 0) {
  host.act(object, runtime::callFunctionForInstance,
           {std::move(instance), std::move(function), std::move(parameters), returnType, slot});
}

// "Call Function ... for Current Instance ...": function, parameters, return type, slot.
inline void callCurrent(TestHost &host, RunObject &object, Param function,
                        Param parameters = std::string(), std::int32_t returnType = 0,
                        std::int32_t slot = 0) {
  host.act(object, runtime::callFunctionForCurrent,
           {std::move(function), std::move(parameters), returnType, slot});
}

inline void makeInstance(TestHost &host, RunObject &object, Param name,
                         Param parameters = std::string()) {
  host.act(object, runtime::createInstance, {std::move(name), std::move(parameters)});
}

inline std::int32_t slotInteger(TestHost &host, RunObject &object, std::int32_t slot) {
  return host.eval(object, runtime::integerSlot, {slot}).integer();
}
inline float slotFloat(TestHost &host, RunObject &object, std::int32_t slot) {
  return host.eval(object, runtime::floatSlot, {slot}).real();
}
inline std::string slotString(TestHost &host, RunObject &object, std::int32_t slot) {
  return host.eval(object, runtime::stringSlot, {slot}).text();
}

inline std::string currentInstanceName(TestHost &host, RunObject &object) {
  return host.eval(object, runtime::getInstanceName).text();
}
inline std::int32_t currentParameterCount(TestHost &host, RunObject &object) {
  return host.eval(object, runtime::numberOfParameters).integer();
}
inline std::int32_t currentLoopNumber(TestHost &host, RunObject &object) {
  return host.eval(object, runtime::functionLoopNumber).integer();
}
inline std::int32_t currentReturnType(TestHost &host, RunObject &object) {
  return host.eval(object, runtime::getReturnType).integer();
}
inline std::int32_t readLocalInt(TestHost &host, RunObject &object, std::string name) {
  return host.eval(object, runtime::localInt, {std::move(name)}).integer();
}
inline std::string readLocalString(TestHost &host, RunObject &object, std::string name) {
  return host.eval(object, runtime::localString, {std::move(name)}).text();
}
inline std::int32_t expressionErrorOf(TestHost &host, RunObject &object) {
  return host.eval(object, runtime::expressionError).integer();
}

// Adds an "On Error" line to `object` that logs each code it sees; the log lives as long
// as the caller keeps it (the line keeps it too).
inline std::shared_ptr<std::vector<std::int32_t>> logErrors(TestHost &host, RunObject &object) {
  auto log = std::make_shared<std::vector<std::int32_t>>();
  host.on(object, host::kOnError, [&host, &object, log] {
    log->push_back(host.eval(object, runtime::currentError).integer());
  });
  return log;
}

using Codes = std::vector<std::int32_t>;

} // namespace morvex::tests

#endif
