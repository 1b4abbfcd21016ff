#pragma once

#include "frontends/windows/toolkit/Window.h"

#include <Zandor/platform/Intrinsic.h>

#include <functional>

namespace zandor::platform::windows {

/// The control's own window, a child of its host's, with all the parts in it.
class ControlWindow final : public Window {
public:
    ControlWindow(std::shared_ptr<Surroundings> surroundings, HWND parent);

    /// The control is to lay itself out.
    PlainEvent onResize;
    /// The control is to paint: it has come to be shown, or its host asks for it by WM_PAINT
    /// without a place to be painted (RedrawWindow with RDW_INTERNALPAINT).
    PlainEvent onPaint;
    /// Tab has left the last stop; false: the host has nowhere to go on to. Unset: the next tab
    /// stop of the window around.
    std::function<bool(bool next)> onLeave;

    /// onPaint follows when the messages at hand have been dealt with.
    void paintLater();
    /// The monitor is another, of so many dots to an inch.
    void setDpi(int dpi);

protected:
    LRESULT handle(const Message& message) override;
    void forget() override;

private:
    bool mPaintQueued = false;
};

} // namespace zandor::platform::windows
