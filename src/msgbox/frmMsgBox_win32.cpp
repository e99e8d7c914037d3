#include "msgbox/frmMsgBox_win32.h"

#include "common/constants.h"
#include "common/window_win32.h"
#include "startup/screen_metrics.h"

namespace checker::msgbox {

namespace {
constexpr wchar_t kClassName[] = L"frmMsgBox";

std::uint32_t rgbOf(COLORREF c) {
    return (std::uint32_t(GetRValue(c)) << 16) | (std::uint32_t(GetGValue(c)) << 8) | GetBValue(c);
}

// Runs one step; a failing step is passed over and the next one runs.
template <typename F> void step(F&& body) noexcept {
    try {
        body();
    } catch (...) {
    }
}

struct ThreadWindows {
    HWND except;
    std::vector<HWND> disabled;
};

BOOL CALLBACK disableOne(HWND hwnd, LPARAM param) {
    auto* w = reinterpret_cast<ThreadWindows*>(param);
    if (hwnd != w->except && ::IsWindowEnabled(hwnd)) {
        ::EnableWindow(hwnd, FALSE);
        w->disabled.push_back(hwnd);
    }
    return TRUE;
}
} // namespace

frmMsgBox::frmMsgBox(HINSTANCE instance) : instance_(instance) {}

frmMsgBox::~frmMsgBox() {
    if (hwnd_) ::DestroyWindow(hwnd_);
}

int frmMsgBox::xPx(int twips) const {
    return twipsToPixels(twips, twipsX_);
}
int frmMsgBox::yPx(int twips) const {
    return twipsToPixels(twips, twipsY_);
}
RECT frmMsgBox::rectPx(int left, int top, int width, int height) const {
    return RECT{xPx(left), yPx(top), xPx(left + width), yPx(top + height)};
}

KtrButton* frmMsgBox::buttonOf(Button button) {
    switch (button) {
    case Button::OK:
        return &cmdOK;
    case Button::No:
        return &cmdNo;
    case Button::Cancel:
        return &cmdCancel;
    case Button::Close:
        return &cmdClose;
    default:
        return nullptr;
    }
}

void frmMsgBox::Load() {
    if (hwnd_) return;
    // Twips per pixel as the screen measures them; the design size when it cannot tell.
    HDC screen = ::GetDC(nullptr);
    const int dpiX = ::GetDeviceCaps(screen, LOGPIXELSX);
    dpiY_ = ::GetDeviceCaps(screen, LOGPIXELSY);
    ::ReleaseDC(nullptr, screen);
    try {
        const ScreenMetrics m = computeScreenMetrics(dpiX, dpiY_, 0, 0);
        twipsX_ = m.intTwipsPerPixelX;
        twipsY_ = m.intTwipsPerPixelY;
    } catch (...) {
        twipsX_ = twipsY_ = common::kDefaultTwipsPerPixel;
        dpiY_ = common::kTwipsPerInch / common::kDefaultTwipsPerPixel;
    }

    WNDCLASSEXW wc{};
    if (!::GetClassInfoExW(instance_, kClassName, &wc)) {
        wc.cbSize = sizeof(wc);
        wc.lpfnWndProc = &frmMsgBox::StaticWndProc;
        wc.hInstance = instance_;
        wc.hCursor = ::LoadCursorA(nullptr, IDC_ARROW);
        wc.lpszClassName = kClassName;
        if (!::RegisterClassExW(&wc))
            throw CheckerError(0, "frmMsgBox", "Cannot register the window");
    }
    // No system frame or title bar: the black strip is the title.
    ::CreateWindowExW(0, kClassName, toWide(kWindowCaption).c_str(), WS_POPUP | WS_CLIPCHILDREN,
                      xPx(kUncentredLeft), yPx(kUncentredTop), xPx(kWindowWidth),
                      yPx(kWindowHeight), nullptr, nullptr, instance_, this);
    if (!hwnd_) throw CheckerError(0, "frmMsgBox", "Cannot create the window");

    captionFont_ = createFont(kCaptionFont, kCaptionFontTenthsPt, true, dpiY_);
    messageFont_ = createFont(kMessageFont, kMessageFontTenthsPt, true, dpiY_);
    buttonFont_ = createFont(kButtonFont, kButtonFontTenthsPt, true, dpiY_);
    const auto captionFont = static_cast<HFONT>(captionFont_.get());
    const auto buttonFont = static_cast<HFONT>(buttonFont_.get());

    // Children in tab order, so that the z-order follows it too.
    KtrButtonDesign answer;
    answer.buttonstyle = 1;
    answer.borderonfocus = true;
    answer.backcolormousedown = kAnswerBackDown;

    KtrButtonDesign ok = answer;
    ok.picture = Picture::CheckMark;
    ok.picturePx = kButtonPicturePx;
    cmdOK.Create(hwnd_, idCmdOK, rectPx(kSlot1Left, kButtonTop, kButtonWidth, kButtonHeight), ok,
                 buttonFont, dpiY_);
    cmdOK.setCaption(model_.cmdOK.caption);

    KtrButtonDesign cancel = answer;
    cancel.picture = Picture::Prohibition;
    cancel.picturePx = kCancelPicturePx;
    cmdCancel.Create(hwnd_, idCmdCancel,
                     rectPx(kSlot3Left, kButtonTop, kButtonWidth, kButtonHeight), cancel,
                     buttonFont, dpiY_);
    cmdCancel.setCaption(model_.cmdCancel.caption);

    KtrButtonDesign no = answer;
    no.picture = Picture::Cross;
    no.picturePx = kButtonPicturePx;
    cmdNo.Create(hwnd_, idCmdNo, rectPx(kSlot2Left, kButtonTop, kButtonWidth, kButtonHeight), no,
                 buttonFont, dpiY_);
    cmdNo.setCaption(model_.cmdNo.caption);

    Frame1.setBackground(kButtonBack);
    Frame1.Create(hwnd_, MsgBoxPart::Kind::Panel, idFrame1,
                  rectPx(kFrameLeft, kFrameTop, kFrameWidth, kFrameHeight));
    Frame1.onMouseDown = [this] { Frame1_MouseDown(); };

    KtrButtonDesign close;
    close.backcolormousedown = kCloseBackDown;
    cmdClose.Create(Frame1.hwnd(), idCmdClose,
                    rectPx(kCloseLeft, kCloseTop, kCloseWidth, kCloseHeight), close, captionFont,
                    dpiY_);
    cmdClose.setCaption(std::string(kCaptionClose));

    lblCaption.setBackground(kButtonBack);
    lblCaption.setForeground(kTitleText);
    lblCaption.setFont(captionFont);
    lblCaption.Create(Frame1.hwnd(), MsgBoxPart::Kind::Label, idLblCaption,
                      rectPx(kCaptionLeft, kCaptionTop, kCaptionWidth, kCaptionHeight));
    lblCaption.setText(model_.title);
    // The "X" stays above a title long enough to reach it.
    if (lblCaption.hwnd() && cmdClose.hwnd())
        ::SetWindowPos(lblCaption.hwnd(), HWND_BOTTOM, 0, 0, 0, 0,
                       SWP_NOMOVE | SWP_NOSIZE | SWP_NOACTIVATE);

    Image1.setBackground(kBackground);
    Image1.setPicture(Picture::Exclamation);
    Image1.Create(hwnd_, MsgBoxPart::Kind::Image, idImage1,
                  rectPx(kImageLeft, kImageTop, kImageSize, kImageSize));

    LblMsg.setBackground(kBackground);
    LblMsg.setForeground(rgbOf(::GetSysColor(COLOR_WINDOWTEXT)));
    LblMsg.setFont(static_cast<HFONT>(messageFont_.get()));
    LblMsg.setWrap(true);
    LblMsg.Create(hwnd_, MsgBoxPart::Kind::Label, idLblMsg,
                  rectPx(kMsgLeft, kMsgTop, kMsgWidth, kMsgHeight));
    LblMsg.setText(model_.messageText);

    Form_Load();
}

void frmMsgBox::Form_Load() {
    // An hourglass left by the caller is cleared.
    step([] { ::SetCursor(::LoadCursorA(nullptr, IDC_ARROW)); });
    step([&] {
        model_.messageText = model_.Message;
        LblMsg.setText(model_.messageText);
    });
    // The label keeps its width and wraps: only its height follows the text.
    step([&] {
        const SIZE fitted = LblMsg.fittedSize();
        model_.messageHeight = pixelsToTwips(fitted.cy, twipsY_);
        LblMsg.move(xPx(kMsgLeft), yPx(kMsgTop), xPx(kMsgWidth), fitted.cy);
    });
    step([] { doEvents(); });
}

void frmMsgBox::setTitle(const std::string& title) {
    Load();
    model_.title = title;
    lblCaption.setText(title);
    // The title sizes itself to its text: a longer title widens it, on one line.
    const SIZE fitted = lblCaption.fittedSize();
    lblCaption.move(xPx(kCaptionLeft), yPx(kCaptionTop), fitted.cx, fitted.cy);
}

bool frmMsgBox::applyStyle(std::int32_t style, const std::string& caption1,
                           const std::string& caption2, const std::string& caption3) {
    Load();
    const bool applied = msgbox::applyStyle(model_, style, caption1, caption2, caption3);
    cmdOK.setCaption(model_.cmdOK.caption);
    cmdNo.setCaption(model_.cmdNo.caption);
    cmdCancel.setCaption(model_.cmdCancel.caption);
    prSyncLayout();
    return applied;
}

void frmMsgBox::applyCaptionPictures(const std::string& caption1, const std::string& caption2,
                                     const std::string& caption3) {
    Load();
    msgbox::applyCaptionPictures(model_, caption1, caption2, caption3);
    cmdOK.setPicturePosition(model_.cmdOK.PicturePosition);
    cmdNo.setPicturePosition(model_.cmdNo.PicturePosition);
    cmdCancel.setPicturePosition(model_.cmdCancel.PicturePosition);
}

void frmMsgBox::prSyncLayout() {
    if (!hwnd_) return;
    ::SetWindowPos(hwnd_, nullptr, xPx(model_.windowLeft), yPx(model_.windowTop),
                   xPx(model_.windowWidth), yPx(model_.windowHeight),
                   SWP_NOZORDER | SWP_NOACTIVATE);
    cmdOK.setPosition(xPx(model_.cmdOK.left), yPx(model_.cmdOK.top));
    cmdNo.setPosition(xPx(model_.cmdNo.left), yPx(model_.cmdNo.top));
    cmdCancel.setPosition(xPx(model_.cmdCancel.left), yPx(model_.cmdCancel.top));
    cmdOK.setVisible(model_.cmdOK.visible);
    cmdNo.setVisible(model_.cmdNo.visible);
    cmdCancel.setVisible(model_.cmdCancel.visible);
    LblMsg.move(xPx(kMsgLeft), yPx(kMsgTop), xPx(kMsgWidth), yPx(model_.messageHeight));
    ::InvalidateRect(hwnd_, nullptr, TRUE);
}

void frmMsgBox::Form_Activate() {
    activated_ = true;
    model_.ReturnValue = static_cast<std::uint8_t>(kResultNo);
    if (model_.AlwaysOnTop) prSetTopMost(hwnd_);
    // Growth with the fitted text, but never so far that the answers leave the screen.
    const int screenHeight = pixelsToTwips(::GetSystemMetrics(SM_CYSCREEN), twipsY_);
    const int fitted =
        capMessageHeight(model_.messageHeight, screenHeight, model_.CentreinMDIClient);
    activateLayout(model_, fitted);
    prSyncLayout();
    buttonOf(focusTarget(model_))->setFocus();
    doEvents();
}

void frmMsgBox::ShowModal() {
    Load();
    if (showing_) return;
    showing_ = true;
    // Modal: every other window of this thread waits until the box is answered.
    ThreadWindows others{hwnd_, {}};
    ::EnumThreadWindows(::GetCurrentThreadId(), disableOne, reinterpret_cast<LPARAM>(&others));

    ::ShowWindow(hwnd_, SW_SHOW);
    ::SetForegroundWindow(hwnd_);
    if (!activated_) Form_Activate();

    MSG msg;
    while (hwnd_ && ::IsWindowVisible(hwnd_)) {
        const BOOL got = ::GetMessageW(&msg, nullptr, 0, 0);
        if (got == 0 || got == -1) {
            // Leave the request to quit to the caller's loop; the box answers as closed.
            if (got == 0) ::PostQuitMessage(static_cast<int>(msg.wParam));
            break;
        }
        ::TranslateMessage(&msg);
        ::DispatchMessageW(&msg);
    }
    for (HWND w : others.disabled)
        if (::IsWindow(w)) ::EnableWindow(w, TRUE);
    if (hwnd_) ::ShowWindow(hwnd_, SW_HIDE);
    showing_ = false;
}

void frmMsgBox::prClick(Button button) {
    if (button == Button::None) return;
    if (button == Button::OK)
        cmdOK_Click();
    else if (button == Button::No)
        cmdNo_Click();
    else if (button == Button::Cancel)
        cmdCancel_Click();
    else
        cmdClose_Click();
}

void frmMsgBox::prAnswer(Button button) {
    setReturnValue(model_, clickResult(model_, button));
    ::ShowWindow(hwnd_, SW_HIDE);
}

void frmMsgBox::cmdOK_Click() {
    prAnswer(Button::OK);
}
void frmMsgBox::cmdNo_Click() {
    prAnswer(Button::No);
}
void frmMsgBox::cmdCancel_Click() {
    prAnswer(Button::Cancel);
}
void frmMsgBox::cmdClose_Click() {
    prAnswer(Button::Close);
}

void frmMsgBox::Form_KeyDown(int keyCode) {
    prClick(keyTarget(model_, keyCode));
}

void frmMsgBox::Frame1_MouseDown() {
    ::ReleaseCapture();
    ::SendMessageW(hwnd_, kSysCommandMessage, kSysCommandDragMove, 0);
}

void frmMsgBox::prTabFocus(HWND from, bool forward) {
    KtrButton* order[] = {&cmdOK, &cmdCancel, &cmdNo, &cmdClose};
    constexpr int n = 4;
    int at = 0;
    for (int i = 0; i < n; ++i)
        if (order[i]->hwnd() == from) at = i;
    for (int k = 1; k <= n; ++k) {
        KtrButton* next = order[(at + (forward ? k : n - k)) % n];
        if (next->visible()) {
            next->setFocus();
            return;
        }
    }
}

void frmMsgBox::prPaint(HDC dc) {
    RECT r;
    ::GetClientRect(hwnd_, &r);
    UniqueGdiObject back(::CreateSolidBrush(colour(kBackground)));
    ::FillRect(dc, &r, static_cast<HBRUSH>(back.get()));
    // Shape1: a white outline round the whole window.
    UniqueGdiObject pen(::CreatePen(PS_SOLID, 1, colour(kShapeLine)));
    SelectScope usePen(dc, pen.get());
    SelectScope useBrush(dc, ::GetStockObject(NULL_BRUSH));
    ::Rectangle(dc, 0, 0, xPx(model_.shapeWidth), yPx(model_.shapeHeight));
}

LRESULT CALLBACK frmMsgBox::StaticWndProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    return dispatchToWindow<frmMsgBox, &frmMsgBox::hwnd_, &frmMsgBox::WndProc>(hwnd, message, wParam, lParam);
}

