#include "frontends/windows/toolkit/Drags.h"

#include "frontends/windows/toolkit/OleDrag.h"
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

Drags::Drags(Surroundings& surroundings) : mSurroundings(surroundings), mCarrier(&carryByOle) {}

void Drags::request(Control* source, std::vector<String> names) {
    if (mRunning) return;
    mSource = source;
    mNames = std::move(names);
    mRequested = true;
}

bool Drags::runRequested(Window& from) {
    if (mRunning || !std::exchange(mRequested, false) || !mSource || !from.isAlive()) return false;
    const auto held = from.shared_from_this(); // and with it all this
    mRunning = true;
    mFrom = held;
    mOver.reset();
    mLetGo.reset();
    mCounts = false;
    // The carrier has the mouse from now on.
    if (GetCapture() == from.hwnd()) ReleaseCapture();
    SetTimer(from.hwnd(), timer, pace, nullptr);
    const Carrier carry = mCarrier;
    carry(*this);
    if (const auto at = std::exchange(mLetGo, {}); at && isRunning())
        drop(*at);
    else
        cancel();
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

bool Drags::moved(POINT at) {
    if (!isRunning()) return false;
    // What the mouse only passes, on its way to the grid say, does not scroll.
    if (const auto from = mFrom.lock(); from && (at.x != mAt.x || at.y != mAt.y))
        SetTimer(from->hwnd(), timer, pace, nullptr);
    mAt = at;
    Window* const found = targetAt(at);
    const auto over = found ? found->shared_from_this() : nullptr;
    const bool entering = over != mOver.lock();
    if (entering) left();
    if (!isRunning()) return false;
    mOver = over;
    const bool counts = over && over->isAlive() &&
                        targetOf(*over).draggedOver(inside(*over, at), entering ? DragState::enters
                                                                                : DragState::moves);
    mCounts = counts;
    return over != nullptr && isRunning();
}

void Drags::left() {
    mCounts = false;
    const auto over = std::exchange(mOver, {}).lock();
    if (over && over->isAlive()) targetOf(*over).draggedOver(inside(*over, mAt), DragState::leaves);
}

void Drags::letGo(POINT at) {
    if (isRunning()) mLetGo = at;
}

void Drags::drop(POINT at) {
    moved(at);
    const auto over = mOver.lock();
    if (!isRunning() || !over || !over->isAlive()) return cancel();
    Control* const source = mSource;
    stop();
    // The source is told of with the drop, and gone after it.
    mSource = source;
    targetOf(*over).dropped(inside(*over, at));
    if (!mRunning) mSource = nullptr;
}

void Drags::tick() {
    const auto over = mOver.lock();
    if (!isRunning() || !over || !over->isAlive()) return;
    if (targetOf(*over).scrollUnderDrag(inside(*over, mAt))) moved(mAt);
}

void Drags::stop() {
    mRunning = mRequested = mCounts = false;
    mSource = nullptr;
    mOver.reset();
    mLetGo.reset();
    if (const auto ended = std::exchange(onEnd, {})) ended();
    const auto from = std::exchange(mFrom, {}).lock();
    if (from && from->hwnd()) KillTimer(from->hwnd(), timer);
}

void Drags::cancel() {
    if (mRunning) left();
    stop();
}

void Drags::giveUp(const Control* source) {
    if (source && mSource == source) cancel();
}

void Drags::forget(const Control* source) {
    if (mSource == source) mSource = nullptr;
}

void Drags::showCursor() const {
    const auto* const shape = reinterpret_cast<const wchar_t*>(mCounts ? IDC_HAND : IDC_NO);
    SetCursor(LoadCursorW(nullptr, shape));
}

} // namespace zandor::platform::windows
