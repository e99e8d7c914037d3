#include "tray/commands.h"

#include "common/constants.h"
#include "startup/host_profile.h"
#include "startup/kill_process.h"

namespace checker {

bool fnStartsUpdater(UserCommand command) {
    return command == UserCommand::GetUpdate || command == UserCommand::CheckUpdate;
}

std::string fnUpdaterPath(const std::string& strFolder) {
    return strFolder + std::string(tray::kUpdaterExe);
}

void prCommandSteps(UserCommand command, ProcessesPort& processes, const std::string& strFolder,
                    bool blnSecondProduct, const std::function<void()>& removeTrayIcon) {
    if (fnStartsUpdater(command)) processes.start(fnUpdaterPath(strFolder), tray::kShowMaximized);
    removeTrayIcon();
    KillProcessByName(processes, titleNameFor(blnSecondProduct));
}

} // namespace checker
