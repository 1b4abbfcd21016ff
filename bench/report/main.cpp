#include "Report.h"
#include "processes.h"

#include <QApplication>
#include <QCommandLineParser>
#include <QFile>
#include <QJsonDocument>

#include <cstdio>

// What the control takes beside other ways to the same: QGraphicsScene, bare painter calls, bare
// arithmetic, an engine's own query. Every contestant of a figure runs in this one process, turn by
// turn, so that ratios hold on a busy machine as well.
//
//   bench_report [--only dragging,core,...] [--out NAME]    writes NAME.json and NAME.svg
//
// In the folder that it is started in; QT_QPA_PLATFORM=offscreen, or below xvfb-run, as you like.

namespace {

struct Part {
    const char* name;
    void (*measure)(report::Report&);
};

constexpr Part parts[] = {
    {"dragging", report::measureDragging},   {"core", report::measureCore},
    {"scrolling", report::measureScrolling}, {"binding", report::measureBinding},
    {"pressing", report::measurePressing},   {"processes", report::measureProcesses},
    {"readers", report::measureReaders},     {"rows", report::measureRows},
    {"growth", report::measureGrowth},
};

} // namespace

int main(int argc, char** argv) {
    QApplication application(argc, argv);
    QCommandLineParser parser;
    const QCommandLineOption only(QStringLiteral("only"), QStringLiteral("Parts, by commas."),
                                  QStringLiteral("parts"));
    const QCommandLineOption out(QStringLiteral("out"), QStringLiteral("Name of the files."),
                                 QStringLiteral("name"), QStringLiteral("report"));
    const QCommandLineOption form(QStringLiteral("form"), QStringLiteral("Shows one window."),
                                  QStringLiteral("form"));
    const QCommandLineOption rows(QStringLiteral("rows"), QStringLiteral("Shows rows of a file."),
                                  QStringLiteral("file"));
    const QCommandLineOption count(QStringLiteral("count"), QStringLiteral("So many of them."),
                                   QStringLiteral("count"));
    parser.addHelpOption();
    parser.addOptions({only, out, form, rows, count});
    parser.process(application);
    if (parser.isSet(form)) return report::showForm(parser.value(form));
    if (parser.isSet(rows))
        return report::showRows(parser.value(rows), parser.value(count).toLongLong());

    report::Report measured{
        .platform = QGuiApplication::platformName(), .figures = {}, .growths = {}};
    QStringList wanted = parser.value(only).split(u',', Qt::SkipEmptyParts);
    const bool all = wanted.isEmpty();
    for (const Part& part : parts)
        if (all || wanted.removeAll(QLatin1String(part.name)) > 0) {
            std::fprintf(stderr, "%s ...\n", part.name);
            part.measure(measured);
        }
    if (!wanted.isEmpty()) {
        QStringList names;
        for (const Part& part : parts) names += QLatin1String(part.name);
        std::fprintf(stderr, "There is no part \"%s\": the parts are %s\n",
                     qPrintable(wanted.first()), qPrintable(names.join(QStringLiteral(", "))));
        return 2;
    }
    std::fputs(measured.table().toUtf8().constData(), stdout);
    QFile json(parser.value(out) + QStringLiteral(".json"));
    if (!json.open(QIODevice::WriteOnly) ||
        json.write(QJsonDocument(measured.json()).toJson()) < 0) {
        std::fprintf(stderr, "%s cannot be written: %s\n", qPrintable(json.fileName()),
                     qPrintable(json.errorString()));
        return 1;
    }
    measured.draw(parser.value(out) + QStringLiteral(".svg"));
}
