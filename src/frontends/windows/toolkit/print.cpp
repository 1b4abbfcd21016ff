#include "frontends/windows/toolkit/print.h"

#include "frontends/windows/toolkit/Drawing.h"

#include <algorithm>
#include <vector>

namespace zandor::platform::windows {

namespace {

/// The children that are to be seen, the lowest first.
std::vector<HWND> childrenOf(HWND window) {
    std::vector<HWND> children;
    for (HWND child = GetWindow(window, GW_CHILD); child; child = GetWindow(child, GW_HWNDNEXT))
        if (GetWindowLongW(child, GWL_STYLE) & WS_VISIBLE) children.insert(children.begin(), child);
    return children;
}

bool isScrollBar(HWND window) {
    wchar_t kind[16] = {};
    GetClassNameW(window, kind, 16);
    return lstrcmpiW(kind, L"SCROLLBAR") == 0;
}

void printEdge(HWND window, HDC dc, RECT place) {
    if (GetWindowLongW(window, GWL_EXSTYLE) & WS_EX_CLIENTEDGE)
        DrawEdge(dc, &place, EDGE_SUNKEN, BF_RECT);
    else if (GetWindowLongW(window, GWL_STYLE) & WS_BORDER)
        frame(dc, place, systemColour(COLOR_WINDOWFRAME));
}

/// A scroll bar as it stands: not every system draws one that it is asked for.
void printBar(HWND window, HDC dc, int kind, const RECT& bar) {
    SCROLLINFO info{};
    info.cbSize = sizeof info;
    info.fMask = SIF_ALL;
    GetScrollInfo(window, kind, &info);
    const bool lying = widthOf(bar) > heightOf(bar);
    const int length = lying ? widthOf(bar) : heightOf(bar);
    const int arrow = std::min(lying ? heightOf(bar) : widthOf(bar), length / 2);
    const auto part = [&](int from, int to) {
        return lying ? RECT{bar.left + from, bar.top, bar.left + to, bar.bottom}
                     : RECT{bar.left, bar.top + from, bar.right, bar.top + to};
    };
    fill(dc, bar, systemColour(COLOR_SCROLLBAR));
    RECT first = part(0, arrow);
    RECT last = part(length - arrow, length);
    DrawFrameControl(dc, &first, DFC_SCROLL, lying ? DFCS_SCROLLLEFT : DFCS_SCROLLUP);
    DrawFrameControl(dc, &last, DFC_SCROLL, lying ? DFCS_SCROLLRIGHT : DFCS_SCROLLDOWN);
    const int range = info.nMax - info.nMin + 1;
    const int page = static_cast<int>(info.nPage);
    const int room = length - 2 * arrow;
    if (page <= 0 || page >= range || room <= 0) return;
    const int thumb = std::min(room, std::max(MulDiv(room, page, range), arrow / 2));
    const int way = MulDiv(room - thumb, info.nPos - info.nMin, range - page);
    RECT place = part(arrow + way, arrow + way + thumb);
    DrawFrameControl(dc, &place, DFC_BUTTON, DFCS_BUTTONPUSH);
}

/// The bars at a window's own border, which is at the origin.
void printBars(HWND window, HDC dc, POINT origin) {
    for (const LONG object : {OBJID_HSCROLL, OBJID_VSCROLL}) {
        const bool lying = object == OBJID_HSCROLL;
        if (!(GetWindowLongW(window, GWL_STYLE) & (lying ? WS_HSCROLL : WS_VSCROLL))) continue;
        SCROLLBARINFO info{};
        info.cbSize = sizeof info;
        if (!GetScrollBarInfo(window, object, &info)) continue;
        OffsetRect(&info.rcScrollBar, -origin.x, -origin.y);
        printBar(window, dc, lying ? SB_HORZ : SB_VERT, info.rcScrollBar);
    }
}

/// Each is asked alone: not every system's WM_PRINT asks those that stand in a window, too.
void printAt(HWND window, HDC dc, POINT origin) {
    RECT place{};
    GetWindowRect(window, &place);
    OffsetRect(&place, -origin.x, -origin.y);
    POINT inside{};
    ClientToScreen(window, &inside);
    const int state = SaveDC(dc);
    IntersectClipRect(dc, place.left, place.top, place.right, place.bottom);
    printEdge(window, dc, place);
    printBars(window, dc, origin);
    RECT area{};
    GetClientRect(window, &area);
    OffsetRect(&area, inside.x - origin.x, inside.y - origin.y);
    IntersectClipRect(dc, area.left, area.top, area.right, area.bottom);
    const int within = SaveDC(dc);
    SetViewportOrgEx(dc, area.left, area.top, nullptr);
    SendMessageW(window, WM_ERASEBKGND, reinterpret_cast<WPARAM>(dc), 0);
    SendMessageW(window, WM_PRINTCLIENT, reinterpret_cast<WPARAM>(dc), PRF_CLIENT);
    if (isScrollBar(window)) printBar(window, dc, SB_CTL, {0, 0, widthOf(area), heightOf(area)});
    RestoreDC(dc, within);
    for (const HWND child : childrenOf(window)) printAt(child, dc, origin);
    RestoreDC(dc, state);
}

} // namespace

void print(HWND window, HDC dc) {
    RECT place{};
    GetWindowRect(window, &place);
    printAt(window, dc, {place.left, place.top});
}

} // namespace zandor::platform::windows
