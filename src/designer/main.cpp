#include "designer/Colours.h"
#include "designer/DesignerWindow.h"
#include "designer/Screen.h"
#include "designer/document/AutosaveSlot.h"
#include "designer/options/Languages.h"
#include "designer/show/DrawingPicture.h"
#include "designer/show/savePicture.h"
#include "model/files/QueryDocument.h"

#include <QDir>
#include <QFile>
#include <QPixmap>

#include <cstdio>

namespace {

constexpr int pictureFailed = 1;
constexpr int unusable = 2;

QStringList argumentsOf(int argc, char** argv) {
    QStringList arguments;
    for (int n = 1; n < argc; ++n) arguments << QString::fromLocal8Bit(argv[n]);
    return arguments;
}

void say(std::FILE* stream, const QString& text) {
    std::fputs(text.toLocal8Bit().constData(), stream);
}

int refuse(const QString& why) {
    say(stderr, QStringLiteral("zandor-designer: %1\n").arg(why));
    return unusable;
}

/// Draws the tables and joins of a query's file into another file.
int drawQuery(const designer::Arguments& arguments) {
    const auto document = files::loadQuery(QFile::encodeName(arguments.drawing).toStdString());
    if (!document) return refuse(QString::fromStdString(document.error()));
    using designer::DrawingPicture;
    const DrawingPicture picture(*document->query, {},
                                 arguments.asShown ? DrawingPicture::Rows::asDrawn
                                                   : DrawingPicture::Rows::all);
    const auto error = designer::savePicture(picture, arguments.picture);
    if (!error) return 0;
    say(stderr, QStringLiteral("zandor-designer: %1\n").arg(*error));
    return pictureFailed;
}

/// Draws a window that is shown into a file.
int draw(designer::DesignerWindow& window, const QString& file) {
    QCoreApplication::processEvents();
    if (window.grab().save(file, "PNG")) return 0;
    say(stderr, QStringLiteral("zandor-designer: The picture \"%1\" cannot be written; check the "
                               "folder and your permissions.\n")
                    .arg(file));
    return pictureFailed;
}

} // namespace

int main(int argc, char** argv) {
    const QStringList given = argumentsOf(argc, argv);
    if (designer::asksForHelp(given)) return say(stdout, designer::helpText()), 0;
    if (designer::asksForVersion(given)) return say(stdout, designer::versionText()), 0;

    if (designer::asksForTask(given)) {
        const QCoreApplication application(argc, argv);
        const auto arguments = designer::readArguments(argumentsOf(argc, argv));
        return arguments ? designer::shell::perform(*arguments->task) : refuse(arguments.error());
    }

    const auto application = designer::makeApplication(argc, argv, designer::asksForPicture(given));
    designer::speak();
    // Qt has taken its own arguments out by now.
    const auto arguments = designer::readArguments(argumentsOf(argc, argv));
    if (!arguments) return refuse(arguments.error());
    if (arguments->dark) designer::useDarkColours();
    if (!arguments->drawing.isEmpty()) return drawQuery(*arguments);
    designer::DesignerWindow window;
    if (const auto error = window.openAtFirst(*arguments, QStringLiteral(ZANDOR_SAMPLE_DATABASE)))
        return refuse(*error);
    window.show();
    if (!arguments->screenshot.isEmpty()) return draw(window, arguments->screenshot);
    if (!designer::isOffscreen()) {
        window.keepSafe(designer::AutosaveSlot::standardFolder());
        return QApplication::exec();
    }

    const QString file = QDir::temp().filePath(QStringLiteral("zandor-designer.png"));
    const int result = draw(window, file);
    if (result == 0)
        say(stdout, QStringLiteral("No display can be reached; the window was drawn off screen:\n"
                                   "%1\n")
                        .arg(file));
    return result;
}
