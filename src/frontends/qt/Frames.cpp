#include "frontends/qt/Frames.h"

#include <QComboBox>
#include <QCoreApplication>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLineEdit>
#include <QPainter>

namespace zandor::platform::qt {

CanvasAdapter::CanvasAdapter(Canvas* widget, FocusTracker& focus, FrameEvents events)
    : Adapter(widget, focus) {
    widget->setEvents(std::move(events));
}

CanvasAdapter::~CanvasAdapter() {
    if (!mWidget) return;
    mWidget->setEvents({});
    mWidget->dragGone();
}

void CanvasAdapter::ZOrder() {
    // Alone in its window, the canvas stands as high as that does.
    if (mWidget) mWidget->parentWidget()->raise();
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

bool RowFrame::event(QEvent* event) {
    const bool key = event->type() == QEvent::KeyPress || event->type() == QEvent::ShortcutOverride;
    if (!key || static_cast<QKeyEvent*>(event)->key() != Qt::Key_Escape || !mOutermost)
        return QFrame::event(event);
    // From the button beside it, Escape is the input's as well.
    QWidget* input = findChild<QLineEdit*>();
    if (!input) input = findChild<QComboBox*>();
    if (!input) return QFrame::event(event);
    event->accept();
    if (event->type() == QEvent::KeyPress) {
        QKeyEvent escape(event->type(), Qt::Key_Escape, Qt::NoModifier);
        QCoreApplication::sendEvent(input, &escape);
    }
    return true;
}

void RowFrame::showEvent(QShowEvent* event) {
    QFrame::showEvent(event);
    if (!mTitle) return;
    const QString title = mTitle();
    setAccessibleName(title);
    for (auto* input : findChildren<QLineEdit*>()) input->setAccessibleName(title);
    for (auto* input : findChildren<QComboBox*>()) {
        input->setAccessibleName(title);
        // On some platforms the name of a list is what it has chosen.
        input->setAccessibleDescription(title);
    }
}

void RowFrame::paintEvent(QPaintEvent*) {
    if (!mOutermost) return;
    QPainter painter(this);
    painter.fillRect(rect(), palette().window()); // a style sheet leaves it to the widget
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

} // namespace zandor::platform::qt
