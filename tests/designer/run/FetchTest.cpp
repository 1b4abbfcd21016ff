#include "Databases.h"
#include "Queries.h"

#include <gmock/gmock.h>

#include <QElapsedTimer>
#include <QSqlQuery>

#include <thread>

using namespace zandor;

using designer::Command;
using designer::Database;
using designer::Outcome;
using model::sql::Dialect;
using testing::ElementsAre;
using testing::HasSubstr;

namespace {

class Fetching : public testing::Test {
protected:
    Outcome fetch(const Command& command) {
        return designer::fetch(Database::connectorTo(file, {}), command, keeper, stop);
    }
    Outcome fetch(const QString& statement) { return fetch(Command{statement, {}, {}}); }

    DatabaseFolder folder;
    QString file = folder.database("numbers.db", numbersTable(3000));
    Keeper keeper;
    std::atomic<bool> stop = false;
};

} // namespace

TEST_F(Fetching, GivesTheColumnsAndThenTheRows) {
    const auto query =
        draw(file, {"numbers"}, {{"numbers.n", {"< 3"}}, {"numbers.word"}, {"numbers.missing"}});
    const Outcome outcome = fetch(commandFor(query, Dialect::SQLite));
    EXPECT_EQ(outcome.end, Outcome::End::complete);
    EXPECT_EQ(outcome.rows, 3);
    EXPECT_EQ(keeper.columns, QStringList({"n", "word", "missing"}));
    EXPECT_EQ(keeper.rows,
              QStringList({"n:0 | t:word 0 | 0:", "n:1 | t:word 1 | 0:", "n:2 | t:word 2 | 0:"}));
    EXPECT_TRUE(keeper.finished);
}

TEST_F(Fetching, TellsKindsOfValuesApart) {
    fetch("SELECT 1, 1.5, 0.1, 9007199254740993, 'a', '', NULL, x'00ff', x''");
    EXPECT_EQ(keeper.rows,
              QStringList("n:1 | n:1.5 | n:0.1 | n:9007199254740993 | t:a | t: | 0: | B:00ff | "
                          "B:"));
}

TEST_F(Fetching, LeavesTheNoiseOfSumsOut) {
    fetch("SELECT 0.1 + 0.2, 45408.759999999995, 1.0 / 3, 1e300 * 10, -2.5e-7");
    EXPECT_EQ(keeper.rows,
              QStringList("n:0.3 | n:45408.76 | n:0.333333333333333 | n:1e+301 | n:-2.5e-07"));
}

TEST_F(Fetching, GivesTheNamesOfColumnsAsTheyAre) {
    fetch("SELECT 1 AS \"a\"\"b\", 2 AS \"\"\"c\"\"\", 3 AS \"Größe ☃\"");
    EXPECT_EQ(keeper.columns, QStringList({"a\"b", "\"c\"", "Größe ☃"}));
}

TEST_F(Fetching, GivesTheColumnsOfAResultWithoutRows) {
    EXPECT_EQ(fetch("SELECT n, word FROM numbers WHERE n < 0").end, Outcome::End::complete);
    EXPECT_EQ(keeper.columns, QStringList({"n", "word"}));
    EXPECT_TRUE(keeper.finished);
}

TEST_F(Fetching, EndsAtTheLimitAndTellsThatThereAreMore) {
    const auto query = draw(file, {"numbers"});
    const Outcome limited = fetch(commandFor(query, Dialect::SQLite, 10));
    EXPECT_EQ(limited.end, Outcome::End::limited);
    EXPECT_EQ(limited.rows, 10);
    EXPECT_EQ(keeper.rows.size(), 10);
    EXPECT_TRUE(keeper.finished);
    // An engine that was not told of the limit is left at it too.
    EXPECT_EQ(fetch(commandFor(query, Dialect::Standard, 10)).end, Outcome::End::limited);
}

