#pragma once

#include <Zandor/platform/Control.h>

#include <QPointF>
#include <QRect>

#include <algorithm>
#include <cmath>

/// Twips to logical pixels and back. The device scale is Qt's own business.
namespace zandor::platform::qt {

inline constexpr float twipsPerPixel = 15; ///< of logical pixels, 96 to an inch

/// To the nearest pixel; what is far outside every screen is brought to its rim, so that sums of
/// two results never overflow.
inline int toPixels(float twips) {
    constexpr float rim = 1 << 20;
    const float pixels = std::round(twips / twipsPerPixel);
    if (!(pixels > -rim)) return -static_cast<int>(rim);
    return static_cast<int>(std::min(pixels, rim));
}

/// Exactly, to single precision.
inline float toTwips(double pixels) { return static_cast<float>(pixels * twipsPerPixel); }

/// The edges are rounded, not the size: neighbours stay neighbours at every fraction.
inline QRect toPixels(const Bounds& bounds) {
    const int left = toPixels(bounds.Left);
    const int top = toPixels(bounds.Top);
    const int right = toPixels(bounds.Left + bounds.Width);
    const int bottom = toPixels(bounds.Top + bounds.Height);
    return {left, top, std::max(0, right - left), std::max(0, bottom - top)};
}

/// Exactly, to single precision.
inline Bounds toTwips(const QRect& pixels) {
    return {toTwips(pixels.x()), toTwips(pixels.y()), toTwips(pixels.width()),
            toTwips(pixels.height())};
}

} // namespace zandor::platform::qt
