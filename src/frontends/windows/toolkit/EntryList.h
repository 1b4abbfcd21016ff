#pragma once

#include "frontends/windows/toolkit/Constituent.h"

#include <Zandor/platform/ImageList.h>

#include <vector>

namespace zandor::platform::windows {

/// How an entry looks beside its text.
struct EntryLook {
    std::optional<Picture> picture;
    bool comesOut = false;
};

/// What a list tells about the mouse and the keys on its entries (row counts from 0). The selection
/// is already as the gesture leaves it.
class EntryListener {
public:
    virtual ~EntryListener() = default;
    virtual void entryPressed(int row, std::int16_t button, std::int16_t shift) = 0;
    /// The mouse moves with a button held; told is the entry that was pressed, wherever it is now.
    virtual void entryMoved(int row, std::int16_t buttons, std::int16_t shift) = 0;
    virtual void entryReleased(int row, std::int16_t button, std::int16_t shift) = 0;
    /// When the button has come up from a double click; or by Enter.
    virtual void entryDoubleClicked(int row) = 0;
    /// The selection has changed otherwise than by a press on an entry.
    virtual void selectionChanged() = 0;
    virtual void listScrolled() = 0;
    virtual void listGotFocus() = 0;
    /// A key asks for the menu at a place of the screen; the row is -1 in a list without entries.
    virtual void menuKey(int row, POINT at) = 0;
    virtual void deleteKey(int row) = 0;
    virtual EntryLook lookOf(int row) const = 0;
};

/// The list of a table's columns, a list of the system's whose gestures are ours: several entries
/// can be selected and dragged together, and a press on one of them leaves the others selected
/// until the button comes up.
class EntryList final : public Window {
public:
    EntryList(std::shared_ptr<Surroundings> surroundings, HWND parent);

    void setListener(EntryListener* listener) { mListener = listener; }

    int count() const;
    void add(const String& text);
    void clear();
    String textOf(int row) const;
    int rowHeight() const { return mRowHeight; }
    /// The first row in view.
    int top() const;
    void scrollTo(int row);
    /// Scrolls as little as shows a row.
    void reveal(int row);
    /// -1: none. In the list's own pixels.
    int rowAt(POINT at) const;
    RECT placeOf(int row) const;
    bool isSelected(int row) const;
    void select(int row, bool value);
    std::vector<int> selected() const;
    /// The row that keys go from; -1: there is none.
    int caret() const { return count() == 0 ? -1 : static_cast<int>(ask(LB_GETCARETINDEX)); }
    /// As a user does by keys, for who works by a screen reader; by SELFLAG_, added up.
    void take(int row, LONG how);
    /// As Enter does.
    void open(int row) {
        if (mListener) mListener->entryDoubleClicked(row);
    }
    void repaintRow(int row) const;
    EntryLook lookOf(int row) const { return mListener ? mListener->lookOf(row) : EntryLook{}; }

    std::optional<LRESULT> told(const Message& message) override;
    void gotFocus() override;

protected:
    LRESULT handle(const Message& message) override;
    void forget() override { mListener = nullptr; }
    void fontChanged() override;

private:
    LRESULT ask(UINT message, WPARAM w = 0, LPARAM l = 0) const { return passOn({message, w, l}); }
    LRESULT dealWith(const Message& message);
    void press(const Message& message);
    void move(const Message& message);
    void release(const Message& message);
    bool keyPressed(const Message& message);
    bool walk(WPARAM key);
    void selectFor(const Message& message, int row);
    void selectOnly(int from, int to);
    void selectAlone(int row);
    void setCaret(int row);
    int rowsInView() const;
    void tellOfKeys(const std::vector<int>& before);
    void checkTop();
    void draw(const DRAWITEMSTRUCT& item) const;
    void hint(POINT at) const;
    void openMenu();
    /// The whole table moves or resizes with some keys.
    bool isTables(const Message& message);

    EntryListener* mListener = nullptr;
    int mRowHeight = 0;
    int mTop = 0;
    int mAnchor = 0; ///< of a range
    int mPressed = -1;
    POINT mPressedAt{};
    int mDoubleClicked = -1;
    int mClickPending = -1; ///< to be selected alone when the button comes up
};

} // namespace zandor::platform::windows
