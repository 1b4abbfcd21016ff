#include "frontends/qt/ColumnListView.h"

#include "frontends/qt/ColumnDelegate.h"
#include "frontends/qt/ColumnListModel.h"
#include "frontends/qt/ElisionToolTip.h"
#include "frontends/qt/KeyCodes.h"

#include <QContextMenuEvent>
#include <QHelpEvent>
#include <QPointer>
#include <QScrollBar>
#include <QWheelEvent>

namespace zandor::platform::qt {

ColumnListView::ColumnListView(QWidget* parent) : QListView(parent) {
    setFrameShape(QFrame::NoFrame);
    setFocusPolicy(Qt::ClickFocus);
    setSelectionMode(ExtendedSelection);
    setEditTriggers(NoEditTriggers);
    setDragDropMode(NoDragDrop);
    setUniformItemSizes(true);
    setVerticalScrollMode(ScrollPerPixel);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setTextElideMode(Qt::ElideRight);
    setItemDelegate(new ColumnDelegate(this));
    // The frame around the list shows the arrows of its border; the list does not inherit them.
    setCursor(Qt::ArrowCursor);
    connect(verticalScrollBar(), &QScrollBar::valueChanged, this, [this](int value) {
        mScrolledBy = value;
        if (mListener) mListener->listScrolled();
    });
    measure();
}

void ColumnListView::measure() {
    const int before = std::exchange(mRowHeight, ColumnDelegate::rowHeight(fontMetrics()));
    const int inset = std::exchange(mInset, contentsRect().top());
    verticalScrollBar()->setSingleStep(mRowHeight);
    if (before == 0 || (before == mRowHeight && inset == mInset)) return;
    // Joins end at entries, and those stand elsewhere once they are laid out.
    QMetaObject::invokeMethod(
        this,
        [this] {
            doItemsLayout();
            if (mListener) mListener->listScrolled();
        },
        Qt::QueuedConnection);
}

void ColumnListView::doItemsLayout() {
    // A list that was never shown knows nothing of the host's style sheet.
    ensurePolished();
    measure();
    QListView::doItemsLayout();
}

void ColumnListView::changeEvent(QEvent* event) {
    QListView::changeEvent(event);
    if (event->type() == QEvent::FontChange || event->type() == QEvent::StyleChange) measure();
}

/// The base class knows where ranges begin, and leaves the selection alone for a press on one of
/// several selected entries.
void ColumnListView::selectFor(const QMouseEvent& event, const QModelIndex& index) {
    const bool left = event.button() == Qt::LeftButton;
    const bool plain = event.modifiers() == Qt::NoModifier;
    mPressed = index;
    mClickPending = mDoubleClicked = QPersistentModelIndex();
    if (left && plain && selectionModel()->isSelected(index)) mClickPending = index;
    if (!left && !index.isValid()) return;
    // Of the buttons, the left one alone extends.
    QMouseEvent press(event.type(), event.position(), event.scenePosition(), event.globalPosition(),
                      event.button(), event.buttons(),
                      left ? event.modifiers() : Qt::KeyboardModifiers());
    QListView::mousePressEvent(&press);
    // The base class would go on to select along the way of the mouse.
    setState(NoState);
    if (left && plain && !index.isValid()) selectAlone(index);
}

void ColumnListView::selectAlone(const QModelIndex& index) {
    const QItemSelection before = selectionModel()->selection();
    if (index.isValid())
        selectionModel()->setCurrentIndex(index, QItemSelectionModel::ClearAndSelect);
    else
        selectionModel()->clearSelection();
    if (mListener && selectionModel()->selection() != before) mListener->selectionChanged();
}

void ColumnListView::mousePressEvent(QMouseEvent* event) {
    const QModelIndex index = indexAt(event->position().toPoint());
    selectFor(*event, index);
    // Whoever was told of an emptied selection may have ended all this.
    if (index.isValid() && mListener)
        mListener->entryPressed(index.row(), buttonState(event->button()),
                                shiftState(event->modifiers()));
}

void ColumnListView::mouseMoveEvent(QMouseEvent* event) {
    if (!mListener || !mPressed.isValid() || event->buttons() == Qt::NoButton) return;
    mDoubleClicked = QPersistentModelIndex(); // a drag that follows a click closely
    mListener->entryMoved(mPressed.row(), buttonState(event->buttons()),
                          shiftState(event->modifiers()));
}

void ColumnListView::mouseReleaseEvent(QMouseEvent* event) {
    const QPointer<ColumnListView> alive = this;
    const QPersistentModelIndex index = indexAt(event->position().toPoint());
    const bool again = event->button() == Qt::LeftButton && mClickPending == index;
    const bool doubleClicked = event->button() == Qt::LeftButton && mDoubleClicked == index;
    mPressed = mClickPending = mDoubleClicked = QPersistentModelIndex();
    if (again && index.isValid()) selectAlone(index);
    if (alive && mListener && index.isValid())
        mListener->entryReleased(index.row(), buttonState(event->button()),
                                 shiftState(event->modifiers()));
    if (alive && mListener && index.isValid() && doubleClicked)
        mListener->entryDoubleClicked(index.row());
}

void ColumnListView::mouseDoubleClickEvent(QMouseEvent* event) {
    const QPointer<ColumnListView> alive = this;
    mousePressEvent(event);
    if (!alive) return;
    // Until the button comes up it may still become a drag.
    if (event->button() == Qt::LeftButton) mDoubleClicked = indexAt(event->position().toPoint());
}

void ColumnListView::keyPressEvent(QKeyEvent* event) {
    if (isMenuKey(*event)) return openMenu();
    if (mListener && event->key() == Qt::Key_Delete && modifiersOf(*event) == Qt::NoModifier)
        return mListener->deleteKey(currentIndex().row());
    if (mListener && isEnter(*event) && currentIndex().isValid())
        return mListener->entryDoubleClicked(currentIndex().row());
    const QPointer<ColumnListView> alive = this;
    const QItemSelection before = selectionModel()->selection();
    if (event->key() == Qt::Key_Space && currentIndex().isValid())
        // The base class goes on to search for a name that begins with a blank.
        selectionModel()->select(currentIndex(), selectionCommand(currentIndex(), event));
    else
        QListView::keyPressEvent(event);
    const int row = currentIndex().row();
    if (!mListener || row < 0 || selectionModel()->selection() == before) return;
    // To the control, selecting is what a press of the mouse has done.
    const std::int16_t left = buttonState(Qt::LeftButton);
    mListener->entryPressed(row, left, shiftState(event->modifiers()));
    if (alive && mListener) mListener->entryReleased(row, left, shiftState(event->modifiers()));
}

void ColumnListView::contextMenuEvent(QContextMenuEvent* event) {
    // The mouse opens the menu on release; the menu key has no release of its own.
    if (event->reason() == QContextMenuEvent::Keyboard) openMenu();
}

void ColumnListView::openMenu() {
    if (!mListener) return;
    const QModelIndex current = currentIndex();
    if (current.isValid()) scrollTo(current);
    const QRect place = current.isValid() ? visualRect(current) : viewport()->rect();
    mListener->menuKey(current.row(), viewport()->mapToGlobal(place.center()));
}

void ColumnListView::wheelEvent(QWheelEvent* event) {
    QListView::wheelEvent(event);
    // At its end the list stands still; the canvas below does not take over.
    event->accept();
}

bool ColumnListView::viewportEvent(QEvent* event) {
    if (event->type() != QEvent::ToolTip) return QListView::viewportEvent(event);
    const auto& help = *static_cast<QHelpEvent*>(event);
    const QModelIndex index = indexAt(help.pos());
    if (index.isValid())
        showElisionToolTip(
            help, *viewport(), index.data().toString(), font(),
            ColumnDelegate::textPlace(visualRect(index), fontMetrics(),
                                      index.data(ColumnListModel::outputRole).toBool()));
    return true;
}

} // namespace zandor::platform::qt
