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
struct Fixture {
  TestHost host;
  RunObject &object = host.create();
  std::vector<std::int32_t> errors;

  Fixture() {
    host.on(object, host::kOnError,
            [this] { errors.push_back(host.eval(object, currentError).integer()); });
  }
};

TEST(Variables, GlobalNamesIgnoreCaseAndThePartsStayApart) {
  Fixture f;
  f.host.act(f.object, createGlobalVariable, {std::string("Score")});
  f.host.act(f.object, setGlobalInteger, {std::string("Score"), 5});
  EXPECT_EQ(f.host.eval(f.object, globalInt, {std::string("SCORE")}).integer(), 5);

  f.host.act(f.object, createGlobalVariable, {std::string("text")});
  f.host.act(f.object, setGlobalString, {std::string("text"), std::string("5")});
  EXPECT_EQ(f.host.eval(f.object, globalInt, {std::string("text")}).integer(), 0);
  const Result real = f.host.eval(f.object, globalFloat, {std::string("text")});
  EXPECT_TRUE(real.isFloat());
  EXPECT_EQ(real.real(), 0.0f);
  const Result text = f.host.eval(f.object, globalString, {std::string("Text")});
  EXPECT_TRUE(text.isString());
  EXPECT_EQ(text.text(), "5");
  EXPECT_EQ(f.host.eval(f.object, globalInt, {std::string("text")}).flags, 0);

  f.host.act(f.object, setGlobalFloat, {std::string("Score"), 2.5f});
  EXPECT_EQ(f.host.eval(f.object, globalInt, {std::string("score")}).integer(), 5);
  EXPECT_EQ(f.host.eval(f.object, globalFloat, {std::string("score")}).real(), 2.5f);
  EXPECT_TRUE(f.errors.empty());
  EXPECT_EQ(f.object.expressionErrorCode, 0);
}

TEST(Variables, CreatingAnExistingNameRaisesSevenAndKeepsTheValues) {
  Fixture f;
  f.host.act(f.object, createGlobalVariable, {std::string("lives")});
  f.host.act(f.object, setGlobalInteger, {std::string("lives"), 3});
  f.host.act(f.object, setGlobalString, {std::string("lives"), std::string("three")});
  f.host.act(f.object, createGlobalVariable, {std::string("LIVES")});
  f.host.act(f.object, createLocalVariable, {std::string("mine")});
  f.host.act(f.object, createLocalVariable, {std::string("Mine")});
  EXPECT_EQ(f.errors, (std::vector<std::int32_t>{kVariableExists, kVariableExists}));
  EXPECT_EQ(f.host.eval(f.object, globalInt, {std::string("lives")}).integer(), 3);
  EXPECT_EQ(f.host.eval(f.object, globalString, {std::string("lives")}).text(), "three");
  EXPECT_EQ(globalVariables().size(), 1);
  EXPECT_EQ(f.object.localVariables->size(), 1);
}

TEST(Variables, SettingAMissingVariableRaisesThreeAndCreatesNothing) {
  Fixture f;
  f.host.act(f.object, setLocalFloat, {std::string("ghost"), 1.5f});
  f.host.act(f.object, setLocalInteger, {std::string("ghost"), 1});
  f.host.act(f.object, setLocalString, {std::string("ghost"), std::string("x")});
  f.host.act(f.object, setGlobalInteger, {std::string("ghost"), 1});
  f.host.act(f.object, setGlobalFloat, {std::string("ghost"), 1.5f});
  f.host.act(f.object, setGlobalString, {std::string("ghost"), std::string("x")});
  EXPECT_EQ(f.errors, std::vector<std::int32_t>(6, kNoSuchVariable));
  EXPECT_EQ(f.object.localVariables->size(), 0);
  EXPECT_EQ(globalVariables().size(), 0);

  const Result real = f.host.eval(f.object, localFloat, {std::string("ghost")});
  EXPECT_TRUE(real.isFloat());
  EXPECT_EQ(real.word, 0);
  EXPECT_EQ(f.object.expressionErrorCode, kNoSuchVariable);
  EXPECT_EQ(f.errors.size(), 6u); // expression errors run no "On Error" lines
}

TEST(Variables, ReadingAMissingVariableGivesAnEmptyResultOfItsType) {
  Fixture f;
  const Result text = f.host.eval(f.object, globalString, {std::string("nothing")});
  EXPECT_TRUE(text.isString());
  EXPECT_EQ(text.text(), "");
  EXPECT_EQ(f.object.expressionErrorCode, kNoSuchVariable);
  f.object.expressionErrorCode = 0;
  const Result integer = f.host.eval(f.object, localInt, {std::string("nothing")});
  EXPECT_EQ(integer.word, 0);
  EXPECT_EQ(integer.flags, 0);
  EXPECT_EQ(f.object.expressionErrorCode, kNoSuchVariable);
  f.object.expressionErrorCode = 0;
  EXPECT_EQ(f.host.eval(f.object, localString, {NullText{}}).text(), "");
  EXPECT_EQ(f.host.eval(f.object, globalFloat, {NullText{}}).flags, host::kFloatResult);
  EXPECT_EQ(f.object.expressionErrorCode, kNoSuchVariable);
  EXPECT_TRUE(f.errors.empty());
  EXPECT_EQ(f.object.errorCode, 0);
}

