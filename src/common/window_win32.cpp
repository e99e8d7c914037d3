#include "common/window_win32.h"

#include "common/constants.h"

namespace checker {

void prSetTopMost(HWND hwnd) noexcept {
    ::SetWindowPos(hwnd, reinterpret_cast<HWND>(common::kHwndTopMost), 0, 0, 0, 0,
                   common::kTopMostFlags);
}

void doEvents() noexcept {
    MSG msg;
    while (::PeekMessageA(&msg, nullptr, 0, 0, PM_REMOVE)) {
        if (msg.message == WM_QUIT) {
            // Keep the request to quit for the main loop.
            ::PostQuitMessage(static_cast<int>(msg.wParam));
            return;
        }
        ::TranslateMessage(&msg);
        ::DispatchMessageA(&msg);
    }
}

[[noreturn]] void prLastResort(const CheckerError& error) noexcept {
    const std::string text = "Run-time error '" + std::to_string(error.number()) + "':\n\n" +
                             error.description();
    ::MessageBoxA(nullptr, text.c_str(), std::string(startup::kTitleNameMain).c_str(),
                  MB_OK | MB_ICONERROR | MB_SETFOREGROUND | MB_TASKMODAL);
    ::ExitProcess(static_cast<UINT>(error.number()));
}

[[noreturn]] void prLastResortUnknown(const char* what) noexcept {
    prLastResort(CheckerError(51, "", what ? what : "Internal error"));
}

} // namespace checker
