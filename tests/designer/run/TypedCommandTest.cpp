#include "designer/run/typedCommand.h"

#include <gmock/gmock.h>

using namespace zandor;

using model::sql::Dialect;
using testing::HasSubstr;
using testing::StartsWith;

namespace {

model::Result<designer::TypedRun, QString> run(const QString& text,
                                               Dialect dialect = Dialect::SQLite) {
    return designer::typedRun({text.toStdU16String(), dialect}, dialect);
}

std::string refusal(const QString& text, Dialect dialect = Dialect::SQLite) {
    const auto typed = run(text, dialect);
    return typed ? "it is run: " + typed->statement.toStdString() : typed.failure().toStdString();
}

std::vector<std::string> asked(const QString& text, Dialect dialect) {
    const auto typed = run(text, dialect);
    EXPECT_TRUE(typed) << refusal(text, dialect);
    std::vector<std::string> names;
    for (const auto& question : questions(*typed)) names.push_back(question.name.toStdString());
    return names;
}

std::string sent(const QString& text, const designer::Answers& answers, Dialect dialect) {
    const auto typed = run(text, dialect);
    EXPECT_TRUE(typed) << refusal(text, dialect);
    return makeCommand(*typed, answers, {}).statement.toStdString();
}

constexpr Dialect engines[] = {Dialect::SQLite, Dialect::PostgreSQL, Dialect::MySQL};

} // namespace

TEST(ATypedCommand, IsTheTextAsItStands) {
    for (const char* text :
         {"select rank() over () from t", "  -- mine\n(SELECT 1) UNION (SELECT 2)",
          "With t AS (SELECT 1) SELECT * FROM t", "VALUES (1)", "TABLE t", "((select 1))"})
        for (const Dialect dialect : engines) EXPECT_EQ(sent(text, {}, dialect), text);
}

TEST(ATypedCommand, EndsAtItsSemicolon) {
    for (const Dialect dialect : engines) {
        EXPECT_EQ(sent("SELECT ';' ; ", {}, dialect), "SELECT ';' ");
        EXPECT_EQ(sent("SELECT 1;; -- done\n/* yes; */", {}, dialect).substr(0, 8), "SELECT 1");
    }
}

TEST(ATypedCommand, IsOneStatement) {
    for (const Dialect dialect : engines)
        EXPECT_EQ(refusal("SELECT 1;\n  DELETE FROM t", dialect),
                  "Line 2, column 3: a second statement begins here: one is run at a time.");
}

TEST(ATypedCommand, IsAQuery) {
    for (const Dialect dialect : engines)
        for (const char* text :
             {"DELETE FROM t", "insert into t values (1) returning *", "PRAGMA query_only = 0",
              "VACUUM INTO 'x'", "ATTACH 'x' AS y", "COPY t TO '/tmp/x'", "DO $$ $$", "SET x = 1",
              "EXPLAIN ANALYZE DELETE FROM t", "(DELETE FROM t)", "'select'", "\"select\" 1"})
            EXPECT_THAT(refusal(text, dialect), HasSubstr("only a query is run")) << text;
    EXPECT_EQ(refusal("\n delete from t"), "Line 2, column 2: only a query is run: it begins with "
                                           "SELECT, WITH, VALUES or TABLE.");
}

TEST(ATypedCommand, IsThere) {
    for (const char* text : {"", "  \n", "-- select 1", "/* select 1 */", ";", "("})
        EXPECT_EQ(refusal(text), "There is no statement: write one, or go back to the drawing.")
            << text;
}

TEST(ATypedCommand, DoesNotWriteIntoAnything) {
    for (const Dialect dialect : engines)
        for (const char* text : {"SELECT 1 INTO OUTFILE '/tmp/x'", "select * into u from t",
                                 "WITH x AS (SELECT 1) INSERT INTO t SELECT * FROM x"})
            EXPECT_THAT(refusal(text, dialect), HasSubstr("INTO writes")) << text;
    EXPECT_THAT(refusal("SELECT 1 /*!50000 INTO OUTFILE 'x' */", Dialect::MySQL),
                HasSubstr("INTO writes"));
    EXPECT_EQ(sent("SELECT t.into, 1 AS into, 'into' FROM t", {}, Dialect::PostgreSQL),
              "SELECT t.into, 1 AS into, 'into' FROM t");
}

