#include "platform/qt/Frames.h"

#include <QHBoxLayout>
#include <QPainter>

namespace platform::qt {

CanvasAdapter::CanvasAdapter(Canvas* widget, FocusTracker& focus, FrameEvents events)
    : Adapter(widget, focus) {
    widget->setEvents(std::move(events));
}

CanvasAdapter::~CanvasAdapter() {
    if (mWidget) mWidget->setEvents({});
}

void CanvasAdapter::ZOrder() {
    if (mWidget) mWidget->raise();
}

RowFrame::RowFrame(QWidget* parent, bool outermost) : QFrame(parent), mOutermost(outermost) {
    // Opaque, so that showing it never makes what lies below paint itself.
    setAutoFillBackground(true);
    auto* row = new QHBoxLayout(this);
    const int margin = outermost ? 2 : 5;
    row->setContentsMargins(margin, margin, margin, margin);
    row->setSpacing(5);
    if (outermost) hide();
}

void RowFrame::paintEvent(QPaintEvent*) {
    if (!mOutermost) return;
    QPainter painter(this);
    painter.setPen(QPen(palette().color(QPalette::Highlight), 1));
    painter.setRenderHint(QPainter::Antialiasing);
    painter.drawRect(QRectF(rect()).adjusted(0.5, 0.5, -0.5, -0.5));
}

Bounds RowFrameAdapter::bounds() const {
    Bounds result = Adapter::bounds();
    if (!mSized && mWidget) {
        const QSize wanted = mWidget->sizeHint();
        result.Width = toTwips(wanted.width());
        result.Height = toTwips(wanted.height());
    }
    return result;
}

void RowFrameAdapter::setBounds(const Bounds& wanted) {
    const Bounds now = bounds();
    mSized = mSized || wanted.Width != now.Width || wanted.Height != now.Height;
    Adapter::setBounds(wanted);
}

void RowFrameAdapter::place(QWidget* child, Role role) {
    if (!mWidget) return;
    auto* row = static_cast<QHBoxLayout*>(mWidget->layout());
    row->addWidget(child, role == Role::button ? 0 : 1);
}

void RowFrameAdapter::Visible(bool value) {
    if (value && mWidget && !laidOut()) mWidget->setGeometry(toPixels(bounds()));
    show(value);
}

void RowFrameAdapter::ZOrder() {
    if (mWidget) mWidget->raise();
}

} // namespace platform::qt
