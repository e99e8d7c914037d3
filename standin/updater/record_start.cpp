// A program that only records how it was started: one line "EXE-NAME|SHOW-STATE|COMMAND-LINE"
// appended to started.log in its own folder, then it ends. SHOW-STATE is the wShowWindow it was
// given (or -1 when the starter gave none). Built as the updater and as the patch program.
#include <windows.h>

#include <cstdio>
#include <string>

int WINAPI WinMain(HINSTANCE, HINSTANCE, LPSTR, int) {
    char path[MAX_PATH] = "";
    ::GetModuleFileNameA(nullptr, path, MAX_PATH);
    std::string folder(path), name(path);
    const std::size_t slash = folder.find_last_of("\\/");
    if (slash != std::string::npos) {
        name = folder.substr(slash + 1);
        folder.resize(slash);
    }
    STARTUPINFOA startup{};
    startup.cb = sizeof(startup);
    ::GetStartupInfoA(&startup);
    const int showState = (startup.dwFlags & STARTF_USESHOWWINDOW) ? startup.wShowWindow : -1;
    const std::string line =
        name + "|" + std::to_string(showState) + "|" + ::GetCommandLineA() + "\r\n";
    const std::string log = folder + "\\started.log";
    if (FILE* f = std::fopen(log.c_str(), "ab")) {
        std::fwrite(line.data(), 1, line.size(), f);
        std::fclose(f);
    }
    return 0;
}
