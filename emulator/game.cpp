// The game loop and the host's side of every call into and out of the extension.
#include "emulator/game.h"

#include "emulator/big_stack.h"
#include "emulator/edit_structure.h"

#include <cstdlib>
#include <cstring>
#include <new>
#include <utility>

namespace morvex::emulator {

namespace {

// Bytes of stack kept free below the deepest event: room for one more level of the
// extension's and the host's frames, several times over.
constexpr std::size_t kStackMargin = std::size_t{16} << 20;

// After the game stopped, a function body set to loop until it returns can only be ended
// by a return (see afterHalt). One that cannot return at all would keep raising events
// for ever; after this many the emulator gives up on it.
constexpr std::int64_t kRaisesAfterHaltLimit = 1'000'000;

// The action "Return from Current Function", which the host runs to end a function body
// that would otherwise loop for ever once no action runs any more.
constexpr int kReturnActionCode = 10;

constexpr std::int32_t kSelectedPerObject = 1; // each object of the sheet is one object

struct BlockDeleter {
  void operator()(void *block) const {
    ::operator delete (block, std::align_val_t{alignof(std::max_align_t)});
  }
};

host::HostWord directWord(const std::vector<Value> &values, std::size_t index) {
  return index < values.size() ? wordOf(values[index], false) : 0;
}

// Keeps the sheet line being run on the stack of running lines for a scope.
class LineScope {
public:
  LineScope(std::vector<int> &lines, int line) : lines_(lines) { lines_.push_back(line); }
  ~LineScope() { lines_.pop_back(); }
  LineScope(const LineScope &) = delete;
  LineScope &operator=(const LineScope &) = delete;

private:
  std::vector<int> &lines_;
};

} // namespace

struct Game::RunningObject {
  std::vector<std::uint8_t> edit; // the stored block; the host keeps it while the object lives
  std::unique_ptr<void, BlockDeleter> block;
  host::ObjectHeader *header = nullptr; // the start of `block`
};

Game::Game(Extension &extension, const Sheet &sheet, std::string sheetName, PlayOptions options,
           std::ostream &out, std::ostream &err)
    : extension_(extension), catalog_(extension.catalog()), routines_(extension.runInfos()),
      sheet_(sheet), sheetName_(std::move(sheetName)), options_(options), out_(out), err_(err),
      runHeader_(makeRunHeader(*this)), trace_(options.trace ? &err : nullptr, objectNames_) {
  for (const ObjectSetup &object : sheet.objects) {
    objectNames_.push_back(object.name);
  }
  triggered_.assign(sheet.objects.size(),
                    std::vector<std::vector<const EventLine *>>(catalog_.conditions.size()));
  for (const EventLine &line : sheet.events) {
    if (!line.triggered()) {
      frameLines_.push_back(&line);
      continue;
    }
    const RoutineCall &call = line.conditions.front().call;
    triggered_[static_cast<std::size_t>(call.object)][static_cast<std::size_t>(call.code)]
        .push_back(&line);
  }
}

Game::~Game() = default;

int Game::play() {
  createObjects();
  // Without lines that run in the frame loop, frames have nothing to do, however many.
  const std::int64_t frames = frameLines_.empty() ? 0 : options_.frames;
  for (frame_ = 1; frame_ <= frames && !halted(); ++frame_) {
    for (const EventLine *line : frameLines_) {
      if (halted()) {
        break;
      }
      runLine(*line);
    }
  }
  destroyObjects();
  out_.flush();
  if (stopped_) {
    err_ << report() << '\n';
    return kStopped;
  }
  return kEndedNormally;
}

void Game::createObjects() {
  const std::size_t count = sheet_.objects.size();
  // The host's object table, one entry per object, each selecting kSelectedPerObject.
  hostObjects_.assign(count, host::HostObject{});
  selectionRecords_.assign(count * host::kSelectionRecordSize, 0);
  objectTable_.assign(count, host::ObjectTableEntry{});
  for (std::size_t i = 0; i < count; ++i) {
    hostObjects_[i].selectionIndex = static_cast<std::int16_t>(i + 1);
    hostObjects_[i].selectionRecords = selectionRecords_.data();
    std::memcpy(selectionRecords_.data() + i * host::kSelectionRecordSize +
                    host::kSelectedCountOffset,
                &kSelectedPerObject, sizeof kSelectedPerObject);
    objectTable_[i].object = &hostObjects_[i];
  }
  runHeader_->header.objectCount = static_cast<std::int32_t>(count);
  runHeader_->header.objectTable = objectTable_.empty() ? nullptr : objectTable_.data();

  objects_.reserve(count);
  for (const ObjectSetup &setup : sheet_.objects) {
    RunningObject object;
    object.edit = buildEditStructure(setup);
    auto *edit = reinterpret_cast<host::EditStructure *>(object.edit.data());
    const auto size = static_cast<std::size_t>(
        extension_.entries().getRunObjectDataSize(&runHeader_->header, edit) & 0xFFFF);
    if (size < sizeof(host::ObjectHeader)) {
      LineScope scope(runningLines_, setup.where.line);
      stop("the extension asks for " + std::to_string(size) +
           " bytes per object, less than the host's own header");
      return;
    }
    object.block.reset(::operator new (size, std::align_val_t{alignof(std::max_align_t)}));
    std::memset(object.block.get(), 0, size);
    object.header = static_cast<host::ObjectHeader *>(object.block.get());
    object.header->runHeader = &runHeader_->header;
    extension_.entries().createRunObject(object.header, edit, 0);
    objects_.push_back(std::move(object));
  }
}

void Game::destroyObjects() {
  while (!objects_.empty()) {
    extension_.entries().destroyRunObject(objects_.back().header, 0);
    objects_.pop_back();
  }
}

void Game::runLine(const EventLine &line) {
  for (const Condition &condition : line.conditions) {
    if (halted() || !holds(condition)) {
      return;
    }
  }
  for (const Action &action : line.actions) {
    if (halted()) {
      return;
    }
    run(action);
  }
}

bool Game::holds(const Condition &condition) {
  LineScope scope(runningLines_, condition.where.line);
  switch (condition.kind) {
  case Condition::Kind::StartOfFrame:
    return frame_ == 1;
  case Condition::Kind::Always:
    return true;
  case Condition::Kind::Compare: {
    const std::optional<Value> left = evaluate(*condition.left, *this);
    if (!left) {
      return false;
    }
    const std::optional<Value> right = evaluate(*condition.right, *this);
    if (!right) {
      return false;
    }
    return compareValues(*left, condition.op, *right, *this).value_or(false);
  }
  case Condition::Kind::Extension:
    break;
  }
  return testExtension(condition.call);
}

bool Game::testExtension(const RoutineCall &call) {
  ParameterFrame frame;
  frame.routine = &catalog_.conditions[static_cast<std::size_t>(call.code)];
  if (!evaluateArguments(call, frame.values)) {
    return false;
  }
  ParameterStack::Scope scope(parameters_, frame);
  const host::HostWord holds =
      routines_.conditions[call.code](objects_[static_cast<std::size_t>(call.object)].header,
                                      directWord(frame.values, 0), directWord(frame.values, 1));
  return holds != 0 && !stopped_;
}

void Game::run(const Action &action) {
  LineScope scope(runningLines_, action.where.line);
  if (!countStep()) {
    return;
  }
  switch (action.kind) {
  case Action::Kind::Display:
    if (const std::optional<Value> value = evaluate(*action.value, *this)) {
      out_ << formatValue(*value) << '\n';
    }
    return;
  case Action::Kind::EndApplication:
    ended_ = true;
    return;
  case Action::Kind::Extension:
    break;
  }
  runExtension(action.call, action.where.line);
}

void Game::runExtension(const RoutineCall &call, int line) {
  ParameterFrame frame;
  frame.routine = &catalog_.actions[static_cast<std::size_t>(call.code)];
  if (!evaluateArguments(call, frame.values)) {
    return;
  }
  trace_.action(static_cast<int>(depth_), line, call.object, *frame.routine, frame.values);
  ParameterStack::Scope scope(parameters_, frame);
  routines_.actions[call.code](objects_[static_cast<std::size_t>(call.object)].header,
                               directWord(frame.values, 0), directWord(frame.values, 1));
}

bool Game::evaluateArguments(const RoutineCall &call, std::vector<Value> &values) {
  values.reserve(call.arguments.size());
  for (const ExpressionPtr &argument : call.arguments) {
    std::optional<Value> value = evaluate(*argument, *this);
    if (!value) {
      return false;
    }
    values.push_back(std::move(*value));
  }
  return true;
}

bool Game::countStep() {
  if (++steps_ > options_.maxSteps) {
    stop("the game ran more than " + std::to_string(options_.maxSteps) +
         " steps (actions and raised events; see --max-steps)");
    return false;
  }
  return true;
}

void Game::stop(std::string message) {
  if (stopped_) {
    return;
  }
  stopped_ = true;
  stopMessage_ = std::move(message);
  stopLine_ = runningLines_.empty() ? 0 : runningLines_.back();
}

std::string Game::report() const {
  std::string where = sheetName_ + ":";
  if (stopLine_ > 0) {
    where += std::to_string(stopLine_) + ":";
  }
  return where + " error: " + stopMessage_;
}

int Game::objectOf(const host::ObjectHeader *header) const {
  for (std::size_t i = 0; i < objects_.size(); ++i) {
    if (objects_[i].header == header) {
      return static_cast<int>(i);
    }
  }
  return -1;
}

host::HostWord Game::generateEvent(host::ObjectHeader *object, host::HostWord code) {
  if (halted()) {
    afterHalt(object, code);
    return 0;
  }
  const int index = objectOf(object);
  if (index < 0) {
    stop("the extension raised an event for an object the host did not create");
    return 0;
  }
  if (!countStep()) {
    return 0;
  }
  if (depth_ >= options_.maxDepth) {
    stop("events nested more than " + std::to_string(options_.maxDepth) +
         " deep (see --max-depth)");
    return 0;
  }
  if (stackNearlyExhausted(kStackMargin)) {
    stop("events nested " + std::to_string(depth_) + " deep, too deep for the emulator's stack");
    return 0;
  }
  const bool known = code >= 0 && static_cast<std::size_t>(code) < catalog_.conditions.size();
  trace_.event(static_cast<int>(depth_), index,
               known ? &catalog_.conditions[static_cast<std::size_t>(code)] : nullptr, code);
  if (!known) {
    return 0;
  }
  ++depth_;
  for (const EventLine *line :
       triggered_[static_cast<std::size_t>(index)][static_cast<std::size_t>(code)]) {
    if (halted()) {
      break;
    }
    runLine(*line);
  }
  --depth_;
  return 0;
}

// Once the game has stopped or ended, no action runs, so a body that loops until it
// returns would run for ever; the host answers each new run of a body with the return
// action, which ends it.
void Game::afterHalt(host::ObjectHeader *object, host::HostWord code) {
  if (++raisesAfterHalt_ > kRaisesAfterHaltLimit) {
    out_.flush();
    if (!stopped_) {
      stop("the game ended");
    }
    err_ << report()
         << "; then the extension kept raising events, which can never end (a "
            "function called with a return type it cannot return, set to loop "
            "until it returns)"
         << std::endl;
    std::_Exit(kStopped);
  }
  if (code != host::kOnFunction || objectOf(object) < 0 ||
      catalog_.actions.size() <= static_cast<std::size_t>(kReturnActionCode)) {
    return;
  }
  ParameterFrame frame;
  frame.routine = &catalog_.actions[kReturnActionCode];
  ParameterStack::Scope scope(parameters_, frame);
  routines_.actions[kReturnActionCode](object, 0, 0);
}

host::HostWord Game::fetched(std::optional<host::HostWord> word, const std::string &fault) {
  if (!word) {
    stop("the extension broke the host's contract: " + fault);
    return 0;
  }
  return *word;
}

host::HostWord Game::fetchActionParam(host::HostWord mode) {
  if (stopped_) {
    return 0;
  }
  std::string fault;
  return fetched(parameters_.fetchAction(mode, fault), fault);
}

host::HostWord Game::fetchActionParamFloat(host::HostWord index) {
  if (stopped_) {
    return 0;
  }
  std::string fault;
  return fetched(parameters_.fetchActionFloat(index, fault), fault);
}

host::HostWord Game::fetchFirstExpressionParam(host::HostWord type, host::HostWord cookie) {
  if (stopped_) {
    return 0;
  }
  std::string fault;
  return fetched(parameters_.fetchFirstExpression(type, cookie, fault), fault);
}

host::HostWord Game::fetchNextExpressionParam(host::HostWord type, host::HostWord cookie) {
  if (stopped_) {
    return 0;
  }
  std::string fault;
  return fetched(parameters_.fetchNextExpression(type, cookie, fault), fault);
}

void Game::abandon(const std::string &why) noexcept {
  try {
    stop("the emulator failed: " + why);
  } catch (...) {
    stopped_ = true; // not even the message fits in memory
  }
}

std::optional<Value> Game::callExtension(const Expression &call, std::vector<Value> parameters) {
  if (stopped_) {
    return std::nullopt;
  }
  ParameterFrame frame;
  frame.routine = &catalog_.expressions[static_cast<std::size_t>(call.code)];
  frame.values = std::move(parameters);
  frame.cookie = ++lastCookie_;
  host::ObjectHeader *object = objects_[static_cast<std::size_t>(call.integer)].header;
  host::HostWord word = 0;
  {
    ParameterStack::Scope scope(parameters_, frame);
    object->hostFlags = 0;
    word = routines_.expressions[call.code](object, frame.cookie);
  }
  if (stopped_) {
    return std::nullopt;
  }
  const std::uint16_t flags = object->hostFlags;
  if ((flags & host::kStringResult) != 0) {
    const auto *text = reinterpret_cast<const char *>(word);
    return std::string(text != nullptr ? text : "");
  }
  if ((flags & host::kFloatResult) != 0) {
    return host::floatFromWord(word);
  }
  return static_cast<std::int32_t>(word);
}

void Game::fail(std::string message) {
  stop(std::move(message));
}

} // namespace morvex::emulator
