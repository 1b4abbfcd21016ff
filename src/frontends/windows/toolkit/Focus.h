#pragma once

#include "frontends/windows/toolkit/system.h"

namespace zandor::platform::windows {

class Window;

/// Which part of a control has the keyboard's focus, as the control understands it: a message box
/// or another window in front takes no focus away, and its closing gives none back.
class Focus {
public:
    /// The control's own window; it has the focus where no part can.
    void setSurface(Window* surface) { mSurface = surface; }
    /// Where the focus goes from a part that is hidden, while this is visible itself.
    void setFallback(Window* fallback) { mFallback = fallback; }

    /// Gives a part the focus; error 5 when it is hidden or disabled. While a box or a dialog is in
    /// front, the part is told all the same and at once, and has the focus when that has closed.
    void take(Window* part);
    /// If the focus is in the part, moves it to the fallback, or else to the control's own window;
    /// nobody is told.
    void release(Window& part);
    /// After a box or a dialog: the focus is where it was, or where it was sent meanwhile.
    void restore();
    /// The part goes.
    void forget(Window& part);
    /// Whether there is a focus to be had: not before the control's window is shown.
    bool isOnScreen() const;

    // The system's messages.
    void entered(Window& part);
    void left(const Window& part, HWND to);

private:
    Window* mSurface = nullptr;
    Window* mFallback = nullptr;
    Window* mOwner = nullptr;
};

} // namespace zandor::platform::windows
