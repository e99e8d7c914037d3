// The host's cipher for plan texts and Settings values: bytes mixed with the secret key and
// their position, written as upper-case hexadecimal text. Portable (hostkit and the DLL share it).
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace hoststandin {

std::string encipher(std::string_view plain, std::string_view key);
// Nothing when the text is not an enciphered text (odd length, a character that is no hex digit).
std::optional<std::string> decipher(std::string_view text, std::string_view key);

std::string toHex(std::string_view bytes);
std::optional<std::string> fromHex(std::string_view hex);

} // namespace hoststandin
