#include "frontends/windows/toolkit/ScrollBar.h"

#include <Zandor/platform/RuntimeError.h>

#include <algorithm>
#include <cmath>

namespace zandor::platform::windows {

ScrollBarWindow::ScrollBarWindow(std::shared_ptr<Surroundings> around, HWND parent,
                                 Orientation orientation, ScrollBarEvents events)
    : Window(std::move(around)), mOrientation(orientation), mEvents(std::move(events)) {
    const bool lying = orientation == Orientation::horizontal;
    createNative(L"SCROLLBAR", parent,
                 WS_CHILD | WS_VISIBLE | WS_CLIPSIBLINGS | (lying ? SBS_HORZ : SBS_VERT));
    place(lying ? RECT{0, 0, 0, thickness()} : RECT{0, 0, thickness(), 0});
    (lying ? surroundings().across : surroundings().down) = this;
    showRange();
}

ScrollBarWindow::~ScrollBarWindow() { forget(); }

void ScrollBarWindow::forget() {
    mEvents = {};
    ScrollBarWindow*& known =
        mOrientation == Orientation::horizontal ? surroundings().across : surroundings().down;
    if (known == this) known = nullptr;
}

int ScrollBarWindow::thickness() const {
    return systemMetric(mOrientation == Orientation::horizontal ? SM_CYHSCROLL : SM_CXVSCROLL,
                        surroundings().scale);
}

void ScrollBarWindow::showRange() {
    // The system's range goes on for as much as is seen of it.
    if (hwnd())
        mRange.show(hwnd(), SB_CTL, {0, mMax + mLargeChange - 1, mLargeChange, mValue},
                    SIF_DISABLENOSCROLL);
}

void ScrollBarWindow::setMax(int max) {
    mMax = max;
    showRange();
    scrollTo(mValue);
}

void ScrollBarWindow::setLargeChange(int change) {
    mLargeChange = change;
    showRange();
}

void ScrollBarWindow::scrollTo(int value) {
    const int held = std::clamp(value, 0, mMax);
    if (held == mValue) return;
    mValue = held;
    showRange();
    // A copy: what it does may end the bar.
    if (const PlainEvent change = mEvents.Change) change();
}

void ScrollBarWindow::scrollBy(float twips) {
    if (isEnabled()) scrollTo(mValue + static_cast<int>(std::lround(twips)));
}

void ScrollBarWindow::gotFocus() {
    if (const PlainEvent got = mEvents.GotFocus) got();
}

std::optional<LRESULT> ScrollBarWindow::told(const Message& message) {
    if (message.id != WM_HSCROLL && message.id != WM_VSCROLL) return {};
    const int line = static_cast<int>(step);
    switch (LOWORD(message.w)) {
    case SB_LINEUP: scrollTo(mValue - line); break;
    case SB_LINEDOWN: scrollTo(mValue + line); break;
    case SB_PAGEUP: scrollTo(mValue - mLargeChange); break;
    case SB_PAGEDOWN: scrollTo(mValue + mLargeChange); break;
    case SB_THUMBPOSITION:
    case SB_THUMBTRACK: scrollTo(HIWORD(message.w)); break;
    case SB_TOP: scrollTo(0); break;
    case SB_BOTTOM: scrollTo(mMax); break;
    default: break;
    }
    return 0;
}

LRESULT ScrollBarWindow::handle(const Message& message) {
    // A bar takes the focus with a press of the mouse; the control may send it on at once.
    if (message.id == WM_LBUTTONDOWN || message.id == WM_LBUTTONDBLCLK) SetFocus(hwnd());
    return isAlive() ? Window::handle(message) : 0;
}

Bounds ScrollBar::bounds() const {
    Bounds result = Constituent::bounds();
    const Orientation orientation = mWindow->orientation();
    const float thick = surroundings().scale.toTwips(mWindow->thickness());
    (orientation == Orientation::horizontal ? result.Height : result.Width) = thick;
    return result;
}

void ScrollBar::Max(std::int16_t value) {
    if (value < 0) throw errors::invalidPropertyValue();
    mWindow->setMax(value);
}

void ScrollBar::Value(std::int16_t value) {
    if (value < 0 || value > Max()) throw errors::invalidPropertyValue();
    mWindow->scrollTo(value);
}

void ScrollBar::LargeChange(std::int16_t value) {
    if (value < 1) throw errors::invalidPropertyValue();
    mWindow->setLargeChange(value);
}

} // namespace zandor::platform::windows
