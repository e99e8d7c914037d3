#include "tray/artwork_win32.h"

#include <string>

#include "common/constants.h"
#include "common/window_win32.h"
#include "startup/screen_metrics.h"

namespace checker {

namespace {

constexpr char kPictureClass[] = "CheckOZProUpdatePicture";

COLORREF colour(std::uint32_t rgb) {
    return RGB((rgb >> 16) & 0xFF, (rgb >> 8) & 0xFF, rgb & 0xFF);
}

// Arial bold at tenths of a point, for the screen's vertical dots per inch.
HFONT arialBold(int tenthsOfPoint, int twipsPerPixelY) {
    const int dpi = twipsPerPixelY > 0 ? common::kTwipsPerInch / twipsPerPixelY : 96;
    const int height = -::MulDiv(tenthsOfPoint, dpi, 720);
    return ::CreateFontA(height, 0, 0, 0, FW_BOLD, FALSE, FALSE, FALSE, ANSI_CHARSET,
                         OUT_DEFAULT_PRECIS, CLIP_DEFAULT_PRECIS, DEFAULT_QUALITY,
                         DEFAULT_PITCH | FF_SWISS, std::string(tray::kLabelFont).c_str());
}

} // namespace

RECT Picture1::labelRect(int left, int top, int width, int height) const {
    RECT r;
    r.left = twipsToPixels(left, tppX_);
    r.top = twipsToPixels(top, tppY_);
    r.right = r.left + twipsToPixels(width, tppX_);
    r.bottom = r.top + twipsToPixels(height, tppY_);
    return r;
}

void Picture1::create(HWND parent, HINSTANCE instance, int twipsPerPixelX, int twipsPerPixelY) {
    tppX_ = twipsPerPixelX > 0 ? twipsPerPixelX : common::kDefaultTwipsPerPixel;
    tppY_ = twipsPerPixelY > 0 ? twipsPerPixelY : common::kDefaultTwipsPerPixel;

    WNDCLASSEXA wc{};
    wc.cbSize = sizeof(wc);
    wc.lpfnWndProc = &Picture1::StaticWndProc;
    wc.hInstance = instance;
    wc.hCursor = ::LoadCursorA(nullptr, IDC_ARROW);
    wc.hbrBackground = reinterpret_cast<HBRUSH>(COLOR_WINDOW + 1);
    wc.lpszClassName = kPictureClass;
    ::RegisterClassExA(&wc);

    const RECT box = labelRect(tray::kPicture1Left, tray::kPicture1Top, tray::kPicture1Width,
                               tray::kPicture1Height);
    hwnd_ = ::CreateWindowExA(0, kPictureClass, "", WS_CHILD | WS_VISIBLE, box.left, box.top,
                              box.right - box.left, box.bottom - box.top, parent, nullptr, instance,
                              this);
    if (!hwnd_) return;

    commandFont_.reset(arialBold(tray::kCommandFontTenthsPt, tppY_));
    label2Font_.reset(arialBold(tray::kLabel2FontTenthsPt, tppY_));
    titleFont_.reset(arialBold(tray::kArtworkTitlePointsTenths, tppY_));

    // Creation order as designed: the commands first, the latest-version label above them.
    makeLabel(instance, std::string(tray::kGetUpdateText).c_str(), tray::kLabelIdGetUpdate,
              labelRect(tray::kGetUpdateLeft, tray::kGetUpdateTop, tray::kGetUpdateWidth,
                        tray::kGetUpdateHeight),
              static_cast<HFONT>(commandFont_.get()));
    makeLabel(
        instance, std::string(tray::kCancelText).c_str(), tray::kLabelIdCancel,
        labelRect(tray::kCancelLeft, tray::kCancelTop, tray::kCancelWidth, tray::kCancelHeight),
        static_cast<HFONT>(commandFont_.get()));
    label2_ = makeLabel(
        instance, std::string(tray::kLabel2DesignText).c_str(), tray::kLabelId2,
        labelRect(tray::kLabel2Left, tray::kLabel2Top, tray::kLabel2Width, tray::kLabel2Height),
        static_cast<HFONT>(label2Font_.get()));
}

HWND Picture1::makeLabel(HINSTANCE instance, const char* text, int id, RECT where, HFONT font) {
    HWND label = ::CreateWindowExA(
        0, "STATIC", text, WS_CHILD | WS_VISIBLE | SS_NOTIFY | SS_CENTER, where.left, where.top,
        where.right - where.left, where.bottom - where.top, hwnd_,
        reinterpret_cast<HMENU>(static_cast<INT_PTR>(id)), instance, nullptr);
    if (label) ::SendMessageA(label, WM_SETFONT, reinterpret_cast<WPARAM>(font), FALSE);
    return label;
}

void Picture1::paint(HDC dc) const {
    // The artwork is a 229 x 146 pixel picture drawn from the box's top-left corner; the bars
    // follow the labels so that they stay under them at any dots per inch.
    RECT all;
    ::GetClientRect(hwnd_, &all);
    ::FillRect(dc, &all, ::GetSysColorBrush(COLOR_WINDOW));

    RECT title{0, tray::kArtworkTitleTop, tray::kArtworkWidthPx,
               tray::kArtworkTitleTop + tray::kArtworkTitleHeight};
    {
        SelectScope font(dc, titleFont_.get());
        ::SetBkMode(dc, TRANSPARENT);
        ::SetTextColor(dc, colour(tray::kArtworkTitleColour));
        ::DrawTextA(dc, std::string(tray::kArtworkTitle).c_str(), -1, &title,
                    DT_CENTER | DT_VCENTER | DT_SINGLELINE | DT_NOPREFIX);
    }
    UniqueGdiObject rulePen(::CreatePen(PS_SOLID, 2, colour(tray::kArtworkRuleColour)));
    {
        SelectScope pen(dc, rulePen.get());
        const int y = title.bottom + 4;
        ::MoveToEx(dc, 12, y, nullptr);
        ::LineTo(dc, tray::kArtworkWidthPx - 12, y);
    }

    UniqueGdiObject barBrush(::CreateSolidBrush(colour(tray::kArtworkBarColour)));
    UniqueGdiObject edgePen(::CreatePen(PS_SOLID, 1, colour(tray::kArtworkBarEdgeColour)));
    SelectScope brush(dc, barBrush.get());
    SelectScope pen(dc, edgePen.get());
    for (RECT bar : {labelRect(tray::kGetUpdateLeft, tray::kGetUpdateTop, tray::kGetUpdateWidth,
                               tray::kGetUpdateHeight),
                     labelRect(tray::kCancelLeft, tray::kCancelTop, tray::kCancelWidth,
                               tray::kCancelHeight)}) {
        ::InflateRect(&bar, tray::kArtworkBarInset, tray::kArtworkBarInset);
        ::RoundRect(dc, bar.left, bar.top, bar.right, bar.bottom, 8, 8);
    }
}

LRESULT CALLBACK Picture1::StaticWndProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == WM_NCCREATE) {
        auto* create = reinterpret_cast<CREATESTRUCTA*>(lParam);
        auto* self = static_cast<Picture1*>(create->lpCreateParams);
        self->hwnd_ = hwnd;
        ::SetWindowLongPtrA(hwnd, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(self));
    }
    auto* self = reinterpret_cast<Picture1*>(::GetWindowLongPtrA(hwnd, GWLP_USERDATA));
    if (message == WM_NCDESTROY) {
        ::SetWindowLongPtrA(hwnd, GWLP_USERDATA, 0);
        if (self) self->hwnd_ = nullptr;
    }
    if (!self) return ::DefWindowProcA(hwnd, message, wParam, lParam);
    LRESULT result = 0;
    guarded([&] { result = self->WndProc(message, wParam, lParam); });
    return result;
}

LRESULT Picture1::WndProc(UINT message, WPARAM wParam, LPARAM lParam) {
    switch (message) {
    case WM_PAINT: {
        PaintScope paintScope(hwnd_);
        paint(paintScope.dc());
        return 0;
    }
    case WM_ERASEBKGND:
        return 1; // paint() covers everything
    case WM_CTLCOLORSTATIC: {
        // The labels lie on the artwork: no background of their own.
        HDC dc = reinterpret_cast<HDC>(wParam);
        const bool command = reinterpret_cast<HWND>(lParam) != label2_;
        ::SetBkMode(dc, TRANSPARENT);
        ::SetTextColor(dc, colour(command ? tray::kCommandTextColour : tray::kLabel2TextColour));
        return reinterpret_cast<LRESULT>(::GetStockObject(HOLLOW_BRUSH));
    }
    case WM_COMMAND:
        return ::SendMessageA(::GetParent(hwnd_), message, wParam, lParam);
    default:
        return ::DefWindowProcA(hwnd_, message, wParam, lParam);
    }
}

} // namespace checker
