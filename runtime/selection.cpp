// The selection count read from the host's object table, the action that does nothing
// with it, and the extension's version number.
#include "runtime/errors.h"
#include "runtime/host_services.h"
#include "runtime/routines.h"

#include <cstring>

namespace morvex::runtime {
namespace {

// 1.06 as a 32-bit float.
constexpr std::uint32_t kVersionBits = 0x3F87AE14;

// The selected count that the host keeps for `entry`; 0 when the entry holds no object or
// its object points at no selection record.
std::int32_t selectedCountOf(const host::ObjectTableEntry &entry) {
  const host::HostObject *hostObject = entry.object;
  if (!hostObject || hostObject->selectionIndex < 1 || !hostObject->selectionRecords) {
    return 0;
  }
  const std::uint8_t *record =
      hostObject->selectionRecords +
      static_cast<std::size_t>(hostObject->selectionIndex - 1) * host::kSelectionRecordSize;
  std::int32_t count = 0;
  std::memcpy(&count, record + host::kSelectedCountOffset, sizeof count); // not aligned
  return count;
}

} // namespace

void countAllSelected(RunObject &, HostWord, HostWord) {
}

HostWord countSelected(RunObject &object, HostWord cookie) {
  // Only the low 16 bits count, as a signed number.
  const auto number = static_cast<std::int16_t>(
      static_cast<std::uint16_t>(fetchFirstExpressionInteger(object, cookie)));
  const host::RunHeader &run = *object.runHeader;
  if (number < 0 || number >= run.objectCount) {
    raiseExpressionError(object, kBadObjectNumber);
    return 0;
  }
  if (!run.objectTable) {
    return 0;
  }
  return selectedCountOf(run.objectTable[number]);
}

HostWord objectVersion(RunObject &object, HostWord) {
  markFloatResult(object);
  return static_cast<HostWord>(kVersionBits);
}

} // namespace morvex::runtime
