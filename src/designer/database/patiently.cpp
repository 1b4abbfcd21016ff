#include "designer/database/patiently.h"

#include "frontends/qt/ShownText.h"

#include <QCoreApplication>
#include <QEventLoop>
#include <QFutureWatcher>
#include <QLabel>
#include <QProgressDialog>
#include <QPromise>
#include <QThreadPool>
#include <QTimer>

namespace zandor::designer {

namespace {

constexpr int moment = 300; // milliseconds; for less a dialog would only flicker

} // namespace

QFuture<void> startOnThread(std::function<void()> work) {
    const auto promise = std::make_shared<QPromise<void>>();
    auto* const threads = QThreadPool::globalInstance();
    promise->start();
    threads->start([threads, promise, work = std::move(work)] {
        threads->releaseThread(); // it needs no processor while it waits
        work();
        threads->reserveThread();
        promise->finish();
    });
    return promise->future();
}

bool runPatiently(const QString& what, QWidget* window, std::function<void()> work) {
    QFutureWatcher<void> watcher;
    watcher.setFuture(startOnThread(std::move(work)));

    QEventLoop loop;
    QObject::connect(&watcher, &QFutureWatcher<void>::finished, &loop, &QEventLoop::quit);
    QTimer::singleShot(moment, &loop, &QEventLoop::quit);
    loop.exec(QEventLoop::ExcludeUserInputEvents);
    if (watcher.isFinished()) return true;

    QProgressDialog dialog(QString(),
                           QCoreApplication::translate("zandor::designer::Waiting", "Cancel"), 0, 0,
                           window);
    auto* const label = new QLabel(platform::qt::asSigns(what));
    label->setTextFormat(Qt::PlainText);
    dialog.setLabel(label);
    dialog.setWindowTitle(QCoreApplication::applicationName());
    dialog.setWindowModality(Qt::WindowModal);
    dialog.setMinimumDuration(0);
    QObject::connect(&watcher, &QFutureWatcher<void>::finished, &dialog, &QDialog::accept);
    dialog.exec();
    return watcher.isFinished();
}

} // namespace zandor::designer
