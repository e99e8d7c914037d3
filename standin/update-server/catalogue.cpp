#include "catalogue.h"

#include <cstdio>
#include <ctime>
#include <vector>

#include "common/text.h"
#include "service/version_number.h"

namespace updsrv {

bool isNewer(const std::string& version, const std::string& major, const std::string& minor) {
    using checker::fnVersionValue;
    const std::vector<std::string> parts = checker::splitFields(version, '.');
    if (parts.size() < 2) return false;
    const double latestMajor = fnVersionValue(parts[0] + "." + parts[1]);
    const double latestMinor = fnVersionValue(parts.back());
    const double installedMajor = fnVersionValue(major);
    if (latestMajor != installedMajor) return latestMajor > installedMajor;
    return latestMinor > fnVersionValue(minor);
}

std::string checkAnswer(const std::map<std::string, std::string>& latest, const std::string& select,
                        const std::string& major, const std::string& minor) {
    const auto it = latest.find(select);
    const std::string version = it == latest.end() ? std::string() : it->second;
    const bool newer = !version.empty() && isNewer(version, major, minor);
    return select + "," + version + "," + major + "." + minor + "," + (newer ? "True" : "False");
}

std::string todayMonthDayYear() {
    const std::time_t now = std::time(nullptr);
    std::tm local{};
    localtime_r(&now, &local);
    char buffer[16];
    std::strftime(buffer, sizeof buffer, "%m/%d/%Y", &local);
    return buffer;
}

} // namespace updsrv
