#include "support/PostgresServer.h"

#include <Zandor/DatabaseReader.h>
#include <Zandor/reader/Connection.h>

#include <QCoreApplication>
#include <QSqlError>
#include <QSqlQuery>
#include <QTemporaryDir>

#include <benchmark/benchmark.h>

#include <chrono>

using namespace zandor;

// The list of 5000 tables beside the engine's own query for their names, turn by turn in one run,
// so that the ratio holds on a busy machine as well.

namespace {

constexpr int tableCount = 5000;

void must(QSqlQuery& query, const QString& statement) {
    if (!query.exec(statement)) qFatal("%s", qPrintable(query.lastError().text()));
}

void makeTables(const QSqlDatabase& database) {
    QSqlQuery query(database);
    for (int n = 0; n < tableCount; ++n) {
        if (n % 500 == 0) must(query, QStringLiteral("BEGIN"));
        must(query, QStringLiteral("CREATE TABLE table_%1 (id INTEGER PRIMARY KEY, name "
                                   "VARCHAR(40), other INTEGER REFERENCES table_0 (id))")
                        .arg(n));
        if (n % 500 == 499) must(query, QStringLiteral("COMMIT"));
    }
}

template <class Work>
double seconds(Work&& work) {
    const auto start = std::chrono::steady_clock::now();
    work();
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

void listTables(benchmark::State& state, const QSqlDatabase& database, const QString& ownQuery) {
    const auto schema = reader::makeReader(database);
    double raw = 0, ours = 0;
    for (auto _ : state) {
        raw += seconds([&] {
            QSqlQuery query(database);
            query.setForwardOnly(database.driverName() == QStringLiteral("QSQLITE"));
            must(query, ownQuery);
            int count = 0;
            while (query.next()) count += !query.value(0).toString().isEmpty();
            if (count < tableCount) qFatal("only %d names", count);
        });
        const double once = seconds([&] {
            const auto tables = schema->tables();
            if (!tables || tables->size() != tableCount) qFatal("%s", qPrintable(tables.error()));
        });
        ours += once;
        state.SetIterationTime(once);
    }
    const auto runs = static_cast<double>(state.iterations());
    state.counters["own_ms"] = raw / runs * 1000;
    state.counters["reader_ms"] = ours / runs * 1000;
    state.counters["ratio"] = ours / raw;
}

void sqlite(benchmark::State& state) {
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("tables.sqlite"));
    {
        QSqlDatabase database =
            QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), QStringLiteral("making"));
        database.setDatabaseName(path);
        if (!database.open()) qFatal("%s", qPrintable(database.lastError().text()));
        const reader::Connection closes(std::exchange(database, {}));
        makeTables(closes.database());
    }
    const auto opened = reader::openDatabase(path);
    if (!opened) qFatal("%s", qPrintable(opened.error()));
    listTables(state, opened->database(),
               QStringLiteral("SELECT name FROM sqlite_master WHERE type = 'table' ORDER BY name"));
}

void postgres(benchmark::State& state) {
    const PostgresServer server;
    const reader::Connection connection(server.connect(QStringLiteral("bench")));
    makeTables(connection.database());
    listTables(state, connection.database(),
               QStringLiteral("SELECT relname FROM pg_class WHERE relkind = 'r' ORDER BY relname"));
}

/// The columns of one table after the other, as a user asks for them.
void columnsOfATable(benchmark::State& state) {
    const PostgresServer server;
    const reader::Connection connection(server.connect(QStringLiteral("bench")));
    makeTables(connection.database());
    const auto schema = reader::makeReader(connection.database());
    double columns = 0, keys = 0;
    int n = 0;
    for (auto _ : state) {
        const auto name = u"table_" + platform::decimal(n++ % tableCount);
        columns += seconds([&] { benchmark::DoNotOptimize(schema->table({u"", name})); });
        keys += seconds([&] { benchmark::DoNotOptimize(schema->foreignKeys({u"", name})); });
    }
    state.counters["columns_ms"] = columns / n * 1000;
    state.counters["keys_ms"] = keys / n * 1000;
}

} // namespace

BENCHMARK(sqlite)->Iterations(20)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK(postgres)->Iterations(20)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK(columnsOfATable)->Iterations(50)->Unit(benchmark::kMillisecond);

int main(int argc, char** argv) {
    const QCoreApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
}
