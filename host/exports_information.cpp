// Entry points that describe the module and the object: identity, texts, the run-time
// information record with the routine tables, the help file and the property list.
#include "editor/event_texts.h"
#include "editor/resource_ids.h"
#include "host/boundary.h"
#include "runtime/routine_tables.h"

#include <cstring>
#include <type_traits>

using morvex::host::EditorContext;
using morvex::host::EditStructure;
using morvex::host::HostWord;
using morvex::host::RunObjectInfos;

namespace morvex::host {
namespace {

// Sizes of the five GetObjInfos buffers, in characters with the terminating zero.
constexpr std::size_t kNameSize = 255;
constexpr std::size_t kAuthorSize = 255;
constexpr std::size_t kCopyrightSize = 255;
constexpr std::size_t kCommentSize = 1024;
constexpr std::size_t kWebSize = 255;

constexpr std::uint16_t kNewEditStructureSize = 68;
constexpr std::uint8_t kPriority = 100;
constexpr char kIdentifier[4] = {'3', 'Q', 'N', 'Z'};
static_assert(kNewEditStructureSize == sizeof(EditStructure));

// The host's property list holding no property: an end marker only. The host reads it
// during EditorRequest; it is static and never changes.
HostWord emptyPropertyList[4] = {};

} // namespace
} // namespace morvex::host

// Answers for the host's information codes: 0x300 for 0, 0x100 for 2, 2 for 6, 219 for 7.
MORVEX_EXPORT HostWord MORVEX_CALL GetInfos(HostWord code) {
  switch (code) {
  case 0:
    return 0x300;
  case 2:
    return 0x100;
  case 6:
    return 2;
  case 7:
    return 219;
  default:
    return 0;
  }
}

MORVEX_EXPORT void MORVEX_CALL GetObjInfos(EditorContext *, EditStructure *, char *name,
                                           char *author, char *copyright, char *comment,
                                           char *web) {
  using morvex::editor::loadResourceString;
  loadResourceString(IDS_OBJECT_NAME, name, morvex::host::kNameSize);
  loadResourceString(IDS_OBJECT_AUTHOR, author, morvex::host::kAuthorSize);
  loadResourceString(IDS_OBJECT_COPYRIGHT, copyright, morvex::host::kCopyrightSize);
  loadResourceString(IDS_OBJECT_COMMENT, comment, morvex::host::kCommentSize);
  loadResourceString(IDS_OBJECT_WEB, web, morvex::host::kWebSize);
}

// A constant text of the module, relative to the host's folder.
MORVEX_EXPORT const char *MORVEX_CALL GetHelpFileName() {
  return "Help\\Morvex.html";
}

// Fills the host's record field by field; byte 25 is left as the host had it. The tables
// are static data of the module, valid while it is loaded. Answers 1,
// or 0 when there is no record to fill.
MORVEX_EXPORT HostWord MORVEX_CALL GetRunObjectInfos(void *, RunObjectInfos *infos) {
  if (infos == nullptr) {
    return 0;
  }
  infos->conditions = morvex::runtime::conditionTable().data();
  infos->actions = morvex::runtime::actionTable().data();
  infos->expressions = morvex::runtime::expressionTable().data();
  infos->conditionCount = morvex::host::kConditionCount;
  infos->actionCount = morvex::host::kActionCount;
  infos->expressionCount = morvex::host::kExpressionCount;
  infos->editStructureSize = morvex::host::kNewEditStructureSize;
  infos->options = 0;
  infos->priority = morvex::host::kPriority;
  infos->reserved26 = 0;
  std::memcpy(infos->identifier, morvex::host::kIdentifier, sizeof infos->identifier);
  infos->editStructureVersion = static_cast<std::uint16_t>(morvex::host::kEditVersion);
  return 1;
}

// Hands the host the empty property list. Answers 1 once it has been handed over, 0 when
// the host offers no EditorRequest service to hand it through.
MORVEX_EXPORT HostWord MORVEX_CALL GetProperties(EditorContext *context, EditStructure *edit,
                                                 HostWord) {
  if (context == nullptr || context->EditorRequest == nullptr) {
    return 0;
  }
  context->EditorRequest(edit, 1, morvex::host::emptyPropertyList, 1, 1);
  return 1;
}

static_assert(std::is_same_v<decltype(&GetInfos), morvex::host::GetInfosFn>);
static_assert(std::is_same_v<decltype(&GetObjInfos), morvex::host::GetObjInfosFn>);
static_assert(std::is_same_v<decltype(&GetHelpFileName), morvex::host::GetHelpFileNameFn>);
static_assert(std::is_same_v<decltype(&GetRunObjectInfos), morvex::host::GetRunObjectInfosFn>);
static_assert(std::is_same_v<decltype(&GetProperties), morvex::host::GetPropertiesFn>);
