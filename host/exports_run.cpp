// Run-time entry points: the size of an object's block, creating and destroying a
// RunObject in it, and the entry points that only answer.
#include "host/boundary.h"
#include "runtime/run_object.h"

#include <cstdint>
#include <type_traits>

using morvex::host::EditStructure;
using morvex::host::HostWord;
using morvex::host::ObjectHeader;
using morvex::host::RunHeader;

// The host reports the size as a 16-bit value.
static_assert(sizeof(morvex::runtime::RunObject) <= UINT16_MAX);

namespace morvex::host {
namespace {
constexpr HostWord kCreationFailed = 1;
// The debugger shows no items: the list holds only its end marker.
constexpr std::uint16_t kDebugTree[] = {0xFFFF};
} // namespace
} // namespace morvex::host

MORVEX_EXPORT HostWord MORVEX_CALL GetRunObjectDataSize(RunHeader *, EditStructure *) {
  return static_cast<HostWord>(sizeof(morvex::runtime::RunObject));
}

// Builds the RunObject in the host's block: 0 when done. A missing block, or a failure to
// allocate the object's tables, answers 1 and leaves no object behind.
MORVEX_EXPORT HostWord MORVEX_CALL CreateRunObject(ObjectHeader *block, EditStructure *edit,
                                                   HostWord) {
  if (block == nullptr) {
    return morvex::host::kCreationFailed;
  }
  return morvex::host::callGuarded(
      [&] {
        morvex::runtime::createRunObject(block, edit);
        return HostWord{0};
      },
      morvex::host::kCreationFailed);
}

MORVEX_EXPORT HostWord MORVEX_CALL DestroyRunObject(ObjectHeader *block, HostWord) {
  if (block != nullptr) {
    morvex::runtime::destroyRunObject(&morvex::runtime::runObjectOf(block));
  }
  return 0;
}

MORVEX_EXPORT HostWord MORVEX_CALL HandleRunObject(ObjectHeader *) {
  return 1;
}
MORVEX_EXPORT HostWord MORVEX_CALL DisplayRunObject(ObjectHeader *) {
  return 0;
}
MORVEX_EXPORT HostWord MORVEX_CALL PauseRunObject(ObjectHeader *) {
  return 0;
}
MORVEX_EXPORT HostWord MORVEX_CALL ContinueRunObject(ObjectHeader *) {
  return 0;
}

MORVEX_EXPORT void MORVEX_CALL StartApp(HostWord, HostWord) {
}
MORVEX_EXPORT void MORVEX_CALL EndApp(HostWord, HostWord) {
}
MORVEX_EXPORT void MORVEX_CALL StartFrame(HostWord, HostWord, HostWord) {
}
MORVEX_EXPORT void MORVEX_CALL EndFrame(HostWord, HostWord, HostWord) {
}

// A static list that lives as long as the module.
MORVEX_EXPORT const std::uint16_t *MORVEX_CALL GetDebugTree(ObjectHeader *) {
  return morvex::host::kDebugTree;
}
MORVEX_EXPORT void MORVEX_CALL GetDebugItem(HostWord, HostWord, HostWord) {
}
MORVEX_EXPORT void MORVEX_CALL EditDebugItem(HostWord, HostWord) {
}

static_assert(
    std::is_same_v<decltype(&GetRunObjectDataSize), morvex::host::GetRunObjectDataSizeFn>);
static_assert(std::is_same_v<decltype(&CreateRunObject), morvex::host::CreateRunObjectFn>);
static_assert(std::is_same_v<decltype(&DestroyRunObject), morvex::host::DestroyRunObjectFn>);
static_assert(std::is_same_v<decltype(&HandleRunObject), morvex::host::RunObjectQueryFn>);
static_assert(std::is_same_v<decltype(&DisplayRunObject), morvex::host::RunObjectQueryFn>);
static_assert(std::is_same_v<decltype(&PauseRunObject), morvex::host::RunObjectQueryFn>);
static_assert(std::is_same_v<decltype(&ContinueRunObject), morvex::host::RunObjectQueryFn>);
static_assert(std::is_same_v<decltype(&GetDebugTree), morvex::host::GetDebugTreeFn>);
