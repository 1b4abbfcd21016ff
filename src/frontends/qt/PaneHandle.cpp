#include "frontends/qt/PaneHandle.h"

#include "frontends/qt/FocusFrame.h"

#include <Zandor/qt/Text.h>

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>

namespace zandor::platform::qt {

PaneHandle::PaneHandle(QWidget* parent) : QWidget(parent) {
    setObjectName(QStringLiteral("paneHandle"));
    setFocusPolicy(Qt::ClickFocus);
    setCursor(Qt::SplitVCursor);
    setAttribute(Qt::WA_OpaquePaintEvent);
    setAttribute(Qt::WA_Hover);
    hide();
}

void PaneHandle::setWords(const Words& words) {
    setAccessibleName(toQt(words.Divider));
    setToolTip(toQt(words.MoveDivider));
}

void PaneHandle::moveBy(int down) {
    if (down != 0 && mMover) mMover(down);
}

bool PaneHandle::event(QEvent* event) {
    // To a shortcut of the host, an arrow here is the handle's.
    if (event->type() == QEvent::ShortcutOverride) {
        const auto& key = static_cast<QKeyEvent&>(*event);
        if (key.key() == Qt::Key_Up || key.key() == Qt::Key_Down) event->accept();
    }
    return QWidget::event(event);
}

void PaneHandle::mousePressEvent(QMouseEvent* event) {
    mGrabbedAt = event->position().toPoint().y();
}

void PaneHandle::mouseMoveEvent(QMouseEvent* event) {
    if (event->buttons() & Qt::LeftButton) moveBy(event->position().toPoint().y() - mGrabbedAt);
}

void PaneHandle::keyPressEvent(QKeyEvent* event) {
    constexpr int step = 16;
    switch (event->key()) {
    case Qt::Key_Up: return moveBy(-step);
    case Qt::Key_Down: return moveBy(step);
    default: QWidget::keyPressEvent(event);
    }
}

void PaneHandle::focusInEvent(QFocusEvent*) { update(); }

void PaneHandle::focusOutEvent(QFocusEvent*) { update(); }

void PaneHandle::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    const QColor text = palette().color(QPalette::WindowText);
    painter.fillRect(rect(), palette().window());
    QColor line = text;
    line.setAlphaF(0.25F);
    painter.fillRect(0, 0, width(), 1, line);
    QColor grip =
        underMouse() || hasFocus() ? palette().color(QPalette::Active, QPalette::Highlight) : text;
    if (!underMouse() && !hasFocus()) grip.setAlphaF(0.45F);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(grip);
    painter.drawRoundedRect(QRectF(width() / 2.0 - 18, 2.5, 36, 3), 1.5, 1.5);
    if (hasFocus()) paintFocusFrame(painter, rect(), palette());
}

} // namespace zandor::platform::qt
