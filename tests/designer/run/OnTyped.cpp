#include "Queries.h"
#include "designer/database/Answers.h"
#include "model/reader/OneMariaServer.h"
#include "model/reader/OneServer.h"

#include "designer/document/Document.h"
#include "designer/run/ResultTable.h"
#include "designer/run/ResultsPanel.h"
#include "designer/run/typedCommand.h"
#include "designer/statement/StatementPanel.h"

#include <gmock/gmock.h>

#include <QAction>
#include <QElapsedTimer>
#include <QLabel>

using namespace zandor;

using designer::Database;
using designer::Outcome;
using model::sql::Dialect;
using testing::AllOf;
using testing::HasSubstr;
using testing::Not;
using testing::StartsWith;

// Statements as somebody has typed them, on servers.

namespace {

class TypedOnAServer : public testing::Test {
protected:
    /// Of a text that may be sent.
    Outcome fetch(const QString& text, const designer::Answers& answers = {},
                  std::optional<qint64> limit = {}) {
        keeper = {};
        const auto typed = designer::typedRun({text.toStdU16String(), dialect}, dialect);
        EXPECT_TRUE(typed) << text.toStdString();
        return send(makeCommand(*typed, answers, limit));
    }
    /// As if nobody had looked at the text before.
    Outcome fetchBlindly(const QString& text) { return send({text, {}, {}, true}); }
    Outcome send(const designer::Command& command) {
        return designer::fetch(Database::connectorTo(address, {}), command, keeper, stop);
    }

    void expectRefusedByTheEngine(const QString& text) {
        const Outcome outcome = fetchBlindly(text);
        EXPECT_EQ(outcome.end, Outcome::End::failed) << text.toStdString();
        EXPECT_FALSE(outcome.message.isEmpty());
        expectNothingWritten(text);
    }
    void expectNothingWritten(const QString& text) {
        fetch("SELECT count(*), min(n) FROM kept");
        EXPECT_EQ(keeper.rows, QStringList("n:2 | n:1")) << text.toStdString();
    }
    static QStringList keptTable() {
        return {"DROP TABLE IF EXISTS kept",
                "CREATE TABLE kept (n integer, word varchar(9), day date)",
                "INSERT INTO kept VALUES (1, 'one', '2026-01-01'), (2, 'two', '2026-02-02')"};
    }

    /// In the panel of rows, with a drawing behind it.
    void expectRunInThePanel() {
        designer::Document document;
        Database database;
        ASSERT_EQ(database.open(address), std::nullopt);
        document.setQuery(draw(address, {"kept"}));
        designer::StatementPanel statement(document);
        statement.takeTyping(database, [](model::Query&) { ADD_FAILURE() << "it is drawn"; });
        statement.setDatabaseDialect(database.dialect());
        statement.show();
        statement.type("SELECT word, rank() OVER (ORDER BY n) FROM kept WHERE n > 1");
        ASSERT_TRUE(until([&] { return statement.typing()->refusal().has_value(); }));
        EXPECT_EQ(document.typed()->dialect, dialect);
        designer::ResultsPanel panel(document, database);
        panel.show();
        const auto ended = [&] { return !panel.isRunning(); };
        panel.run();
        ASSERT_TRUE(until(ended));
        auto& rows = panel.findChild<designer::ResultTable*>()->rows();
        ASSERT_EQ(rows.rowCount(), 1);
        EXPECT_EQ(rows.index(0, 0).data().toString(), "two");
        EXPECT_THAT(panel.findChild<QLabel*>("runStatus")->text().toStdString(),
                    HasSubstr("of the text that was typed"));

        const auto message = [&] {
            return panel.findChild<QLabel*>("runMessage")->text().toStdString();
        };
        document.setTyped(
            files::TypedStatement{u"SELECT nothing, rank() OVER () FROM kept", dialect});
        panel.run();
        ASSERT_TRUE(until(ended));
        EXPECT_THAT(message(), AllOf(StartsWith("The database did not run the statement:\n"),
                                     HasSubstr("nothing"), Not(HasSubstr("LINE 1"))));
        document.setTyped(files::TypedStatement{u"DELETE FROM kept", dialect});
        panel.run();
        EXPECT_THAT(message(), HasSubstr("only a query is run"));

        document.setTyped(files::TypedStatement{endless.toStdU16String(), dialect});
        panel.run();
        ASSERT_TRUE(panel.isRunning());
        QElapsedTimer clock;
        clock.start();
        panel.cancelAction()->trigger();
        ASSERT_TRUE(until(ended));
        EXPECT_LT(clock.elapsed(), 5000);
        EXPECT_THAT(panel.findChild<QLabel*>("runStatus")->text().toStdString(),
                    StartsWith("Cancelled."));
    }

