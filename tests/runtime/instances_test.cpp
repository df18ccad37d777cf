// Instances: creation and destruction with their events and frames, members, the default
// instance and "Destroy All Instances".
#include "runtime/errors.h"
#include "runtime/routines.h"
#include "tests/runtime/event_lines.h"
#include "tests/support/test_host.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <vector>

namespace morvex::tests {
namespace {

namespace rt = morvex::runtime;

// An object declaring the members speed, name and hp.
class Instances : public ::testing::Test {
protected:
  bool exists(const std::string &name) {
    return object.instances.find(name.c_str()) != object.noInstance();
  }
  // The names the instance list holds, in its order.
  std::vector<std::string> names() {
    std::vector<std::string> result;
    for (auto *at = object.instances.first(); at != object.noInstance(); at = at->next) {
      result.push_back(at->name);
    }
    return result;
  }
  std::int32_t intOf(Param instance, Param member) {
    return host.eval(object, rt::intOfInstance, {std::move(instance), std::move(member)}).integer();
  }

  TestHost host;
  RunObject &object = host.create({{"f"}, {"speed", "name", "hp"}, false, false});
  std::shared_ptr<Codes> errors = logErrors(host, object);
};

using Names = std::vector<std::string>;

TEST_F(Instances, CreationStoresTheLowerCasedNameAndRunsItsEventForIt) {
  std::vector<std::string> seen;
  host.on(object, host::kOnCreation, [&] {
    seen.push_back(currentInstanceName(host, object));
    EXPECT_EQ(currentReturnType(host, object), -1);
    EXPECT_EQ(currentLoopNumber(host, object), 0);
    host.act(object, rt::setCurrentMemberInteger, {"hp", 10});
  });
  makeInstance(host, object, "Enemy");
  EXPECT_EQ(seen, Names{"enemy"});
  EXPECT_EQ(names(), Names{"enemy"});
  EXPECT_EQ(intOf("ENEMY", "HP"), 10);
  EXPECT_EQ(object.instances.find("enemy")->instanceBusy, 0);
  EXPECT_TRUE(errors->empty());
}

TEST_F(Instances, CreatingAnExistingNameRaises6AndLeavesItAlone) {
  makeInstance(host, object, "enemy");
  host.act(object, rt::setMemberInteger, {"enemy", "hp", 3});
  int events = 0;
  host.on(object, host::kOnCreation, [&] { ++events; });
  makeInstance(host, object, "ENEMY", "9");
  EXPECT_EQ(*errors, Codes{6});
  EXPECT_EQ(events, 0);
  EXPECT_EQ(intOf("enemy", "hp"), 3);
  EXPECT_EQ(object.instances.size(), 1);
}

TEST_F(Instances, CreatingWithoutANameRaises13) {
  makeInstance(host, object, "");
  makeInstance(host, object, NullText{});
  EXPECT_EQ(*errors, (Codes{13, 13}));
  EXPECT_EQ(host.raised(host::kOnCreation), 0);
  EXPECT_EQ(object.instances.size(), 0);
}

TEST_F(Instances, CreationParametersAreLocalsOfTheEventOnly) {
  std::vector<std::string> seen;
  host.on(object, host::kOnCreation, [&] {
    seen.push_back(std::to_string(currentParameterCount(host, object)) + ":" +
                   std::to_string(readLocalInt(host, object, "p1")) + ":" +
                   readLocalString(host, object, "p2"));
  });
  makeInstance(host, object, "a", "5,abc");
  makeInstance(host, object, "b", NullText{});
  EXPECT_EQ(seen, (Names{"2:5:abc", "0:0:"}));
  // The parameters are not members, and are gone with the event.
  EXPECT_EQ(intOf("a", "speed"), 0);
  EXPECT_EQ(readLocalInt(host, object, "p1"), 0);
  EXPECT_EQ(expressionErrorOf(host, object), rt::kNoSuchVariable);
  EXPECT_EQ(currentParameterCount(host, object), 0);
  EXPECT_EQ(object.currentInstance, object.noInstance());
}

TEST_F(Instances, TheEventFramePutsTheFunctionsFrameBack) {
  makeInstance(host, object, "caller");
  host.onFunction(object, "f", [&] {
    host.act(object, rt::createLocalVariable, {"mine"});
    host.act(object, rt::loopCurrentFunction); // asked before: stays asked
    makeInstance(host, object, "made", "1,2,3");
    host.act(object, rt::destroyInstance, {"made"});
    EXPECT_EQ(currentInstanceName(host, object), "caller");
    EXPECT_EQ(currentParameterCount(host, object), 1);
    EXPECT_EQ(currentReturnType(host, object), 1);
    EXPECT_EQ(currentLoopNumber(host, object), 0);
    EXPECT_EQ(readLocalInt(host, object, "p1"), 8);
    host.act(object, rt::setLocalInteger, {"mine", 4});
    EXPECT_EQ(object.currentFunctionName, std::optional<std::string>("f"));
    EXPECT_EQ(object.loopRequested, 1);
    host.act(object, rt::returnInteger, {readLocalInt(host, object, "mine")});
  });
  host.on(object, host::kOnCreation, [&] {
    EXPECT_EQ(readLocalInt(host, object, "mine"), 0); // the caller's locals are hidden
    host.act(object, rt::createLocalVariable, {"mine"});
  });
  host.on(object, host::kOnDestruction, [&] {
    EXPECT_EQ(currentParameterCount(host, object), 0);
    EXPECT_EQ(readLocalInt(host, object, "p1"), 0);
  });
  callFor(host, object, "caller", "f", "8", 1, 0);
  EXPECT_EQ(slotInteger(host, object, 0), 4);
  EXPECT_EQ(*errors, Codes{});
}

TEST_F(Instances, ABusyInstanceCannotBeDestroyed) {
  makeInstance(host, object, "x");
  host.on(object, host::kOnCreation, [&] { host.act(object, rt::destroyInstance, {"y"}); });
  host.on(object, host::kOnDestruction, [&] { host.act(object, rt::destroyInstance, {"x"}); });
  host.onFunction(object, "f", [&] {
    host.act(object, rt::destroyInstance, {"x"});
    host.act(object, rt::returnVoid);
  });
  makeInstance(host, object, "y");              // in its own creation event
  callFor(host, object, "x", "f");              // during a call on it
  host.act(object, rt::destroyInstance, {"x"}); // in its own destruction event, then gone
  EXPECT_EQ(*errors, (Codes{5, 5, 5}));
  EXPECT_EQ(names(), Names{"y"});
  EXPECT_EQ(host.raised(host::kOnDestruction), 1);
}

TEST_F(Instances, DestroyingTheDefaultInstanceClearsTheDefault) {
  std::vector<std::string> destroyed;
  host.on(object, host::kOnDestruction, [&] {
    destroyed.push_back(currentInstanceName(host, object));
    EXPECT_TRUE(exists(currentInstanceName(host, object))); // still findable by name
  });
  makeInstance(host, object, "a");
  makeInstance(host, object, "b");
  host.act(object, rt::setDefaultInstance, {"A"});
  host.act(object, rt::destroyInstance, {""});
  host.act(object, rt::destroyInstance, {NullText{}});
  EXPECT_EQ(*errors, Codes{1});
  EXPECT_EQ(object.defaultInstance, object.noInstance());

  host.act(object, rt::setDefaultInstance, {"b"});
  host.act(object, rt::destroyInstance, {"B"});
  EXPECT_EQ(object.defaultInstance, object.noInstance());
  host.act(object, rt::destroyInstance, {"b"});
  EXPECT_EQ(*errors, (Codes{1, 1}));
  EXPECT_EQ(destroyed, (Names{"a", "b"}));
}

TEST_F(Instances, SettingTheDefaultFindsByNameOnly) {
  makeInstance(host, object, "a");
  host.act(object, rt::setDefaultInstance, {"a"});
  host.act(object, rt::setDefaultInstance, {""});
  host.act(object, rt::setDefaultInstance, {NullText{}});
  host.act(object, rt::setDefaultInstance, {"nobody"});
  EXPECT_EQ(*errors, (Codes{1, 1, 1}));
  EXPECT_EQ(object.defaultInstance, object.instances.find("a"));
}

TEST_F(Instances, MemberSettersOfANamedInstance) {
  makeInstance(host, object, "a");
  host.act(object, rt::setMemberInteger, {"A", "Speed", 7});
  const float tiny = 1.0e-40f; // a subnormal keeps its bits too
  host.act(object, rt::setMemberFloat, {"a", "speed", tiny});
  host.act(object, rt::setMemberString, {"a", "speed", "fast"});
  host.act(object, rt::setMemberString, {"a", "name", NullText{}});
  EXPECT_EQ(intOf("a", "speed"), 7);
  EXPECT_EQ(host.eval(object, rt::floatOfInstance, {"a", "speed"}).word, host::wordFromFloat(tiny));
  EXPECT_EQ(host.eval(object, rt::stringOfInstance, {"a", "speed"}).text(), "fast");
  EXPECT_EQ(host.eval(object, rt::stringOfInstance, {"a", "name"}).text(), "");
  EXPECT_TRUE(errors->empty());

  // The default instance stands for an empty name; the instance is checked first.
  host.act(object, rt::setMemberInteger, {"", "hp", 1});
  host.act(object, rt::setDefaultInstance, {"a"});
  host.act(object, rt::setMemberInteger, {"", "hp", 2});
  host.act(object, rt::setMemberInteger, {NullText{}, "hp", 3});
  host.act(object, rt::setMemberInteger, {"nobody", "undeclared", 4});
  host.act(object, rt::setMemberFloat, {"a", "undeclared", 1.0f});
  host.act(object, rt::setMemberString, {"a", NullText{}, "x"});
  EXPECT_EQ(*errors, (Codes{1, 1, 3, 3}));
  EXPECT_EQ(intOf("a", "hp"), 3);
  EXPECT_EQ(host.eval(object, rt::floatOfInstance, {"a", "speed"}).word, host::wordFromFloat(tiny));
}

TEST_F(Instances, MemberSettersOfTheCurrentInstance) {
  host.act(object, rt::setCurrentMemberInteger, {"undeclared", 1}); // 14 comes before 3
  host.act(object, rt::setCurrentMemberFloat, {"speed", 1.0f});
  host.act(object, rt::setCurrentMemberString, {"speed", "x"});
  EXPECT_EQ(*errors, (Codes{14, 14, 14}));

  errors->clear();
  host.on(object, host::kOnCreation, [&] {
    host.act(object, rt::setCurrentMemberInteger, {"HP", -4});
    host.act(object, rt::setCurrentMemberFloat, {"hp", -0.5f});
    host.act(object, rt::setCurrentMemberString, {"name", "bob"});
    host.act(object, rt::setCurrentMemberString, {"speed", NullText{}});
    host.act(object, rt::setCurrentMemberInteger, {NullText{}, 1});
    host.act(object, rt::setCurrentMemberFloat, {"undeclared", 1.0f});
  });
  makeInstance(host, object, "a");
  EXPECT_EQ(*errors, (Codes{3, 3}));
  EXPECT_EQ(intOf("a", "hp"), -4);
  EXPECT_EQ(host.eval(object, rt::floatOfInstance, {"a", "hp"}).real(), -0.5f);
  EXPECT_EQ(host.eval(object, rt::stringOfInstance, {"a", "name"}).text(), "bob");
  EXPECT_EQ(host.eval(object, rt::stringOfInstance, {"a", "speed"}).text(), "");
}

TEST_F(Instances, MemberReadersMarkTheirTypeAndRecordTheirErrors) {
  makeInstance(host, object, "a");
  struct Case {
    const char *label;
    ExpressionFn routine;
    std::vector<Param> params;
    std::uint16_t flags;
    std::int32_t error;
  };
  const std::vector<Case> cases = {
      {"int of no instance", rt::intOfInstance, {"nobody", "hp"}, 0, 1},
      {"float of no instance", rt::floatOfInstance, {"nobody", "undeclared"}, 0x4000, 1},
      {"string of no instance", rt::stringOfInstance, {"nobody", "hp"}, 0x8000, 1},
      {"string of no default", rt::stringOfInstance, {"", "hp"}, 0x8000, 1},
      {"int of undeclared member", rt::intOfInstance, {"a", "undeclared"}, 0, 3},
      {"float of missing member", rt::floatOfInstance, {"a", NullText{}}, 0x4000, 3},
      {"string of undeclared", rt::stringOfInstance, {"a", "x"}, 0x8000, 3},
      {"int of no current", rt::intOfCurrInstance, {"hp"}, 0, 14},
      {"float of no current", rt::floatOfCurrInstance, {"hp"}, 0x4000, 14},
      {"string of no current", rt::stringOfCurrInstance, {"hp"}, 0x8000, 14},
      {"name of no current", rt::getInstanceName, {}, 0x8000, 14},
  };
  for (const Case &c : cases) {
    SCOPED_TRACE(c.label);
    host.act(object, rt::clearExpressionErrorCode);
    const Result result = host.eval(object, c.routine, c.params);
    EXPECT_EQ(result.flags, c.flags);
    EXPECT_EQ(result.word == 0 || result.text().empty(), true);
    EXPECT_EQ(expressionErrorOf(host, object), c.error);
  }
  EXPECT_TRUE(errors->empty());
}

TEST_F(Instances, DestroyAllKeepsBusyInstancesAsTheSameRecords) {
  for (const char *name : {"a", "b", "c", "d"}) {
    makeInstance(host, object, name);
  }
  host.act(object, rt::setMemberInteger, {"c", "hp", 30});
  host.act(object, rt::setDefaultInstance, {"c"});
  rt::InstanceRecord *const c = object.instances.find("c");
  std::vector<std::string> destroyed;
  std::vector<bool> cFindable;
  host.on(object, host::kOnDestruction, [&] {
    destroyed.push_back(currentInstanceName(host, object));
    cFindable.push_back(exists("c"));
  });
  host.onFunction(object, "f", [&] {
    host.act(object, rt::destroyAllInstances);
    EXPECT_EQ(names(), Names{"c"});
    EXPECT_EQ(object.instances.find("c"), c);
    EXPECT_EQ(currentInstanceName(host, object), "c");
    EXPECT_EQ(host.eval(object, rt::intOfCurrInstance, {"hp"}).integer(), 30);
    host.act(object, rt::returnVoid);
  });
  callFor(host, object, "c", "f");
  EXPECT_EQ(*errors, Codes{5});
  EXPECT_EQ(destroyed, (Names{"a", "b", "d"}));
  EXPECT_EQ(cFindable, (std::vector<bool>{true, true, false})); // held while d goes
  EXPECT_EQ(object.defaultInstance, c);
  EXPECT_EQ(c->instanceBusy, 0);
  EXPECT_EQ(intOf("", "hp"), 30);
}

TEST_F(Instances, DestroyAllGoesInAscendingOrderAlsoThroughInstancesCreatedOnTheWay) {
  std::vector<std::string> destroyed;
  host.on(object, host::kOnDestruction, [&] {
    const std::string name = currentInstanceName(host, object);
    destroyed.push_back(name);
    if (name == "b") {
      makeInstance(host, object, "a"); // before the pass's position: still first next
      makeInstance(host, object, "c");
      makeInstance(host, object, "e");
    }
  });
  host.act(object, rt::destroyAllInstances); // nothing to do
  EXPECT_TRUE(destroyed.empty());
  for (const char *name : {"d", "b"}) {
    makeInstance(host, object, name);
  }
  host.act(object, rt::setDefaultInstance, {"b"});
  host.act(object, rt::destroyAllInstances);
  EXPECT_EQ(destroyed, (Names{"b", "a", "c", "d", "e"}));
  EXPECT_EQ(object.instances.size(), 0);
  EXPECT_EQ(object.defaultInstance, object.noInstance());
  EXPECT_TRUE(errors->empty());
}

TEST_F(Instances, DestroyAllInsideADestructionEventLeavesThatInstanceToItsDestroyer) {
  for (const char *name : {"a", "b", "c"}) {
    makeInstance(host, object, name);
  }
  std::vector<std::string> destroyed;
  host.on(object, host::kOnDestruction, [&] {
    const std::string name = currentInstanceName(host, object);
    destroyed.push_back(name);
    if (name == "b") {
      host.act(object, rt::destroyAllInstances);
      EXPECT_EQ(names(), Names{"b"});
      EXPECT_EQ(currentInstanceName(host, object), "b");
    }
  });
  host.act(object, rt::destroyInstance, {"b"});
  EXPECT_EQ(*errors, Codes{5});
  EXPECT_EQ(destroyed, (Names{"b", "a", "c"}));
  EXPECT_EQ(object.instances.size(), 0);
}

TEST_F(Instances, DestroyAllRaises5OnceForEachBusyInstanceAndGoesOn) {
  for (const char *name : {"a", "b", "c"}) {
    makeInstance(host, object, name);
  }
  std::vector<std::string> order;
  host.on(object, host::kOnDestruction,
          [&] { order.push_back("destroy " + currentInstanceName(host, object)); });
  host.on(object, host::kOnError, [&] { order.push_back("error"); });
  host.onFunction(object, "f", [&] {
    if (currentInstanceName(host, object) == "a") {
      callFor(host, object, "c", "f"); // a and c are busy now
      host.act(object, rt::returnVoid);
      return;
    }
    host.act(object, rt::destroyAllInstances);
    host.act(object, rt::returnVoid);
  });
  callFor(host, object, "a", "f");
  EXPECT_EQ(order, (Names{"error", "destroy b", "error"}));
  EXPECT_EQ(names(), (Names{"a", "c"}));
}

} // namespace
} // namespace morvex::tests
