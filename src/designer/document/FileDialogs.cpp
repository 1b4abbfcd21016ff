#include "designer/document/FileDialogs.h"

#include "designer/document/Document.h"
#include "designer/document/QueryFile.h"
#include "designer/document/RecentFiles.h"
#include "designer/statement/ModelWords.h"

#include <QFileDialog>
#include <QFileInfo>
#include <QMessageBox>
#include <QStandardPaths>

namespace designer {

namespace {

/// A dialog over the folder of the current file.
void prepare(QFileDialog& dialog, const QueryFile& file) {
    dialog.setNameFilters(
        {FileDialogs::tr("Zandor queries (*.json)"), FileDialogs::tr("All files (*)")});
    dialog.setDefaultSuffix(QStringLiteral("json"));
    const QString path = file.path();
    dialog.setDirectory(path.isEmpty()
                            ? QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation)
                            : QFileInfo(path).absolutePath());
}

/// The file that the user chose, or nothing.
QString chosen(QFileDialog& dialog) {
    return dialog.exec() == QDialog::Accepted ? dialog.selectedFiles().value(0) : QString();
}

} // namespace

FileDialogs::FileDialogs(Document& document, QueryFile& file, RecentFiles& recent, QWidget& window)
    : QObject(&window), mDocument(document), mFile(file), mRecent(recent), mWindow(window) {
    connect(&document, &Document::modifiedChanged, &window, &QWidget::setWindowModified);
    window.setWindowModified(document.isModified());
}

bool FileDialogs::startNew() {
    if (!mayLose()) return false;
    mFile.startNew();
    return true;
}

bool FileDialogs::open() {
    if (!mayLose()) return false;
    QFileDialog dialog(&mWindow, tr("Open query"));
    prepare(dialog, mFile);
    dialog.setFileMode(QFileDialog::ExistingFile);
    const QString path = chosen(dialog);
    return !path.isEmpty() && openFrom(path);
}

bool FileDialogs::open(const QString& path) { return mayLose() && openFrom(path); }

bool FileDialogs::openFrom(const QString& path) {
    if (const auto error = mFile.open(path)) {
        tell(tr("Open query"), *error);
        return false;
    }
    mRecent.add(mFile.path());
    emit opened();
    return true;
}

bool FileDialogs::save() { return mFile.path().isEmpty() ? saveAs() : saveTo(mFile.path()); }

bool FileDialogs::saveAs() {
    QFileDialog dialog(&mWindow, tr("Save query"));
    prepare(dialog, mFile);
    dialog.setAcceptMode(QFileDialog::AcceptSave);
    dialog.selectFile(mFile.path().isEmpty() ? tr("query.json") : mFile.name());
    const QString path = chosen(dialog);
    return !path.isEmpty() && saveTo(path);
}

bool FileDialogs::mayLose() {
    if (!mDocument.isModified()) return true;
    QMessageBox box(QMessageBox::Warning, tr("Save query"),
                    tr("Save the changes to \"%1\"?").arg(mFile.name()),
                    QMessageBox::Save | QMessageBox::Discard | QMessageBox::Cancel, &mWindow);
    box.setInformativeText(tr("Changes that are not saved are lost."));
    box.setDefaultButton(QMessageBox::Save);
    switch (box.exec()) {
    case QMessageBox::Save: return save();
    case QMessageBox::Discard: return true;
    default: return false;
    }
}

bool FileDialogs::saveTo(const QString& path) {
    if (const auto error = mFile.saveAs(path)) {
        tell(tr("Save query"), *error);
        return false;
    }
    mRecent.add(mFile.path());
    return true;
}

void FileDialogs::tell(const QString& title, const QString& error) {
    QMessageBox::warning(&mWindow, title, inWords(error));
}

} // namespace designer
