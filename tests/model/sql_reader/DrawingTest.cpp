#include "Reading.h"

using Statement = Reading;

TEST_F(Statement, BecomesTablesUnderItsOwnNamesAndColumnsInItsOrder) {
    read(
        u"SELECT c.name, o.total AS sum FROM customers AS c JOIN orders o ON o.customer_id = c.id");
    ASSERT_EQ(record.tables.size(), 2u);
    EXPECT_EQ(record.tables[0].name, u"c");
    EXPECT_EQ(record.tables[0].sourceName, u"customers");
    EXPECT_EQ(record.tables[0].left, -1) << "places are the caller's";
    EXPECT_EQ(columns(), (Texts{"c.name", "o.total as sum"}));
    ASSERT_EQ(record.joins.size(), 1u);
    EXPECT_EQ(record.joins[0].type, 0);
}

TEST_F(Statement, PutsWhatSpeaksOfOneColumnIntoItsCell) {
    read(u"SELECT name FROM customers WHERE (city = 'New York' OR city LIKE 'W%') AND id > 5 "
         u"AND id <> 7 AND active");
    EXPECT_EQ(columns(), (Texts{"customers.name", "(customers.city)", "(customers.id)",
                                "(customers.active)"}));
    EXPECT_EQ(criteria(2), (Texts{"4: New York Or Like W*"}));
    EXPECT_EQ(criteria(3), (Texts{"4: > 5 And <> 7"}));
    EXPECT_EQ(criteria(4), (Texts{"4: True"}));
}

TEST_F(Statement, HasARowForEachWayInWhichItsConditionsHold) {
    read(u"SELECT name FROM customers WHERE active AND (city = 'Wien' OR id < 5)");
    EXPECT_EQ(columns(), (Texts{"customers.name", "(customers.active)", "(customers.city)",
                                "(customers.id)"}));
    EXPECT_EQ(criteria(2), (Texts{"4: True", "5: True"}));
    EXPECT_EQ(criteria(3), (Texts{"4: Wien"}));
    EXPECT_EQ(criteria(4), (Texts{"5: < 5"}));
}

TEST_F(Statement, PutsWhatNeedsMoreThanTwelveRowsIntoOneCell) {
    std::u16string where;
    for (int n = 0; n < 13; ++n)
        where += (n ? u" OR " : u"") + std::u16string(u"(id = ") + zandor::platform::decimal(n) +
                 u" AND city = 'x')";
    read(u"SELECT name FROM customers WHERE " + where);
    ASSERT_EQ(columns(), (Texts{"customers.name", "(customers.id)"}));
    EXPECT_EQ(criteria(2).size(), 1u);
    EXPECT_NE(criteria(2)[0].find("(0 And customers.city = 'x') Or"), std::string::npos)
        << criteria(2)[0];
}

TEST_F(Statement, DrawsAConditionOnACalculationAsAHiddenColumn) {
    read(u"SELECT price FROM \"Order Lines\" WHERE price * Quantity > 100");
    EXPECT_EQ(columns(),
              (Texts{"Order Lines.price", "([Order Lines].price * [Order Lines].Quantity)"}));
    EXPECT_EQ(criteria(2), (Texts{"4: > 100"}));
}

TEST_F(Statement, JoinsTablesBehindCommasByTheEqualitiesThatConnectThem) {
    read(u"SELECT name FROM customers c, orders o WHERE c.id = o.customer_id AND c.id = o.id "
         u"AND o.total > 5");
    EXPECT_EQ(record.joins.size(), 2u);
    EXPECT_EQ(columns(), (Texts{"c.name", "(o.total)"}));
}

TEST_F(Statement, KeepsTheSideOfAnOuterJoinWhicheverWayItIsWritten) {
    read(u"SELECT c.name FROM customers c LEFT JOIN orders o ON o.customer_id = c.id");
    EXPECT_EQ(record.joins[0].type, 2) << "the right end is the customer";
    read(u"SELECT c.name FROM orders o RIGHT JOIN customers c ON c.id = o.customer_id");
    EXPECT_EQ(record.joins[0].type, 1);
    EXPECT_NE(text().find("FROM customers AS c\n    LEFT JOIN orders AS o"), std::string::npos)
        << text();
}

