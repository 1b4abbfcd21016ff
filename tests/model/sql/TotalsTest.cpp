#include "../Expect.h"
#include "CriteriaReading.h"

#include <Zandor/model/Snapshot.h>

using namespace zandor;

using model::Finding;
using model::Total;
using model::sql::Dialect;
using platform::String;
using platform::StringView;
using platform::toUtf8;

namespace {

using Definition = platform::Ref<model::ColumnDefinition>;

/// Queries that put rows together.
class Totals : public testing::Test, protected AllTypes {
protected:
    Definition add(StringView column, Total total = Total::None) {
        auto definition = platform::makeRef<model::ColumnDefinition>();
        definition->Column(
            column == u"*" ? table->Columns().Item(1)
                           : platform::Ref<TalvikZandorLib::ZDColumn>(table->columnNamed(column)));
        definition->total(total);
        query->AddColumnDefinition(definition);
        return definition;
    }
    Definition addExpression(StringView text, Total total = Total::None) {
        auto definition = platform::makeRef<model::ColumnDefinition>();
        definition->expression(String(text));
        definition->total(total);
        query->AddColumnDefinition(definition);
        return definition;
    }
    std::string findings() {
        std::string all;
        for (const auto& finding : model::sql::validate(*query, Dialect::SQLite))
            all += toUtf8(finding.text()) + (finding.isError() ? " (error)" : "") + "\n";
        return all;
    }
    std::string sql(Dialect dialect = Dialect::SQLite) {
        return toUtf8(
            model::sql::statementText(*query, dialect, model::sql::ValueForm::literal).text);
    }
};

} // namespace

TEST_F(Totals, AreShownByTheirColumns) {
    EXPECT_EQ(add(u"whole")->Column()->Name(), u"t.whole");
    EXPECT_EQ(add(u"whole", Total::Sum)->Column()->Name(), u"sum(t.whole)");
    EXPECT_EQ(add(u"*", Total::Count)->Column()->Name(), u"count(*)");
    EXPECT_EQ(addExpression(u"whole * 2")->Column()->Name(), u"whole * 2");
    EXPECT_EQ(addExpression(u"whole * 2", Total::Average)->Column()->Name(), u"average(whole * 2)");
    const auto sum = add(u"whole", Total::Sum);
    query->renameTable(table, u"other");
    EXPECT_EQ(sum->Column()->Name(), u"sum(other.whole)");
}

TEST_F(Totals, GoWithACopyOfTheirColumn) {
    const auto sum = add(u"whole", Total::Sum);
    const auto copy = platform::makeRef<model::ColumnDefinition>();
    copy->Column(sum->Column());
    query->AddColumnDefinition(copy);
    EXPECT_EQ(copy->total(), Total::Sum);
    EXPECT_EQ(copy->place(), sum->place());
    const auto expression = platform::makeRef<model::ColumnDefinition>();
    expression->Column(addExpression(u"t.whole + 1", Total::Largest)->Column());
    query->AddColumnDefinition(expression);
    EXPECT_EQ(expression->Column()->Name(), u"largest(t.whole + 1)");
    // Another field takes the place of an expression, and keeps the total.
    expression->Column(table->columnNamed(u"number"));
    EXPECT_EQ(expression->Column()->Name(), u"largest(t.number)");
    EXPECT_FALSE(expression->isExpression());
}

TEST_F(Totals, AndExpressionsGoWithTheirTable) {
    const auto other = query->addTable(described(u"u"));
    add(u"whole", Total::Sum);
    addExpression(u"t.whole + u.whole");
    addExpression(u"1 + 1");
    addExpression(u"u.whole * 2");
    query->DeleteTable(other);
    ASSERT_EQ(query->ColumnDefinitions().Count(), 2);
    EXPECT_EQ(query->ColumnDefinitions().Item(2)->Column()->Name(), u"1 + 1");
}

