// Writing trace lines.
#include "emulator/trace.h"

#include "emulator/display_template.h"

namespace morvex::emulator {

std::string traceValue(const Value &value, std::uint16_t type,
                       const std::vector<std::string> &objectNames) {
  if (const auto *text = std::get_if<std::string>(&value)) {
    std::string literal = "\"";
    for (const char c : *text) {
      literal += c;
      if (c == '"') {
        literal += '"';
      }
    }
    return literal + "\"";
  }
  if (type == kObjectParam) {
    const std::int32_t number = toInteger(value);
    if (number >= 0 && static_cast<std::size_t>(number) < objectNames.size()) {
      return objectNames[static_cast<std::size_t>(number)];
    }
  }
  return formatValue(value);
}

void Trace::indent(int level) {
  for (int i = 0; i < level; ++i) {
    *out_ << "  ";
  }
}

void Trace::action(int depth, int line, int object, const RoutineInfo &routine,
                   const std::vector<Value> &values) {
  if (out_ == nullptr) {
    return;
  }
  std::vector<std::string> shown;
  for (std::size_t i = 0; i < values.size(); ++i) {
    const std::uint16_t type = i < routine.parameterTypes.size() ? routine.parameterTypes[i] : 0;
    shown.push_back(traceValue(values[i], type, objectNames_));
  }
  const std::string &name = objectNames_[static_cast<std::size_t>(object)];
  indent(2 * depth);
  *out_ << "line " << line << ": " << name << ": " << fillTemplate(routine.display, name, shown)
        << '\n';
}

void Trace::event(int depth, int object, const RoutineInfo *condition, long long code) {
  if (out_ == nullptr) {
    return;
  }
  indent(2 * depth + 1);
  *out_ << "event " << objectNames_[static_cast<std::size_t>(object)] << ": "
        << (condition ? eventName(condition->display) : "condition " + std::to_string(code))
        << '\n';
}

} // namespace morvex::emulator
