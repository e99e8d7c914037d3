#include "tray/network_win32.h"

#include <windows.h>
#include <wininet.h>

namespace checker {

bool fnIsConnected() noexcept {
    DWORD dwFlags = 0; // the connection kinds are not used
    return ::InternetGetConnectedState(&dwFlags, 0) != FALSE;
}

} // namespace checker
