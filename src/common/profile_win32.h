#pragma once

#include "common/ports.h"

namespace checker {

// Private-profile files through GetPrivateProfileStringA / WritePrivateProfileStringA.
class Win32ProfilePort final : public ProfilePort {
public:
    std::string read(const std::string& file, std::string_view section, std::string_view key,
                     std::string_view defaultValue, std::size_t bufferChars) override;
    void write(const std::string& file, std::string_view section, std::string_view key,
               std::string_view value) override;
};

} // namespace checker
