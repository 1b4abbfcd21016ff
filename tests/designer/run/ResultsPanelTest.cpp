#include "OpenPanel.h"

#include "designer/run/ParameterDialog.h"

#include <QComboBox>
#include <QElapsedTimer>
#include <QHeaderView>
#include <QLineEdit>
#include <QPlainTextEdit>

using namespace zandor;

using designer::ResultsPanel;
using testing::HasSubstr;
using testing::MatchesRegex;
using testing::StartsWith;

namespace {

class TheResultsPanel : public OpenPanel {};

} // namespace

TEST_F(TheResultsPanel, SaysThatAQueryFindsNothingAndHowTextsAreCompared) {
    open({"CREATE TABLE words (n INTEGER, word TEXT)", "INSERT INTO words VALUES (1, 'Berlin')"});
    show({"words"}, {{"words.word", {"berlin"}}});
    pressRun();
    ASSERT_TRUE(ended());
    EXPECT_THAT(table().emptyText().toStdString(), StartsWith("The query finds no rows.\nA text "));
    show({"words"}, {{"words.n", {"2"}}});
    EXPECT_EQ(table().emptyText(), "");
    pressRun();
    ASSERT_TRUE(ended());
    EXPECT_EQ(table().emptyText(), "The query finds no rows.");
    show({"words"}, {{"words.n", {"1"}}});
    pressRun();
    ASSERT_TRUE(ended());
    EXPECT_EQ(table().emptyText(), "");
}

TEST_F(TheResultsPanel, ShowsTheRowsOfTheDrawnQuery) {
    open(numbersTable(3000));
    show({"numbers"}, {{"numbers.n", {"< 20"}, 2}, {"numbers.missing"}});
    pressRun();
    ASSERT_TRUE(ended());
    EXPECT_EQ(table().rows().rowCount(), 20);
    EXPECT_TRUE(table().isVisible());
    EXPECT_EQ(at(0, 0), "19");
    EXPECT_EQ(at(19, 1), "NULL");
    EXPECT_THAT(status(), MatchesRegex("Rows: 20 . [0-9]+\\.[0-9] s|Rows: 20 .. [0-9]+\\.[0-9] s"));
    EXPECT_FALSE(all().isVisible());
}

TEST_F(TheResultsPanel, ShowsTheFirstRowsAndAllOnAClick) {
    open(numbersTable(3000));
    show({"numbers"});
    auto* const limit = panel.findChild<QComboBox*>("rowLimit");
    EXPECT_EQ(limit->currentText(), "10,000 rows");
    limit->setFocus();
    hands::key(*limit, Qt::Key_Up);
    EXPECT_EQ(panel.limit(), 1000);
    pressRun();
    ASSERT_TRUE(ended());
    EXPECT_EQ(table().rows().rowCount(), 1000);
    EXPECT_THAT(status(), StartsWith("First 1,000 rows; there are more"));
    ASSERT_TRUE(all().isVisible());
    hands::click(all(), all().rect().center());
    ASSERT_TRUE(ended());
    EXPECT_EQ(table().rows().rowCount(), 3000);
    EXPECT_THAT(status(), StartsWith("Rows: 3,000"));
}

TEST_F(TheResultsPanel, RunsNothingThatDoesNotSayWhatWasDrawn) {
    open(numbersTable(10));
    show({"numbers"}, {{"numbers.n", {"< abc def"}}});
    pressRun();
    EXPECT_FALSE(panel.isRunning());
    EXPECT_THAT(message(), StartsWith("The query cannot be run yet:\n\u2022 numbers.n: "));
    document.setQuery(platform::makeRef<model::Query>());
    pressRun();
    EXPECT_THAT(message(), HasSubstr("The query has no tables"));
}

TEST_F(TheResultsPanel, AsksForADatabaseFirst) {
    panel.show();
    pressRun();
    EXPECT_EQ(message(), "No database is open: open one first.");
}

TEST_F(TheResultsPanel, ShowsTheEnginesWordsAndTheStatement) {
    open(numbersTable(10));
    show({"numbers"});
    folder.database("panel.db", {"ALTER TABLE numbers RENAME TO others"});
    pressRun();
    ASSERT_TRUE(ended());
    EXPECT_EQ(message(), "The database did not run the statement:\nno such table: numbers");
    EXPECT_THAT(panel.findChild<QPlainTextEdit*>("failedStatement")->toPlainText().toStdString(),
                HasSubstr("FROM numbers"));
}

