#include "designer/show/askForPicture.h"

#include "designer/PlainBox.h"
#include "designer/show/Picture.h"
#include "designer/show/savePicture.h"
#include "designer/tr.h"

#include <QClipboard>
#include <QDir>
#include <QFileDialog>
#include <QFileInfo>
#include <QGuiApplication>

namespace zandor::designer {

void askForPicture(QWidget* window, const QString& title, const QString& proposed,
                   const Picture& picture) {
    QFileDialog dialog(window, title);
    dialog.setAcceptMode(QFileDialog::AcceptSave);
    dialog.setNameFilters(
        {tr("Picture (*.png)"), tr("Scalable drawing (*.svg)"), tr("Document (*.pdf)")});
    const QStringList suffixes{QStringLiteral("png"), QStringLiteral("svg"), QStringLiteral("pdf")};
    const auto follow = [&](const QString& filter) {
        dialog.setDefaultSuffix(suffixes.value(dialog.nameFilters().indexOf(filter)));
    };
    QObject::connect(&dialog, &QFileDialog::filterSelected, &dialog, follow);
    follow(dialog.selectedNameFilter());
    const QFileInfo place(proposed);
    if (place.dir().exists()) dialog.setDirectory(place.dir());
    dialog.selectFile(place.fileName());
    if (dialog.exec() != QDialog::Accepted) return;
    if (const auto error = savePicture(picture, dialog.selectedFiles().value(0)))
        PlainBox::warn(window, title, *error);
}

void copyPicture(const Picture& picture) {
    constexpr qreal scale = 2;
    QGuiApplication::clipboard()->setImage(picture.image(scale));
}

} // namespace zandor::designer
