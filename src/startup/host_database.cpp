#include "startup/host_database.h"

#include <vector>

#include "common/constants.h"
#include "common/error.h"
#include "common/text.h"

namespace checker {

namespace c = checker::startup;

std::string fnPasswordFromPlan(std::string_view deciphered) {
    const std::vector<std::string> fields = splitFields(deciphered, c::kPasswordFieldSeparator);
    if (fields.empty()) throw subscriptError("prOpenDatabase");
    return fields.front();
}

std::string fnConnectionString(std::string_view databasePath, std::string_view password) {
    std::string out(c::kConnPrefix);
    out.append(databasePath).append(c::kConnMiddle).append(password);
    return out;
}

std::string fnPlanFilter(int plan) { return std::string(c::kFilterPrefix) + std::to_string(plan); }

std::string fnPlanFind(int plan) { return std::string(c::kFindPrefix) + std::to_string(plan); }

bool fnApplyInstalledVersion(std::string_view fileVersion, CustomerRecord& record) {
    if (fileVersion.empty()) return false;
    const std::vector<std::string> parts = splitFields(fileVersion, c::kVersionSeparator);
    if (parts.size() < 2) throw subscriptError("prGetVersion");
    record.strMajorVersion = parts[0] + c::kVersionSeparator + parts[1];
    record.strMinorVersion = parts.back();
    return true;
}

} // namespace checker
