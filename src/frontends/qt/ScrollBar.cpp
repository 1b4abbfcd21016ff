#include "frontends/qt/ScrollBar.h"

#include "frontends/qt/FocusFrame.h"

#include <Zandor/platform/RuntimeError.h>

#include <QApplication>
#include <QStyle>
#include <QWheelEvent>

#include <algorithm>

namespace zandor::platform::qt {

namespace {

/// One press on an arrow, one line of the wheel: twips.
constexpr int singleStep = 240;

void scrollBy(QScrollBar* bar, int twips) {
    if (bar && bar->isEnabled() && twips != 0) bar->setValue(bar->value() - twips);
}

} // namespace

CanvasScrollBar::CanvasScrollBar(Qt::Orientation orientation, QWidget* parent)
    : QScrollBar(orientation, parent) {
    // No stop of the Tab key: the canvas itself scrolls by keys, and the control may send the
    // focus on from a bar.
    setFocusPolicy(Qt::ClickFocus);
    setAutoFillBackground(true);
}

void CanvasScrollBar::paintEvent(QPaintEvent* event) {
    QScrollBar::paintEvent(event);
    if (!hasFocus()) return;
    QPainter painter(this);
    paintFocusFrame(painter, rect(), palette());
}

void CanvasScrollBar::focusInEvent(QFocusEvent* event) {
    QScrollBar::focusInEvent(event);
    update();
}

void CanvasScrollBar::focusOutEvent(QFocusEvent* event) {
    QScrollBar::focusOutEvent(event);
    update();
}

void CanvasScrollBar::sliderChange(SliderChange change) {
    mPicture.drop();
    QScrollBar::sliderChange(change);
}

ScrollBarAdapter::ScrollBarAdapter(QScrollBar* widget, FocusTracker& focus,
                                   const ScrollBarEvents& events)
    : Adapter(widget, focus) {
    widget->setRange(0, 0);
    widget->setSingleStep(singleStep);
    widget->resize(widget->sizeHint());
    QObject::connect(widget, &QScrollBar::valueChanged, widget, [change = events.Change] {
        if (change) change();
    });
    mFocus.watch(widget, events.GotFocus);
}

Bounds ScrollBarAdapter::bounds() const {
    Bounds result = Adapter::bounds();
    if (!mWidget) return result;
    const QSize wanted = mWidget->sizeHint();
    if (mWidget->orientation() == Qt::Horizontal)
        result.Height = toTwips(wanted.height());
    else
        result.Width = toTwips(wanted.width());
    return result;
}

std::int16_t ScrollBarAdapter::Max() const {
    return mWidget ? static_cast<std::int16_t>(mWidget->maximum()) : std::int16_t{0};
}

void ScrollBarAdapter::Max(std::int16_t value) {
    if (value < 0) throw errors::invalidPropertyValue();
    if (mWidget) mWidget->setMaximum(value);
}

std::int16_t ScrollBarAdapter::Value() const {
    return mWidget ? static_cast<std::int16_t>(mWidget->value()) : std::int16_t{0};
}

void ScrollBarAdapter::Value(std::int16_t value) {
    if (value < 0 || value > Max()) throw errors::invalidPropertyValue();
    if (mWidget) mWidget->setValue(value);
}

void ScrollBarAdapter::LargeChange(std::int16_t value) {
    if (value < 1) throw errors::invalidPropertyValue();
    if (mWidget) mWidget->setPageStep(value);
}

void scrollByWheel(QScrollBar* horizontal, QScrollBar* vertical, QWheelEvent& event) {
    event.accept();
    QPoint way;
    if (!event.pixelDelta().isNull())
        way = event.pixelDelta() * static_cast<int>(twipsPerPixel);
    else
        way = event.angleDelta() * (QApplication::wheelScrollLines() * singleStep) / 120;
    if (event.modifiers() & Qt::ShiftModifier && way.x() == 0) way = way.transposed();
    scrollBy(horizontal, way.x());
    scrollBy(vertical, way.y());
}

} // namespace zandor::platform::qt
