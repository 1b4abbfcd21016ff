#pragma once

#include <Zandor/qt/export.h>

#include "frontends/qt/ColumnListView.h"
#include "frontends/qt/DragScroller.h"
#include "frontends/qt/RestingPicture.h"

#include <Zandor/platform/Words.h>

#include <QAbstractButton>
#include <QColor>
#include <QPointer>
#include <QWidget>

namespace zandor::platform::qt {

class Canvas;
class ColumnListModel;

class ZANDOR_WIDGETS_EXPORT TabuletListener : public EntryListener {
public:
    /// The table has its list from now on.
    virtual void listMade(ColumnListView& list) = 0;
    virtual void closeClicked() = 0;
    /// The right button has come up over the title.
    virtual void titleClicked() = 0;
    /// A move (no edge) or a resize by one or two edges begins.
    virtual void gestureBegan() = 0;
    /// The mouse is `way` logical pixels from where the gesture began.
    virtual void gestureMoved(Qt::Edges edges, QPointF way) = 0;
    virtual void gestureEnded(Qt::Edges edges) = 0;
    /// The box is to be where the gesture began.
    virtual void gestureTakenBack() = 0;
    /// Without data it is the drag that has come before. State 0 enters, 1 leaves, 2 is over.
    virtual bool draggedOver(const QMimeData* data, QPointF at, std::int16_t state) = 0;
    virtual bool dropped(const QMimeData* data, QPointF at) = 0;
};

struct TitleColours {
    QColor back;
    QColor text;
    QColor frame;
};

/// A table as a box: title bar with name and close button, list of columns, a border to resize by.
/// List and button are made when they are first asked for, by the mouse, the keyboard, a screen
/// reader or whoever selects an entry; until then the box paints what they would.
class ZANDOR_WIDGETS_EXPORT TabuletWidget : public QWidget {
    Q_OBJECT

public:
    /// The slot orders the tables for the keyboard.
    TabuletWidget(int slot, Canvas& canvas);

    int slot() const { return mSlot; }

    void setListener(TabuletListener* listener);
    void setWords(const Words& words);
    /// Made by asking, with the button.
    ColumnListView& list() const;
    QAbstractButton& closeButton() const;
    /// nullptr as long as nobody has asked for it.
    ColumnListView* madeList() const { return mList; }
    ColumnListModel& model() const { return *mModel; }
    RestingPicture& picture() { return mPicture; }

    void setTitle(const QString& title);
    /// As it is shown.
    const QString& title() const { return mTitle; }
    /// What is wrong with the table, as a sign in its title and a tooltip over it; empty: nothing.
    void setNote(const QString& note);
    const QString& note() const { return mNote; }
    /// Neither moved, nor resized, nor closed by the user, and nothing that offers it.
    void setLocked(bool locked);
    bool isLocked() const { return mLocked; }
    void setCurrent(bool current);
    bool isCurrent() const { return mCurrent; }

    /// To be called when all entries are there.
    void layOut();
    int rowHeight() const;
    /// Where the first entry begins inside the box; above the list when that is scrolled.
    int firstEntry() const;
    TitleColours titleColours() const;

    /// Top of the list inside the box, the same at every size.
    int listTop() const { return mTitleHeight; }
    /// The smallest box that still shows its name and one entry.
    QSize smallest() const;
    QRect titleBar() const;

protected:
    bool event(QEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void changeEvent(QEvent* event) override;
    void focusInEvent(QFocusEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dragMoveEvent(QDragMoveEvent* event) override;
    void dragLeaveEvent(QDragLeaveEvent* event) override;
    void dropEvent(QDropEvent* event) override;

private:
    enum class Gesture { none, move, resize };

    void makeParts();
    void makePartsIfNeeded();
    bool handOn(QEvent& event);
    void measure();
    void tellOfMovedEntries();
    void paintAnew();
    QRect listPlace() const;
    QRect crossPlace() const;
    QRect titlePlace() const;
    QFont titleFont() const;
    void arrange();
    Qt::Edges edgesAt(QPoint at) const;
    void beginGesture(Qt::Edges edges);
    /// Whether there was one that has moved the box.
    bool stopGesture();
    void endGesture();
    bool moveOrResize(const QKeyEvent& event);
    void scrollUnderDrag(QPoint direction);

    Canvas& mCanvas;
    const int mSlot;
    TabuletListener* mListener = nullptr;
    ColumnListModel* mModel;
    ColumnListView* mList = nullptr;
    QAbstractButton* mClose = nullptr;
    QPointer<QWidget> mHandedTo; ///< has the mouse while a button is down
    QString mRemoveWord;
    QString mTitle;
    QString mNote;
    bool mCurrent = false;
    bool mLocked = false;
    int mTitleHeight = 0;
    Gesture mGesture = Gesture::none;
    Qt::Edges mEdges;
    QPointF mPressedAt;
    QPointF mDraggedAt;
    bool mMoved = false;
    DragScroller mScroller;
    RestingPicture mPicture;
};

} // namespace zandor::platform::qt
