#pragma once

#include <QApplication>
#include <QContextMenuEvent>
#include <QDrag>
#include <QDropEvent>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QPointer>
#include <QWidget>
#include <QWindow>
#include <QtTest/qtestspontaneevent.h>

// Qt's own, for its tests.
Q_GUI_EXPORT bool qt_sendShortcutOverrideEvent(QObject* receiver, ulong timestamp, int key,
                                               Qt::KeyboardModifiers modifiers,
                                               const QString& text = {}, bool repeats = false,
                                               ushort count = 1);

/// Real Qt input, as the window system would deliver it.
namespace hands {

/// One mouse event on a widget; gives the focus as a click of the user's does.
inline void mouse(QWidget& widget, QEvent::Type type, QPointF at, Qt::MouseButton button,
                  Qt::MouseButtons held = Qt::NoButton, Qt::KeyboardModifiers modifiers = {}) {
    QMouseEvent event(type, at, widget.mapTo(widget.window(), at), widget.mapToGlobal(at), button,
                      held, modifiers);
    QSpontaneKeyEvent::setSpontaneous(&event);
    qApp->notify(&widget, &event);
}

inline void click(QWidget& widget, QPointF at) {
    const QPointer<QWidget> alive = &widget;
    mouse(widget, QEvent::MouseButtonPress, at, Qt::LeftButton, Qt::LeftButton);
    if (alive) mouse(widget, QEvent::MouseButtonRelease, at, Qt::LeftButton);
}

inline void key(QWidget& widget, int key, const QString& text = {},
                Qt::KeyboardModifiers modifiers = {}) {
    const QPointer<QWidget> alive = &widget;
    for (const auto type : {QEvent::ShortcutOverride, QEvent::KeyPress, QEvent::KeyRelease}) {
        if (!alive) return;
        QKeyEvent event(type, key, modifiers, text);
        QSpontaneKeyEvent::setSpontaneous(&event);
        qApp->notify(&widget, &event);
    }
}

/// A key of which the window around may have made a shortcut.
inline void shortcut(QWidget& widget, int key, Qt::KeyboardModifiers modifiers = {}) {
    qt_sendShortcutOverrideEvent(&widget, 0, key, modifiers);
}

/// The menu key, which the window system reports as a request for the menu of its own kind.
inline void menuKey(QWidget& window) {
    QContextMenuEvent event(QContextMenuEvent::Keyboard, {}, window.mapToGlobal(QPoint()));
    QCoreApplication::sendEvent(window.windowHandle(), &event);
}

/// Carries a drag over a place of a widget, from where it goes on.
inline void carryOver(QDrag& drag, QWidget& over, QPointF at) {
    QWindow* const window = over.window()->windowHandle();
    const QPoint place = over.mapTo(over.window(), at).toPoint();
    QDragEnterEvent enter(place, Qt::CopyAction, drag.mimeData(), Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(window, &enter);
    QDragMoveEvent move(place, Qt::CopyAction, drag.mimeData(), Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(window, &move);
}

/// Carries a drag to a place of a widget and drops it there, or leaves where nothing takes it.
/// The events reach the widget through its window, which looks for whoever takes drops; it is
/// entered once, before whatever the drag passes.
inline void carry(QDrag& drag, QWidget& over, QPointF at, bool isInWindow = false) {
    QWindow* const window = over.window()->windowHandle();
    const QPoint place = over.mapTo(over.window(), at).toPoint();
    const QMimeData* const data = drag.mimeData();
    QDragEnterEvent enter(place, Qt::CopyAction, data, Qt::LeftButton, Qt::NoModifier);
    if (!isInWindow) QCoreApplication::sendEvent(window, &enter);
    QDragMoveEvent move(place, Qt::CopyAction, data, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(window, &move);
    if (move.isAccepted()) {
        QDropEvent drop(place, Qt::CopyAction, data, Qt::NoButton, Qt::NoModifier);
        QCoreApplication::sendEvent(window, &drop);
    } else {
        QDragLeaveEvent leave;
        QCoreApplication::sendEvent(window, &leave);
    }
}

} // namespace hands
