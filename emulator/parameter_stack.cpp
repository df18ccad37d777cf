// Parameter fetching for the running routine, with checks that the extension asks only
// for parameters its routine has, of the types its record gives.
#include "emulator/parameter_stack.h"

namespace morvex::emulator {

namespace {

std::string routineName(const ParameterFrame &frame) {
  if (frame.routine == nullptr) {
    return "a routine";
  }
  return std::string(kindName(frame.routine->kind)) + " \"" + frame.routine->display + "\"";
}

} // namespace

host::HostWord wordOf(const Value &value, bool asFloat) {
  if (const auto *text = std::get_if<std::string>(&value)) {
    return reinterpret_cast<host::HostWord>(text->c_str());
  }
  if (asFloat) {
    return host::wordFromFloat(toFloat(value));
  }
  return toInteger(value);
}

ParameterFrame *ParameterStack::top(RoutineKind kind, const char *service, std::string &fault) {
  if (frames_.empty()) {
    fault = std::string(service) + " was called while no routine runs";
    return nullptr;
  }
  ParameterFrame *frame = frames_.back();
  const RoutineKind running = frame->routine ? frame->routine->kind : kind;
  const bool fits = kind == RoutineKind::Expression ? running == RoutineKind::Expression
                                                    : running != RoutineKind::Expression;
  if (!fits) {
    fault = std::string(service) + " was called by " + routineName(*frame);
    return nullptr;
  }
  return frame;
}

ParameterFrame *ParameterStack::expressionTop(host::HostWord cookie, const char *service,
                                              std::string &fault) {
  ParameterFrame *frame = top(RoutineKind::Expression, service, fault);
  if (frame != nullptr && frame->cookie != cookie) {
    fault = routineName(*frame) + " passed " + service + " another value than the one it got";
    return nullptr;
  }
  return frame;
}

std::optional<host::HostWord> ParameterStack::take(ParameterFrame &frame, std::size_t index,
                                                   bool asFloat, bool wantsText,
                                                   const char *service, std::string &fault) {
  if (index >= frame.values.size()) {
    fault = routineName(frame) + " fetched parameter " + std::to_string(index + 1) + " with " +
            service + ", but it has " + std::to_string(frame.values.size());
    return std::nullopt;
  }
  const Value &value = frame.values[index];
  if (isText(value) != wantsText) {
    fault = routineName(frame) + " fetched parameter " + std::to_string(index + 1) + " as " +
            (wantsText ? "a text" : "a number") + " with " + service + ", but it is " +
            (isText(value) ? "a text" : "a number");
    return std::nullopt;
  }
  return wordOf(value, asFloat);
}

std::optional<host::HostWord> ParameterStack::fetchAction(host::HostWord mode, std::string &fault) {
  constexpr const char *kService = "FetchActionParam";
  ParameterFrame *frame = top(RoutineKind::Action, kService, fault);
  if (frame == nullptr) {
    return std::nullopt;
  }
  const std::size_t index = frame->next++;
  if (mode == host::kFetchFloat) {
    return take(*frame, index, true, false, kService, fault);
  }
  // As-is: whatever the parameter is, a number or a text.
  const bool isTextParameter = index < frame->values.size() && isText(frame->values[index]);
  return take(*frame, index, false, isTextParameter, kService, fault);
}

std::optional<host::HostWord> ParameterStack::fetchActionFloat(host::HostWord index,
                                                               std::string &fault) {
  constexpr const char *kService = "FetchActionParamFloat";
  ParameterFrame *frame = top(RoutineKind::Action, kService, fault);
  if (frame == nullptr) {
    return std::nullopt;
  }
  if (index < 0) {
    fault = routineName(*frame) + " fetched parameter " + std::to_string(index + 1) + " with " +
            kService;
    return std::nullopt;
  }
  return take(*frame, static_cast<std::size_t>(index), true, false, kService, fault);
}

std::optional<host::HostWord> ParameterStack::fetchFirstExpression(host::HostWord type,
                                                                   host::HostWord cookie,
                                                                   std::string &fault) {
  constexpr const char *kService = "FetchFirstExpressionParam";
  ParameterFrame *frame = expressionTop(cookie, kService, fault);
  if (frame == nullptr) {
    return std::nullopt;
  }
  frame->next = 1;
  return take(*frame, 0, false, type == host::kParamString, kService, fault);
}

std::optional<host::HostWord> ParameterStack::fetchNextExpression(host::HostWord type,
                                                                  host::HostWord cookie,
                                                                  std::string &fault) {
  constexpr const char *kService = "FetchNextExpressionParam";
  ParameterFrame *frame = expressionTop(cookie, kService, fault);
  if (frame == nullptr) {
    return std::nullopt;
  }
  if (frame->next == 0) {
    fault = routineName(*frame) + " called " + kService + " before FetchFirstExpressionParam";
    return std::nullopt;
  }
  const std::size_t index = frame->next++;
  return take(*frame, index, false, type == host::kParamString, kService, fault);
}

} // namespace morvex::emulator
