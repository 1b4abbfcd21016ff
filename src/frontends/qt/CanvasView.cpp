#include "frontends/qt/CanvasView.h"

#include "frontends/qt/Canvas.h"
#include "frontends/qt/CanvasWindow.h"
#include "frontends/qt/DragSession.h"
#include "frontends/qt/ScrollBar.h"

#include <Zandor/qt/Twips.h>

namespace zandor::platform::qt {

namespace {

void scroll(QScrollBar* bar, int pixels) {
    if (!bar || !bar->isEnabled() || pixels == 0) return;
    bar->setValue(bar->value() + pixels * static_cast<int>(twipsPerPixel));
}

/// How far a view has to go to show a stretch.
int wayTo(int begin, int end, int seenBegin, int seenEnd) {
    if (end > seenEnd && begin > seenBegin) return std::min(end - seenEnd, begin - seenBegin);
    return begin < seenBegin ? begin - seenBegin : 0;
}

} // namespace

void CanvasView::setCanvas(Canvas* canvas, CanvasWindow* window) {
    mCanvas = canvas;
    mWindow = window;
}

void CanvasView::setBar(QScrollBar* bar) {
    (bar->orientation() == Qt::Horizontal ? mAcross : mDown) = bar;
    if (mWindow) static_cast<CanvasWindow*>(mWindow.data())->endAt(*bar);
}

Canvas* CanvasView::canvas() const { return static_cast<Canvas*>(mCanvas.data()); }

bool CanvasView::carries(const QMimeData* data) const { return mDrags.accepts(data); }

QRect CanvasView::seen() const {
    if (!mCanvas || !mWindow) return {};
    const QRect window = static_cast<CanvasWindow*>(mWindow.data())->seen();
    return window.translated(-mCanvas->pos()) & mCanvas->rect();
}

void CanvasView::scrollBy(QPoint way) {
    scroll(mAcross, way.x());
    scroll(mDown, way.y());
}

void CanvasView::scrollByWheel(QWheelEvent& event) { qt::scrollByWheel(mAcross, mDown, event); }

void CanvasView::reveal(const QRect& place) {
    const QRect now = seen();
    scrollBy({wayTo(place.left(), place.right(), now.left(), now.right()),
              wayTo(place.top(), place.bottom(), now.top(), now.bottom())});
}

} // namespace zandor::platform::qt
