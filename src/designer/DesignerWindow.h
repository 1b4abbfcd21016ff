#pragma once

#include "designer/Arguments.h"
#include "designer/DrawingArea.h"
#include "designer/database/Database.h"
#include "designer/document/Document.h"
#include "designer/document/QueryFile.h"
#include "designer/document/RecentFiles.h"
#include "designer/help/HelpWindow.h"

#include <QMainWindow>
#include <QSettings>

class QLabel;
class QPushButton;

namespace zandor::designer {

class Autosave;
class Banner;
class ColumnPanel;
class CurrentColumn;
class DatabaseCommands;
class EventPanel;
class FileDialogs;
class QueryPanel;
class ResultsPanel;
class ShowCommands;
class StatementPanel;
class SavedQueryCommands;
class SqlCommands;
class TableAdding;
class TablesPanel;
class TotalCommands;

/// The designer's window: the drawing, and the panels around it.
class DesignerWindow final : public QMainWindow {
    Q_OBJECT

public:
    DesignerWindow();
    ~DesignerWindow() override;

    /// Opens what the command line names: a database with the tables named, if any, or a query with
    /// its database. Nothing named opens the sample with its example. Returns what went wrong; the
    /// window is empty then.
    std::optional<QString> openAtFirst(const Arguments& arguments, const QString& sample);
    /// Says in the window what went wrong with that, and offers to try it again.
    void offerAgain(const QString& error, const Arguments& arguments, const QString& sample);
    /// Saves what is done from time to time, in a folder, and offers to go on with what a designer
    /// that was killed has left there. To be called once the window stands.
    void keepSafe(const QString& folder);

    Document& document() { return mDocument; }
    Database& database() { return mDatabase; }
    DrawingArea& drawing() { return *mDrawing; }
    ResultsPanel& results() { return *mResults; }

protected:
    bool event(QEvent* event) override;
    void closeEvent(QCloseEvent* event) override;
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dropEvent(QDropEvent* event) override;

private:
    void makePanels();
    QDockWidget* dock(QWidget* panel, const QString& name, const QString& title,
                      Qt::DockWidgetArea area);
    void makeMenus();
    QWidget* makeCorner();
    void goTo(QWidget& panel);
    void connectParts();
    void restoreLayout();
    void lookAround();
    void saveForTheEnd();
    void followFile();
    void showTable(const QString& name);
    /// In the status bar, for a while.
    void tell(const QString& message);
    void showTitle();
    void showCounts();
    void offerCommands();
    void warnOfFullGrid();
    void showOptions();
    void renameTable();
    void showHelp(HelpWindow::Page page);
    void about();

    bool mWarnedOfFullGrid = false;
    QSettings mSettings;
    Document mDocument;
    QueryFile mFile{mDocument};
    RecentFiles mRecentQueries{mSettings, QStringLiteral("queries")};
    RecentFiles mRecentDatabases{mSettings, QStringLiteral("databases")};
    Database mDatabase;
    // Children of the window.
    Banner* mUnsafe;     ///< while the changes cannot be kept safe
    Banner* mNotOpened;  ///< while what was named at first could not be opened
    QPushButton* mAgain; ///< of the latter
    QLabel* mCounts;
    DrawingArea* mDrawing;
    TablesPanel* mTables;
    StatementPanel* mStatement;
    ResultsPanel* mResults;
    EventPanel* mEvents;
    CurrentColumn* mCurrentColumn;
    TotalCommands* mTotals;
    ColumnPanel* mColumn;
    QueryPanel* mQueryPanel;
    TableAdding* mAdding;
    SavedQueryCommands* mSavedQueries;
    HelpWindow* mHelp = nullptr;          ///< made when it is asked for first
    std::vector<QAction*> mTableCommands; ///< that need a table
    FileDialogs* mFiles;
    DatabaseCommands* mDatabases;
    ShowCommands* mShow;
    SqlCommands* mSql;
    std::unique_ptr<Autosave> mAutosave;
};

} // namespace zandor::designer
