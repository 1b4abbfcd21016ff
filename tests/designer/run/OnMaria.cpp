#include "Queries.h"
#include "model/reader/OneMariaServer.h"

#include <gmock/gmock.h>

#include <QDeadlineTimer>
#include <QElapsedTimer>

#include <thread>

using namespace zandor;

using designer::Command;
using designer::Database;
using designer::Outcome;
using testing::HasSubstr;

namespace {

class OnMaria : public testing::Test {
protected:
    void SetUp() override {
        if (const auto missing = MariaServer::missing()) GTEST_SKIP() << missing->toStdString();
        runOnMaria({"CREATE OR REPLACE DATABASE here"});
    }
    Outcome fetch(const Command& command) {
        return designer::fetch(Database::connectorTo(mariaAddress("here"), {}), command, keeper,
                               stop);
    }
    Outcome fetch(const QString& statement) { return fetch(Command{statement, {}, {}}); }

    Keeper keeper;
    std::atomic<bool> stop = false;
};

} // namespace

TEST_F(OnMaria, TellsTextsFromBytesWhateverTheirCollation) {
    runOnMaria({"USE here",
                "CREATE TABLE t (a varchar(9) COLLATE utf8mb4_bin, j json, u uuid, i inet6, "
                "l text CHARACTER SET latin1 COLLATE latin1_bin, b varbinary(9), bl blob, "
                "d decimal(30,10), p point)",
                "INSERT INTO t VALUES ('Größe', '{\"a\":1}', "
                "'123e4567-e89b-12d3-a456-426655440000', '::1', 'ß', 'abc', x'00ff', 1.5, NULL)"});
    const QStringList expected{
        "t:Größe | t:{\"a\":1} | t:123e4567-e89b-12d3-a456-426655440000 | t:::1 | t:ß | B:616263 "
        "| B:00ff | n:1.5000000000 | 0:"};
    fetch("SELECT * FROM t");
    EXPECT_EQ(keeper.rows, expected);
    keeper.rows.clear();
    fetch({"SELECT * FROM t WHERE d > ? AND a = ?", {1, "Größe"}, {}});
    EXPECT_EQ(keeper.rows, expected);
}

TEST_F(OnMaria, GivesBitsAsNumbers) {
    runOnMaria({"USE here",
                "CREATE TABLE t (o bit, e bit(8), b bit(8), s bit(64), `a``\"b` bit(12))",
                "INSERT INTO t VALUES (b'1', b'101', 200, 18446744073709551615, 256), "
                "(0, 0, 127, 9007199254740993, NULL)"});
    fetch("SELECT * FROM t");
    EXPECT_EQ(keeper.rows, QStringList({"n:1 | n:5 | n:200 | n:18446744073709551615 | n:256",
                                        "n:0 | n:0 | n:127 | n:9007199254740993 | 0:"}));
    EXPECT_EQ(keeper.columns.last(), "a`\"b");
}

TEST_F(OnMaria, GivesNumbersAsTheyAre) {
    runOnMaria({"USE here",
                "CREATE TABLE t (b boolean, y year, z int(5) unsigned zerofill, l bigint unsigned, "
                "f float, g double, n decimal(5,2))",
                "INSERT INTO t VALUES (true, 2024, 42, 18446744073709551615, 1.5, 0.1, -7.10)"});
    fetch("SELECT t.*, count(*) AS c, 1e300 * 10 AS h FROM t");
    EXPECT_EQ(keeper.rows, QStringList("n:1 | n:2024 | n:42 | n:18446744073709551615 | n:1.5 | "
                                       "n:0.1 | n:-7.10 | n:1 | n:1e301"));
}

