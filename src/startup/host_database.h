// The texts of the host database reads and the installed-version split: the parts of the
// database road that need no automation object.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

#include "startup/customer_record.h"

namespace checker {

// The password is the first "~" field of what the protection component deciphers; an empty
// text has no first field (error 9).
std::string fnPasswordFromPlan(std::string_view deciphered);

std::string fnConnectionString(std::string_view databasePath, std::string_view password);

// "Plan = 999", "Plan = 14" (filter) and "plan = 14" (find).
std::string fnPlanFilter(int plan);
std::string fnPlanFind(int plan);

// Sets strMajorVersion ("a.b") and strMinorVersion (last part) from a dotted file version.
// Returns false for an empty text: the program then ends silently. A text with fewer than two
// parts throws error 9.
bool fnApplyInstalledVersion(std::string_view fileVersion, CustomerRecord& record);

} // namespace checker
