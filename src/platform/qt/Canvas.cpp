#include "platform/qt/Canvas.h"

#include "platform/qt/CanvasItems.h"
#include "platform/qt/KeyCodes.h"
#include "platform/qt/Twips.h"

#include <QMouseEvent>
#include <QPaintEvent>
#include <QPainter>

#include <algorithm>

namespace platform::qt {

namespace {

void report(const MouseEvent& handler, const QMouseEvent& event) {
    if (handler)
        handler(buttonState(event.button()), shiftState(event.modifiers()),
                toTwips(event.position().x()), toTwips(event.position().y()));
}

} // namespace

Canvas::Canvas(QWidget* parent) : QWidget(parent) {
    // It fills every pixel itself, and what lies below is never asked to.
    setAttribute(Qt::WA_OpaquePaintEvent);
    setFocusPolicy(Qt::ClickFocus);
}

Canvas::~Canvas() {
    for (CanvasItem* item : mItems) item->detach();
}

void Canvas::add(CanvasItem& item) {
    const auto at = std::upper_bound(
        mItems.begin(), mItems.end(), item.layer(),
        [](int layer, const CanvasItem* other) { return layer < other->layer(); });
    mItems.insert(at, &item);
}

void Canvas::remove(CanvasItem& item) { std::erase(mItems, &item); }

void Canvas::paintEvent(QPaintEvent* event) {
    QPainter painter(this);
    for (const QRect& part : event->region()) painter.fillRect(part, palette().window());
    painter.setRenderHint(QPainter::Antialiasing);
    for (const CanvasItem* item : mItems)
        if (item->visible() && event->region().intersects(item->extent()))
            item->paint(painter, palette());
}

void Canvas::mousePressEvent(QMouseEvent* event) { report(mEvents.MouseDown, *event); }

void Canvas::mouseReleaseEvent(QMouseEvent* event) { report(mEvents.MouseUp, *event); }

// The second press of a double click is a press like any other.
void Canvas::mouseDoubleClickEvent(QMouseEvent* event) { mousePressEvent(event); }

} // namespace platform::qt