TEST_F(Statement, HasTotalsAndGroupsAndConditionsBehindThem) {
    read(u"SELECT city, COUNT(*) AS n, SUM(total) FROM customers c JOIN orders o "
         u"ON o.customer_id = c.id WHERE active AND city <> 'Graz' GROUP BY city "
         u"HAVING COUNT(*) > 3 AND MAX(total) < 100 ORDER BY n DESC");
    // What chooses rows is asked behind what they are put together by.
    EXPECT_EQ(columns(), (Texts{"c.city", "count(*) as n", "sum(o.total)", "(largest(o.total))",
                                "(condition(c.active))"}));
    EXPECT_EQ(criteria(1), (Texts{"4: <> Graz"}));
    EXPECT_EQ(criteria(2), (Texts{"4: > 3"}));
    EXPECT_EQ(criteria(4), (Texts{"4: < 100"}));
    EXPECT_EQ(criteria(5), (Texts{"4: True"}));
    EXPECT_EQ(record.definitions[1].sortOrder, 2);
}

TEST_F(Statement, SortsByPrioritiesOnlyWhereTheColumnsStandInAnotherOrder) {
    read(u"SELECT name, city FROM customers ORDER BY name, city DESC");
    EXPECT_EQ(record.definitions[0].sortPriority, 0);
    EXPECT_EQ(record.definitions[1].sortOrder, 2);
    read(u"SELECT name, city FROM customers ORDER BY city, since, name");
    EXPECT_EQ(record.definitions[1].sortPriority, 1);
    EXPECT_EQ(record.definitions[2].sortPriority, 2);
    EXPECT_EQ(record.definitions[0].sortPriority, 3);
    EXPECT_FALSE(record.definitions[2].visible);
}

TEST_F(Statement, IsReadFromAnotherAsASavedQuery) {
    read(u"WITH big AS (SELECT id, customer_id FROM orders WHERE total > 100) "
         u"SELECT name FROM customers JOIN big ON big.customer_id = customers.id");
    ASSERT_TRUE(record.tables[1].query);
    EXPECT_EQ(record.tables[1].name, u"big");
    EXPECT_EQ(record.tables[1].query->record.tables[0].sourceName, u"orders");
}

TEST_F(Statement, AsksForItsParametersByTheirNames) {
    read(u"SELECT name FROM customers WHERE city = :city AND since >= @from AND id = ?");
    EXPECT_EQ(criteria(2), (Texts{"4: :city"}));
    EXPECT_EQ(criteria(3), (Texts{"4: >= :from"}));
    EXPECT_EQ(criteria(4), (Texts{"4: [1]"}));
}

TEST_F(Statement, ComesOutOnceInTheFirstRowsOnly) {
    read(u"SELECT DISTINCT TOP 5 city FROM customers ORDER BY city", Dialect::SqlServer);
    EXPECT_TRUE(record.options.distinct);
    EXPECT_EQ(record.options.first, 5);
    read(u"SELECT city FROM customers ORDER BY city LIMIT 0, 7", Dialect::MySQL);
    EXPECT_EQ(record.options.first, 7);
}

TEST_F(Statement, NamesSharedColumnsAsItsEngineDoes) {
    read(u"SELECT * FROM orders JOIN customers USING (id)");
    EXPECT_EQ(column(1), "orders.id");
    EXPECT_EQ(column(2), "orders.customer_id");
    EXPECT_EQ(columns().size(), 8u) << "id comes out once";
}

TEST_F(Statement, ReadsNumbersBelowZero) {
    read(u"SELECT id * -5, id - - 3, -(7) + id FROM customers WHERE id > -12 AND id < - -4");
    EXPECT_EQ(columns(), (Texts{"customers.id * -5", "customers.id - -3", "-7 + customers.id",
                                "(customers.id)"}));
    EXPECT_EQ(criteria(4), (Texts{"4: > -12 And < 4"}));
}

