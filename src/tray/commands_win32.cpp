// The four user commands of frmCheckUpdate. The labels end the program at once; the menu items
// unload the window, which ends the program when the handler returns.
#include "tray/commands.h"
#include "tray/frmCheckUpdate_win32.h"

namespace checker {

void frmCheckUpdate::LblGetUpdate_Click() {
    prCommandSteps(UserCommand::GetUpdate, processes_, strFolder, profile.blnSecondProduct,
                   [this] { prRemoveTrayIcon(); });
    ::ExitProcess(0);
}

void frmCheckUpdate::mnuUpdate_Click() {
    prCommandSteps(UserCommand::CheckUpdate, processes_, strFolder, profile.blnSecondProduct,
                   [this] { prRemoveTrayIcon(); });
    prUnload();
}

void frmCheckUpdate::lblCancel_Click() {
    prCommandSteps(UserCommand::Cancel, processes_, strFolder, profile.blnSecondProduct,
                   [this] { prRemoveTrayIcon(); });
    ::ExitProcess(0);
}

void frmCheckUpdate::mnuClose_Click() {
    prCommandSteps(UserCommand::Close, processes_, strFolder, profile.blnSecondProduct,
                   [this] { prRemoveTrayIcon(); });
    prUnload();
}

} // namespace checker
