#include "common/files_win32.h"

#include <windows.h>

#include <vector>

#include "common/com_win32.h"
#include "common/error.h"

namespace checker {

namespace {
// The attributes that a plain directory search for one name still matches.
constexpr DWORD kNotPlain =
    FILE_ATTRIBUTE_DIRECTORY | FILE_ATTRIBUTE_HIDDEN | FILE_ATTRIBUTE_SYSTEM;
} // namespace

[[noreturn]] void throwLastError(const std::string& source) {
    const DWORD code = ::GetLastError();
    throw errorFromHresult(HRESULT_FROM_WIN32(code), source);
}

bool Win32FilesPort::existsPlain(const std::string& path) {
    WIN32_FIND_DATAA data{};
    const HANDLE h = ::FindFirstFileA(path.c_str(), &data);
    if (h == INVALID_HANDLE_VALUE) return false;
    ::FindClose(h);
    return (data.dwFileAttributes & kNotPlain) == 0;
}

bool Win32FilesPort::existsAny(const std::string& path) {
    if (path.empty()) return false;
    const DWORD attributes = ::GetFileAttributesA(path.c_str());
    return attributes != INVALID_FILE_ATTRIBUTES && (attributes & FILE_ATTRIBUTE_DIRECTORY) == 0;
}

void Win32FilesPort::copyReplace(const std::string& from, const std::string& to) {
    if (!::CopyFileA(from.c_str(), to.c_str(), FALSE)) throwLastError("FileCopy");
}

std::string Win32FilesPort::fileVersion(const std::string& path) {
    // A missing file is an error, as the scripting file-system object reports it.
    if (::GetFileAttributesA(path.c_str()) == INVALID_FILE_ATTRIBUTES)
        throw CheckerError(kErrFileNotFound, "GetFileVersion", "File not found");
    DWORD ignored = 0;
    const DWORD size = ::GetFileVersionInfoSizeA(path.c_str(), &ignored);
    if (size == 0) return {};
    std::vector<char> data(size);
    if (!::GetFileVersionInfoA(path.c_str(), 0, size, data.data())) return {};
    VS_FIXEDFILEINFO* info = nullptr;
    UINT length = 0;
    if (!::VerQueryValueA(data.data(), "\\", reinterpret_cast<void**>(&info), &length) || !info ||
        length < sizeof(VS_FIXEDFILEINFO))
        return {};
    return std::to_string(HIWORD(info->dwFileVersionMS)) + "." +
           std::to_string(LOWORD(info->dwFileVersionMS)) + "." +
           std::to_string(HIWORD(info->dwFileVersionLS)) + "." +
           std::to_string(LOWORD(info->dwFileVersionLS));
}

} // namespace checker
