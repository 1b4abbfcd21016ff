#include "designer/DatabaseCommands.h"

#include "designer/PlainBox.h"
#include "designer/database/ConnectionDialog.h"
#include "designer/database/opening.h"
#include "designer/document/FileDialogs.h"
#include "designer/document/QueryFile.h"
#include "designer/document/RecentFiles.h"
#include "designer/document/RecentMenu.h"

#include <QFileDialog>
#include <QMenu>
#include <QPushButton>

namespace zandor::designer {

DatabaseCommands::DatabaseCommands(Database& database, QueryFile& file, FileDialogs& files,
                                   RecentFiles& recent, QWidget& window)
    : QObject(&window), mDatabase(database), mFile(file), mFiles(files), mRecent(recent),
      mWindow(window), mOpenFile(tr("Open SQLite &file\u2026")),
      mConnect(tr("&Connect to a server\u2026")), mReconnect(tr("Reco&nnect")) {
    mOpenFile.setObjectName(QStringLiteral("openDatabaseFile"));
    mConnect.setObjectName(QStringLiteral("connect"));
    mReconnect.setObjectName(QStringLiteral("reconnect"));
    mOpenFile.setShortcut(Qt::CTRL | Qt::SHIFT | Qt::Key_O);
    connect(&mOpenFile, &QAction::triggered, this, &DatabaseCommands::askForFile);
    connect(&mConnect, &QAction::triggered, this, &DatabaseCommands::askForConnection);
    connect(&mReconnect, &QAction::triggered, this, &DatabaseCommands::reconnect);
    connect(&database, &Database::opened, this, &DatabaseCommands::remember);
    mReconnect.setEnabled(false);
}

void DatabaseCommands::addTo(QMenu& menu) {
    auto* const recent = new RecentMenu(mRecent, &menu);
    connect(recent, &RecentMenu::chosen, this, &DatabaseCommands::openAddress);
    menu.addAction(&mOpenFile);
    menu.addAction(&mConnect);
    menu.addMenu(recent);
    menu.addSeparator();
    menu.addAction(&mReconnect);
}

void DatabaseCommands::remember() {
    mReconnect.setEnabled(mDatabase.isOpen());
    if (!mDatabase.isOpen()) return;
    mRecent.add(mDatabase.address());
    mFile.setDatabaseAddress(mDatabase.address());
}

void DatabaseCommands::begin() {
    mFile.startNew();
    mFile.setDatabaseAddress(mDatabase.address());
}

void DatabaseCommands::openAddress(const QString& address) {
    if (!mFiles.mayLose()) return;
    const Opening opening = openAskingForPassword(mDatabase, address, &mWindow);
    if (!opening.error.isEmpty()) PlainBox::warn(&mWindow, tr("Open database"), opening.error);
    if (opening.opened) begin();
}

QString DatabaseCommands::openAtFirst(const QString& address) {
    const Opening opening = openAskingForPassword(mDatabase, address, &mWindow);
    if (opening.opened) return {};
    return opening.error.isEmpty() ? tr("The database was not opened.") : opening.error;
}

void DatabaseCommands::followFile() {
    const auto address = mFile.databaseAddress();
    if (!address || (mDatabase.isOpen() && *address == mDatabase.address())) return;
    const Opening opening = openAskingForPassword(mDatabase, *address, &mWindow);
    if (opening.opened) return;
    if (mDatabase.isOpen()) mDatabase.close(); // the query is not to run on another one
    PlainBox box(QMessageBox::Warning, tr("Open database"),
                 tr("The query is open, but not its database. %1").arg(opening.error).trimmed(),
                 QMessageBox::Close, &mWindow);
    const auto* again = box.addButton(tr("&Try again"), QMessageBox::AcceptRole);
    const auto* another = box.addButton(tr("&Choose database\u2026"), QMessageBox::AcceptRole);
    box.exec();
    if (box.clickedButton() == again) return followFile();
    if (box.clickedButton() != another) return;
    // The query keeps what it has; it may have moved.
    ConnectionDialog dialog(mDatabase, &mWindow);
    dialog.setAddress(*address);
    dialog.exec();
}

void DatabaseCommands::askForFile() {
    const QString path = QFileDialog::getOpenFileName(
        &mWindow, tr("Open SQLite file"), {},
        tr("SQLite databases (*.sqlite *.sqlite3 *.db *.db3);;All files (*)"));
    if (!path.isEmpty()) openAddress(path);
}

void DatabaseCommands::askForConnection() {
    if (!mFiles.mayLose()) return;
    ConnectionDialog dialog(mDatabase, &mWindow);
    // It is a server that is asked for; most often another database of the same one.
    dialog.setAddress(mDatabase.isServer() ? mDatabase.address()
                                           : QStringLiteral("postgresql://localhost"));
    if (dialog.exec() == QDialog::Accepted) begin();
}

void DatabaseCommands::reconnect() {
    const Opening opening = renewPatiently(mDatabase, &mWindow);
    if (!opening.error.isEmpty()) PlainBox::warn(&mWindow, tr("Reconnect"), opening.error);
}

} // namespace zandor::designer
