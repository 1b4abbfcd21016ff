#include "Queries.h"
#include "model/reader/OneServer.h"

#include <Zandor/DatabaseReader.h>

#include <gmock/gmock.h>

#include <thread>

using namespace zandor;

using designer::Database;
using designer::Outcome;
using model::sql::Dialect;
using testing::AllOf;
using testing::HasSubstr;
using testing::Not;

namespace {

/// A table of which three further servers have a third each.
class OnPartitions : public testing::Test {
protected:
    static void SetUpTestSuite() {
        runOnServer({"DROP SCHEMA public CASCADE", "CREATE SCHEMA public",
                     "CREATE EXTENSION postgres_fdw",
                     "CREATE TABLE numbers (n int, word text) PARTITION BY RANGE (n)"});
        for (int part = 0; part < 3; ++part) {
            servers.push_back(std::make_unique<PostgresServer>());
            {
                const reader::Connection there(servers.back()->connect("part"));
                runOver(there, {QString("CREATE TABLE numbers AS SELECT n, 'word ' || n AS word "
                                        "FROM generate_series(%1, %2) AS n")
                                    .arg(part * 1000)
                                    .arg(part * 1000 + 999)});
            }
            runOnServer(
                {QString("CREATE SERVER part%1 FOREIGN DATA WRAPPER postgres_fdw OPTIONS "
                         "(host '%2', dbname 'postgres')")
                     .arg(part)
                     .arg(servers.back()->folder()),
                 QString("CREATE USER MAPPING FOR postgres SERVER part%1 OPTIONS "
                         "(user 'postgres')")
                     .arg(part),
                 QString("CREATE FOREIGN TABLE numbers%1 PARTITION OF numbers FOR VALUES FROM "
                         "(%2) TO (%3) SERVER part%1 OPTIONS (table_name 'numbers')")
                     .arg(part)
                     .arg(part * 1000)
                     .arg((part + 1) * 1000)});
        }
    }
    static void TearDownTestSuite() {
        runOnServer({"DROP EXTENSION postgres_fdw CASCADE", "DROP TABLE numbers"});
        servers.clear();
    }

    Outcome fetch(const designer::Command& command) {
        return designer::fetch(Database::connectorTo(serverAddress(), {}), command, keeper, stop);
    }
    Outcome fetch(const platform::Ref<model::Query>& query) {
        return fetch(commandFor(query, Dialect::PostgreSQL));
    }
    /// What the engine makes of a query.
    std::string plan(const platform::Ref<model::Query>& query) {
        const auto text =
            model::sql::statementText(*query, Dialect::PostgreSQL, model::sql::ValueForm::literal);
        fetch({"EXPLAIN VERBOSE " + QString::fromStdU16String(text.text), {}, {}});
        return keeper.rows.join(u'\n').toStdString();
    }

    static inline std::vector<std::unique_ptr<PostgresServer>> servers;
    Keeper keeper;
    std::atomic<bool> stop = false;
};

} // namespace

TEST_F(OnPartitions, ListsTheTableOnce) {
    const auto opened = reader::openDatabase(serverAddress());
    ASSERT_TRUE(opened) << opened.error().toStdString();
    const auto tables = reader::makeReader(opened->database())->tables();
    ASSERT_TRUE(tables);
    EXPECT_EQ(*tables, (std::vector<reader::TableEntry>{{{u"", u"numbers"}, false}}));
}

TEST_F(OnPartitions, FindsRowsOfAllServers) {
    const auto query = draw(serverAddress(), {"numbers"},
                            {{"numbers.n", {"In (1, 1001, 2001)"}, 1}, {"numbers.word"}});
    EXPECT_EQ(fetch(query).end, Outcome::End::complete);
    EXPECT_EQ(keeper.rows,
              QStringList({"n:1 | t:word 1", "n:1001 | t:word 1001", "n:2001 | t:word 2001"}));
}

TEST_F(OnPartitions, LeavesTheConditionsToTheServers) {
    const auto one = plan(draw(serverAddress(), {"numbers"}, {{"numbers.n", {"1500"}}}));
    EXPECT_THAT(one, AllOf(HasSubstr("numbers1"), HasSubstr("WHERE ((n = 1500))"),
                           Not(HasSubstr("numbers0")), Not(HasSubstr("numbers2"))));
    const auto like =
        plan(draw(serverAddress(), {"numbers"}, {{"numbers.word", {"Like WORD 15*"}}}));
    for (const char* part : {"numbers0", "numbers1", "numbers2", "WHERE ((word ~~* "})
        EXPECT_THAT(like, HasSubstr(part));
    EXPECT_THAT(like, Not(HasSubstr("Filter:")));
}

TEST_F(OnPartitions, StopsAStatementThatWouldTakeMinutes) {
    std::thread stopping([this] {
        const reader::Connection watching(oneServer.server().connect("watching"));
        for (int working = 0; working == 0;) {
            QSqlQuery query(watching.database());
            query.exec("SELECT count(*) FROM pg_stat_activity WHERE state = 'active' AND query "
                       "LIKE '%numbers%' AND pid <> pg_backend_pid()");
            query.next();
            working = query.value(0).toInt();
        }
        stop = true;
    });
    const Outcome outcome = fetch(drawForMinutes(serverAddress()));
    stopping.join();
    EXPECT_EQ(outcome.end, Outcome::End::cancelled);
}

TEST_F(OnPartitions, SaysWhichServerIsGone) {
    servers[1]->kill();
    const auto all = draw(serverAddress(), {"numbers"}, {{"numbers.n"}});
    const Outcome outcome = fetch(all);
    EXPECT_EQ(outcome.end, Outcome::End::failed);
    EXPECT_EQ(outcome.message, "ERROR:  could not connect to server \"part1\"");
    // What does not need it goes on.
    keeper.rows.clear();
    EXPECT_EQ(fetch(draw(serverAddress(), {"numbers"}, {{"numbers.n", {"= 5"}}})).end,
              Outcome::End::complete);
    EXPECT_EQ(keeper.rows, QStringList("n:5"));
    servers[1]->restart();
    EXPECT_EQ(fetch(all).rows, 3000);
}
