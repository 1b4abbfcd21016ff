#pragma once

#include "frontends/windows/automation/com/system.h"

namespace zandor::automation {

// Containers measure in hundredths of a millimetre, and windows in pixels of the screen.

inline SIZE screenDpi() {
    const HDC screen = GetDC(nullptr);
    const SIZE dpi{GetDeviceCaps(screen, LOGPIXELSX), GetDeviceCaps(screen, LOGPIXELSY)};
    ReleaseDC(nullptr, screen);
    return dpi;
}

inline SIZE toPixels(SIZE himetric) {
    const SIZE dpi = screenDpi();
    return {MulDiv(himetric.cx, dpi.cx, 2540), MulDiv(himetric.cy, dpi.cy, 2540)};
}

} // namespace zandor::automation
