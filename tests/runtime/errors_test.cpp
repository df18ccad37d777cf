// Raising errors on both sides, and reading them from events.
#include "runtime/errors.h"
#include "runtime/routines.h"
#include "tests/support/test_host.h"

#include <gtest/gtest.h>

namespace morvex::tests {
namespace {

using namespace morvex::runtime;

TEST(Errors, ActionErrorRunsOnErrorWithItsCodeThenClearsIt) {
  TestHost host;
  RunObject &object = host.create();
  std::vector<std::int32_t> seen;
  host.on(object, host::kOnError, [&] { seen.push_back(host.eval(object, currentError).integer()); });
  host.act(object, generateError, {-5});
  host.act(object, generateError, {0});
  EXPECT_EQ(seen, (std::vector<std::int32_t>{-5, 0}));
  EXPECT_EQ(host.eval(object, currentError).integer(), 0);
  EXPECT_EQ(host.raised(host::kOnError), 2);
}

TEST(Errors, NestedErrorLeavesZeroForTheRestOfTheOuterHandler) {
  TestHost host;
  RunObject &object = host.create();
  std::vector<std::int32_t> seen;
  host.on(object, host::kOnError, [&] {
    const std::int32_t code = host.eval(object, currentError).integer();
    seen.push_back(code);
    if (code == 7) {
      host.act(object, generateError, {9});
      seen.push_back(host.eval(object, currentError).integer());
    }
  });
  host.act(object, generateError, {7});
  EXPECT_EQ(seen, (std::vector<std::int32_t>{7, 9, 0}));
}

TEST(Errors, ExpressionErrorsOnlyRecordTheirCodeUntilCleared) {
  TestHost host;
  RunObject &object = host.create();
  RunObject &other = host.create();
  host.on(object, host::kOnError, [] { FAIL() << "an expression error ran On Error"; });
  raiseExpressionError(object, 3);
  raiseExpressionError(object, 1);
  EXPECT_EQ(host.eval(object, expressionError).integer(), 1);
  EXPECT_EQ(host.eval(object, currentError).integer(), 0);
  EXPECT_EQ(host.eval(other, expressionError).integer(), 0);
  // Only the low 8 bits of the flag count: 0x100 is the action side.
  raiseError(other, 4, 0x100);
  EXPECT_EQ(host.eval(other, expressionError).integer(), 0);
  host.act(object, clearExpressionErrorCode);
  EXPECT_EQ(host.eval(object, expressionError).integer(), 0);
}

} // namespace
} // namespace morvex::tests