TEST_F(TheResultsPanel, AsksForParametersAndRemembersThem) {
    open(numbersTable(100));
    show({"numbers"}, {{"numbers.n", {"< :top"}}, {"numbers.word", {"<> :other"}}});
    whenOpen<designer::ParameterDialog>([](auto& dialog) {
        type(*dialog.template findChild<QLineEdit*>("top"), "7");
        dialog.accept();
    });
    pressRun();
    ASSERT_TRUE(ended());
    EXPECT_EQ(table().rows().rowCount(), 7);
    QString remembered;
    whenOpen<designer::ParameterDialog>([&](auto& dialog) {
        remembered = dialog.template findChild<QLineEdit*>("top")->text();
        dialog.reject();
    });
    pressRun();
    EXPECT_EQ(remembered, "7");
    EXPECT_FALSE(panel.isRunning());
    EXPECT_EQ(table().rows().rowCount(), 7); // the rows of before stay
}

TEST_F(TheResultsPanel, StaysAliveWhileTheEngineWorksAndCancels) {
    open(numbersTable(3000));
    document.setQuery(drawForMinutes(file));
    pressRun();
    EXPECT_FALSE(panel.runAction()->isEnabled());
    int beats = 0;
    QTimer heart;
    QObject::connect(&heart, &QTimer::timeout, [&] { ++beats; });
    heart.start(10);
    ASSERT_TRUE(until([&] { return beats > 20; }));
    ASSERT_TRUE(panel.isRunning());
    EXPECT_THAT(status(), StartsWith("Running\u2026"));
    QElapsedTimer clock;
    clock.start();
    press(panel.cancelAction());
    ASSERT_TRUE(ended());
    EXPECT_LT(clock.elapsed(), 2000);
    EXPECT_THAT(status(), StartsWith("Cancelled. Rows that came: 0"));
    EXPECT_TRUE(panel.runAction()->isEnabled());
}

TEST_F(TheResultsPanel, CancelsByAKeyThatItsMenuNames) {
    open(numbersTable(3000));
    document.setQuery(drawForMinutes(file));
    panel.addAction(panel.cancelAction());
    EXPECT_EQ(panel.cancelAction()->shortcut(), QKeySequence(Qt::Key_Escape));
    pressRun();
    ASSERT_TRUE(panel.isRunning());
    panel.activateWindow();
    EXPECT_TRUE(until([&] { return panel.isActiveWindow(); }));
    hands::shortcut(panel, Qt::Key_Escape);
    ASSERT_TRUE(ended());
    EXPECT_THAT(status(), StartsWith("Cancelled."));
}

TEST_F(TheResultsPanel, KeepsTheRowsThatCameBeforeItWasCancelled) {
    open(numbersTable(3000));
    show({"numbers", "numbers", "numbers"});
    panel.setLimit(ResultsPanel::mostRows);
    pressRun();
    ASSERT_TRUE(until([&] { return table().rows().rowCount() > 1000; }));
    panel.cancel();
    ASSERT_TRUE(ended());
    EXPECT_GT(table().rows().rowCount(), 1000);
    EXPECT_TRUE(table().isVisible());
    EXPECT_EQ(at(999, 0), "0");
}

TEST_F(TheResultsPanel, MayGoWhileAStatementRuns) {
    open(numbersTable(3000));
    document.setQuery(drawForMinutes(file));
    auto* const other = new ResultsPanel(document, database);
    other->run();
    EXPECT_TRUE(other->isRunning());
    QElapsedTimer clock;
    clock.start();
    delete other;
    EXPECT_LT(clock.elapsed(), 2000);
}

TEST_F(TheResultsPanel, ExportsAllRowsWhateverTheLimit) {
    open(numbersTable(3000));
    show({"numbers"}, {{"numbers.n"}});
    panel.setLimit(1000);
    panel.exportTo(folder.path("all.csv"));
    ASSERT_TRUE(ended());
    QFile exported(folder.path("all.csv"));
    ASSERT_TRUE(exported.open(QIODevice::ReadOnly));
    EXPECT_EQ(exported.readAll().count('\n'), 3001);
    EXPECT_THAT(status(), StartsWith("Exported to "));
    EXPECT_THAT(status(), HasSubstr("Rows: 3,000"));
}

TEST_F(TheResultsPanel, LeavesNoFileOfACancelledExport) {
    open(numbersTable(3000));
    show({"numbers", "numbers", "numbers"});
    panel.exportTo(folder.path("half.csv"));
    ASSERT_TRUE(until([&] { return status().find("so far: 0 ") == std::string::npos; }));
    EXPECT_THAT(status(), StartsWith("Exporting\u2026"));
    press(panel.cancelAction());
    ASSERT_TRUE(ended());
    EXPECT_THAT(status(), StartsWith("Cancelled; nothing was exported"));
    EXPECT_FALSE(QFile::exists(folder.path("half.csv")));
}

