#pragma once

#include "frontends/windows/toolkit/system.h"

#include <Zandor/platform/Control.h>

#include <functional>
#include <memory>
#include <optional>
#include <vector>

namespace zandor::platform::windows {

class Surroundings;
class Window;

/// The states of a drag over a target, as the platform's events have them.
enum class DragState : std::int16_t { enters = 0, leaves = 1, moves = 2 };

/// A window that a drag can be over. Places are its own pixels.
class DropTarget {
public:
    virtual ~DropTarget() = default;
    /// Whether a drop would mean something here.
    virtual bool draggedOver(POINT at, DragState state) = 0;
    virtual void dropped(POINT at) = 0;
    /// Scrolls where the drag stands near an edge. False: there is nothing to scroll.
    virtual bool scrollUnderDrag(POINT at) = 0;
};

/// The drags of one control. One lives between the control's own windows: it carries nothing that
/// others could take, and nothing that others carry is taken.
class Drags {
public:
    /// Carries a drag from its start to its end: tells of it by `moved`, `left` and `letGo`.
    using Carrier = std::function<void(Drags&)>;

    explicit Drags(Surroundings& surroundings);

    /// For a mouse that is not the system's. The default is the system's own drag and drop.
    void setCarrier(Carrier carrier) { mCarrier = std::move(carrier); }

    /// Asks for a drag with `source` as its source, of what bears these names; it begins with
    /// `runRequested`. While one runs, requests are ignored.
    void request(Control* source, std::vector<String> names);
    /// Runs a requested drag to its end, the drop included, from a window that the mouse was
    /// pressed in. False without a request.
    bool runRequested(Window& from);
    /// Whether one runs that has not been given up.
    bool isRunning() const { return mRunning && mSource; }
    Control* source() const { return mSource; }
    const std::vector<String>& names() const { return mNames; }
    Surroundings& surroundings() const { return mSurroundings; }

    // What the carrier tells. Places are on the screen.

    /// Whether a drop there comes to a window of the control's.
    bool moved(POINT at);
    /// The drag is elsewhere than over the control.
    void left();
    /// The button has come up over the control. The drop follows when the carrier has come to its
    /// end: it may open message boxes, which must not stand inside the drag.
    void letGo(POINT at);
    /// Shows by the cursor whether a drop would count.
    void showCursor() const;

    /// A while has passed with the mouse at rest.
    void tick();

    /// As Escape ends it: what it is over is told, and nothing is dropped.
    void cancel();
    /// The same for the drag of a source; without one nothing happens.
    void giveUp(const Control* source);
    /// The source has gone: its drag, if any, drops nothing.
    void forget(const Control* source);
    /// Called when the drag ends, however it does.
    std::function<void()> onEnd;

    static constexpr UINT_PTR timer = 7; ///< of the window that it began in
    static constexpr UINT pace = 60;     ///< of that, in milliseconds

private:
    Window* targetAt(POINT at) const;
    void drop(POINT at);
    void stop();

    Surroundings& mSurroundings;
    Carrier mCarrier;
    Control* mSource = nullptr;
    std::vector<String> mNames;
    bool mRequested = false;
    bool mRunning = false;
    bool mCounts = false;
    std::weak_ptr<Window> mFrom;
    std::weak_ptr<Window> mOver;
    POINT mAt{};
    std::optional<POINT> mLetGo;
};

} // namespace zandor::platform::windows
