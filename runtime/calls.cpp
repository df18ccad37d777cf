// Function calls: the call frame, the body loop, return actions, slots and conditions.
#include "runtime/host_services.h"
#include "runtime/routines.h"

namespace morvex::runtime {

bool onFunction(RunObject &object, HostWord name, HostWord) {
  const auto *text = reinterpret_cast<const char *>(name);
  return object.currentFunctionName && text &&
         compareLowered(lowerCased(object.currentFunctionName->c_str()), text) == 0;
}

bool alwaysTrue(RunObject &, HostWord, HostWord) { return true; }

} // namespace morvex::runtime
