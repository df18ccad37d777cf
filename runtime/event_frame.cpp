// Saving and restoring the object's fields around an instance's creation or destruction.
#include "runtime/event_frame.h"

#include <utility>

namespace morvex::runtime {

EventFrame::EventFrame(RunObject &object, InstanceRecord &instance)
    : object_(object), instance_(instance), loopNumber_(object.loopNumber),
      returnType_(object.returnType), currentInstance_(object.currentInstance),
      localVariables_(std::move(object.localVariables)), instanceBusy_(instance.instanceBusy),
      parameterCount_(object.parameterCount) {
  object.loopNumber = 0;
  object.returnType = kNoFunction;
  object.currentInstance = &instance;
  object.localVariables = std::make_unique<VariableList>();
  instance.instanceBusy = 1;
  object.parameterCount = 0;
}

EventFrame::~EventFrame() {
  object_.loopNumber = loopNumber_;
  object_.returnType = returnType_;
  object_.currentInstance = currentInstance_;
  object_.localVariables = std::move(localVariables_);
  instance_.instanceBusy = instanceBusy_;
  object_.parameterCount = parameterCount_;
}

} // namespace morvex::runtime
