#include "Databases.h"
#include "Program.h"
#include "designer/run/Queries.h"
#include "model/reader/OneServer.h"
#include "support/OdbcSources.h"

#include <gmock/gmock.h>

#include <QDeadlineTimer>
#include <QThread>

#include <algorithm>
#include <csignal>

using namespace zandor;

using testing::HasSubstr;

namespace {

int working() {
    const reader::Connection connection(oneServer.server().connect("watching"));
    QSqlQuery query(connection.database());
    EXPECT_TRUE(query.exec("SELECT count(*) FROM pg_stat_activity WHERE state = 'active' AND query "
                           "LIKE '%numbers%' AND pid <> pg_backend_pid()"));
    EXPECT_TRUE(query.next());
    return query.value(0).toInt();
}

bool comesTo(int count) {
    const QDeadlineTimer end(30'000);
    while (working() != count) {
        if (end.hasExpired()) return false;
        QThread::yieldCurrentThread();
    }
    return true;
}

class InAShellOnPostgres : public testing::Test {
protected:
    static void SetUpTestSuite() {
        runOnServer({"DROP TABLE IF EXISTS numbers",
                     "CREATE TABLE numbers AS SELECT n, 'word ' || n AS word, "
                     "CAST(NULL AS integer) AS missing FROM generate_series(0, 2999) AS n"});
    }
    QString saved(const platform::Ref<model::Query>& query, const QString& address) {
        save(folder.path("query.json"), query, address);
        return folder.path("query.json");
    }

    DatabaseFolder folder;
};

} // namespace

TEST_F(InAShellOnPostgres, WritesRows) {
    const QString address = serverAddress();
    const QString query = saved(
        draw(address, {"numbers"}, {{"numbers.n", {"< :top"}, 1}, {"numbers.word"}}), address);
    const Ended csv = runProgram({"--run", query, "--set", "top=2"});
    EXPECT_EQ(csv.code, 0) << csv.err;
    EXPECT_EQ(csv.out, "n,word\r\n0,word 0\r\n1,word 1\r\n");
    EXPECT_EQ(runProgram({"--run", query, "--set", "top=1", "--format", "json"}).out,
              "[\n{\"n\": 0, \"word\": \"word 0\"}\n]\n");
}

TEST_F(InAShellOnPostgres, StopsTheStatementWhenInterrupted) {
    const QString address = serverAddress();
    QProcess program;
    program.start(ZANDOR_DESIGNER, {"--run", saved(drawForMinutes(address), address)});
    ASSERT_TRUE(comesTo(1));
    kill(static_cast<pid_t>(program.processId()), SIGINT);
    ASSERT_TRUE(program.waitForFinished(10'000));
    EXPECT_EQ(program.exitCode(), 1);
    EXPECT_EQ(program.readAllStandardError(), "zandor-designer: Cancelled.\n");
    EXPECT_EQ(working(), 0);
}

TEST_F(InAShellOnPostgres, LeavesNothingRunningWhenNobodyReadsOn) {
    const QString address = serverAddress();
    const QString query = saved(draw(address, {"numbers", "numbers", "numbers"}), address);
    QProcess shell;
    shell.start("bash",
                {"-c", QString("\"%1\" --run \"%2\" | head -n 1").arg(ZANDOR_DESIGNER, query)});
    ASSERT_TRUE(shell.waitForFinished(60'000));
    EXPECT_EQ(shell.readAllStandardError(), "");
    EXPECT_TRUE(comesTo(0));
}

TEST_F(InAShellOnPostgres, TakesThePasswordFromWhereItIsHidden) {
    runOnServer({"DROP ROLE IF EXISTS ann", "CREATE ROLE ann LOGIN PASSWORD 'secret'",
                 "GRANT SELECT ON numbers TO ann"});
    const QString query = saved(draw(serverAddress(), {"numbers"}, {{"numbers.n", {}, 1}}), {});
    oneServer.server().requirePassword("ann");
    const QStringList asked{"--run", query, "--limit", "1", "--database", serverAddress("ann")};

    const Ended without = runProgram(asked);
    EXPECT_EQ(without.code, 2);
    EXPECT_THAT(without.err, HasSubstr("password"));

    const Ended right = runProgram(asked, {{"PGPASSWORD", "secret"}});
    EXPECT_EQ(right.code, 0) << right.err;
    EXPECT_EQ(right.out, "n\r\n0\r\n");

    QString address = serverAddress("ann:secret");
    EXPECT_EQ(runProgram({"--run", query, "--limit", "1", "--database", address}).out,
              "n\r\n0\r\n");
    const Ended wrong =
        runProgram({"--run", query, "--database", address.replace("secret", "s3cr3t")});
    EXPECT_EQ(wrong.code, 2);
    EXPECT_EQ(wrong.err.find("s3cr3t"), std::string::npos) << wrong.err;
}

TEST_F(InAShellOnPostgres, SaysInOneLineWhatWasRefusedBehindOdbc) {
    if (const auto missing = OdbcSources::missing(odbcOfPostgres))
        GTEST_SKIP() << missing->toStdString();
    OdbcSources sources;
    const QString source = sources.add(odbcOfPostgres, {"Servername=" + oneServer.server().folder(),
                                                        "Database=postgres", "Username=postgres"});
    runOnServer({"CREATE TABLE \"Brief\" (n int)"});
    const QString address = "odbc://" + source;
    const QString query = saved(draw(address, {"Brief"}, {{"Brief.n", {"< 5"}}}), address);
    EXPECT_EQ(runProgram({"--run", query}).out, "n\r\n");
    runOnServer({"DROP TABLE \"Brief\""});
    const Ended refused = runProgram({"--run", query});
    EXPECT_EQ(std::count(refused.err.begin(), refused.err.end(), '\n'), 1) << refused.err;
}