TEST_F(Statement, OfSmallLettersMeansThoseAloneInPostgres) {
    read(u"SELECT NAME FROM Customers", Dialect::PostgreSQL);
    EXPECT_EQ(refusal(u"SELECT \"Name\" FROM customers", Dialect::PostgreSQL),
              "Line 1, column 8: no table has a column \"Name\"; is \"name\" meant?");
}

TEST_F(Statement, PutsRowsTogetherInItsOwnOrder) {
    read(u"SELECT city, COUNT(*) AS n FROM customers GROUP BY active, city");
    EXPECT_EQ(columns(), (Texts{"(customers.active)", "customers.city", "count(*) as n"}));
    EXPECT_NE(text().find("GROUP BY customers.active, customers.city"), std::string::npos);
}

TEST_F(Statement, SortsAColumnThatStandsTwiceTwice) {
    read(u"SELECT name, name AS again FROM customers ORDER BY name, name DESC, name");
    EXPECT_NE(text().find("ORDER BY customers.name, customers.name DESC"), std::string::npos);
    EXPECT_EQ(columns().size(), 2u);
}

TEST_F(Statement, KeepsTheOrderOfConditionsWhereAColumnStandsTwice) {
    read(u"SELECT name, city, name AS again FROM customers WHERE city > 'b' AND name > 'a'");
    EXPECT_TRUE(criteria(1).empty());
    EXPECT_EQ(criteria(2), (Texts{"4: > b"}));
    EXPECT_EQ(criteria(3), (Texts{"4: > a"}));
}

TEST_F(Statement, OfAnyWriterHasNoColumnsForTheOrderOfItsConditions) {
    read(u"SELECT name, city FROM customers WHERE city > 'b' AND name > 'a'");
    EXPECT_EQ(columns(), (Texts{"customers.name", "customers.city"}));
}

TEST_F(Statement, ThatADrawingSaidIsWrittenTheSame) {
    const std::u16string written = u"SELECT\n    customers.name,\n    customers.city\n"
                                   u"FROM customers\nWHERE customers.city > 'b'\n"
                                   u"    AND customers.name > 'a'";
    read(written + u";\n");
    EXPECT_EQ(text(), zandor::platform::toUtf8(written));
    EXPECT_EQ(columns(), (Texts{"customers.name", "customers.city", "(customers.name)"}));
}

TEST_F(Statement, JoinsATableWithItselfWhereThatLeavesItsConditionsAsTheyAre) {
    const std::u16string where = u"id < customer_id AND ((total > 5 AND id = 1) OR placed IS NULL)";
    read(u"SELECT total FROM orders WHERE " + where);
    EXPECT_EQ(record.joins.size(), 1u);
    EXPECT_NE(text().find("WHERE orders.id < orders.customer_id\n"), std::string::npos) << text();
    read(u"SELECT total FROM orders WHERE id < customer_id");
    EXPECT_TRUE(record.joins.empty()) << "a cell says it as well";
}

TEST_F(Statement, AsksForNothingTwice) {
    read(u"SELECT city, COUNT(*) AS n FROM customers WHERE city = 'a' OR city > 'c' GROUP BY city "
         u"HAVING (city = 'a' OR city > 'c') AND COUNT(*) > 1");
    EXPECT_EQ(criteria(1), (Texts{"4: a Or > c"}));
}

TEST_F(Statement, KnowsANameOfWithOnlyWhereItStands) {
    EXPECT_EQ(refusal(u"SELECT a.city FROM w, (WITH w AS (SELECT city FROM customers) "
                      u"SELECT DISTINCT * FROM (SELECT city FROM w) AS q) AS a, w",
                      Dialect::MySQL),
              "Line 1, column 20: the database has no table \"w\".");
    EXPECT_EQ(refusal(u"SELECT a.city FROM (WITH w AS (SELECT city FROM customers) "
                      u"SELECT DISTINCT * FROM (SELECT city FROM w) AS q) AS a, w",
                      Dialect::MySQL),
              "Line 1, column 116: the database has no table \"w\".");
}

