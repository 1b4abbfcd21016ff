#include "frontends/qt/TabuletWidget.h"

#include "frontends/qt/Canvas.h"
#include "frontends/qt/CanvasView.h"
#include "frontends/qt/ColumnDelegate.h"
#include "frontends/qt/ColumnListModel.h"
#include "frontends/qt/ElisionToolTip.h"
#include "frontends/qt/KeyCodes.h"
#include "frontends/qt/ListAtRest.h"
#include "frontends/qt/ShownText.h"
#include "frontends/qt/TitleCross.h"
#include "frontends/qt/mixed.h"

#include <Zandor/qt/Text.h>

#include <QCoreApplication>
#include <QDropEvent>
#include <QHelpEvent>
#include <QPainter>
#include <QPointer>
#include <QScrollBar>
#include <QToolTip>

#include <cmath>
#include <utility>

namespace zandor::platform::qt {

namespace {

constexpr int border = 4;       ///< resizes the box; its outermost pixel is the frame line
constexpr int keyStep = 10;     ///< 150 twips
constexpr int cornerReach = 14; ///< how far a corner reaches along its edges

/// A triangle with a mark in it, on whatever colour.
void paintWarning(QPainter& painter, const QRectF& place) {
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    const QColor amber(0xf5, 0xb8, 0x1c);
    const QColor dark(0x3c, 0x2f, 0x08);
    painter.setPen(QPen(dark, 1, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter.setBrush(amber);
    painter.drawPolygon(QPolygonF{{place.center().x(), place.top()},
                                  {place.right(), place.bottom()},
                                  {place.left(), place.bottom()}});
    const QPointF middle(place.center().x(), place.top());
    const qreal high = place.height();
    painter.setPen(QPen(dark, high / 8, Qt::SolidLine, Qt::RoundCap));
    painter.drawLine(middle + QPointF(0, high * 0.38), middle + QPointF(0, high * 0.62));
    painter.drawPoint(middle + QPointF(0, high * 0.82));
    painter.restore();
}

Qt::CursorShape cursorFor(Qt::Edges edges) {
    const bool sideways = edges & (Qt::LeftEdge | Qt::RightEdge);
    const bool upright = edges & (Qt::TopEdge | Qt::BottomEdge);
    if (sideways && upright)
        return edges == (Qt::LeftEdge | Qt::TopEdge) || edges == (Qt::RightEdge | Qt::BottomEdge)
                   ? Qt::SizeFDiagCursor
                   : Qt::SizeBDiagCursor;
    return sideways ? Qt::SizeHorCursor : upright ? Qt::SizeVerCursor : Qt::ArrowCursor;
}

} // namespace

TabuletWidget::TabuletWidget(int slot, Canvas& canvas)
    : QWidget(&canvas), mCanvas(canvas), mSlot(slot), mModel(new ColumnListModel(this)),
      mScroller(Qt::Vertical, [this](QPoint direction) { scrollUnderDrag(direction); }),
      mPicture(*this) {
    // Opaque, so that moving the box moves its pixels instead of painting it anew.
    setAttribute(Qt::WA_OpaquePaintEvent);
    setMouseTracking(true);
    setAcceptDrops(true);
    const auto otherwise = [this] { mList ? mPicture.drop() : paintAnew(); };
    connect(mModel, &QAbstractItemModel::dataChanged, this, otherwise);
    connect(mModel, &QAbstractItemModel::rowsInserted, this, otherwise);
    connect(mModel, &QAbstractItemModel::modelReset, this, otherwise);
    measure();
}

void TabuletWidget::makeParts() {
    const int rowBefore = rowHeight();
    const int firstBefore = firstEntry();
    mList = new ColumnListView(this);
    mList->setModel(mModel);
    mList->setListener(mListener);
    mList->setAccessibleName(accessibleName());
    mList->setAccessibleDescription(accessibleDescription());
    mList->installEventFilter(this);
    mList->viewport()->installEventFilter(this);
    const auto otherwise = [this] { mPicture.drop(); };
    connect(mList->selectionModel(), &QItemSelectionModel::selectionChanged, this, otherwise);
    connect(mList->selectionModel(), &QItemSelectionModel::currentChanged, this, otherwise);
    connect(mList->verticalScrollBar(), &QScrollBar::valueChanged, this, otherwise);
    connect(mList->verticalScrollBar(), &QScrollBar::rangeChanged, this, otherwise);

    mClose = new TitleCross(*this);
    mClose->setToolTip(mRemoveWord);
    mClose->setAccessibleName(mRemoveWord);
    connect(mClose, &QAbstractButton::clicked, this, [this] {
        if (mListener) mListener->closeClicked();
    });

    mPicture.watch(*mList);
    arrange();
    mList->show();
    mClose->setVisible(!mLocked);
    setFocusProxy(mList);
    mList->doItemsLayout(); // whoever has it made wants to scroll it, or to know where entries are
    if (mListener) mListener->listMade(*mList);
    if (rowHeight() != rowBefore || firstEntry() != firstBefore) tellOfMovedEntries();
}

/// A list that looks otherwise than the box takes it for has to be there to be seen.
void TabuletWidget::makePartsIfNeeded() {
    if (!mList && !canStandForList(*this, listPlace())) makeParts();
}

ColumnListView& TabuletWidget::list() const {
    // It looks as what the box has shown of it.
    if (!mList) const_cast<TabuletWidget*>(this)->makeParts();
    return *mList;
}

QAbstractButton& TabuletWidget::closeButton() const {
    list();
    return *mClose;
}

int TabuletWidget::rowHeight() const {
    return mList ? mList->rowHeight() : ColumnDelegate::rowHeight(fontMetrics());
}

int TabuletWidget::firstEntry() const { return mTitleHeight + (mList ? mList->firstEntry() : 0); }

void TabuletWidget::layOut() {
    makePartsIfNeeded();
    if (mList) mList->doItemsLayout();
    update();
}

/// Joins end at entries.
void TabuletWidget::tellOfMovedEntries() {
    QMetaObject::invokeMethod(
        this,
        [this] {
            if (mListener) mListener->listScrolled();
        },
        Qt::QueuedConnection);
}

TitleColours TabuletWidget::titleColours() const {
    const QColor window = palette().color(QPalette::Window);
    const QColor windowText = palette().color(QPalette::WindowText);
    const QColor highlight = palette().color(QPalette::Active, QPalette::Highlight);
    const bool focused = mList && mList->hasFocus() && isActiveWindow();
    if (focused)
        return {highlight, palette().color(QPalette::Active, QPalette::HighlightedText), highlight};
    if (isCurrent())
        return {mixed(window, highlight, 0.3), windowText, mixed(window, highlight, 0.7)};
    return {mixed(window, windowText, 0.08), windowText, mixed(window, windowText, 0.35)};
}

void TabuletWidget::paintAnew() {
    mPicture.drop();
    update();
}

void TabuletWidget::setListener(TabuletListener* listener) {
    mListener = listener;
    if (!mList) return;
    mList->setListener(listener);
    if (listener) listener->listMade(*mList);
}

void TabuletWidget::setWords(const Words& words) {
    mModel->setWords(words);
    mRemoveWord = toQt(words.RemoveTable);
    if (!mClose) return;
    mClose->setToolTip(mRemoveWord);
    mClose->setAccessibleName(mRemoveWord);
}

void TabuletWidget::setTitle(const QString& title) {
    mTitle = asSigns(title);
    setAccessibleName(mTitle);
    if (mList) mList->setAccessibleName(mTitle);
    paintAnew();
}

void TabuletWidget::setNote(const QString& note) {
    if (mNote == note) return;
    mNote = note;
    setAccessibleDescription(asSigns(note));
    if (mList) mList->setAccessibleDescription(asSigns(note));
    paintAnew();
}

void TabuletWidget::setLocked(bool locked) {
    mLocked = locked;
    if (mClose) mClose->setVisible(!locked);
    unsetCursor();
    paintAnew();
    if (locked && stopGesture() && mListener) mListener->gestureTakenBack();
}

void TabuletWidget::setCurrent(bool current) {
    if (mCurrent == current) return;
    mCurrent = current;
    paintAnew();
}

QSize TabuletWidget::smallest() const {
    return {mTitleHeight * 3, mTitleHeight + rowHeight() + border};
}

QRect TabuletWidget::titlePlace() const {
    const int sign = mNote.isEmpty() ? 0 : mTitleHeight - 4;
    const int cross = isLocked() ? border : mTitleHeight;
    return titleBar().adjusted(border + 4 + sign, 0, -cross, 0);
}

QFont TabuletWidget::titleFont() const {
    QFont bold = font();
    bold.setWeight(QFont::DemiBold);
    bold.setStrikeOut(!mNote.isEmpty());
    return bold;
}

QRect TabuletWidget::titleBar() const { return {0, 0, width(), mTitleHeight}; }

QRect TabuletWidget::crossPlace() const {
    const int side = mTitleHeight - 8;
    return {width() - side - border, 4, side, side};
}

QRect TabuletWidget::listPlace() const {
    return rect().adjusted(border, mTitleHeight, -border, -border);
}

void TabuletWidget::measure() {
    const int before = std::exchange(mTitleHeight, fontMetrics().height() + 10);
    arrange();
    // A list tells it itself.
    if (!mList && before != 0 && before != mTitleHeight) tellOfMovedEntries();
}

void TabuletWidget::arrange() {
    if (!mList) return;
    mClose->setGeometry(crossPlace());
    mList->setGeometry(listPlace());
}

/// For whoever gives it to the box: the keys are the list's.
void TabuletWidget::focusInEvent(QFocusEvent* event) { list().setFocus(event->reason()); }

void TabuletWidget::resizeEvent(QResizeEvent*) {
    makePartsIfNeeded();
    arrange();
}

void TabuletWidget::changeEvent(QEvent* event) {
    QWidget::changeEvent(event);
    switch (event->type()) {
    case QEvent::FontChange:
    case QEvent::StyleChange: measure(); [[fallthrough]];
    case QEvent::PaletteChange:
    case QEvent::LayoutDirectionChange:
        // Not while the host's style sheet goes from widget to widget.
        QMetaObject::invokeMethod(this, &TabuletWidget::makePartsIfNeeded, Qt::QueuedConnection);
        break;
    case QEvent::ActivationChange: update(); break;
    default: break;
    }
}

void TabuletWidget::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    const TitleColours colours = titleColours();
    painter.fillRect(rect(), palette().base());
    painter.fillRect(titleBar(), colours.back);

    const QFont bold = titleFont();
    painter.setFont(bold);
    painter.setPen(colours.text);
    const QRect place = titlePlace();
    painter.setLayoutDirection(asItReads);
    painter.drawText(place, static_cast<int>(atTheLeft) | Qt::TextSingleLine,
                     QFontMetrics(bold).elidedText(mTitle, Qt::ElideRight, place.width()));
    if (!mNote.isEmpty())
        paintWarning(painter, QRect(border + 4, 5, mTitleHeight - 10, mTitleHeight - 10));

    painter.setPen(colours.frame);
    painter.drawRect(rect().adjusted(0, 0, -1, -1));
    if (mList) return;
    if (!mLocked) paintCross(painter, crossPlace(), colours.text);
    paintListAtRest(painter, *this, listPlace(), *mModel);
}

bool TabuletWidget::event(QEvent* event) {
    if (handOn(*event)) return true;
    if (event->type() == QEvent::ToolTip) {
        const auto& help = *static_cast<QHelpEvent*>(event);
        if (titleBar().contains(help.pos()) && !mNote.isEmpty())
            QToolTip::showText(help.globalPos(), asToolTip(mNote), this, titleBar());
        else if (titleBar().contains(help.pos()))
            showElisionToolTip(help, *this, mTitle, titleFont(), titlePlace());
        return true;
    }
    return QWidget::event(event);
}

/// What brings the mouse to a box without parts is for the one that is made there, and with a
/// press all until the button comes up.
bool TabuletWidget::handOn(QEvent& event) {
    switch (event.type()) {
    case QEvent::MouseMove:
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseButtonRelease:
    case QEvent::Wheel: break;
    default: return false;
    }
    const auto& at = static_cast<const QSinglePointEvent&>(event);
    if (!mList) {
        makeParts();
        mHandedTo = childAt(at.position().toPoint());
        // Qt has looked for whom to give the focus to before.
        if (mHandedTo && mHandedTo != mClose && at.button() != Qt::NoButton)
            mList->setFocus(Qt::MouseFocusReason);
    }
    // What the part does not take comes back here, and is the box's own then.
    const QPointer<QWidget> part = std::exchange(mHandedTo, nullptr);
    if (!part) return false;
    const QPointer<TabuletWidget> alive = this;
    const QPointF inside = part->mapFrom(this, at.position());
    if (event.type() == QEvent::Wheel) {
        const auto& turn = static_cast<const QWheelEvent&>(event);
        QWheelEvent own(inside, turn.globalPosition(), turn.pixelDelta(), turn.angleDelta(),
                        turn.buttons(), turn.modifiers(), turn.phase(), turn.inverted(),
                        turn.source(), turn.pointingDevice());
        QCoreApplication::sendEvent(part, &own);
    } else {
        QMouseEvent own(event.type(), inside, at.scenePosition(), at.globalPosition(), at.button(),
                        at.buttons(), at.modifiers(), at.pointingDevice());
        QCoreApplication::sendEvent(part, &own);
    }
    if (alive && at.buttons() != Qt::NoButton) mHandedTo = part;
    event.accept();
    return true;
}

bool TabuletWidget::eventFilter(QObject* watched, QEvent* event) {
    switch (event->type()) {
    case QEvent::FocusIn:
    case QEvent::FocusOut:
        update();
        mClose->update();
        break;
    case QEvent::MouseButtonPress: raise(); break;
    case QEvent::KeyPress: return moveOrResize(*static_cast<QKeyEvent*>(event));
    default: break;
    }
    return QWidget::eventFilter(watched, event);
}

/// Alt and an arrow move the box as its title does, with Shift they resize it as its lower right
/// corner does; Control stands for Alt there. Control alone is the list's.
bool TabuletWidget::moveOrResize(const QKeyEvent& event) {
    const Qt::KeyboardModifiers held = modifiersOf(event);
    const QPoint arrow = arrowOf(event);
    const bool resize = held == (Qt::AltModifier | Qt::ShiftModifier) ||
                        held == (Qt::ControlModifier | Qt::ShiftModifier);
    if (arrow.isNull() || !mListener || isLocked() || !(resize || held == Qt::AltModifier))
        return false;
    Qt::Edges edges;
    if (resize) edges = arrow.x() != 0 ? Qt::RightEdge : Qt::BottomEdge;
    const QPointer<TabuletWidget> alive = this;
    beginGesture(edges);
    mMoved = true;
    mListener->gestureMoved(edges, arrow * keyStep);
    if (alive) endGesture();
    if (alive) mCanvas.view().reveal(geometry());
    return true;
}

Qt::Edges TabuletWidget::edgesAt(QPoint at) const {
    Qt::Edges edges;
    if (at.x() < border) edges |= Qt::LeftEdge;
    if (at.x() >= width() - border) edges |= Qt::RightEdge;
    if (at.y() < border) edges |= Qt::TopEdge;
    if (at.y() >= height() - border) edges |= Qt::BottomEdge;
    // Near a corner an edge takes its neighbour along.
    if (edges & (Qt::TopEdge | Qt::BottomEdge)) {
        if (at.x() < cornerReach) edges |= Qt::LeftEdge;
        if (at.x() >= width() - cornerReach) edges |= Qt::RightEdge;
    } else if (edges) {
        if (at.y() < cornerReach) edges |= Qt::TopEdge;
        if (at.y() >= height() - cornerReach) edges |= Qt::BottomEdge;
    }
    return edges;
}

void TabuletWidget::mousePressEvent(QMouseEvent* event) {
    raise();
    if (event->button() != Qt::LeftButton) return;
    if (isLocked()) return list().setFocus(Qt::MouseFocusReason);
    mPressedAt = event->globalPosition();
    beginGesture(edgesAt(event->position().toPoint()));
    list().setFocus(Qt::MouseFocusReason);
}

void TabuletWidget::mouseMoveEvent(QMouseEvent* event) {
    // The release may have gone to a message box that came up in between.
    if (!(event->buttons() & Qt::LeftButton)) endGesture();
    if (mGesture == Gesture::none) {
        if (!isLocked()) setCursor(cursorFor(edgesAt(event->position().toPoint())));
        return;
    }
    const QPointF way = event->globalPosition() - mPressedAt;
    if (!mMoved && way.isNull()) return;
    mMoved = true;
    if (mListener) mListener->gestureMoved(mEdges, way);
}

void TabuletWidget::mouseReleaseEvent(QMouseEvent* event) {
    if (event->button() == Qt::LeftButton) endGesture();
    const bool onTitle = titleBar().contains(event->position().toPoint());
    if (event->button() == Qt::RightButton && onTitle && mListener) mListener->titleClicked();
}

void TabuletWidget::beginGesture(Qt::Edges edges) {
    mEdges = edges;
    mGesture = edges ? Gesture::resize : Gesture::move;
    mMoved = false;
    if (mListener) mListener->gestureBegan();
}

bool TabuletWidget::stopGesture() {
    const bool going = std::exchange(mGesture, Gesture::none) != Gesture::none;
    return std::exchange(mMoved, false) && going;
}

void TabuletWidget::endGesture() {
    if (stopGesture() && mListener) mListener->gestureEnded(mEdges);
}

// The canvas below does not scroll while the mouse is over a table.
void TabuletWidget::wheelEvent(QWheelEvent* event) { event->accept(); }

void TabuletWidget::dragEnterEvent(QDragEnterEvent* event) {
    mDraggedAt = event->position();
    event->setAccepted(mListener && mListener->draggedOver(event->mimeData(), mDraggedAt, 0));
}

void TabuletWidget::dragMoveEvent(QDragMoveEvent* event) {
    mDraggedAt = event->position();
    event->setAccepted(mListener && mListener->draggedOver(event->mimeData(), mDraggedAt, 2));
    if (!event->isAccepted()) return;
    // The list first: below its edge the canvas would run away.
    const bool scrolls = list().verticalScrollBar()->maximum() > 0;
    if (scrolls && mScroller.hover(mDraggedAt.toPoint(), listPlace()))
        mCanvas.dragGone();
    else
        mCanvas.dragHovers(mapToParent(mDraggedAt.toPoint()));
}

void TabuletWidget::scrollUnderDrag(QPoint direction) {
    QScrollBar& bar = *list().verticalScrollBar();
    const int before = bar.value();
    bar.setValue(before + direction.y() * bar.singleStep() / 2);
    if (bar.value() != before && mListener) mListener->draggedOver(nullptr, mDraggedAt, 2);
}

void TabuletWidget::dragLeaveEvent(QDragLeaveEvent*) {
    mScroller.stop();
    mCanvas.dragGone();
    if (mListener) mListener->draggedOver(nullptr, mDraggedAt, 1);
}

void TabuletWidget::dropEvent(QDropEvent* event) {
    mScroller.stop();
    mCanvas.dragGone();
    event->setAccepted(mListener && mListener->dropped(event->mimeData(), event->position()));
}

} // namespace zandor::platform::qt
