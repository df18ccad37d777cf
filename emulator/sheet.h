// A parsed event sheet: its objects with their setup, and its event lines.
#ifndef MORVEX_EMULATOR_SHEET_H
#define MORVEX_EMULATOR_SHEET_H

#include "emulator/expression.h"
#include "emulator/line_matcher.h"
#include "emulator/source.h"

#include <string>
#include <vector>

namespace morvex::emulator {

// An object of the extension's kind and what its author set in the setup dialog.
struct ObjectSetup {
  std::string name;
  Location where;
  std::vector<std::string> functions; // as typed: any case, any length
  std::vector<std::string> members;
  bool verify = false; // "Verify Function Names Before Executing"
  bool loop = false;   // "Loop Functions Until They Return"
};

enum class CompareOp { Equal, NotEqual, Less, LessEqual, Greater, GreaterEqual };

struct Condition {
  enum class Kind { StartOfFrame, Always, Compare, Extension };

  Kind kind = Kind::Always;
  Location where;
  CompareOp op = CompareOp::Equal; // Compare
  ExpressionPtr left;              // Compare
  ExpressionPtr right;             // Compare
  RoutineCall call;                // Extension
};

struct Action {
  enum class Kind { Display, EndApplication, Extension };

  Kind kind = Kind::Display;
  Location where;
  ExpressionPtr value; // Display
  RoutineCall call;    // Extension
};

// Conditions that must all hold, and the actions they run.
struct EventLine {
  Location where; // its first condition
  std::vector<Condition> conditions;
  std::vector<Action> actions;

  // A line headed by an extension condition runs only when its object raises it.
  bool triggered() const {
    return !conditions.empty() && conditions.front().kind == Condition::Kind::Extension;
  }
};

struct Sheet {
  std::vector<ObjectSetup> objects; // in file order; an object's number is its index
  std::vector<EventLine> events;    // in file order
};

} // namespace morvex::emulator

#endif
