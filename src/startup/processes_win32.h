#pragma once

#include "common/ports.h"

namespace checker {

// CreateProcessA and a Toolhelp walk.
class Win32ProcessesPort final : public ProcessesPort {
public:
    void start(const std::string& path, int showState) override;
    std::vector<ProcessEntry> snapshot() override;
    void terminate(std::uint32_t processId) override;
};

} // namespace checker
