// Workstation patch pick-up: on a network client, a patch that the server folder offers for
// exactly the installed version is copied into the checker folder and started.
#pragma once

#include <string>
#include <string_view>

#include "common/ports.h"
#include "startup/customer_record.h"

namespace checker {

// The [VERSIONINFO] values of UpdateInfo.INI, cleaned.
struct PatchOffer {
    std::string strBaseVersMajor;
    std::string strBaseVersMinor;
    std::string strVersMajorAvai;
    std::string strVersMinorAvai;
    std::string strPatcFileName;
};

// What the pick-up leaves behind on the window between ticks.
struct PatchPickupState {
    bool blnPatchDue = false;
    std::string strServerFolder;
    std::string strPatchFileName;
};

// A bare file name: no separator, no drive, no "..", so nothing outside the checker folder is
// written or started.
bool fnPatchNameSafe(std::string_view strName);

// The offer applies to the installed version and brings a newer one (number rule).
bool fnPatchApplies(std::string_view strMajorVersion, std::string_view strMinorVersion,
                    const PatchOffer& offer);

// Reads the offer from the server folder's hand-off file (the caller has seen it exists).
PatchOffer fnReadPatchOffer(ProfilePort& profiles, const std::string& strServerFolder);

struct PatchPickupPorts {
    ProfilePort& profiles;
    FilesPort& files;
    ProcessesPort& processes;
    MessagePump& pump;
};

// Returns true when the patch has been started: the caller ends the program at once.
// Copy and start failures are thrown to the caller.
bool prPatchPickUp(PatchPickupPorts ports, const std::string& strFolder,
                   const CustomerRecord& record, PatchPickupState& state);

} // namespace checker
