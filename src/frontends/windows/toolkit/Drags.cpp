#include "frontends/windows/toolkit/Drags.h"

#include "frontends/windows/toolkit/Surroundings.h"

#include <utility>

namespace zandor::platform::windows {

namespace {

POINT inside(const Window& window, POINT screen) {
    ScreenToClient(window.hwnd(), &screen);
    return screen;
}

DropTarget& targetOf(Window& window) { return dynamic_cast<DropTarget&>(window); }

} // namespace

void Drags::request(Control* source) {
    if (mRunning) return;
    mSource = source;
    mRequested = true;
}

bool Drags::runRequested(Window& from) {
    if (mRunning || !std::exchange(mRequested, false) || !mSource || !from.isAlive()) return false;
    mRunning = true;
    mFrom = from.weak_from_this();
    mOver.reset();
    SetTimer(from.hwnd(), timer, pace, nullptr);
    return true;
}

Window* Drags::targetAt(POINT at) const {
    const HWND surface = mSurroundings.surfaceHandle();
    HWND found = nullptr;
    for (HWND next = surface; next && next != found;) {
        found = next;
        POINT place = at;
        ScreenToClient(found, &place);
        next = ChildWindowFromPointEx(found, place, CWP_SKIPINVISIBLE);
    }
    for (Window* window = Window::around(found); window;
         window = Window::around(GetAncestor(window->hwnd(), GA_PARENT)))
        if (window->isAlive() && dynamic_cast<DropTarget*>(window)) return window;
    return nullptr;
}

void Drags::moved(POINT at) {
    if (!mRunning) return;
    mAt = at;
    Window* const found = targetAt(at);
    const auto over = found ? found->shared_from_this() : nullptr;
    const bool entering = over != mOver.lock();
    if (entering) leave();
    if (!mRunning) return;
    mOver = over;
    const bool counts = over && over->isAlive() &&
                        targetOf(*over).draggedOver(inside(*over, at), entering ? DragState::enters
                                                                                : DragState::moves);
    showCursor(counts);
}

void Drags::dropped(POINT at) {
    moved(at);
    if (!mRunning) return;
    const auto over = mOver.lock();
    const auto source = mSource;
    if (!source || !over || !over->isAlive()) {
        leave();
        stop();
        return;
    }
    stop();
    // The source is told of with the drop, and gone after it.
    mSource = source;
    targetOf(*over).dropped(inside(*over, at));
    if (!mRunning) mSource = nullptr;
}

void Drags::tick() {
    const auto over = mOver.lock();
    if (!mRunning || !over || !over->isAlive()) return;
    if (targetOf(*over).scrollUnderDrag(inside(*over, mAt))) moved(mAt);
}

void Drags::leave() {
    const auto over = std::exchange(mOver, {}).lock();
    if (over && over->isAlive()) targetOf(*over).draggedOver(inside(*over, mAt), DragState::leaves);
}

void Drags::stop() {
    mRunning = mRequested = false;
    mSource = nullptr;
    mOver.reset();
    const auto from = std::exchange(mFrom, {}).lock();
    if (!from || !from->hwnd()) return;
    KillTimer(from->hwnd(), timer);
    if (GetCapture() == from->hwnd()) ReleaseCapture();
}

void Drags::cancel() {
    if (mRunning) leave();
    stop();
}

void Drags::giveUp(const Control* source) {
    if (source && mSource == source) cancel();
}

void Drags::forget(const Control* source) {
    if (mSource == source) mSource = nullptr;
}

void Drags::showCursor(bool counts) const {
    const auto* const shape = reinterpret_cast<const wchar_t*>(counts ? IDC_HAND : IDC_NO);
    SetCursor(LoadCursorW(nullptr, shape));
}

} // namespace zandor::platform::windows
