#include "Contest.h"
#include "ManyTables.h"
#include "Report.h"

#include "support/PostgresServer.h"

#include <Zandor/DatabaseReader.h>
#include <Zandor/reader/Connection.h>

#include <QTemporaryDir>

namespace report {

using namespace zandor;

namespace {

/// By the wall where the engine is another process.
Figure listTables(const QString& name, const QSqlDatabase& database, bool byTheWall) {
    const auto schema = reader::makeReader(database);
    const auto times = contest(20,
                               {[&] {
                                    const auto tables = schema->tables();
                                    if (!tables || tables->size() != manytables::count)
                                        qFatal("%s", qPrintable(tables.error()));
                                },
                                [&] { manytables::listOwn(database); }},
                               byTheWall);
    return {.name = name,
            .unit = QStringLiteral("ms"),
            .ours = times[0] * 1e3,
            .theirs = times[1] * 1e3,
            .goal = 1.5};
}

} // namespace

void measureReaders(Report& report) {
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("tables.sqlite"));
    manytables::makeSqlite(path);
    const auto opened = reader::openDatabase(path);
    if (!opened) qFatal("%s", qPrintable(opened.error()));
    report.figures.push_back(listTables(QStringLiteral("list of 5,000 tables / SQLite's own"),
                                        opened->database(), false));

    const PostgresServer server;
    const reader::Connection connection(server.connect(QStringLiteral("report")));
    manytables::make(connection.database());
    report.figures.push_back(listTables(QStringLiteral("list of 5,000 tables / PostgreSQL's own"),
                                        connection.database(), true));
}

} // namespace report
