#include "Queries.h"
#include "designer/database/Answers.h"
#include "model/reader/OneServer.h"

#include "designer/document/Document.h"
#include "designer/run/ResultTable.h"
#include "designer/run/ResultsPanel.h"

#include <gmock/gmock.h>

#include <QAction>
#include <QElapsedTimer>
#include <QLabel>

#include <thread>

using namespace zandor;

using designer::Command;
using designer::Database;
using designer::Outcome;
using model::sql::Dialect;
using testing::HasSubstr;

namespace {

/// How many statements on the table "numbers" the server works on.
int working() {
    const reader::Connection connection(oneServer.server().connect("watching"));
    QSqlQuery query(connection.database());
    EXPECT_TRUE(query.exec("SELECT count(*) FROM pg_stat_activity WHERE state = 'active' AND query "
                           "LIKE '%numbers%' AND pid <> pg_backend_pid()"));
    EXPECT_TRUE(query.next());
    return query.value(0).toInt();
}

class OnPostgres : public testing::Test {
protected:
    static void SetUpTestSuite() {
        runOnServer({"DROP TABLE IF EXISTS numbers",
                     "CREATE TABLE numbers AS SELECT n, 'word ' || n AS word, "
                     "CAST(NULL AS integer) AS missing FROM generate_series(0, 2999) AS n"});
    }
    Outcome fetch(const Command& command) {
        return designer::fetch(Database::connectorTo(serverAddress(), {}), command, keeper, stop);
    }
    Outcome fetch(const QString& statement) { return fetch(Command{statement, {}, {}}); }
    /// Sets the flag as soon as the server works on the statement.
    std::thread stopWhenWorking() {
        return std::thread([this] {
            while (working() == 0) std::this_thread::yield();
            clock.start();
            stop = true;
        });
    }

    Keeper keeper;
    std::atomic<bool> stop = false;
    QElapsedTimer clock;
};

} // namespace

TEST_F(OnPostgres, TellsKindsOfValuesApart) {
    fetch("SELECT 1, 1.50::numeric, 12345678901234567890.123456789::numeric, 0.1::float8, true, "
          "'a'::text, NULL, '\\x00ff'::bytea, DATE '2024-05-01', TIME '10:30', TIMESTAMP "
          "'2024-05-01 10:30:00.25', 'NaN'::numeric, TIMESTAMP 'infinity'");
    EXPECT_EQ(keeper.rows,
              QStringList("n:1 | n:1.50 | n:12345678901234567890.123456789 | n:0.1 | b:true | t:a "
                          "| 0: | B:00ff | t:2024-05-01 | t:10:30:00 | t:2024-05-01 "
                          "10:30:00.25 | n:NaN | t:infinity"));
}

TEST_F(OnPostgres, GivesMomentsAsTheEngineWritesThem) {
    fetch("SELECT TIMESTAMP '2024-05-01 10:30:00.123456', DATE '0044-03-15 BC', "
          "DATE '-infinity', TIME '24:00', TIME '01:02:03.5', TIMETZ '01:02:03.25+05:30', "
          "TIMESTAMPTZ '12024-05-01 10:30+00' AT TIME ZONE 'UTC', CAST(NULL AS date)");
    EXPECT_EQ(keeper.rows,
              QStringList("t:2024-05-01 10:30:00.123456 | t:0044-03-15 BC | t:-infinity | "
                          "t:24:00:00 | t:01:02:03.5 | t:01:02:03.25+05:30 | "
                          "t:12024-05-01 10:30:00 | 0:"));
    fetch("SELECT TIMESTAMPTZ '2024-05-01 10:30:00.000001+05:30' FROM (SELECT "
          "set_config('TimeZone', 'Asia/Kathmandu', true)) AS there");
    EXPECT_EQ(keeper.rows.last(), "t:2024-05-01 10:45:00.000001+05:45");
}

TEST_F(OnPostgres, FindsARowByTheMomentThatItShows) {
    runOnServer({"DROP TABLE IF EXISTS moments",
                 "CREATE TABLE moments (d date, m timestamp, c time, z timestamptz, n timestamp, "
                 "e date)",
                 "INSERT INTO moments VALUES ('2024-02-29', '2024-02-29 01:02:03.123456', "
                 "'23:59:59.999999', '2024-02-29 01:02:03.000001', 'infinity', '0044-03-15 BC'), "
                 "('2024-03-01', '2024-02-29 01:02:03.123457', '23:59:59', "
                 "'2024-02-29 01:02:03', '-infinity', '0044-03-15')"});
    expectFoundByWhatIsShown(serverAddress(), "moments", Dialect::PostgreSQL, {"z", "n", "e"});
}

TEST_F(OnPostgres, GivesTheNamesOfColumnsAsTheyAre) {
    fetch("SELECT 1 AS \"a\"\"b\", 2 AS \"\"\"c\"\"\"");
    EXPECT_EQ(keeper.columns, QStringList({"a\"b", "\"c\""}));
}

TEST_F(OnPostgres, GivesTheFirstRowsBeforeTheLastOnesAreThere) {
    // The whole result would take minutes and all the memory that there is.
    keeper.refuseAfter = 1000;
    const auto query = draw(serverAddress(), {"numbers", "numbers", "numbers"});
    const Outcome outcome = fetch(commandFor(query, Dialect::PostgreSQL));
    EXPECT_EQ(outcome.end, Outcome::End::refused);
    EXPECT_EQ(outcome.rows, 1000);
    EXPECT_EQ(working(), 0);
}

