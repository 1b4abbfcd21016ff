#include "CriteriaReading.h"

using namespace zandor;

namespace {

class AtTheEdges : public testing::Test, protected AllTypes {
protected:
    /// What follows WHERE in the statement of a query with one criterion.
    std::string where(platform::StringView column, platform::StringView text) {
        const auto definition = platform::makeRef<model::ColumnDefinition>();
        definition->Column(table->columnNamed(column));
        definition->AddCriterium(platform::String(text), u"4");
        const auto stored = query->AddColumnDefinition(definition);
        const std::string statement =
            platform::toUtf8(model::sql::statementText(*query, model::sql::Dialect::SQLite,
                                                       model::sql::ValueForm::literal)
                                 .text);
        query->ColumnDefinitions().Remove(stored->Key());
        const auto at = statement.find("WHERE ");
        return at == std::string::npos ? statement : statement.substr(at + 6);
    }
};

} // namespace

TEST_F(AtTheEdges, NotTurnsEachComparisonIntoItsOpposite) {
    EXPECT_EQ(where(u"whole", u"Not < 5"), "t.whole >= 5");
    EXPECT_EQ(where(u"whole", u"Not > 5"), "t.whole <= 5");
    EXPECT_EQ(where(u"whole", u"Not <= 5"), "t.whole > 5");
    EXPECT_EQ(where(u"whole", u"Not >= 5"), "t.whole < 5");
    EXPECT_EQ(where(u"whole", u"Not = 5"), "t.whole <> 5");
    EXPECT_EQ(where(u"whole", u"Not <> 5"), "t.whole = 5");
}

TEST_F(AtTheEdges, AYearHasFourDigits) {
    EXPECT_EQ(condition(u"on_day", u"2024-01-02").find("At character"), std::string::npos);
    for (const auto* text : {u"12024-01-02", u"202-01-02"})
        EXPECT_EQ(condition(u"on_day", text).rfind("At character 1", 0), 0U)
            << platform::toUtf8(text);
}

TEST_F(AtTheEdges, WordsWithACommaAreNoNumberWithOne) {
    EXPECT_EQ(condition(u"whole", u"a,b"), condition(u"whole", u"ab"));
    EXPECT_NE(condition(u"whole", u"1,5"), condition(u"whole", u"15,,"));
}

TEST_F(AtTheEdges, NotIsTakenIntoWhatItStandsBefore) {
    EXPECT_EQ(where(u"whole", u"Not Not 1"), "t.whole = 1");
    EXPECT_EQ(where(u"whole", u"Not (1 Or 2)"), "t.whole <> 1\n    AND t.whole <> 2");
    EXPECT_EQ(where(u"text", u"Not (Not Like 'a')"), "t.text LIKE 'a'");
    EXPECT_EQ(where(u"whole", u"Not (Not In (1, 2))"), "t.whole IN (1, 2)");
}

TEST_F(AtTheEdges, OnlyWhatOneColumnMayBeEqualToBecomesAList) {
    EXPECT_EQ(where(u"whole", u"1 Or 2 Or In (3, 1)"), "t.whole IN (1, 2, 3)");
    EXPECT_EQ(where(u"whole", u"In (1, 2) Or 1"), "t.whole IN (1, 2)");
    EXPECT_EQ(where(u"whole", u"< 1 Or 2"), "t.whole < 1\n    OR t.whole = 2");
    EXPECT_EQ(where(u"whole", u"Not In (1) Or 2"), "t.whole NOT IN (1)\n    OR t.whole = 2");
    EXPECT_EQ(where(u"whole", u"1 Or [number] = 2"), "t.whole = 1\n    OR t.number = 2");
    EXPECT_EQ(where(u"anything", u"1 Or 'x'"), "t.anything = 1\n    OR t.anything = 'x'");
}

TEST_F(AtTheEdges, ANameEndsBeforeABlankOfAnyKind) {
    EXPECT_EQ(condition(u"whole", u"> [number]\u00A0+\u00A01"), "t.whole > t.number + 1");
    EXPECT_EQ(condition(u"whole", u"> number_\u2003+ 1").rfind("At character 3", 0), 0U);
    EXPECT_EQ(condition(u"whole", u"Abs(number\u3000) > 1"), "ABS(t.number) > 1");
}

TEST_F(AtTheEdges, ANameMayHaveADollarInIt) {
    query->addTable({u"", u"costs", {{u"cost$", model::ColumnType::Integer}}});
    EXPECT_EQ(condition(u"whole", u"> Abs(cost$)"), "t.whole > ABS(costs.cost$)");
    EXPECT_EQ(condition(u"whole", u"> costs.cost$"), "t.whole > costs.cost$");
}

TEST_F(AtTheEdges, ADotAloneIsNoNameBeforeABracket) {
    EXPECT_EQ(condition(u"text", u".[whole]"),
              "At character 2: put And or Or between two conditions, or quotes around a text.");
}

TEST_F(AtTheEdges, QuotedWordsWithACommaAreNoNumberWithOne) {
    EXPECT_EQ(condition(u"whole", u"'a,b'"), condition(u"whole", u"'ab'"));
    EXPECT_NE(condition(u"whole", u"'1,5'"), condition(u"whole", u"'ab'"));
}

TEST_F(AtTheEdges, OfTwoPatternsWithoutLikeTheFirstIsToldOf) {
    const auto warning = read(u"text", u"a* Or b*").warning;
    ASSERT_TRUE(warning);
    EXPECT_EQ(warning->position, 0U);
}
