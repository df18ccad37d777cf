// The runtime's calls back into the host, through the RunHeader of the object's header.
#ifndef MORVEX_RUNTIME_HOST_SERVICES_H
#define MORVEX_RUNTIME_HOST_SERVICES_H

#include "host/contract.h"
#include "runtime/run_object.h"

#include <cstdint>

namespace morvex::runtime {

using host::HostWord;

// Raises one of the extension's conditions; the host runs the matching event lines (which
// may call any routine again) before this returns.
inline void generateEvent(RunObject &object, HostWord conditionCode) {
  object.runHeader->GenerateEvent(&object, conditionCode, 0);
}

// The next parameter of the running action: an integer, or a host-owned text (may be null).
inline HostWord fetchActionParam(RunObject &object) {
  return object.runHeader->FetchActionParam(&object, host::kFetchAsIs, 0);
}
inline const char *fetchActionText(RunObject &object) {
  return reinterpret_cast<const char *>(fetchActionParam(object));
}
inline std::int32_t fetchActionInteger(RunObject &object) {
  return static_cast<std::int32_t>(fetchActionParam(object));
}
// The next parameter of the running action, as a float.
inline float fetchActionFloat(RunObject &object) {
  return host::floatFromWord(object.runHeader->FetchActionParam(&object, host::kFetchFloat, 0));
}
// Parameter `index` (from 0) of the running action, as a float.
inline float fetchActionParamFloat(RunObject &object, HostWord index) {
  return host::floatFromWord(object.runHeader->FetchActionParamFloat(&object, index, 0));
}

// The first and the following parameters of the running expression.
inline const char *fetchFirstExpressionText(RunObject &object, HostWord cookie) {
  return reinterpret_cast<const char *>(
      object.runHeader->FetchFirstExpressionParam(&object, host::kParamString, cookie));
}
inline const char *fetchNextExpressionText(RunObject &object, HostWord cookie) {
  return reinterpret_cast<const char *>(
      object.runHeader->FetchNextExpressionParam(&object, host::kParamString, cookie));
}
inline HostWord fetchFirstExpressionInteger(RunObject &object, HostWord cookie) {
  return object.runHeader->FetchFirstExpressionParam(&object, host::kParamInteger, cookie);
}

// Marks the running expression's result as a float or a string.
inline void markFloatResult(RunObject &object) {
  object.hostFlags |= host::kFloatResult;
}
inline void markStringResult(RunObject &object) {
  object.hostFlags |= host::kStringResult;
}

// Result words: a float's bit pattern, or a text the RunObject keeps owning.
inline HostWord floatResult(float value) {
  return host::wordFromFloat(value);
}
inline HostWord textResult(const std::string &text) {
  return reinterpret_cast<HostWord>(text.c_str());
}
// The empty string result of a failed string expression: static text, never released.
inline HostWord emptyTextResult() {
  static constexpr char kEmptyText[] = "";
  return reinterpret_cast<HostWord>(kEmptyText);
}

} // namespace morvex::runtime

#endif
