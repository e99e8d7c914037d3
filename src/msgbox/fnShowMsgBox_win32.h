// fnShowMsgBox: shows the program's own message box modally and returns the answer
// (1 OK, 2 Cancel, 6 Yes, 7 No or closed without a button). No error reaches the caller.
#pragma once

#include <cstdint>
#include <string>
#include <type_traits>

namespace checker {

std::int32_t fnShowMsgBox(const std::string& strMessage, std::int32_t lngStyle,
                          const std::string& strTitle, bool blnCentre,
                          const std::string& strCaption1, const std::string& strCaption2,
                          const std::string& strCaption3, bool blnAlwaysOnTop);

// The message may be any value: numbers are shown as their text.
template <typename T>
requires std::is_arithmetic_v<T> std::int32_t
fnShowMsgBox(T message, std::int32_t lngStyle, const std::string& strTitle, bool blnCentre,
             const std::string& strCaption1, const std::string& strCaption2,
             const std::string& strCaption3, bool blnAlwaysOnTop) {
    return fnShowMsgBox(std::to_string(message), lngStyle, strTitle, blnCentre, strCaption1,
                        strCaption2, strCaption3, blnAlwaysOnTop);
}

} // namespace checker
