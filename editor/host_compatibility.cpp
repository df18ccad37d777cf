// The compatibility test run before every menu and display string.
#include "editor/host_compatibility.h"

namespace morvex::editor {

bool isCompatibleHost(const host::EditorContext *context) {
  if (context == nullptr || context->HostVersion == nullptr) {
    return false;
  }
  if ((context->HostVersion() & 0xFFFu) < kMinimumHostBuild) {
    return false;
  }
  if ((context->HostVersion() >> 16) < kMinimumHostVersion) {
    return false;
  }
  return (context->HostVersion() & kIncompatibleHostBit) == 0;
}

} // namespace morvex::editor
