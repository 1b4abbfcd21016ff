#include "designer/document/FileDialogs.h"

#include "designer/PlainBox.h"
#include "designer/document/Document.h"
#include "designer/document/QueryFile.h"
#include "designer/document/RecentFiles.h"

#include <QFileDialog>
#include <QFileInfo>
#include <QPushButton>
#include <QScopedValueRollback>
#include <QStandardPaths>

namespace zandor::designer {

namespace {

/// A dialog over the folder of the current file.
void prepare(QFileDialog& dialog, const QueryFile& file) {
    dialog.setNameFilters(
        {FileDialogs::tr("Zandor queries (*.json)"), FileDialogs::tr("All files (*)")});
    dialog.setDefaultSuffix(QStringLiteral("json"));
    const QString& path = file.path();
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
    const QString path = ask(tr("Open query"));
    return !path.isEmpty() && openFrom(path);
}

QString FileDialogs::ask(const QString& title) {
    QFileDialog dialog(&mWindow, title);
    prepare(dialog, mFile);
    dialog.setFileMode(QFileDialog::ExistingFile);
    return chosen(dialog);
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
    PlainBox box(QMessageBox::Warning, tr("Save query"),
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
    const bool own = QFileInfo(path).absoluteFilePath() == mFile.path();
    if (own && mFile.onDisk(QueryFile::Look::thorough) == QueryFile::OnDisk::changed) {
        switch (ask(tr("To save your query overwrites these changes."), tr("&Overwrite them"),
                    tr("Cancel"))) {
        case Whose::theirs: openFrom(path); return false;
        case Whose::mine: break;
        case Whose::elsewhere: return saveAs();
        case Whose::open: return false;
        }
    }
    if (const auto error = mFile.saveAs(path)) {
        tell(tr("Save query"), *error);
        return false;
    }
    mRecent.add(mFile.path());
    emit saved();
    return true;
}

void FileDialogs::lookAtFile() {
    // The question itself takes the window's focus and gives it back.
    if (mAsking) return;
    const QScopedValueRollback asking(mAsking, true);
    const QString path = mFile.path();
    switch (mFile.onDisk(QueryFile::Look::quick)) {
    case QueryFile::OnDisk::asKnown: return;
    case QueryFile::OnDisk::gone:
        mFile.keepInstead();
        emit gone(tr("The file \"%1\" is no longer there; save the query to have one.")
                      .arg(mFile.name()));
        return;
    case QueryFile::OnDisk::changed: break;
    }
    const QString detail = mDocument.isModified() ? tr("To load it gives up your own changes.")
                                                  : tr("You have not changed it since.");
    switch (ask(detail, tr("&Keep mine"), tr("&Decide later"))) {
    case Whose::theirs: openFrom(path); break;
    case Whose::mine: mFile.keepInstead(); break;
    case Whose::elsewhere: saveAs(); break;
    case Whose::open: mFile.decideLater(); break;
    }
}

FileDialogs::Whose FileDialogs::ask(const QString& detail, const QString& mine,
                                    const QString& open) {
    PlainBox box(QMessageBox::Warning, tr("Changed file"),
                 tr("Another program has changed \"%1\" since you opened it.").arg(mFile.name()),
                 QMessageBox::NoButton, &mWindow);
    box.setInformativeText(detail);
    const auto* theirs = box.addButton(tr("&Load the file"), QMessageBox::DestructiveRole);
    const auto* own = box.addButton(mine, QMessageBox::AcceptRole);
    auto* elsewhere = box.addButton(tr("Save &as\u2026"), QMessageBox::AcceptRole);
    box.setEscapeButton(box.addButton(open, QMessageBox::RejectRole));
    box.setDefaultButton(elsewhere);
    box.exec();
    if (box.clickedButton() == theirs) return Whose::theirs;
    if (box.clickedButton() == own) return Whose::mine;
    return box.clickedButton() == elsewhere ? Whose::elsewhere : Whose::open;
}

void FileDialogs::tell(const QString& title, const QString& error) {
    PlainBox::warn(&mWindow, title, error);
}

} // namespace zandor::designer
