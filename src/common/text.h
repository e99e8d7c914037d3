// Text helpers shared by every subsystem.
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace checker {

// A private-profile value as the checker uses it: every NUL removed, blanks trimmed at both ends.
std::string fnCleanValue(std::string_view raw);

// Blanks (only " ") trimmed at both ends.
std::string trimBlanks(std::string_view text);

// ASCII upper case; other bytes unchanged.
std::string upperAscii(std::string_view text);
std::string lowerAscii(std::string_view text);

// Split at every separator; an empty text gives no field at all.
std::vector<std::string> splitFields(std::string_view text, char separator);

// Replace every occurrence of `from` (non-empty) by `to`.
std::string replaceAll(std::string_view text, std::string_view from, std::string_view to);

} // namespace checker
