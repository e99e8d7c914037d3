#pragma once

#include "common/ports.h"

namespace checker {

class Win32FilesPort final : public FilesPort {
public:
    bool existsPlain(const std::string& path) override;
    bool existsAny(const std::string& path) override;
    void copyReplace(const std::string& from, const std::string& to) override;
    std::string fileVersion(const std::string& path) override;
};

// The last Win32 error as a CheckerError with the system's text.
[[noreturn]] void throwLastError(const std::string& source);

} // namespace checker
