#include "service/dates_win32.h"

#include <windows.h>

#include <oleauto.h> // after windows.h, which it needs

#include <cstdio>

#include "common/com_win32.h"
#include "common/constants.h"

namespace checker {

namespace {

SYSTEMTIME toSystemTime(const CalendarDate& date) {
    SYSTEMTIME st{};
    st.wYear = static_cast<WORD>(date.year);
    st.wMonth = static_cast<WORD>(date.month);
    st.wDay = static_cast<WORD>(date.day);
    return st;
}

std::string localeText(LCTYPE what) {
    char buffer[16] = {};
    const int n = ::GetLocaleInfoA(LOCALE_USER_DEFAULT, what, buffer, sizeof buffer);
    return n > 1 ? std::string(buffer, static_cast<std::size_t>(n - 1)) : std::string();
}

} // namespace

CalendarDate RegionalDatesPort::today() {
    SYSTEMTIME st{};
    ::GetLocalTime(&st);
    return CalendarDate{st.wYear, st.wMonth, st.wDay};
}

std::string RegionalDatesPort::shortDateText(const CalendarDate& date) {
    const SYSTEMTIME st = toSystemTime(date);
    char buffer[80] = {};
    const int n =
        ::GetDateFormatA(LOCALE_USER_DEFAULT, DATE_SHORTDATE, &st, nullptr, buffer, sizeof buffer);
    return n > 1 ? std::string(buffer, static_cast<std::size_t>(n - 1)) : std::string();
}

std::optional<CalendarDate> RegionalDatesPort::recognise(std::string_view text) {
    if (text.empty()) return std::nullopt;
    const UniqueBstr wide(text);
    DATE value = 0;
    if (FAILED(::VarDateFromStr(wide.get(), LOCALE_USER_DEFAULT, 0, &value))) return std::nullopt;
    SYSTEMTIME st{};
    if (!::VariantTimeToSystemTime(value, &st)) return std::nullopt;
    return CalendarDate{st.wYear, st.wMonth, st.wDay};
}

std::string RegionalDatesPort::formatMonthDayYear(const CalendarDate& date) {
    const std::string separator = localeText(LOCALE_SDATE);
    char buffer[64] = {};
    std::snprintf(buffer, sizeof buffer, "%0*d%s%0*d%s%0*d", service::kDateMonthDigits, date.month,
                  separator.c_str(), service::kDateDayDigits, date.day, separator.c_str(),
                  service::kDateYearDigits, date.year);
    return buffer;
}

} // namespace checker
