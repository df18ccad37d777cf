// The call frame: the RunObject fields a function call changes, saved when the call starts
// and put back when the frame goes out of scope, on every path out of the call.
#ifndef MORVEX_RUNTIME_CALL_FRAME_H
#define MORVEX_RUNTIME_CALL_FRAME_H

#include "runtime/run_object.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>

namespace morvex::runtime {

class CallFrame {
public:
  // Saves the caller's fields and installs the callee's: loop number 0, not returned, the
  // requested return type, a copy of `functionName` (none when missing), `instance` current
  // and busy, a fresh empty local-variable list, no parameters, a run requested.
  // `instance` must stay alive until the frame ends; being busy, it is never destroyed.
  CallFrame(RunObject &object, InstanceRecord &instance, const char *functionName,
            std::int32_t returnType);
  // Puts every saved field back; the callee's local-variable list is destroyed.
  ~CallFrame();
  CallFrame(const CallFrame &) = delete;
  CallFrame &operator=(const CallFrame &) = delete;

private:
  RunObject &object_;
  InstanceRecord &instance_;
  std::int32_t loopNumber_;
  std::uint8_t functionReturned_;
  std::int32_t returnType_;
  std::optional<std::string> functionName_;
  InstanceRecord *currentInstance_;
  std::unique_ptr<VariableList> localVariables_;
  std::uint8_t instanceBusy_;
  std::int32_t parameterCount_;
  std::uint8_t loopRequested_;
};

} // namespace morvex::runtime

#endif
