#pragma once

#include "frontends/qt/Backdrop.h"
#include "frontends/qt/DragScroller.h"

#include <Zandor/platform/Intrinsic.h>

#include <QPointer>
#include <QWidget>

#include <vector>

namespace zandor::platform::qt {

class CanvasItem;
class CanvasLine;
class CanvasView;
class TabuletWidget;

/// The drawing surface: paints lines and marks, which are no widgets, and holds the table lists.
/// When the keyboard's focus is on a line, it is the canvas that has it, and the line is its
/// current one.
class Canvas : public QWidget {
    Q_OBJECT

public:
    Canvas(CanvasView& view, QWidget* parent);
    ~Canvas() override;

    void setEvents(FrameEvents events) { mEvents = std::move(events); }
    CanvasView& view() const { return mView; }

    void add(CanvasItem& item);
    void remove(CanvasItem& item);
    const std::vector<CanvasItem*>& items() const { return mItems; }
    /// An item that looks as it did is about to look otherwise.
    void changes(CanvasItem& item);

    /// The tables shown, in the order of their slots.
    std::vector<TabuletWidget*> tables() const;
    /// The join lines shown, in the order of their numbers.
    std::vector<CanvasLine*> lines() const;

    /// The line that keys work on; nullptr when they work on the canvas.
    CanvasLine* currentLine() const { return mCurrent; }
    /// Takes the focus to a line, or with nullptr to the canvas itself.
    void focusOn(CanvasLine* line, Qt::FocusReason reason);
    /// Opens the current line's definition, as Enter does.
    void openCurrentLine();

    /// A drag over the canvas or one of its tables scrolls it near the edges of what is seen.
    void dragHovers(QPoint at);
    void dragGone() { mScroller.stop(); }

protected:
    bool event(QEvent* event) override;
    void changeEvent(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void moveEvent(QMoveEvent* event) override;
    void focusInEvent(QFocusEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void contextMenuEvent(QContextMenuEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dragMoveEvent(QDragMoveEvent* event) override;
    void dragLeaveEvent(QDragLeaveEvent* event) override;

private:
    void showChanges();
    void settle();
    void makeCurrent(CanvasLine* line);
    bool frameShown() const { return mFocusShown && hasFocus() && !mCurrent; }
    QString sentenceAt(QPoint at) const;
    void showFocus();
    void announceFocus();
    QPointF placeForKeys() const;
    void clickWithRightButton();
    void openMenu();

    CanvasView& mView;
    std::vector<CanvasItem*> mItems; ///< lines before marks
    std::vector<CanvasItem*> mChanged;
    QRegion mLeft; ///< where those were that have changed
    Backdrop mBackdrop;
    FrameEvents mEvents;
    CanvasLine* mCurrent = nullptr;
    bool mFocusShown = false; ///< a click of the mouse gives the focus without showing it
    DragScroller mScroller;
};

} // namespace zandor::platform::qt
