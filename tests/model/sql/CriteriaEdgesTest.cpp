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