TEST_F(OnMaria, GivesMomentsAsTheEngineWritesThem) {
    runOnMaria({"USE here", "SET sql_mode = ''",
                "CREATE TABLE t (d date, m datetime, p datetime(6), s timestamp(6) NULL, "
                "c time(6), l time)",
                "INSERT INTO t VALUES ('2024-02-29', '2024-02-29 01:02:03', "
                "'2024-02-29 01:02:03.123456', '2024-02-29 01:02:03.000001', "
                "'-800:00:00.000001', '23:59:59'), "
                "('0000-00-00', '0000-00-00', '2024-00-00 01:00', '0000-00-00', 0, '838:59:59'), "
                "('2024-02-00', '9999-12-31', '2024-02-29 01:02:03.5', NULL, NULL, '-00:00:01')"});
    fetch("SELECT * FROM t");
    EXPECT_EQ(keeper.rows,
              QStringList({"t:2024-02-29 | t:2024-02-29 01:02:03 | t:2024-02-29 01:02:03.123456 | "
                           "t:2024-02-29 01:02:03.000001 | t:-800:00:00.000001 | t:23:59:59",
                           "t:0000-00-00 | t:0000-00-00 00:00:00 | t:2024-00-00 01:00:00.000000 | "
                           "t:0000-00-00 00:00:00.000000 | t:00:00:00.000000 | t:838:59:59",
                           "t:2024-02-00 | t:9999-12-31 00:00:00 | t:2024-02-29 01:02:03.500000 | "
                           "0: | 0: | t:-00:00:01"}));
}

TEST_F(OnMaria, FindsARowByWhatItShows) {
    runOnMaria({"USE here", "SET sql_mode = ''",
                "CREATE TABLE t (b bit(8), w bit(64), p datetime(6), s timestamp(6) NULL, "
                "c time(6), z date, l time(6))",
                "INSERT INTO t VALUES (200, 18446744073709551615, '2024-02-29 01:02:03.123456', "
                "'2024-02-29 01:02:03.000001', '23:59:59.999999', '0000-00-00', "
                "'-800:00:00.000001'), (201, 1, '2024-02-29 01:02:03.123457', "
                "'2024-02-29 01:02:03', '23:59:59.999998', '2024-02-00', '-800:00:00.000002')"});
    expectFoundByWhatIsShown(mariaAddress("here"), "t", model::sql::Dialect::MySQL, {"z", "l"});
}

TEST_F(OnMaria, StopsAStatementThatWouldTakeMinutes) {
    std::thread stopping([this] {
        const reader::Connection watching(oneMariaServer.server().connect("watching"));
        for (int working = 0; working == 0;) {
            QSqlQuery query(watching.database());
            query.exec("SELECT count(*) FROM information_schema.processlist WHERE info LIKE "
                       "'SELECT count%seq_1%' AND id <> CONNECTION_ID()");
            query.next();
            working = query.value(0).toInt();
        }
        stop = true;
    });
    const Outcome outcome =
        fetch("SELECT count(*) FROM seq_1_to_1000000 a CROSS JOIN seq_1_to_1000000 b "
              "WHERE a.seq * b.seq = -1");
    stopping.join();
    EXPECT_EQ(outcome.end, Outcome::End::cancelled);
}

TEST_F(OnMaria, KeepsTheDigitsOfAMomentThatIsAskedForInAnExpression) {
    runOnMaria({"USE here", "CREATE TABLE t (p datetime(6), c time(6))",
                "INSERT INTO t VALUES (NULL, NULL)"});
    const auto query = draw(mariaAddress("here"), {"t"});
    for (const char16_t* expression :
         {u"Coalesce([t].[p], :moment)", u"Coalesce([t].[c], :time)"}) {
        const auto definition = platform::makeRef<model::ColumnDefinition>();
        definition->expression(expression);
        query->AddColumnDefinition(definition);
    }
    const auto text = designer::statementFor(*query, model::sql::Dialect::MySQL, {});
    const designer::Answers answers{{"moment", "2024-02-29 01:02:03.123456"},
                                    {"time", "23:59:59.999999"}};
    fetch(designer::makeCommand(text, model::sql::Dialect::MySQL, answers, {}));
    EXPECT_EQ(keeper.rows, QStringList("t:2024-02-29 01:02:03.123456 | t:23:59:59.999999"));
}

TEST_F(OnMaria, EndsAtTheLimit) {
    Command command{"SELECT seq FROM seq_1_to_100", {}, 10};
    EXPECT_EQ(fetch(command).end, Outcome::End::limited);
    EXPECT_EQ(keeper.rows.size(), 10);
    command.limit = 100;
    EXPECT_EQ(fetch(command).end, Outcome::End::complete);
    command.limit = 0;
    EXPECT_EQ(fetch(command).end, Outcome::End::limited);
}

