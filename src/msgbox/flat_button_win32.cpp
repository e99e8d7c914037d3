#include "msgbox/flat_button_win32.h"

#include <memory>

#include "common/window_win32.h"

namespace checker::msgbox {

namespace {
constexpr wchar_t kClassName[] = L"KtrButton";
constexpr int kBaseDpi = common::kTwipsPerInch / common::kDefaultTwipsPerPixel;
constexpr int kFocusInset = kButtonFocusInset;
constexpr int kTextInset = kButtonTextInset;
constexpr int kPictureGap = kButtonPictureGap;
constexpr std::uint32_t kEdgeLight = kButtonEdgeLight;
constexpr std::uint32_t kEdgeDark = kButtonEdgeDark;

int scaled(int px96, int dpi) {
    return ::MulDiv(px96, dpi, kBaseDpi);
}
} // namespace

KtrButton::~KtrButton() {
    if (hwnd_) ::DestroyWindow(hwnd_);
}

bool KtrButton::Register(HINSTANCE instance) {
    WNDCLASSEXW wc{};
    if (::GetClassInfoExW(instance, kClassName, &wc)) return true;
    wc.cbSize = sizeof(wc);
    wc.style = CS_HREDRAW | CS_VREDRAW;
    wc.lpfnWndProc = &KtrButton::StaticWndProc;
    wc.hInstance = instance;
    wc.hCursor = ::LoadCursorA(nullptr, IDC_ARROW);
    wc.lpszClassName = kClassName;
    return ::RegisterClassExW(&wc) != 0;
}

bool KtrButton::Create(HWND parent, int id, const RECT& px, const KtrButtonDesign& design,
                       HFONT font, int dpi) {
    design_ = design;
    font_ = font;
    dpi_ = dpi;
    const auto instance = reinterpret_cast<HINSTANCE>(::GetWindowLongPtrW(parent, GWLP_HINSTANCE));
    if (!Register(instance)) return false;
    ::CreateWindowExW(0, kClassName, L"", WS_CHILD | WS_VISIBLE | WS_TABSTOP | WS_CLIPSIBLINGS,
                      px.left, px.top, px.right - px.left, px.bottom - px.top, parent,
                      reinterpret_cast<HMENU>(static_cast<INT_PTR>(id)), instance, this);
    return hwnd_ != nullptr;
}

void KtrButton::setCaption(const std::string& caption) {
    caption_ = caption;
    if (!hwnd_) return;
    ::SetWindowTextW(hwnd_, toWide(caption).c_str());
    ::InvalidateRect(hwnd_, nullptr, TRUE);
}

void KtrButton::setPosition(int xPx, int yPx) {
    if (hwnd_)
        ::SetWindowPos(hwnd_, nullptr, xPx, yPx, 0, 0, SWP_NOSIZE | SWP_NOZORDER | SWP_NOACTIVATE);
}

void KtrButton::setVisible(bool visible) {
    if (hwnd_) ::ShowWindow(hwnd_, visible ? SW_SHOWNA : SW_HIDE);
}

bool KtrButton::visible() const {
    return hwnd_ && (::GetWindowLongPtrW(hwnd_, GWL_STYLE) & WS_VISIBLE);
}

void KtrButton::setFocus() {
    if (hwnd_) ::SetFocus(hwnd_);
}

bool KtrButton::hasFocus() const {
    return hwnd_ && ::GetFocus() == hwnd_;
}

void KtrButton::setPicturePosition(std::int32_t value) {
    picturePosition_ = value;
    if (hwnd_) ::InvalidateRect(hwnd_, nullptr, TRUE);
}

LRESULT CALLBACK KtrButton::StaticWndProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    return dispatchToWindow<KtrButton, &KtrButton::hwnd_, &KtrButton::WndProc>(hwnd, message, wParam, lParam);
}

bool KtrButton::offerKey(WPARAM key, bool alt) {
    HWND self = hwnd_;
    HWND root = ::GetAncestor(self, GA_ROOT);
    if (root && root != self) ::SendMessageW(root, kPreviewKey, key, alt ? 1 : 0);
    // The top-level window may have answered and hidden itself (or gone) meanwhile.
    return ::IsWindow(self) && ::IsWindowVisible(self);
}

void KtrButton::click() {
    HWND parent = ::GetParent(hwnd_);
    if (parent)
        ::SendMessageW(parent, WM_COMMAND, MAKEWPARAM(::GetDlgCtrlID(hwnd_), BN_CLICKED),
                       reinterpret_cast<LPARAM>(hwnd_));
}

