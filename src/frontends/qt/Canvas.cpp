#include "frontends/qt/Canvas.h"

#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/CanvasView.h"
#include "frontends/qt/FocusFrame.h"
#include "frontends/qt/KeyCodes.h"
#include "frontends/qt/KeyboardMenu.h"
#include "frontends/qt/OwnPixels.h"
#include "frontends/qt/ShownText.h"
#include "frontends/qt/TabuletWidget.h"

#include <Zandor/qt/Text.h>
#include <Zandor/qt/Twips.h>

#include <QAccessible>
#include <QHelpEvent>
#include <QMouseEvent>
#include <QPaintEvent>
#include <QPainter>
#include <QToolTip>

#include <algorithm>

namespace zandor::platform::qt {

namespace {

void report(const MouseEvent& handler, const QMouseEvent& event) {
    if (handler)
        handler(buttonState(event.button()), shiftState(event.modifiers()),
                toTwips(event.position().x()), toTwips(event.position().y()));
}

} // namespace

Canvas::Canvas(CanvasView& view, QWidget* parent)
    : QWidget(parent), mView(view),
      mScroller(Qt::Horizontal | Qt::Vertical,
                [this](QPoint direction) { mView.scrollByStep(direction); }) {
    // It fills every pixel itself, and what lies below is never asked to.
    setAttribute(Qt::WA_OpaquePaintEvent);
    setFocusPolicy(Qt::ClickFocus);
    setAcceptDrops(true);
}

Canvas::~Canvas() {
    for (CanvasItem* item : mItems) item->detach();
}

void Canvas::add(CanvasItem& item) {
    const auto at =
        std::upper_bound(mItems.begin(), mItems.end(), item.layer(),
                         [](int layer, const CanvasItem* other) { return layer < other->layer(); });
    mItems.insert(at, &item);
}

void Canvas::remove(CanvasItem& item) {
    std::erase(mItems, &item);
    std::erase(mChanged, &item);
    if (mCurrent != &item) return;
    // The keys go on with the next line, so that several can be deleted in a row.
    const auto rest = lines();
    const int gone = mCurrent->index();
    const auto next = std::find_if(rest.begin(), rest.end(),
                                   [gone](const auto* line) { return line->index() > gone; });
    mCurrent = nullptr;
    makeCurrent(next != rest.end() ? *next : rest.empty() ? nullptr : rest.back());
}

std::vector<TabuletWidget*> Canvas::tables() const {
    std::vector<TabuletWidget*> shown;
    for (auto* box : findChildren<TabuletWidget*>(QString(), Qt::FindDirectChildrenOnly))
        if (!box->isHidden()) shown.push_back(box);
    std::sort(shown.begin(), shown.end(),
              [](const auto* one, const auto* other) { return one->slot() < other->slot(); });
    return shown;
}

std::vector<CanvasLine*> Canvas::lines() const {
    std::vector<CanvasLine*> shown;
    for (CanvasItem* item : mItems)
        if (auto* line = dynamic_cast<CanvasLine*>(item); line && line->visible())
            shown.push_back(line);
    std::sort(shown.begin(), shown.end(),
              [](const auto* one, const auto* other) { return one->index() < other->index(); });
    return shown;
}

void Canvas::focusOn(CanvasLine* line, Qt::FocusReason reason) {
    mCurrent = line;
    setFocus(reason);
    mFocusShown = true;
    showFocus();
    announceFocus();
    if (line) mView.reveal(line->extent().boundingRect());
}

void Canvas::makeCurrent(CanvasLine* line) {
    if (mCurrent == line) return;
    mCurrent = line;
    showFocus();
    announceFocus();
}

void Canvas::showFocus() {
    const bool shown = mFocusShown && hasFocus();
    CanvasLine* const focused = shown ? mCurrent : nullptr;
    for (CanvasItem* item : mItems)
        item->setFocused(focused && (item == focused || item->touches(*focused)));
    // The frame around the canvas goes along with whatever part is seen.
    if (!mCurrent || !shown) update();
}

void Canvas::announceFocus() {
    if (!hasFocus() || !mCurrent || !QAccessible::isActive()) return;
    QAccessibleEvent event(mCurrent->accessible(), QAccessible::Focus);
    QAccessible::updateAccessibility(&event);
}

void Canvas::changes(CanvasItem& item) {
    if (mChanged.empty())
        QMetaObject::invokeMethod(this, &Canvas::showChanges, Qt::QueuedConnection);
    mChanged.push_back(&item);
    if (!item.visible()) return;
    mLeft += item.extent();
    if (item.rests()) mBackdrop.forget(item.extent());
}

/// Has the canvas painted where items have changed, but for what tables cover: those would be
/// painted, too.
void Canvas::showChanges() {
    QRegion stale = std::exchange(mLeft, {});
    for (CanvasItem* item : std::exchange(mChanged, {})) {
        item->taken();
        if (item->visible()) stale += item->extent();
    }
    if (stale.isEmpty()) return;
    for (const QObject* child : children())
        if (const auto* box = qobject_cast<const TabuletWidget*>(child); box && !box->isHidden())
            stale -= box->geometry();
    update(stale);
}

void Canvas::settle() {
    for (CanvasItem* item : mItems)
        if (item->settle()) mBackdrop.forget(item->extent());
}

void Canvas::paintEvent(QPaintEvent* event) {
    showChanges();
    const QRegion& region = event->region();
    const QRect seen = mView.seen();
    for (QObject* child : children())
        if (auto* const box = qobject_cast<TabuletWidget*>(child))
            if (!seen.intersects(box->geometry())) box->picture().drop();
    QPainter painter(this);
    // A picture of the whole canvas is seldom asked for, and needs none of what would be kept.
    const bool kept = paintsOwnPixels(painter, *this) && Backdrop::worksAt(devicePixelRatioF()) &&
                      seen.contains(region.boundingRect());
    if (kept) {
        settle();
        mBackdrop.setLook(palette(), devicePixelRatioF());
        mBackdrop.keepAround(seen);
        mBackdrop.paint(painter, region, mItems);
    } else {
        for (const QRect& part : region) painter.fillRect(part, palette().window());
    }
    const auto shown = [&](const CanvasItem* item) {
        return item->visible() && region.intersects(item->extent());
    };
    for (const CanvasItem* item : mItems)
        if (item->isGround() && !(kept && item->rests()) && shown(item))
            item->paint(painter, palette());
    for (const CanvasItem* item : mItems)
        if (!item->isGround() && shown(item)) item->paint(painter, palette());
    for (const CanvasItem* item : mItems)
        if (item->reachesAbove() && shown(item)) item->paintAbove(painter, palette());
    if (frameShown()) paintFocusFrame(painter, seen, palette());
}

void Canvas::moveEvent(QMoveEvent* event) {
    if (!frameShown()) return;
    // The frame stays at the edges of what is seen; where it was, it has moved with the pixels.
    const QRect seen = mView.seen();
    const QRect before = seen.translated(event->pos() - event->oldPos());
    for (const QRect& place : {seen, before})
        update(QRegion(place) - place.adjusted(focusFrameWidth, focusFrameWidth, -focusFrameWidth,
                                               -focusFrameWidth));
}

void Canvas::focusInEvent(QFocusEvent* event) {
    if (event->reason() == Qt::MouseFocusReason) mFocusShown = false;
    showFocus();
}

void Canvas::focusOutEvent(QFocusEvent*) { showFocus(); }

void Canvas::keyPressEvent(QKeyEvent* event) {
    const bool enter = event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter;
    if (isMenuKey(*event))
        openMenu();
    else if (mCurrent && enter)
        openCurrentLine();
    else if (mCurrent && event->key() == Qt::Key_Delete)
        mView.menu().choose(menuentry::deleteJoin, [this] { clickWithRightButton(); });
    else
        QWidget::keyPressEvent(event);
}

void Canvas::contextMenuEvent(QContextMenuEvent* event) {
    // The mouse opens the menu on release; the menu key has no release of its own.
    if (event->reason() == QContextMenuEvent::Keyboard) openMenu();
}

void Canvas::openCurrentLine() {
    if (mCurrent) mView.menu().choose(menuentry::showJoin, [this] { clickWithRightButton(); });
}

void Canvas::openMenu() {
    const QPoint at = mCurrent ? (placeForKeys() / twipsPerPixel).toPoint() : mView.seen().center();
    mView.menu().openAt(mapToGlobal(at), [this] { clickWithRightButton(); });
}

/// In twips: the middle of the current line, or where another line runs across it a place beside.
QPointF Canvas::placeForKeys() const {
    constexpr qreal nowhere = -1E6; // no line runs there
    if (!mCurrent) return {nowhere, nowhere};
    constexpr qreal clear = 60;
    const auto shown = lines();
    for (const qreal share : {0.5, 0.25, 0.75, 0.375, 0.625}) {
        const QPointF at = mCurrent->at(share);
        if (std::none_of(shown.begin(), shown.end(), [&](const CanvasLine* other) {
                return other != mCurrent && other->distanceTo(at) < clear;
            }))
            return at;
    }
    return mCurrent->at(0.5);
}

void Canvas::clickWithRightButton() {
    const QPointer<Canvas> alive = this;
    const QPointF at = placeForKeys();
    const auto x = static_cast<float>(at.x());
    const auto y = static_cast<float>(at.y());
    if (mEvents.MouseDown) mEvents.MouseDown(rightButton, 0, x, y);
    if (alive && mEvents.MouseUp) mEvents.MouseUp(rightButton, 0, x, y);
}

void Canvas::mousePressEvent(QMouseEvent* event) {
    const QPointer<Canvas> alive = this;
    report(mEvents.MouseDown, *event);
    if (!alive) return;
    // The line that the control has highlighted is the one that keys then work on.
    const auto shown = lines();
    const auto hit = std::find_if(shown.begin(), shown.end(),
                                  [](const auto* line) { return line->borderWidth() > 1; });
    mFocusShown = false;
    makeCurrent(hit == shown.end() ? nullptr : *hit);
}

void Canvas::mouseReleaseEvent(QMouseEvent* event) { report(mEvents.MouseUp, *event); }

// The second press of a double click is a press like any other, and with a comfort more than that.
void Canvas::mouseDoubleClickEvent(QMouseEvent* event) {
    const QPointer<Canvas> alive = this;
    mousePressEvent(event);
    if (!alive || !mCurrent || event->button() != Qt::LeftButton || !mView.readsJoins()) return;
    // The dialog must not come up while the press is being dealt with.
    QMetaObject::invokeMethod(this, &Canvas::openCurrentLine, Qt::QueuedConnection);
}

bool Canvas::event(QEvent* event) {
    if (event->type() != QEvent::ToolTip) return QWidget::event(event);
    const auto& help = static_cast<QHelpEvent&>(*event);
    const QString text = sentenceAt(help.pos());
    if (text.isEmpty())
        QToolTip::hideText();
    else
        QToolTip::showText(help.globalPos(), text, this);
    return true;
}

QString Canvas::sentenceAt(QPoint at) const {
    constexpr double reach = 90; // twips
    const CanvasLine* nearest = nullptr;
    double best = reach;
    for (const CanvasLine* line : lines()) {
        const double distance = line->distanceTo(QPointF(at) * twipsPerPixel);
        if (distance >= best) continue;
        best = distance;
        nearest = line;
    }
    return nearest ? asToolTip(asSigns(toQt(nearest->notes().Sentence))) : QString();
}

void Canvas::changeEvent(QEvent* event) {
    QWidget::changeEvent(event);
    if (event->type() != QEvent::FontChange) return;
    for (CanvasItem* item : mItems) item->fontChanged();
}

void Canvas::dragEnterEvent(QDragEnterEvent* event) {
    event->setAccepted(mView.carries(event->mimeData()));
}

void Canvas::dragMoveEvent(QDragMoveEvent* event) {
    // Nothing can be dropped between the tables; the drag only scrolls the canvas.
    event->ignore();
    dragHovers(event->position().toPoint());
}

void Canvas::dragLeaveEvent(QDragLeaveEvent*) { dragGone(); }

void Canvas::dragHovers(QPoint at) { mScroller.hover(at, mView.seen()); }

} // namespace zandor::platform::qt
