// traypoke: what the shell does to a program's notification-area icon, for the tray scenarios.
//   traypoke delete HWND     the shell loses the icon (id 0) of window HWND, as when it restarts
//   traypoke created HWND    the message a restarted shell sends: "TaskbarCreated"
#include <windows.h>
#include <shellapi.h>

#include <cstdio>
#include <cstdlib>
#include <cstring>

int main(int argc, char** argv) {
    if (argc != 3) {
        std::fprintf(stderr, "usage: traypoke delete|created HWND\n");
        return 2;
    }
    HWND hwnd = reinterpret_cast<HWND>(static_cast<UINT_PTR>(std::strtoull(argv[2], nullptr, 0)));
    if (!std::strcmp(argv[1], "delete")) {
        NOTIFYICONDATAA nid{};
        nid.cbSize = NOTIFYICONDATAA_V1_SIZE;
        nid.hWnd = hwnd;
        nid.uID = 0;
        return Shell_NotifyIconA(NIM_DELETE, &nid) ? 0 : 1;
    }
    if (!std::strcmp(argv[1], "created")) {
        const UINT message = RegisterWindowMessageA("TaskbarCreated");
        return PostMessageA(hwnd, message, 0, 0) ? 0 : 1;
    }
    return 2;
}
