#include "frontends/windows/toolkit/ScrollRange.h"

namespace zandor::platform::windows {

void ScrollRange::show(HWND window, int bar, const Extent& extent, UINT flags) {
    if (mShown == extent) return;
    // First, for a bar that appears or goes makes the window tell of its size.
    mShown = extent;
    SCROLLINFO info{};
    info.cbSize = sizeof info;
    info.fMask = SIF_RANGE | SIF_PAGE | SIF_POS | flags;
    info.nMin = extent.least;
    info.nMax = extent.most;
    info.nPage = static_cast<UINT>(extent.page);
    info.nPos = extent.position;
    SetScrollInfo(window, bar, &info, TRUE);
}

} // namespace zandor::platform::windows
