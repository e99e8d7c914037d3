// The customer id: the number the update service knows a customer by, derived from the plain
// text of the customer row's Settings.
#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

namespace checker {

// A number as the platform reads one: surrounding blanks, an optional sign, digits with at most
// one decimal point, an optional exponent. Nothing else (no NULs, tabs or thousands separators).
std::optional<double> fnPlatformNumber(std::string_view text);

// A value converted to a 32-bit signed integer, halves going to the even neighbour.
// Throws the overflow error outside the 32-bit range.
std::int32_t fnToLong32(double value, const char* source);

// lngCustID from the plain text, as stored (not trimmed). A number converts as it stands;
// any other text becomes the code of its first character followed by its last five characters,
// which must then be a number. Throws CheckerError: 5 for an empty text, 13 for a text that is
// no number, 6 for one out of the 32-bit range.
std::int32_t fnDeriveCustID(std::string_view plain);

} // namespace checker
