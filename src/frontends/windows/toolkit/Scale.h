#pragma once

#include "frontends/windows/toolkit/system.h"

#include <Zandor/platform/Control.h>

namespace zandor::platform::windows {

/// Twips to pixels of one monitor and back.
class Scale {
public:
    /// Dots to an inch; 96 where the system says nothing.
    explicit Scale(int dpi = 96) : mDpi(dpi > 0 ? dpi : 96) {}

    int dpi() const { return mDpi; }
    /// A length of the design, given in pixels of 96 to an inch.
    int pixels(int logical) const { return MulDiv(logical, mDpi, 96); }

    /// To the nearest pixel; what is far outside every screen is brought to its rim, so that sums
    /// of two results never overflow.
    int toPixels(float twips) const;
    /// Exactly, to single precision.
    float toTwips(double pixels) const;
    /// The edges are rounded, not the size: neighbours stay neighbours at every fraction.
    RECT toPixels(const Bounds& bounds) const;
    Bounds toTwips(const RECT& pixels) const;

private:
    int mDpi;
};

/// A measure of the system's, SM_CXVSCROLL and the like, on a monitor of so many dots to an inch; of
/// the first screen where the system knows only that.
int systemMetric(int index, const Scale& scale);

/// Of the monitor that a window is on, where the system knows several; else of the screen.
int dpiOf(HWND window);

} // namespace zandor::platform::windows
