#include "Contest.h"
#include "Report.h"
#include "processes.h"

#include "designer/run/ResultTable.h"

#include <Zandor/reader/Connection.h>

#include <QSqlError>
#include <QSqlQuery>
#include <QTemporaryDir>

#include <cstdio>
#include <unistd.h>
#include <utility>

// The designer's table of rows: a million of them, each looked at, against one page. A process for
// each, for memory that one has had the other would have again.

namespace report {

using namespace zandor;

namespace {

constexpr qint64 million = 1'000'000;

void makeRows(const QString& path) {
    QSqlDatabase database =
        QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), QStringLiteral("making rows"));
    database.setDatabaseName(path);
    if (!database.open()) qFatal("%s", qPrintable(database.lastError().text()));
    const reader::Connection closes(std::exchange(database, {}));
    QSqlQuery query(closes.database());
    if (!query.exec(QStringLiteral("CREATE TABLE rows AS WITH RECURSIVE c(n) AS (SELECT 1 UNION "
                                   "ALL SELECT n + 1 FROM c WHERE n < %1) SELECT n AS id, 'row "
                                   "number ' || n AS name, n * 0.25 AS price FROM c")
                        .arg(million)))
        qFatal("%s", qPrintable(query.lastError().text()));
}

double kibibytesOf(const QString& path, qint64 count) {
    return run({QStringLiteral("--rows"), path, QStringLiteral("--count"), QString::number(count)})
        .kibibytes;
}

} // namespace

int showRows(const QString& path, qint64 count) {
    const auto spool = std::make_shared<designer::Spool>();
    const std::atomic<bool> stop = false;
    const auto outcome = designer::fetch(
        designer::Database::connectorTo(path, {}),
        {.statement = QStringLiteral("SELECT id, name, price FROM rows LIMIT %1").arg(count),
         .values = {},
         .limit = {}},
        *spool, stop);
    if (outcome.rows != count) qFatal("%s", qPrintable(outcome.message));
    designer::ResultTable table;
    table.rows().setSpool(spool);
    table.rows().refresh();
    table.resize(600, 400);
    table.show();
    const auto look = [&](qint64 row) {
        table.scrollTo(table.rows().index(static_cast<int>(row), 0));
        table.grab();
    };
    constexpr qint64 step = designer::Spool::rowsInAPage - 6; // so that no page is left out
    for (qint64 row = 0; row < count; row += step) look(row);
    for (qint64 row = count - 1; row >= 0; row -= 10 * step) look(row);
    std::printf("%.0f\n", resident());
    std::fflush(stdout);
    _exit(0);
}

void measureRows(Report& report) {
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("rows.sqlite"));
    makeRows(path);
    std::vector<double> all, page;
    for (int round = 0; round < 3; ++round) {
        all.push_back(kibibytesOf(path, million));
        page.push_back(kibibytesOf(path, designer::Spool::rowsInAPage));
    }
    report.figures.push_back(
        {.name = QStringLiteral("memory with a million rows, scrolled / one page"),
         .unit = QStringLiteral("KiB"),
         .ours = median(all),
         .theirs = median(page),
         .goal = 1.3});
}

} // namespace report
