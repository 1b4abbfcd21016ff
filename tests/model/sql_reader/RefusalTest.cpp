#include "Reading.h"

using Refusals = Reading;

TEST_F(Refusals, SayTheLineAndColumnOfTheTextAsItWasTyped) {
    EXPECT_EQ(refusal(u"SELECT /* nä */ [name],\n  -- what for?\n  `nmae`\nFROM customers"),
              "Line 3, column 3: no table has a column \"nmae\"; is \"name\" meant?");
    EXPECT_EQ(refusal(u"SELECT TOP 3 \U0001F600, name FROM customers", Dialect::SqlServer),
              "Line 1, column 14: no table has a column \"\U0001F600\".");
}

TEST_F(Refusals, PointBehindATextThatEndsTooEarly) {
    EXPECT_EQ(
        refusal(u"SELECT name\nFROM customers\nWHERE"),
        "Line 3, column 6: this cannot be read as SQL (syntax error at end of input); mend it "
        "here or before.");
    EXPECT_EQ(refusal(u""), "Line 1, column 1: there is no statement; write a SELECT.");
    EXPECT_EQ(refusal(u" ;; "), "Line 1, column 1: there is no statement; write a SELECT.");
}

TEST_F(Refusals, PointAtTheQuoteThatHasNoEnd) {
    EXPECT_EQ(refusal(u"SELECT name FROM customers WHERE name = 'x"),
              "Line 1, column 41: what begins here has no end; close it with '.");
    EXPECT_EQ(refusal(u"SELECT \"name FROM customers"),
              "Line 1, column 8: what begins here has no end; close it with \".");
    EXPECT_EQ(refusal(u"SELECT $a$ FROM customers", Dialect::PostgreSQL),
              "Line 1, column 8: what begins here has no end; close it with $a$.");
}

TEST_F(Refusals, PointAtTheSmallestPartThatDoesNotFit) {
    EXPECT_EQ(refusal(u"SELECT name FROM customers WHERE id > 1 AND (city = 'x' OR name > 5)"),
              "Line 1, column 60: a drawing cannot hold this: compare it with a text");
}

TEST_F(Refusals, KeepWhatOnlyLooksTheSame) {
    // A condition behind a left join takes the rows away that it has added.
    EXPECT_NE(refusal(u"SELECT c.name FROM customers c LEFT JOIN orders o ON o.customer_id = c.id "
                      u"JOIN \"Order Lines\" l ON l.order_id = o.id"),
              "drawn");
    // Whole numbers are divided into whole numbers.
    EXPECT_NE(refusal(u"SELECT Quantity / 2 FROM \"Order Lines\""), "drawn");
    // Moments are texts, and a shorter one comes first.
    EXPECT_NE(refusal(u"SELECT id FROM orders WHERE placed > '2024-01-01'"), "drawn");
    EXPECT_NE(refusal(u"SELECT name FROM customers WHERE name LIKE 'a%'", Dialect::PostgreSQL),
              "drawn");
}