TEST(ATypedCommand, KnowsWhereItsEngineSeesQuotesAndComments) {
    const auto two = HasSubstr("a second statement begins here");
    struct Case {
        const char* text;
        bool sqlite, postgres, mysql; ///< whether there are two statements
    };
    for (const Case& each : {
             Case{"SELECT 'a''; DELETE FROM t'", false, false, false},
             Case{"SELECT \"a\"\"; DELETE FROM t\"", false, false, false},
             Case{"SELECT 'a\\'; DELETE FROM t -- '", true, true, false},
             Case{"SELECT 1 --; DELETE FROM t", false, false, true},
             Case{"SELECT 1--1; DELETE FROM t", false, false, true},
             Case{"SELECT 1 /* /* */; DELETE FROM t -- */", true, false, true},
             Case{"SELECT 1 /*! ; DELETE FROM t */", false, false, true},
             Case{"SELECT 1 /*M! ; DELETE FROM t */", false, false, true},
             Case{"SELECT 1 -- x\n; DELETE FROM t", true, true, true},
         }) {
        EXPECT_EQ(testing::Value(refusal(each.text, Dialect::SQLite), two), each.sqlite)
            << each.text;
        EXPECT_EQ(testing::Value(refusal(each.text, Dialect::PostgreSQL), two), each.postgres)
            << each.text;
        EXPECT_EQ(testing::Value(refusal(each.text, Dialect::MySQL), two), each.mysql) << each.text;
    }
    EXPECT_THAT(refusal("SELECT [a; b] FROM t"), StartsWith("it is run"));
    EXPECT_THAT(refusal("SELECT `a; b` FROM t", Dialect::MySQL), StartsWith("it is run"));
    EXPECT_THAT(refusal("SELECT 1 # ; a", Dialect::MySQL), StartsWith("it is run"));
    for (const char* text :
         {"SELECT $$;$$", "SELECT $a$ $$ ; $a$", "SELECT E'\\';'", "SELECT E'a'\n'\\';'"})
        EXPECT_THAT(refusal(text, Dialect::PostgreSQL), StartsWith("it is run")) << text;
    EXPECT_THAT(refusal("SELECT some'\\'; DELETE FROM t", Dialect::PostgreSQL), two);
}

TEST(ATypedCommand, ClosesWhatItOpens) {
    for (const char* text : {"SELECT 'a", "SELECT \"a", "SELECT 1 /* a", "SELECT `a", "SELECT [a"})
        EXPECT_THAT(refusal(text), HasSubstr("has no end: close it.")) << text;
    EXPECT_THAT(refusal("SELECT $a$ ", Dialect::PostgreSQL), HasSubstr("has no end"));
    EXPECT_THAT(refusal("SELECT 1 /* /* */", Dialect::PostgreSQL), HasSubstr("has no end"));
}

TEST(ATypedCommand, HasNoNul) {
    EXPECT_EQ(refusal(QStringLiteral("SELECT a") + QChar(0) + "WHERE b"),
              "Line 1, column 9: a NUL stands here: delete it.");
}

TEST(ATypedCommand, AsksForItsParameters) {
    using testing::ElementsAre;
    const char* const text = "SELECT ':no', :one, @two FROM t -- :no\nWHERE a = ? AND b = :one "
                             "AND c = ? AND d = :\"and this\"";
    for (const Dialect dialect : engines)
        EXPECT_THAT(asked(text, dialect), ElementsAre("one", "two", "1", "2", "and this"));
    EXPECT_THAT(asked("SELECT $1, $2, $1", Dialect::PostgreSQL), ElementsAre("1", "2"));
    EXPECT_THAT(asked("SELECT ?2, ?1", Dialect::SQLite), ElementsAre("2", "1"));
}

TEST(ATypedCommand, LeavesWhatItsEngineHasTheSignsForItself) {
    using testing::IsEmpty;
    for (const char* text : {"SELECT a::text, '{}'::jsonb ? 'a', b ?| c, b ?& c, b @> c, b <@ c, "
                             "e @@ f FROM t",
                             "SELECT a[1:2], a[b:c] FROM t", "SELECT $$ :a $$"})
        EXPECT_THAT(asked(text, Dialect::PostgreSQL), IsEmpty()) << text;
    EXPECT_THAT(asked("SELECT @@version, @n := @n + 1 FROM t", Dialect::MySQL), IsEmpty());
}

TEST(ATypedCommand, HasTheAnswersWrittenOut) {
    const designer::Answers answers{{"a", "5"}, {"b", "O'Neill"}, {"1", "-2"}};
    const char* const text = "SELECT x-? FROM t WHERE n > :a AND m = :b OR o = :a";
    EXPECT_EQ(sent(text, answers, Dialect::SQLite),
              "SELECT x- -2  FROM t WHERE n >  5  AND m =  'O''Neill'  OR o =  5 ");
    EXPECT_EQ(sent(text, answers, Dialect::PostgreSQL),
              "SELECT x- '-2'  FROM t WHERE n >  '5'  AND m =  'O''Neill'  OR o =  '5' ");
    EXPECT_EQ(sent("SELECT :a", {{"a", "\\'"}}, Dialect::MySQL), "SELECT  '\\\\''' ");
}

TEST(ATypedCommand, IsInTheDialectOfItsEngine) {
    const auto typed = designer::typedRun({u"SELECT 1", Dialect::MySQL}, Dialect::SQLite);
    ASSERT_FALSE(typed);
    EXPECT_EQ(typed.failure(), "The text is in MySQL/MariaDB, and the database speaks SQLite: "
                               "choose that above the text.");
}

TEST(ATypedCommand, NeedsAnEngineThatIsKeptFromWriting) {
    for (const Dialect dialect : {Dialect::SqlServer, Dialect::Standard})
        EXPECT_THAT(refusal("SELECT 1", dialect), HasSubstr("nothing would keep from writing"));
}