TEST_F(TheResultsPanel, SaysThatTheDrawingHasChanged) {
    open(numbersTable(10));
    show({"numbers"});
    pressRun();
    ASSERT_TRUE(ended());
    document.change("Add a column", [](model::Query& query) { addColumn(query, {"numbers.n"}); });
    EXPECT_THAT(status(), HasSubstr("the drawing has changed since"));
    document.undo();
    EXPECT_EQ(status().find("changed"), std::string::npos);
    document.redo();
    pressRun();
    ASSERT_TRUE(ended());
    EXPECT_EQ(status().find("changed"), std::string::npos);
}

TEST_F(TheResultsPanel, SaysNothingOfAChangeThatNoRowDependsOn) {
    open(numbersTable(10));
    show({"numbers"});
    pressRun();
    ASSERT_TRUE(ended());
    document.change("Move", [](model::Query& query) { query.Tables().Item(1)->Left(3000); });
    EXPECT_EQ(status().find("changed"), std::string::npos);
}

TEST_F(TheResultsPanel, ShowsAFormatAtOnceAndExportsTheValuesThemselves) {
    open({"CREATE TABLE sales (price DECIMAL(8,3), at TEXT)",
          "INSERT INTO sales VALUES (1234.567, '2026-07-21'), (20, '2026-07-22')"});
    show({"sales"}, {{"sales.price"}, {"sales.at"}});
    const auto format = [&](std::int32_t position, model::Format format) {
        document.change({}, [&](model::Query& query) {
            auto& definition =
                dynamic_cast<model::ColumnDefinition&>(*query.ColumnDefinitions().Item(position));
            definition.format(format);
            definition.decimals(1);
        });
    };
    const auto inFull = [](int day) {
        return QLocale().toString(QDate(2026, 7, day), QLocale::LongFormat);
    };
    const QString first = inFull(21);
    const QString second = inFull(22);
    format(1, model::Format::Thousands);
    pressRun();
    ASSERT_TRUE(ended());
    EXPECT_EQ(at(0, 0), "1,234.6");
    const std::string said = status();
    const int narrow = table().columnWidth(1);
    format(2, model::Format::LongDate);
    QCoreApplication::processEvents();
    EXPECT_EQ(at(0, 1), first);
    EXPECT_GT(table().columnWidth(1), narrow);
    EXPECT_EQ(status(), said) << "the rows are still those of the drawing";
    // Sorted by what it is and not by what it looks like.
    table().sortByColumn(1, Qt::DescendingOrder);
    EXPECT_EQ(at(0, 1), second);
    const QString path = file + ".csv";
    panel.exportTo(path);
    ASSERT_TRUE(ended());
    QFile written(path);
    ASSERT_TRUE(written.open(QIODevice::ReadOnly));
    EXPECT_EQ(written.readAll(), "price,at\r\n1234.567,2026-07-21\r\n20,2026-07-22\r\n");
    // With another column before them the rows keep the look that they have.
    document.change({}, [&](model::Query& query) {
        query.StandsBehind(query.ColumnDefinitions().Item(2), {});
    });
    QCoreApplication::processEvents();
    EXPECT_EQ(at(0, 1), second);
    document.undo();
    document.undo();
    QCoreApplication::processEvents();
    EXPECT_EQ(at(0, 1), "2026-07-22");
}

TEST_F(TheResultsPanel, TakesACommentForNoChange) {
    open(numbersTable(10));
    show({"numbers"});
    pressRun();
    ASSERT_TRUE(ended());
    document.change("Comment", [](model::Query& query) {
        auto options = query.options();
        options.comments.push_back({.text = u"of all numbers"});
        query.options(options);
    });
    QCoreApplication::processEvents();
    EXPECT_EQ(status().find("changed"), std::string::npos);
    document.change("Fewer", [](model::Query& query) {
        auto options = query.options();
        options.first = 3;
        query.options(options);
    });
    QCoreApplication::processEvents();
    EXPECT_THAT(status(), HasSubstr("the drawing has changed since"));
}

TEST_F(TheResultsPanel, SaysThatTheDrawingHasChangedWhileItRan) {
    open(numbersTable(10));
    show({"numbers"});
    pressRun();
    document.change("Add a column", [](model::Query& query) { addColumn(query, {"numbers.n"}); });
    ASSERT_TRUE(ended());
    EXPECT_THAT(status(), HasSubstr("the drawing has changed since"));
}

