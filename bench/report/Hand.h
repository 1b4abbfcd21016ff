#pragma once

#include <QApplication>
#include <QMouseEvent>
#include <QWheelEvent>
#include <QWidget>

namespace report {

/// The left button on a widget, held from the making on. Places are the widget's own as it stood
/// then, so that they stay where they are while it moves.
class Hand {
public:
    Hand(QWidget& widget, QPointF at)
        : mWidget(widget), mOrigin(widget.mapToGlobal(QPoint())), mAt(at) {
        send(QEvent::MouseButtonPress, Qt::LeftButton, Qt::LeftButton);
    }
    Hand(const Hand&) = delete;
    Hand& operator=(const Hand&) = delete;
    ~Hand() { send(QEvent::MouseButtonRelease, Qt::LeftButton, Qt::NoButton); }

    void moveTo(QPointF at) {
        mAt = at;
        send(QEvent::MouseMove, Qt::NoButton, Qt::LeftButton);
    }

private:
    void send(QEvent::Type type, Qt::MouseButton button, Qt::MouseButtons held) {
        const QPointF onScreen = mOrigin + mAt;
        QMouseEvent event(type, mWidget.mapFromGlobal(onScreen), onScreen, button, held, {});
        QApplication::sendEvent(&mWidget, &event);
    }

    QWidget& mWidget;
    const QPointF mOrigin;
    QPointF mAt;
};

/// A notch of the wheel in the middle of a widget; up or down.
inline void turnWheel(QWidget& widget, bool up) {
    const QPointF at = QRectF(widget.rect()).center();
    QWheelEvent event(at, widget.mapToGlobal(at), {}, {0, up ? 120 : -120}, Qt::NoButton, {},
                      Qt::NoScrollPhase, false);
    QApplication::sendEvent(&widget, &event);
}

/// To and fro along a short way: where the nth step is.
inline QPointF wayOf(int step) {
    const int along = step % 40 < 20 ? step % 40 : 40 - step % 40;
    return {3.0 * along, 2.0 * along};
}

} // namespace report
