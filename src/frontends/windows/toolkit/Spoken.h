#pragma once

#include "frontends/windows/toolkit/Window.h"

#include <vector>

namespace zandor::platform::windows {

/// Something in a window that is no window of its own, as it is said to who does not see it.
struct SpokenPart {
    String name;
    String description;
    String value;
    LONG role = 0;  ///< one of ROLE_SYSTEM_
    LONG state = 0; ///< of STATE_SYSTEM_, added up
    RECT place{};   ///< in the window's pixels
    String action;  ///< what `press` does; empty: nothing
};

/// What a window says of itself and of its parts, which count from 1.
class Spoken {
public:
    virtual ~Spoken() = default;

    virtual LONG role() const = 0;
    virtual String description() const { return {}; }
    /// The windows in it, in the order in which they are told.
    virtual std::vector<HWND> windows() const = 0;
    virtual int count() const { return 0; }
    virtual SpokenPart part(int number) const = 0;
    /// 0: none.
    virtual int partAt(POINT) const { return 0; }
    /// Of a window with the focus; 0: it has the focus itself.
    virtual int focused() const { return 0; }
    virtual std::vector<int> selected() const { return {}; }
    virtual void press(int) {}
    /// By SELFLAG_, added up; false: that cannot be done with it.
    virtual bool select(int, LONG) { return false; }
};

/// Of the windows that have something to say beyond what the system says of them; nullptr for the
/// others. It is there no longer than the window.
std::unique_ptr<Spoken> spokenOf(Window& window);

} // namespace zandor::platform::windows
