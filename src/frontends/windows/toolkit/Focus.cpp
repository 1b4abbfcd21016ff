#include "frontends/windows/toolkit/Focus.h"

#include "frontends/windows/toolkit/Window.h"

#include <Zandor/platform/RuntimeError.h>

#include <utility>

namespace zandor::platform::windows {

namespace {

bool isInside(HWND inner, HWND outer) {
    return inner && outer && (inner == outer || IsChild(outer, inner));
}

} // namespace

void Focus::take(Window* part) {
    if (!part || !part->isAlive() || !IsWindowVisible(part->hwnd()))
        throw errors::invalidProcedureCall();
    // A window that a dialog stands in front of is disabled, too, and that is not meant here.
    for (const Window* at = part; at && at != mSurface;
         at = Window::around(GetAncestor(at->hwnd(), GA_PARENT)))
        if (!at->isEnabled()) throw errors::invalidProcedureCall();
    const HWND handle = part->hwnd();
    const auto held = part->shared_from_this();
    SetFocus(handle);
    if (!held->isAlive() || mOwner == part) return;
    const HWND root = GetAncestor(handle, GA_ROOT);
    if (GetFocus() == handle || GetActiveWindow() != root) entered(*part);
}

void Focus::release(Window& part) {
    if (mOwner && isInside(mOwner->hwnd(), part.hwnd())) mOwner = nullptr;
    if (!isInside(GetFocus(), part.hwnd())) return;
    const bool toFallback = mFallback && mFallback->isAlive() &&
                            IsWindowVisible(mFallback->hwnd()) &&
                            !isInside(mFallback->hwnd(), part.hwnd());
    const Window* const to = toFallback ? mFallback : mSurface;
    if (to && to != &part && to->isAlive()) SetFocus(to->hwnd());
}

void Focus::restore() {
    if (!mOwner || !mOwner->isAlive() || !mSurface || isInside(GetFocus(), mSurface->hwnd()))
        return;
    if (IsWindowVisible(mOwner->hwnd())) SetFocus(mOwner->hwnd());
}

void Focus::forget(Window& part) {
    release(part);
    if (mOwner == &part) mOwner = nullptr;
    if (mFallback == &part) mFallback = nullptr;
    if (mSurface == &part) mSurface = nullptr;
}

bool Focus::isOnScreen() const {
    return mSurface && mSurface->isAlive() && IsWindowVisible(mSurface->hwnd());
}

void Focus::entered(Window& part) {
    if (std::exchange(mOwner, &part) != &part) part.gotFocus();
}

void Focus::left(const Window& part, HWND to) {
    if (mOwner != &part || !to) return;
    if (GetAncestor(to, GA_ROOT) == GetAncestor(part.hwnd(), GA_ROOT)) mOwner = nullptr;
}

} // namespace zandor::platform::windows
