#include "tray/frmCheckUpdate_win32.h"

#include "common/constants.h"
#include "common/window_win32.h"

namespace checker {

namespace {
constexpr char kClassName[] = "CheckOZProUpdateMain";
} // namespace

frmCheckUpdate::frmCheckUpdate(HINSTANCE instance) : instance_(instance) {}

frmCheckUpdate::~frmCheckUpdate() {
    if (hwnd_) ::DestroyWindow(hwnd_);
}

bool frmCheckUpdate::Load() {
    WNDCLASSEXA wc{};
    wc.cbSize = sizeof(wc);
    wc.lpfnWndProc = &frmCheckUpdate::StaticWndProc;
    wc.hInstance = instance_;
    wc.hCursor = ::LoadCursorA(nullptr, IDC_ARROW);
    wc.hbrBackground = reinterpret_cast<HBRUSH>(COLOR_WINDOW + 1);
    wc.lpszClassName = kClassName;
    ::RegisterClassExA(&wc);

    // No system frame: the artwork draws its own title and button bars.
    hwnd_ = ::CreateWindowExA(WS_EX_TOOLWINDOW, kClassName, "", WS_POPUP, 0, 0, 0, 0, nullptr,
                              nullptr, instance_, this);
    if (!hwnd_) return false;
    // Timer1 is armed from the moment the window exists; Timer2 waits for a result to show.
    ::SetTimer(hwnd_, kTimer1Id, tray::kTimer1IntervalMs, nullptr);
    return Form_Load();
}

void frmCheckUpdate::setCaption(const std::string& caption) { ::SetWindowTextA(hwnd_, caption.c_str()); }

LRESULT CALLBACK frmCheckUpdate::StaticWndProc(HWND hwnd, UINT message, WPARAM wParam,
                                               LPARAM lParam) {
    if (message == WM_NCCREATE) {
        auto* create = reinterpret_cast<CREATESTRUCTA*>(lParam);
        auto* self = static_cast<frmCheckUpdate*>(create->lpCreateParams);
        self->hwnd_ = hwnd;
        ::SetWindowLongPtrA(hwnd, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(self));
    }
    auto* self = reinterpret_cast<frmCheckUpdate*>(::GetWindowLongPtrA(hwnd, GWLP_USERDATA));
    if (message == WM_NCDESTROY) {
        ::SetWindowLongPtrA(hwnd, GWLP_USERDATA, 0);
        if (self) self->hwnd_ = nullptr;
        ::PostQuitMessage(0);
        return ::DefWindowProcA(hwnd, message, wParam, lParam);
    }
    if (!self) return ::DefWindowProcA(hwnd, message, wParam, lParam);
    LRESULT result = 0;
    guarded([&] { result = self->WndProc(message, wParam, lParam); });
    return result;
}

LRESULT frmCheckUpdate::WndProc(UINT message, WPARAM wParam, LPARAM lParam) {
    switch (message) {
    case WM_TIMER:
        if (wParam == kTimer1Id) Timer1_Timer();
        else if (wParam == kTimer2Id) Timer2_Timer();
        return 0;
    default:
        return ::DefWindowProcA(hwnd_, message, wParam, lParam);
    }
}

// The check cycle and the slide-in come with the tray front end.
void frmCheckUpdate::Timer1_Timer() {}
void frmCheckUpdate::Timer2_Timer() { ::KillTimer(hwnd_, kTimer2Id); }

// The icon comes with the tray front end.
void frmCheckUpdate::prAddTrayIcon() {}
void frmCheckUpdate::prRemoveTrayIcon() {}

} // namespace checker
