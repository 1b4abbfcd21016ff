#pragma once

#include "frontends/windows/toolkit/Constituent.h"

#include <Zandor/platform/Intrinsic.h>
#include <Zandor/platform/Tabulet.h>

#include <vector>

namespace zandor::platform::windows {

class CanvasItem;
class CanvasLine;
class TableWindow;

/// The drawing surface: paints lines and marks, which are no windows, and holds the table lists.
/// When the keyboard's focus is on a line, it is the canvas that has it, and the line is its
/// current one.
class Canvas final : public Window, public DropTarget {
public:
    Canvas(std::shared_ptr<Surroundings> surroundings, HWND parent, FrameEvents events);
    ~Canvas() override;

    void add(CanvasItem& item);
    void remove(CanvasItem& item);
    /// Lines before marks.
    const std::vector<CanvasItem*>& items() const { return mItems; }

    /// The tables shown, in the order of their slots.
    std::vector<TableWindow*> tables() const;
    /// The join lines shown, in the order of their numbers.
    std::vector<CanvasLine*> lines() const;

    /// The line that keys work on; nullptr when they work on the canvas.
    CanvasLine* currentLine() const { return mCurrent; }
    /// The same, as far as its focus is to be seen.
    const CanvasLine* focusedLine() const;
    /// Takes the focus to a line, or with nullptr to the canvas itself.
    void focusOn(CanvasLine* line);
    /// Opens the current line's definition, as Enter does.
    void openCurrentLine();

    bool draggedOver(POINT at, DragState state) override;
    void dropped(POINT) override {}
    bool scrollUnderDrag(POINT at) override;

protected:
    LRESULT handle(const Message& message) override;
    void forget() override;

private:
    void paint(const Message& message);
    void press(const Message& message);
    void release(const Message& message) const;
    void report(const MouseEvent& handler, const Message& message) const;
    bool keyPressed(const Message& message);
    void makeCurrent(CanvasLine* line);
    bool hasFocus() const { return isAlive() && GetFocus() == hwnd(); }
    TalvikTabulet::Point placeForKeys() const;
    void clickWithRightButton();
    void openMenu();
    void hint(POINT at) const;

    std::vector<CanvasItem*> mItems;
    FrameEvents mEvents;
    CanvasLine* mCurrent = nullptr;
    bool mFocusShown = false; ///< a click of the mouse gives the focus without showing it
};

/// The frame that tables and joins are drawn on.
class CanvasFrame final : public Constituent<platform::Frame, Canvas> {
public:
    using Constituent::Constituent;

    const std::shared_ptr<Canvas>& canvas() const { return mWindow; }
    bool Visible() const override { return mWindow->isShown(); }
    void Visible(bool value) override { mWindow->show(value); }
    void ZOrder() override { mWindow->raise(); }
};

} // namespace zandor::platform::windows
