#include "tray/check_cycle.h"

#include "common/constants.h"
#include "common/error.h"
#include "service/ClsGetUpdate.h"
#include "service/system_date.h"

namespace checker {

namespace {
// Clears the one-tick-at-a-time mark however the tick ends.
class TickScope {
  public:
    explicit TickScope(bool& mark) : mark_(mark) { mark_ = true; }
    TickScope(const TickScope&) = delete;
    TickScope& operator=(const TickScope&) = delete;
    ~TickScope() { mark_ = false; }

  private:
    bool& mark_;
};
} // namespace

TickOutcome CheckCycle::Timer1_Timer(CheckCyclePorts ports, const std::string& strFolder,
                                     const std::string& strServerAddress,
                                     const HostProfile& profile, const CustomerRecord& record,
                                     const ValidateCheckInfo& prValidateCheckInfo) {
    if (blnInTick_) return TickOutcome::Skipped;
    TickScope scope(blnInTick_);

    ports.pump.doEvents();
    patch.blnPatchDue = false;
    ++intTimerTicks;

    if (profile.lngInstallType == startup::kInstallNetworkClient) {
        const PatchPickupPorts patchPorts{ports.profiles, ports.files, ports.processes, ports.pump};
        if (prPatchPickUp(patchPorts, strFolder, record, patch)) return TickOutcome::PatchStarted;
    }

    if (intTimerTicks != tray::kTicksPerCheck) return TickOutcome::Done;
    intTimerTicks = 0;
    prCheckUpdate(ports, strServerAddress, profile, record, prValidateCheckInfo);
    return TickOutcome::Done;
}

bool CheckCycle::prCheckUpdate(CheckCyclePorts ports, const std::string& strServerAddress,
                               const HostProfile& profile, const CustomerRecord& record,
                               const ValidateCheckInfo& prValidateCheckInfo) {
    // C1, C2: online, and the service's date endpoint answers with a date.
    if (!ports.network.isConnected()) return false;
    if (!ports.dates.recognise(GetSystemDate(ports.dateHttp, ports.dates, strServerAddress)))
        return false;

    // C3 to C5
    const std::uint8_t bytProdID = productIdFor(profile.lngInstallType);
    const std::string strProdSubId = productSubIdFor(profile.lngInstallType);
    std::string strAnswer;
    {
        ClsGetUpdate objGetUpdate(ports.http, strServerAddress, &ports.files);
        if (record.blnUseCustID)
            strRequest = objGetUpdate.fnInputStringCheckNewLicence(
                bytProdID, strProdSubId, record.lngCustID, record.strMajorVersion,
                record.strMinorVersion);
        else
            strRequest = objGetUpdate.fnInputStringCheck(
                bytProdID, strProdSubId, record.strMajorVersion, record.strMinorVersion,
                record.strCustCode, record.strCDKey);
        try {
            strAnswer = record.blnUseCustID
                            ? objGetUpdate.fnGetInfoCheckUpdateNewLicence(strRequest)
                            : objGetUpdate.fnGetInfoCheckUpdate(strRequest);
        } catch (const CheckerError&) {
            // The service went away between the date query and the check (a dropped connection,
            // a server restart): a network blip, treated like an unreachable server.
            return false;
        }
    } // the instance lives for this one check
    // C6
    strCheckInfo = strAnswer;
    prValidateCheckInfo(strCheckInfo);
    return true;
}

} // namespace checker
