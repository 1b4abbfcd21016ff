#include "designer/statement/SqlCommands.h"

#include "designer/PlainBox.h"
#include "designer/database/patiently.h"
#include "designer/database/readTables.h"
#include "designer/document/Document.h"
#include "designer/document/FileDialogs.h"
#include "designer/document/QueryFile.h"
#include "designer/document/paths.h"
#include "designer/statement/ModelWords.h"
#include "designer/statement/StatementPanel.h"
#include "designer/statement/readStatementFile.h"
#include "designer/tables/TableAdding.h"

#include <Zandor/files/Replacement.h>

#include <QClipboard>
#include <QFileDialog>
#include <QFileInfo>
#include <QGuiApplication>
#include <QMimeData>
#include <QRegularExpression>
#include <QShortcut>
#include <QUrl>

namespace zandor::designer {

namespace {

QStringList statementFilters() {
    return {SqlCommands::tr("SQL statements (*.sql)"), SqlCommands::tr("All files (*)")};
}

} // namespace

SqlCommands::SqlCommands(const Parts& parts, QWidget& window)
    : QObject(&window), openFile(tr("Open SQ&L\u2026")), paste(tr("Paste S&QL")),
      saveAs(tr("Sa&ve SQL as\u2026")), mParts(parts), mWindow(window) {
    openFile.setObjectName(QStringLiteral("openSql"));
    paste.setObjectName(QStringLiteral("pasteSql"));
    saveAs.setObjectName(QStringLiteral("saveSqlAs"));
    paste.setShortcut(Qt::CTRL | Qt::SHIFT | Qt::Key_V);
    connect(&openFile, &QAction::triggered, this, &SqlCommands::askForFile);
    connect(&paste, &QAction::triggered, this, &SqlCommands::pasteText);
    connect(&saveAs, &QAction::triggered, this, &SqlCommands::save);
    // In the drawing, too, where nothing else is pasted by that key.
    auto* const inDrawing = new QShortcut(QKeySequence::Paste, &mParts.drawing, nullptr, nullptr,
                                          Qt::WidgetWithChildrenShortcut);
    connect(inDrawing, &QShortcut::activated, this, [this] {
        if (looksLikeStatement(QGuiApplication::clipboard()->text())) paste.trigger();
    });
    const auto offer = [this] {
        const bool open = mParts.database.isOpen();
        openFile.setEnabled(open);
        paste.setEnabled(open);
    };
    connect(&mParts.database, &Database::opened, this, offer);
    offer();
}

void SqlCommands::askForFile() {
    if (!mParts.files.mayLose()) return;
    QFileDialog dialog(&mWindow, tr("Open SQL"));
    dialog.setNameFilters(statementFilters());
    dialog.setFileMode(QFileDialog::ExistingFile);
    if (dialog.exec() == QDialog::Accepted) openFrom(dialog.selectedFiles().value(0));
}

void SqlCommands::openFrom(const QString& path) {
    const QString title = tr("Open SQL");
    const auto text = readStatementFile(path);
    if (!text) return PlainBox::warn(&mWindow, title, text.failure().message);
    if (!readTablesOf(*text)) return;
    auto query = readStatement(
        *text, {mParts.database.reader(), mParts.database.tables(), mParts.panel.dialect()});
    if (!query) {
        mParts.panel.type(*text);
        return tell(title);
    }
    mParts.file.startNew();
    mParts.adding.open(*query);
    mParts.document.setModified(true);
}

void SqlCommands::pasteText() {
    const QString text = QGuiApplication::clipboard()->text();
    if (text.trimmed().isEmpty())
        return PlainBox::warn(&mWindow, tr("Paste SQL"),
                              tr("The clipboard has no text; copy a SELECT statement first."));
    if (!readTablesOf(text)) return;
    mParts.panel.type(text);
    tell(tr("Paste SQL"));
}

/// What the panel has to say, if it could not draw the text.
void SqlCommands::tell(const QString& title) {
    const auto why = mParts.panel.typing()->refusal();
    if (!why) return;
    emit refused();
    PlainBox::warn(&mWindow, title, why->withPlace());
}

/// So that nothing waits for a server then. False when the user has cancelled it or it failed.
bool SqlCommands::readTablesOf(const QString& text) {
    Database& database = mParts.database;
    if (!database.isOpen()) return false;
    const Wanted wanted = unknownOf(database, {tablesNamedIn(text, database.tables()), {}});
    if (!database.isServer() || wanted.empty()) return true;
    const auto read = patiently<TablesRead>(
        TableAdding::tr("Reading the tables\u2026"), &mWindow,
        [connect = database.connector(), wanted] { return readTables(connect, wanted); });
    if (!read) return false;
    const auto error = takeTables(database, *read);
    if (error) PlainBox::warn(&mWindow, tr("Open SQL"), inWords(*error));
    return !error;
}

void SqlCommands::save() {
    QFileDialog dialog(&mWindow, tr("Save SQL"));
    dialog.setNameFilters(statementFilters());
    dialog.setDefaultSuffix(QStringLiteral("sql"));
    dialog.setAcceptMode(QFileDialog::AcceptSave);
    const QString beside = mParts.file.besideWith(QStringLiteral("sql"));
    dialog.selectFile(beside.isEmpty() ? tr("statement.sql") : beside);
    if (dialog.exec() != QDialog::Accepted) return;
    const QString text = mParts.panel.text() + QLatin1Char('\n');
    const auto error =
        files::replaceFile(pathOf(dialog.selectedFiles().value(0)), text.toStdString());
    if (error) PlainBox::warn(&mWindow, tr("Save SQL"), inWords(*error));
}

std::optional<QString> droppedStatement(const QMimeData& data) {
    const QList<QUrl> urls = data.urls();
    if (urls.size() != 1 || !urls.front().isLocalFile()) return {};
    const QString path = urls.front().toLocalFile();
    const bool isOne = path.endsWith(QLatin1String(".sql"), Qt::CaseInsensitive);
    return isOne && QFileInfo(path).isFile() ? std::optional(path) : std::nullopt;
}

bool looksLikeStatement(const QString& text) {
    static const QRegularExpression begin(
        QStringLiteral("^(\\s|--[^\\n]*\\n|/\\*.*?\\*/|\\()*(select|with)\\b"),
        QRegularExpression::CaseInsensitiveOption | QRegularExpression::DotMatchesEverythingOption);
    return begin.match(text).hasMatch();
}

} // namespace zandor::designer
