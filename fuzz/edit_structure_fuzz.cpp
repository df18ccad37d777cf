// Creates run-time objects from arbitrary stored blocks and converts them as an old
// version: a damaged block must never be read outside its own bytes.
#include "editor/edit_structure.h"
#include "host/contract.h"
#include "runtime/run_object.h"

#include <windows.h>

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <memory>
#include <new>
#include <vector>

using namespace morvex;

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
  if (size < sizeof(host::EditStructure)) {
    return 0;
  }
  // The block holds exactly the fuzzer's bytes; its size field says no more than that.
  std::vector<std::uint8_t> bytes(data, data + size);
  auto *edit = reinterpret_cast<host::EditStructure *>(bytes.data());
  edit->size = static_cast<std::uint32_t>(std::min<std::size_t>(edit->size, size));

  alignas(runtime::RunObject) static std::uint8_t block[sizeof(runtime::RunObject)];
  auto *header = reinterpret_cast<host::ObjectHeader *>(block);
  std::memset(block, 0, sizeof block);
  runtime::RunObject *object = runtime::createRunObject(header, edit);
  for (const auto &entry : object->functionNames) {
    if (std::memchr(entry.text, '\0', sizeof entry.text) == nullptr) {
      std::abort();
    }
  }
  runtime::destroyRunObject(object);

  edit->version = 1;
  if (void *converted = editor::updateEditStructure(edit)) {
    GlobalFree(converted);
  }
  return 0;
}
