// The event frame: the RunObject fields an instance's creation or destruction event
// changes, saved when the event starts and put back on every path out of it.
#ifndef MORVEX_RUNTIME_EVENT_FRAME_H
#define MORVEX_RUNTIME_EVENT_FRAME_H

#include "runtime/run_object.h"

#include <cstdint>
#include <memory>

namespace morvex::runtime {

// Leaves functionReturned, currentFunctionName, loopRequested, the errors, returnValue and
// the slots alone: a creation or destruction event inside a function body shares them.
class EventFrame {
public:
  // Saves the fields and sets them for `instance`: loop number 0, no function running
  // (return type -1), `instance` current and busy, a fresh empty local-variable list, no
  // parameters. `instance` must stay alive until the frame ends; being busy, it does.
  EventFrame(RunObject &object, InstanceRecord &instance);
  // Puts every saved field back; the event's local-variable list is destroyed.
  ~EventFrame();
  EventFrame(const EventFrame &) = delete;
  EventFrame &operator=(const EventFrame &) = delete;

private:
  RunObject &object_;
  InstanceRecord &instance_;
  std::int32_t loopNumber_;
  std::int32_t returnType_;
  InstanceRecord *currentInstance_;
  std::unique_ptr<VariableList> localVariables_;
  std::uint8_t instanceBusy_;
  std::int32_t parameterCount_;
};

} // namespace morvex::runtime

#endif
