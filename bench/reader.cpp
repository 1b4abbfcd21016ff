#include "ManyTables.h"

#include "support/PostgresServer.h"

#include <Zandor/DatabaseReader.h>
#include <Zandor/reader/Connection.h>

#include <QCoreApplication>
#include <QTemporaryDir>

#include <benchmark/benchmark.h>

#include <chrono>

using namespace zandor;

// The list of 5000 tables beside the engine's own query for their names, turn by turn in one run,
// so that the ratio holds on a busy machine as well.

namespace {

template <class Work>
double seconds(Work&& work) {
    const auto start = std::chrono::steady_clock::now();
    work();
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

void listTables(benchmark::State& state, const QSqlDatabase& database) {
    const auto schema = reader::makeReader(database);
    double raw = 0, ours = 0;
    for (auto _ : state) {
        raw += seconds([&] { manytables::listOwn(database); });
        const double once = seconds([&] {
            const auto tables = schema->tables();
            if (!tables || tables->size() != manytables::count)
                qFatal("%s", qPrintable(tables.error()));
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
    manytables::makeSqlite(path);
    const auto opened = reader::openDatabase(path);
    if (!opened) qFatal("%s", qPrintable(opened.error()));
    listTables(state, opened->database());
}

void postgres(benchmark::State& state) {
    const PostgresServer server;
    const reader::Connection connection(server.connect(QStringLiteral("bench")));
    manytables::make(connection.database());
    listTables(state, connection.database());
}

/// The columns of one table after the other, as a user asks for them.
void columnsOfATable(benchmark::State& state) {
    const PostgresServer server;
    const reader::Connection connection(server.connect(QStringLiteral("bench")));
    manytables::make(connection.database());
    const auto schema = reader::makeReader(connection.database());
    double columns = 0, keys = 0;
    int n = 0;
    for (auto _ : state) {
        const auto name = u"table_" + platform::decimal(n++ % manytables::count);
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