TEST_F(Statement, AsksBehindGroupByWhatIsAskedThere) {
    const std::u16string asked = u"SELECT\n    orders.customer_id,\n    COUNT(orders.id) AS n\n"
                                 u"FROM orders\n";
    // In one row, what rows are put together by is asked of the rows before.
    const std::u16string behind = asked + u"GROUP BY orders.customer_id\n"
                                          u"HAVING orders.customer_id > 3\n"
                                          u"    AND COUNT(orders.id) > 2";
    read(behind);
    EXPECT_EQ(text(), zandor::platform::toUtf8(behind));
    EXPECT_EQ(criteria(1), (Texts{"4: > 3", "5: > 3"}));
    EXPECT_EQ(criteria(2), (Texts{"4: > 2", "5: > 2"}));
    const std::u16string before = asked + u"WHERE orders.customer_id > 3\n"
                                          u"GROUP BY orders.customer_id\n"
                                          u"HAVING COUNT(orders.id) > 2";
    read(before);
    EXPECT_EQ(text(), zandor::platform::toUtf8(before));
    EXPECT_EQ(criteria(1), Texts{"4: > 3"});
}

TEST_F(Statement, JoinsWhatStandsBeforeACommaAsItsDialectDoes) {
    const std::u16string behind = u"SELECT o.id FROM customers c, \"Order Lines\" l JOIN orders o ";
    const std::u16string own = behind + u"ON o.id = l.order_id AND o.customer_id = c.id";
    read(own);
    EXPECT_EQ(record.joins.size(), 2U);
    EXPECT_NE(refusal(own, Dialect::PostgreSQL), "drawn");
    // The rows of another kind of join are others.
    const std::u16string right =
        u"SELECT o.id FROM customers c, \"Order Lines\" l RIGHT JOIN orders "
        u"o ON o.id = l.order_id";
    EXPECT_NE(refusal(right), "drawn");
    EXPECT_EQ(refusal(right, Dialect::PostgreSQL), "drawn");
    EXPECT_EQ(refusal(u"SELECT o.id FROM customers c, (\"Order Lines\" l RIGHT JOIN orders o ON "
                      u"o.id = l.order_id)"),
              "drawn");
    EXPECT_EQ(refusal(u"SELECT o.id FROM customers c, (\"Order Lines\" l RIGHT JOIN orders o ON "
                      u"o.id = l.order_id) LEFT JOIN customers d ON d.id = o.customer_id"),
              "drawn");
}

TEST_F(Statement, ThatADrawingHasWrittenComesBackWithItsCastsAndItsConditionsOnRows) {
    for (const std::u16string written :
         {u"SELECT\n    orders.id\nFROM orders\nWHERE orders.placed >= CAST(CAST('2023-01-01' AS "
          u"date) AS timestamp)",
          u"SELECT\n    orders.id\nFROM orders\nWHERE orders.placed >= TIMESTAMP '2023-01-01 "
          u"00:00:00'",
          u"SELECT\n    orders.id\nFROM orders\n    CROSS JOIN customers\nWHERE "
          u"orders.customer_id = customers.id",
          u"SELECT\n    'x' AS letter,\n    orders.id,\n    COUNT(*) AS n\nFROM orders\nGROUP BY "
          u"COALESCE('x', NULL), orders.id",
          u"SELECT\n    orders.id\nFROM orders\n    INNER JOIN customers ON orders.customer_id = "
          u"customers.id"}) {
        read(written, Dialect::PostgreSQL);
        EXPECT_EQ(text(Dialect::PostgreSQL), zandor::platform::toUtf8(written));
    }
    // People mean a date by it.
    read(u"SELECT id FROM orders WHERE placed >= CAST('2023-01-01' AS timestamp)",
         Dialect::PostgreSQL);
    EXPECT_EQ(criteria(2), Texts{"4: >= 2023-01-01 00:00:00"});
    read(u"SELECT o.id FROM orders o, customers c WHERE o.customer_id = c.id");
    EXPECT_EQ(record.joins.size(), 1U);
}

