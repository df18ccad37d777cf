// Entry points of the host's event editor: the menus of conditions, actions and
// expressions, codes from menu commands, the event-information records, display strings,
// titles and parameter prompts.
#include "editor/event_infos.h"
#include "editor/event_menus.h"
#include "editor/event_texts.h"
#include "host/boundary.h"

#include <type_traits>

using morvex::editor::EventKind;
using morvex::host::EditorContext;
using morvex::host::HostWord;
using morvex::host::MenuHandle;

namespace morvex::host {
namespace {

// A new pop-up menu that the host owns and destroys; null when none can be given.
MenuHandle giveEventMenu(const EditorContext *context, EventKind kind) {
  return static_cast<MenuHandle>(editor::buildEventMenu(context, kind));
}

HostWord findCodeFromMenu(EventKind kind, std::uint16_t command) {
  return editor::findCode(kind, command);
}

// The record from its code field on, static data of the module; null for an unknown code.
const std::uint16_t *findHostRecord(EventKind kind, std::uint16_t code) {
  const auto found = editor::findRecord(kind, code);
  return found ? found->hostView() : nullptr;
}

} // namespace
} // namespace morvex::host

MORVEX_EXPORT MenuHandle MORVEX_CALL GetConditionMenu(EditorContext *context, HostWord, HostWord) {
  return morvex::host::giveEventMenu(context, EventKind::condition);
}
MORVEX_EXPORT MenuHandle MORVEX_CALL GetActionMenu(EditorContext *context, HostWord, HostWord) {
  return morvex::host::giveEventMenu(context, EventKind::action);
}
MORVEX_EXPORT MenuHandle MORVEX_CALL GetExpressionMenu(EditorContext *context, HostWord, HostWord) {
  return morvex::host::giveEventMenu(context, EventKind::expression);
}

MORVEX_EXPORT HostWord MORVEX_CALL GetConditionCodeFromMenu(EditorContext *,
                                                            std::uint16_t command) {
  return morvex::host::findCodeFromMenu(EventKind::condition, command);
}
MORVEX_EXPORT HostWord MORVEX_CALL GetActionCodeFromMenu(EditorContext *, std::uint16_t command) {
  return morvex::host::findCodeFromMenu(EventKind::action, command);
}
MORVEX_EXPORT HostWord MORVEX_CALL GetExpressionCodeFromMenu(EditorContext *,
                                                             std::uint16_t command) {
  return morvex::host::findCodeFromMenu(EventKind::expression, command);
}

MORVEX_EXPORT const std::uint16_t *MORVEX_CALL GetConditionInfos(EditorContext *,
                                                                 std::uint16_t code) {
  return morvex::host::findHostRecord(EventKind::condition, code);
}
MORVEX_EXPORT const std::uint16_t *MORVEX_CALL GetActionInfos(EditorContext *, std::uint16_t code) {
  return morvex::host::findHostRecord(EventKind::action, code);
}
MORVEX_EXPORT const std::uint16_t *MORVEX_CALL GetExpressionInfos(EditorContext *,
                                                                  std::uint16_t code) {
  return morvex::host::findHostRecord(EventKind::expression, code);
}

MORVEX_EXPORT void MORVEX_CALL GetConditionString(EditorContext *context, std::uint16_t code,
                                                  char *buffer, std::uint16_t size) {
  morvex::editor::loadDisplayString(context, EventKind::condition, code, buffer, size);
}
MORVEX_EXPORT void MORVEX_CALL GetActionString(EditorContext *context, std::uint16_t code,
                                               char *buffer, std::uint16_t size) {
  morvex::editor::loadDisplayString(context, EventKind::action, code, buffer, size);
}
MORVEX_EXPORT void MORVEX_CALL GetExpressionString(EditorContext *context, std::uint16_t code,
                                                   char *buffer, std::uint16_t size) {
  morvex::editor::loadDisplayString(context, EventKind::expression, code, buffer, size);
}

MORVEX_EXPORT void MORVEX_CALL GetConditionTitle(EditorContext *, std::uint16_t code,
                                                 std::uint16_t param, char *buffer,
                                                 std::uint16_t size) {
  morvex::editor::loadParameterTitle(EventKind::condition, code, param, buffer, size);
}
MORVEX_EXPORT void MORVEX_CALL GetActionTitle(EditorContext *, std::uint16_t code,
                                              std::uint16_t param, char *buffer,
                                              std::uint16_t size) {
  morvex::editor::loadParameterTitle(EventKind::action, code, param, buffer, size);
}
MORVEX_EXPORT void MORVEX_CALL GetExpressionTitle(EditorContext *, std::uint16_t code, char *buffer,
                                                  std::uint16_t size) {
  morvex::editor::loadExpressionTitle(code, buffer, size);
}
MORVEX_EXPORT void MORVEX_CALL GetExpressionParam(EditorContext *, std::uint16_t code,
                                                  std::uint16_t param, char *buffer,
                                                  std::uint16_t size) {
  morvex::editor::loadExpressionParam(code, param, buffer, size);
}

// The extension defines no parameter types of its own.
MORVEX_EXPORT void MORVEX_CALL InitParameter(EditorContext *, HostWord, HostWord) {
}
MORVEX_EXPORT void MORVEX_CALL EditParameter(EditorContext *, HostWord, HostWord) {
}
MORVEX_EXPORT void MORVEX_CALL GetParameterString(EditorContext *, HostWord, HostWord, HostWord,
                                                  HostWord) {
}

static_assert(std::is_same_v<decltype(&GetConditionMenu), morvex::host::GetMenuFn>);
static_assert(std::is_same_v<decltype(&GetActionMenu), morvex::host::GetMenuFn>);
static_assert(std::is_same_v<decltype(&GetExpressionMenu), morvex::host::GetMenuFn>);
static_assert(std::is_same_v<decltype(&GetConditionCodeFromMenu), morvex::host::GetCodeFromMenuFn>);
static_assert(std::is_same_v<decltype(&GetActionCodeFromMenu), morvex::host::GetCodeFromMenuFn>);
static_assert(
    std::is_same_v<decltype(&GetExpressionCodeFromMenu), morvex::host::GetCodeFromMenuFn>);
static_assert(std::is_same_v<decltype(&GetConditionInfos), morvex::host::GetInfosRecordFn>);
static_assert(std::is_same_v<decltype(&GetActionInfos), morvex::host::GetInfosRecordFn>);
static_assert(std::is_same_v<decltype(&GetExpressionInfos), morvex::host::GetInfosRecordFn>);
static_assert(std::is_same_v<decltype(&GetConditionString), morvex::host::GetStringFn>);
static_assert(std::is_same_v<decltype(&GetActionString), morvex::host::GetStringFn>);
static_assert(std::is_same_v<decltype(&GetExpressionString), morvex::host::GetStringFn>);
static_assert(std::is_same_v<decltype(&GetConditionTitle), morvex::host::GetTitleFn>);
static_assert(std::is_same_v<decltype(&GetActionTitle), morvex::host::GetTitleFn>);
static_assert(std::is_same_v<decltype(&GetExpressionTitle), morvex::host::GetExpressionTitleFn>);
static_assert(std::is_same_v<decltype(&GetExpressionParam), morvex::host::GetExpressionParamFn>);
