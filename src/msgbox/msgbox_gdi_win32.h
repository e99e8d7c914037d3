// Drawing helpers of the message box: text conversion, fonts with a substitute face, colours,
// and the small pictures (exclamation mark, check mark, cross, prohibition sign).
#pragma once

#include <windows.h>

#include <cstdint>
#include <string>
#include <string_view>

#include "common/unique_win32.h"

namespace checker::msgbox {

// The box keeps its texts as UTF-8; the window system wants UTF-16. Invalid bytes become U+FFFD.
std::wstring toWide(std::string_view utf8);
std::string toUtf8(std::wstring_view wide);

// 0xRRGGBB as a GDI colour.
constexpr COLORREF colour(std::uint32_t rgb) noexcept {
    return RGB((rgb >> 16) & 0xFF, (rgb >> 8) & 0xFF, rgb & 0xFF);
}

// A font of `face` at tenths of a point for the screen's dots per inch; where the face is not
// installed, the substitute face at the same size and weight.
UniqueGdiObject createFont(std::string_view face, int tenthsPt, bool bold, int dpiY);

// True when a font family of this name is installed.
bool fontInstalled(std::string_view face);

enum class Picture { None, CheckMark, Cross, Prohibition, Exclamation };

// Draws a picture into `box` (its size scales the drawing).
void drawPicture(HDC dc, Picture picture, const RECT& box);

} // namespace checker::msgbox
