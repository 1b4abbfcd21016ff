#include "Queries.h"
#include "model/TemporaryDatabase.h"
#include "model/reader/OneMariaServer.h"
#include "model/reader/OneServer.h"
#include "support/OdbcSources.h"

using namespace zandor;

using designer::Database;
using designer::Outcome;
using model::sql::Dialect;

// Rows behind the drivers of ODBC that there are.

namespace {

class OnOdbc : public testing::Test {
protected:
    Outcome fetch(const designer::Command& command) {
        return designer::fetch(Database::connectorTo(address, {}), command, keeper, stop);
    }
    Outcome fetch(const QString& statement) { return fetch({statement, {}, {}}); }

    OdbcSources sources;
    QString address;
    Keeper keeper;
    std::atomic<bool> stop = false;
};

class OnPostgresBehindOdbc : public OnOdbc {
protected:
    void SetUp() override {
        if (const auto missing = OdbcSources::missing(odbcOfPostgres))
            GTEST_SKIP() << missing->toStdString();
        address =
            "odbc://" + sources.add(odbcOfPostgres, {"Servername=" + oneServer.server().folder(),
                                                     "Database=postgres", "Username=postgres"});
        runOnServer({"DROP TABLE IF EXISTS moments"});
    }
};

class OnMariaBehindOdbc : public OnOdbc {
protected:
    void SetUp() override {
        if (const auto missing = OdbcSources::missing(odbcOfMaria))
            GTEST_SKIP() << missing->toStdString();
        if (const auto missing = MariaServer::missing()) GTEST_SKIP() << missing->toStdString();
        runOnMaria({"CREATE OR REPLACE DATABASE here"});
        address =
            "odbc://" + sources.add(odbcOfMaria, {"SOCKET=" + oneMariaServer.server().socket(),
                                                  "DATABASE=here", "USER=root"});
    }
};

class OnSqliteBehindOdbc : public OnOdbc {
protected:
    void SetUp() override {
        if (const auto missing = OdbcSources::missing(odbcOfSqlite))
            GTEST_SKIP() << missing->toStdString();
        address = "odbc://" + sources.add(odbcOfSqlite, {"Database=" + database.path()});
    }
    TemporaryDatabase database{{
        QStringLiteral("CREATE TABLE moments (d date, m timestamp, c time, t text, n integer)"),
        QStringLiteral("INSERT INTO moments VALUES ('2024-02-29', '2024-02-29 01:02:03.123456', "
                       "'23:59:59.999999', 'é', 1), ('2024-03-01', '2024-02-29 01:02:03', "
                       "'23:59', '', 2)"),
    }};
};

} // namespace

TEST_F(OnPostgresBehindOdbc, GivesMomentsWithAllTheirDigits) {
    runOnServer({"CREATE TABLE moments (d date, m timestamp, z timestamptz, c time, t text)",
                 "INSERT INTO moments VALUES ('2024-02-29', '2024-02-29 01:02:03.123456', "
                 "'2024-02-29 01:02:03.000001', '23:59:59.999999', 'é'), (NULL, NULL, NULL, NULL, "
                 "''), ('2024-03-01', '2024-02-29 01:02:03', '2024-02-29 01:02:03.5', '01:02', "
                 "NULL)"});
    EXPECT_EQ(fetch("SELECT * FROM moments").end, Outcome::End::complete);
    EXPECT_EQ(keeper.rows,
              QStringList({"t:2024-02-29 | t:2024-02-29 01:02:03.123456 | "
                           "t:2024-02-29 01:02:03.000001 | t:23:59:59.999999 | t:é",
                           "0: | 0: | 0: | 0: | t:",
                           "t:2024-03-01 | t:2024-02-29 01:02:03 | t:2024-02-29 01:02:03.5 | "
                           "t:01:02:00 | 0:"}));
    runOnServer(
        {"DELETE FROM moments WHERE d IS NULL", "UPDATE moments SET t = 'b' WHERE t IS NULL"});
    expectFoundByWhatIsShown(address, "moments", Dialect::PostgreSQL);
}

