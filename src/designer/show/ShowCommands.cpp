#include "designer/show/ShowCommands.h"

#include "designer/DrawingArea.h"
#include "designer/PlainBox.h"
#include "designer/document/Document.h"
#include "designer/document/QueryFile.h"
#include "designer/show/DrawingPicture.h"
#include "designer/show/askForPicture.h"
#include "designer/show/savePicture.h"

#include <QDir>
#include <QPrintDialog>
#include <QPrinter>
#include <QSettings>
#include <QStandardPaths>

namespace zandor::designer {

namespace {

QString allColumnsKey() { return QStringLiteral("pictures/allColumns"); }

} // namespace

ShowCommands::ShowCommands(Document& document, const QueryFile& file, const DrawingArea& area,
                           QSettings& settings, QWidget& window)
    : QObject(&window), exportPicture(tr("&Export drawing\u2026")), print(tr("&Print\u2026")),
      copyPicture(tr("Copy as p&icture")), allColumns(tr("Pictures &with all columns")),
      mDocument(document), mFile(file), mArea(area), mWindow(window) {
    allColumns.setObjectName(QStringLiteral("allColumns"));
    allColumns.setCheckable(true);
    allColumns.setChecked(settings.value(allColumnsKey(), true).toBool());
    connect(&allColumns, &QAction::toggled, this,
            [&settings](bool on) { settings.setValue(allColumnsKey(), on); });
    exportPicture.setObjectName(QStringLiteral("exportPicture"));
    print.setObjectName(QStringLiteral("print"));
    copyPicture.setObjectName(QStringLiteral("copyPicture"));
    print.setShortcut(QKeySequence::Print);
    copyPicture.setShortcut(Qt::CTRL | Qt::SHIFT | Qt::Key_C);
    connect(&exportPicture, &QAction::triggered, this, &ShowCommands::askForFile);
    connect(&print, &QAction::triggered, this, &ShowCommands::askForPrinter);
    connect(&copyPicture, &QAction::triggered, this, &ShowCommands::copy);
    connect(&document, &Document::changed, this, &ShowCommands::follow);
    follow();
}

/// There is something to show as soon as there is a table.
void ShowCommands::follow() {
    const bool drawn = mDocument.query()->Tables().Count() > 0;
    for (QAction* action : {&exportPicture, &print, &copyPicture}) action->setEnabled(drawn);
}

DrawingPicture ShowCommands::picture() const {
    return DrawingPicture(*mDocument.query(), mArea.options(),
                          allColumns.isChecked() ? DrawingPicture::Rows::all
                                                 : DrawingPicture::Rows::asDrawn);
}

QString ShowCommands::proposedName() const {
    if (QString beside = mFile.besideWith(QStringLiteral("png")); !beside.isEmpty())
        return beside;
    return QDir(QStandardPaths::writableLocation(QStandardPaths::PicturesLocation))
        .filePath(tr("drawing.png"));
}

void ShowCommands::askForFile() {
    askForPicture(&mWindow, tr("Export drawing"), proposedName(), picture());
}

void ShowCommands::askForPrinter() {
    QPrinter printer;
    printer.setPageOrientation(QPageLayout::Landscape);
    printer.setDocName(tr("Query"));
    QPrintDialog dialog(&printer, &mWindow);
    if (dialog.exec() != QDialog::Accepted) return;
    if (const auto error = printPicture(picture(), printer))
        PlainBox::warn(&mWindow, tr("Print"), *error);
}

void ShowCommands::copy() { designer::copyPicture(picture()); }

} // namespace zandor::designer
