// Plays a parsed sheet with the loaded extension: creates the objects, runs the frame
// loop, runs triggered lines when the extension raises their conditions, answers the
// extension's parameter fetches, and stops the game at the limits.
#ifndef MORVEX_EMULATOR_GAME_H
#define MORVEX_EMULATOR_GAME_H

#include "emulator/evaluator.h"
#include "emulator/extension.h"
#include "emulator/host_services.h"
#include "emulator/parameter_stack.h"
#include "emulator/sheet.h"
#include "emulator/trace.h"

#include <cstdint>
#include <memory>
#include <ostream>
#include <string>
#include <vector>

namespace morvex::emulator {

struct PlayOptions {
  std::int64_t frames = 1;
  bool trace = false;
  std::int64_t maxDepth = 10'000;      // nesting of raised events
  std::int64_t maxSteps = 100'000'000; // actions run and events raised
};

// Exit statuses of `morvex play`.
inline constexpr int kEndedNormally = 0;
inline constexpr int kStopped = 1;

class Game final : HostServices, ExpressionCalls {
public:
  // Borrows everything; `sheetName` names the sheet in error messages. Display writes to
  // `out`, errors and the trace to `err`.
  Game(Extension &extension, const Sheet &sheet, std::string sheetName, PlayOptions options,
       std::ostream &out, std::ostream &err);
  ~Game() override;
  Game(const Game &) = delete;
  Game &operator=(const Game &) = delete;

  // Creates the objects, plays the frames and destroys the objects. Answers kEndedNormally
  // or, after writing "FILE:LINE: error: TEXT" to `err`, kStopped.
  int play();

private:
  struct RunningObject;

  // Frame loop and event lines.
  void createObjects();
  void destroyObjects();
  void runLine(const EventLine &line);
  bool holds(const Condition &condition);
  bool testExtension(const RoutineCall &call);
  void run(const Action &action);
  void runExtension(const RoutineCall &call, int line);
  bool evaluateArguments(const RoutineCall &call, std::vector<Value> &values);

  // Limits and stopping.
  bool halted() const { return stopped_ || ended_; }
  bool countStep();
  void stop(std::string message);
  void afterHalt(host::ObjectHeader *object, host::HostWord code);
  std::string report() const;
  int objectOf(const host::ObjectHeader *header) const;

  // HostServices.
  host::HostWord generateEvent(host::ObjectHeader *object, host::HostWord code) override;
  host::HostWord fetchActionParam(host::HostWord mode) override;
  host::HostWord fetchActionParamFloat(host::HostWord index) override;
  host::HostWord fetchFirstExpressionParam(host::HostWord type, host::HostWord cookie) override;
  host::HostWord fetchNextExpressionParam(host::HostWord type, host::HostWord cookie) override;
  void abandon(const std::string &why) noexcept override;
  host::HostWord fetched(std::optional<host::HostWord> word, const std::string &fault);

  // ExpressionCalls.
  std::optional<Value> callExtension(const Expression &call,
                                     std::vector<Value> parameters) override;
  void fail(std::string message) override;

  Extension &extension_;
  const Catalog &catalog_;
  const host::RunObjectInfos &routines_;
  const Sheet &sheet_;
  std::string sheetName_;
  PlayOptions options_;
  std::ostream &out_;
  std::ostream &err_;

  std::vector<std::string> objectNames_;
  std::vector<RunningObject> objects_;
  std::unique_ptr<HostRunHeader> runHeader_;
  std::vector<host::HostObject> hostObjects_;       // what "CountSelected(" reads
  std::vector<std::uint8_t> selectionRecords_;      // one 114-byte record per object
  std::vector<host::ObjectTableEntry> objectTable_; // one entry per object
  std::vector<std::vector<std::vector<const EventLine *>>> triggered_; // [object][code]
  std::vector<const EventLine *> frameLines_;
  ParameterStack parameters_;
  Trace trace_;

  bool stopped_ = false;
  bool ended_ = false;
  std::string stopMessage_;
  int stopLine_ = 0;
  std::vector<int> runningLines_; // sheet lines being run, innermost last
  std::int64_t steps_ = 0;
  std::int64_t depth_ = 0;
  std::int64_t frame_ = 0;
  host::HostWord lastCookie_ = 0;
  std::int64_t raisesAfterHalt_ = 0;
};

} // namespace morvex::emulator

#endif
