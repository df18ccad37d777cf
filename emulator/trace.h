// The --trace output: every event the extension raises and every extension action run,
// indented by nesting, so that an author sees the call tree of their functions.
#ifndef MORVEX_EMULATOR_TRACE_H
#define MORVEX_EMULATOR_TRACE_H

#include "emulator/catalog.h"
#include "emulator/value.h"

#include <ostream>
#include <string>
#include <vector>

namespace morvex::emulator {

// A parameter as the trace shows it: texts as string literals, numbers as Display shows
// them, an object parameter (the object's number) by the object's name.
std::string traceValue(const Value &value, std::uint16_t type,
                       const std::vector<std::string> &objectNames);

class Trace {
public:
  // Writes to `out` (borrowed), or nowhere when it is null.
  Trace(std::ostream *out, const std::vector<std::string> &objectNames)
      : out_(out), objectNames_(objectNames) {}

  bool on() const { return out_ != nullptr; }
  // An action at event depth `depth`, on sheet line `line`, with its evaluated parameters.
  void action(int depth, int line, int object, const RoutineInfo &routine,
              const std::vector<Value> &values);
  // An event the extension raised from event depth `depth`; `condition` is null for a
  // code the extension has no condition for.
  void event(int depth, int object, const RoutineInfo *condition, long long code);

private:
  void indent(int level);

  std::ostream *out_;
  const std::vector<std::string> &objectNames_;
};

} // namespace morvex::emulator

#endif
