// Runs the game on a thread whose stack is large enough for thousands of nested events,
// and lets deep code ask whether that stack is close to its end.
#ifndef MORVEX_EMULATOR_BIG_STACK_H
#define MORVEX_EMULATOR_BIG_STACK_H

#include <cstddef>
#include <functional>
#include <optional>

namespace morvex::emulator {

// The stack a game runs on: room for the default nesting of 10,000 events also in a
// sanitized build, whose frames are several times larger. Only reserved address space:
// pages are used as the game reaches them. A 32-bit process has less space to spare.
inline constexpr std::size_t kGameStackSize =
    sizeof(void *) >= 8 ? std::size_t{1} << 30 : std::size_t{256} << 20;

// Runs `body` on a new thread with a stack of `bytes` and waits for it. Nothing when the
// system refused such a thread.
std::optional<int> runOnBigStack(std::size_t bytes, const std::function<int()> &body);

// Whether fewer than `margin` bytes of the current thread's stack are left. Always false
// on a thread that runOnBigStack did not start (its size is unknown).
bool stackNearlyExhausted(std::size_t margin);

} // namespace morvex::emulator

#endif
