#pragma once

#include "frontends/windows/toolkit/system.h"

#include <Zandor/platform/Control.h>

#include <memory>

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

/// The drag of one control. It lives between the window that it began in, which has captured the
/// mouse, and the other windows of the same control: nothing comes from outside or goes there.
class Drags {
public:
    explicit Drags(Surroundings& surroundings) : mSurroundings(surroundings) {}

    /// Asks for a drag with `source` as its source; it begins with `runRequested`. While one runs,
    /// requests are ignored.
    void request(Control* source);
    /// From now on the moves of the mouse are the drag's. False without a request.
    bool runRequested(Window& from);
    bool isRunning() const { return mRunning; }
    Control* source() const { return mSource; }

    // What the window that has the mouse gets. Places are on the screen.
    void moved(POINT at);
    void dropped(POINT at);
    /// A while has passed with the mouse at rest.
    void tick();

    /// As Escape ends it: what it is over is told, and nothing is dropped.
    void cancel();
    /// The same for the drag of a source; without one nothing happens.
    void giveUp(const Control* source);
    /// The source has gone: its drag, if any, drops nothing.
    void forget(const Control* source);

    static constexpr UINT_PTR timer = 7; ///< of the window that has the mouse
    static constexpr UINT pace = 60;     ///< of that, in milliseconds

private:
    Window* targetAt(POINT at) const;
    void leave();
    void stop();
    void showCursor(bool counts) const;

    Surroundings& mSurroundings;
    Control* mSource = nullptr;
    bool mRequested = false;
    bool mRunning = false;
    std::weak_ptr<Window> mFrom; ///< has the mouse
    std::weak_ptr<Window> mOver;
    POINT mAt{};
};

} // namespace zandor::platform::windows