TEST_F(TheResultsPanel, ForgetsTheRowsAndMessagesOfAnotherQuery) {
    open(numbersTable(10));
    show({"numbers"});
    pressRun();
    ASSERT_TRUE(ended());
    ASSERT_EQ(table().rows().rowCount(), 10);
    document.setQuery(platform::makeRef<model::Query>());
    EXPECT_EQ(table().rows().rowCount(), 0);
    EXPECT_EQ(message(), "Run the query to see its rows here.");
    EXPECT_EQ(status(), "");
    pressRun();
    EXPECT_THAT(message(), HasSubstr("The query has no tables"));
    document.setQuery(platform::makeRef<model::Query>());
    EXPECT_EQ(message(), "Run the query to see its rows here.");
}

TEST_F(TheResultsPanel, EndsTheRunOfAnotherQueryButNotItsExport) {
    open(numbersTable(3000));
    document.setQuery(drawForMinutes(file));
    pressRun();
    ASSERT_TRUE(panel.isRunning());
    document.setQuery(platform::makeRef<model::Query>());
    EXPECT_FALSE(panel.isRunning());
    EXPECT_TRUE(panel.runAction()->isEnabled());

    show({"numbers", "numbers"}, {{"numbers.n", {"< 100"}}});
    panel.exportTo(folder.path("all.csv"));
    ASSERT_TRUE(panel.isRunning());
    document.setQuery(platform::makeRef<model::Query>());
    ASSERT_TRUE(ended());
    EXPECT_THAT(status(), StartsWith("Exported to "));
    EXPECT_TRUE(QFile::exists(folder.path("all.csv")));
}

TEST_F(TheResultsPanel, SortsTheRowsByAClickOnAHeaderAndSaysSo) {
    open(numbersTable(3000));
    show({"numbers"}, {{"numbers.n", {"< 12"}}, {"numbers.word"}});
    pressRun();
    ASSERT_TRUE(ended());
    auto& header = *table().horizontalHeader();
    const auto clickHeader = [&](int column) {
        hands::click(*header.viewport(),
                     QPointF(header.sectionViewportPosition(column) + 10, header.height() / 2));
    };
    const std::string before = status();
    clickHeader(0);
    EXPECT_EQ(at(11, 0), "11"); // as a number
    EXPECT_THAT(status(), HasSubstr("these rows are sorted by n here, the query is not"));
    clickHeader(0);
    EXPECT_EQ(at(0, 0), "11");
    EXPECT_THAT(status(), HasSubstr("sorted by n descending here"));
    EXPECT_TRUE(table()
                    .rows()
                    .headerData(0, Qt::Horizontal, Qt::ToolTipRole)
                    .toString()
                    .contains("Click to sort"));
    clickHeader(0);
    EXPECT_EQ(at(0, 0), "0");
    EXPECT_EQ(status(), before);
    // By keys from the menu.
    table().setCurrentIndex(table().rows().index(3, 0));
    table().findChild<QAction*>("sortDescending")->trigger();
    EXPECT_EQ(at(0, 0), "11");
    // The next rows are as the query gives them.
    pressRun();
    ASSERT_TRUE(ended());
    EXPECT_EQ(at(0, 0), "0");
    EXPECT_EQ(header.sortIndicatorSection(), -1);
    EXPECT_EQ(status().find("sorted"), std::string::npos);
}

TEST_F(TheResultsPanel, SortsOnlyWhenAllRowsHaveCome) {
    open(numbersTable(3000));
    show({"numbers", "numbers", "numbers"});
    panel.setLimit(ResultsPanel::mostRows);
    pressRun();
    ASSERT_TRUE(until([&] { return table().rows().rowCount() > 1000; }));
    table().horizontalHeader()->setSortIndicator(0, Qt::DescendingOrder);
    EXPECT_EQ(table().horizontalHeader()->sortIndicatorSection(), -1);
    EXPECT_EQ(at(0, 0), "0");
    EXPECT_THAT(status(), HasSubstr("can be sorted when all of them have come"));
    panel.cancel();
    ASSERT_TRUE(ended());
    EXPECT_EQ(status().find("can be sorted"), std::string::npos);
}

TEST_F(TheResultsPanel, ForgetsTheRowsOfAnotherDatabase) {
    open(numbersTable(10));
    show({"numbers"});
    pressRun();
    ASSERT_TRUE(ended());
    ASSERT_EQ(database.open(sampleDatabase()), std::nullopt);
    EXPECT_EQ(table().rows().rowCount(), 0);
    EXPECT_EQ(message(), "Run the query to see its rows here.");
}
