#pragma once

#include <QAction>
#include <QObject>

class QMenu;
class QWidget;

namespace zandor::designer {

class Database;
class FileDialogs;
class QueryFile;
class RecentFiles;

/// The commands that open databases. Another database begins a new query, so what would be lost is
/// asked about first.
class DatabaseCommands final : public QObject {
    Q_OBJECT

public:
    /// `window` is the parent of the dialogs, and of this object. All outlive it.
    DatabaseCommands(Database& database, QueryFile& file, FileDialogs& files, RecentFiles& recent,
                     QWidget& window);

    void addTo(QMenu& menu);

    /// Opens a path or URL in place of the database before; asks for a password if there has to be
    /// one, and says what goes wrong.
    void openAddress(const QString& address);
    /// The same for the program's start, with nothing to lose yet. Returns what went wrong.
    QString openAtFirst(const QString& address);
    /// Opens the database that the query's file names, if it is another than the open one; offers
    /// to choose where it is now when that fails.
    void followFile();

private:
    void askForFile();
    void askForConnection();
    void reconnect();
    void remember();
    void begin();

    Database& mDatabase;
    QueryFile& mFile;
    FileDialogs& mFiles;
    RecentFiles& mRecent;
    QWidget& mWindow;
    QAction mOpenFile;
    QAction mConnect;
    QAction mReconnect;
};

} // namespace zandor::designer