// The driver reads the engine's text and writes its own: it knows no era and drops the offset.
TEST_F(OnPostgresBehindOdbc, GivesWhatTheDriverMakesOfOtherMoments) {
    fetch("SELECT TIMESTAMP 'infinity', DATE '-infinity', DATE '0044-03-15 BC', TIME '24:00', "
          "TIMETZ '01:02:03.25+05:30', TIMESTAMPTZ '2024-05-01 10:30:00.000001+05:30' FROM "
          "(SELECT set_config('TimeZone', 'Asia/Kathmandu', true)) AS there");
    EXPECT_EQ(keeper.rows, QStringList("t:9999-12-31 23:59:59 | t:0000-00-00 | t:0044-03-15 | "
                                       "t:24:00:00 | t:01:02:03.25+05:30 | "
                                       "t:2024-05-01 10:45:00.000001"));
}

TEST_F(OnMariaBehindOdbc, GivesMomentsAsTheEngineWritesThem) {
    runOnMaria({"USE here", "SET sql_mode = ''",
                "CREATE TABLE moments (d date, m datetime(6), s timestamp(6) NULL, c time(6), "
                "l datetime, t varchar(9))",
                "INSERT INTO moments VALUES ('2024-02-29', '2024-02-29 01:02:03.123456', "
                "'2024-02-29 01:02:03.000001', '23:59:59.999999', '2024-02-29 01:02:03', 'é'), "
                "('2024-03-01', '2024-02-29 01:02:03', '2024-02-29 01:02:03.5', '01:02', "
                "'9999-12-31', '')"});
    EXPECT_EQ(fetch("SELECT * FROM moments").end, Outcome::End::complete);
    EXPECT_EQ(keeper.rows, QStringList({"t:2024-02-29 | t:2024-02-29 01:02:03.123456 | "
                                        "t:2024-02-29 01:02:03.000001 | t:23:59:59.999999 | "
                                        "t:2024-02-29 01:02:03 | t:é",
                                        "t:2024-03-01 | t:2024-02-29 01:02:03.000000 | "
                                        "t:2024-02-29 01:02:03.500000 | t:01:02:00.000000 | "
                                        "t:9999-12-31 00:00:00 | t:"}));
    runOnMaria({"UPDATE here.moments SET t = 'b' WHERE t = ''"});
    expectFoundByWhatIsShown(address, "moments", Dialect::MySQL);
}

TEST_F(OnMariaBehindOdbc, GivesWhatNoCalendarHas) {
    runOnMaria({"USE here", "SET sql_mode = ''",
                "CREATE TABLE moments (d date, m datetime(6), c time(6), n date)",
                "INSERT INTO moments VALUES ('0000-00-00', '0000-00-00', '-800:00:00.000001', "
                "NULL)"});
    fetch("SELECT * FROM moments");
    EXPECT_EQ(keeper.rows, QStringList("t:0000-00-00 | t:0000-00-00 00:00:00.000000 | "
                                       "t:-800:00:00.000001 | 0:"));
}

TEST_F(OnMariaBehindOdbc, FindsByTexts) {
    runOnMaria({"USE here", "CREATE TABLE t (a text)", "INSERT INTO t VALUES ('it''s \\\\ ?')"});
    const auto query = draw(address, {"t"}, {{"t.a", {"it's \\ ?"}}});
    EXPECT_EQ(fetch(commandFor(query, Dialect::MySQL)).end, Outcome::End::complete);
    EXPECT_EQ(keeper.rows, QStringList("t:it's \\ ?"));
}

TEST_F(OnSqliteBehindOdbc, GivesMomentsAsTheyAreKept) {
    EXPECT_EQ(fetch("SELECT * FROM moments").end, Outcome::End::complete);
    EXPECT_EQ(keeper.rows, QStringList({"t:2024-02-29 | t:2024-02-29 01:02:03.123456 | "
                                        "t:23:59:59.999999 | t:é | n:1",
                                        "t:2024-03-01 | t:2024-02-29 01:02:03 | t:23:59 | t: | "
                                        "n:2"}));
}

TEST_F(OnSqliteBehindOdbc, FindsARowByWhatItShows) {
    writeSqlite(database.path(), {QStringLiteral("UPDATE moments SET c = '23:59:00', t = 'b' "
                                                 "WHERE n = 2")});
    expectFoundByWhatIsShown(address, "moments", Dialect::SQLite);
}
