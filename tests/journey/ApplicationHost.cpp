#include "Host.h"

#include "designer/Arguments.h"
#include "designer/DesignerWindow.h"
#include "designer/Screen.h"
#include "designer/options/Languages.h"

#include <QApplication>
#include <QScreen>

using namespace zandor;

// The designer's own window, over what the command line names.

int main(int argc, char** argv) {
    const auto application = designer::makeApplication(argc, argv, false);
    designer::speak();
    QStringList given;
    for (int n = 2; n < argc; ++n) given += QString::fromLocal8Bit(argv[n]);
    const auto arguments = designer::readArguments(given);
    if (!arguments) qFatal("%s", qPrintable(arguments.error()));
    designer::DesignerWindow window;
    if (const auto error = window.openAtFirst(*arguments, QStringLiteral(ZANDOR_SAMPLE_DATABASE)))
        qFatal("%s", qPrintable(*error));

    Host host(window, [&]() -> model::Query& { return *window.document().query(); });
    host.listen(window.drawing().control());
    QObject::connect(&window.drawing(), &designer::DrawingArea::controlMade, &host,
                     [&](ZandorWidget* control) { host.listen(*control); });
    window.move(0, 0);
    // The share of a window manager, of which there is none.
    if (qEnvironmentVariableIsSet("ZANDOR_MAXIMISED"))
        window.resize(QGuiApplication::primaryScreen()->availableSize());
    window.show();
    window.activateWindow();
    // What a designer that was killed has left there is offered now.
    window.keepSafe(QString::fromLocal8Bit(argv[1]));
    return QApplication::exec();
}
