#include "frontends/windows/toolkit/Scale.h"

#include <algorithm>
#include <cmath>

namespace zandor::platform::windows {

namespace {

constexpr double twipsPerInch = 1440;

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

int dpiOf(HWND window) {
    // Systems before the one that first had it are served, too.
    using GetDpiForWindow = UINT(WINAPI*)(HWND);
    static const auto ofWindow = reinterpret_cast<GetDpiForWindow>(
        reinterpret_cast<void*>(GetProcAddress(GetModuleHandleW(L"user32"), "GetDpiForWindow")));
    if (ofWindow)
        if (const UINT dpi = ofWindow(window)) return static_cast<int>(dpi);
    const HDC screen = GetDC(nullptr);
    const int dpi = GetDeviceCaps(screen, LOGPIXELSY);
    ReleaseDC(nullptr, screen);
    return dpi;
}

} // namespace zandor::platform::windows
