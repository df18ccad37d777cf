// A thread with a chosen stack size: pthreads on POSIX systems, _beginthreadex on Windows.
#include "emulator/big_stack.h"

#include <cstdint>

#if defined(_WIN32)
#include <process.h>
#include <windows.h>
#else
#include <pthread.h>
#endif

namespace morvex::emulator {

namespace {

// Where the current thread's stack began and how large it is; zero size when unknown.
thread_local std::uintptr_t tStackBase = 0;
thread_local std::size_t tStackSize = 0;

struct ThreadWork {
  const std::function<int()> *body;
  std::size_t size;
  int result;
};

std::uintptr_t currentFrame() {
  return reinterpret_cast<std::uintptr_t>(__builtin_frame_address(0));
}

void runWork(ThreadWork &work) {
  tStackBase = currentFrame();
  tStackSize = work.size;
  work.result = (*work.body)();
  tStackSize = 0;
}

#if defined(_WIN32)
unsigned __stdcall threadEntry(void *argument) {
  runWork(*static_cast<ThreadWork *>(argument));
  return 0;
}
#else
void *threadEntry(void *argument) {
  runWork(*static_cast<ThreadWork *>(argument));
  return nullptr;
}
#endif

} // namespace

std::optional<int> runOnBigStack(std::size_t bytes, const std::function<int()> &body) {
  ThreadWork work{&body, bytes, 0};
#if defined(_WIN32)
  const std::uintptr_t handle = _beginthreadex(nullptr, static_cast<unsigned>(bytes), threadEntry,
                                               &work, STACK_SIZE_PARAM_IS_A_RESERVATION, nullptr);
  if (handle == 0) {
    return std::nullopt;
  }
  WaitForSingleObject(reinterpret_cast<HANDLE>(handle), INFINITE);
  CloseHandle(reinterpret_cast<HANDLE>(handle));
#else
  pthread_attr_t attributes;
  if (pthread_attr_init(&attributes) != 0) {
    return std::nullopt;
  }
  pthread_t thread;
  const bool started = pthread_attr_setstacksize(&attributes, bytes) == 0 &&
                       pthread_create(&thread, &attributes, threadEntry, &work) == 0;
  pthread_attr_destroy(&attributes);
  if (!started) {
    return std::nullopt;
  }
  pthread_join(thread, nullptr);
#endif
  return work.result;
}

bool stackNearlyExhausted(std::size_t margin) {
  if (tStackSize == 0) {
    return false;
  }
  // Stacks grow downwards on every platform the host runs on.
  const std::uintptr_t used = tStackBase - currentFrame();
  return used + margin > tStackSize;
}

} // namespace morvex::emulator
