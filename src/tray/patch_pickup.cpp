#include "tray/patch_pickup.h"

#include "common/constants.h"
#include "common/text.h"
#include "service/version_number.h"

namespace checker {

bool fnPatchNameSafe(std::string_view strName) {
    return strName.find_first_of(tray::kPathSeparators) == std::string_view::npos &&
           strName.find(tray::kDriveMark) == std::string_view::npos &&
           strName.find(tray::kParentFolder) == std::string_view::npos;
}

bool fnPatchApplies(std::string_view strMajorVersion, std::string_view strMinorVersion,
                    const PatchOffer& offer) {
    const double major = fnVersionValue(strMajorVersion);
    const double minor = fnVersionValue(strMinorVersion);
    if (major != fnVersionValue(offer.strBaseVersMajor) ||
        minor != fnVersionValue(offer.strBaseVersMinor))
        return false; // offered for another installed version, or already applied
    const double majorAvai = fnVersionValue(offer.strVersMajorAvai);
    const double minorAvai = fnVersionValue(offer.strVersMinorAvai);
    return (major == majorAvai && minor < minorAvai) || major < majorAvai;
}

PatchOffer fnReadPatchOffer(ProfilePort& profiles, const std::string& strServerFolder) {
    const std::string file = strServerFolder + std::string(tray::kUpdateInfoIni);
    auto value = [&](std::string_view key, std::size_t longest) {
        return fnCleanValue(profiles.read(file, tray::kSectionVersionInfo, key, "", longest + 1));
    };
    PatchOffer offer;
    offer.strBaseVersMajor = value(tray::kKeyBaseVersMajor, tray::kVersionValueChars);
    offer.strBaseVersMinor = value(tray::kKeyBaseVersMinor, tray::kVersionValueChars);
    offer.strVersMajorAvai = value(tray::kKeyVersMajorAvai, tray::kVersionValueChars);
    offer.strVersMinorAvai = value(tray::kKeyVersMinorAvai, tray::kVersionValueChars);
    offer.strPatcFileName = value(tray::kKeyPatcFileName, tray::kPatchNameChars);
    return offer;
}

bool prPatchPickUp(PatchPickupPorts ports, const std::string& strFolder,
                   const CustomerRecord& record, PatchPickupState& state) {
    // P1: the server folder is read again on every tick.
    state.strServerFolder = fnCleanValue(
        ports.profiles.read(strFolder + std::string(startup::kClientIni), startup::kSectionGeneral,
                            startup::kKeyServerPath, "", tray::kServerPathChars + 1));
    // P2
    if (!ports.files.existsAny(state.strServerFolder + std::string(tray::kUpdateInfoIniExists)))
        return false;
    // P3
    const PatchOffer offer = fnReadPatchOffer(ports.profiles, state.strServerFolder);
    state.strPatchFileName = offer.strPatcFileName;
    // P4, P5. A name that reaches outside the folder counts as no offer at all.
    state.blnPatchDue = fnPatchApplies(record.strMajorVersion, record.strMinorVersion, offer) &&
                        fnPatchNameSafe(state.strPatchFileName);
    if (!state.blnPatchDue) return false;
    // P6
    const std::string source = state.strServerFolder + "\\" + state.strPatchFileName;
    if (state.strPatchFileName.empty() || !ports.files.existsAny(source)) return false;
    const std::string target = strFolder + "\\" + state.strPatchFileName;
    ports.files.copyReplace(source, target);
    for (int i = 0; i < tray::kMessageRunsBeforePatch; ++i)
        ports.pump.doEvents();
    ports.processes.start(target, tray::kShowNormal);
    return true;
}

} // namespace checker
