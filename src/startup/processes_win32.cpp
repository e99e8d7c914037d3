#include "startup/processes_win32.h"

#include <windows.h>
#include <tlhelp32.h>

#include "common/error.h"
#include "common/files_win32.h"
#include "common/unique_win32.h"

namespace checker {

void Win32ProcessesPort::start(const std::string& path, int showState) {
    // The application name is given explicitly and the path is quoted on the command line, so
    // a folder with blanks can never make the system run a different, shorter-named program.
    std::string commandLine = "\"" + path + "\"";
    STARTUPINFOA startup{};
    startup.cb = sizeof(startup);
    startup.dwFlags = STARTF_USESHOWWINDOW;
    startup.wShowWindow = static_cast<WORD>(showState);
    PROCESS_INFORMATION info{};
    if (!::CreateProcessA(path.c_str(), commandLine.data(), nullptr, nullptr, FALSE, 0, nullptr,
                          nullptr, &startup, &info)) {
        // A missing program is the runtime's own "File not found", as for any other file.
        const DWORD code = ::GetLastError();
        if (code == ERROR_FILE_NOT_FOUND || code == ERROR_PATH_NOT_FOUND)
            throw CheckerError(kErrFileNotFound, "Shell", "File not found");
        throwLastError("Shell");
    }
    // Not waited for: the program runs on after the checker ends.
    UniqueHandle process(info.hProcess), thread(info.hThread);
}

std::vector<ProcessEntry> Win32ProcessesPort::snapshot() {
    std::vector<ProcessEntry> entries;
    UniqueFileHandle snap(::CreateToolhelp32Snapshot(TH32CS_SNAPPROCESS, 0));
    if (!snap) return entries;
    PROCESSENTRY32 entry{};
    entry.dwSize = sizeof(entry);
    for (BOOL more = ::Process32First(snap.get(), &entry); more;
         more = ::Process32Next(snap.get(), &entry)) {
        const std::size_t n = ::strnlen(entry.szExeFile, sizeof(entry.szExeFile));
        entries.push_back({entry.th32ProcessID, std::string(entry.szExeFile, n)});
        entry.dwSize = sizeof(entry);
    }
    return entries;
}

void Win32ProcessesPort::terminate(std::uint32_t processId) {
    UniqueHandle process(::OpenProcess(PROCESS_ALL_ACCESS, FALSE, processId));
    if (process) ::TerminateProcess(process.get(), 0);
}

} // namespace checker
