// A thread with a large stack, for deep recursion in tests.
#include "tests/support/large_stack.h"

#include <gtest/gtest.h>

#include <pthread.h>

namespace morvex::tests {
namespace {

void *runWork(void *work) {
  (*static_cast<const std::function<void()> *>(work))();
  return nullptr;
}

} // namespace

void runOnLargeStack(const std::function<void()> &work, std::size_t stackBytes) {
  pthread_attr_t attributes;
  ASSERT_EQ(pthread_attr_init(&attributes), 0);
  ASSERT_EQ(pthread_attr_setstacksize(&attributes, stackBytes), 0);
  pthread_t thread;
  const int created =
      pthread_create(&thread, &attributes, runWork, const_cast<std::function<void()> *>(&work));
  pthread_attr_destroy(&attributes);
  ASSERT_EQ(created, 0);
  ASSERT_EQ(pthread_join(thread, nullptr), 0);
}

} // namespace morvex::tests
