#include "designer/run/Spool.h"
#include "designer/run/Worker.h"
#include "support/PostgresServer.h"

#include <Zandor/QueryDocument.h>
#include <Zandor/reader/Connection.h>

#include <QApplication>
#include <QEventLoop>
#include <QProcess>
#include <QSqlError>
#include <QSqlQuery>
#include <QTemporaryDir>

#include <benchmark/benchmark.h>

#include <chrono>

using namespace zandor;

// The designer's ways to the first rows beside the engine's own, turn by turn in one run, so that
// the ratios hold on a busy machine as well.

namespace {

constexpr int rowCount = 1'000'000;

void must(const QSqlDatabase& database, const QString& statement) {
    QSqlQuery query(database);
    if (!query.exec(statement)) qFatal("%s", qPrintable(query.lastError().text()));
}

template <class Work>
double seconds(Work&& work) {
    const auto start = std::chrono::steady_clock::now();
    work();
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

/// A table of a million rows in a file, or on a server.
class Million {
public:
    explicit Million(bool onServer) {
        if (onServer) {
            mServer = std::make_unique<PostgresServer>();
            address = QStringLiteral("postgresql://postgres@localhost/postgres?host=") +
                      mServer->folder();
            const reader::Connection connection(mServer->connect(QStringLiteral("making")));
            must(connection.database(),
                 QStringLiteral("CREATE TABLE rows AS SELECT n AS id, 'row number ' || n AS name, "
                                "n * 0.25 AS price FROM generate_series(1, %1) AS n")
                     .arg(rowCount));
            must(connection.database(), QStringLiteral("ANALYZE"));
        } else {
            address = mFolder.filePath(QStringLiteral("rows.sqlite"));
            QSqlDatabase database =
                QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), QStringLiteral("making"));
            database.setDatabaseName(address);
            if (!database.open()) qFatal("%s", qPrintable(database.lastError().text()));
            const reader::Connection closes(std::exchange(database, {}));
            must(closes.database(),
                 QStringLiteral("CREATE TABLE rows AS WITH RECURSIVE c(n) AS (SELECT 1 UNION ALL "
                                "SELECT n + 1 FROM c WHERE n < %1) SELECT n AS id, 'row number ' "
                                "|| n AS name, n * 0.25 AS price FROM c")
                     .arg(rowCount));
        }
        const auto connection = reader::openDatabase(address);
        if (!connection) qFatal("%s", qPrintable(connection.error()));
        const auto table = reader::makeReader(connection->database())->table({u"", u"rows"});
        if (!table) qFatal("%s", qPrintable(table.error()));
        query->addTable(*table);
        files::QueryDocument document(query);
        document.database = address.toStdU16String();
        if (const auto error = files::saveQuery(file().toStdString(), document))
            qFatal("%s", error->text().c_str());
    }

    QString file() const { return mFolder.filePath(QStringLiteral("query.json")); }
    QString socketFolder() const { return mServer->folder(); }
    bool isOnServer() const { return mServer != nullptr; }
    model::sql::Dialect dialect() const {
        return mServer ? model::sql::Dialect::PostgreSQL : model::sql::Dialect::SQLite;
    }
    designer::Command command(std::optional<qint64> limit = {}) const {
        return designer::makeCommand(designer::statementFor(*query, dialect(), limit), dialect(),
                                     {}, limit);
    }

    QString address;
    platform::Ref<model::Query> query = platform::makeRef<model::Query>();

private:
    QTemporaryDir mFolder;
    std::unique_ptr<PostgresServer> mServer;
};

/// From the start of a program to the first of what it writes; its end is not waited for.
double firstOutput(const QString& name, const QStringList& arguments) {
    QProcess program;
    const double took = seconds([&] {
        program.start(name, arguments);
        if (!program.waitForReadyRead()) qFatal("%s wrote nothing", qPrintable(name));
    });
    program.kill();
    program.waitForFinished();
    return took;
}

void report(benchmark::State& state, double own, double ours) {
    const auto runs = static_cast<double>(state.iterations());
    state.counters["own_ms"] = own / runs * 1000;
    state.counters["designer_ms"] = ours / runs * 1000;
    state.counters["ratio"] = ours / own;
}

/// The program against the engine's shell, on the same statement with the same limit.
void programs(benchmark::State& state, bool onServer) {
    const Million rows(onServer);
    const QString statement = rows.command(1).statement;
    double own = 0, ours = 0;
    for (auto _ : state) {
        own += onServer
                   ? firstOutput(QStringLiteral("psql"),
                                 {QStringLiteral("-XAq"), QStringLiteral("--csv"),
                                  QStringLiteral("-h"), rows.socketFolder(), QStringLiteral("-U"),
                                  QStringLiteral("postgres"), QStringLiteral("-c"), statement})
                   : firstOutput(QStringLiteral("sqlite3"),
                                 {QStringLiteral("-csv"), rows.address, statement});
        const double once = firstOutput(
            QStringLiteral(ZANDOR_DESIGNER),
            {QStringLiteral("--run"), rows.file(), QStringLiteral("--limit"), QStringLiteral("1")});
        ours += once;
        state.SetIterationTime(once);
    }
    report(state, own, ours);
}

/// The first page on the screen's side of the thread against the driver's first row, both from
/// connecting on and without a limit in the statement.
void firstPage(benchmark::State& state, bool onServer) {
    const Million rows(onServer);
    const designer::Command command = rows.command();
    double own = 0, ours = 0;
    for (auto _ : state) {
        {
            std::optional<reader::Connection> connection;
            std::optional<QSqlQuery> query;
            own += seconds([&] {
                auto opened = reader::openDatabase(rows.address);
                if (!opened) qFatal("%s", qPrintable(opened.error()));
                connection = std::move(*opened);
                query.emplace(connection->database());
                query->setForwardOnly(true);
                if (!query->exec(command.statement) || !query->next()) qFatal("no row");
            });
            // Its rest is read here when the statement ends, outside of the time.
        }
        const auto spool = std::make_shared<designer::Spool>();
        designer::WorkerPointer worker;
        const double once = seconds([&] {
            worker.reset(new designer::Worker(designer::Database::connectorTo(rows.address, {}),
                                              command, spool));
            QEventLoop loop;
            QObject::connect(worker.get(), &designer::Worker::progressed, &loop, [&] {
                if (!spool->page(0, 4000).empty()) loop.quit();
            });
            worker->start();
            loop.exec();
        });
        worker.reset();
        ours += once;
        state.SetIterationTime(once);
    }
    report(state, own, ours);
}

} // namespace

BENCHMARK_CAPTURE(programs, sqlite, false)
    ->Iterations(20)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(programs, postgres, true)
    ->Iterations(20)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(firstPage, sqlite, false)
    ->Iterations(20)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(firstPage, postgres, true)
    ->Iterations(10)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);

int main(int argc, char** argv) {
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
}
