#include "designer/database/Address.h"
#include "designer/database/RememberingReader.h"
#include "designer/document/paths.h"
#include "designer/shell/Task.h"
#include "designer/shell/Words.h"
#include "designer/shell/openForTask.h"
#include "designer/statement/ModelWords.h"
#include "designer/statement/readStatementFile.h"
#include "designer/tables/placeTables.h"

#include <Zandor/QueryDocument.h>
#include <Zandor/reader/dialectOf.h>

#include <QFileInfo>
#include <QMap>

namespace zandor::designer::shell {

namespace {

constexpr int canvasWidth = 18000; // twips; the window's, more or less

const QString standardInput = QStringLiteral("-");

/// The query file of each statement; or what is wrong with their names.
reader::Result<QMap<QString, QString>> filesFor(const Task& task) {
    const bool intoFolder = task.statements.size() > 1 || QFileInfo(task.drawing).isDir();
    QMap<QString, QString> files;
    if (!intoFolder) {
        files[task.statements.front()] = task.drawing;
        return files;
    }
    if (!QFileInfo(task.drawing).isDir())
        return reader::Error{Words::tr("There is no folder \"%1\"; several statements are drawn "
                                       "into one that is there.")
                                 .arg(task.drawing)};
    QMap<QString, QString> statements; // by their files
    for (const QString& statement : task.statements) {
        if (statement == standardInput)
            return reader::Error{
                Words::tr("The standard input stream has no name; name a file to draw it into.")};
        const QString file = task.drawing + QLatin1Char('/') +
                             QFileInfo(statement).completeBaseName() + QStringLiteral(".json");
        if (statements.contains(file) && statements[file] != statement)
            return reader::Error{
                Words::tr("\"%1\" and \"%2\" would both become \"%3\"; draw them into two folders.")
                    .arg(statements[file], statement, file)};
        statements[file] = statement;
        files[statement] = file;
    }
    return files;
}

model::Result<QString, Undrawn> textOf(const QString& statement) {
    if (statement != standardInput) return readStatementFile(statement);
    QFile input;
    if (!input.open(stdin, QIODevice::ReadOnly))
        return Undrawn{Words::tr("The standard input stream cannot be read.")};
    QByteArray bytes;
    while (bytes.size() <= mostStatementBytes) {
        const QByteArray more = input.read(mostStatementBytes + 1);
        if (more.isEmpty()) break;
        bytes += more;
    }
    return statementTextOf(bytes, standardInput);
}

int drawStatement(const QString& statement, const QString& file, const StatementGround& ground,
                  const QString& address) {
    const auto text = textOf(statement);
    if (!text) return complain(text.failure().message), unusable;
    const auto query = readStatement(*text, ground);
    if (!query) {
        const Undrawn& why = query.failure();
        // As compilers say it, so that editors find the place.
        const QString place =
            why.line == 0 ? QString() : QStringLiteral("%1:%2:").arg(why.line).arg(why.column);
        complain(QStringLiteral("%1:%2 %3").arg(statement, place, why.message));
        return failed;
    }
    arrangeUnplaced(**query, canvasWidth);
    files::QueryDocument document(*query);
    document.database = address.toStdU16String();
    if (const auto error = files::saveQuery(pathOf(file), document))
        return complain(inWords(*error)), unusable;
    return allWell;
}

} // namespace

int drawStatements(const Task& task) {
    const auto files = filesFor(task);
    if (!files) return complain(inWords(files.failure())), unusable;
    const auto opened = openForTask(task.database);
    if (!opened) return complain(inWords(opened.failure())), unusable;
    RememberingReader reader(reader::makeReader(opened->connection.database()));
    const auto tables = reader.tables();
    if (!tables) return complain(inWords(tables.failure())), unusable;
    const StatementGround ground{reader, *tables, reader::dialectOf(opened->connection.database())};
    int worst = allWell;
    for (const QString& statement : task.statements)
        worst = std::max(worst, drawStatement(statement, (*files)[statement], ground,
                                              lastingAddress(opened->address)));
    return worst;
}

} // namespace zandor::designer::shell
