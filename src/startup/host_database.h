// The texts of the host database reads and the installed-version split: the parts of the
// database road that need no automation object.
#pragma once

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

#include "common/ports.h"
#include "startup/customer_record.h"
#include "startup/host_profile.h"

namespace checker {

// The password is the first "~" field of what the protection component deciphers; an empty
// text has no first field (error 9).
std::string fnPasswordFromPlan(std::string_view deciphered);

std::string fnConnectionString(std::string_view databasePath, std::string_view password);

// "Plan = 999", "Plan = 14" (filter) and "plan = 14" (find).
std::string fnPlanFilter(int plan);
std::string fnPlanFind(int plan);

// Sets strMajorVersion ("a.b") and strMinorVersion (last part) from a dotted file version.
// Returns false for an empty text: the program then ends silently. A text with fewer than two
// parts throws error 9.
bool fnApplyInstalledVersion(std::string_view fileVersion, CustomerRecord& record);

// One read of PlanIDs on the open connection (a static, read-only recordset), as the two reads
// use it. Failures throw CheckerError with the database layer's number and text.
class PlanRecordset {
  public:
    virtual ~PlanRecordset() = default;
    virtual void clearFilter() = 0;
    virtual void filter(const std::string& criteria) = 0;
    virtual bool eof() = 0;
    // The current row's value as stored; nothing for a null.
    virtual std::optional<std::string> field(std::string_view column) = 0;
    virtual std::optional<std::string> firstField() = 0;
    // Forward from the first row.
    virtual void findFirst(const std::string& criteria) = 0;
    virtual bool isOpen() = 0;
    virtual void close() = 0;
};

// The host database as start-up reads it: recordsets on the connection of prOpenDatabase, and
// the plain form of a stored Settings text.
class HostDatabasePort {
  public:
    virtual ~HostDatabasePort() = default;
    virtual std::unique_ptr<PlanRecordset> open(std::string_view sql) = 0;
    virtual std::string plainSettings(const std::string& stored) = 0;
};

// The settings read: blnUseCustID when row 999 holds a Settings, then lngCustID from the
// customer row (bytCustPlan).
void fnReadSettings(HostDatabasePort& db, std::uint8_t bytCustPlan, CustomerRecord& record);

// prGetVersion: the installed version from the host executable, then strCustCode from the
// customer row. Returns false when the executable has no version: the program ends silently.
bool fnGetVersion(FilesPort& files, HostDatabasePort& db, const HostProfile& profile,
                  std::string_view checkerFolder, CustomerRecord& record);

} // namespace checker
