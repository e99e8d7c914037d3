// Baseline for the bench: registers a class, creates a hidden window, initialises COM, adds a
// notification-area icon and runs a message loop with a periodic timer that does nothing.
// BASELINE_TICK_MS sets the timer interval (default 6500).
#include <windows.h>
#include <objbase.h>
#include <shellapi.h>

#include <cstdlib>

namespace {
LRESULT CALLBACK wndProc(HWND hwnd, UINT msg, WPARAM w, LPARAM l) {
    if (msg == WM_TIMER) return 0;
    if (msg == WM_DESTROY) {
        PostQuitMessage(0);
        return 0;
    }
    return DefWindowProcA(hwnd, msg, w, l);
}
} // namespace

int WINAPI WinMain(HINSTANCE instance, HINSTANCE, LPSTR, int) {
    WNDCLASSA wc{};
    wc.lpfnWndProc = wndProc;
    wc.hInstance = instance;
    wc.lpszClassName = "BaselineTray";
    RegisterClassA(&wc);
    HWND hwnd = CreateWindowExA(WS_EX_TOOLWINDOW, "BaselineTray", "Baseline", WS_POPUP, 0, 0, 0,
                                0, nullptr, nullptr, instance, nullptr);
    CoInitialize(nullptr);
    NOTIFYICONDATAA nid{};
    nid.cbSize = NOTIFYICONDATAA_V1_SIZE;
    nid.hWnd = hwnd;
    nid.uID = 0;
    nid.uFlags = NIF_MESSAGE | NIF_ICON | NIF_TIP;
    nid.uCallbackMessage = WM_APP;
    nid.hIcon = LoadIconA(nullptr, IDI_APPLICATION);
    lstrcpynA(nid.szTip, "Baseline", sizeof nid.szTip);
    Shell_NotifyIconA(NIM_ADD, &nid);
    const char* tick = std::getenv("BASELINE_TICK_MS");
    SetTimer(hwnd, 1, tick ? static_cast<UINT>(std::atoi(tick)) : 6500u, nullptr);
    MSG msg;
    while (GetMessageA(&msg, nullptr, 0, 0) > 0) {
        TranslateMessage(&msg);
        DispatchMessageA(&msg);
    }
    Shell_NotifyIconA(NIM_DELETE, &nid);
    CoUninitialize();
    return 0;
}