TEST_F(Statement, TakesANumberForTruthWhereThatIsAsked) {
    // Where a column is called True, the word would mean it.
    const std::u16string written =
        u"SELECT\n    1 AS True,\n    NOT (1) AS no,\n    CASE WHEN 0 THEN "
        u"customers.id END AS none\nFROM customers";
    read(written);
    EXPECT_EQ(text(), zandor::platform::toUtf8(written));
    EXPECT_NE(refusal(u"SELECT NOT 2 AS x FROM customers"), "drawn");
    EXPECT_NE(refusal(u"SELECT NOT 1 AS x FROM customers", Dialect::PostgreSQL), "drawn");
}

TEST_F(Statement, AsksForASmallestThatComesOutAndElseForTheGroupInMySql) {
    const std::u16string begin =
        u"SELECT orders.customer_id, MIN(orders.customer_id) AS least FROM "
        u"orders GROUP BY orders.customer_id HAVING ";
    read(begin + u"MIN(orders.customer_id) > 3", Dialect::MySQL);
    EXPECT_EQ(criteria(1), Texts{});
    EXPECT_EQ(criteria(2), Texts{"4: > 3"});
    read(u"SELECT orders.customer_id, COUNT(*) AS n FROM orders GROUP BY orders.customer_id HAVING "
         u"MIN(orders.customer_id) > 3 OR COUNT(*) > 2",
         Dialect::MySQL);
    ASSERT_EQ(record.definitions.size(), 2U);
    EXPECT_EQ(criteria(1), Texts{"4: > 3"});
    EXPECT_EQ(criteria(2), Texts{"5: > 2"});
}

TEST_F(Statement, AsksForNoTruthThatHoldsAlways) {
    for (const std::u16string condition :
         {u"TRUE", u"TRUE AND TRUE", u"TRUE OR TRUE", u"TRUE OR TRUE AND TRUE AND TRUE",
          u"TRUE = TRUE OR TRUE"}) {
        read(u"SELECT name FROM customers WHERE " + condition, Dialect::PostgreSQL);
        EXPECT_EQ(text(Dialect::PostgreSQL), "SELECT\n    customers.name\nFROM customers")
            << zandor::platform::toUtf8(condition);
    }
    read(u"SELECT name FROM customers WHERE NOT (active OR 0 <> FALSE)");
    EXPECT_EQ(text(), "SELECT\n    customers.name\nFROM customers\nWHERE customers.active <> TRUE");
}

TEST_F(Statement, TakesATextBehindAsForANameWhereTheDatabaseDoes) {
    for (const Dialect dialect : {Dialect::SQLite, Dialect::MySQL, Dialect::SqlServer}) {
        read(u"SELECT name AS 'the name' FROM customers", dialect);
        EXPECT_EQ(columns(), Texts{"customers.name as the name"});
    }
    EXPECT_NE(refusal(u"SELECT name AS 'n' FROM customers", Dialect::PostgreSQL), "drawn");
    read(u"SELECT id FROM orders WHERE placed > CAST('2023-01-01 00:00:00' AS datetime)",
         Dialect::MySQL);
    EXPECT_EQ(criteria(2), Texts{"4: > 2023-01-01 00:00:00"});
}

TEST_F(Statement, TellsAnOperatorFromTheSignBehindIt) {
    for (const Dialect dialect : {Dialect::SQLite, Dialect::MySQL, Dialect::SqlServer}) {
        read(u"SELECT name FROM customers WHERE id!=-1 AND id*-2<-3 AND id>=+4 AND id<>- -5",
             dialect);
        EXPECT_EQ(criteria(2), Texts{"4: <> -1 And >= 4 And <> 5"});
        EXPECT_EQ(criteria(3), Texts{"4: < -3"});
    }
    EXPECT_NE(refusal(u"SELECT name FROM customers WHERE id!=-1", Dialect::PostgreSQL), "drawn")
        << "one operator of its own there";
}

