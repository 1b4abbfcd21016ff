#include <Zandor/Library.h>
#include <Zandor/ZandorWidget.h>

#include <QApplication>

#include <benchmark/benchmark.h>

#include <algorithm>
#include <chrono>

using namespace zandor;

// Showing a query anew beside making another widget for it, turn by turn in one run, so that the
// ratio holds on a busy machine as well: nothing changed, one cell changed, one table added or
// removed. Each is painted before the next. The tables are of 20 columns, each joined to the one
// before it, and each gives two columns to the grid; of 40 tables the first 16 are shown.

namespace {

constexpr int columnCount = 20;
constexpr int shownTables = 16; ///< a join of others would be reported, and wait

template <class Work>
double seconds(Work&& work) {
    const auto start = std::chrono::steady_clock::now();
    work();
    QCoreApplication::processEvents();
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

class Desk {
public:
    explicit Desk(int tables) {
        for (int n = 0; n < tables; ++n) addTable();
        const auto column = [&](int table, int position) {
            return mQuery->Tables().Item(table)->Columns().Item(position);
        };
        for (int n = 1; n <= tables; ++n) {
            if (n > 1 && n <= shownTables) {
                const auto join = mLibrary.NewZDJoin();
                join->LeftColumn(column(n - 1, 3));
                join->RightColumn(column(n, 2));
                mQuery->AddJoin(join);
            }
            for (const int position : {3, 4}) {
                const auto definition = mLibrary.NewZDColumnDefinition();
                definition->Column(column(n, position));
                definition->AddCriterium(u"> 100", u"4");
                mQuery->AddColumnDefinition(definition);
            }
        }
        mWindow.resize(1340, 800);
        makeWidget();
        mWindow.show();
        QCoreApplication::processEvents();
    }
    ~Desk() { delete mWidget; }

    void makeWidget() {
        delete mWidget;
        mWidget = new ZandorWidget(mLibrary, &mWindow);
        mWidget->setDebugSwitch(0);
        mWidget->setOnlyJoin(false);
        mWidget->setGeometry(mWindow.rect());
        mWidget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(mQuery));
        mWidget->show();
    }
    void showAnew() { mWidget->showAnew(); }

    void changeCell() {
        mQuery->ColumnDefinitions().Item(1)->Synonym(u"name " + platform::decimal(++mChanges));
    }
    void changeTables() {
        if (++mChanges % 2 == 1)
            mAdded = addTable();
        else
            mQuery->DeleteTable(std::exchange(mAdded, {}));
    }

private:
    platform::Ref<model::Table> addTable() {
        const auto name = u"table_" + platform::decimal(mQuery->Tables().Count() + 1);
        model::TableDescription table{u"public", name, {}};
        for (int c = 0; c < columnCount; ++c)
            table.columns.push_back({u"column_" + platform::decimal(c), model::ColumnType::Integer,
                                     u"INTEGER", c == 0});
        return mQuery->addTable(table);
    }

    model::Library mLibrary;
    platform::Ref<model::Query> mQuery = platform::makeRef<model::Query>();
    platform::Ref<model::Table> mAdded;
    int mChanges = 0;
    QWidget mWindow;
    ZandorWidget* mWidget = nullptr;
};

void run(benchmark::State& state, void (*change)(Desk&)) {
    Desk desk(static_cast<int>(state.range(0)));
    std::vector<double> anew, another;
    for (auto _ : state) {
        change(desk);
        anew.push_back(seconds([&] { desk.showAnew(); }));
        change(desk);
        another.push_back(seconds([&] { desk.makeWidget(); }));
        state.SetIterationTime(anew.back());
    }
    const auto median = [](std::vector<double>& times) {
        std::sort(times.begin(), times.end());
        return times[times.size() / 2];
    };
    state.counters["another widget (ms)"] = median(another) * 1e3;
    state.counters["ratio"] = median(anew) / median(another);
}

void nothingChanged(benchmark::State& state) {
    run(state, [](Desk&) {});
}
void oneCellChanged(benchmark::State& state) {
    run(state, [](Desk& desk) { desk.changeCell(); });
}
void oneTableMoreOrLess(benchmark::State& state) {
    run(state, [](Desk& desk) { desk.changeTables(); });
}

void sizes(benchmark::internal::Benchmark* benchmark) {
    benchmark->Arg(2)->Arg(10)->Arg(40)->Unit(benchmark::kMillisecond)->UseManualTime();
    benchmark->Iterations(25);
}

} // namespace

BENCHMARK(nothingChanged)->Apply(sizes);
BENCHMARK(oneCellChanged)->Apply(sizes);
BENCHMARK(oneTableMoreOrLess)->Apply(sizes);

int main(int argc, char** argv) {
    const QApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
}
