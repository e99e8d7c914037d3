// KillProcessByName: end every running process whose image name ends with the name.
#pragma once

#include <string_view>

#include "common/ports.h"

namespace checker {

// Plain tail comparison, case ignored: no separator or extension required in front.
bool fnImageNameMatches(std::string_view imageName, std::string_view name);

void KillProcessByName(ProcessesPort& processes, std::string_view name);

} // namespace checker
