// An in-process host for tests: it creates objects, runs routines the way the host does
// (direct parameters, parameter fetches, hostFlags) and runs event lines written as
// lambdas when the extension raises its conditions, re-entrantly and to any depth.
#ifndef MORVEX_TESTS_TEST_HOST_H
#define MORVEX_TESTS_TEST_HOST_H

#include "host/contract.h"
#include "runtime/run_object.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <variant>
#include <vector>

namespace morvex::tests {

using host::HostWord;
using runtime::RunObject;

// The settings an author gives an object in the setup dialog.
struct ObjectSettings {
  std::vector<std::string> functions;
  std::vector<std::string> members;
  bool verify = false;
  bool loop = false;
};

// A missing text, as a host passes it: a null pointer.
struct NullText {};

// One parameter of an action or expression, as the host evaluated it.
using Param = std::variant<std::int32_t, float, std::string, NullText>;

// What an expression routine gave, with the type bits it set.
struct Result {
  HostWord word = 0;
  std::uint16_t flags = 0;

  std::int32_t integer() const { return static_cast<std::int32_t>(word); }
  float real() const { return host::floatFromWord(word); }
  std::string text() const { return word ? reinterpret_cast<const char *>(word) : "<null>"; }
  bool isFloat() const { return (flags & host::kFloatResult) != 0; }
  bool isString() const { return (flags & host::kStringResult) != 0; }
};

using ConditionFn = bool (*)(RunObject &, HostWord, HostWord);
using ActionFn = void (*)(RunObject &, HostWord, HostWord);
using ExpressionFn = HostWord (*)(RunObject &, HostWord);

class TestHost {
public:
  TestHost();
  ~TestHost(); // destroys the objects still alive, last created first
  TestHost(const TestHost &) = delete;
  TestHost &operator=(const TestHost &) = delete;

  // Creates an object from its stored settings (names kept as given, cut to 25
  // characters), or from a raw edit structure. The host owns the block until destroy().
  RunObject &create(const ObjectSettings &settings = {});
  RunObject &createFrom(const host::EditStructure *edit);
  void destroy(RunObject &object);

  // Event lines, run in the order added when `object` raises their condition. A line for
  // "On Function" first evaluates that condition with `name` when the line is reached.
  void onFunction(RunObject &object, std::string name, std::function<void()> body);
  void on(RunObject &object, HostWord conditionCode, std::function<void()> body);
  void clearLines();

  // Runs a routine as the host does: the first two parameters passed directly, every
  // parameter also available to the fetch services in order.
  void act(RunObject &object, ActionFn routine, std::vector<Param> params = {});
  Result eval(RunObject &object, ExpressionFn routine, std::vector<Param> params = {});
  bool test(RunObject &object, ConditionFn routine, std::vector<Param> params = {});

  // The same, by code through the routine tables, the way a real host reaches routines.
  void actByCode(RunObject &object, int code, std::vector<Param> params = {});
  Result evalByCode(RunObject &object, int code, std::vector<Param> params = {});
  bool testByCode(RunObject &object, int code, std::vector<Param> params = {});

  // Replaces text parameter `index` of the innermost running routine, freeing the old text,
  // the way a host reuses its buffers once a routine has fetched its parameters.
  void overwriteText(std::size_t index, std::string text);

  // How often each condition was raised, by any object.
  int raised(HostWord conditionCode) const;
  // Raises deeper than this fail the test (the real host has a bound too).
  int depth() const { return depth_; }

  host::RunHeader &runHeader() { return *runHeader_; }

  // Service entry points, reached through the RunHeader.
  static HostWord MORVEX_CALL generateEvent(host::ObjectHeader *, HostWord, HostWord);
  static HostWord MORVEX_CALL fetchActionParam(host::ObjectHeader *, HostWord, HostWord);
  static HostWord MORVEX_CALL fetchActionParamFloat(host::ObjectHeader *, HostWord, HostWord);
  static HostWord MORVEX_CALL fetchFirstExpressionParam(host::ObjectHeader *, HostWord, HostWord);
  static HostWord MORVEX_CALL fetchNextExpressionParam(host::ObjectHeader *, HostWord, HostWord);

private:
  struct Line {
    RunObject *object;
    HostWord code;
    std::optional<std::string> functionName;
    std::function<void()> body;
  };
  struct Frame {
    std::vector<Param> params;
    std::size_t next = 0;
    HostWord cookie = 0;
  };

  HostWord word(const Param &param, bool asFloat) const;
  // Pushes a parameter frame, runs `routine` with the first two parameters as words, pops.
  HostWord runWithParams(std::vector<Param> params, HostWord cookie,
                         const std::function<HostWord(HostWord, HostWord)> &routine);
  Frame &top();
  HostWord fetch(bool asFloat);

  std::unique_ptr<host::RunHeader> runHeader_;
  std::vector<RunObject *> objects_;
  std::vector<Line> lines_;
  std::vector<Frame> frames_;
  std::vector<int> raised_ = std::vector<int>(4, 0);
  int depth_ = 0;
};

// Builds the stored block an editor would have written for `settings`.
std::vector<std::uint8_t> editStructureFor(const ObjectSettings &settings);

} // namespace morvex::tests

#endif
