#include "designer/document/Document.h"

#include <Zandor/Library.h>

#include <QCoreApplication>
#include <QUndoStack>

#include <benchmark/benchmark.h>

using namespace zandor;

// Recording and undoing one step, in a small drawing and in the largest that the control shows:
// tables, joins, definitions. The counters tell how often the smallest drawing's time that is.

namespace {

struct Drawing {
    Drawing(std::int64_t tables, std::int64_t joins, std::int64_t definitions) {
        const auto query = platform::makeRef<model::Query>();
        for (std::int64_t t = 0; t < tables; ++t) {
            model::TableDescription table{u"public", u"table_" + platform::decimal(t), {}};
            for (int c = 0; c < 100; ++c)
                table.columns.push_back({u"column_" + platform::decimal(c),
                                         model::ColumnType::Integer, u"INTEGER", c == 0});
            query->addTable(table);
        }
        const auto column = [&](std::int64_t n) {
            auto& from = query->Tables();
            const auto table = from.Item(static_cast<std::int32_t>(n % tables) + 1);
            return table->Columns().Item(static_cast<std::int32_t>(n % 100) + 2);
        };
        for (std::int64_t j = 0; j < joins; ++j) {
            const auto join = library.NewZDJoin();
            join->LeftColumn(column(j));
            join->RightColumn(column(j + 1));
            query->AddJoin(join);
        }
        for (std::int64_t d = 0; d < definitions; ++d) {
            const auto definition = library.NewZDColumnDefinition();
            definition->Column(column(d));
            definition->AddCriterium(u"> 100", u"4");
            query->AddColumnDefinition(definition);
        }
        document.setQuery(query);
    }

    model::Library library;
    designer::Document document;
};

void run(benchmark::State& state, const std::function<void(model::Query&)>& change) {
    Drawing drawing(state.range(0), state.range(1), state.range(2));
    static double smallest = 0;
    const auto begin = std::chrono::steady_clock::now();
    for (auto _ : state) {
        change(*drawing.document.query());
        drawing.document.settle();
        drawing.document.undo();
    }
    const std::chrono::duration<double> took = std::chrono::steady_clock::now() - begin;
    const double each = took.count() / static_cast<double>(state.iterations());
    if (state.range(0) == 2) smallest = each;
    state.counters["times"] = each / smallest;
}

void move(benchmark::State& state) {
    float place = 0;
    run(state, [&](model::Query& query) { query.Tables().Item(1)->Left(++place); });
}

void changeCriterion(benchmark::State& state) {
    int value = 0;
    run(state, [&](model::Query& query) {
        query.ColumnDefinitions().Item(1)->Criteria().Item(u"4")->Criterium(
            u"> " + platform::decimal(++value));
    });
}

void deleteJoin(benchmark::State& state) {
    run(state, [](model::Query& query) { query.Joins().Remove(query.Joins().Item(1)->Key()); });
}

/// What nearly every release of a mouse button finds.
void findNothing(benchmark::State& state) {
    run(state, [](model::Query&) {});
}

void sizes(benchmark::internal::Benchmark* benchmark) {
    benchmark->Args({2, 1, 4})->Args({16, 64, 200})->Unit(benchmark::kMicrosecond);
}

} // namespace

BENCHMARK(move)->Apply(sizes);
BENCHMARK(changeCriterion)->Apply(sizes);
BENCHMARK(deleteJoin)->Apply(sizes);
BENCHMARK(findNothing)->Apply(sizes);

int main(int argc, char** argv) {
    const QCoreApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
}
