#pragma once

#include "frontends/windows/toolkit/system.h"

#include <memory>
#include <vector>

namespace zandor::platform::windows {

class CanvasLine;
class RowWindow;
class Surroundings;
class TableWindow;
class Window;
struct Message;

/// The way of the keyboard through a control. Its stops are the tables in the order of their slots,
/// the join lines, the canvas where it has no lines, the grid and the home button; to the window
/// around it the control is a single stop.
class Navigation {
public:
    explicit Navigation(Surroundings& surroundings) : mSurroundings(surroundings) {}

    /// The focus has come into the control by Tab or Shift+Tab.
    void enter(bool next);
    /// A key that the part with the focus has not taken. False when it means nothing here, either.
    bool keyPressed(const Window& part, const Message& message);

private:
    struct Stop {
        std::shared_ptr<Window> window;
        CanvasLine* line = nullptr; ///< when the window is the canvas
    };

    HWND focused() const;
    std::vector<Stop> stops() const;
    bool goOn(bool next);
    void go(const Stop& stop);
    bool goOnInEditor(const RowWindow& editor, bool next) const;
    bool leave(bool next);
    bool changePane();
    bool scroll(WPARAM key, std::int16_t shift) const;

    Surroundings& mSurroundings;
    std::weak_ptr<Window> mLastTable; ///< that had the focus when F6 went to the grid
    // Where the control sent the focus on from a stop, Tab goes on from that stop all the same.
    std::weak_ptr<Window> mSentOnFrom;
    HWND mSentOnTo = nullptr;
};

} // namespace zandor::platform::windows
