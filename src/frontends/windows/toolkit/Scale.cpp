#include "frontends/windows/toolkit/Scale.h"

#include <algorithm>
#include <cmath>

namespace zandor::platform::windows {

namespace {

constexpr double twipsPerInch = 1440;

/// A procedure that came to the system later: systems before are served, too.
template <class Procedure>
Procedure* later(const char* name) {
    return reinterpret_cast<Procedure*>(
        reinterpret_cast<void*>(GetProcAddress(GetModuleHandleW(L"user32"), name)));
}

} // namespace

int Scale::toPixels(float twips) const {
    constexpr double rim = 1 << 20;
    const double pixels = std::round(static_cast<double>(twips) * mDpi / twipsPerInch);
    if (!(pixels > -rim)) return -static_cast<int>(rim);
    return static_cast<int>(std::min(pixels, rim));
}

float Scale::toTwips(double pixels) const {
    return static_cast<float>(pixels * twipsPerInch / mDpi);
}

RECT Scale::toPixels(const Bounds& bounds) const {
    const int left = toPixels(bounds.Left);
    const int top = toPixels(bounds.Top);
    return {left, top, std::max(left, toPixels(bounds.Left + bounds.Width)),
            std::max(top, toPixels(bounds.Top + bounds.Height))};
}

Bounds Scale::toTwips(const RECT& pixels) const {
    return {toTwips(pixels.left), toTwips(pixels.top), toTwips(pixels.right - pixels.left),
            toTwips(pixels.bottom - pixels.top)};
}

int systemMetric(int index, const Scale& scale) {
    static const auto forDpi = later<int WINAPI(int, UINT)>("GetSystemMetricsForDpi");
    return forDpi ? forDpi(index, static_cast<UINT>(scale.dpi())) : GetSystemMetrics(index);
}

int dpiOf(HWND window) {
    static const auto ofWindow = later<UINT WINAPI(HWND)>("GetDpiForWindow");
    if (ofWindow)
        if (const UINT dpi = ofWindow(window)) return static_cast<int>(dpi);
    const HDC screen = GetDC(nullptr);
    const int dpi = GetDeviceCaps(screen, LOGPIXELSY);
    ReleaseDC(nullptr, screen);
    return dpi;
}

} // namespace zandor::platform::windows
