#include "frontends/windows/toolkit/ControlWindow.h"

#include "frontends/windows/toolkit/Drawing.h"
#include "frontends/windows/toolkit/Surroundings.h"
#include "frontends/windows/toolkit/partsIn.h"

#include <utility>

// Newer than what the headers are asked for.
#ifndef WM_DPICHANGED_AFTERPARENT
#define WM_DPICHANGED_AFTERPARENT 0x02E3
#endif

namespace zandor::platform::windows {

namespace {

constexpr UINT paintMessage = WM_APP + 1;

} // namespace

ControlWindow::ControlWindow(std::shared_ptr<Surroundings> surroundings, HWND parent)
    : Window(std::move(surroundings)) {
    create(parent, WS_CHILD | WS_CLIPCHILDREN | WS_CLIPSIBLINGS | WS_TABSTOP);
}

void ControlWindow::forget() {
    onResize = nullptr;
    onPaint = nullptr;
    onLeave = nullptr;
    surroundings().onFocus = nullptr;
    surroundings().onModal = nullptr;
    surroundings().surface = nullptr;
}

void ControlWindow::paintLater() {
    // What comes of it may open message boxes, which must never happen while the system paints.
    if (!isAlive() || std::exchange(mPaintQueued, true)) return;
    PostMessageW(hwnd(), paintMessage, 0, 0);
}

void ControlWindow::setDpi(int dpi) {
    if (dpi == surroundings().scale.dpi()) return;
    surroundings().scale = Scale(dpi);
    surroundings().fonts.setDpi(dpi);
    for (const auto& part : partsIn(hwnd())) part->applyScale();
    surroundings().fonts.dropOld();
    if (const PlainEvent resized = onResize) resized();
}

LRESULT ControlWindow::handle(const Message& message) {
    switch (message.id) {
    case WM_SIZE:
        if (const PlainEvent resized = onResize) resized();
        // An editor that does not go with its cell would be left where that was.
        if (isAlive() && !surroundings().comforts.flags().KeepsTyping) paintLater();
        return 0;
    case WM_SHOWWINDOW:
        if (message.w) paintLater();
        break;
    case paintMessage:
        mPaintQueued = false;
        if (const PlainEvent paint = onPaint) paint();
        return 0;
    case WM_ERASEBKGND: return 1;
    case WM_PRINTCLIENT:
    case WM_PAINT: {
        RECT stale{};
        if (message.id == WM_PAINT && !GetUpdateRect(hwnd(), &stale, FALSE)) paintLater();
        const Painting painting(hwnd(), message);
        fill(painting.dc(), painting.place(), surroundings().ground());
        return 0;
    }
    case WM_DESTROY:
        // With its host's; nothing is dropped on it any more.
        surroundings().drags.cancel();
        break;
    case WM_SETFOCUS:
        // From outside, by Tab. The focus of a part that is hidden comes here, too, and stays.
        if (GetKeyState(VK_TAB) < 0 && !surroundings().holds(reinterpret_cast<HWND>(message.w)))
            surroundings().navigation.enter(GetKeyState(VK_SHIFT) >= 0);
        return 0;
    case WM_LBUTTONDOWN: SetFocus(hwnd()); return 0;
    case WM_DPICHANGED_AFTERPARENT: setDpi(dpiOf(hwnd())); return 0;
    default: break;
    }
    return Window::handle(message);
}

} // namespace zandor::platform::windows
