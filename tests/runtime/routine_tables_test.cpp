// The routine tables: every code reaches the routine the host means by it, driven only
// by code, the way the host drives the extension.
#include "runtime/routine_tables.h"
#include "tests/support/test_host.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <vector>

namespace morvex::tests {
namespace {

namespace rt = morvex::runtime;

// Codes as the host numbers them; the conditions' are those of the host contract.
enum Action {
  kCallForInstance = 0,
  kSetMemberInteger = 1,
  kSetMemberFloat = 2,
  kSetMemberString = 3,
  kCallForCurrent = 4,
  kSetCurrentInteger = 5,
  kSetCurrentFloat = 6,
  kSetCurrentString = 7,
  kCreateInstance = 8,
  kDestroyInstance = 9,
  kReturnVoid = 10,
  kReturnInteger = 11,
  kReturnFloat = 12,
  kReturnString = 13,
  kCreateGlobal = 14,
  kSetGlobalInteger = 15,
  kSetGlobalFloat = 16,
  kSetGlobalString = 17,
  kCreateLocal = 18,
  kSetLocalInteger = 19,
  kSetLocalFloat = 20,
  kSetLocalString = 21,
  kClearExpressionError = 22,
  kLoopCurrentFunction = 23,
  kSetDefaultInstance = 24,
  kGenerateError = 25,
  kDestroyAll = 26,
  kCountAllSelected = 27,
};
enum Expression {
  kIntegerSlot = 0,
  kFloatSlot = 1,
  kStringSlot = 2,
  kIntOfInstance = 3,
  kFloatOfInstance = 4,
  kStringOfInstance = 5,
  kIntOfCurrent = 6,
  kFloatOfCurrent = 7,
  kStringOfCurrent = 8,
  kGlobalInt = 9,
  kGlobalFloat = 10,
  kGlobalString = 11,
  kLocalInt = 12,
  kLocalFloat = 13,
  kLocalString = 14,
  kFunctionLoopNumber = 15,
  kError = 16,
  kFormatString = 17,
  kUnformatString = 18,
  kInstanceName = 19,
  kReturnType = 20,
  kExpressionError = 21,
  kParameterCount = 22,
  kObjectVersion = 23,
  kCountSelected = 24,
};

class ByCode : public ::testing::Test {
protected:
  std::int32_t integer(int code, std::vector<Param> params = {}) {
    const Result result = host.evalByCode(object, code, std::move(params));
    EXPECT_EQ(result.flags, 0) << "expression " << code;
    return result.integer();
  }
  float real(int code, std::vector<Param> params = {}) {
    const Result result = host.evalByCode(object, code, std::move(params));
    EXPECT_EQ(result.flags, host::kFloatResult) << "expression " << code;
    return result.real();
  }
  std::string text(int code, std::vector<Param> params = {}) {
    const Result result = host.evalByCode(object, code, std::move(params));
    EXPECT_EQ(result.flags, host::kStringResult) << "expression " << code;
    return result.text();
  }

