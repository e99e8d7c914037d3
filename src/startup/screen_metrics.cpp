#include "startup/screen_metrics.h"

#include <cmath>

#include "common/constants.h"
#include "common/error.h"

namespace checker {

std::int16_t roundToInt16(double value) {
    if (!std::isfinite(value)) throw overflowError("Form_Load");
    const double rounded = std::nearbyint(value); // default rounding mode: halves to even
    if (rounded < -32768.0 || rounded > 32767.0) throw overflowError("Form_Load");
    return static_cast<std::int16_t>(rounded);
}

ScreenMetrics computeScreenMetrics(int dpiX, int dpiY, int widthPx, int heightPx) {
    if (dpiX <= 0 || dpiY <= 0) throw CheckerError(11, "Form_Load", "Division by zero");
    const double twipsX = double(common::kTwipsPerInch) / dpiX;
    const double twipsY = double(common::kTwipsPerInch) / dpiY;
    ScreenMetrics m;
    m.intTwipsPerPixelX = roundToInt16(twipsX);
    m.intTwipsPerPixelY = roundToInt16(twipsY);
    if (m.intTwipsPerPixelX == 0 || m.intTwipsPerPixelY == 0)
        throw CheckerError(11, "Form_Load", "Division by zero");
    m.intScreenHeightPx = roundToInt16(heightPx * twipsY / m.intTwipsPerPixelY);
    m.intScreenWidthPx = roundToInt16(widthPx * twipsX / m.intTwipsPerPixelX);
    return m;
}

int twipsToPixels(int twips, int twipsPerPixel) {
    return twipsPerPixel > 0 ? static_cast<int>(std::lround(double(twips) / twipsPerPixel)) : twips;
}

int pixelsToTwips(int pixels, int twipsPerPixel) { return pixels * twipsPerPixel; }

} // namespace checker
