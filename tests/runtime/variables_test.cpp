// Global and local variables: creating, setting and reading their three independent parts,
// and the errors for existing and missing names.
#include "runtime/errors.h"
#include "runtime/routines.h"
#include "runtime/variables.h"
#include "tests/support/test_host.h"

#include <gtest/gtest.h>

#include <cstring>
#include <limits>
#include <string>
#include <vector>

namespace morvex::tests {
namespace {

using namespace morvex::runtime;

std::uint32_t bitsOf(float value) {
  std::uint32_t bits = 0;
  std::memcpy(&bits, &value, sizeof bits);
  return bits;
}

// An object whose "On Error" lines record every code they see.
class Variables : public ::testing::Test {
protected:
  TestHost host;
  RunObject &object = host.create();
  std::vector<std::int32_t> errors;

  void SetUp() override {
    host.on(object, host::kOnError,
            [this] { errors.push_back(host.eval(object, currentError).integer()); });
  }
};

TEST_F(Variables, GlobalNamesIgnoreCaseAndThePartsStayApart) {
  host.act(object, createGlobalVariable, {"Score"});
  host.act(object, setGlobalInteger, {"Score", 5});
  EXPECT_EQ(host.eval(object, globalInt, {"SCORE"}).integer(), 5);

  host.act(object, createGlobalVariable, {"text"});
  host.act(object, setGlobalString, {"text", "5"});
  EXPECT_EQ(host.eval(object, globalInt, {"text"}).integer(), 0);
  EXPECT_EQ(host.eval(object, globalFloat, {"text"}).real(), 0.0f);
  EXPECT_EQ(host.eval(object, globalString, {"Text"}).text(), "5");

  host.act(object, setGlobalFloat, {"Score", 2.5f});
  EXPECT_EQ(host.eval(object, globalInt, {"score"}).integer(), 5);
  EXPECT_EQ(host.eval(object, globalFloat, {"score"}).real(), 2.5f);
  EXPECT_TRUE(errors.empty());
  EXPECT_EQ(object.expressionErrorCode, 0);
}

TEST_F(Variables, CreatingAnExistingNameRaisesSevenAndKeepsTheValues) {
  host.act(object, createGlobalVariable, {"lives"});
  host.act(object, setGlobalInteger, {"lives", 3});
  host.act(object, setGlobalString, {"lives", "three"});
  host.act(object, createGlobalVariable, {"LIVES"});
  host.act(object, createLocalVariable, {"mine"});
  host.act(object, createLocalVariable, {"Mine"});
  EXPECT_EQ(errors, (std::vector<std::int32_t>{kVariableExists, kVariableExists}));
  EXPECT_EQ(host.eval(object, globalInt, {"lives"}).integer(), 3);
  EXPECT_EQ(host.eval(object, globalString, {"lives"}).text(), "three");
  EXPECT_EQ(globalVariables().size(), 1);
  EXPECT_EQ(object.localVariables->size(), 1);
}

TEST_F(Variables, SettingAMissingVariableRaisesThreeAndCreatesNothing) {
  host.act(object, setLocalFloat, {"ghost", 1.5f});
  host.act(object, setLocalInteger, {"ghost", 1});
  host.act(object, setLocalString, {"ghost", "x"});
  host.act(object, setGlobalInteger, {"ghost", 1});
  host.act(object, setGlobalFloat, {"ghost", 1.5f});
  host.act(object, setGlobalString, {"ghost", "x"});
  EXPECT_EQ(errors, std::vector<std::int32_t>(6, kNoSuchVariable));
  EXPECT_EQ(object.localVariables->size(), 0);
  EXPECT_EQ(globalVariables().size(), 0);
}

TEST_F(Variables, ReadingAMissingVariableGivesAnEmptyResultOfItsType) {
  const Result text = host.eval(object, globalString, {"nothing"});
  EXPECT_TRUE(text.isString());
  EXPECT_EQ(text.text(), "");
  EXPECT_EQ(object.expressionErrorCode, kNoSuchVariable);
  object.expressionErrorCode = 0;
  const Result integer = host.eval(object, localInt, {"nothing"});
  EXPECT_EQ(integer.word, 0);
  EXPECT_EQ(integer.flags, 0);
  EXPECT_EQ(object.expressionErrorCode, kNoSuchVariable);
  object.expressionErrorCode = 0;
  EXPECT_EQ(host.eval(object, localString, {NullText{}}).text(), "");
  EXPECT_EQ(host.eval(object, globalFloat, {NullText{}}).flags, host::kFloatResult);
  EXPECT_EQ(object.expressionErrorCode, kNoSuchVariable);
  EXPECT_TRUE(errors.empty()); // expression errors run no "On Error" lines
}

TEST_F(Variables, FloatsAreStoredAndGivenBackBitForBit) {
  host.act(object, createGlobalVariable, {"f"});
  for (const float value : {1.1f, -0.0f, std::numeric_limits<float>::denorm_min(), -123.456f}) {
    host.act(object, setGlobalFloat, {"f", value});
    const Result read = host.eval(object, globalFloat, {"f"});
    EXPECT_EQ(static_cast<std::uint32_t>(read.word), bitsOf(value));
  }
  // A signalling NaN, as the host may hand one over, keeps its payload too.
  constexpr HostWord kSignallingNaN = 0x7FA00001;
  setVariable(object, globalVariables(), "f", kSignallingNaN, kFloatPart);
  EXPECT_EQ(getVariable(object, globalVariables(), "F", kFloatPart), kSignallingNaN);
  // The second parameter is fetched as a float: an integer expression arrives converted.
  host.act(object, createLocalVariable, {"g"});
  host.act(object, setLocalFloat, {"g", 3});
  EXPECT_EQ(host.eval(object, localFloat, {"g"}).real(), 3.0f);
}

TEST_F(Variables, MissingTextsCountAsEmpty) {
  // A missing name is the empty name, which is a valid variable name.
  host.act(object, createGlobalVariable, {NullText{}});
  host.act(object, setGlobalInteger, {"", 9});
  EXPECT_EQ(host.eval(object, globalInt, {NullText{}}).integer(), 9);
  host.act(object, createGlobalVariable, {""});
  EXPECT_EQ(errors, (std::vector<std::int32_t>{kVariableExists}));

  host.act(object, setGlobalString, {"", "old"});
  host.act(object, setGlobalString, {"", NullText{}});
  const Result text = host.eval(object, globalString, {""});
  EXPECT_NE(text.word, 0);
  EXPECT_EQ(text.text(), "");
}

TEST_F(Variables, LocalsAreTheObjectsOwnAndFollowTheListInForce) {
  RunObject &other = host.create();
  host.act(object, createLocalVariable, {"x"});
  host.act(object, createGlobalVariable, {"x"});
  host.act(object, setLocalInteger, {"x", 1});
  host.act(object, setGlobalInteger, {"x", 2});
  EXPECT_EQ(host.eval(object, localInt, {"x"}).integer(), 1);
  EXPECT_EQ(host.eval(object, globalInt, {"x"}).integer(), 2);
  EXPECT_EQ(host.eval(other, localInt, {"x"}).integer(), 0);
  EXPECT_EQ(other.expressionErrorCode, kNoSuchVariable);
  EXPECT_EQ(host.eval(other, globalInt, {"x"}).integer(), 2);

  // Whatever list localVariables names is the one used.
  auto outer = std::move(object.localVariables);
  object.localVariables = std::make_unique<VariableList>();
  EXPECT_EQ(host.eval(object, localInt, {"x"}).integer(), 0);
  host.act(object, createLocalVariable, {"x"});
  host.act(object, setLocalString, {"x", "inner"});
  EXPECT_EQ(host.eval(object, localString, {"x"}).text(), "inner");
  object.localVariables = std::move(outer);
  EXPECT_EQ(host.eval(object, localInt, {"x"}).integer(), 1);
  EXPECT_EQ(host.eval(object, localString, {"x"}).text(), "");
  EXPECT_TRUE(errors.empty());
}

TEST_F(Variables, SetAndGetWorkOnOneExistingPartOnly) {
  VariableList &globals = globalVariables();
  host.act(object, createGlobalVariable, {"v"});
  setVariable(object, globals, "v", reinterpret_cast<HostWord>("some text"), kStringPart);
  // A variable's string set from its own text, as from "GlobalString$(" of itself.
  const HostWord own = getVariable(object, globals, "v", kStringPart);
  setVariable(object, globals, "V", own, kStringPart);
  EXPECT_STREQ(reinterpret_cast<const char *>(getVariable(object, globals, "v", kStringPart)),
               "some text");
  // Value types other than 1 to 3 change nothing and read as 0, without an error.
  setVariable(object, globals, "v", 77, 4);
  EXPECT_EQ(getVariable(object, globals, "v", 4), 0);
  EXPECT_EQ(getVariable(object, globals, "v", kIntegerPart), 0);
  EXPECT_EQ(getVariable(object, globals, "v", kFloatPart), 0);
  EXPECT_TRUE(errors.empty());
  EXPECT_EQ(object.expressionErrorCode, 0);
}

} // namespace
} // namespace morvex::tests
