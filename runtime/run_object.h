// The run-time block of one object: the host's header, then the extension's fields.
#ifndef MORVEX_RUNTIME_RUN_OBJECT_H
#define MORVEX_RUNTIME_RUN_OBJECT_H

#include "host/contract.h"
#include "runtime/name_list.h"
#include "runtime/records.h"

#include <array>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace morvex::runtime {

using InstanceList = NameList<InstanceRecord>;
using VariableList = NameList<VariableRecord>;

// One declared function or member name: at most 25 characters and a terminating zero.
struct NameEntry {
  char text[host::kNameEntrySize];
};

inline constexpr std::int32_t kSlotCount = 11; // return slots 0 to 10

// Return types, as the author numbers them; kNoFunction while no function is running.
inline constexpr std::int32_t kNoFunction = -1;
inline constexpr std::int32_t kReturnVoid = 0;
inline constexpr std::int32_t kReturnInteger = 1;
inline constexpr std::int32_t kReturnFloat = 2;
inline constexpr std::int32_t kReturnString = 3;

// The host allocates the block and fills the ObjectHeader base; createRunObject builds the
// rest in place and destroyRunObject takes it down. Records that currentInstance and
// defaultInstance refer to belong to `instances`; its end marker stands for "none".
struct RunObject : host::ObjectHeader {
  RunObject(const host::ObjectHeader &hostPart, const host::EditStructure *edit);
  ~RunObject();
  RunObject(const RunObject &) = delete;
  RunObject &operator=(const RunObject &) = delete;

  InstanceRecord *noInstance() { return instances.end(); }

  InstanceList instances;
  std::int32_t functionCount = 0;
  std::vector<NameEntry> functionNames;
  std::int32_t memberCount = 0;
  std::vector<NameEntry> memberNames;
  std::uint8_t verifyFunctionNames = 0;
  std::uint8_t loopUntilReturn = 0;
  std::uint8_t loopRequested = 0;
  // The list in force: the object's own outside calls and events, else the running one's.
  std::unique_ptr<VariableList> localVariables;
  // The running function's name, held for the call; none outside calls and after a return.
  std::optional<std::string> currentFunctionName;
  InstanceRecord *currentInstance;
  InstanceRecord *defaultInstance;
  std::int32_t errorCode = 0;
  std::int32_t expressionErrorCode = 0;
  std::uint8_t functionReturned = 0;
  std::int32_t returnType = kNoFunction;
  std::int32_t parameterCount = 0;
  std::int32_t loopNumber = 0;
  Value returnValue; // an empty string stands for "no string"
  std::array<std::int32_t, kSlotCount> slotIntegers{};
  std::array<float, kSlotCount> slotFloats{};
  std::array<std::string, kSlotCount> slotStrings; // "" reads as the empty string
  // The latest FormatString$/UnformatString$ result and the one before it, or none. Held
  // on the heap so that a text handed to the host keeps its address when it moves from
  // the one field to the other.
  std::unique_ptr<std::string> stringResult;
  std::unique_ptr<std::string> previousStringResult;
};

// The process-wide global variables, shared by every live RunObject; they exist while
// at least one does. The reference is valid until the last RunObject is destroyed.
VariableList &globalVariables();
std::int32_t runObjectCount();

// Builds a RunObject in the host's block (which starts with a filled ObjectHeader) from
// the stored edit structure, and takes it down again. `block` must be at least
// sizeof(RunObject) bytes.
RunObject *createRunObject(host::ObjectHeader *block, const host::EditStructure *edit);
void destroyRunObject(RunObject *object);

// The RunObject whose header the host hands to a routine.
inline RunObject &runObjectOf(host::ObjectHeader *header) { return *static_cast<RunObject *>(header); }

} // namespace morvex::runtime

#endif
