// The setup dialog as the edit-time entry points run it.
#ifndef MORVEX_EDITOR_SETUP_DIALOG_H
#define MORVEX_EDITOR_SETUP_DIALOG_H

#include "host/contract.h"

namespace morvex::editor {

// Shows the setup dialog, modal over the host's main window (none when `context` is
// null), on `edit`. True when the author closed it with OK: the options and both lists
// have then been written back into `edit`, which must have room for
// kMaxEditStructureSize bytes. False on Cancel, and when the dialog could not be shown:
// `edit` is then untouched.
bool runSetupDialog(host::EditorContext *context, host::EditStructure &edit);

} // namespace morvex::editor

#endif
