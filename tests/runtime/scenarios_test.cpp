// Re-entrant scenarios written as event sheets: deep recursion, calls nested in events and
// events nested in calls, and variables seen across them.
#include "runtime/errors.h"
#include "runtime/routines.h"
#include "tests/runtime/event_lines.h"
#include "tests/support/large_stack.h"
#include "tests/support/test_host.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <string>
#include <vector>

namespace morvex::tests {
namespace {

namespace rt = morvex::runtime;

constexpr std::int32_t kDepth = 1500;

// sum(n) = n + sum(n - 1), every level checking that its own frame survives the level
// below it and that its instance cannot be destroyed.
TEST(Recursion, ThousandsOfLevelsOnOneInstanceKeepEachLevelsFrame) {
  runOnLargeStack([] {
    TestHost host;
    RunObject &object = host.create({{"sum"}, {}, true, false});
    makeInstance(host, object, "a");
    const auto errors = logErrors(host, object);
    int levels = 0;
    int deepest = 0;
    host.onFunction(object, "sum", [&] {
      ++levels;
      deepest = std::max(deepest, host.depth());
      const std::int32_t n = readLocalInt(host, object, "p1");
      host.act(object, rt::createLocalVariable, {"twice"});
      host.act(object, rt::setLocalInteger, {"twice", 2 * n});
      host.act(object, rt::destroyInstance, {"a"});
      std::int32_t below = 0;
      if (n > 0) {
        callCurrent(host, object, "sum", std::to_string(n - 1), 1, 0);
        below = slotInteger(host, object, 0);
        host.act(object, rt::destroyInstance, {"a"}); // still busy after the inner call
      }
      if (readLocalInt(host, object, "p1") != n ||
          readLocalString(host, object, "p1") != std::to_string(n) ||
          readLocalInt(host, object, "twice") != 2 * n ||
          currentParameterCount(host, object) != 1 || currentInstanceName(host, object) != "a" ||
          currentReturnType(host, object) != 1 || currentLoopNumber(host, object) != 0) {
        ADD_FAILURE() << "the frame of level " << n << " changed";
      }
      host.act(object, rt::returnInteger, {n + below});
    });
    callFor(host, object, "a", "sum", std::to_string(kDepth), 1, 0);

    EXPECT_EQ(slotInteger(host, object, 0), kDepth * (kDepth + 1) / 2);
    EXPECT_EQ(levels, kDepth + 1);
    EXPECT_GT(deepest, kDepth);
    // Error 5 at every level before and after its inner call, and nothing else.
    EXPECT_EQ(*errors, Codes(static_cast<std::size_t>(2 * kDepth + 1), rt::kInstanceBusy));
    EXPECT_EQ(object.instances.find("a")->instanceBusy, 0);
    EXPECT_EQ(currentReturnType(host, object), -1);
    EXPECT_EQ(object.localVariables->size(), 0);
    host.act(object, rt::destroyInstance, {"a"});
    EXPECT_EQ(object.instances.size(), 0);
  });
}

TEST(VariableScopes, LocalsBelongToTheirCallAndGoWithIt) {
  TestHost host;
  RunObject &object = host.create();
  makeInstance(host, object, "a");
  const auto errors = logErrors(host, object);
  host.act(object, rt::createLocalVariable, {"outer"});
  host.act(object, rt::setLocalInteger, {"outer", 1});
  host.onFunction(object, "g", [&] {
    EXPECT_EQ(readLocalInt(host, object, "inner"), 0);
    EXPECT_EQ(expressionErrorOf(host, object), rt::kNoSuchVariable);
    host.act(object, rt::createLocalVariable, {"inner"}); // its own list: no error 7
    host.act(object, rt::setLocalInteger, {"inner", 99});
    host.act(object, rt::returnVoid);
  });
  host.onFunction(object, "f", [&] {
    host.act(object, rt::clearExpressionErrorCode);
    EXPECT_EQ(readLocalInt(host, object, "outer"), 0);
    EXPECT_EQ(expressionErrorOf(host, object), rt::kNoSuchVariable);
    host.act(object, rt::createLocalVariable, {"inner"});
    host.act(object, rt::setLocalInteger, {"inner", 2});
    callCurrent(host, object, "g");
    EXPECT_EQ(readLocalInt(host, object, "inner"), 2);
    host.act(object, rt::returnVoid);
  });
  callFor(host, object, "a", "f");
  callFor(host, object, "a", "f"); // "inner" went with the first call: no error 7
  EXPECT_TRUE(errors->empty());
  EXPECT_EQ(readLocalInt(host, object, "outer"), 1);
  EXPECT_EQ(object.localVariables->size(), 1);
}

TEST(NestedEvents, EventsInsideARunningBodyRefuseReturnsWith9AndMayAskForALoop) {
  TestHost host;
  RunObject &object = host.create();
  makeInstance(host, object, "a");
  const auto errors = logErrors(host, object);
  std::vector<std::string> log;
  host.on(object, host::kOnCreation, [&] {
    log.push_back("created in run " + std::to_string(object.loopNumber));
    EXPECT_EQ(currentReturnType(host, object), -1);
    host.act(object, rt::returnInteger, {1});
    host.act(object, rt::loopCurrentFunction); // asks the running body for one more run
  });
  host.on(object, host::kOnDestruction, [&] {
    host.act(object, rt::returnVoid);
    EXPECT_EQ(currentInstanceName(host, object), "temp");
  });
  host.onFunction(object, "f", [&] {
    const std::int32_t run = currentLoopNumber(host, object);
    log.push_back("run " + std::to_string(run));
    if (run == 0) {
      makeInstance(host, object, "temp");
      host.act(object, rt::destroyInstance, {"temp"});
      EXPECT_EQ(currentReturnType(host, object), 2);
      EXPECT_EQ(currentInstanceName(host, object), "a");
      return;
    }
    host.act(object, rt::returnFloat, {0.5f});
  });
  callFor(host, object, "a", "f", "", 2, 0);
  EXPECT_EQ(log, (std::vector<std::string>{"run 0", "created in run 0", "run 1"}));
  EXPECT_EQ(*errors, (Codes{9, 9}));
  EXPECT_EQ(slotFloat(host, object, 0), 0.5f);
}

TEST(NestedEvents, EventsAfterTheBodyReturnedSeeItReturned) {
  TestHost host;
  RunObject &object = host.create();
  makeInstance(host, object, "a");
  const auto errors = logErrors(host, object);
  auto lateLines = [&] {
    host.act(object, rt::returnVoid);          // 10, not 9
    callCurrent(host, object, "g");            // 4
    host.act(object, rt::loopCurrentFunction); // 12
  };
  host.on(object, host::kOnCreation, lateLines);
  host.on(object, host::kOnDestruction, lateLines);
  int runs = 0;
  host.onFunction(object, "f", [&] {
    ++runs;
    host.act(object, rt::returnInteger, {3});
    makeInstance(host, object, "late");
    host.act(object, rt::destroyInstance, {"late"});
  });
  host.onFunction(object, "g", [] { ADD_FAILURE() << "a call after the return ran"; });
  callFor(host, object, "a", "f", "", 1, 0);
  EXPECT_EQ(*errors, (Codes{10, 4, 12, 10, 4, 12}));
  EXPECT_EQ(runs, 1);
  EXPECT_EQ(slotInteger(host, object, 0), 3);
}

} // namespace
} // namespace morvex::tests
