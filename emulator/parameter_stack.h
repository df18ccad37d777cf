// The parameters of the routines that are running, one frame per routine, innermost on
// top: the fetch services always read the frame of the routine that calls them, so an
// action whose event runs further actions keeps its own place.
#ifndef MORVEX_EMULATOR_PARAMETER_STACK_H
#define MORVEX_EMULATOR_PARAMETER_STACK_H

#include "emulator/catalog.h"
#include "emulator/value.h"
#include "host/contract.h"

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

namespace morvex::emulator {

// The evaluated parameters of one running routine. The texts' pointers handed to the
// extension point into `values`, so a frame must stay where it is while it is pushed.
struct ParameterFrame {
  const RoutineInfo *routine = nullptr;
  std::vector<Value> values;
  std::size_t next = 0;      // the next parameter FetchActionParam/FetchNext... gives
  host::HostWord cookie = 0; // expressions: the value passed beside the object
};

// A parameter as a word: a text as a pointer to its characters (owned by the frame),
// a number as an integer (floats truncated) or, with `asFloat`, as a float's bit pattern.
host::HostWord wordOf(const Value &value, bool asFloat);

class ParameterStack {
public:
  // Pushes a frame for the lifetime of the scope; the frame is the caller's and must
  // outlive the scope.
  class Scope {
  public:
    Scope(ParameterStack &stack, ParameterFrame &frame) : stack_(stack) {
      stack_.frames_.push_back(&frame);
    }
    ~Scope() { stack_.frames_.pop_back(); }
    Scope(const Scope &) = delete;
    Scope &operator=(const Scope &) = delete;

  private:
    ParameterStack &stack_;
  };

  // The services' answers. Each gives the word, or nothing with `fault` saying how the
  // extension asked for something the running routine does not have.
  std::optional<host::HostWord> fetchAction(host::HostWord mode, std::string &fault);
  std::optional<host::HostWord> fetchActionFloat(host::HostWord index, std::string &fault);
  std::optional<host::HostWord> fetchFirstExpression(host::HostWord type, host::HostWord cookie,
                                                     std::string &fault);
  std::optional<host::HostWord> fetchNextExpression(host::HostWord type, host::HostWord cookie,
                                                    std::string &fault);

  std::size_t depth() const { return frames_.size(); }

private:
  ParameterFrame *top(RoutineKind kind, const char *service, std::string &fault);
  // The running expression's frame, when the cookie is the one it was given.
  ParameterFrame *expressionTop(host::HostWord cookie, const char *service, std::string &fault);
  std::optional<host::HostWord> take(ParameterFrame &frame, std::size_t index, bool asFloat,
                                     bool wantsText, const char *service, std::string &fault);

  std::vector<ParameterFrame *> frames_; // borrowed from the scopes that pushed them
};

} // namespace morvex::emulator

#endif
