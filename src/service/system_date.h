// GetSystemDate: the update service's date query. Never fails: errors become result texts.
#pragma once

#include <string>

#include "common/ports.h"

namespace checker {

std::string GetSystemDate(HttpPort& http, DatesPort& dates, const std::string& baseAddress);

// The update service's base address: CHECKER_UPDATE_SERVER when set, else the built-in default.
std::string fnUpdateServerAddress();

} // namespace checker