TEST_F(OnMaria, GivesTheFirstRowsBeforeTheLastOnesAreThere) {
    // The whole result would take minutes and all the memory that there is.
    keeper.refuseAfter = 1000;
    const Outcome outcome = fetch("SELECT * FROM seq_1_to_1000000 a CROSS JOIN seq_1_to_1000000 b");
    EXPECT_EQ(outcome.end, Outcome::End::refused);
    EXPECT_EQ(outcome.rows, 1000);
    // The server learns in its own time that nobody reads any more.
    const QStringList none("n:0");
    const QDeadlineTimer patience(10'000);
    do {
        keeper = {};
        fetch("SELECT count(*) FROM information_schema.processlist WHERE info LIKE '%seq_1_%' AND "
              "id <> CONNECTION_ID()");
    } while (keeper.rows != none && !patience.hasExpired());
    EXPECT_EQ(keeper.rows, none);
}

TEST_F(OnMaria, StopsAStatementInTheMidstOfItsRows) {
    keeper.afterFirst = [this] { stop = true; };
    EXPECT_EQ(fetch("SELECT * FROM seq_1_to_1000000 a CROSS JOIN seq_1_to_1000000 b").end,
              Outcome::End::cancelled);
}

TEST_F(OnMaria, TellsOfAFailureBetweenTwoRows) {
    const Outcome outcome = fetch("SELECT (SELECT seq FROM seq_1_to_2 WHERE seq <= IF(s.seq > "
                                  "50000, 2, 1)) FROM seq_1_to_100000 s");
    EXPECT_EQ(outcome.end, Outcome::End::failed);
    EXPECT_EQ(outcome.message, "Subquery returns more than 1 row");
    EXPECT_FALSE(keeper.finished);
}

TEST_F(OnMaria, TellsThatTheConnectionIsLostInTheMidstOfARow) {
    const QString statement = "SELECT REPEAT('x', 10000000) AS here FROM seq_1_to_1000";
    keeper.afterFirst = [&] {
        // It has more to write than anybody has read.
        runOnMaria({"SET @there = (SELECT id FROM information_schema.processlist WHERE info LIKE "
                    "'SELECT REPEAT%')",
                    "EXECUTE IMMEDIATE CONCAT('KILL ', @there)"});
    };
    const Outcome outcome = fetch(statement);
    EXPECT_EQ(outcome.end, Outcome::End::lost);
    EXPECT_FALSE(outcome.message.isEmpty());
    EXPECT_GE(outcome.rows, 1);
    EXPECT_LT(outcome.rows, 1000);
    EXPECT_FALSE(keeper.finished);
}

TEST_F(OnMaria, WaitsForOneWhoReadsSlowly) {
    runOnMaria({"SET GLOBAL net_write_timeout = 1"});
    keeper.afterFirst = [] { std::this_thread::sleep_for(std::chrono::milliseconds(2500)); };
    const Outcome outcome = fetch("SELECT REPEAT('x', 10000) FROM seq_1_to_2000");
    runOnMaria({"SET GLOBAL net_write_timeout = DEFAULT"});
    EXPECT_EQ(outcome.end, Outcome::End::complete) << outcome.message.toStdString();
    EXPECT_EQ(outcome.rows, 2000);
}

TEST_F(OnMaria, GivesTheRowsOfTheFirstOfSeveralResults) {
    runOnMaria({"USE here", "CREATE PROCEDURE p() BEGIN SELECT 1 AS one; SELECT 2 AS two; END"});
    EXPECT_EQ(fetch("CALL p()").end, Outcome::End::complete);
    EXPECT_EQ(keeper.columns, QStringList("one"));
    EXPECT_EQ(keeper.rows, QStringList("n:1"));
}

TEST_F(OnMaria, TellsAFailureFromALostConnection) {
    const Outcome failed = fetch("SELECT nothing FROM nowhere");
    EXPECT_EQ(failed.end, Outcome::End::failed);
    EXPECT_THAT(failed.message.toStdString(), HasSubstr("nowhere"));
    EXPECT_EQ(fetch("DO SLEEP(0)").end, Outcome::End::complete);
    EXPECT_NE(fetch("CREATE TABLE written (x int)").end, Outcome::End::complete);
}