TEST_F(Totals, OfAnotherQueryAreRefused) {
    AllTypes other;
    const auto foreign = platform::makeRef<model::ColumnDefinition>();
    foreign->expression(u"t.whole + 1");
    other.query->AddColumnDefinition(foreign);
    other.query->renameTable(other.table, u"renamed"); // which ties the names
    const auto copy = platform::makeRef<model::ColumnDefinition>();
    copy->Column(foreign->Column());
    EXPECT_EQ(errorOf([&] { query->AddColumnDefinition(copy); }), 5);
    EXPECT_EQ(query->ColumnDefinitions().Count(), 0);
}

TEST_F(Totals, RefuseWhatTheyCannotBe) {
    const auto definition = add(u"whole");
    EXPECT_EQ(errorOf([&] { definition->total(static_cast<Total>(9)); }), 380);
    EXPECT_EQ(errorOf([&] { definition->sortPriority(-1); }), 380);
    EXPECT_EQ(errorOf([&] { definition->sortPriority(256); }), 380);
    EXPECT_EQ(errorOf([&] { query->options({.first = -1}); }), 380);
    EXPECT_EQ(definition->total(), Total::None);
    EXPECT_EQ(query->options(), model::QueryOptions());
}

TEST_F(Totals, AreFoundWhereTheyCannotBeSaid) {
    add(u"text", Total::Sum);
    EXPECT_EQ(findings(), "sum(t.text) holds no numbers, for which alone there is the total "
                          "\"sum\": choose another total. (error)\n");
    query->ColumnDefinitions().Remove(u"x1");
    add(u"truth", Total::Largest);
    EXPECT_EQ(findings(), "largest(t.truth) holds values that have no order, so that there is no "
                          "total \"largest\" of them: choose another total. (error)\n");
    query->ColumnDefinitions().Remove(u"x2");
    add(u"*", Total::Sum);
    EXPECT_EQ(findings(), "t.* stands for all columns: count the rows with the total \"count\", "
                          "or add the columns that are meant. (error)\n");
    query->ColumnDefinitions().Remove(u"x3");
    add(u"*");
    add(u"whole", Total::Count);
    EXPECT_EQ(findings(), "t.* stands for all columns: count the rows with the total \"count\", "
                          "or add the columns that are meant. (error)\n");
}

TEST_F(Totals, AndConditionsInSeveralRowsAreAFinding) {
    const auto condition = add(u"text", Total::Condition);
    const auto sum = add(u"whole", Total::Sum);
    condition->AddCriterium(u"Berlin", u"4");
    sum->AddCriterium(u"> 5", u"5");
    EXPECT_EQ(findings(),
              "Where criteria stand in several rows, some of a total and some of a column that is "
              "only a condition, the latter must be the same in every row: repeat it, or make two "
              "queries of this one. (error)\n");
    condition->AddCriterium(u"'Berlin'", u"5");
    EXPECT_EQ(findings(), "");
    EXPECT_EQ(sql(), "SELECT\n    SUM(t.whole) AS \"sum(t.whole)\"\nFROM t\n"
                     "WHERE t.text = 'Berlin'\nHAVING SUM(t.whole) > 5");
}

TEST_F(Totals, AreNotComparedWithWhatWasPutTogether) {
    const auto sum = add(u"whole", Total::Sum);
    sum->AddCriterium(u"> [number]", u"4");
    EXPECT_EQ(findings(), "This criterion is asked of rows that were put together, and t.number "
                          "has many values there: add it as a column of its own, or write a "
                          "value. (error)\n");
    add(u"number");
    EXPECT_EQ(findings(), "");
    sum->Criteria().Item(u"4")->Criterium(u"> [number] * 2 + Length('abc')");
    EXPECT_EQ(findings(), "");
}

TEST_F(Totals, AndSortsThatAreNotThere) {
    const auto condition = add(u"text", Total::Condition);
    condition->SortOrder(1);
    add(u"whole", Total::Sum);
    EXPECT_EQ(findings(),
              "condition(t.text) is only a condition, so that nothing can be sorted by it: choose "
              "another total, or take its sort away. (error)\n");
    condition->total(Total::None);
    EXPECT_EQ(findings(), "");
}

