#include "processes.h"

#include "Contest.h"
#include "Drawing.h"
#include "Report.h"
#include "Scene.h"

#include <QApplication>
#include <QFile>
#include <QProcess>

#include <cstdio>
#include <unistd.h>

// Whole processes, because libraries that have to be loaded count as well.

namespace report {

double resident() {
    QFile file(QStringLiteral("/proc/self/statm"));
    if (!file.open(QIODevice::ReadOnly)) qFatal("there is no /proc/self/statm");
    return file.readAll().split(' ').value(1).toDouble() *
           static_cast<double>(sysconf(_SC_PAGESIZE)) / 1024;
}

Run run(const QStringList& arguments) {
    constexpr int patience = 600'000;
    Run result;
    QProcess process;
    process.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    result.milliseconds = 1e3 * seconds([&] {
                              process.start(QCoreApplication::applicationFilePath(), arguments);
                              if (!process.waitForFinished(patience) || process.exitCode() != 0)
                                  qFatal("%s did not end well", qPrintable(arguments.join(u' ')));
                          });
    result.kibibytes = process.readAllStandardOutput().trimmed().toDouble();
    return result;
}

int showForm(const QString& form) {
    std::unique_ptr<QWidget> empty;
    std::unique_ptr<Drawing> drawing;
    std::unique_ptr<Scene> scene;
    if (form == QStringLiteral("control")) {
        drawing = std::make_unique<Drawing>(Setting{});
    } else if (form == QStringLiteral("scene")) {
        scene = std::make_unique<Scene>(Setting{}, false);
    } else if (form == QStringLiteral("empty")) {
        empty = std::make_unique<QWidget>();
        Painted painted(*empty);
        empty->resize(Setting::window);
        empty->show();
        painted.wait();
    } else {
        std::fprintf(stderr, "%s: give empty, control or scene\n", qPrintable(form));
        return 2;
    }
    std::printf("%.0f\n", resident());
    std::fflush(stdout);
    _exit(0); // what takes it down is no part of its start
}

void measureProcesses(Report& report) {
    const QStringList forms = {QStringLiteral("empty"), QStringLiteral("control"),
                               QStringLiteral("scene")};
    std::vector<std::vector<double>> times(3), memory(3);
    for (int round = 0; round < 15; ++round)
        for (std::size_t n = 0; n < 3; ++n) {
            const Run once = run({QStringLiteral("--form"), forms[static_cast<qsizetype>(n)]});
            times[n].push_back(once.milliseconds);
            memory[n].push_back(once.kibibytes);
        }
    const double emptyTime = median(times[0]);
    report.figures.push_back(
        {.name = QStringLiteral("start beyond an empty window / the scene's"),
         .unit = QStringLiteral("ms"),
         .ours = median(times[1]) - emptyTime,
         .theirs = median(times[2]) - emptyTime,
         .goal = 1.5,
         .note = QStringLiteral("the empty window %1 ms").arg(emptyTime, 0, 'f', 0)});
    const double emptyMemory = median(memory[0]);
    report.figures.push_back(
        {.name = QStringLiteral("memory beyond an empty window / the scene's"),
         .unit = QStringLiteral("KiB"),
         .ours = median(memory[1]) - emptyMemory,
         .theirs = median(memory[2]) - emptyMemory,
         .goal = 1.5,
         .note = QStringLiteral("the empty window %1 KiB").arg(emptyMemory, 0, 'f', 0)});
}

} // namespace report
