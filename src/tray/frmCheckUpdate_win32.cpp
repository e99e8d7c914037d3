#include "tray/frmCheckUpdate_win32.h"

#include <cmath>

#include "common/constants.h"
#include "common/window_win32.h"
#include "service/system_date.h"

namespace checker {

namespace {
constexpr char kClassName[] = "CheckOZProUpdateMain";

// Twips per pixel before Form_Load has measured the screen: the window is laid out at creation.
int screenTwipsPerPixel(int index) {
    HDC screen = ::GetDC(nullptr);
    const int dpi = ::GetDeviceCaps(screen, index);
    ::ReleaseDC(nullptr, screen);
    return dpi > 0 ? static_cast<int>(std::lround(double(common::kTwipsPerInch) / dpi))
                   : common::kDefaultTwipsPerPixel;
}
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
    wc.hIcon = ::LoadIconA(instance_, MAKEINTRESOURCEA(tray::kIconResourceId));
    wc.hbrBackground = reinterpret_cast<HBRUSH>(COLOR_WINDOW + 1);
    wc.lpszClassName = kClassName;
    ::RegisterClassExA(&wc);

    // No system frame: the artwork draws its own title and button bars. The client area is the
    // whole window.
    const int tppX = screenTwipsPerPixel(LOGPIXELSX);
    const int tppY = screenTwipsPerPixel(LOGPIXELSY);
    hwnd_ = ::CreateWindowExA(
        WS_EX_TOOLWINDOW, kClassName, "", WS_POPUP, 0, 0, twipsToPixels(tray::kClientWidth, tppX),
        twipsToPixels(tray::kClientHeight, tppY), nullptr, nullptr, instance_, this);
    if (!hwnd_) return false;
    picture1_.create(hwnd_, instance_, tppX, tppY);

    mnuPopup_.reset(::CreatePopupMenu());
    ::AppendMenuA(mnuPopup_.get(), MF_STRING, tray::kMenuIdCheckUpdate,
                  std::string(tray::kMenuCheckUpdate).c_str());
    ::AppendMenuA(mnuPopup_.get(), MF_SEPARATOR, 0, nullptr);
    ::AppendMenuA(mnuPopup_.get(), MF_STRING, tray::kMenuIdClose,
                  std::string(tray::kMenuClose).c_str());

    // Timer1 is armed from the moment the window exists; Timer2 waits for a result to show.
    ::SetTimer(hwnd_, kTimer1Id, tray::kTimer1IntervalMs, nullptr);
    return Form_Load();
}

void frmCheckUpdate::setCaption(const std::string& caption) {
    ::SetWindowTextA(hwnd_, caption.c_str());
}

LRESULT CALLBACK frmCheckUpdate::StaticWndProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    return dispatchToWindow<frmCheckUpdate, &frmCheckUpdate::hwnd_, &frmCheckUpdate::WndProc>(hwnd, message, wParam, lParam);
}

LRESULT frmCheckUpdate::WndProc(UINT message, WPARAM wParam, LPARAM lParam) {
    switch (message) {
    case WM_TIMER:
        if (wParam == kTimer1Id)
            Timer1_Timer();
        else if (wParam == kTimer2Id)
            Timer2_Timer();
        return 0;
    case WM_COMMAND:
        if (HIWORD(wParam) == STN_CLICKED) {
            if (LOWORD(wParam) == tray::kLabelIdGetUpdate)
                LblGetUpdate_Click();
            else if (LOWORD(wParam) == tray::kLabelIdCancel)
                lblCancel_Click();
        }
        return 0;
    case WM_DESTROY:
        // The only window: when it goes, the message loop ends and the program with it.
        ::PostQuitMessage(0);
        return 0;
    case WM_ACTIVATE:
        if (LOWORD(wParam) != WA_INACTIVE) Form_Activate();
        return ::DefWindowProcA(hwnd_, message, wParam, lParam);
    default:
        return ::DefWindowProcA(hwnd_, message, wParam, lParam);
    }
}

void frmCheckUpdate::Form_Activate() {
    pump_.doEvents();
}

void frmCheckUpdate::Timer1_Timer() {
    const TickOutcome outcome = cycle.Timer1_Timer(
        {profiles_, files_, processes_, network_, http_, dateHttp_, dates_, pump_}, strFolder,
        fnUpdateServerAddress(), profile, record,
        [this](const std::string& strCheckInfoString) { prValidateCheckInfo(strCheckInfoString); });
    // The patch program runs on its own now; the checker ends where it stands, icon and all.
    if (outcome == TickOutcome::PatchStarted) ::ExitProcess(0);
}

void frmCheckUpdate::prValidateCheckInfo(const std::string& strCheckInfoString) {
    checker::prValidateCheckInfo({profiles_, files_, dates_}, strFolder, strCheckInfoString, *this);
}

void frmCheckUpdate::Timer2_Timer() {
    slide_.Timer2_Timer(*this, pump_, fnSlidePlan(metrics, tray::kClientWidth));
}

// ---- ResultDisplayWindow

void frmCheckUpdate::disarmTimer1() {
    ::KillTimer(hwnd_, kTimer1Id);
}
void frmCheckUpdate::armTimer2() {
    ::SetTimer(hwnd_, kTimer2Id, tray::kTimer2IntervalMs, nullptr);
}

void frmCheckUpdate::setLabel2(const std::string& strText) {
    ::SetWindowTextA(picture1_.label2(), strText.c_str());
    // The label has no background of its own: the artwork under it is drawn again.
    ::InvalidateRect(picture1_.hwnd(), nullptr, TRUE);
}

// ---- SlideWindow: positions kept in twips, the window placed at the nearest pixel

int frmCheckUpdate::pixelsX(int twips) const {
    return twipsToPixels(twips, metrics.intTwipsPerPixelX);
}
int frmCheckUpdate::pixelsY(int twips) const {
    return twipsToPixels(twips, metrics.intTwipsPerPixelY);
}

void frmCheckUpdate::move(int intLeft, int intTop) {
    intLeft_ = intLeft;
    intTop_ = intTop;
    ::SetWindowPos(hwnd_, nullptr, pixelsX(intLeft_), pixelsY(intTop_), 0, 0,
                   SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
}

void frmCheckUpdate::setTop(int intTop) {
    const int before = pixelsY(intTop_);
    intTop_ = intTop;
    // Fifteen 1-twip steps make one pixel: the window only moves when its pixel changes.
    if (pixelsY(intTop_) != before)
        ::SetWindowPos(hwnd_, nullptr, pixelsX(intLeft_), pixelsY(intTop_), 0, 0,
                       SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
}

void frmCheckUpdate::show() {
    if (!::IsWindowVisible(hwnd_)) ::ShowWindow(hwnd_, SW_SHOW);
}

void frmCheckUpdate::disarmTimer2() {
    ::KillTimer(hwnd_, kTimer2Id);
}
void frmCheckUpdate::prSetTopMost() {
    checker::prSetTopMost(hwnd_);
}
bool frmCheckUpdate::exists() {
    return hwnd_ != nullptr && ::IsWindow(hwnd_);
}

void frmCheckUpdate::prUnload() {
    // The only window: when it is gone the message loop ends and the program with it.
    if (hwnd_) ::DestroyWindow(hwnd_);
}

} // namespace checker