TEST_F(Refusals, ComeOfTooMuchAndTooDeepAndNothingElseDoes) {
    const std::u16string select = u"SELECT name FROM customers WHERE ";
    EXPECT_NE(
        refusal(select + std::u16string(20'000, u'(') + u"id = 1" + std::u16string(20'000, u')')),
        "drawn");
    std::u16string nots;
    for (int n = 0; n < 5'000; ++n) nots += u"NOT ";
    EXPECT_NE(refusal(select + nots + u"id = 1"), "drawn");
    std::u16string sums;
    for (int n = 0; n < 5'000; ++n) sums += u"id + ";
    EXPECT_NE(refusal(select + sums + u"1 = 1"), "drawn");
    std::u16string subs;
    for (int n = 0; n < 30; ++n) subs += u"SELECT id FROM (";
    EXPECT_NE(refusal(subs + u"SELECT id FROM orders" + std::u16string(30, u')')), "drawn");
    EXPECT_EQ(refusal(select + std::u16string(200'000, u' ')).substr(0, 24),
              "Line 1, column 100001: t");
}

TEST_F(Refusals, AskWhatIsNeitherTrueNorFalseForNoTruth) {
    for (const auto* text :
         {u"SELECT name + name OR name FROM customers", u"SELECT NOT name FROM customers",
          u"SELECT CASE WHEN name THEN 1 END FROM customers",
          u"SELECT name FROM customers WHERE active AND (NOT name OR active)"})
        EXPECT_NE(refusal(text, Dialect::SqlServer).find("condition"), std::string::npos)
            << refusal(text, Dialect::SqlServer);
    EXPECT_EQ(refusal(u"SELECT CASE WHEN active THEN 1 END AS n FROM customers WHERE NOT active"),
              "drawn");
}

TEST_F(Refusals, PointAtTheCharacterZeroWhichWouldEndTheText) {
    using namespace std::string_view_literals;
    EXPECT_EQ(refusal(u"SELECT id FROM orders \0 WHERE"sv),
              "Line 1, column 23: this cannot be read as SQL (U+0000); mend it here or before.");
    EXPECT_EQ(refusal(u"SELECT id FROM customers WHERE name = 'a\0b'"sv),
              "Line 1, column 41: this cannot be read as SQL (U+0000); mend it here or before.");
}

TEST_F(Refusals, TakeNoCastForADateInSqliteWhichMakesANumberOfIt) {
    const std::string line =
        "a drawing does not know this cast; the statement can be run as it is.";
    EXPECT_EQ(refusal(u"SELECT CAST('2020-01-01' AS date) AS day FROM orders"),
              "Line 1, column 8: " + line);
    EXPECT_EQ(refusal(u"SELECT id FROM orders WHERE placed >= CAST('2023-01-01 10:00:00' AS "
                      u"timestamp)"),
              "Line 1, column 39: " + line);
    EXPECT_EQ(refusal(u"SELECT id FROM orders WHERE placed >= CAST('2023-01-01 10:00:00' AS "
                      u"datetime)",
                      Dialect::MySQL),
              "drawn");
}

TEST_F(Refusals, HaveNoTextForWhatIsTrueOrFalseWhereItIsANumber) {
    for (const char16_t* text :
         {u"length(active)", u"length(city = 'Wien' AND 1 > 1)", u"CAST(active AS TEXT)",
          u"upper(NOT active)", u"substring(TRUE, 2)", u"replace(name, active, 'x')"})
        EXPECT_NE(refusal(u"SELECT id FROM customers WHERE " + std::u16string(text) + u" <> 'x'"),
                  "drawn")
            << zandor::platform::toUtf8(text);
    EXPECT_EQ(refusal(u"SELECT CAST(active AS TEXT) AS x FROM customers"),
              "Line 1, column 8: a drawing does not know this cast; the statement can be run as it "
              "is.");
    EXPECT_EQ(
        refusal(u"SELECT length(active) AS x FROM customers"),
        "Line 1, column 8: a drawing does not know the function length as it stands here; the "
        "statement can be run as it is.");
    EXPECT_NE(refusal(u"SELECT concat(name, active) AS x FROM customers", Dialect::MySQL), "drawn");
    EXPECT_EQ(refusal(u"SELECT CAST(active AS text) AS x FROM customers", Dialect::PostgreSQL),
              "drawn");
}

TEST_F(Refusals, AskForParenthesesWhereSqliteTakesOperatorsTogetherInAnotherOrder) {
    const std::string line =
        "the database takes these operators together in another order than they "
        "are read; write parentheses.";
    const auto said = [&](const char16_t* value, Dialect dialect = Dialect::SQLite) {
        const std::string all =
            refusal(u"SELECT id FROM customers WHERE " + std::u16string(value), dialect);
        return all.ends_with(line) ? "parentheses" : all;
    };
    for (const char16_t* value :
         {u"id * 2 || name = 'x'", u"name || id + 1 = 'x'", u"active = id IN (1)",
          u"active = id BETWEEN 1 AND 3", u"active = name LIKE 'A%'", u"city IS NULL < NOT active",
          u"active IN (1) < active"})
        EXPECT_EQ(said(value), "parentheses") << zandor::platform::toUtf8(value);
    for (const char16_t* value :
         {u"(id * 2) || name = 'x'", u"name || (id + 1) = 'x'", u"active = (id IN (1))",
          u"active = (id BETWEEN 1 AND 3)", u"(city IS NULL) < (NOT active)",
          u"name || ' ' || city LIKE 'A%'", u"id IN (1) = active", u"name IS NULL = active",
          u"-id * 2 + 1 - 3 > 4 - -id", u"NOT id + 1 > 3 OR id BETWEEN 1 + 1 AND 2 * 3",
          u"active = NOT active", u"abs(id + 1) || abs(id * 2) = '22'",
          u"CASE WHEN id = 1 THEN id + 1 ELSE 2 END || name = '2'"})
        EXPECT_EQ(said(value), "drawn") << zandor::platform::toUtf8(value);
    // Others read as the parser does.
    EXPECT_EQ(said(u"name || id + 1 = 'x'", Dialect::PostgreSQL), "drawn");
}

TEST_F(Refusals, TakeNoWordForTruthAsANameInSqlite) {
    const auto named = u"SELECT name AS \"True\" FROM customers WHERE active = TRUE";
    EXPECT_EQ(refusal(named), "Line 1, column 8: a drawing has no place for this (AS true); it can "
                              "be run as it is.");
    EXPECT_EQ(refusal(named, Dialect::PostgreSQL), "drawn");
    EXPECT_NE(refusal(u"SELECT name TRUE, city FROM customers WHERE active"), "drawn");
    read(u"SELECT TRUE FROM customers WHERE active");
    EXPECT_EQ(text(), "SELECT\n    1 AS True\nFROM customers\nWHERE customers.active = 1");
    read(zandor::platform::fromUtf8(std::string_view(text())));
    EXPECT_EQ(text(), "SELECT\n    1 AS True\nFROM customers\nWHERE customers.active = 1");
}

TEST_F(Refusals, NameASchemaThatTheTableIsNotOf) {
    EXPECT_EQ(refusal(u"SELECT other.customers.name FROM customers"),
              refusal(u"SELECT other.customers.* FROM customers"));
    EXPECT_NE(refusal(u"SELECT other.customers.name FROM customers").find("\"other.customers\""),
              std::string::npos)
        << refusal(u"SELECT other.customers.name FROM customers");
    EXPECT_EQ(refusal(u"SELECT main.customers.name, main.customers.* FROM main.customers"),
              "drawn");
}

TEST_F(Refusals, TakeNoLettersBehindANumberForAName) {
    for (const char16_t* item : {u"0x2", u"1e", u"123abc", u"1_000", u"2.5x"})
        EXPECT_EQ(refusal(u"SELECT id, " + std::u16string(item) + u" FROM orders").substr(0, 49),
                  "Line 1, column 12: this cannot be read as SQL (" +
                      zandor::platform::toUtf8(item).substr(0, 2))
            << zandor::platform::toUtf8(item);
    EXPECT_EQ(refusal(u"SELECT id, 1e3 x, 2 y FROM orders"), "drawn");
}

TEST_F(Refusals, JoinNoTextsOnTwoLinesWhereTheSecondIsAName) {
    const std::u16string two = u"SELECT id, 'a'\n'b' FROM orders";
    for (const Dialect dialect : {Dialect::SQLite, Dialect::SqlServer})
        EXPECT_NE(refusal(two, dialect), "drawn");
    for (const Dialect dialect : {Dialect::PostgreSQL, Dialect::Standard})
        EXPECT_EQ(refusal(two, dialect), "drawn");
}

TEST_F(Refusals, MakeNoNumberOfATextInSqliteWhereItStandsBesideNoColumnOfATable) {
    for (const char16_t* condition :
         {u"id + 1 = '2'", u"'1' = 1", u"'1' IN (1)", u"1 IN ('1')", u"'1' BETWEEN 1 AND 2",
          u"abs(id) < '1'", u"'1' = TRUE", u"+id = '1'", u"CASE id + 1 WHEN '2' THEN 1 END = 1",
          u"coalesce('1', 1) > 0", u"coalesce('01', id, 1) = id", u"iif(active, '1', 1) = id",
          u"abs('1') = id", u"coalesce('true', active)"}) {
        const std::u16string text =
            u"SELECT name FROM customers WHERE " + std::u16string(condition);
        EXPECT_NE(refusal(text).find("write it without quotes"), std::string::npos)
            << zandor::platform::toUtf8(condition) << ": " << refusal(text);
    }
    EXPECT_EQ(refusal(u"SELECT name FROM customers WHERE id + 1 = '2'", Dialect::MySQL), "drawn");
    EXPECT_NE(refusal(u"SELECT s.n FROM (SELECT count(*) AS n FROM orders) s WHERE s.n = '5'"),
              "drawn");
    EXPECT_NE(refusal(u"SELECT city FROM customers GROUP BY city HAVING count(*) = '1'"), "drawn");
    EXPECT_EQ(refusal(u"SELECT name FROM customers WHERE name = '1' OR id = 1"), "drawn");
    read(u"SELECT id AS n FROM customers WHERE '1' = id AND customers.id IN ('1', '2')");
    EXPECT_EQ(criteria(1), Texts{"4: 1 And In (1, 2)"});
}

TEST_F(Refusals, MakeNoTruthOfATextInSqliteBesideANumberThatIsNone) {
    for (const char16_t* value :
         {u"IIF(name > 'a', '1', 1 IS NULL)", u"IIF(id > 1, 'yes', 1 IS NULL)",
          u"IIF(id > 5, '0', 0 IS NULL)"}) {
        const std::u16string text = u"SELECT " + std::u16string(value) + u" FROM customers";
        EXPECT_NE(refusal(text), "drawn") << zandor::platform::toUtf8(text);
    }
    EXPECT_EQ(refusal(u"SELECT name FROM customers WHERE active = 1 AND name = '1'"), "drawn");
}

TEST_F(Refusals, MakeNoMomentOfADateInSqliteWhereTheStatementDoesNot) {
    for (const char16_t* item :
         {u"CASE WHEN active THEN since ELSE placed END", u"coalesce(since, placed)",
          u"CASE WHEN placed BETWEEN since AND since THEN 1 END"}) {
        const std::u16string text =
            u"SELECT " + std::u16string(item) + u" AS x FROM customers, orders";
        EXPECT_EQ(refusal(text),
                  "Line 1, column 8: a drawing takes a date for a moment beside one, "
                  "which the database does not; the statement can be run as it is.");
        EXPECT_EQ(refusal(text, Dialect::PostgreSQL), "drawn");
    }
    EXPECT_EQ(refusal(u"SELECT CASE WHEN placed > datetime(since) THEN 1 END AS x FROM customers, "
                      u"orders"),
              "drawn");
}

TEST_F(Refusals, WriteNoMomentOtherwiseInSqliteWhereAnotherIsTypedAsItWouldBeWritten) {
    for (const char16_t* condition :
         {u"'2023-02-03 00:00:00' NOT BETWEEN placed AND '2023-02-03 00:00'",
          u"placed IN ('2023-02-03', '2023-02-03 00:00:00')",
          u"NOT (name = '2023-02-03 00:00:00' AND placed > '2023-02-03 00:00')"}) {
        const std::u16string text =
            u"SELECT name FROM customers, orders WHERE " + std::u16string(condition);
        EXPECT_NE(refusal(text).find("2023-02-03 00:00:00"), std::string::npos) << refusal(text);
    }
    EXPECT_EQ(refusal(u"SELECT id FROM orders WHERE placed NOT BETWEEN '2023-02-03 00:00:00' AND "
                      u"'2023-02-03 00:00:00'"),
              "drawn");
}

TEST_F(Refusals, FindNothingByAPatternThatEndsWithTheSignThatEscapes) {
    for (const Dialect dialect : {Dialect::SQLite, Dialect::PostgreSQL, Dialect::SqlServer})
        for (const char16_t* pattern : {u"'%!'", u"'!'", u"'5!%!'"}) {
            const std::u16string text = u"SELECT name FROM customers WHERE name LIKE " +
                                        std::u16string(pattern) + u" ESCAPE '!'";
            EXPECT_NE(refusal(text, dialect), "drawn") << zandor::platform::toUtf8(text);
        }
    EXPECT_EQ(refusal(u"SELECT name FROM customers WHERE name LIKE '5!%!!' ESCAPE '!'"), "drawn");
    EXPECT_EQ(
        refusal(u"SELECT name FROM customers WHERE name LIKE '%!' ESCAPE '!'", Dialect::MySQL),
        "drawn");
}

TEST_F(Refusals, LeaveNoColumnUnderTheNameOfTruthBesideAnother) {
    EXPECT_EQ(
        refusal(u"SELECT true FROM customers WHERE coalesce(true, active)"),
        "Line 1, column 8: a drawing has no place for this (AS true); it can be run as it is.");
    EXPECT_NE(
        refusal(u"SELECT c.id FROM customers c JOIN (SELECT TRUE, id FROM orders) s ON s.id = "
                u"c.id"),
        "drawn");
    EXPECT_EQ(refusal(u"SELECT true AS yes FROM customers WHERE coalesce(true, active)"), "drawn");
}

TEST_F(Refusals, CompareNoTotalUnderItsNameWithWhatIsInNoGroup) {
    for (const char16_t* total : {u"count(*)", u"sum(id)", u"max(active)", u"min(name)"})
        for (const char16_t* condition : {u"n = id", u"id = n", u"n < id", u"id >= n"}) {
            const std::u16string text = u"SELECT city, " + std::u16string(total) +
                                        u" AS n FROM customers GROUP BY city HAVING " + condition;
            EXPECT_NE(refusal(text), "drawn") << zandor::platform::toUtf8(text);
        }
    EXPECT_EQ(refusal(u"SELECT id, count(*) AS n FROM customers GROUP BY id HAVING n = id"),
              "drawn");
}