TEST_F(Totals, DifferentRowsAreSortedByWhatComesOut) {
    const auto hidden = add(u"whole");
    add(u"text");
    hidden->Visible(false);
    hidden->SortOrder(1);
    query->options({.distinct = true});
    EXPECT_EQ(findings(), "t.whole sorts the rows and does not come out with them, which "
                          "different rows need: show it, or take its sort away. (error)\n");
    hidden->Visible(true);
    EXPECT_EQ(findings(), "");
    // What is only a condition does not come out either, though nothing is put together.
    hidden->total(Total::Condition);
    EXPECT_NE(findings(), "");
}

TEST_F(Totals, TheFirstOfWhatIsUnsortedAreAny) {
    query->options({.first = 7});
    EXPECT_EQ(findings(), "The first 7 rows are any 7 as long as nothing is sorted: sort by what "
                          "is to decide.\n");
    add(u"whole")->SortOrder(1);
    EXPECT_EQ(findings(), "");
}

TEST_F(Totals, TakeTheLesserLimit) {
    query->options({.first = 7});
    const auto behind = [&](std::optional<std::int64_t> limit) {
        const std::string text = toUtf8(
            statementText(*query, Dialect::SQLite, model::sql::ValueForm::literal, limit).text);
        return text.substr(text.find("LIMIT"));
    };
    EXPECT_EQ(behind({}), "LIMIT 7");
    EXPECT_EQ(behind(3), "LIMIT 3");
    EXPECT_EQ(behind(9), "LIMIT 7");
}

TEST_F(Totals, WhatRowsArePutTogetherByIsWrittenOut) {
    addExpression(u"Left(text, 2) & 'x'");
    add(u"whole", Total::Count);
    const auto bound =
        model::sql::statementText(*query, Dialect::PostgreSQL, model::sql::ValueForm::bound);
    EXPECT_EQ(toUtf8(bound.text), "SELECT\n    LEFT(t.text, 2) || 'x' AS \"Left(text, 2) & 'x'\",\n"
                                  "    COUNT(t.whole) AS \"count(t.whole)\"\nFROM t\n"
                                  "GROUP BY LEFT(t.text, 2) || 'x'");
    EXPECT_TRUE(bound.bindings.empty());
}

TEST_F(Totals, AQuestionThatRowsArePutTogetherByIsFoundByItsNumber) {
    const auto asked = addExpression(u"If(whole > :limit, 'x', 'y')");
    asked->Synonym(u"size");
    add(u"whole", Total::Count);
    EXPECT_EQ(sql(Dialect::PostgreSQL),
              "SELECT\n    CASE WHEN t.whole > :limit THEN 'x' ELSE 'y' END AS size,\n"
              "    COUNT(t.whole) AS \"count(t.whole)\"\nFROM t\nGROUP BY 1");
    EXPECT_EQ(sql(Dialect::SqlServer), "");
    asked->Visible(false);
    EXPECT_EQ(findings(), "The parameter limit stands in an expression that rows are put together "
                          "by: show that column, or write a value in the place of the parameter. "
                          "(error)\n");
}

TEST_F(Totals, ALongNameIsTheColumnsNumber) {
    addExpression(u"text & '" + String(70, u'x') + u"'");
    EXPECT_NE(sql().find("AS \"column 1\""), std::string::npos) << sql();
}

TEST_F(Totals, AreUndoneAndDoneAgain) {
    const auto definition = add(u"whole");
    model::Snapshot snapshot(*query);
    definition->total(Total::Sum);
    definition->sortPriority(3);
    query->options({.distinct = true, .first = 5, .description = u"x"});
    const auto other = addExpression(u"t.whole");
    const auto change = snapshot.update(*query);
    const auto after = query->record();
    query->apply(change.reversed());
    EXPECT_EQ(definition->total(), Total::None);
    EXPECT_EQ(definition->sortPriority(), 0);
    EXPECT_EQ(query->options(), model::QueryOptions());
    EXPECT_EQ(query->ColumnDefinitions().Count(), 1);
    snapshot.update(*query);
    query->apply(change);
    EXPECT_EQ(query->record(), after);
    snapshot.update(*query);
    other->expression(u"t.number");
    const auto typed = snapshot.update(*query);
    ASSERT_EQ(typed.definitions.changed.size(), 1U);
    EXPECT_EQ(typed.definitions.changed[0].before.expression.text, u"t.whole");
}

