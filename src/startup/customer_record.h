// The customer and version record: every value the update service identifies an installation by.
#pragma once

#include <cstdint>
#include <string>

namespace checker {

struct CustomerRecord {
    std::string strMajorVersion;
    std::string strMinorVersion;
    std::string strCustCode;
    std::string strCDKey; // never assigned: always empty
    // Program-wide in the design; kept here with the rest of the identity, fixed after start-up.
    std::int32_t lngCustID = 0;
    bool blnUseCustID = false;
};

} // namespace checker
