#include "msgbox/msgbox_parts_win32.h"

#include "common/unique_win32.h"
#include "common/window_win32.h"

namespace checker::msgbox {

namespace {
constexpr wchar_t kClassName[] = L"MsgBoxPart";
} // namespace

MsgBoxPart::~MsgBoxPart() {
    if (hwnd_) ::DestroyWindow(hwnd_);
}

bool MsgBoxPart::Create(HWND parent, Kind kind, int id, const RECT& px) {
    kind_ = kind;
    const auto instance = reinterpret_cast<HINSTANCE>(::GetWindowLongPtrW(parent, GWLP_HINSTANCE));
    WNDCLASSEXW wc{};
    if (!::GetClassInfoExW(instance, kClassName, &wc)) {
        wc.cbSize = sizeof(wc);
        wc.lpfnWndProc = &MsgBoxPart::StaticWndProc;
        wc.hInstance = instance;
        wc.hCursor = ::LoadCursorA(nullptr, IDC_ARROW);
        wc.lpszClassName = kClassName;
        if (!::RegisterClassExW(&wc)) return false;
    }
    DWORD style = WS_CHILD | WS_VISIBLE | WS_CLIPSIBLINGS;
    if (kind == Kind::Panel) style |= WS_CLIPCHILDREN;
    ::CreateWindowExW(0, kClassName, L"", style, px.left, px.top, px.right - px.left,
                      px.bottom - px.top, parent, reinterpret_cast<HMENU>(static_cast<INT_PTR>(id)),
                      instance, this);
    return hwnd_ != nullptr;
}

UINT MsgBoxPart::textFormat() const {
    return DT_NOPREFIX | DT_EXPANDTABS | DT_LEFT | (wrap_ ? DT_WORDBREAK : DT_SINGLELINE);
}

void MsgBoxPart::setText(const std::string& text) {
    text_ = text;
    if (!hwnd_) return;
    ::SetWindowTextW(hwnd_, toWide(text).c_str());
    ::InvalidateRect(hwnd_, nullptr, TRUE);
}

SIZE MsgBoxPart::fittedSize() const {
    RECT current{0, 0, 0, 0};
    if (hwnd_) ::GetClientRect(hwnd_, &current);
    HDC dc = ::GetDC(hwnd_);
    SIZE size{0, 0};
    {
        SelectScope useFont(dc, font_ ? static_cast<HGDIOBJ>(font_)
                                      : ::GetStockObject(DEFAULT_GUI_FONT));
        const std::wstring text = toWide(text_);
        // An empty text still takes one line.
        const std::wstring measured = text.empty() ? std::wstring(L" ") : text;
        RECT r{0, 0, wrap_ ? current.right : 0, 0};
        ::DrawTextW(dc, measured.c_str(), static_cast<int>(measured.size()), &r,
                    textFormat() | DT_CALCRECT);
        size.cx = wrap_ ? current.right : (text.empty() ? 0 : r.right);
        size.cy = r.bottom;
    }
    ::ReleaseDC(hwnd_, dc);
    return size;
}

void MsgBoxPart::move(int xPx, int yPx, int widthPx, int heightPx) {
    if (hwnd_)
        ::SetWindowPos(hwnd_, nullptr, xPx, yPx, widthPx, heightPx, SWP_NOZORDER | SWP_NOACTIVATE);
}

LRESULT CALLBACK MsgBoxPart::StaticWndProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    return dispatchToWindow<MsgBoxPart, &MsgBoxPart::hwnd_, &MsgBoxPart::WndProc>(hwnd, message, wParam, lParam);
}

LRESULT MsgBoxPart::WndProc(UINT message, WPARAM wParam, LPARAM lParam) {
    switch (message) {
    case WM_ERASEBKGND:
        return 1;
    case WM_PAINT: {
        PaintScope ps(hwnd_);
        RECT r;
        ::GetClientRect(hwnd_, &r);
        UniqueGdiObject brush(::CreateSolidBrush(colour(back_)));
        ::FillRect(ps.dc(), &r, static_cast<HBRUSH>(brush.get()));
        if (kind_ == Kind::Image) {
            drawPicture(ps.dc(), picture_, r);
        } else if (kind_ == Kind::Label) {
            SelectScope useFont(ps.dc(), font_ ? static_cast<HGDIOBJ>(font_)
                                               : ::GetStockObject(DEFAULT_GUI_FONT));
            ::SetBkMode(ps.dc(), TRANSPARENT);
            ::SetTextColor(ps.dc(), colour(fore_));
            const std::wstring text = toWide(text_);
            ::DrawTextW(ps.dc(), text.c_str(), static_cast<int>(text.size()), &r, textFormat());
        }
        return 0;
    }
    case WM_COMMAND:
        // A panel passes its buttons' clicks on to the window that holds it.
        return ::SendMessageW(::GetParent(hwnd_), message, wParam, lParam);
    case WM_LBUTTONDOWN:
    case WM_RBUTTONDOWN:
    case WM_MBUTTONDOWN:
        if (kind_ == Kind::Panel && onMouseDown) {
            onMouseDown();
            return 0;
        }
        return ::DefWindowProcW(hwnd_, message, wParam, lParam);
    default:
        return ::DefWindowProcW(hwnd_, message, wParam, lParam);
    }
}

} // namespace checker::msgbox
