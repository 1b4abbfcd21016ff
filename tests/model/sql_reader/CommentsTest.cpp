#include "Reading.h"

#include <array>

using namespace zandor;
using namespace std::string_literals;

// Comments stay with what they stand by: a statement in the printer's own layout comes back whole.

namespace {

class Comments : public Reading {
protected:
    void expectKept(platform::StringView written, Dialect dialect = Dialect::SQLite) {
        read(written, dialect);
        EXPECT_EQ(text(dialect), platform::toUtf8(written));
    }

    /// "column x1 beside: its text", as the record has it.
    std::vector<std::string> comments() const {
        static constexpr std::array places = {"start",  "table", "column", "criterion",
                                              "groups", "order", "end"};
        std::vector<std::string> all;
        for (const auto& comment : record.options.comments) {
            std::string line = places[static_cast<std::size_t>(comment.place)];
            if (!comment.key.empty()) line += ' ' + platform::toUtf8(comment.key);
            if (comment.row != 0) line += ' ' + std::to_string(comment.row);
            all.push_back(line + (comment.beside ? " beside: " : ": ") +
                          platform::toUtf8(comment.text));
        }
        return all;
    }
};

} // namespace

TEST_F(Comments, StandByAllThatAStatementHas) {
    expectKept(uR"(-- Who pays late
-- as of today
SELECT DISTINCT -- once each
    -- the customer
    customers.name, -- in full
    COUNT(*) AS n -- how often
-- all of them
FROM customers -- from the shop
    -- with or without
    LEFT JOIN orders ON customers.id = orders.customer_id -- one to many
-- only these
WHERE customers.active = TRUE -- still here
    -- and not abroad
    AND customers.city = 'Wien'
-- by person
GROUP BY customers.name -- the whole name
-- several
HAVING COUNT(*) > 2 -- at least three
-- the most first
ORDER BY 2 DESC -- then any
LIMIT 5 -- the first five
-- that is all)");
    EXPECT_EQ(record.options.comments.size(), 21u);
}

TEST_F(Comments, StandByTablesAndColumnsAndCriteriaInTheRecord) {
    read(u"SELECT name, -- its name\n city FROM customers /* all */ WHERE id > 5 # 5\n",
         Dialect::MySQL);
    EXPECT_EQ(comments(), (Texts{"column x1 beside: its name", "table t1 beside: all",
                                 "criterion x3 4 beside: 5"}));
}

TEST_F(Comments, OfSavedQueriesStayInThem) {
    expectKept(uR"(SELECT
    q.name
FROM (
    -- inside
    SELECT
        customers.name -- theirs
    FROM customers
    WHERE customers.id > 5
    -- the inner end
) AS q -- outside
WHERE q.name <> 'x')");
    EXPECT_EQ(comments(), (Texts{"table t1 beside: outside"}));
}

TEST_F(Comments, OfSavedColumnsStayWithEachOfThem) {
    expectKept(uR"(SELECT
    q.id,
    q.name
FROM (
    SELECT
        orders.id,
        orders.customer_id,
        orders.placed,
        orders.total,
        customers.name -- the last
    FROM orders
        INNER JOIN customers ON orders.customer_id = customers.id
) AS q)");
}

TEST_F(Comments, OfHiddenColumnsStandByWhatElseTheyDo) {
    read(u"SELECT name FROM customers WHERE id > 5 ORDER BY city");
    ASSERT_EQ(columns(), (Texts{"customers.name", "(customers.city)", "(customers.id)"}));
    auto options = query->options();
    const auto by = [](const model::DefinitionRecord& definition, const char16_t* said) {
        return model::Comment{model::CommentPlace::column, definition.key, 0, true, said};
    };
    options.comments = {by(record.definitions[1], u"sorts"), by(record.definitions[2], u"asks")};
    query->options(options);
    EXPECT_EQ(text(), "SELECT\n    customers.name\nFROM customers\n"
                      "WHERE customers.id > 5 -- asks\nORDER BY customers.city -- sorts");
}

TEST_F(Comments, BeforeWithStandBeforeItAgain) {
    expectKept(uR"(-- both
WITH w AS (
    SELECT
        customers.id -- a key
    FROM customers
    WHERE customers.id > 1
)
SELECT
    w.id,
    v.id AS other
FROM w
    INNER JOIN w AS v ON w.id = v.id)");
}

TEST_F(Comments, OfBlocksBecomeLines) {
    read(u"/* first\n * second\n */\nSELECT /* all */ name /* of them */ FROM customers /**/");
    EXPECT_EQ(text(), "-- first\n-- second\nSELECT -- all\n    customers.name -- of them\n"
                      "FROM customers");
}

TEST_F(Comments, AreWrittenTheSameWhateverWasInThem) {
    for (const String& inner :
         {u"\x7F  * a\u2028 * b"s, u"\x01-- c"s, u"**\x02"s, u" \u0085 d \t"s}) {
        read(u"SELECT name -- " + inner + u"\n FROM customers /*" + inner + u"*/");
        const std::string once = text();
        read(platform::fromUtf8(std::string_view(once)));
        EXPECT_EQ(text(), once);
    }
    expectKept(u"-- a\n--\n-- b\nSELECT\n    customers.name\nFROM customers");
    read(u"/*\n\n a\n\n b\n\n*/ SELECT name FROM customers --");
    EXPECT_EQ(text(), "-- a\n--\n-- b\nSELECT\n    customers.name\nFROM customers");
}

