// Edit-time entry points that work on one object's edit structure: creating and editing
// it through the setup dialog, its rectangle, and converting an older block.
#include "editor/edit_structure.h"
#include "editor/setup_dialog.h"
#include "host/boundary.h"

#include <type_traits>

using morvex::host::EditorContext;
using morvex::host::EditStructure;
using morvex::host::HostWord;
using morvex::host::Rect;

namespace morvex::host {
namespace {
constexpr HostWord kCreated = 0;
constexpr HostWord kCreationCancelled = -1;
constexpr HostWord kEdited = 1;
constexpr HostWord kEditCancelled = 0;
} // namespace
} // namespace morvex::host

// Writes the creation defaults, then shows the setup dialog: 0 on OK, -1 on Cancel (also
// when there is no block or the dialog cannot run).
MORVEX_EXPORT HostWord MORVEX_CALL CreateObject(EditorContext *context, HostWord,
                                                EditStructure *edit) {
  if (edit == nullptr) {
    return morvex::host::kCreationCancelled;
  }
  return morvex::host::callGuarded(
      [&] {
        morvex::editor::writeCreationDefaults(*edit);
        return morvex::editor::runSetupDialog(context, *edit) ? morvex::host::kCreated
                                                              : morvex::host::kCreationCancelled;
      },
      morvex::host::kCreationCancelled);
}

// Shows the setup dialog: 1 when the block changed (OK), 0 otherwise.
MORVEX_EXPORT HostWord MORVEX_CALL EditObject(EditorContext *context, HostWord, HostWord,
                                              EditStructure *edit) {
  if (edit == nullptr) {
    return morvex::host::kEditCancelled;
  }
  return morvex::host::callGuarded(
      [&] {
        return morvex::editor::runSetupDialog(context, *edit) ? morvex::host::kEdited
                                                              : morvex::host::kEditCancelled;
      },
      morvex::host::kEditCancelled);
}

MORVEX_EXPORT void MORVEX_CALL GetObjectRect(EditorContext *, Rect *rect, HostWord,
                                             EditStructure *edit) {
  if (rect != nullptr && edit != nullptr) {
    morvex::editor::getObjectRect(*edit, *rect);
  }
}

// A converted block from the global heap, which the host takes over; null when there is
// nothing to convert.
MORVEX_EXPORT void *MORVEX_CALL UpdateEditStructure(EditorContext *, EditStructure *stored) {
  return morvex::host::callGuarded([&] { return morvex::editor::updateEditStructure(stored); },
                                   static_cast<void *>(nullptr));
}

static_assert(std::is_same_v<decltype(&CreateObject), morvex::host::CreateObjectFn>);
static_assert(std::is_same_v<decltype(&EditObject), morvex::host::EditObjectFn>);
static_assert(std::is_same_v<decltype(&GetObjectRect), morvex::host::GetObjectRectFn>);
static_assert(std::is_same_v<decltype(&UpdateEditStructure), morvex::host::UpdateEditStructureFn>);