    Dialect dialect = Dialect::PostgreSQL;
    QString address;
    QString endless;
    Keeper keeper;
    std::atomic<bool> stop = false;
};

class TypedOnPostgres : public TypedOnAServer {
protected:
    void SetUp() override {
        runOnServer(keptTable());
        address = serverAddress();
        endless = "SELECT count(*), pg_sleep(600) FROM kept";
    }
};

class TypedOnMaria : public TypedOnAServer {
protected:
    void SetUp() override {
        if (const auto missing = MariaServer::missing()) GTEST_SKIP() << missing->toStdString();
        runOnMaria(QStringList{"CREATE OR REPLACE DATABASE here", "USE here"} + keptTable());
        dialect = Dialect::MySQL;
        address = mariaAddress("here");
        endless = "SELECT count(*), sleep(600) FROM kept";
    }
};

} // namespace

TEST_F(TypedOnPostgres, IsRunInThePanel) { expectRunInThePanel(); }

TEST_F(TypedOnMaria, IsRunInThePanel) { expectRunInThePanel(); }

TEST_F(TypedOnPostgres, TakesAnswersForWhatTheyStandBeside) {
    const designer::Answers answers{{"n", "1"}, {"word", "two"}, {"day", "2026-01-15"}};
    EXPECT_EQ(fetch("SELECT n - :n, rank() OVER (), '{\"a\": 1}'::jsonb ? 'a' FROM kept "
                    "WHERE word = :word AND day > :day AND n::text <> ':n' LIMIT :n",
                    answers)
                  .message,
              "");
    EXPECT_EQ(keeper.rows, QStringList("n:1 | n:1 | b:true"));
}

TEST_F(TypedOnMaria, TakesAnswersForWhatTheyStandBeside) {
    const designer::Answers answers{{"n", "1"}, {"word", "two"}, {"day", "2026-01-15"}};
    EXPECT_EQ(fetch("SELECT n - @n, rank() OVER (ORDER BY n) FROM kept WHERE word = @word AND day "
                    "> @day AND word <> '@n' LIMIT @n",
                    answers)
                  .message,
              "");
    EXPECT_EQ(keeper.rows, QStringList("n:1 | n:1"));
}

TEST_F(TypedOnPostgres, EndsAtTheLimitWithoutTheOtherRows) {
    QElapsedTimer clock;
    clock.start();
    const Outcome outcome =
        fetch("SELECT n, rank() OVER () FROM generate_series(1, 3000000) AS n", {}, 10);
    EXPECT_EQ(outcome.end, Outcome::End::limited);
    EXPECT_EQ(keeper.rows.size(), 10);
    EXPECT_LT(clock.elapsed(), 10'000);
    fetch("SELECT n FROM kept", {}, 2);
    EXPECT_EQ(keeper.rows.size(), 2);
}

TEST_F(TypedOnPostgres, WritesNothing) {
    runOnServer({"CREATE OR REPLACE FUNCTION writing() RETURNS integer LANGUAGE sql AS "
                 "'DELETE FROM kept; SELECT 1'"});
    for (const char* text :
         {"WITH gone AS (DELETE FROM kept RETURNING n) SELECT * FROM gone",
          "WITH x AS (SELECT 1) UPDATE kept SET n = 7 RETURNING n",
          "WITH x AS (SELECT 1) DELETE FROM kept", "SELECT writing()",
          "SELECT set_config('transaction_read_only', 'off', false), writing()"}) {
        EXPECT_EQ(fetch(text).end, Outcome::End::failed) << text;
        expectNothingWritten(text);
    }
    for (const char* text :
         {"SELECT 1; COMMIT; SET default_transaction_read_only = off; DELETE FROM kept",
          "SELECT 1; DELETE FROM kept", "SELECT * INTO other FROM kept",
          "INSERT INTO kept VALUES (3) RETURNING n"})
        expectRefusedByTheEngine(text);
}

TEST_F(TypedOnMaria, WritesNothing) {
    runOnMaria({"USE here", "CREATE FUNCTION writing() RETURNS integer MODIFIES SQL DATA BEGIN "
                            "DELETE FROM kept; RETURN 1; END"});
    for (const char* text : {"WITH x AS (SELECT 1) SELECT writing()", "SELECT writing()"}) {
        EXPECT_EQ(fetch(text).end, Outcome::End::failed) << text;
        expectNothingWritten(text);
    }
    for (const char* text :
         {"SELECT 1; SET SESSION TRANSACTION READ WRITE; DELETE FROM kept",
          "SELECT 1; DELETE FROM kept", "INSERT INTO kept VALUES (3, '', NULL) RETURNING n",
          "SELECT 1 /*! ; DELETE FROM kept */"})
        expectRefusedByTheEngine(text);
}
