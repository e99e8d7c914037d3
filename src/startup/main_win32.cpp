// Main: the entry routine. One copy at a time; the hidden main window carries the rest.
#include <windows.h>

#include <memory>

#include "common/constants.h"
#include "common/unique_win32.h"
#include "common/window_win32.h"
#include "tray/frmCheckUpdate_win32.h"

namespace checker {

namespace {
// The previous-instance test recognises a copy by the application title.
constexpr char kInstanceMutex[] = "CheckOZProUpdate.PrevInstance";
} // namespace

int Main(HINSTANCE instance) {
    UniqueHandle mutex(::CreateMutexA(nullptr, FALSE, kInstanceMutex));
    if (!mutex || ::GetLastError() == ERROR_ALREADY_EXISTS) return 0; // silent: a copy runs

    ComApartment com;
    auto form = std::make_unique<frmCheckUpdate>(instance);
    bool loaded = false;
    guarded([&] { loaded = form->Load(); });
    if (!loaded) ::ExitProcess(0); // the silent ends of start-up

    MSG msg;
    while (::GetMessageA(&msg, nullptr, 0, 0) > 0) {
        ::TranslateMessage(&msg);
        ::DispatchMessageA(&msg);
    }
    return 0;
}

} // namespace checker

int WINAPI WinMain(HINSTANCE instance, HINSTANCE, LPSTR, int) {
    int result = 0;
    checker::guarded([&] { result = checker::Main(instance); });
    return result;
}
