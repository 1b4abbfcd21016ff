#pragma once

#include "frontends/windows/toolkit/system.h"

#include <Zandor/platform/String.h>

namespace zandor::platform::windows {

class Window;

/// The tooltips of one control: what there is to say about the place that the mouse is at.
class Hints {
public:
    Hints() = default;
    Hints(const Hints&) = delete;
    Hints& operator=(const Hints&) = delete;
    ~Hints();

    /// The mouse has moved in a window, over a place that this is said about; empty: nothing is.
    void over(const Window& window, const RECT& place, const String& text);
    /// The window goes, or shows something else.
    void leave(const Window& window);
    /// What is said at present.
    const String& text() const { return mText; }

private:
    HWND mTip = nullptr;
    HWND mOver = nullptr;
    RECT mPlace{};
    String mText;
};

} // namespace zandor::platform::windows
