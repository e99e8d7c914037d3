// The once-a-day result display: decides from a check answer and Update.INI whether the user is
// told now, records the day, and drives the window through its steps in their fixed order.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "common/ports.h"

namespace checker {

// What the display needs of the main window, in the order it is used.
class ResultDisplayWindow {
  public:
    virtual ~ResultDisplayWindow() = default;
    virtual void disarmTimer1() = 0;
    virtual void armTimer2() = 0;
    virtual void setLabel2(const std::string& strText) = 0;
    virtual void Timer2_Timer() = 0; // the slide-in, run at once
};

struct ResultDisplayPorts {
    ProfilePort& profiles;
    FilesPort& files;
    DatesPort& dates;
};

// Field 1 of an answer whose update flag (field 3) is true. Nothing for a false flag, and also
// for an answer that is no check answer at all (fewer than four fields, or a field 3 that is no
// truth value, as an error page or a proxy's login page gives): that is "no update", not a fault.
std::optional<std::string> fnOfferedVersion(std::string_view strCheckInfoString);

// The stored CurrDate as a date; a text that does not read as one counts as another day.
std::optional<CalendarDate> fnStoredDate(ProfilePort& profiles, FilesPort& files, DatesPort& dates,
                                         const std::string& strUpdateIni);

// prValidateCheckInfo of the main window. Returns true when the result was shown.
bool prValidateCheckInfo(ResultDisplayPorts ports, const std::string& strFolder,
                         const std::string& strCheckInfoString, ResultDisplayWindow& window);

} // namespace checker
