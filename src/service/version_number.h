// Version texts as numbers, and truth values of answer fields.
#pragma once

#include <optional>
#include <string_view>

namespace checker {

// The leading-number rule: blanks, tabs and line feeds skipped anywhere; optional sign; digits
// with at most one "."; optional exponent "E"/"D"; "&H"/"&O" integers; stop at the first other
// character; no leading number gives 0. "." whatever the regional settings.
double fnVersionValue(std::string_view text);

// "True"/"False" in any case, or a number (0 false, other true). Nothing for anything else.
std::optional<bool> fnTruthValue(std::string_view text);

} // namespace checker