TEST_F(Fetching, TakesALimitThatIsJustReachedForTheWholeResult) {
    const auto query = draw(file, {"numbers"});
    EXPECT_EQ(fetch(commandFor(query, Dialect::SQLite, 3000)).end, Outcome::End::complete);
    EXPECT_EQ(fetch(commandFor(query, Dialect::SQLite, 2999)).end, Outcome::End::limited);
}

TEST_F(Fetching, TakesALimitOfNoRows) {
    const Outcome outcome = fetch(commandFor(draw(file, {"numbers"}), Dialect::SQLite, 0));
    EXPECT_EQ(outcome.end, Outcome::End::limited);
    EXPECT_EQ(outcome.rows, 0);
}

TEST_F(Fetching, PassesOnWhatTheEngineSays) {
    const Outcome outcome = fetch("SELECT nowhere FROM numbers");
    EXPECT_EQ(outcome.end, Outcome::End::failed);
    EXPECT_EQ(outcome.message, "no such column: nowhere");
    EXPECT_FALSE(keeper.finished);
}

TEST_F(Fetching, TellsOfAFailureBetweenTwoRows) {
    const Outcome outcome = fetch("SELECT abs(CASE n WHEN 5 THEN -9223372036854775807 - 1 ELSE n "
                                  "END) FROM numbers");
    EXPECT_EQ(outcome.end, Outcome::End::failed);
    EXPECT_EQ(outcome.message, "integer overflow");
    EXPECT_EQ(outcome.rows, 5);
    EXPECT_FALSE(keeper.finished);
}

TEST_F(Fetching, TellsThatThereIsNoDatabase) {
    file = folder.path("nothing.db");
    const Outcome outcome = fetch("SELECT 1");
    EXPECT_EQ(outcome.end, Outcome::End::unreachable);
    EXPECT_THAT(outcome.message.toStdString(), HasSubstr("There is no file"));
}

TEST_F(Fetching, EndsWhenTheRowsCannotBeTaken) {
    keeper.refuseAfter = 7;
    const Outcome outcome = fetch(commandFor(draw(file, {"numbers"}), Dialect::SQLite));
    EXPECT_EQ(outcome.end, Outcome::End::refused);
    EXPECT_EQ(outcome.message, "enough");
    EXPECT_EQ(outcome.rows, 7);
    EXPECT_FALSE(keeper.finished);
}

TEST_F(Fetching, StopsAStatementThatWouldTakeMinutes) {
    const Command command = commandFor(drawForMinutes(file), Dialect::SQLite);
    QElapsedTimer clock;
    std::thread stopping([&] {
        std::this_thread::sleep_for(std::chrono::milliseconds(300)); // it is running by then
        clock.start();
        stop = true;
    });
    const Outcome outcome = fetch(command);
    const qint64 took = clock.isValid() ? clock.elapsed() : -1;
    stopping.join();
    EXPECT_EQ(outcome.end, Outcome::End::cancelled);
    EXPECT_EQ(outcome.rows, 0);
    EXPECT_GE(took, 0) << "the statement was over before it was stopped";
    EXPECT_LT(took, 2000);
}

TEST_F(Fetching, StopsAStatementThatHasNotBegun) {
    stop = true;
    EXPECT_EQ(fetch(commandFor(drawForMinutes(file), Dialect::SQLite)).end,
              Outcome::End::cancelled);
}

TEST_F(Fetching, CanChangeNothing) {
    for (const char* statement : {"DELETE FROM numbers", "UPDATE numbers SET n = 0",
                                  "INSERT INTO numbers VALUES (1, 'a', 2)", "DROP TABLE numbers",
                                  "CREATE TABLE other (a)"}) {
        const Outcome outcome = fetch(QString::fromLatin1(statement));
        EXPECT_EQ(outcome.end, Outcome::End::failed) << statement;
        EXPECT_EQ(outcome.message, "attempt to write a readonly database") << statement;
    }
    keeper = {};
    fetch("SELECT count(*), sum(n) FROM numbers");
    EXPECT_EQ(keeper.rows, QStringList("n:3000 | n:4498500"));
}