TEST_F(Statement, BringsWhatARightJoinSharesFromTheRightWhereTheLeftOneStands) {
    read(u"SELECT * FROM customers c RIGHT JOIN orders o USING (id)");
    EXPECT_EQ(columns(), (Texts{"o.id", "c.name", "c.city", "c.active", "c.since", "o.customer_id",
                                "o.placed", "o.total"}));
    read(u"SELECT * FROM customers c JOIN orders o USING (id) RIGHT JOIN orders p USING (id)",
         Dialect::MySQL);
    EXPECT_EQ(columns().front(), "p.id");
    EXPECT_EQ(columns().size(), 11U);
}

TEST_F(Statement, KeepsTheOrderOfConditionsWithinAQueryThatItReadsFrom) {
    const std::u16string inner =
        u"\n        SELECT\n            c.id,\n            c.name\n        FROM "
        u"customers AS c\n        WHERE c.city = 'Wien'\n            OR "
        u"(c.id > 5 AND c.name > c.city AND c.id < 9)\n    ";
    const std::u16string from = u"SELECT\n    s.name\nFROM (" + inner + u") AS s";
    EXPECT_EQ(refusal(from), "drawn");
}

TEST_F(Statement, JoinsATableWithItselfOnlyByWhatBeginsItsConditions) {
    using namespace std::string_literals;
    for (const std::u16string& where :
         {u"FROM orders AS o\n    CROSS JOIN customers AS c\nWHERE c.city = c.id\n    AND "
          u"o.customer_id <> 10.5\n    AND c.active = c.active\nORDER BY c.active DESC"s,
          u"FROM customers AS p\n    LEFT JOIN customers AS c ON p.name = c.active\n    CROSS JOIN "
          u"customers AS x\nWHERE x.active = x.name\n    AND c.active = c.active\n    AND 'a' NOT "
          u"IN ('b', 'c')"s,
          u"FROM orders AS o\n    CROSS JOIN customers AS c\nWHERE c.id = c.name\n    AND "
          u"o.placed <= "
          u"o.placed"s,
          u"FROM orders AS o\n    CROSS JOIN customers AS x\n    CROSS JOIN customers AS c\nWHERE "
          u"x.id = x.name\n    AND c.active < c.id\n    AND x.name <> x.city"s}) {
        const std::u16string written = u"SELECT\n    c.since\n" + where;
        read(written);
        EXPECT_EQ(text(), zandor::platform::toUtf8(written));
    }
}

TEST_F(Statement, KeepsTheOrderOfConditionsWithinWhereTruthIsANumber) {
    const std::u16string written =
        u"SELECT\n    1 AS True\nFROM (\n    SELECT\n        c.id,\n        c.city,\n        "
        u"c.active\n    FROM customers AS c\n    WHERE c.active = 0\n        AND c.city LIKE "
        u"'W%'\n) AS s";
    read(written);
    EXPECT_EQ(text(), zandor::platform::toUtf8(written));
}

TEST_F(Statement, KeepsTheOrderOfConditionsThatNeedMoreRowsThanThereAre) {
    const std::u16string ways = u" NOT BETWEEN 'b' AND 'e' OR c.name BETWEEN 'a' AND 'b' OR c.name "
                                u"> 'c' OR c.name > c.city)";
    const std::u16string written =
        u"SELECT\n    c.active,\n    c.since\nFROM customers AS c\nWHERE c.since <> c.since\n    "
        u"AND c.active = TRUE\n    AND ('c'" +
        ways + u"\n    AND ('d'" + ways;
    read(written);
    EXPECT_EQ(text(), zandor::platform::toUtf8(written));
}