TEST_F(Totals, ComeOutAllWhereNoneIsShown) {
    add(u"text")->Visible(false);
    add(u"whole", Total::Sum)->Visible(false);
    EXPECT_EQ(sql(), "SELECT\n    t.text,\n    SUM(t.whole)\nFROM t\nGROUP BY t.text");
}

// MariaDB 10.11 gives "SELECT DISTINCT AVG(1) FROM t GROUP BY id" a row for each group.
TEST_F(Totals, AreDifferentInMySqlByASelectAroundThem) {
    add(u"text")->SortOrder(2);
    add(u"whole", Total::Average);
    query->options({.distinct = true, .first = 3});
    EXPECT_EQ(sql(Dialect::MySQL),
              "SELECT DISTINCT * FROM (\nSELECT\n    t.text,\n"
              "    AVG(t.whole * 1e0) AS `average(t.whole)`\nFROM t\nGROUP BY t.text\n) AS totals\n"
              "ORDER BY 1 DESC\nLIMIT 3");
    add(u"number", Total::Average)->Synonym(u"TEXT");
    EXPECT_EQ(sql(Dialect::MySQL).substr(0, 16), "SELECT DISTINCT\n");
}

TEST_F(Totals, AGroupAlonePutsRowsTogether) {
    add(u"text", Total::Group);
    EXPECT_EQ(sql(), "SELECT\n    t.text\nFROM t\nGROUP BY t.text");
    add(u"text", Total::Group)->Synonym(u"again");
    EXPECT_EQ(sql(), "SELECT\n    t.text,\n    t.text AS again\nFROM t\nGROUP BY t.text");
}

TEST_F(Totals, OfSeveralValuesAreAList) {
    add(u"whole", Total::Sum)->AddCriterium(u"1 Or 2", u"4");
    EXPECT_EQ(sql(), "SELECT\n    SUM(t.whole) AS \"sum(t.whole)\"\nFROM t\n"
                     "HAVING SUM(t.whole) IN (1, 2)");
}

TEST_F(Totals, OfSeveralRowsAreAskedWithTheirGroupsRowByRow) {
    add(u"text")->AddCriterium(u"Berlin", u"4");
    const auto sum = add(u"whole", Total::Sum);
    sum->AddCriterium(u"> 5", u"4");
    sum->AddCriterium(u"> 9", u"5");
    const std::string text = sql();
    EXPECT_EQ(text.substr(text.find("GROUP BY")),
              "GROUP BY t.text\nHAVING (t.text = 'Berlin' AND SUM(t.whole) > 5)\n"
              "    OR SUM(t.whole) > 9");
}

TEST_F(Totals, ThatAreNoneLeaveConditionsInTheirOrder) {
    add(u"text", Total::Condition)->AddCriterium(u"Berlin", u"4");
    add(u"whole")->AddCriterium(u"1", u"4");
    EXPECT_EQ(sql(), "SELECT\n    t.whole\nFROM t\nWHERE t.text = 'Berlin'\n    AND t.whole = 1");
}

TEST_F(Totals, AndConditionsStandBesideThatOfATableOnItself) {
    const auto join = platform::makeRef<model::Join>();
    join->LeftColumn(table->columnNamed(u"whole"));
    join->RightColumn(table->columnNamed(u"number"));
    query->AddJoin(join);
    add(u"text")->AddCriterium(u"Berlin", u"4");
    EXPECT_EQ(sql(), "SELECT\n    t.text\nFROM t\nWHERE t.whole = t.number\n"
                     "    AND t.text = 'Berlin'");
}

TEST_F(Totals, ASortByAConstantIsNone) {
    addExpression(u"2")->SortOrder(1);
    add(u"text");
    EXPECT_EQ(sql().find("ORDER BY"), std::string::npos) << sql();
}

TEST_F(Totals, WhatHasNoPrioritySortsBehindWhatHas) {
    add(u"text")->SortOrder(1);
    const auto first = add(u"whole");
    first->SortOrder(2);
    first->sortPriority(1);
    EXPECT_EQ(sql(), "SELECT\n    t.text,\n    t.whole\nFROM t\nORDER BY t.whole DESC, t.text");
}
