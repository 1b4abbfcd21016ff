#include "designer/DesignerWindow.h"

#include "designer/Banner.h"
#include "designer/Colours.h"
#include "designer/DatabaseCommands.h"
#include "designer/EndingSignals.h"
#include "designer/GridHint.h"
#include "designer/Invitation.h"
#include "designer/OpenedQuery.h"
#include "designer/PlainBox.h"
#include "designer/Screen.h"
#include "designer/canvasSize.h"
#include "designer/chart/ChartPanel.h"
#include "designer/database/ConnectionBanner.h"
#include "designer/database/droppedDatabase.h"
#include "designer/document/Autosave.h"
#include "designer/document/FileDialogs.h"
#include "designer/document/RecentMenu.h"
#include "designer/document/Recovery.h"
#include "designer/options/EventPanel.h"
#include "designer/options/OptionsDialog.h"
#include "designer/properties/ColumnPanel.h"
#include "designer/properties/MenuQuestions.h"
#include "designer/properties/QueryPanel.h"
#include "designer/properties/TotalCommands.h"
#include "designer/run/ResultsPanel.h"
#include "designer/show/ShowCommands.h"
#include "designer/statement/FindingPlace.h"
#include "designer/statement/ModelWords.h"
#include "designer/statement/SqlCommands.h"
#include "designer/statement/StatementPanel.h"
#include "designer/tables/MissingTables.h"
#include "designer/tables/RenameDialog.h"
#include "designer/tables/SavedQueryCommands.h"
#include "designer/tables/TableAdding.h"
#include "designer/tables/TableDropTarget.h"
#include "designer/tables/TablesPanel.h"
#include "frontends/qt/ShownText.h"

#include <QApplication>
#include <QCloseEvent>
#include <QDockWidget>
#include <QLabel>
#include <QLineEdit>
#include <QMenuBar>
#include <QMimeData>
#include <QPushButton>
#include <QScreen>
#include <QStatusBar>
#include <QToolButton>
#include <QVBoxLayout>

