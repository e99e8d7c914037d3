#include "common/profile_win32.h"

#include <windows.h>

#include <vector>

namespace checker {

std::string Win32ProfilePort::read(const std::string& file, std::string_view section,
                                   std::string_view key, std::string_view defaultValue,
                                   std::size_t bufferChars) {
    if (bufferChars == 0) return {};
    std::vector<char> buffer(bufferChars, '\0');
    const std::string sectionZ(section), keyZ(key), defaultZ(defaultValue);
    const DWORD n = ::GetPrivateProfileStringA(sectionZ.c_str(), keyZ.c_str(), defaultZ.c_str(),
                                               buffer.data(), static_cast<DWORD>(bufferChars),
                                               file.c_str());
    return std::string(buffer.data(), std::min<std::size_t>(n, bufferChars - 1));
}

void Win32ProfilePort::write(const std::string& file, std::string_view section,
                             std::string_view key, std::string_view value) {
    const std::string sectionZ(section), keyZ(key), valueZ(value);
    ::WritePrivateProfileStringA(sectionZ.c_str(), keyZ.c_str(), valueZ.c_str(), file.c_str());
}

} // namespace checker
