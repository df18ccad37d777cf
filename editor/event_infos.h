// The event-information tables: for every condition, action and expression, its menu
// command, display string, result type, parameter types and parameter prompts, as runs of
// 16-bit fields the host reads directly.
#ifndef MORVEX_EDITOR_EVENT_INFOS_H
#define MORVEX_EDITOR_EVENT_INFOS_H

#include "editor/resource_ids.h"
#include "host/contract.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>

namespace morvex::editor {

// Parameter and result types of the records, as the host reads them.
using host::eventinfo::kFloatResult;
using host::eventinfo::kIntegerArgument;
using host::eventinfo::kIntegerResult;
using host::eventinfo::kNumberParam;
using host::eventinfo::kObjectParam;
using host::eventinfo::kStringArgument;
using host::eventinfo::kStringParam;
using host::eventinfo::kStringResult;

// Fields of a record: menu command, display string, code, flags, parameter count n, then
// n parameter types and n prompt strings (0 for none).
inline constexpr std::size_t kMenuField = 0;
inline constexpr std::size_t kStringField = 1;
inline constexpr std::size_t kCodeField = 2;
inline constexpr std::size_t kFlagsField = 3;
inline constexpr std::size_t kCountField = 4;
inline constexpr std::size_t kHeadFields = 5;

namespace prompt {
inline constexpr std::uint16_t kInstance = IDS_PROMPT_INSTANCE_NAME;
inline constexpr std::uint16_t kFunction = IDS_PROMPT_FUNCTION_NAME;
inline constexpr std::uint16_t kInteger = IDS_PROMPT_INTEGER;
inline constexpr std::uint16_t kFloat = IDS_PROMPT_FLOAT;
inline constexpr std::uint16_t kString = IDS_PROMPT_STRING;
inline constexpr std::uint16_t kVariable = IDS_PROMPT_VARIABLE_NAME;
inline constexpr std::uint16_t kParameters = IDS_PROMPT_PARAMETER_LIST;
inline constexpr std::uint16_t kReturnType = IDS_PROMPT_RETURN_TYPE;
inline constexpr std::uint16_t kSlot = IDS_PROMPT_SLOT_NUMBER;
inline constexpr std::uint16_t kErrorCode = IDS_PROMPT_ERROR_CODE;
inline constexpr std::uint16_t kObject = IDS_PROMPT_OBJECT;
} // namespace prompt

// clang-format off
inline constexpr auto conditionInfos = std::to_array<std::uint16_t>({
  // menu   string code flags n  types...      prompts...
    26000, 6000,  0,   0,    1, kStringParam, prompt::kFunction, // On Function
    26010, 6010,  1,   0,    0,                                  // On Error
    26020, 6020,  2,   0,    0,                                  // On Creation of an Instance
    26030, 6030,  3,   0,    0,                                  // On Destruction of an Instance
});

inline constexpr auto actionInfos = std::to_array<std::uint16_t>({
  // Specify an Instance
    25000, 5000,  0, 0, 5, kStringParam, kStringParam, kStringParam, kNumberParam, kNumberParam,
                           prompt::kInstance, prompt::kFunction, prompt::kParameters,
                           prompt::kReturnType, prompt::kSlot,
    25010, 5010,  1, 0, 3, kStringParam, kStringParam, kNumberParam,
                           prompt::kInstance, prompt::kVariable, prompt::kInteger,
    25020, 5020,  2, 0, 3, kStringParam, kStringParam, kNumberParam,
                           prompt::kInstance, prompt::kVariable, prompt::kFloat,
    25030, 5030,  3, 0, 3, kStringParam, kStringParam, kStringParam,
                           prompt::kInstance, prompt::kVariable, prompt::kString,
  // Current Instance
    25040, 5040,  4, 0, 4, kStringParam, kStringParam, kNumberParam, kNumberParam,
                           prompt::kFunction, prompt::kParameters, prompt::kReturnType, prompt::kSlot,
    25050, 5050,  5, 0, 2, kStringParam, kNumberParam, prompt::kVariable, prompt::kInteger,
    25060, 5060,  6, 0, 2, kStringParam, kNumberParam, prompt::kVariable, prompt::kFloat,
    25070, 5070,  7, 0, 2, kStringParam, kStringParam, prompt::kVariable, prompt::kString,
  // Instances
    25080, 5080,  8, 0, 2, kStringParam, kStringParam, prompt::kInstance, prompt::kParameters,
    25090, 5090,  9, 0, 1, kStringParam, prompt::kInstance,
  // Returns
    25100, 5100, 10, 0, 0,
    25110, 5110, 11, 0, 1, kNumberParam, prompt::kInteger,
    25120, 5120, 12, 0, 1, kNumberParam, prompt::kFloat,
    25130, 5130, 13, 0, 1, kStringParam, prompt::kString,
  // Global Variables
    25140, 5140, 14, 0, 1, kStringParam, prompt::kVariable,
    25150, 5150, 15, 0, 2, kStringParam, kNumberParam, prompt::kVariable, prompt::kInteger,
    25160, 5160, 16, 0, 2, kStringParam, kNumberParam, prompt::kVariable, prompt::kFloat,
    25170, 5170, 17, 0, 2, kStringParam, kStringParam, prompt::kVariable, prompt::kString,
  // Local Variables
    25180, 5180, 18, 0, 1, kStringParam, prompt::kVariable,
    25190, 5190, 19, 0, 2, kStringParam, kNumberParam, prompt::kVariable, prompt::kInteger,
    25200, 5200, 20, 0, 2, kStringParam, kNumberParam, prompt::kVariable, prompt::kFloat,
    25210, 5210, 21, 0, 2, kStringParam, kStringParam, prompt::kVariable, prompt::kString,
  // The rest
    25220, 5220, 22, 0, 0,                                        // Clear Expression Error Code
    25230, 5230, 23, 0, 0,                                        // Loop Current Function
    25240, 5240, 24, 0, 1, kStringParam, prompt::kInstance,       // Set Default Instance
    25250, 5250, 25, 0, 1, kNumberParam, prompt::kErrorCode,      // Generate Error
    25260, 5260, 26, 0, 0,                                        // Destroy All Instances
    25270, 5270, 27, 0, 1, kObjectParam, prompt::kObject,         // Count all Selected
});

inline constexpr auto expressionInfos = std::to_array<std::uint16_t>({
  // menu   string code flags           n  types...                          prompts
    27000, 7000,  0, kIntegerResult, 1, kIntegerArgument, 0,                     // IntegerSlot(
    27010, 7010,  1, kFloatResult,   1, kIntegerArgument, 0,                     // FloatSlot(
    27020, 7020,  2, kStringResult,  1, kIntegerArgument, 0,                     // StringSlot$(
    27030, 7030,  3, kIntegerResult, 2, kStringArgument, kStringArgument, 0, 0,  // IntOfInstance(
    27040, 7040,  4, kFloatResult,   2, kStringArgument, kStringArgument, 0, 0,  // FloatOfInstance(
    27050, 7050,  5, kStringResult,  2, kStringArgument, kStringArgument, 0, 0,  // StringOfInstance$(
    27060, 7060,  6, kIntegerResult, 1, kStringArgument, 0,                      // IntOfCurrInstance(
    27070, 7070,  7, kFloatResult,   1, kStringArgument, 0,                      // FloatOfCurrInstance(
    27080, 7080,  8, kStringResult,  1, kStringArgument, 0,                      // StringOfCurrInstance$(
    27090, 7090,  9, kIntegerResult, 1, kStringArgument, 0,                      // GlobalInt(
    27100, 7100, 10, kFloatResult,   1, kStringArgument, 0,                      // GlobalFloat(
    27110, 7110, 11, kStringResult,  1, kStringArgument, 0,                      // GlobalString$(
    27120, 7120, 12, kIntegerResult, 1, kStringArgument, 0,                      // LocalInt(
    27130, 7130, 13, kFloatResult,   1, kStringArgument, 0,                      // LocalFloat(
    27140, 7140, 14, kStringResult,  1, kStringArgument, 0,                      // LocalString$(
    27150, 7150, 15, kIntegerResult, 0,                                          // FunctionLoopNumber(
    27160, 7160, 16, kIntegerResult, 0,                                          // Error(
    27170, 7170, 17, kStringResult,  1, kStringArgument, 0,                      // FormatString$(
    27180, 7180, 18, kStringResult,  1, kStringArgument, 0,                      // UnformatString$(
    27190, 7190, 19, kStringResult,  0,                                          // GetInstanceName$(
    27200, 7200, 20, kIntegerResult, 0,                                          // GetReturnType(
    27210, 7210, 21, kIntegerResult, 0,                                          // ExpressionError(
    27220, 7220, 22, kIntegerResult, 0,                                          // NumberOfParameters(
    27230, 7230, 23, kFloatResult,   0,                                          // ObjectVersion(
    27240, 7240, 24, kIntegerResult, 1, kIntegerArgument, 0,                     // CountSelected(
});
// clang-format on

enum class EventKind { condition, action, expression };

// One table with what its records must agree with.
struct EventTable {
  std::span<const std::uint16_t> fields;
  std::uint16_t recordCount;
  std::uint16_t menuBase;   // menu command of code k: menuBase + 10 * k
  std::uint16_t stringBase; // display string of code k: stringBase + 10 * k
  std::uint16_t menuResource;
};

constexpr EventTable eventTable(EventKind kind) {
  switch (kind) {
  case EventKind::condition:
    return {conditionInfos, 4, IDM_CONDITION_BASE, IDS_CONDITION_BASE, IDR_CONDITION_MENU};
  case EventKind::action:
    return {actionInfos, 28, IDM_ACTION_BASE, IDS_ACTION_BASE, IDR_ACTION_MENU};
  case EventKind::expression:
    break;
  }
  return {expressionInfos, 25, IDM_EXPRESSION_BASE, IDS_EXPRESSION_BASE, IDR_EXPRESSION_MENU};
}

// A view of one record of a table. The fields are static data of the module.
class EventRecord {
public:
  explicit constexpr EventRecord(std::span<const std::uint16_t> fields) : fields_(fields) {}

  constexpr std::uint16_t menuCommand() const { return fields_[kMenuField]; }
  constexpr std::uint16_t displayString() const { return fields_[kStringField]; }
  constexpr std::uint16_t code() const { return fields_[kCodeField]; }
  constexpr std::uint16_t flags() const { return fields_[kFlagsField]; }
  constexpr std::uint16_t parameterCount() const { return fields_[kCountField]; }
  // Parameter `index` (below parameterCount()): its type and its prompt string.
  constexpr std::uint16_t parameterType(std::size_t index) const {
    return fields_[kHeadFields + index];
  }
  constexpr std::uint16_t promptString(std::size_t index) const {
    return fields_[kHeadFields + parameterCount() + index];
  }
  // The record from its code field on, as the host reads it; lives as long as the module.
  constexpr const std::uint16_t *hostView() const { return fields_.data() + kCodeField; }

private:
  std::span<const std::uint16_t> fields_;
};

// The record of `code`, found by walking the table from its first record; none for a code
// the table does not hold.
std::optional<EventRecord> findRecord(EventKind kind, int code);

// The code of the record whose menu command is `command`, or -1 when none has it.
int findCode(EventKind kind, unsigned command);

} // namespace morvex::editor

#endif
