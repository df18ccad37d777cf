// The Linux stand-in for the setup and name dialogs: nobody sits at the screen, so a
// scripted user works each dialog the logic opens. Linux builds only: Windows builds show
// the real dialogs (setup_dialog_win32.cpp).
#ifndef MORVEX_EDITOR_SETUP_DIALOG_STANDIN_H
#define MORVEX_EDITOR_SETUP_DIALOG_STANDIN_H

#include "editor/setup_dialog_driver.h"

namespace morvex::editor {

// Installs the user who works every setup dialog runSetupDialog shows from now on, and
// answers the one it replaces. An empty user restores the default, who clicks OK at once.
// A user who returns with the dialog still open has walked away: the dialog is cancelled.
SetupDialogUser installStandinUser(SetupDialogUser user);

} // namespace morvex::editor

#endif
