#include "designer/Colours.h"
#include "designer/DesignerWindow.h"
#include "designer/Screen.h"
#include "designer/document/AutosaveSlot.h"
#include "designer/document/paths.h"
#include "designer/options/Languages.h"
#include "designer/placeOfSample.h"
#include "designer/run/spoolSweep.h"
#include "designer/shell/loadForTask.h"
#include "designer/show/DrawingPicture.h"
#include "designer/show/savePicture.h"
#include "designer/statement/ModelWords.h"
#include "designer/tables/placeTables.h"

#include <Zandor/QueryDocument.h>
#include <Zandor/files/Replacement.h>

#include <QBuffer>
#include <QDir>
#include <QPixmap>

using namespace zandor;

namespace {

QStringList argumentsOf(int argc, char** argv) {
    QStringList arguments;
    for (int n = 1; n < argc; ++n) arguments << QString::fromLocal8Bit(argv[n]);
    return arguments;
}

int refuse(const QString& why) {
    designer::shell::complain(why);
    return designer::shell::unusable;
}

int failed(const QString& why) {
    designer::shell::complain(why);
    return designer::shell::failed;
}

/// Draws the tables and joins of a query's file into another file.
int drawQuery(const designer::Arguments& arguments) {
    const auto document = designer::shell::loadForTask(arguments.drawing);
    if (!document) return refuse(designer::inWords(document.failure()));
    constexpr int pageWidth = 15000; // twips
    designer::arrangeUnplaced(*document->query, pageWidth);
    using designer::DrawingPicture;
    const DrawingPicture picture(*document->query, {},
                                 arguments.asShown ? DrawingPicture::Rows::asDrawn
                                                   : DrawingPicture::Rows::all);
    const auto error = designer::savePicture(picture, arguments.picture);
    return error ? failed(*error) : designer::shell::allWell;
}

/// Draws a window that is shown into a file.
int draw(designer::DesignerWindow& window, const QString& file) {
    QCoreApplication::processEvents();
    QBuffer png;
    window.grab().save(&png, "PNG");
    const auto error =
        designer::inWords(files::replaceFile(designer::pathOf(file), png.data().toStdString()));
    return error ? failed(*error) : designer::shell::allWell;
}

} // namespace

// What nobody has caught ends the program; the work of its user is kept safe beside it.
// NOLINTNEXTLINE(bugprone-exception-escape)
int main(int argc, char** argv) {
    const QStringList given = argumentsOf(argc, argv);
    if (designer::asksForHelp(given))
        return designer::shell::print(designer::helpText().toLocal8Bit());
    if (designer::asksForVersion(given))
        return designer::shell::print(designer::versionText().toLocal8Bit());

    if (designer::asksForTask(given)) {
        designer::keepRemarksQuiet();
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
    designer::sweepSpools();
    designer::DesignerWindow window;
    const QString sample = designer::placeOfSample();
    const bool stays = arguments->screenshot.isEmpty() && !designer::isOffscreen();
    if (const auto error = window.openAtFirst(*arguments, sample)) {
        // Names that are not in the database were typed in a shell, where somebody reads this.
        if (!stays || window.database().isOpen()) return refuse(*error);
        window.offerAgain(*error, *arguments, sample);
    }
    window.show();
    if (!arguments->screenshot.isEmpty()) return draw(window, arguments->screenshot);
    if (!designer::isOffscreen()) {
        window.keepSafe(designer::AutosaveSlot::standardFolder());
        return QApplication::exec();
    }

    const QString file = QDir::temp().filePath(QStringLiteral("zandor-designer.png"));
    const int result = draw(window, file);
    if (result != designer::shell::allWell) return result;
    return designer::shell::print(
        QStringLiteral("No display can be reached; the window was drawn off screen:\n%1\n")
            .arg(file)
            .toLocal8Bit());
}
