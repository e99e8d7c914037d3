#include "tray/result_display.h"

#include "common/constants.h"
#include "common/text.h"
#include "service/version_number.h"

namespace checker {

std::optional<std::string> fnOfferedVersion(std::string_view strCheckInfoString) {
    const std::vector<std::string> fields =
        splitFields(strCheckInfoString, service::kFieldSeparator);
    if (fields.size() <= service::kFieldUpdateFlag) return std::nullopt;
    const std::optional<bool> flag = fnTruthValue(fields[service::kFieldUpdateFlag]);
    if (!flag || !*flag) return std::nullopt;
    return fields[service::kFieldLatestVersion];
}

std::optional<CalendarDate> fnStoredDate(ProfilePort& profiles, FilesPort& files, DatesPort& dates,
                                         const std::string& strUpdateIni) {
    std::string strStored;
    if (!files.existsAny(strUpdateIni)) {
        // The first run writes today's date now; the fall-back lies before any real run.
        profiles.write(strUpdateIni, startup::kSectionGeneral, tray::kKeyCurrDate,
                       dates.shortDateText(dates.today()));
        strStored = std::string(tray::kFallbackDate);
    } else {
        strStored = profiles.read(strUpdateIni, startup::kSectionGeneral, tray::kKeyCurrDate, "",
                                  tray::kCurrDateBufferChars);
        std::erase(strStored, '\0');
    }
    return dates.recognise(trimBlanks(strStored));
}

bool prValidateCheckInfo(ResultDisplayPorts ports, const std::string& strFolder,
                         const std::string& strCheckInfoString, ResultDisplayWindow& window) {
    const std::optional<std::string> strLatest = fnOfferedVersion(strCheckInfoString);
    if (!strLatest) return false; // Timer1 stays armed; the cycle asks again later

    const std::string strUpdateIni = strFolder + std::string(tray::kUpdateIni);
    const CalendarDate today = ports.dates.today();
    const std::optional<CalendarDate> stored =
        fnStoredDate(ports.profiles, ports.files, ports.dates, strUpdateIni);
    // A damaged or empty CurrDate is simply not today: the user is told and the day rewritten.
    if (stored && *stored == today) return false;

    ports.profiles.write(strUpdateIni, startup::kSectionGeneral, tray::kKeyCurrDate,
                         ports.dates.shortDateText(today));
    window.disarmTimer1();
    window.armTimer2();
    window.setLabel2(std::string(tray::kLatestVersionLabel) + *strLatest);
    window.Timer2_Timer();
    return true;
}

} // namespace checker
