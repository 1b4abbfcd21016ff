#pragma once

#include <QListView>
#include <QPersistentModelIndex>

namespace zandor::platform::qt {

/// What a list tells about the mouse on its entries (row counts from 0). The selection is already
/// as the gesture leaves it.
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
    /// A key asks for the menu at a place of the screen; the row is -1 in a list without entries.
    virtual void menuKey(int row, QPoint at) = 0;
    virtual void deleteKey(int row) = 0;
};

/// The list of a table's columns. Several entries can be selected and dragged together: a press on
/// one of them leaves the others selected until the button comes up.
class ColumnListView : public QListView {
public:
    explicit ColumnListView(QWidget* parent);

    void setListener(EntryListener* listener) { mListener = listener; }
    int rowHeight() const { return mRowHeight; }
    /// Where the first entry begins, above the list when it is scrolled.
    int firstEntry() const { return mInset - mScrolledBy; }

    void doItemsLayout() override;

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void contextMenuEvent(QContextMenuEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    bool viewportEvent(QEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void selectFor(const QMouseEvent& event, const QModelIndex& index);
    void selectAlone(const QModelIndex& index);
    void openMenu();
    void measure();

    EntryListener* mListener = nullptr;
    QPersistentModelIndex mPressed;
    QPersistentModelIndex mDoubleClicked;
    QPersistentModelIndex mClickPending; ///< to be selected alone when the button comes up
    int mRowHeight = 0;
    int mInset = 0; ///< of the entries, by a style sheet
    int mScrolledBy = 0;
};

} // namespace zandor::platform::qt
