#include "frontends/windows/toolkit/Surroundings.h"

#include "frontends/windows/toolkit/Canvas.h"
#include "frontends/windows/toolkit/Grid.h"
#include "frontends/windows/toolkit/ScrollBar.h"

#include <algorithm>

namespace zandor::platform::windows {

namespace {

/// How far a view has to go to show a stretch.
int wayTo(int begin, int end, int seenBegin, int seenEnd) {
    if (end > seenEnd && begin > seenBegin) return std::min(end - seenEnd, begin - seenBegin);
    return begin < seenBegin ? begin - seenBegin : 0;
}

UINT wheelLines() {
    UINT lines = 3;
    SystemParametersInfoW(SPI_GETWHEELSCROLLLINES, 0, &lines, 0);
    return lines == WHEEL_PAGESCROLL ? 10 : lines;
}

} // namespace

COLORREF Surroundings::ground() const { return hostsGround.value_or(GetSysColor(COLOR_BTNFACE)); }

COLORREF Surroundings::ink() const { return hostsInk.value_or(GetSysColor(COLOR_WINDOWTEXT)); }

bool Surroundings::holds(HWND window) const {
    const HWND own = surfaceHandle();
    return own && window && (window == own || IsChild(own, window));
}

RECT Surroundings::seen() const {
    if (!canvas || !canvas->isAlive() || !surface) return {};
    RECT place = surface->area();
    if (down && down->isShown()) place.right = std::min(place.right, down->placeInParent().left);
    if (across && across->isShown())
        place.bottom = std::min(place.bottom, across->placeInParent().top);
    const RECT at = canvas->placeInParent();
    OffsetRect(&place, -at.left, -at.top);
    const RECT whole = canvas->area();
    RECT part{};
    IntersectRect(&part, &place, &whole);
    return part;
}

void Surroundings::scrollBy(POINT way) const {
    if (across) across->scrollBy(scale.toTwips(way.x));
    if (down) down->scrollBy(scale.toTwips(way.y));
}

void Surroundings::scrollByStep(POINT direction) const {
    constexpr int step = 16;
    scrollBy({direction.x * scale.pixels(step), direction.y * scale.pixels(step)});
}

void Surroundings::scrollByWheel(const Message& message) const {
    const float way = static_cast<float>(GET_WHEEL_DELTA_WPARAM(message.w)) / WHEEL_DELTA *
                      static_cast<float>(wheelLines()) * ScrollBarWindow::step;
    if (message.id == WM_MOUSEHWHEEL) {
        if (across) across->scrollBy(way);
    } else if (auto* const bar = GET_KEYSTATE_WPARAM(message.w) & MK_SHIFT ? across : down) {
        bar->scrollBy(-way);
    }
}

void Surroundings::reveal(const RECT& place) const {
    const RECT now = seen();
    scrollBy({wayTo(place.left, place.right, now.left, now.right),
              wayTo(place.top, place.bottom, now.top, now.bottom)});
}

} // namespace zandor::platform::windows
