// The regional-dates port on the user's locale: today, the short date, the platform's date
// recognition (VarDateFromStr) and the regional date separator.
#pragma once

#include "common/ports.h"

namespace checker {

class RegionalDatesPort final : public DatesPort {
  public:
    CalendarDate today() override;
    std::string shortDateText(const CalendarDate& date) override;
    std::optional<CalendarDate> recognise(std::string_view text) override;
    std::string formatMonthDayYear(const CalendarDate& date) override;
};

} // namespace checker
