// fnIsConnected: whether the system reports an internet connection of any kind.
#pragma once

#include "common/ports.h"

namespace checker {

bool fnIsConnected() noexcept;

class Win32NetworkPort final : public NetworkPort {
  public:
    bool isConnected() override { return fnIsConnected(); }
};

} // namespace checker
