#include "Queries.h"
#include "model/reader/OneMariaServer.h"
#include "support/OdbcSources.h"

#include <gmock/gmock.h>

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

TEST_F(OnMaria, GivesBitsAsNumbersAndTimesBeyondADay) {
    runOnMaria({"USE here",
                "CREATE TABLE t (o bit, e bit(8), s bit(64), x time(6), "
                "d datetime, `a``\"b` int)",
                "INSERT INTO t VALUES (b'1', b'101', 65, '-800:00:00.000001', "
                "'2024-02-29 01:02:03', 7)"});
    fetch("SELECT * FROM t");
    EXPECT_EQ(keeper.rows,
              QStringList("n:1 | n:5 | n:65 | t:-800:00:00.000001 | t:2024-02-29 01:02:03 | n:7"));
    EXPECT_EQ(keeper.columns.last(), "a`\"b");
}

TEST_F(OnMaria, FindsByTextsBehindOdbcToo) {
    const QString driver = QStringLiteral("libmaodbc.so");
    if (const auto missing = OdbcSources::missing(driver, QStringLiteral("odbc-mariadb")))
        GTEST_SKIP() << missing->toStdString();
    runOnMaria({"USE here", "CREATE TABLE t (a text)", "INSERT INTO t VALUES ('it''s \\\\ ?')"});
    OdbcSources sources;
    const QString address =
        "odbc://" + sources.add(driver, {"SOCKET=" + oneMariaServer.server().socket(),
                                         "DATABASE=here", "USER=root"});
    const auto query = draw(address, {"t"}, {{"t.a", {"it's \\ ?"}}});
    EXPECT_EQ(designer::fetch(Database::connectorTo(address, {}),
                              commandFor(query, model::sql::Dialect::MySQL), keeper, stop)
                  .end,
              Outcome::End::complete);
    EXPECT_EQ(keeper.rows, QStringList("t:it's \\ ?"));
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

TEST_F(OnMaria, TellsAFailureFromALostConnection) {
    const Outcome failed = fetch("SELECT nothing FROM nowhere");
    EXPECT_EQ(failed.end, Outcome::End::failed);
    EXPECT_THAT(failed.message.toStdString(), HasSubstr("nowhere"));
    EXPECT_EQ(fetch("DO SLEEP(0)").end, Outcome::End::complete);
    EXPECT_NE(fetch("CREATE TABLE written (x int)").end, Outcome::End::complete);
}
