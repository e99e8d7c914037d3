// The check cycle: what every tick of Timer1 does. On a network client each tick runs the
// patch pick-up; every fifteenth tick asks the update service and hands the answer on.
#pragma once

#include <cstdint>
#include <functional>
#include <string>

#include "common/ports.h"
#include "startup/customer_record.h"
#include "startup/host_profile.h"
#include "tray/patch_pickup.h"

namespace checker {

struct CheckCyclePorts {
    ProfilePort& profiles;
    FilesPort& files;
    ProcessesPort& processes;
    NetworkPort& network;
    HttpPort& http;     // the check requests
    HttpPort& dateHttp; // the service date query
    DatesPort& dates;
    MessagePump& pump;
};

enum class TickOutcome {
    Skipped,      // started inside another tick by its message runs: not counted
    Done,         // the tick ended; the checker stays resident
    PatchStarted, // a patch program runs now: the caller ends the program at once
};

class CheckCycle {
  public:
    using ValidateCheckInfo = std::function<void(const std::string& strCheckInfoString)>;

    // Timer1_Timer. Errors of the service client's request builders and of the result display
    // are thrown to the caller; a check request that fails on the network ends the tick quietly.
    TickOutcome Timer1_Timer(CheckCyclePorts ports, const std::string& strFolder,
                             const std::string& strServerAddress, const HostProfile& profile,
                             const CustomerRecord& record,
                             const ValidateCheckInfo& prValidateCheckInfo);

    // The update check alone (C1 to C6). True when an answer was handed on.
    bool prCheckUpdate(CheckCyclePorts ports, const std::string& strServerAddress,
                       const HostProfile& profile, const CustomerRecord& record,
                       const ValidateCheckInfo& prValidateCheckInfo);

    std::int16_t intTimerTicks = 0;
    PatchPickupState patch;
    std::string strRequest;
    std::string strCheckInfo;

  private:
    bool blnInTick_ = false;
};

} // namespace checker
