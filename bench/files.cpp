#include <Zandor/QueryDocument.h>

#include <benchmark/benchmark.h>

using namespace zandor;

// Saving and loading, a usual query and the largest one.

namespace {

platform::Ref<model::Query> queryOf(std::int64_t tables, std::int64_t columns) {
    auto query = platform::makeRef<model::Query>();
    for (std::int64_t t = 0; t < tables; ++t) {
        model::TableDescription table{u"public", u"table_" + platform::decimal(t), {}};
        for (std::int64_t c = 1; c < columns; ++c) // the entry for all columns is one as well
            table.columns.push_back({u"column_" + platform::decimal(c), model::ColumnType::Integer,
                                     u"INTEGER", c == 1});
        query->addTable(table);
    }
    return query;
}

void toJson(benchmark::State& state) {
    const files::QueryDocument document = queryOf(state.range(0), state.range(1));
    for (auto _ : state) benchmark::DoNotOptimize(files::toJson(document));
}

void fromJson(benchmark::State& state) {
    const auto text = files::toJson(queryOf(state.range(0), state.range(1)));
    for (auto _ : state) benchmark::DoNotOptimize(files::fromJson(*text));
    state.SetBytesProcessed(state.iterations() * static_cast<std::int64_t>(text->size()));
}

} // namespace

BENCHMARK(toJson)->Args({16, 100})->Args({20, 5000})->Unit(benchmark::kMillisecond);
BENCHMARK(fromJson)->Args({16, 100})->Args({20, 5000})->Unit(benchmark::kMillisecond);

BENCHMARK_MAIN();
