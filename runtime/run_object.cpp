// Creation and destruction of run-time objects, and the global variables they share.
#include "runtime/run_object.h"

#include <algorithm>
#include <cstring>
#include <new>

namespace morvex::runtime {
namespace {

std::unique_ptr<VariableList> gGlobalVariables;
std::int32_t gRunObjectCount = 0;

// Copies `count` stored 26-byte entries starting at `from`. A stored entry comes from a
// game file and may lack its terminating zero: the copy is always terminated.
std::vector<NameEntry> copyNames(const char *from, std::int32_t count) {
  std::vector<NameEntry> names(static_cast<std::size_t>(count));
  for (auto &entry : names) {
    std::memcpy(entry.text, from, host::kNameEntrySize);
    entry.text[host::kNameEntrySize - 1] = '\0';
    from += host::kNameEntrySize;
  }
  return names;
}

// The stored counts, made safe to use. A damaged block is read only within its own bytes:
// each count is clamped to 0..500, and the lists are cut to the whole entries that fit
// before the end that the block's size field gives (function names first).
struct StoredCounts {
  std::int32_t functions = 0;
  std::int32_t members = 0;
};
StoredCounts safeCounts(const host::EditStructure &edit) {
  const std::size_t room = edit.size > host::kEditHeadSize
                               ? (edit.size - host::kEditHeadSize) / host::kNameEntrySize
                               : 0;
  StoredCounts counts;
  counts.functions = std::clamp(edit.functionCount, 0, host::kMaxNames);
  counts.members = std::clamp(edit.memberCount, 0, host::kMaxNames);
  counts.functions = static_cast<std::int32_t>(std::min<std::size_t>(counts.functions, room));
  counts.members = static_cast<std::int32_t>(
      std::min<std::size_t>(counts.members, room - static_cast<std::size_t>(counts.functions)));
  return counts;
}

} // namespace

RunObject::RunObject(const host::ObjectHeader &hostPart, const host::EditStructure *edit)
    : host::ObjectHeader(hostPart), localVariables(std::make_unique<VariableList>()),
      currentInstance(instances.end()), defaultInstance(instances.end()) {
  if (edit) {
    const StoredCounts counts = safeCounts(*edit);
    const char *names = edit->names;
    functionCount = counts.functions;
    functionNames = copyNames(names, functionCount);
    memberCount = counts.members;
    memberNames = copyNames(names + host::kNameEntrySize * static_cast<std::size_t>(functionCount),
                            memberCount);
    verifyFunctionNames = edit->verifyFunctionNames;
    loopUntilReturn = edit->loopUntilReturn;
  }
  if (!gGlobalVariables) {
    gGlobalVariables = std::make_unique<VariableList>();
  }
  ++gRunObjectCount; // counted only once nothing more can fail
}

RunObject::~RunObject() {
  if (--gRunObjectCount == 0) {
    gGlobalVariables.reset();
  }
}

VariableList &globalVariables() {
  return *gGlobalVariables;
}

std::int32_t runObjectCount() {
  return gRunObjectCount;
}

RunObject *createRunObject(host::ObjectHeader *block, const host::EditStructure *edit) {
  const host::ObjectHeader hostPart = *block;
  return new (block) RunObject(hostPart, edit);
}

void destroyRunObject(RunObject *object) {
  object->~RunObject();
}

} // namespace morvex::runtime