TEST_F(Comments, WithinACalculationStandByTheWhole) {
    read(u"SELECT id,\n  COALESCE(\n    -- where known\n    city, name) AS c\nFROM customers");
    EXPECT_EQ(comments(), (Texts{"column x2: where known"}));
}

TEST_F(Comments, OfConditionsThatBecomeJoinsStandByTheTable) {
    read(u"SELECT name FROM customers c, orders o WHERE c.id = o.customer_id -- theirs\n"
         u" AND o.total > 5 -- dear");
    EXPECT_EQ(comments(), (Texts{"table t2 beside: theirs", "criterion x2 4 beside: dear"}));
    EXPECT_NE(text().find("INNER JOIN orders AS o ON c.id = o.customer_id -- theirs\n"),
              std::string::npos)
        << text();
}

TEST_F(Comments, OfConditionsThatAreWrittenInFewerWordsAreKept) {
    read(u"SELECT name FROM customers WHERE id = 1 -- one\n OR id = 2 -- two\n");
    EXPECT_EQ(text(), "SELECT\n    customers.name\nFROM customers\n"
                      "WHERE customers.id IN (1, 2) -- one two");
    read(u"SELECT name FROM customers WHERE city = 'a' -- one\n AND (id = 1 OR name = 'b') -- "
         u"two\n");
    EXPECT_EQ(text(), "SELECT\n    customers.name\nFROM customers\n"
                      "WHERE (customers.city = 'a' AND customers.id = 1) -- one\n"
                      "    OR (customers.name = 'b' AND customers.city = 'a') -- two");
}

TEST_F(Comments, GoWithWhatTheyStandBy) {
    read(u"SELECT name, -- its name\n city -- its city\nFROM customers -- all\n");
    query->ColumnDefinitions().Remove(record.definitions[0].key);
    EXPECT_EQ(text(), "SELECT\n    customers.city -- its city\nFROM customers -- all");
}

TEST_F(Comments, AreNotRun) {
    read(u"SELECT name -- what? :where @x\nFROM customers");
    using namespace zandor::model::sql;
    const auto bound = statementText(*query, Dialect::SQLite, ValueForm::bound);
    EXPECT_EQ(platform::toUtf8(bound.text), "SELECT\n    customers.name\nFROM customers");
}

TEST_F(Comments, EndBeforeTheSemicolonOfAScript) {
    read(u"SELECT name FROM customers -- all");
    using namespace zandor::model::sql;
    const auto script = [&] {
        return platform::toUtf8(statementText(*query, Dialect::SQLite, ValueForm::script).text);
    };
    EXPECT_EQ(script(), "SELECT\n    customers.name\nFROM customers -- all\n;");
    query->options({});
    EXPECT_EQ(script(), "SELECT\n    customers.name\nFROM customers;");
}

TEST_F(Comments, EndWithTheirLineWhateverIsInThem) {
    read(u"SELECT name FROM customers");
    auto options = query->options();
    options.comments = {{.text = u"one\r\ntwo\rDROP\u2028TABLE \0x"},
                        {.place = model::CommentPlace::end, .beside = true, .text = u"a\nb"}};
    options.comments[0].text += u"\0y"s;
    query->options(options);
    EXPECT_EQ(text(), "-- one\n-- twoDROP TABLE  y\nSELECT\n    customers.name\n"
                      "FROM customers -- a b");
}

TEST_F(Comments, ThatAnEngineRunsAreRefused) {
    EXPECT_EQ(refusal(u"SELECT name /*! , city */ FROM customers", Dialect::MySQL),
              "Line 1, column 13: a drawing has no place for a comment that is run; it can be run "
              "as it is.");
    EXPECT_EQ(refusal(u"SELECT name /*M!100100 , city */ FROM customers", Dialect::MySQL),
              "Line 1, column 13: a drawing has no place for a comment that is run; it can be run "
              "as it is.");
    read(u"SELECT name /*! , city */ FROM customers");
    EXPECT_EQ(columns().size(), 1u);
}

TEST_F(Comments, AreNotTwoSignsInMySql) {
    read(u"SELECT id--1 AS n FROM customers", Dialect::MySQL);
    EXPECT_NE(text(Dialect::MySQL).find("customers.id - -1 AS n"), std::string::npos)
        << text(Dialect::MySQL);
    read(u"SELECT id--1 AS n\nFROM customers");
    EXPECT_EQ(comments(), (Texts{"column x1 beside: 1 AS n"}));
}

TEST_F(Comments, StandInEachOtherWhereTheEngineHasItSo) {
    const auto nested = u"SELECT name /* a /* b */ c */ FROM customers";
    read(nested, Dialect::SqlServer);
    EXPECT_EQ(record.options.comments.size(), 1u);
    read(nested, Dialect::PostgreSQL);
    EXPECT_EQ(record.options.comments.size(), 1u);
    EXPECT_NE(refusal(nested), "drawn");
}

TEST_F(Comments, StandByTheFirstConditionOfTheirCell) {
    read(
        u"SELECT c.id FROM customers c, orders o WHERE c.id > c.city AND (o.total > 2) IS NULL AND "
        u"(o.total > 2) AND (o.total IS NULL) -- never\n");
    const std::string written = text();
    EXPECT_NE(written.find("IS NULL\n    AND o.total > 2 -- never\n    AND o.total IS NULL"),
              std::string::npos)
        << written;
    read(zandor::platform::fromUtf8(written));
    EXPECT_EQ(text(), written);
}
