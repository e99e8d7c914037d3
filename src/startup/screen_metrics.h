// Screen metrics of start-up: twips per pixel and the screen size in pixels, all 16-bit.
#pragma once

#include <cstdint>

namespace checker {

struct ScreenMetrics {
    std::int16_t intTwipsPerPixelX = 0;
    std::int16_t intTwipsPerPixelY = 0;
    std::int16_t intScreenWidthPx = 0;
    std::int16_t intScreenHeightPx = 0;
};

// Round half to even and check the 16-bit range; throws the overflow error outside it.
std::int16_t roundToInt16(double value);

// From the logical dots per inch and the screen size in pixels, the way the window toolkit
// derives them: twips per pixel = 1440 / dpi, screen size in twips = pixels x twips per pixel.
// A zero dpi is an arithmetic fault (division by zero, reported as an overflow).
ScreenMetrics computeScreenMetrics(int dpiX, int dpiY, int widthPx, int heightPx);

// Twips to pixels and back with the measured factor.
int twipsToPixels(int twips, int twipsPerPixel);
int pixelsToTwips(int pixels, int twipsPerPixel);

} // namespace checker
