#pragma once

#include "support/QtHands.h"

#include <QDeadlineTimer>
#include <QDialog>
#include <QTimer>

#include <functional>

/// Handles a dialog of a kind as soon as one is open, from within its own event loop.
template <class Dialog>
void whenOpen(std::function<void(Dialog&)> handle) {
    auto* const timer = new QTimer(qApp);
    QObject::connect(timer, &QTimer::timeout, timer, [timer, handle = std::move(handle)] {
        auto* const dialog = dynamic_cast<Dialog*>(QApplication::activeModalWidget());
        if (!dialog || !dialog->isVisible()) return;
        timer->stop();
        timer->deleteLater();
        handle(*dialog);
    });
    timer->start(5);
}

/// Lets events happen until it is so; whether it came to that.
inline bool until(const std::function<bool()>& so) {
    const QDeadlineTimer end(30'000);
    while (!so()) {
        if (end.hasExpired()) return false;
        QCoreApplication::processEvents(QEventLoop::AllEvents, 20);
    }
    return true;
}

inline void type(QWidget& widget, const QString& text) {
    for (const QChar character : text) hands::key(widget, 0, QString(character));
}