  TestHost host;
  RunObject &object = host.create({{"f", "g"}, {"hp"}, false, false});
};

TEST_F(ByCode, ConditionsAnswerOneOrZero) {
  EXPECT_TRUE(host.testByCode(object, host::kOnError));
  EXPECT_TRUE(host.testByCode(object, host::kOnCreation));
  EXPECT_TRUE(host.testByCode(object, host::kOnDestruction));
  EXPECT_FALSE(host.testByCode(object, host::kOnFunction, {"f"}));
}

TEST_F(ByCode, InstancesAndMembers) {
  std::vector<std::string> events;
  host.on(object, host::kOnCreation, [&] {
    events.push_back("create " + text(kInstanceName) + " with " +
                     std::to_string(integer(kParameterCount)));
    const std::int32_t p1 = integer(kLocalInt, {"p1"});
    host.actByCode(object, kSetCurrentInteger, {"hp", p1});
    host.actByCode(object, kSetCurrentFloat, {"hp", 0.5f});
    host.actByCode(object, kSetCurrentString, {"hp", "full"});
    EXPECT_EQ(integer(kIntOfCurrent, {"hp"}), p1);
    EXPECT_EQ(real(kFloatOfCurrent, {"hp"}), 0.5f);
    EXPECT_EQ(text(kStringOfCurrent, {"hp"}), "full");
  });
  host.on(object, host::kOnDestruction,
          [&] { events.push_back("destroy " + text(kInstanceName)); });
  host.actByCode(object, kCreateInstance, {"a", "7"});
  host.actByCode(object, kCreateInstance, {"b", ""});
  host.actByCode(object, kCreateInstance, {"c", ""});
  host.actByCode(object, kSetMemberInteger, {"b", "hp", 1});
  host.actByCode(object, kSetMemberFloat, {"b", "hp", 1.5f});
  host.actByCode(object, kSetMemberString, {"b", "hp", "one"});
  host.actByCode(object, kSetDefaultInstance, {"b"});
  EXPECT_EQ(integer(kIntOfInstance, {"", "hp"}), 1);
  EXPECT_EQ(real(kFloatOfInstance, {"b", "hp"}), 1.5f);
  EXPECT_EQ(text(kStringOfInstance, {"a", "hp"}), "full");
  EXPECT_EQ(integer(kIntOfInstance, {"a", "hp"}), 7);
  host.actByCode(object, kDestroyInstance, {"a"});
  host.actByCode(object, kDestroyAll);
  EXPECT_EQ(events,
            (std::vector<std::string>{"create a with 1", "create b with 0", "create c with 0",
                                      "destroy a", "destroy b", "destroy c"}));
}

TEST_F(ByCode, CallsReturnsAndSlots) {
  host.actByCode(object, kCreateInstance, {"a", ""});
  std::vector<std::int32_t> loops;
  host.onFunction(object, "f", [&] {
    EXPECT_TRUE(host.testByCode(object, host::kOnFunction, {"F"}));
    loops.push_back(integer(kFunctionLoopNumber));
    if (loops.size() == 1) {
      host.actByCode(object, kLoopCurrentFunction);
      return;
    }
    EXPECT_EQ(integer(kReturnType), 1);
    host.actByCode(object, kCallForCurrent, {"g", "x", 3, 1});
    host.actByCode(object, kReturnInteger, {5});
  });
  host.onFunction(object, "g", [&] {
    if (integer(kReturnType) == 3) {
      host.actByCode(object, kReturnString, {text(kLocalString, {"p1"})});
    } else if (integer(kReturnType) == 2) {
      host.actByCode(object, kReturnFloat, {2.5f});
    } else {
      host.actByCode(object, kReturnVoid);
    }
  });
  host.actByCode(object, kCallForInstance, {"a", "f", "", 1, 0});
  host.actByCode(object, kCallForInstance, {"a", "g", "", 2, 2});
  host.actByCode(object, kCallForInstance, {"a", "g", "", 1, 3});
  EXPECT_EQ(loops, (std::vector<std::int32_t>{0, 1}));
  EXPECT_EQ(integer(kIntegerSlot, {0}), 5);
  EXPECT_EQ(text(kStringSlot, {1}), "x");
  EXPECT_EQ(real(kFloatSlot, {2}), 2.5f);
  EXPECT_EQ(integer(kIntegerSlot, {3}), 0);
  EXPECT_EQ(integer(kReturnType), -1);
}

TEST_F(ByCode, Variables) {
  host.actByCode(object, kCreateGlobal, {"score"});
  host.actByCode(object, kSetGlobalInteger, {"score", 3});
  host.actByCode(object, kSetGlobalFloat, {"score", 0.25f});
  host.actByCode(object, kSetGlobalString, {"score", "three"});
  EXPECT_EQ(integer(kGlobalInt, {"SCORE"}), 3);
  EXPECT_EQ(real(kGlobalFloat, {"score"}), 0.25f);
  EXPECT_EQ(text(kGlobalString, {"score"}), "three");
  host.actByCode(object, kCreateLocal, {"n"});
  host.actByCode(object, kSetLocalInteger, {"n", 4});
  host.actByCode(object, kSetLocalFloat, {"n", 0.75f});
  host.actByCode(object, kSetLocalString, {"n", "four"});
  EXPECT_EQ(integer(kLocalInt, {"n"}), 4);
  EXPECT_EQ(real(kLocalFloat, {"n"}), 0.75f);
  EXPECT_EQ(text(kLocalString, {"n"}), "four");
}

TEST_F(ByCode, ErrorsTextsAndTheRest) {
  std::vector<std::int32_t> seen;
  host.on(object, host::kOnError, [&] { seen.push_back(integer(kError)); });
  host.actByCode(object, kGenerateError, {77});
  EXPECT_EQ(seen, (std::vector<std::int32_t>{77}));
  EXPECT_EQ(integer(kIntegerSlot, {-1}), 0);
  EXPECT_EQ(integer(kExpressionError), 8);
  host.actByCode(object, kClearExpressionError);
  EXPECT_EQ(integer(kExpressionError), 0);
  EXPECT_EQ(text(kFormatString, {"a,b"}), "a\\,b");
  EXPECT_EQ(text(kUnformatString, {"a\\,b"}), "a,b");
  EXPECT_FLOAT_EQ(real(kObjectVersion), 1.06f);
  host.actByCode(object, kCountAllSelected);
  EXPECT_EQ(integer(kCountSelected, {0}), 0); // the host has no object slots
  EXPECT_EQ(integer(kExpressionError), 15);
  EXPECT_EQ(seen.size(), 1u);
}

} // namespace
} // namespace morvex::tests
