#include "msgbox/msgbox_gdi_win32.h"

#include <algorithm>
#include <vector>

#include "common/constants.h"

namespace checker::msgbox {

std::wstring toWide(std::string_view utf8) {
    if (utf8.empty()) return {};
    const int n =
        ::MultiByteToWideChar(CP_UTF8, 0, utf8.data(), static_cast<int>(utf8.size()), nullptr, 0);
    std::wstring out(static_cast<std::size_t>(std::max(n, 0)), L'\0');
    if (n > 0)
        ::MultiByteToWideChar(CP_UTF8, 0, utf8.data(), static_cast<int>(utf8.size()), out.data(),
                              n);
    return out;
}

std::string toUtf8(std::wstring_view wide) {
    if (wide.empty()) return {};
    const int n = ::WideCharToMultiByte(CP_UTF8, 0, wide.data(), static_cast<int>(wide.size()),
                                        nullptr, 0, nullptr, nullptr);
    std::string out(static_cast<std::size_t>(std::max(n, 0)), '\0');
    if (n > 0)
        ::WideCharToMultiByte(CP_UTF8, 0, wide.data(), static_cast<int>(wide.size()), out.data(), n,
                              nullptr, nullptr);
    return out;
}

namespace {
int CALLBACK foundFamily(const LOGFONTW*, const TEXTMETRICW*, DWORD, LPARAM found) {
    *reinterpret_cast<bool*>(found) = true;
    return 0;
}
} // namespace

bool fontInstalled(std::string_view face) {
    LOGFONTW lf{};
    lf.lfCharSet = DEFAULT_CHARSET;
    const std::wstring wface = toWide(face);
    if (wface.empty() || wface.size() >= LF_FACESIZE) return false;
    wface.copy(lf.lfFaceName, wface.size());
    bool found = false;
    HDC dc = ::GetDC(nullptr);
    ::EnumFontFamiliesExW(dc, &lf, foundFamily, reinterpret_cast<LPARAM>(&found), 0);
    ::ReleaseDC(nullptr, dc);
    return found;
}

UniqueGdiObject createFont(std::string_view face, int tenthsPt, bool bold, int dpiY) {
    const std::string_view chosen = fontInstalled(face) ? face : kSubstituteFont;
    LOGFONTW lf{};
    // Point size to pixels, rounded: 8.25 pt at 96 dpi is 11 pixels.
    lf.lfHeight = -((tenthsPt * dpiY + 360) / 720);
    lf.lfWeight = bold ? FW_BOLD : FW_NORMAL;
    lf.lfCharSet = DEFAULT_CHARSET;
    lf.lfQuality = DEFAULT_QUALITY;
    const std::wstring wface = toWide(chosen);
    wface.copy(lf.lfFaceName, std::min<std::size_t>(wface.size(), LF_FACESIZE - 1));
    return UniqueGdiObject(::CreateFontIndirectW(&lf));
}

namespace {

// A point of a drawing laid out on a grid of `grid` units, scaled into `box`.
POINT at(const RECT& box, int grid, int x, int y) {
    const int w = box.right - box.left, h = box.bottom - box.top;
    return POINT{box.left + x * w / grid, box.top + y * h / grid};
}

void polyline(HDC dc, const std::vector<POINT>& points, COLORREF c, int width) {
    UniqueGdiObject pen(::CreatePen(PS_SOLID, width, c));
    SelectScope use(dc, pen.get());
    ::Polyline(dc, points.data(), static_cast<int>(points.size()));
}

void ring(HDC dc, const RECT& r, COLORREF c, int width) {
    UniqueGdiObject pen(::CreatePen(PS_SOLID, width, c));
    SelectScope usePen(dc, pen.get());
    SelectScope useBrush(dc, ::GetStockObject(NULL_BRUSH));
    ::Ellipse(dc, r.left, r.top, r.right, r.bottom);
}

void filledShape(HDC dc, const std::vector<POINT>& points, COLORREF fill, COLORREF edge,
                 bool round) {
    UniqueGdiObject brush(::CreateSolidBrush(fill));
    UniqueGdiObject pen(::CreatePen(PS_SOLID, 1, edge));
    SelectScope useBrush(dc, brush.get());
    SelectScope usePen(dc, pen.get());
    if (round)
        ::Ellipse(dc, points[0].x, points[0].y, points[1].x, points[1].y);
    else
        ::Polygon(dc, points.data(), static_cast<int>(points.size()));
}

// Every stroke outlined in black first, then all of them in colour on top: the pictures read on
// black and grey faces alike.
void outlined(HDC dc, const std::vector<std::vector<POINT>>& strokes, int unit) {
    for (const auto& s : strokes)
        polyline(dc, s, colour(kPictureOutline), unit + 2);
    for (const auto& s : strokes)
        polyline(dc, s, colour(kPictureYellow), unit);
}

void exclamation(HDC dc, const RECT& box, int dx, int dy, COLORREF fill, COLORREF edge) {
    RECT r = box;
    ::OffsetRect(&r, dx, dy);
    constexpr int g = 32;
    filledShape(dc, {at(r, g, 12, 3), at(r, g, 19, 3), at(r, g, 17, 20), at(r, g, 14, 20)}, fill,
                edge, false);
    filledShape(dc, {at(r, g, 13, 23), at(r, g, 19, 29)}, fill, edge, true);
}

} // namespace

void drawPicture(HDC dc, Picture picture, const RECT& box) {
    const int size = std::min(box.right - box.left, box.bottom - box.top);
    const int unit = std::max(1, size / 8);
    constexpr int g = 16;
    switch (picture) {
    case Picture::CheckMark:
        outlined(dc, {{at(box, g, 3, 8), at(box, g, 6, 12), at(box, g, 13, 3)}}, unit);
        break;
    case Picture::Cross:
        outlined(dc,
                 {{at(box, g, 4, 4), at(box, g, 12, 12)}, {at(box, g, 12, 4), at(box, g, 4, 12)}},
                 unit);
        break;
    case Picture::Prohibition: {
        const RECT r{at(box, g, 2, 2).x, at(box, g, 2, 2).y, at(box, g, 14, 14).x,
                     at(box, g, 14, 14).y};
        ring(dc, r, colour(kPictureOutline), unit + 2);
        outlined(dc, {{at(box, g, 4, 12), at(box, g, 12, 4)}}, unit);
        ring(dc, r, colour(kPictureYellow), unit);
        break;
    }
    case Picture::Exclamation: {
        const int shadow = std::max(1, size / 16);
        exclamation(dc, box, shadow, shadow, colour(kImageShadow), colour(kImageShadow));
        exclamation(dc, box, 0, 0, colour(kImageRed), colour(kImageEdge));
        break;
    }
    case Picture::None:
        break;
    }
}

} // namespace checker::msgbox
