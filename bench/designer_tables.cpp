#include "designer/database/Database.h"
#include "designer/tables/TablesPanel.h"

#include <QApplication>
#include <QKeyEvent>
#include <QLineEdit>
#include <QSqlDatabase>
#include <QSqlQuery>
#include <QTemporaryDir>

#include <benchmark/benchmark.h>

#include <chrono>

using namespace zandor;

// Typing a name into the filter of the list of tables: of 5000 tables beside 100, turn by turn in
// one run. Every key is answered and painted before the next.

namespace {

QString databaseOf(const QTemporaryDir& folder, int tables) {
    const QString path = folder.filePath(QString::number(tables));
    {
        auto database =
            QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), QStringLiteral("making"));
        database.setDatabaseName(path);
        if (!database.open()) qFatal("no database");
        QSqlQuery query(database);
        query.exec(QStringLiteral("BEGIN"));
        for (int n = 0; n < tables; ++n)
            if (!query.exec(QStringLiteral("CREATE TABLE customer_order_%1 (x)").arg(n)))
                qFatal("no table");
        query.exec(QStringLiteral("COMMIT"));
    }
    QSqlDatabase::removeDatabase(QStringLiteral("making"));
    return path;
}

struct Panel {
    explicit Panel(const QString& path) {
        if (const auto error = database.open(path)) qFatal("%s", qPrintable(*error));
        panel.resize(260, 700);
        panel.show();
        QCoreApplication::processEvents();
    }

    /// Seconds.
    double type(const QString& text) {
        const auto start = std::chrono::steady_clock::now();
        for (const QChar character : text) {
            QKeyEvent press(QEvent::KeyPress, 0, Qt::NoModifier, QString(character));
            QCoreApplication::sendEvent(&panel.filterBox(), &press);
            QCoreApplication::processEvents();
        }
        const std::chrono::duration<double> taken = std::chrono::steady_clock::now() - start;
        panel.filterBox().clear();
        QCoreApplication::processEvents();
        return taken.count();
    }

    designer::Database database;
    designer::TablesPanel panel{database};
};

void typing(benchmark::State& state) {
    const QTemporaryDir folder;
    Panel many(databaseOf(folder, 5000));
    Panel few(databaseOf(folder, 100));
    const QString text = QStringLiteral("order 12 cust");
    double manySeconds = 0;
    double fewSeconds = 0;
    for (auto _ : state) {
        fewSeconds += few.type(text);
        const double once = many.type(text);
        manySeconds += once;
        state.SetIterationTime(once);
    }
    const auto keys = static_cast<double>(state.iterations()) * static_cast<double>(text.size());
    state.counters["key_of_5000_ms"] = manySeconds / keys * 1000;
    state.counters["key_of_100_ms"] = fewSeconds / keys * 1000;
    state.counters["ratio"] = manySeconds / fewSeconds;
}

} // namespace

BENCHMARK(typing)->Iterations(20)->UseManualTime()->Unit(benchmark::kMillisecond);

int main(int argc, char** argv) {
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
}
