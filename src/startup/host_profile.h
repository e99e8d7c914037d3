// Which host product is installed and how: the decisions of the product name step and
// prIntialization, and every path and code that follows from them.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "common/ports.h"

namespace checker {

struct HostProfile {
    std::string strCaption;        // window caption; empty unless the host names itself
    bool blnSecondProduct = false;
    std::int32_t lngInstallType = 0;
    std::string strDatabasePath;
    std::uint8_t bytCustPlan = 0;
};

struct ProductNameDecision {
    std::optional<std::string> caption; // nothing: leave the caption as it is
    bool blnSecondProduct = false;
};

// From the cleaned Application value (compared upper-cased).
ProductNameDecision decideProductName(std::string_view cleanedApplication);

// Marker facts, each "a plain directory search finds the file".
struct MarkerFacts {
    bool mainExe = false;
    bool mainBlank = false;
    bool secondExe = false;
    bool secondBlank = false;
};
std::int32_t decideInstallType(const MarkerFacts& facts);

std::string databasePath(std::int32_t installType, std::string_view checkerFolder,
                         std::string_view cleanedServerPath);
std::uint8_t custPlanFor(std::int32_t installType);
std::string hostExePath(std::int32_t installType, std::string_view checkerFolder);
std::uint8_t productIdFor(std::int32_t installType);
std::string productSubIdFor(std::int32_t installType);
std::string_view titleNameFor(bool blnSecondProduct);
std::string_view tipTextFor(bool blnSecondProduct);

// Product name step: reads Application.INI and applies the decision to `profile`.
void prReadProductName(ProfilePort& profiles, std::string_view checkerFolder, HostProfile& profile);

// prIntialization: installation type, database path and plan row.
// Returns false when the database file is missing: the caller ends the program silently.
bool prIntialization(ProfilePort& profiles, FilesPort& files, std::string_view checkerFolder,
                     HostProfile& profile);

} // namespace checker
