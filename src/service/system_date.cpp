#include "service/system_date.h"

#include <cstdlib>
#include <new>

#include "common/constants.h"
#include "common/error.h"

namespace checker {

std::string GetSystemDate(HttpPort& http, DatesPort& dates, const std::string& baseAddress) {
    using namespace service;
    try {
        const std::string address = baseAddress + std::string(kPathDate);
        const std::unique_ptr<HttpRequest> request = http.create();
        request->open(kMethodPost, address);
        request->send();
        std::string answer = request->responseText();
        if (const auto date = dates.recognise(answer)) return dates.formatMonthDayYear(*date);
        return answer;
    } catch (const CheckerError& e) {
        return std::string(e.number() == kErrServerNotFound ? kDateUnavailable : kDateFailed);
    } catch (const std::exception&) {
        // Nothing leaves this function; the check cycle only asks whether a date came back.
        return std::string(kDateFailed);
    }
}

std::string fnUpdateServerAddress() {
    std::string address;
#ifdef _MSC_VER
    char* value = nullptr;
    std::size_t length = 0;
    if (_dupenv_s(&value, &length, std::string(service::kServerEnvVar).c_str()) == 0 && value) {
        address = value;
        std::free(value);
    }
#else
    if (const char* value = std::getenv(std::string(service::kServerEnvVar).c_str()))
        address = value;
#endif
    if (address.empty()) address = CHECKER_UPDATE_SERVER_DEFAULT;
    // The paths begin with "/": a trailing one here would double it.
    while (!address.empty() && address.back() == '/')
        address.pop_back();
    return address;
}

} // namespace checker
