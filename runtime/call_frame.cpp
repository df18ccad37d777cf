// Saving and restoring the caller's fields around a function call.
#include "runtime/call_frame.h"

#include <utility>

namespace morvex::runtime {

CallFrame::CallFrame(RunObject &object, InstanceRecord &instance, const char *functionName,
                     std::int32_t returnType)
    : object_(object), instance_(instance), loopNumber_(object.loopNumber),
      functionReturned_(object.functionReturned), returnType_(object.returnType),
      functionName_(std::move(object.currentFunctionName)),
      currentInstance_(object.currentInstance), localVariables_(std::move(object.localVariables)),
      instanceBusy_(instance.instanceBusy), parameterCount_(object.parameterCount),
      loopRequested_(object.loopRequested) {
  object.loopNumber = 0;
  object.functionReturned = 0;
  object.returnType = returnType;
  object.currentFunctionName =
      functionName ? std::optional<std::string>(functionName) : std::nullopt;
  object.currentInstance = &instance;
  object.localVariables = std::make_unique<VariableList>();
  instance.instanceBusy = 1;
  object.parameterCount = 0;
  object.loopRequested = 1;
}

CallFrame::~CallFrame() {
  object_.loopNumber = loopNumber_;
  object_.functionReturned = functionReturned_;
  object_.returnType = returnType_;
  object_.currentFunctionName = std::move(functionName_);
  object_.currentInstance = currentInstance_;
  object_.localVariables = std::move(localVariables_);
  instance_.instanceBusy = instanceBusy_;
  object_.parameterCount = parameterCount_;
  object_.loopRequested = loopRequested_;
}

} // namespace morvex::runtime