TEST(Variables, FloatsAreStoredAndGivenBackBitForBit) {
  Fixture f;
  f.host.act(f.object, createGlobalVariable, {std::string("f")});
  for (const float value : {1.1f, -0.0f, std::numeric_limits<float>::denorm_min(), -123.456f}) {
    f.host.act(f.object, setGlobalFloat, {std::string("f"), value});
    const Result read = f.host.eval(f.object, globalFloat, {std::string("f")});
    EXPECT_EQ(static_cast<std::uint32_t>(read.word), bitsOf(value));
  }
  // A signalling NaN, as the host may hand one over, keeps its payload too.
  constexpr HostWord kSignallingNaN = 0x7FA00001;
  setVariable(f.object, globalVariables(), "f", kSignallingNaN, kFloatPart);
  EXPECT_EQ(getVariable(f.object, globalVariables(), "F", kFloatPart), kSignallingNaN);
  // The second parameter is fetched as a float: an integer expression arrives converted.
  f.host.act(f.object, createLocalVariable, {std::string("g")});
  f.host.act(f.object, setLocalFloat, {std::string("g"), 3});
  EXPECT_EQ(f.host.eval(f.object, localFloat, {std::string("g")}).real(), 3.0f);
}

TEST(Variables, MissingTextsCountAsEmpty) {
  Fixture f;
  // A missing name is the empty name, which is a valid variable name.
  f.host.act(f.object, createGlobalVariable, {NullText{}});
  f.host.act(f.object, setGlobalInteger, {std::string(""), 9});
  EXPECT_EQ(f.host.eval(f.object, globalInt, {NullText{}}).integer(), 9);
  f.host.act(f.object, createGlobalVariable, {std::string("")});
  EXPECT_EQ(f.errors, (std::vector<std::int32_t>{kVariableExists}));

  f.host.act(f.object, setGlobalString, {std::string(""), std::string("old")});
  f.host.act(f.object, setGlobalString, {std::string(""), NullText{}});
  const Result text = f.host.eval(f.object, globalString, {std::string("")});
  EXPECT_NE(text.word, 0);
  EXPECT_EQ(text.text(), "");
}

TEST(Variables, LocalsAreTheObjectsOwnAndFollowTheListInForce) {
  Fixture f;
  RunObject &other = f.host.create();
  f.host.act(f.object, createLocalVariable, {std::string("x")});
  f.host.act(f.object, createGlobalVariable, {std::string("x")});
  f.host.act(f.object, setLocalInteger, {std::string("x"), 1});
  f.host.act(f.object, setGlobalInteger, {std::string("x"), 2});
  EXPECT_EQ(f.host.eval(f.object, localInt, {std::string("x")}).integer(), 1);
  EXPECT_EQ(f.host.eval(f.object, globalInt, {std::string("x")}).integer(), 2);
  EXPECT_EQ(f.host.eval(other, localInt, {std::string("x")}).integer(), 0);
  EXPECT_EQ(other.expressionErrorCode, kNoSuchVariable);
  EXPECT_EQ(f.host.eval(other, globalInt, {std::string("x")}).integer(), 2);

  // Whatever list localVariables names is the one used.
  auto outer = std::move(f.object.localVariables);
  f.object.localVariables = std::make_unique<VariableList>();
  EXPECT_EQ(f.host.eval(f.object, localInt, {std::string("x")}).integer(), 0);
  f.host.act(f.object, createLocalVariable, {std::string("x")});
  f.host.act(f.object, setLocalString, {std::string("x"), std::string("inner")});
  EXPECT_EQ(f.host.eval(f.object, localString, {std::string("x")}).text(), "inner");
  f.object.localVariables = std::move(outer);
  EXPECT_EQ(f.host.eval(f.object, localInt, {std::string("x")}).integer(), 1);
  EXPECT_EQ(f.host.eval(f.object, localString, {std::string("x")}).text(), "");
  EXPECT_TRUE(f.errors.empty());
}

TEST(Variables, SetAndGetWorkOnOneExistingPartOnly) {
  Fixture f;
  VariableList &globals = globalVariables();
  f.host.act(f.object, createGlobalVariable, {std::string("v")});
  setVariable(f.object, globals, "v", reinterpret_cast<HostWord>("some text"), kStringPart);
  // A variable's string set from its own text, as from "GlobalString$(" of itself.
  const HostWord own = getVariable(f.object, globals, "v", kStringPart);
  setVariable(f.object, globals, "V", own, kStringPart);
  EXPECT_STREQ(reinterpret_cast<const char *>(getVariable(f.object, globals, "v", kStringPart)),
               "some text");
  // Value types other than 1 to 3 change nothing and read as 0, without an error.
  setVariable(f.object, globals, "v", 77, 4);
  EXPECT_EQ(getVariable(f.object, globals, "v", 4), 0);
  EXPECT_EQ(getVariable(f.object, globals, "v", kIntegerPart), 0);
  EXPECT_EQ(getVariable(f.object, globals, "v", kFloatPart), 0);
  EXPECT_TRUE(f.errors.empty());
  EXPECT_EQ(f.object.expressionErrorCode, 0);
}

} // namespace
} // namespace morvex::tests
