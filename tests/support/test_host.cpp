// The in-process test host.
#include "tests/support/test_host.h"

#include "runtime/routine_tables.h"
#include "runtime/routines.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <new>

namespace morvex::tests {
namespace {

TestHost *gActive = nullptr;

} // namespace

std::vector<std::uint8_t> editStructureFor(const ObjectSettings &settings) {
  const std::size_t size =
      host::editStructureSize(settings.functions.size(), settings.members.size());
  std::vector<std::uint8_t> bytes(std::max(size, sizeof(host::EditStructure)), 0);
  auto *edit = reinterpret_cast<host::EditStructure *>(bytes.data());
  edit->size = static_cast<std::uint32_t>(size);
  edit->version = host::kEditVersion;
  edit->width = edit->height = 32;
  edit->verifyFunctionNames = settings.verify ? 1 : 0;
  edit->loopUntilReturn = settings.loop ? 1 : 0;
  edit->functionCount = static_cast<std::int32_t>(settings.functions.size());
  edit->memberCount = static_cast<std::int32_t>(settings.members.size());
  char *entry = reinterpret_cast<char *>(bytes.data()) + host::kEditHeadSize;
  for (const auto *list : {&settings.functions, &settings.members}) {
    for (const std::string &name : *list) {
      std::memcpy(entry, name.c_str(), std::min(name.size(), host::kNameEntrySize - 1));
      entry += host::kNameEntrySize;
    }
  }
  return bytes;
}

TestHost::TestHost() : runHeader_(std::make_unique<host::RunHeader>()) {
  std::memset(runHeader_.get(), 0, sizeof(host::RunHeader));
  runHeader_->GenerateEvent = &TestHost::generateEvent;
  runHeader_->FetchActionParam = &TestHost::fetchActionParam;
  runHeader_->FetchActionParamFloat = &TestHost::fetchActionParamFloat;
  runHeader_->FetchFirstExpressionParam = &TestHost::fetchFirstExpressionParam;
  runHeader_->FetchNextExpressionParam = &TestHost::fetchNextExpressionParam;
  gActive = this;
}

TestHost::~TestHost() {
  while (!objects_.empty()) {
    destroy(*objects_.back());
  }
  gActive = nullptr;
}

RunObject &TestHost::create(const ObjectSettings &settings) {
  const std::vector<std::uint8_t> edit = editStructureFor(settings);
  return createFrom(reinterpret_cast<const host::EditStructure *>(edit.data()));
}

RunObject &TestHost::createFrom(const host::EditStructure *edit) {
  void *block = ::operator new(sizeof(RunObject));
  std::memset(block, 0, sizeof(RunObject));
  auto *header = static_cast<host::ObjectHeader *>(block);
  header->runHeader = runHeader_.get();
  RunObject *object = runtime::createRunObject(header, edit);
  objects_.push_back(object);
  return *object;
}

void TestHost::destroy(RunObject &object) {
  auto found = std::find(objects_.begin(), objects_.end(), &object);
  ASSERT_NE(found, objects_.end());
  objects_.erase(found);
  runtime::destroyRunObject(&object);
  ::operator delete(static_cast<void *>(&object));
}

void TestHost::onFunction(RunObject &object, std::string name, std::function<void()> body) {
  lines_.push_back({&object, host::kOnFunction, std::move(name), std::move(body)});
}

void TestHost::on(RunObject &object, HostWord conditionCode, std::function<void()> body) {
  lines_.push_back({&object, conditionCode, std::nullopt, std::move(body)});
}

void TestHost::clearLines() {
  lines_.clear();
}

void TestHost::overwriteText(std::size_t index, std::string text) {
  Frame &frame = top();
  ASSERT_LT(index, frame.params.size());
  ASSERT_TRUE(std::holds_alternative<std::string>(frame.params[index]));
  frame.params[index] = std::move(text);
}

int TestHost::raised(HostWord conditionCode) const {
  return raised_.at(static_cast<std::size_t>(conditionCode));
}

HostWord TestHost::word(const Param &param, bool asFloat) const {
  if (const auto *integer = std::get_if<std::int32_t>(&param)) {
    return asFloat ? host::wordFromFloat(static_cast<float>(*integer)) : *integer;
  }
  if (const auto *real = std::get_if<float>(&param)) {
    return asFloat ? host::wordFromFloat(*real) : static_cast<HostWord>(*real);
  }
  if (const auto *text = std::get_if<std::string>(&param)) {
    return reinterpret_cast<HostWord>(text->c_str());
  }
  return 0;
}

TestHost::Frame &TestHost::top() {
  if (frames_.empty()) {
    ADD_FAILURE() << "a parameter was fetched while no routine runs";
    frames_.emplace_back();
  }
  return frames_.back();
}

HostWord TestHost::fetch(bool asFloat) {
  Frame &frame = top();
  if (frame.next >= frame.params.size()) {
    ADD_FAILURE() << "parameter " << frame.next << " fetched, but the routine has "
                  << frame.params.size();
    return 0;
  }
  return word(frame.params[frame.next++], asFloat);
}

HostWord TestHost::runWithParams(std::vector<Param> params, HostWord cookie,
                                 const std::function<HostWord(HostWord, HostWord)> &routine) {
  frames_.push_back({std::move(params), 0, cookie});
  const Frame &frame = frames_.back();
  const HostWord first = frame.params.size() > 0 ? word(frame.params[0], false) : 0;
  const HostWord second = frame.params.size() > 1 ? word(frame.params[1], false) : 0;
  const HostWord answer = routine(first, second);
  frames_.pop_back();
  return answer;
}

void TestHost::act(RunObject &object, ActionFn routine, std::vector<Param> params) {
  runWithParams(std::move(params), 0, [&](HostWord first, HostWord second) {
    routine(object, first, second);
    return HostWord{0};
  });
}

Result TestHost::eval(RunObject &object, ExpressionFn routine, std::vector<Param> params) {
  const auto cookie = static_cast<HostWord>(frames_.size() + 1000);
  object.hostFlags = 0;
  Result result;
  result.word = runWithParams(std::move(params), cookie,
                              [&](HostWord, HostWord) { return routine(object, cookie); });
  result.flags = object.hostFlags;
  return result;
}

bool TestHost::test(RunObject &object, ConditionFn routine, std::vector<Param> params) {
  return runWithParams(std::move(params), 0, [&](HostWord first, HostWord second) {
           return HostWord{routine(object, first, second)};
         }) != 0;
}

void TestHost::actByCode(RunObject &object, int code, std::vector<Param> params) {
  const host::ActionRoutine routine = runtime::actionTable()[static_cast<std::size_t>(code)];
  const HostWord answer = runWithParams(std::move(params), 0, [&](HostWord first, HostWord second) {
    return routine(&object, first, second);
  });
  EXPECT_EQ(answer, 0) << "action " << code << " answered other than 0";
}

Result TestHost::evalByCode(RunObject &object, int code, std::vector<Param> params) {
  const host::ExpressionRoutine routine =
      runtime::expressionTable()[static_cast<std::size_t>(code)];
  const auto cookie = static_cast<HostWord>(frames_.size() + 1000);
  object.hostFlags = 0;
  Result result;
  result.word = runWithParams(std::move(params), cookie,
                              [&](HostWord, HostWord) { return routine(&object, cookie); });
  result.flags = object.hostFlags;
  return result;
}

bool TestHost::testByCode(RunObject &object, int code, std::vector<Param> params) {
  const host::ConditionRoutine routine = runtime::conditionTable()[static_cast<std::size_t>(code)];
  const HostWord answer = runWithParams(std::move(params), 0, [&](HostWord first, HostWord second) {
    return routine(&object, first, second);
  });
  EXPECT_TRUE(answer == 0 || answer == 1) << "condition " << code << " answered " << answer;
  return answer != 0;
}

HostWord MORVEX_CALL TestHost::generateEvent(host::ObjectHeader *header, HostWord code, HostWord) {
  TestHost &self = *gActive;
  RunObject &object = runtime::runObjectOf(header);
  if (code >= 0 && code < 4) {
    ++self.raised_[static_cast<std::size_t>(code)];
  }
  ++self.depth_;
  // Lines are looked up by index: a body may add lines, which later raises then see.
  for (std::size_t i = 0; i < self.lines_.size(); ++i) {
    if (self.lines_[i].object != &object || self.lines_[i].code != code) {
      continue;
    }
    if (self.lines_[i].functionName) {
      const std::string name = *self.lines_[i].functionName;
      if (!self.test(object, runtime::onFunction, {name})) {
        continue;
      }
    }
    const std::function<void()> body = self.lines_[i].body;
    body();
  }
  --self.depth_;
  return 0;
}

HostWord MORVEX_CALL TestHost::fetchActionParam(host::ObjectHeader *, HostWord mode, HostWord) {
  return gActive->fetch(mode == host::kFetchFloat);
}

HostWord MORVEX_CALL TestHost::fetchActionParamFloat(host::ObjectHeader *, HostWord index,
                                                     HostWord) {
  Frame &frame = gActive->top();
  if (index < 0 || static_cast<std::size_t>(index) >= frame.params.size()) {
    ADD_FAILURE() << "float parameter " << index << " fetched, but the routine has "
                  << frame.params.size();
    return 0;
  }
  return gActive->word(frame.params[static_cast<std::size_t>(index)], true);
}

HostWord MORVEX_CALL TestHost::fetchFirstExpressionParam(host::ObjectHeader *, HostWord,
                                                         HostWord cookie) {
  Frame &frame = gActive->top();
  EXPECT_EQ(frame.cookie, cookie) << "the expression passed another cookie";
  frame.next = 0;
  return gActive->fetch(false);
}

HostWord MORVEX_CALL TestHost::fetchNextExpressionParam(host::ObjectHeader *, HostWord,
                                                        HostWord cookie) {
  EXPECT_EQ(gActive->top().cookie, cookie) << "the expression passed another cookie";
  return gActive->fetch(false);
}

} // namespace morvex::tests
