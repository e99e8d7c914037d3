#include "startup/host_profile.h"

#include "common/constants.h"
#include "common/text.h"

namespace checker {

namespace c = checker::startup;

namespace {
std::string join(std::string_view a, std::string_view b) {
    std::string out(a);
    out.append(b);
    return out;
}
} // namespace

ProductNameDecision decideProductName(std::string_view cleanedApplication) {
    const std::string name = upperAscii(cleanedApplication);
    if (name == c::kNameMainPro || name == c::kNameMainGold)
        return {std::string(c::kCaptionMain), false};
    if (name == c::kNameSecond) return {std::string(c::kCaptionSecond), true};
    return {std::nullopt, false};
}

std::int32_t decideInstallType(const MarkerFacts& facts) {
    if (facts.mainExe && !facts.mainBlank) return c::kInstallNetworkClient;
    if (facts.secondExe && facts.secondBlank) return c::kInstallSecondProduct;
    return c::kInstallStandAlone;
}

std::string databasePath(std::int32_t installType, std::string_view checkerFolder,
                         std::string_view cleanedServerPath) {
    switch (installType) {
    case c::kInstallNetworkClient:
        // ServerPath names the server folder with its trailing separator: nothing is inserted.
        return join(cleanedServerPath, c::kDatabaseClientTail);
    case c::kInstallSecondProduct:
        return join(checkerFolder, c::kDatabaseSecond);
    default:
        return join(checkerFolder, c::kDatabaseMain);
    }
}

std::uint8_t custPlanFor(std::int32_t installType) {
    return installType == c::kInstallSecondProduct ? c::kCustPlanSecond : c::kCustPlanMain;
}

std::string hostExePath(std::int32_t installType, std::string_view checkerFolder) {
    return join(checkerFolder,
                installType == c::kInstallSecondProduct ? c::kHostExeSecond : c::kHostExeMain);
}

std::uint8_t productIdFor(std::int32_t installType) {
    return installType == c::kInstallSecondProduct ? 4 : 1;
}

std::string productSubIdFor(std::int32_t installType) {
    return installType == c::kInstallNetworkClient ? "N" : "S";
}

std::string_view titleNameFor(bool blnSecondProduct) {
    return blnSecondProduct ? c::kTitleNameSecond : c::kTitleNameMain;
}

std::string_view tipTextFor(bool blnSecondProduct) {
    return blnSecondProduct ? tray::kTipSecond : tray::kTipMain;
}

void prReadProductName(ProfilePort& profiles, std::string_view checkerFolder, HostProfile& profile) {
    const std::string value =
        fnCleanValue(profiles.read(join(checkerFolder, c::kApplicationIni), c::kSectionGeneral,
                                   c::kKeyApplication, "", common::kIniBufferChars));
    const ProductNameDecision decision = decideProductName(value);
    if (!decision.caption) return;
    profile.strCaption = *decision.caption;
    profile.blnSecondProduct = decision.blnSecondProduct;
}

bool prIntialization(ProfilePort& profiles, FilesPort& files, std::string_view checkerFolder,
                     HostProfile& profile) {
    MarkerFacts facts;
    facts.mainExe = files.existsPlain(join(checkerFolder, c::kMarkerMainExe));
    facts.mainBlank = files.existsPlain(join(checkerFolder, c::kMarkerMainBlank));
    facts.secondExe = files.existsPlain(join(checkerFolder, c::kMarkerSecondExe));
    facts.secondBlank = files.existsPlain(join(checkerFolder, c::kMarkerSecondBlank));
    profile.lngInstallType = decideInstallType(facts);

    profile.strDatabasePath.clear();
    std::string serverPath;
    if (profile.lngInstallType == c::kInstallNetworkClient)
        serverPath = fnCleanValue(profiles.read(join(checkerFolder, c::kClientIni),
                                                c::kSectionGeneral, c::kKeyServerPath, "",
                                                common::kIniBufferChars));
    profile.strDatabasePath = databasePath(profile.lngInstallType, checkerFolder, serverPath);
    profile.bytCustPlan = custPlanFor(profile.lngInstallType);
    return files.existsAny(profile.strDatabasePath);
}

} // namespace checker