TEST_F(OnPostgres, EndsAtTheLimit) {
    const auto query = draw(serverAddress(), {"numbers"});
    EXPECT_EQ(fetch(commandFor(query, Dialect::PostgreSQL, 10)).end, Outcome::End::limited);
    EXPECT_EQ(fetch(commandFor(query, Dialect::PostgreSQL, 3000)).end, Outcome::End::complete);
}

TEST_F(OnPostgres, TakesParameters) {
    const auto query = draw(serverAddress(), {"numbers"}, {{"numbers.n", {"< :top"}}});
    const auto text = designer::statementFor(*query, Dialect::PostgreSQL, {});
    const auto command = designer::makeCommand(text, Dialect::PostgreSQL, {{"top", "2.5"}}, {});
    EXPECT_EQ(fetch(command).end, Outcome::End::complete);
    EXPECT_EQ(keeper.rows, QStringList({"n:0", "n:1", "n:2"}));
}

TEST_F(OnPostgres, StopsAStatementThatWouldTakeMinutes) {
    std::thread stopping = stopWhenWorking();
    const Outcome outcome = fetch(commandFor(drawForMinutes(serverAddress()), Dialect::PostgreSQL));
    const qint64 took = clock.elapsed();
    stopping.join();
    EXPECT_EQ(outcome.end, Outcome::End::cancelled);
    EXPECT_LT(took, 3000);
    EXPECT_EQ(working(), 0);
}

TEST_F(OnPostgres, StopsAStatementInTheMidstOfItsRows) {
    std::thread stopping = stopWhenWorking();
    const auto query = draw(serverAddress(), {"numbers", "numbers", "numbers"}, {{"numbers.n"}});
    const Outcome outcome = fetch(commandFor(query, Dialect::PostgreSQL));
    stopping.join();
    EXPECT_EQ(outcome.end, Outcome::End::cancelled);
    EXPECT_EQ(working(), 0);
}

TEST_F(OnPostgres, CanChangeNothing) {
    for (const char* statement : {"DELETE FROM numbers", "INSERT INTO numbers VALUES (1, 'a', 2)",
                                  "DROP TABLE numbers", "CREATE TABLE other (a integer)"}) {
        const Outcome outcome = fetch(QString::fromLatin1(statement));
        EXPECT_EQ(outcome.end, Outcome::End::failed) << statement;
        EXPECT_THAT(outcome.message.toStdString(), HasSubstr("in a read-only transaction"));
    }
    keeper = {};
    fetch("SELECT count(*) FROM numbers");
    EXPECT_EQ(keeper.rows, QStringList("n:3000"));
}

TEST_F(OnPostgres, TellsAFailureFromALostConnection) {
    const Outcome failed = fetch("SELECT 1 / (n - 5) FROM numbers");
    EXPECT_EQ(failed.end, Outcome::End::failed);
    EXPECT_THAT(failed.message.toStdString(), HasSubstr("division by zero"));

    const Command minutes = commandFor(drawForMinutes(serverAddress()), Dialect::PostgreSQL);
    Outcome lost;
    std::thread running([&] { lost = fetch(minutes); });
    while (working() == 0) std::this_thread::yield();
    runOnServer({"SELECT pg_terminate_backend(pid) FROM pg_stat_activity WHERE state = 'active' "
                 "AND query LIKE '%numbers%' AND pid <> pg_backend_pid()"});
    running.join();
    EXPECT_EQ(lost.end, Outcome::End::lost);
    EXPECT_FALSE(lost.message.isEmpty());
}

TEST_F(OnPostgres, CancelsFromThePanel) {
    designer::Document document;
    designer::Database database;
    ASSERT_EQ(database.open(serverAddress()), std::nullopt);
    document.setQuery(drawForMinutes(serverAddress()));
    designer::ResultsPanel panel(document, database);
    panel.show();
    panel.runAction()->trigger();
    ASSERT_TRUE(until([] { return working() == 1; }));
    panel.cancelAction()->trigger();
    ASSERT_TRUE(until([&] { return !panel.isRunning(); }));
    EXPECT_EQ(working(), 0);
}

TEST_F(OnPostgres, SaysThatTheConnectionIsLost) {
    designer::Document document;
    designer::Database database;
    const QString address = serverAddress();
    ASSERT_EQ(database.open(address), std::nullopt);
    document.setQuery(draw(address, {"numbers"}));
    designer::ResultsPanel panel(document, database);
    panel.show();
    QString said;
    QObject::connect(&database, &Database::lost, [&](const QString& message) { said = message; });
    oneServer.server().kill();
    panel.run();
    ASSERT_TRUE(until([&] { return !panel.isRunning(); }));
    EXPECT_FALSE(said.isEmpty());
    EXPECT_TRUE(panel.findChild<QLabel*>("runMessage")->isVisible());
    oneServer.server().restart();
    ASSERT_EQ(database.renew(), std::nullopt);
    panel.run();
    ASSERT_TRUE(until([&] { return !panel.isRunning(); }));
    EXPECT_EQ(panel.findChild<designer::ResultTable*>()->rows().rowCount(), 3000);
}