namespace zandor::designer {

namespace {

constexpr QSize newSize(1340, 800);   // logical pixels
constexpr QSize aroundWindow(16, 40); // what a desktop puts around a window, more or less
constexpr int layoutVersion = 1;      // another number forgets where the panels were
constexpr int messageTime = 10'000;   // milliseconds

QString paneShareKey() { return QStringLiteral("window/paneShare"); }
QString geometryKey() { return QStringLiteral("window/geometry"); }
QString darkKey() { return QStringLiteral("window/dark"); }
QString layoutKey() { return QStringLiteral("window/layout"); }

} // namespace

DesignerWindow::DesignerWindow()
    : mUnsafe(new Banner), mNotOpened(new Banner), mCounts(new QLabel),
      mDrawing(new DrawingArea(mDocument)),
      mFiles(new FileDialogs(mDocument, mFile, mRecentQueries, *this)),
      mDatabases(new DatabaseCommands(mDatabase, mFile, *mFiles, mRecentDatabases, *this)),
      mShow(new ShowCommands(mDocument, mFile, *mDrawing, mSettings, *this)) {
    mDrawing->setOptions(ControlOptions::read(mSettings).properties());
    mDrawing->setPaneShare(mSettings.value(paneShareKey(), 0.6).toDouble());
    connect(mDrawing, &DrawingArea::paneShareChanged, this,
            [this](double share) { mSettings.setValue(paneShareKey(), share); });
    connect(mDrawing, &DrawingArea::renameRequested, this,
            [this](const QString& key) { RenameDialog(mDocument, this, key).exec(); });
    auto* const middle = new QWidget;
    auto* const layout = new QVBoxLayout(middle);
    layout->setContentsMargins({});
    layout->setSpacing(0);
    layout->addWidget(mUnsafe);
    layout->addWidget(mNotOpened);
    layout->addWidget(new ConnectionBanner(mDatabase));
    layout->addWidget(mDrawing, 1);
    setCentralWidget(middle);
    mUnsafe->setObjectName(QStringLiteral("unsafe"));
    mNotOpened->setObjectName(QStringLiteral("notOpened"));
    mCounts->setObjectName(QStringLiteral("counts"));
    // Permanent, so that a message leaves it its place. What is cut off of one is in the tip.
    statusBar()->addPermanentWidget(mCounts);
    connect(statusBar(), &QStatusBar::messageChanged, statusBar(), &QWidget::setToolTip);
    setAcceptDrops(true);
    makePanels();
    mAdding = new TableAdding(mDocument, mDatabase, *mDrawing);
    mStatement->takeTyping(mDatabase, [this](model::Query& query) {
        mAdding->become(StatementTyping::tr("Change the SQL"), query);
    });
    mSql = new SqlCommands({mDocument, mDatabase, mFile, *mFiles, *mAdding, *mStatement, *mDrawing},
                           *this);
    mSavedQueries = new SavedQueryCommands(mDocument, mFile, *mFiles, *mAdding, this);
    makeMenus();
    connectParts();
    // Off screen there is no edge that a window could reach beyond.
    const QSize room = screen()->availableSize() - aroundWindow;
    const bool large = isOffscreen() || newSize == newSize.boundedTo(room);
    resize(large ? newSize : newSize.boundedTo(room));
    if (!large) setWindowState(Qt::WindowMaximized);
    restoreLayout();
    showTitle();
    showCounts();
    offerCommands();
}

DesignerWindow::~DesignerWindow() {
    // Before the document and the database that they look at.
    mAutosave.reset();
    qDeleteAll(findChildren<QDockWidget*>(Qt::FindDirectChildrenOnly));
    delete takeCentralWidget();
}

void DesignerWindow::makePanels() {
    // The panels at the side keep their height when one is opened below.
    setCorner(Qt::BottomLeftCorner, Qt::LeftDockWidgetArea);
    mTables = new TablesPanel(mDatabase);
    mStatement = new StatementPanel(mDocument);
    mResults = new ResultsPanel(mDocument, mDatabase);
    mEvents = new EventPanel;
    mCurrentColumn = new CurrentColumn(mDocument, *mDrawing, this);
    mTotals = new TotalCommands(mDocument, *mCurrentColumn, this);
    mColumn = new ColumnPanel(mDocument, *mCurrentColumn);
    mQueryPanel = new QueryPanel(mDocument);
    dock(mTables, QStringLiteral("tablesDock"), tr("Tables"), Qt::LeftDockWidgetArea);
    // Below the tables, once they are asked for.
    QDockWidget* const column =
        dock(mColumn, QStringLiteral("columnDock"), tr("Column"), Qt::LeftDockWidgetArea);
    QDockWidget* const query =
        dock(mQueryPanel, QStringLiteral("queryDock"), tr("Query"), Qt::LeftDockWidgetArea);
    tabifyDockWidget(column, query);
    column->hide();
    query->hide();
    QDockWidget* const statement =
        dock(mStatement, QStringLiteral("statementDock"), tr("SQL"), Qt::BottomDockWidgetArea);
    QDockWidget* const results =
        dock(mResults, QStringLiteral("resultsDock"), tr("Rows"), Qt::BottomDockWidgetArea);
    QDockWidget* const events =
        dock(mEvents, QStringLiteral("eventsDock"), tr("Events"), Qt::BottomDockWidgetArea);
    // The last one lies on top.
    tabifyDockWidget(events, results);
    tabifyDockWidget(results, statement);
    events->hide();
    resizeDocks({findChild<QDockWidget*>(QStringLiteral("tablesDock"))}, {220}, Qt::Horizontal);
    // On a small screen the drawing needs the room more.
    const int quarter = (isOffscreen() ? newSize.height() : screen()->availableSize().height()) / 4;
    resizeDocks({statement}, {std::min(220, quarter)}, Qt::Vertical);
    for (const QAction* action : {mResults->runAction(), mResults->exportAction()})
        connect(action, &QAction::triggered, results, [results] {
            results->show();
            results->raise();
        });
}

QDockWidget* DesignerWindow::dock(QWidget* panel, const QString& name, const QString& title,
                                  Qt::DockWidgetArea area) {
    auto* const dock = new QDockWidget(title, this);
    dock->setObjectName(name);
    dock->setWidget(panel);
    addDockWidget(area, dock);
    return dock;
}

void DesignerWindow::makeMenus() {
    const auto add = [this](const QString& title, const char* name) {
        QMenu* const menu = menuBar()->addMenu(title);
        menu->setObjectName(QLatin1String(name));
        return menu;
    };
    const auto command = [this](QMenu* menu, const QString& text, const char* name, auto what) {
        QAction* const action = menu->addAction(text);
        action->setObjectName(QLatin1String(name));
        connect(action, &QAction::triggered, this, what);
        return action;
    };

    QMenu* const file = add(tr("&File"), "fileMenu");
    auto* const recent = new RecentMenu(mRecentQueries, file);
    connect(recent, &RecentMenu::chosen, mFiles,
            [this](const QString& path) { mFiles->open(path); });
    command(file, tr("&New query"), "new", [this] {
        mFiles->startNew();
    })->setShortcut(QKeySequence::New);
    command(file, tr("&Open query\u2026"), "open", [this] {
        mFiles->open();
    })->setShortcut(QKeySequence::Open);
    file->addMenu(recent);
    file->addAction(&mSql->openFile);
    file->addSeparator();
    command(file, tr("&Save"), "save", [this] { mFiles->save(); })->setShortcut(QKeySequence::Save);
    command(file, tr("Save &as\u2026"), "saveAs", [this] {
        mFiles->saveAs();
    })->setShortcut(QKeySequence::SaveAs);
    file->addAction(&mSql->saveAs);
    file->addSeparator();
    file->addAction(&mShow->exportPicture);
    file->addAction(&mShow->print);
    file->addAction(&mShow->allColumns);
    file->addSeparator();
    command(file, tr("&Quit"), "quit", [this] { close(); })->setShortcut(QKeySequence::Quit);

    QMenu* const edit = add(tr("&Edit"), "editMenu");
    QAction* const undo = mDocument.makeUndoAction(this);
    QAction* const redo = mDocument.makeRedoAction(this);
    undo->setObjectName(QStringLiteral("undo"));
    redo->setObjectName(QStringLiteral("redo"));
    edit->addActions({undo, redo});
    edit->addSeparator();
    edit->addAction(&mShow->copyPicture);
    mTableCommands.push_back(
        command(edit, tr("Copy &SQL"), "copySql", [this] { mStatement->copy(); }));
    edit->addAction(&mSql->paste);
    edit->addSeparator();
    command(edit, tr("&Options\u2026"), "options", &DesignerWindow::showOptions);

    mDatabases->addTo(*add(tr("&Database"), "databaseMenu"));

    QMenu* const query = add(tr("&Query"), "queryMenu");
    mResults->runAction()->setObjectName(QStringLiteral("run"));
    mResults->cancelAction()->setObjectName(QStringLiteral("cancel"));
    mResults->exportAction()->setObjectName(QStringLiteral("exportRows"));
    query->addAction(mResults->runAction());
    query->addAction(mResults->cancelAction());
    query->addAction(mResults->exportAction());
    query->addSeparator();
    mResults->chartAction()->setObjectName(QStringLiteral("chartShown"));
    query->addAction(mResults->chartAction());
    query->addSeparator();
    QAction* const arrange =
        command(query, tr("&Arrange tables"), "arrange", [this] { mAdding->arrange(); });
    arrange->setShortcut(Qt::CTRL | Qt::SHIFT | Qt::Key_A);
    mTableCommands.push_back(arrange);
    mTableCommands.push_back(
        command(query, tr("Re&name table\u2026"), "rename", &DesignerWindow::renameTable));
    query->addSeparator();
    query->addActions({&mSavedQueries->addQuery, &mSavedQueries->readAgain});
    query->addSeparator();
    query->addMenu(&mTotals->menu());
    menuBar()->setCornerWidget(makeCorner());

    QMenu* const view = add(tr("&View"), "viewMenu");
    QAction* const dark = view->addAction(tr("&Dark colours"));
    dark->setObjectName(QStringLiteral("dark"));
    dark->setCheckable(true);
    // They may have been asked for on the command line, for this once.
    if (mSettings.value(darkKey()).toBool()) useDarkColours();
    dark->setChecked(areDarkColoursUsed());
    connect(dark, &QAction::toggled, this, [this](bool on) {
        mSettings.setValue(darkKey(), on);
        on ? useDarkColours() : useOwnColours();
    });
    view->addSeparator();
    command(view, tr("&Find table"), "findTable", [this] {
        mTables->parentWidget()->show();
        mTables->filterBox().setFocus();
        mTables->filterBox().selectAll();
    })->setShortcut(QKeySequence::Find);
    // From anywhere to anywhere without a long row of Tabs.
    QMenu* const go = view->addMenu(tr("&Go to"));
    go->setObjectName(QStringLiteral("goMenu"));
    command(go, tr("&Drawing"), "goDrawing", [this] {
        mDrawing->control().setFocus(Qt::TabFocusReason);
        for (const auto& table :
             platform::Each<TalvikZandorLib::ZDTable>(mDocument.query()->Tables()))
            if (table->Selected() != 0)
                mDrawing->control().SetCurrentTable(QString::fromStdU16String(table->Name()));
    })->setShortcut(Qt::CTRL | Qt::Key_1);
    const auto goTo = [&](const QString& text, const char* name, Qt::Key key, QWidget* panel) {
        command(go, text, name, [this, panel] { this->goTo(*panel); })->setShortcut(Qt::CTRL | key);
    };
    goTo(tr("&Tables"), "goTables", Qt::Key_2, mTables);
    goTo(tr("&SQL"), "goStatement", Qt::Key_3, mStatement);
    goTo(tr("&Rows"), "goResults", Qt::Key_4, mResults);
    connect(go->actions().last(), &QAction::triggered, mResults, &ResultsPanel::goToTable);
    goTo(tr("&Chart"), "goChart", Qt::Key_5, mResults);
    connect(go->actions().last(), &QAction::triggered, mResults, &ResultsPanel::goToChart);
    goTo(tr("C&olumn"), "goColumn", Qt::Key_6, mColumn);
    goTo(tr("&Query"), "goQuery", Qt::Key_7, mQueryPanel);
    view->addSeparator();
    const auto panel = [&](const QString& text, const char* name) {
        QAction* const action = findChild<QDockWidget*>(QLatin1String(name))->toggleViewAction();
        action->setText(text);
        action->setObjectName(QLatin1String(name) + QStringLiteral("Shown"));
        view->addAction(action);
    };
    panel(tr("&Tables"), "tablesDock");
    panel(tr("&SQL"), "statementDock");
    panel(tr("&Rows"), "resultsDock");
    panel(tr("C&olumn"), "columnDock");
    panel(tr("&Query"), "queryDock");
    panel(tr("&Events"), "eventsDock");

    QMenu* const help = add(tr("&Help"), "helpMenu");
    command(help, tr("&Criteria"), "helpCriteria", [this] {
        showHelp(HelpWindow::Page::criteria);
    })->setShortcut(QKeySequence::HelpContents);
    command(help, tr("&Keys"), "helpKeys", [this] { showHelp(HelpWindow::Page::keys); });
    help->addSeparator();
    command(help, tr("&About"), "about", &DesignerWindow::about);
}

/// In sight whatever panel is in front.
QWidget* DesignerWindow::makeCorner() {
    auto* const corner = new QWidget;
    auto* const layout = new QHBoxLayout(corner);
    layout->setContentsMargins({});
    layout->setSpacing(2);
    auto* const totals = new QToolButton;
    totals->setObjectName(QStringLiteral("totals"));
    totals->setText(QStringLiteral("\u03a3 ")); // apart from the arrow
    totals->setToolTip(tr("Total of the output column that the grid is in (Ctrl+T)"));
    totals->setAccessibleName(tr("Total"));
    totals->setShortcut(Qt::CTRL | Qt::Key_T);
    totals->setMenu(&mTotals->menu());
    totals->setPopupMode(QToolButton::InstantPopup);
    auto* const run = new QToolButton;
    run->setObjectName(QStringLiteral("runButton"));
    run->setDefaultAction(mResults->runAction());
    run->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
    for (QToolButton* button : {totals, run}) {
        button->setAutoRaise(true);
        button->setFocusPolicy(Qt::TabFocus); // a click leaves the keyboard where it is
        button->setMaximumHeight(menuBar()->sizeHint().height() - 2);
        layout->addWidget(button);
    }
    connect(mCurrentColumn, &CurrentColumn::changed, totals,
            [this, totals] { totals->setEnabled(mTotals->menu().isEnabled()); });
    totals->setEnabled(mTotals->menu().isEnabled());
    return corner;
}

void DesignerWindow::goTo(QWidget& panel) {
    panel.parentWidget()->show();
    panel.parentWidget()->raise();
    panel.setFocus(Qt::ShortcutFocusReason);
}

void DesignerWindow::connectParts() {
    const auto questions = std::make_shared<MenuQuestions>(
        *mTotals, JoinCommands(mDocument, *mDrawing), [this] { goTo(*mColumn); });
    const auto ask = [questions](ZandorWidget* control) { control->setQuestions(questions); };
    connect(mDrawing, &DrawingArea::controlMade, this, ask);
    ask(&mDrawing->control());
    auto* const target = new TableDropTarget(*mDrawing);
    new GridHint(mDocument, *mDrawing);
    new Invitation(mDocument, mDatabase, *mDrawing);
    new MissingTables(mDocument, mDatabase, *mDrawing);
    connect(mTables, &TablesPanel::chosen, mAdding,
            [this](const std::vector<reader::TableId>& tables) { mAdding->add(tables); });
    connect(target, &TableDropTarget::dropped, mAdding, &TableAdding::add);
    connect(mAdding, &TableAdding::added, this, &DesignerWindow::showTable);
    connect(mAdding, &TableAdding::noted, this, &DesignerWindow::tell);
    connect(mAdding, &TableAdding::refused, this,
            [this](const QString& why) { PlainBox::warn(this, tr("Add tables"), why); });

    connect(mSavedQueries, &SavedQueryCommands::noted, this, &DesignerWindow::tell);
    connect(mSavedQueries, &SavedQueryCommands::refused, this,
            [this](const QString& why) { PlainBox::warn(this, tr("Add saved query"), why); });

    connect(mSql, &SqlCommands::refused, this, [this] { goTo(*mStatement); });
    connect(mStatement, &StatementPanel::findingChosen, this,
            [this](const model::Finding& finding) {
                showPlace(mDrawing->control(), *mDocument.query(), finding);
                if (isOfColumn(finding)) goTo(*mColumn);
            });
    connect(mStatement, &StatementPanel::findingsChanged, mDrawing, &DrawingArea::showFindings);
    mEvents->watch(&mDrawing->control());
    connect(mDrawing, &DrawingArea::controlMade, mEvents, &EventPanel::watch);

    connect(&mDatabase, &Database::opened, this, [this] {
        mStatement->setDatabaseDialect(mDatabase.dialect());
        showTitle();
    });
    connect(&mFile, &QueryFile::changed, this, &DesignerWindow::showTitle);
    connect(&mFile, &QueryFile::changed, mResults, [this] {
        mResults->proposeFile(mFile.besideWith(QStringLiteral("csv")));
        mResults->chart().proposeFile(mFile.besideWith(QStringLiteral("chart.png")));
    });
    connect(mFiles, &FileDialogs::saved, this,
            [this] { tell(tr("Saved as %1.").arg(platform::qt::asSigns(mFile.name()))); });
    connect(mFiles, &FileDialogs::opened, this, &DesignerWindow::followFile);
    connect(mFiles, &FileDialogs::opened, mSavedQueries, &SavedQueryCommands::followFiles);
    connect(&mDocument, &Document::replaced, statusBar(), &QStatusBar::clearMessage);
    connect(mFiles, &FileDialogs::gone, this,
            [this](const QString& message) { statusBar()->showMessage(message); });
    connect(mUnsafe->addButton(tr("Save &as\u2026"), QStringLiteral("saveUnsafe")),
            &QPushButton::clicked, mFiles, &FileDialogs::saveAs);
    mAgain = mNotOpened->addButton(tr("&Try again"), QStringLiteral("tryAgain"));
    connect(&mDatabase, &Database::opened, mNotOpened, &QWidget::hide);
    connect(mFiles, &FileDialogs::opened, mNotOpened, &QWidget::hide);
    connect(mResults->runAction(), &QAction::triggered, &mDatabase, &Database::look);
    connect(&mDocument, &Document::changed, this, &DesignerWindow::showCounts);
    connect(&mDocument, &Document::changed, this, &DesignerWindow::offerCommands);
    connect(&mDocument, &Document::changed, this, &DesignerWindow::warnOfFullGrid);
}

std::optional<QString> DesignerWindow::openAtFirst(const Arguments& arguments,
                                                   const QString& sample) {
    if (arguments.file.endsWith(QLatin1String(".json"), Qt::CaseInsensitive)) {
        if (auto error = mFile.open(arguments.file)) return error;
        followFile();
        mSavedQueries->followFiles();
        return {};
    }
    const bool isSample = arguments.file.isEmpty();
    const QString address = isSample ? sample : arguments.file;
    const QString error = mDatabases->openAtFirst(address);
    if (!error.isEmpty()) return error;
    const auto opened =
        openQuery(mDatabase.reader(), mDatabase.tables(),
                  {arguments.tables, isSample, address, mDrawing->width() * twipsPerPixel});
    if (!opened) return inWords(opened.failure());
    mDocument.setQuery(opened->query);
    mAdding->takeAsArranged();
    tell(opened->message);
    return {};
}

void DesignerWindow::keepSafe(const QString& folder) {
    mAutosave = std::make_unique<Autosave>(mDocument, mFile, folder);
    connect(mAutosave.get(), &Autosave::failed, mUnsafe,
            [this](const QString& message) { mUnsafe->say(message); });
    connect(mAutosave.get(), &Autosave::worked, mUnsafe, &QWidget::hide);
    mAutosave->setTyping([this](const platform::Ref<model::Query>& copy) {
        return mDrawing->control().writeTyping(copy);
    });
    connect(new EndingSignals(this), &EndingSignals::ending, this, &DesignerWindow::saveForTheEnd);
    connect(qGuiApp, &QGuiApplication::commitDataRequest, this, &DesignerWindow::saveForTheEnd);
    if (offerRecovery(mFile, *mAutosave, folder, this)) followFile();
}

void DesignerWindow::followFile() {
    mDatabases->followFile();
    mStatement->typing()->readReplaced();
    if (!mDocument.typed()) return;
    mStatement->parentWidget()->show(); // where one sees that the drawing sleeps
    mStatement->parentWidget()->raise();
}

void DesignerWindow::tell(const QString& message) {
    statusBar()->showMessage(message, messageTime);
}

/// Nobody can be asked any more.
void DesignerWindow::saveForTheEnd() {
    if (!mAutosave) return;
    if (const auto error = mAutosave->saveAtOnce()) shell::complain(*error);
}

void DesignerWindow::offerAgain(const QString& error, const Arguments& arguments,
                                const QString& sample) {
    mNotOpened->say(error);
    mAgain->disconnect();
    connect(mAgain, &QPushButton::clicked, this, [this, arguments, sample] {
        if (const auto again = openAtFirst(arguments, sample))
            mNotOpened->say(*again);
        else
            mNotOpened->hide();
    });
}

bool DesignerWindow::event(QEvent* event) {
    // After the event, for there may be questions.
    if (event->type() == QEvent::WindowActivate)
        QMetaObject::invokeMethod(this, &DesignerWindow::lookAround, Qt::QueuedConnection);
    return QMainWindow::event(event);
}

/// Other programs may have been at work meanwhile.
void DesignerWindow::lookAround() {
    if (QApplication::activeModalWidget()) return;
    mDatabase.look();
    mFiles->lookAtFile();
}

void DesignerWindow::closeEvent(QCloseEvent* event) {
    mStatement->typing()->readNow();
    if (!mFiles->mayLose()) return event->ignore();
    mResults->cancel();
    mSettings.setValue(geometryKey(), saveGeometry());
    mSettings.setValue(layoutKey(), saveState(layoutVersion));
    mAutosave.reset();
    event->accept();
}

void DesignerWindow::restoreLayout() {
    restoreGeometry(mSettings.value(geometryKey()).toByteArray());
    restoreState(mSettings.value(layoutKey()).toByteArray(), layoutVersion);
}

void DesignerWindow::dragEnterEvent(QDragEnterEvent* event) {
    const QMimeData& data = *event->mimeData();
    if (droppedDatabase(data) || (mDatabase.isOpen() && droppedStatement(data)))
        event->acceptProposedAction();
}

void DesignerWindow::dropEvent(QDropEvent* event) {
    const auto database = droppedDatabase(*event->mimeData());
    const auto statement = droppedStatement(*event->mimeData());
    if (!database && !statement) return;
    event->acceptProposedAction();
    // After the drop, for there may be questions.
    const auto open = [this, database, statement] {
        if (database)
            mDatabases->openAddress(*database);
        else if (mFiles->mayLose())
            mSql->openFrom(*statement);
    };
    QMetaObject::invokeMethod(this, open, Qt::QueuedConnection);
}

/// Brings a table into view, and leaves the keyboard where it is.
void DesignerWindow::showTable(const QString& name) {
    const auto table = mDocument.query()->tableNamed(name.toStdU16String());
    if (!table) return;
    // With what it is joined to, as far as there is room.
    for (const auto& join : platform::Each<TalvikZandorLib::ZDJoin>(mDocument.query()->Joins()))
        for (const auto& [one, other] : {std::pair(join->LeftTable(), join->RightTable()),
                                         std::pair(join->RightTable(), join->LeftTable())})
            if (one == table && other) bringIntoView(mDrawing->control(), *other);
    const QPointer<QWidget> typing = focusWidget();
    model::Finding finding{};
    finding.table = table->Key();
    showPlace(mDrawing->control(), *mDocument.query(), finding);
    if (typing) typing->setFocus();
}

void DesignerWindow::showTitle() {
    const QString mark = QStringLiteral("[*]");
    // In a name it means itself.
    const auto shown = [&](const QString& name) {
        return platform::qt::asSigns(name).replace(mark, mark + mark);
    };
    QStringList parts{shown(mFile.name()) + mark};
    if (mDatabase.isOpen()) parts += shown(mDatabase.name());
    parts += QStringLiteral("Zandor Designer");
    setWindowTitle(parts.join(QStringLiteral(" \u2014 ")));
}

void DesignerWindow::showCounts() {
    model::Query& query = *mDocument.query();
    mCounts->setText(
        tr("Tables: %1   Joins: %2").arg(query.Tables().Count()).arg(query.Joins().Count()));
}

void DesignerWindow::offerCommands() {
    const bool drawn = mDocument.query()->Tables().Count() > 0;
    for (QAction* command : mTableCommands) command->setEnabled(drawn);
}

/// What is added to a full grid takes the place of its last column.
void DesignerWindow::warnOfFullGrid() {
    const bool full = mDocument.query()->ColumnDefinitions().Count() >= mostOutputColumns;
    if (full && !mWarnedOfFullGrid)
        PlainBox::warn(this, tr("Output columns"),
                       tr("The grid shows %1 output columns and is full. Delete one before you "
                          "add another; it would take the place of the last.")
                           .arg(mostOutputColumns));
    mWarnedOfFullGrid = full;
}

void DesignerWindow::showOptions() {
    OptionsDialog dialog(mSettings, this);
    connect(&dialog, &OptionsDialog::applied, this,
            [this](const ControlOptions& options) { mDrawing->setOptions(options.properties()); });
    dialog.exec();
}

void DesignerWindow::renameTable() { RenameDialog(mDocument, this).exec(); }

void DesignerWindow::showHelp(HelpWindow::Page page) {
    if (!mHelp) mHelp = new HelpWindow(this);
    mHelp->showPage(page);
}

void DesignerWindow::about() {
    PlainBox(QMessageBox::Information, tr("About Zandor Designer"),
             tr("Zandor Designer %1\n\nDraw a query, read its SQL, run it. The database is "
                "only read.")
                 .arg(QStringLiteral(ZANDOR_VERSION)),
             QMessageBox::Ok, this)
        .exec();
}

} // namespace zandor::designer
