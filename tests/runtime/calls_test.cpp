// Function calls: instance selection, the call frame, the body loop, return actions and
// their conversions, and the result slots.
#include "runtime/errors.h"
#include "runtime/routines.h"
#include "tests/runtime/event_lines.h"
#include "tests/support/test_host.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <limits>
#include <string>
#include <variant>
#include <vector>

namespace morvex::tests {
namespace {

namespace rt = morvex::runtime;

constexpr std::int32_t kIntMax = std::numeric_limits<std::int32_t>::max();
constexpr std::int32_t kIntMin = std::numeric_limits<std::int32_t>::min();

// An object declaring f and g and the member speed, with the instances a (the default)
// and b.
class Calls : public ::testing::Test {
protected:
  void SetUp() override {
    makeInstance(host, object, "a");
    makeInstance(host, object, "b");
    host.act(object, rt::setDefaultInstance, {"a"});
  }

  TestHost host;
  RunObject &object = host.create({{"f", "g"}, {"speed"}, false, false});
};

// What one slot holds.
struct Slot {
  std::int32_t integer;
  float real;
  std::string text;
};

Slot slotOf(TestHost &host, RunObject &object, std::int32_t slot) {
  return {slotInteger(host, object, slot), slotFloat(host, object, slot),
          slotString(host, object, slot)};
}

// One return action, its parameters, the requested return type, and what reaches the slot.
struct ReturnCase {
  const char *label;
  ActionFn action;
  std::vector<Param> params;
  std::int32_t returnType;
  std::variant<std::int32_t, float, std::string> expected; // of the return type's kind
};

TEST_F(Calls, ReturnActionsConvertTheirValueToTheReturnType) {
  const std::vector<ReturnCase> cases = {
      {"void as integer", rt::returnVoid, {}, 1, 0},
      {"void as float", rt::returnVoid, {}, 2, 0.0f},
      {"void as string", rt::returnVoid, {}, 3, ""},
      {"integer as integer", rt::returnInteger, {5}, 1, 5},
      {"integer as float", rt::returnInteger, {-7}, 2, -7.0f},
      {"integer 0 as string", rt::returnInteger, {0}, 3, ""},
      {"integer -12 as string", rt::returnInteger, {-12}, 3, "-12"},
      {"float -2.7 as integer", rt::returnFloat, {-2.7f}, 1, -2},
      {"3e9 as integer", rt::returnFloat, {3e9f}, 1, kIntMax},
      {"float as float", rt::returnFloat, {2.5f}, 2, 2.5f},
      {"float 3 as string", rt::returnFloat, {3.0f}, 3, "3."},
      {"float 0.05 as string", rt::returnFloat, {0.05f}, 3, "5.0000000745058e-002"},
      {"string as integer", rt::returnString, {" 42abc"}, 1, 42},
      {"missing string as integer", rt::returnString, {NullText{}}, 1, 0},
      {"string as float", rt::returnString, {"2.5x"}, 2, 2.5f},
      {"string as string", rt::returnString, {"a,b"}, 3, "a,b"},
      {"missing string as string", rt::returnString, {NullText{}}, 3, ""},
  };
  for (const ReturnCase &c : cases) {
    SCOPED_TRACE(c.label);
    host.clearLines();
    host.onFunction(object, "f", [&] { host.act(object, c.action, c.params); });
    // Stale values everywhere, so that a part left alone shows.
    object.returnValue = {99, 9.5f, "stale"};
    object.slotIntegers[0] = 98;
    object.slotFloats[0] = 8.5f;
    object.slotStrings[0] = "old";
    callFor(host, object, "a", "f", "", c.returnType, 0);
    const Slot slot = slotOf(host, object, 0);
    EXPECT_EQ(slot.integer, c.returnType == 1 ? std::get<std::int32_t>(c.expected) : 98);
    EXPECT_EQ(slot.real, c.returnType == 2 ? std::get<float>(c.expected) : 8.5f);
    EXPECT_EQ(slot.text, c.returnType == 3 ? std::get<std::string>(c.expected) : "old");
  }
}

TEST_F(Calls, OtherReturnTypesStoreNothingButAction11StillSetsTheInteger) {
  std::int32_t errors = 0;
  host.on(object, host::kOnError, [&] { ++errors; });
  for (const std::int32_t type : {0, 7, -2}) {
    SCOPED_TRACE(type);
    object.returnValue = {1, 1.5f, "x"};
    host.clearLines();
    host.onFunction(object, "f", [&] { host.act(object, rt::returnFloat, {9.5f}); });
    callFor(host, object, "a", "f", "", type, 0);
    EXPECT_EQ(object.returnValue.intValue, 1);
    EXPECT_EQ(object.returnValue.floatValue, 1.5f);
    EXPECT_EQ(object.returnValue.stringValue, "x");

    host.clearLines();
    host.onFunction(object, "f", [&] { host.act(object, rt::returnInteger, {42}); });
    callFor(host, object, "a", "f", "", type, 0);
    EXPECT_EQ(object.returnValue.intValue, 42);
    EXPECT_EQ(object.returnValue.floatValue, 1.5f);
    EXPECT_EQ(object.returnValue.stringValue, "x");
  }
  // A return type 0 or 7 with slot 0 writes no slot at all.
  EXPECT_EQ(slotOf(host, object, 0).integer, 0);
  EXPECT_EQ(errors, 0);
}

TEST_F(Calls, BadSlotRaisesError8BeforeCallingUnlessTheTypeIsVoid) {
  const auto errors = logErrors(host, object);
  int runs = 0;
  host.onFunction(object, "f", [&] {
    ++runs;
    host.act(object, rt::returnInteger, {3});
  });
  callFor(host, object, "a", "f", "", 1, 11);
  callFor(host, object, "a", "f", "", 2, -1);
  callCurrent(host, object, "f", "", 3, 11);
  callFor(host, object, "a", "f", "", 7, 11); // any type but 0 is checked
  EXPECT_EQ(*errors, (Codes{8, 8, 8, 8}));
  EXPECT_EQ(runs, 0);

  callFor(host, object, "a", "f", "", 0, 99);
  EXPECT_EQ(runs, 1);
  EXPECT_EQ(errors->size(), 4u);
  EXPECT_EQ(object.returnValue.intValue, 3);
  for (std::int32_t slot = 0; slot < rt::kSlotCount; ++slot) {
    EXPECT_EQ(slotInteger(host, object, slot), 0);
  }
}

TEST_F(Calls, RefusedCallsStillWriteTheSlotOfTheirType) {
  const auto errors = logErrors(host, object);
  host.onFunction(object, "f", [&] {
    host.act(object, rt::returnInteger, {7});
    callCurrent(host, object, "g", "", 1, 4); // after the return: error 4
  });
  host.onFunction(object, "g", [] { ADD_FAILURE() << "a refused call ran its body"; });
  callFor(host, object, "a", "f", "", 3, 1);
  EXPECT_EQ(*errors, (Codes{4}));
  EXPECT_EQ(slotInteger(host, object, 4), 7);
  EXPECT_EQ(slotString(host, object, 1), "7");

  callFor(host, object, "nobody", "g", "", 3, 2);
  callCurrent(host, object, "g", "", 1, 3); // no current instance outside every call
  EXPECT_EQ(*errors, (Codes{4, 1, 1}));
  EXPECT_EQ(slotString(host, object, 2), "7");
  EXPECT_EQ(slotInteger(host, object, 3), 7);
}

// What the running frame shows: error, instance, parameter count, local "mine" and return type.
std::string frameOf(TestHost &host, RunObject &object) {
  return std::to_string(host.eval(object, rt::currentError).integer()) + " " +
         currentInstanceName(host, object) + " " +
         std::to_string(currentParameterCount(host, object)) + " " +
         std::to_string(readLocalInt(host, object, "mine")) + " " +
         std::to_string(currentReturnType(host, object));
}

TEST_F(Calls, RefusedCallsRaiseTheirErrorInTheCallersFrame) {
  std::vector<std::string> seen;
  host.on(object, host::kOnError, [&] { seen.push_back(frameOf(host, object)); });
  host.onFunction(object, "f", [&] {
    host.act(object, rt::createLocalVariable, {"mine"});
    host.act(object, rt::setLocalInteger, {"mine", 31});
    callFor(host, object, "nobody", "g", "", 1, 0);
    host.act(object, rt::returnVoid);
    callFor(host, object, "b", "g", "", 1, 0);
  });
  host.onFunction(object, "g", [] { ADD_FAILURE() << "a refused call ran its body"; });
  callFor(host, object, "", "f", "x,y", 2, 0);
  EXPECT_EQ(seen, (std::vector<std::string>{"1 a 2 31 2", "4 a 2 31 2"}));
}

TEST(CallVerification, OnlyDeclaredNamesAreCalledWhenVerifying) {
  TestHost host;
  RunObject &object = host.create({{"double"}, {}, true, false});
  makeInstance(host, object, "a");
  const auto errors = logErrors(host, object);
  int runs = 0;
  host.onFunction(object, "double", [&] {
    ++runs;
    host.act(object, rt::returnInteger, {2 * readLocalInt(host, object, "p1")});
  });
  host.onFunction(object, "other", [&] { ++runs; });
  callFor(host, object, "a", "DOUBLE", "21", 1, 0);
  EXPECT_EQ(slotInteger(host, object, 0), 42);
  callFor(host, object, "a", "other", "", 1, 0);
  callFor(host, object, "a", NullText{}, "", 1, 0);
  callFor(host, object, "nobody", "other", "", 1, 0); // the instance is checked first
  EXPECT_EQ(*errors, (Codes{2, 2, 1}));
  EXPECT_EQ(runs, 1);

  RunObject &empty = host.create({{}, {}, true, false});
  makeInstance(host, empty, "a");
  const auto emptyErrors = logErrors(host, empty);
  callFor(host, empty, "a", "double", "", 0, 0);
  EXPECT_EQ(*emptyErrors, (Codes{2}));
}

TEST_F(Calls, WithoutVerificationAnUnhandledNameRunsNothingAndRaises11) {
  const auto errors = logErrors(host, object);
  callFor(host, object, "a", "undeclared", "", 0, 0);
  callFor(host, object, "a", NullText{}, "", 0, 0); // no name: no line can match
  EXPECT_EQ(*errors, (Codes{11, 11}));
  EXPECT_EQ(host.raised(host::kOnFunction), 2);
}

TEST_F(Calls, Error11IsRaisedInTheCalleesFrameWhereAReturnStillCounts) {
  std::vector<std::string> seen;
  host.onFunction(object, "f", [&] {
    host.act(object, rt::createLocalVariable, {"mine"});
    host.act(object, rt::setLocalInteger, {"mine", 3});
  });
  host.on(object, host::kOnError, [&] {
    seen.push_back(frameOf(host, object) + " loop " +
                   std::to_string(currentLoopNumber(host, object)));
    host.act(object, rt::returnFloat, {6.5f});
  });
  callFor(host, object, "b", "f", "x,y", 2, 5);
  EXPECT_EQ(seen, (std::vector<std::string>{"11 b 2 3 2 loop 1"}));
  EXPECT_EQ(slotFloat(host, object, 5), 6.5f);

  // The caller's frame is back.
  EXPECT_EQ(currentReturnType(host, object), -1);
  EXPECT_EQ(currentParameterCount(host, object), 0);
  EXPECT_EQ(currentLoopNumber(host, object), 0);
  EXPECT_EQ(object.functionReturned, 0);
  EXPECT_EQ(object.currentInstance, object.noInstance());
  EXPECT_EQ(object.localVariables->size(), 0);
  EXPECT_EQ(object.instances.find("b")->instanceBusy, 0);
}

TEST_F(Calls, LoopCurrentFunctionRunsTheBodyOnceMore) {
  std::vector<std::int32_t> loops;
  host.onFunction(object, "f", [&] {
    const std::int32_t loop = currentLoopNumber(host, object);
    loops.push_back(loop);
    if (loop < 2) {
      host.act(object, rt::loopCurrentFunction);
      host.act(object, rt::loopCurrentFunction); // asking twice is asking once
    } else {
      host.act(object, rt::returnInteger, {loop});
    }
  });
  callFor(host, object, "a", "f", "", 1, 0);
  EXPECT_EQ(loops, (Codes{0, 1, 2}));
  EXPECT_EQ(slotInteger(host, object, 0), 2);
  EXPECT_EQ(host.raised(host::kOnFunction), 3);
}

TEST_F(Calls, LoopRequestedOutsideACallDoesNotCarryIntoOne) {
  int runs = 0;
  host.onFunction(object, "f", [&] {
    ++runs;
    host.act(object, rt::returnVoid);
  });
  host.act(object, rt::loopCurrentFunction);
  callFor(host, object, "a", "f");
  EXPECT_EQ(runs, 1);
  EXPECT_EQ(object.loopRequested, 1);
}

TEST(CallLoopOption, TheBodyRunsUntilItReturns) {
  TestHost host;
  RunObject &object = host.create({{}, {}, false, true});
  makeInstance(host, object, "a");
  const auto errors = logErrors(host, object);
  std::vector<std::int32_t> loops;
  host.onFunction(object, "f", [&] {
    loops.push_back(currentLoopNumber(host, object));
    if (loops.size() == 4) {
      host.act(object, rt::returnInteger, {9});
    }
  });
  callFor(host, object, "a", "f", "", 1, 0);
  EXPECT_EQ(loops, (Codes{0, 1, 2, 3}));
  EXPECT_EQ(slotInteger(host, object, 0), 9);
  EXPECT_TRUE(errors->empty());
}

TEST_F(Calls, LinesAfterTheReturningLineNoLongerMatch) {
  int secondRuns = 0;
  host.onFunction(object, "f", [&] { host.act(object, rt::returnInteger, {1}); });
  host.onFunction(object, "f", [&] {
    ++secondRuns;
    host.act(object, rt::returnInteger, {2});
  });
  callFor(host, object, "a", "f", "", 1, 0);
  EXPECT_EQ(slotInteger(host, object, 0), 1);
  EXPECT_EQ(secondRuns, 0);
}

TEST_F(Calls, OnFunctionMatchesTheRunningNameIgnoringCaseUntilItReturns) {
  std::vector<bool> answers;
  host.onFunction(object, "f", [&] {
    answers.push_back(host.test(object, rt::onFunction, {"F"}));
    answers.push_back(host.test(object, rt::onFunction, {"g"}));
    answers.push_back(host.test(object, rt::onFunction, {NullText{}}));
    host.act(object, rt::returnVoid);
    answers.push_back(host.test(object, rt::onFunction, {"f"}));
  });
  callFor(host, object, "a", "f");
  EXPECT_EQ(answers, (std::vector<bool>{true, false, false, false}));
  EXPECT_FALSE(host.test(object, rt::onFunction, {"f"}));
  EXPECT_TRUE(host.test(object, rt::alwaysTrue));
}

TEST_F(Calls, NestedCallOnAnotherInstanceLeavesTheCallersFrameAsItWas) {
  std::vector<std::string> log;
  host.onFunction(object, "g", [&] {
    log.push_back("g in " + currentInstanceName(host, object));
    EXPECT_EQ(readLocalInt(host, object, "own"), 0);
    EXPECT_EQ(expressionErrorOf(host, object), rt::kNoSuchVariable);
    EXPECT_EQ(currentParameterCount(host, object), 1);
    EXPECT_EQ(currentReturnType(host, object), 1);
    host.act(object, rt::returnInteger, {77});
  });
  host.onFunction(object, "f", [&] {
    host.act(object, rt::createLocalVariable, {"own"});
    host.act(object, rt::setLocalInteger, {"own", 5});
    host.act(object, rt::loopCurrentFunction);
    callFor(host, object, "b", "g", "1", 1, 1);
    log.push_back("f in " + currentInstanceName(host, object));
    EXPECT_EQ(currentParameterCount(host, object), 3);
    EXPECT_EQ(readLocalInt(host, object, "p1"), 10);
    EXPECT_EQ(readLocalInt(host, object, "own"), 5);
    EXPECT_EQ(currentReturnType(host, object), 3);
    EXPECT_EQ(currentLoopNumber(host, object), 0);
    EXPECT_EQ(object.loopRequested, 1); // f's own request survives g
    host.act(object, rt::returnString, {"done"});
  });
  const auto errors = logErrors(host, object);
  callFor(host, object, "a", "f", "10,20,30", 3, 2);
  EXPECT_EQ(log, (std::vector<std::string>{"g in b", "f in a"}));
  EXPECT_EQ(slotInteger(host, object, 1), 77);
  EXPECT_EQ(slotString(host, object, 2), "done");
  EXPECT_TRUE(errors->empty());
  EXPECT_EQ(host.raised(host::kOnFunction), 2); // f returned: its loop request is moot
}

TEST_F(Calls, ReturnActionsRefuseOutsideCallsWith9AndAfterTheReturnWith10) {
  const auto errors = logErrors(host, object);
  object.returnValue = {1, 2.0f, "three"};
  host.act(object, rt::returnVoid);
  host.act(object, rt::returnInteger, {5});
  host.act(object, rt::returnFloat, {5.0f});
  host.act(object, rt::returnString, {"5"});
  EXPECT_EQ(*errors, (Codes{9, 9, 9, 9}));
  EXPECT_EQ(object.returnValue.intValue, 1);
  EXPECT_EQ(object.returnValue.floatValue, 2.0f);
  EXPECT_EQ(object.returnValue.stringValue, "three");
  EXPECT_EQ(object.functionReturned, 0);

  errors->clear();
  host.onFunction(object, "f", [&] {
    host.act(object, rt::returnInteger, {1});
    host.act(object, rt::returnVoid);
    host.act(object, rt::returnInteger, {2});
    host.act(object, rt::returnFloat, {2.0f});
    host.act(object, rt::returnString, {"2"});
  });
  callFor(host, object, "a", "f", "", 1, 0);
  EXPECT_EQ(*errors, (Codes{10, 10, 10, 10}));
  EXPECT_EQ(slotInteger(host, object, 0), 1);
}

TEST_F(Calls, SlotExpressionsCheckTheNumberAndMarkTheirTypeEvenWhenFailing) {
  const auto errors = logErrors(host, object);
  const Result integer = host.eval(object, rt::integerSlot, {-1});
  EXPECT_EQ(integer.integer(), 0);
  EXPECT_EQ(integer.flags, 0);
  EXPECT_EQ(expressionErrorOf(host, object), 8);

  host.act(object, rt::clearExpressionErrorCode);
  const Result real = host.eval(object, rt::floatSlot, {11});
  EXPECT_EQ(real.real(), 0.0f);
  EXPECT_TRUE(real.isFloat());
  EXPECT_FALSE(real.isString());
  EXPECT_EQ(expressionErrorOf(host, object), 8);

  host.act(object, rt::clearExpressionErrorCode);
  const Result text = host.eval(object, rt::stringSlot, {kIntMin});
  EXPECT_EQ(text.text(), "");
  EXPECT_TRUE(text.isString());
  EXPECT_FALSE(text.isFloat());
  EXPECT_EQ(expressionErrorOf(host, object), 8);

  // Success marks the same bits and leaves the error code alone.
  EXPECT_TRUE(host.eval(object, rt::floatSlot, {10}).isFloat());
  EXPECT_TRUE(host.eval(object, rt::stringSlot, {0}).isString());
  EXPECT_EQ(host.eval(object, rt::integerSlot, {10}).flags, 0);
  EXPECT_EQ(expressionErrorOf(host, object), 8);
  EXPECT_TRUE(errors->empty());
}

TEST_F(Calls, CallInformationDescribesTheRunningCall) {
  std::vector<std::int32_t> seen;
  host.onFunction(object, "f", [&] {
    seen.push_back(currentReturnType(host, object));
    seen.push_back(currentParameterCount(host, object));
    host.act(object, rt::returnVoid);
  });
  callFor(host, object, "a", "f", "p,q,r", 3, 0);
  callFor(host, object, "a", "f", NullText{}, 0, 0);
  EXPECT_EQ(seen, (Codes{3, 3, 0, 0}));
}

TEST_F(Calls, TheInstanceIsChosenByNameByDefaultOrAsTheCurrentOne) {
  std::vector<std::string> instances;
  host.onFunction(object, "f", [&] {
    instances.push_back(currentInstanceName(host, object));
    if (readLocalInt(host, object, "p1") == 1) {
      callCurrent(host, object, "f", "2");
    }
    host.act(object, rt::returnVoid);
  });
  const auto errors = logErrors(host, object);
  callFor(host, object, "B", "f", "1");
  callFor(host, object, "", "f");
  callFor(host, object, NullText{}, "f");
  EXPECT_EQ(instances, (std::vector<std::string>{"b", "b", "a", "a"}));
  EXPECT_TRUE(errors->empty());

  host.act(object, rt::destroyInstance, {"a"}); // the default instance
  callFor(host, object, "", "f");
  EXPECT_EQ(*errors, (Codes{1}));
}

TEST_F(Calls, ACallKeepsItsOwnCopyOfTheFunctionName) {
  // The host may reuse its parameter texts while the body runs: the body's later lines
  // still match the name the call was made with.
  int runs = 0;
  host.onFunction(object, "f", [&] {
    ++runs;
    host.overwriteText(1, std::string(200, 'x'));
  });
  host.onFunction(object, "f", [&] {
    ++runs;
    host.act(object, rt::returnInteger, {4});
  });
  callFor(host, object, "a", "f", "", 1, 0);
  EXPECT_EQ(runs, 2);
  EXPECT_EQ(slotInteger(host, object, 0), 4);
}

} // namespace
} // namespace morvex::tests
