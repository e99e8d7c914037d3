#include "startup/host_database.h"

#include <vector>

#include "common/constants.h"
#include "common/error.h"
#include "common/text.h"
#include "startup/customer_id.h"

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

std::string fnPlanFilter(int plan) {
    return std::string(c::kFilterPrefix) + std::to_string(plan);
}

std::string fnPlanFind(int plan) {
    return std::string(c::kFindPrefix) + std::to_string(plan);
}

bool fnApplyInstalledVersion(std::string_view fileVersion, CustomerRecord& record) {
    if (fileVersion.empty()) return false;
    const std::vector<std::string> parts = splitFields(fileVersion, c::kVersionSeparator);
    if (parts.size() < 2) throw subscriptError("prGetVersion");
    record.strMajorVersion = parts[0] + c::kVersionSeparator + parts[1];
    record.strMinorVersion = parts.back();
    return true;
}

namespace {
// A null cannot be passed on as text.
std::string notNull(const std::optional<std::string>& stored) {
    if (!stored) throw CheckerError(94, std::string(c::kColumnSettings), "Invalid use of Null");
    return *stored;
}
} // namespace

void fnReadSettings(HostDatabasePort& db, std::uint8_t bytCustPlan, CustomerRecord& record) {
    const std::unique_ptr<PlanRecordset> rsPlanIDs = db.open(c::kSqlSettings);
    rsPlanIDs->clearFilter();
    rsPlanIDs->filter(fnPlanFilter(c::kPlanCustomerIdFlag));
    if (!rsPlanIDs->eof() && rsPlanIDs->field(c::kColumnSettings)) {
        record.blnUseCustID = true;
        rsPlanIDs->clearFilter();
        rsPlanIDs->filter(fnPlanFilter(bytCustPlan));
        const std::string stored = notNull(rsPlanIDs->field(c::kColumnSettings));
        record.lngCustID = fnDeriveCustID(db.plainSettings(stored));
    }
    rsPlanIDs->close();
}

bool fnGetVersion(FilesPort& files, HostDatabasePort& db, const HostProfile& profile,
                  std::string_view checkerFolder, CustomerRecord& record) {
    const std::string version =
        files.fileVersion(hostExePath(profile.lngInstallType, checkerFolder));
    if (!fnApplyInstalledVersion(version, record)) return false;

    const std::unique_ptr<PlanRecordset> rsPlanIDs = db.open(c::kSqlCustomerRow);
    rsPlanIDs->findFirst(fnPlanFind(profile.bytCustPlan));
    // The stored text loses its surrounding blanks; its plain form is kept as it comes.
    const std::string stored = trimBlanks(notNull(rsPlanIDs->firstField()));
    record.strCustCode = db.plainSettings(stored);
    if (rsPlanIDs->isOpen()) rsPlanIDs->close();
    return true;
}

} // namespace checker
