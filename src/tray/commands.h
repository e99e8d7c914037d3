// The four user commands: two labels of the shown window and two tray menu items. Every one of
// them ends the checker; two start the updater first.
#pragma once

#include <functional>
#include <string>

#include "common/ports.h"

namespace checker {

enum class UserCommand { GetUpdate, CheckUpdate, Cancel, Close };

bool fnStartsUpdater(UserCommand command);
std::string fnUpdaterPath(const std::string& strFolder);

// Everything a command does before the program ends, in order: start the updater maximized
// without waiting (when the command does), remove the tray icon, KillProcessByName with the
// title name. A failing start stops the command before the icon goes (thrown to the caller).
void prCommandSteps(UserCommand command, ProcessesPort& processes, const std::string& strFolder,
                    bool blnSecondProduct, const std::function<void()>& removeTrayIcon);

} // namespace checker
