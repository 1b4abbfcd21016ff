#include "designer/show/ShowCommands.h"

#include "designer/DrawingArea.h"
#include "designer/document/Document.h"
#include "designer/show/DrawingPicture.h"
#include "designer/show/savePicture.h"

#include <QClipboard>
#include <QFileDialog>
#include <QFileInfo>
#include <QGuiApplication>
#include <QImage>
#include <QMessageBox>
#include <QPrintDialog>
#include <QPrinter>

namespace designer {

ShowCommands::ShowCommands(Document& document, const DrawingArea& area, QWidget& window)
    : QObject(&window), exportPicture(tr("&Export drawing\u2026")), print(tr("&Print\u2026")),
      copyPicture(tr("Copy as p&icture")), mDocument(document), mArea(area), mWindow(window) {
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
    return DrawingPicture(*mDocument.query(), mArea.options());
}

void ShowCommands::askForFile() {
    QFileDialog dialog(&mWindow, tr("Export drawing"));
    dialog.setAcceptMode(QFileDialog::AcceptSave);
    dialog.setNameFilters(
        {tr("Picture (*.png)"), tr("Scalable drawing (*.svg)"), tr("Document (*.pdf)")});
    const QStringList suffixes{QStringLiteral("png"), QStringLiteral("svg"), QStringLiteral("pdf")};
    const auto follow = [&](const QString& filter) {
        dialog.setDefaultSuffix(suffixes.value(dialog.nameFilters().indexOf(filter)));
    };
    connect(&dialog, &QFileDialog::filterSelected, &dialog, follow);
    follow(dialog.selectedNameFilter());
    if (dialog.exec() != QDialog::Accepted) return;
    if (const auto error = savePicture(picture(), dialog.selectedFiles().value(0)))
        QMessageBox::warning(&mWindow, tr("Export drawing"), *error);
}

void ShowCommands::askForPrinter() {
    QPrinter printer;
    printer.setPageOrientation(QPageLayout::Landscape);
    printer.setDocName(tr("Query"));
    QPrintDialog dialog(&printer, &mWindow);
    if (dialog.exec() != QDialog::Accepted) return;
    if (const auto error = printPicture(picture(), printer))
        QMessageBox::warning(&mWindow, tr("Print"), *error);
}

void ShowCommands::copy() {
    constexpr qreal scale = 2; // for documents that are printed
    QGuiApplication::clipboard()->setImage(picture().image(scale));
}

} // namespace designer