LRESULT KtrButton::WndProc(UINT message, WPARAM wParam, LPARAM lParam) {
    switch (message) {
    case WM_ERASEBKGND:
        return 1; // paint does the whole face
    case WM_PAINT: {
        PaintScope ps(hwnd_);
        paint(ps.dc());
        return 0;
    }
    case WM_SETFOCUS:
    case WM_KILLFOCUS:
        ::InvalidateRect(hwnd_, nullptr, TRUE);
        return 0;
    case WM_LBUTTONDOWN:
        ::SetFocus(hwnd_);
        ::SetCapture(hwnd_);
        tracking_ = pressed_ = true;
        ::InvalidateRect(hwnd_, nullptr, TRUE);
        return 0;
    case WM_MOUSEMOVE:
        if (tracking_) {
            RECT r;
            ::GetClientRect(hwnd_, &r);
            const POINT p{static_cast<short>(LOWORD(lParam)), static_cast<short>(HIWORD(lParam))};
            const bool inside = ::PtInRect(&r, p) != 0;
            if (inside != pressed_) {
                pressed_ = inside;
                ::InvalidateRect(hwnd_, nullptr, TRUE);
            }
        }
        return 0;
    case WM_LBUTTONUP: {
        const bool wasPressed = tracking_ && pressed_;
        tracking_ = pressed_ = false;
        ::ReleaseCapture();
        ::InvalidateRect(hwnd_, nullptr, TRUE);
        if (wasPressed) click();
        return 0;
    }
    case WM_CAPTURECHANGED:
        if (tracking_) {
            tracking_ = pressed_ = false;
            ::InvalidateRect(hwnd_, nullptr, TRUE);
        }
        return 0;
    case WM_GETDLGCODE:
        return DLGC_WANTALLKEYS;
    case WM_KEYDOWN:
        if (!offerKey(wParam, false)) return 0;
        if (wParam == VK_SPACE || wParam == VK_RETURN) click();
        return 0;
    case WM_SYSKEYDOWN:
        if (!offerKey(wParam, true)) return 0;
        // Alt+F4 and the like belong to the system; letters were the box's access keys.
        if (wParam >= 'A' && wParam <= 'Z') return 0;
        return ::DefWindowProcW(hwnd_, message, wParam, lParam);
    case WM_SYSCHAR:
        return 0; // no menu here to search, so no beep either
    default:
        return ::DefWindowProcW(hwnd_, message, wParam, lParam);
    }
}

void KtrButton::paint(HDC dc) {
    RECT r;
    ::GetClientRect(hwnd_, &r);
    const COLORREF back = colour(pressed_ ? design_.backcolormousedown : design_.backcolor);
    const COLORREF fore = colour(pressed_ ? design_.forecolormousedown : design_.forecolor);
    UniqueGdiObject brush(::CreateSolidBrush(back));
    ::FillRect(dc, &r, static_cast<HBRUSH>(brush.get()));

    if (design_.buttonstyle == 1) {
        UniqueGdiObject light(::CreatePen(PS_SOLID, 1, colour(pressed_ ? kEdgeDark : kEdgeLight)));
        UniqueGdiObject dark(::CreatePen(PS_SOLID, 1, colour(pressed_ ? kEdgeLight : kEdgeDark)));
        {
            SelectScope use(dc, light.get());
            ::MoveToEx(dc, r.left, r.bottom - 1, nullptr);
            ::LineTo(dc, r.left, r.top);
            ::LineTo(dc, r.right - 1, r.top);
        }
        SelectScope use(dc, dark.get());
        ::LineTo(dc, r.right - 1, r.bottom - 1);
        ::LineTo(dc, r.left, r.bottom - 1);
    }
    if (design_.borderonfocus && ::GetFocus() == hwnd_) {
        RECT f = r;
        ::InflateRect(&f, -kFocusInset, -kFocusInset);
        UniqueGdiObject pen(::CreatePen(PS_SOLID, 1, fore));
        SelectScope usePen(dc, pen.get());
        SelectScope useBrush(dc, ::GetStockObject(NULL_BRUSH));
        ::Rectangle(dc, f.left, f.top, f.right, f.bottom);
    }

    const std::wstring text = toWide(caption_);
    SelectScope useFont(dc,
                        font_ ? static_cast<HGDIOBJ>(font_) : ::GetStockObject(DEFAULT_GUI_FONT));
    ::SetBkMode(dc, TRANSPARENT);
    ::SetTextColor(dc, fore);
    const UINT format = DT_SINGLELINE | DT_VCENTER | DT_END_ELLIPSIS;

    RECT textRect = r;
    ::InflateRect(&textRect, -kTextInset, 0);
    const bool withPicture = picturePosition_ == kPictureLeft && design_.picture != Picture::None;
    if (withPicture) {
        // Picture and caption side by side, the pair centred; a long caption keeps the picture.
        const int pic = scaled(design_.picturePx, dpi_);
        const int gap = scaled(kPictureGap, dpi_);
        RECT measure{0, 0, 0, 0};
        ::DrawTextW(dc, text.c_str(), static_cast<int>(text.size()), &measure,
                    DT_SINGLELINE | DT_CALCRECT);
        const int avail = textRect.right - textRect.left;
        const int pair = pic + gap + (measure.right - measure.left);
        const int start = textRect.left + (pair < avail ? (avail - pair) / 2 : 0);
        const int top = r.top + (r.bottom - r.top - pic) / 2;
        const RECT picRect{start, top, start + pic, top + pic};
        drawPicture(dc, design_.picture, picRect);
        textRect.left = start + pic + gap;
        ::DrawTextW(dc, text.c_str(), static_cast<int>(text.size()), &textRect, format | DT_LEFT);
    } else {
        ::DrawTextW(dc, text.c_str(), static_cast<int>(text.size()), &textRect, format | DT_CENTER);
    }
}

} // namespace checker::msgbox
