#pragma once

#include "frontends/windows/toolkit/EntryList.h"

#include <Zandor/comforts/BoxGesture.h>

namespace zandor::platform::windows {

using enum comforts::Edges;

class TableListener : public EntryListener {
public:
    virtual void closeClicked() = 0;
    /// The right button has come up over the title.
    virtual void titleClicked() = 0;
    /// A move (no edge) or a resize by one or two edges begins.
    virtual void gestureBegan() = 0;
    /// The mouse is so many pixels from where the gesture began.
    virtual void gestureMoved(unsigned edges, POINT way) = 0;
    virtual void gestureEnded(unsigned edges) = 0;
    /// The box is to be where the gesture began.
    virtual void gestureTakenBack() = 0;
    /// Whether a drop would mean something here.
    virtual bool draggedOver(POINT at, DragState state) = 0;
    virtual void dropped(POINT at) = 0;
};

/// A table as a box: title bar with name and close button, list of columns, a border to resize by.
class TableWindow final : public Window, public DropTarget {
public:
    /// The slot orders the tables for the keyboard.
    TableWindow(std::shared_ptr<Surroundings> surroundings, HWND canvas, int slot);
    ~TableWindow() override;

    /// As a click on it does.
    void pressCross() const {
        if (!mLocked && mListener) mListener->closeClicked();
    }

    int slot() const { return mSlot; }
    void setListener(TableListener* listener);
    EntryList& list() const { return *mList; }

    void setTitle(const String& title);
    const String& title() const { return mTitle; }
    /// Neither moved, nor resized, nor closed by the user, and nothing that offers it.
    void setLocked(bool locked);
    bool isLocked() const { return mLocked; }
    void setCurrent(bool current);
    bool isCurrent() const { return mCurrent; }

    /// Top of the list inside the box, the same at every size.
    int listTop() const { return mTitleHeight; }
    /// The smallest box that still shows its name and one entry.
    SIZE smallest() const;
    RECT titleBar() const;
    RECT crossPlace() const;
    /// Alt and an arrow move the box as its title does, with Shift they resize it as its lower
    /// right corner does; Control stands for Alt there. Control alone is the list's.
    bool moveOrResize(WPARAM key, std::int16_t shift);

    bool draggedOver(POINT at, DragState state) override;
    void dropped(POINT at) override;
    bool scrollUnderDrag(POINT at) override;

protected:
    LRESULT handle(const Message& message) override;
    void forget() override;
    void fontChanged() override;

private:
    enum class Gesture { none, moveOrResize, cross };

    struct Colours {
        COLORREF back, text, frame;
    };
    Colours colours() const;
    RECT listPlace() const;
    unsigned edgesAt(POINT at) const;
    void arrange();
    void paint(const Message& message);
    void press(const Message& message);
    void move(const Message& message);
    void release(const Message& message);
    void beginGesture(unsigned edges);
    /// Whether there was one that has moved the box.
    bool stopGesture();
    void endGesture();
    void setCross(bool hot);
    bool showCursor() const;

    const int mSlot;
    TableListener* mListener = nullptr;
    std::shared_ptr<EntryList> mList;
    String mTitle;
    bool mCurrent = false;
    bool mLocked = false;
    int mTitleHeight = 0;
    Gesture mGesture = Gesture::none;
    unsigned mEdges = noEdge;
    POINT mPressedAt{};
    bool mMoved = false;
    bool mCrossHot = false;
};

} // namespace zandor::platform::windows
