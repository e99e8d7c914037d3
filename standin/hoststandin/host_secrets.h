// What the host product's own components know: the plan code they answer, the key they expect,
// and the plan text whose first "~" field is the database password. The host holds its own copy
// of the key on purpose: if the checker's copy drifts, the components refuse it.
#pragma once

#include <string_view>

namespace hoststandin {

inline constexpr std::string_view kPlanCode = "QK$27NOV";
inline constexpr std::string_view kSecretKey = "Q"
                                               "\x07"
                                               "v"
                                               "\xA7"
                                               "L"
                                               "\x1F"
                                               "z";
inline constexpr std::string_view kDatabasePassword = "Zn#27-Orv!Plan";
inline constexpr std::string_view kPlanText = "Zn#27-Orv!Plan~QVL~ZARN~2027";

} // namespace hoststandin
