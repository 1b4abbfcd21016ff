#include "designer/DesignerWindow.h"
#include "designer/Screen.h"
#include "designer/options/Languages.h"

#include <QApplication>
#include <QElapsedTimer>
#include <QPaintEvent>
#include <QProcess>

#include <algorithm>
#include <cstdio>
#include <vector>

using namespace zandor;

// From the start of a process to a window that is painted and waits for its user: the designer over
// the sample, against an empty main window. The program starts itself, turn by turn, in either
// form; whole processes, because libraries that have to be loaded count as well.
//
//   bench_designer_start [RUNS]

namespace {

/// Ends the program as soon as the event loop has nothing more urgent to do than to wait.
void endWhenPainted(QWidget& window) {
    class Watch final : public QObject {
    public:
        using QObject::QObject;
        bool eventFilter(QObject*, QEvent* event) override {
            if (event->type() == QEvent::UpdateRequest)
                QMetaObject::invokeMethod(qApp, &QCoreApplication::quit, Qt::QueuedConnection);
            return false;
        }
    };
    window.installEventFilter(new Watch(&window));
}

int showDesigner() {
    designer::speak();
    designer::DesignerWindow window;
    if (const auto error = window.openAtFirst({}, QStringLiteral(ZANDOR_SAMPLE_DATABASE)))
        qFatal("%s", qPrintable(*error));
    endWhenPainted(window);
    window.show();
    return QApplication::exec();
}

int showEmptyWindow() {
    QMainWindow window;
    window.resize(1340, 800);
    endWhenPainted(window);
    window.show();
    return QApplication::exec();
}

double milliseconds(const QString& form) {
    QElapsedTimer clock;
    clock.start();
    QProcess process;
    process.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    process.start(QCoreApplication::applicationFilePath(), {form});
    if (!process.waitForFinished() || process.exitCode() != 0)
        qFatal("%s did not end well", qPrintable(form));
    return static_cast<double>(clock.nsecsElapsed()) / 1e6;
}

} // namespace

int main(int argc, char** argv) {
    const QString form = QString::fromLocal8Bit(argc > 1 ? argv[1] : "");
    const bool starts = form == QLatin1String("designer") || form == QLatin1String("empty");
    if (starts) {
        const auto application = designer::makeApplication(argc, argv, false);
        return form == QLatin1String("designer") ? showDesigner() : showEmptyWindow();
    }
    const QCoreApplication application(argc, argv);
    const int runs = form.isEmpty() ? 15 : form.toInt();
    std::vector<double> designers;
    std::vector<double> empties;
    for (int run = 0; run < runs; ++run) {
        designers.push_back(milliseconds(QStringLiteral("designer")));
        empties.push_back(milliseconds(QStringLiteral("empty")));
    }
    const auto median = [](std::vector<double>& times) {
        std::sort(times.begin(), times.end());
        return times[times.size() / 2];
    };
    const double designer = median(designers);
    const double empty = median(empties);
    std::printf("median of %d: designer %.0f ms, empty window %.0f ms, ratio %.2f\n", runs,
                designer, empty, designer / empty);
}
