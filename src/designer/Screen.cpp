#include "designer/Screen.h"

#include <QIcon>
#include <QLoggingCategory>

namespace zandor::designer {

namespace {

QtMessageHandler previousHandler = nullptr;

/// Off screen there is no desktop session to speak of, and what a statement failed for is told by
/// the statement; Qt need not remark on either.
void leaveOutRemarks(QtMsgType type, const QMessageLogContext& context, const QString& text) {
    const bool remark = text.startsWith(QLatin1String("QStandardPaths: XDG_RUNTIME_DIR")) ||
                        text.startsWith(QLatin1String("This plugin does not support")) ||
                        text.startsWith(QLatin1String("QODBCResult::"));
    if (!remark) previousHandler(type, context, text);
}

} // namespace

void keepRemarksQuiet() {
    if (!previousHandler) previousHandler = qInstallMessageHandler(leaveOutRemarks);
}

std::unique_ptr<QApplication> makeApplication(int& argc, char** argv, bool offscreen) {
    const bool decided = qEnvironmentVariableIsSet("QT_QPA_PLATFORM");
    if (!decided) {
        // Qt takes the first of these that works.
        QByteArrayList platforms;
        if (!offscreen && qEnvironmentVariableIsSet("WAYLAND_DISPLAY")) platforms << "wayland";
        if (!offscreen && qEnvironmentVariableIsSet("DISPLAY")) platforms << "xcb";
        platforms << "offscreen";
        qputenv("QT_QPA_PLATFORM", platforms.join(';'));
        // That one of them fails is expected, and the designer says itself what follows from it.
        QLoggingCategory::setFilterRules(
            QStringLiteral("qt.qpa.plugin=false\nqt.qpa.xcb=false\nqt.qpa.wayland=false"));
    }
    keepRemarksQuiet();
    // Where the settings and what is kept safe stand.
    QCoreApplication::setOrganizationName(QStringLiteral("Zandor"));
    QCoreApplication::setApplicationName(QStringLiteral("zandor-designer"));
    QGuiApplication::setDesktopFileName(QStringLiteral("zandor-designer"));
    auto application = std::make_unique<QApplication>(argc, argv);
    QApplication::setWindowIcon(QIcon(QStringLiteral(":/zandor-designer.svg")));
    if (!decided) {
        QLoggingCategory::setFilterRules({});
        qunsetenv("QT_QPA_PLATFORM"); // programs started from here decide for themselves
    }
    return application;
}

bool isOffscreen() {
    return QGuiApplication::platformName() == QLatin1String("offscreen") ||
           QGuiApplication::platformName() == QLatin1String("minimal");
}

} // namespace zandor::designer