LRESULT frmMsgBox::WndProc(UINT message, WPARAM wParam, LPARAM lParam) {
    switch (message) {
    case WM_ERASEBKGND:
        return 1;
    case WM_PAINT: {
        PaintScope ps(hwnd_);
        prPaint(ps.dc());
        return 0;
    }
    case WM_COMMAND:
        if (HIWORD(wParam) == BN_CLICKED) {
            switch (LOWORD(wParam)) {
            case idCmdOK:
                cmdOK_Click();
                break;
            case idCmdNo:
                cmdNo_Click();
                break;
            case idCmdCancel:
                cmdCancel_Click();
                break;
            case idCmdClose:
                cmdClose_Click();
                break;
            default:
                break;
            }
        }
        return 0;
    case kPreviewKey: {
        // The form sees every key first; Tab moves along the tab order; Alt+letter is an access
        // key.
        const int key = static_cast<int>(wParam);
        if (key == VK_TAB) {
            prTabFocus(::GetFocus(), (::GetKeyState(VK_SHIFT) & 0x8000) == 0);
            return 0;
        }
        Form_KeyDown(key);
        if (lParam && ::IsWindowVisible(hwnd_) && key >= 'A' && key <= 'Z')
            prClick(accessKeyTarget(model_, static_cast<char>(key)));
        return 0;
    }
    case WM_KEYDOWN:
    case WM_SYSKEYDOWN:
        // Keys reach the window itself only when no button has the focus.
        Form_KeyDown(static_cast<int>(wParam));
        if (message == WM_SYSKEYDOWN) return ::DefWindowProcW(hwnd_, message, wParam, lParam);
        return 0;
    case WM_CLOSE:
        // Closed without a button (Alt+F4, the system): the answer stays 7.
        ::ShowWindow(hwnd_, SW_HIDE);
        return 0;
    case WM_ACTIVATE:
        // Hand the focus back to a button when the box is activated again.
        if (LOWORD(wParam) != WA_INACTIVE && activated_) {
            HWND focus = ::GetFocus();
            if (!focus || !::IsChild(hwnd_, focus)) buttonOf(focusTarget(model_))->setFocus();
            return 0;
        }
        return ::DefWindowProcW(hwnd_, message, wParam, lParam);
    default:
        return ::DefWindowProcW(hwnd_, message, wParam, lParam);
    }
}

} // namespace checker::msgbox
