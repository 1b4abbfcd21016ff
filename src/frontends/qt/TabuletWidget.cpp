#include "frontends/qt/TabuletWidget.h"

#include "frontends/qt/Canvas.h"
#include "frontends/qt/CanvasView.h"
#include "frontends/qt/ColumnListModel.h"
#include "frontends/qt/ElisionToolTip.h"
#include "frontends/qt/KeyCodes.h"
#include "frontends/qt/ShownText.h"
#include "frontends/qt/mixed.h"

#include <Zandor/qt/Text.h>

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

struct TitleColours {
    QColor back;
    QColor text;
    QColor frame;
};

TitleColours titleColours(const TabuletWidget& box) {
    const QPalette palette = box.palette();
    const QColor window = palette.color(QPalette::Window);
    const QColor windowText = palette.color(QPalette::WindowText);
    const QColor highlight = palette.color(QPalette::Active, QPalette::Highlight);
    const bool focused = box.list().hasFocus() && box.isActiveWindow();
    if (focused)
        return {highlight, palette.color(QPalette::Active, QPalette::HighlightedText), highlight};
    if (box.isCurrent())
        return {mixed(window, highlight, 0.3), windowText, mixed(window, highlight, 0.7)};
    return {mixed(window, windowText, 0.08), windowText, mixed(window, windowText, 0.35)};
}

/// The cross in the title bar.
class CloseButton : public QAbstractButton {
public:
    explicit CloseButton(TabuletWidget& box) : QAbstractButton(&box), mBox(box) {
        setFocusPolicy(Qt::NoFocus);
        setCursor(Qt::ArrowCursor);
        setAttribute(Qt::WA_Hover);
    }

protected:
    void paintEvent(QPaintEvent*) override {
        QPainter painter(this);
        painter.setRenderHint(QPainter::Antialiasing);
        const TitleColours colours = titleColours(mBox);
        if (underMouse()) {
            painter.setPen(Qt::NoPen);
            painter.setBrush(mixed(colours.back, colours.text, isDown() ? 0.35 : 0.2));
            painter.drawRoundedRect(rect(), 3, 3);
        }
        const QPointF middle = QRectF(rect()).center();
        const qreal arm = width() * 0.22;
        painter.setPen(QPen(colours.text, 1.3, Qt::SolidLine, Qt::RoundCap));
        painter.drawLine(middle + QPointF(-arm, -arm), middle + QPointF(arm, arm));
        painter.drawLine(middle + QPointF(-arm, arm), middle + QPointF(arm, -arm));
    }

private:
    TabuletWidget& mBox;
};

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
      mList(new ColumnListView(this)), mClose(new CloseButton(*this)),
      mScroller(Qt::Vertical, [this](QPoint direction) { scrollUnderDrag(direction); }),
      mPicture(*this) {
    // Opaque, so that moving the box moves its pixels instead of painting it anew.
    setAttribute(Qt::WA_OpaquePaintEvent);
    setMouseTracking(true);
    setAcceptDrops(true);
    setFocusProxy(mList);
    mList->setModel(mModel);
    mList->installEventFilter(this);
    mList->viewport()->installEventFilter(this);
    connect(mClose, &QAbstractButton::clicked, this, [this] {
        if (mListener) mListener->closeClicked();
    });
    const auto otherwise = [this] { mPicture.drop(); };
    connect(mModel, &QAbstractItemModel::dataChanged, this, otherwise);
    connect(mModel, &QAbstractItemModel::rowsInserted, this, otherwise);
    connect(mModel, &QAbstractItemModel::modelReset, this, otherwise);
    connect(mList->selectionModel(), &QItemSelectionModel::selectionChanged, this, otherwise);
    connect(mList->selectionModel(), &QItemSelectionModel::currentChanged, this, otherwise);
    connect(mList->verticalScrollBar(), &QScrollBar::valueChanged, this, otherwise);
    connect(mList->verticalScrollBar(), &QScrollBar::rangeChanged, this, otherwise);
    measure();
}

void TabuletWidget::paintAnew() {
    mPicture.drop();
    update();
}

void TabuletWidget::setListener(TabuletListener* listener) {
    mListener = listener;
    mList->setListener(listener);
}

void TabuletWidget::setWords(const Words& words) {
    mClose->setToolTip(toQt(words.RemoveTable));
    mClose->setAccessibleName(mClose->toolTip());
    mModel->setWords(words);
}

void TabuletWidget::setTitle(const QString& title) {
    mTitle = asSigns(title);
    setAccessibleName(mTitle);
    mList->setAccessibleName(mTitle);
    paintAnew();
}

void TabuletWidget::setNote(const QString& note) {
    if (mNote == note) return;
    mNote = note;
    setAccessibleDescription(asSigns(note));
    mList->setAccessibleDescription(asSigns(note));
    paintAnew();
}

void TabuletWidget::setLocked(bool locked) {
    mLocked = locked;
    mClose->setVisible(!locked);
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
    return {mTitleHeight * 3, mTitleHeight + mList->rowHeight() + border};
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

void TabuletWidget::measure() {
    mTitleHeight = fontMetrics().height() + 10;
    arrange();
}

void TabuletWidget::arrange() {
    const int side = mTitleHeight - 8;
    mClose->setGeometry(width() - side - border, 4, side, side);
    mList->setGeometry(
        QRect(border, mTitleHeight, width() - 2 * border, height() - mTitleHeight - border));
}

void TabuletWidget::resizeEvent(QResizeEvent*) { arrange(); }

void TabuletWidget::changeEvent(QEvent* event) {
    QWidget::changeEvent(event);
    if (event->type() == QEvent::FontChange || event->type() == QEvent::StyleChange) measure();
    if (event->type() == QEvent::ActivationChange) update();
}

void TabuletWidget::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    const TitleColours colours = titleColours(*this);
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
}

bool TabuletWidget::event(QEvent* event) {
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
    if (isLocked()) return mList->setFocus(Qt::MouseFocusReason);
    mPressedAt = event->globalPosition();
    beginGesture(edgesAt(event->position().toPoint()));
    mList->setFocus(Qt::MouseFocusReason);
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
    const bool scrolls = mList->verticalScrollBar()->maximum() > 0;
    if (scrolls && mScroller.hover(mDraggedAt.toPoint(), mList->geometry()))
        mCanvas.dragGone();
    else
        mCanvas.dragHovers(mapToParent(mDraggedAt.toPoint()));
}

void TabuletWidget::scrollUnderDrag(QPoint direction) {
    QScrollBar& bar = *mList->verticalScrollBar();
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
