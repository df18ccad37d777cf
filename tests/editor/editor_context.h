// An editor context for tests: a HostVersion service answering scripted words, counting
// how often it is asked.
#ifndef MORVEX_TESTS_EDITOR_EDITOR_CONTEXT_H
#define MORVEX_TESTS_EDITOR_EDITOR_CONTEXT_H

#include "host/contract.h"

#include <cstdint>
#include <vector>

namespace morvex::tests {

inline constexpr std::uint32_t kGoodHostWord = 0x0200'0000u | 228u; // version 0x0200, build 228

// The words HostVersion answers, one per call; the last one repeats.
struct HostVersionScript {
  static inline std::vector<std::uint32_t> words{kGoodHostWord};
  static inline int calls = 0;

  static std::uint32_t MORVEX_CALL answer() {
    const auto index = static_cast<std::size_t>(calls++);
    return index < words.size() ? words[index] : words.back();
  }
};

// A context whose HostVersion answers `words` from now on.
inline host::EditorContext scriptedContext(std::vector<std::uint32_t> words = {kGoodHostWord}) {
  HostVersionScript::words = std::move(words);
  HostVersionScript::calls = 0;
  host::EditorContext context{};
  context.HostVersion = &HostVersionScript::answer;
  return context;
}

} // namespace morvex::tests

#endif
