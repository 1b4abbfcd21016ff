#include "Painted.h"

#include <QApplication>
#include <QElapsedTimer>
#include <QEvent>

namespace report {

Painted::Painted(QWidget& window) : mWindow(window) { qApp->installEventFilter(this); }

bool Painted::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::Paint && watched->isWidgetType() &&
        static_cast<QWidget*>(watched)->window() == &mWindow)
        ++mPaints;
    return false;
}

void Painted::wait() {
    QElapsedTimer clock;
    clock.start();
    for (int seen = mWaitedFor - 1; seen != mPaints || mPaints == mWaitedFor;) {
        if (clock.elapsed() > 10'000)
            qFatal("%s: nothing was painted", mWindow.metaObject()->className());
        seen = mPaints;
        QCoreApplication::sendPostedEvents();
        QCoreApplication::processEvents();
    }
    QGuiApplication::sync();
    mWaitedFor = mPaints;
}

} // namespace report
