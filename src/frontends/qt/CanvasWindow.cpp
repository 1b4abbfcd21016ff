#include "frontends/qt/CanvasWindow.h"

#include <QEvent>

namespace zandor::platform::qt {

CanvasWindow::CanvasWindow(QWidget* surface) : QWidget(surface) {
    surface->installEventFilter(this);
    fit();
}

void CanvasWindow::endAt(QScrollBar& bar) {
    (bar.orientation() == Qt::Horizontal ? mAcross : mDown) = &bar;
    bar.installEventFilter(this);
    fit();
}

QRect CanvasWindow::seen() const {
    return parentWidget() ? rect() & parentWidget()->rect() : rect();
}

bool CanvasWindow::eventFilter(QObject* watched, QEvent* event) {
    switch (event->type()) {
    case QEvent::Move:
    case QEvent::Resize:
    case QEvent::ShowToParent:
    case QEvent::HideToParent: fit(); break;
    default: break;
    }
    return QWidget::eventFilter(watched, event);
}

void CanvasWindow::fit() {
    const QWidget* const around = parentWidget();
    if (!around) return;
    const int right = mDown && !mDown->isHidden() ? mDown->x() : around->width();
    const int bottom = mAcross && !mAcross->isHidden() ? mAcross->y() : around->height();
    setGeometry(0, 0, right, bottom);
}

} // namespace zandor::platform::qt
