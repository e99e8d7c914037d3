// What the update service answers: the check answer from the catalogue of latest versions,
// and today's date.
#pragma once

#include <map>
#include <string>

namespace updsrv {

// `select`, `major`, `minor`: the request's Select, MajorVersion and MinorVersion values.
std::string checkAnswer(const std::map<std::string, std::string>& latest, const std::string& select,
                        const std::string& major, const std::string& minor);

// True when the four-part `version` is newer than the installed major "a.b" and minor "d".
bool isNewer(const std::string& version, const std::string& major, const std::string& minor);

std::string todayMonthDayYear();

} // namespace updsrv
