// Running deeply re-entrant test scenarios on a thread whose stack is big enough for them.
#ifndef MORVEX_TESTS_LARGE_STACK_H
#define MORVEX_TESTS_LARGE_STACK_H

#include <cstddef>
#include <functional>

namespace morvex::tests {

inline constexpr std::size_t kLargeStackBytes = std::size_t{512} << 20;

// Runs `work` on a new thread with a stack of `stackBytes` and waits for it to finish.
// Recursion through the host's event service nests several native frames per level, more
// than the default stack holds at a depth of thousands under the sanitizers.
void runOnLargeStack(const std::function<void()> &work, std::size_t stackBytes = kLargeStackBytes);

} // namespace morvex::tests

#endif
