#include "CriteriaReading.h"

#include <Zandor/Library.h>
#include <Zandor/sql/Builder.h>

#include <gtest/gtest.h>

using namespace zandor;

// What a finding points at: the corpus states the texts.

namespace {

using model::Finding;
using model::sql::Dialect;
using platform::String;
using platform::toUtf8;
using TalvikZandorLib::ZDColumnDefinition;
using TalvikZandorLib::ZDJoin;

class AFinding : public testing::Test {
protected:
    using TableRef = platform::Ref<model::Table>;

    TableRef added(String name) {
        return query->addTable({u"",
                                std::move(name),
                                {{u"id", model::ColumnType::Integer},
                                 {u"word", model::ColumnType::Text},
                                 {String(70, u'l'), model::ColumnType::Integer}}});
    }

    platform::Ref<ZDJoin> joined(const TableRef& left, const TableRef& right, std::int16_t type = 0,
                                 platform::StringView leftColumn = u"id",
                                 platform::StringView rightColumn = u"id") {
        auto join = library.NewZDJoin();
        join->LeftColumn(left->columnNamed(leftColumn));
        join->RightColumn(right->columnNamed(rightColumn));
        join->JoinType(type);
        return query->AddJoin(join);
    }

    platform::Ref<ZDColumnDefinition> defined(const TableRef& table, platform::StringView column) {
        auto definition = library.NewZDColumnDefinition();
        definition->Column(table->columnNamed(column));
        return query->AddColumnDefinition(definition);
    }

    /// The one finding there is.
    Finding only(Dialect dialect = Dialect::SQLite) {
        const auto findings = model::sql::validate(*query, dialect);
        if (findings.size() == 1) return findings.front();
        ADD_FAILURE() << findings.size() << " findings";
        return {Finding::Kind::noTables, {}};
    }

    bool runnable(Dialect dialect) {
        return model::sql::statementText(*query, dialect, model::sql::ValueForm::bound).runnable();
    }

    model::Library library;
    platform::Ref<model::Query> query = platform::makeRef<model::Query>();
};

} // namespace

TEST_F(AFinding, OnAQueryWithoutTablesIsAnError) {
    EXPECT_EQ(only().kind, Finding::Kind::noTables);
    EXPECT_TRUE(only().isError());
    EXPECT_FALSE(runnable(Dialect::SQLite));
}

TEST_F(AFinding, IsNotMadeOfASoundQuery) {
    joined(added(u"a"), added(u"b"), 1);
    for (const Dialect dialect : model::sql::allDialects) {
        EXPECT_TRUE(model::sql::validate(*query, dialect).empty());
        EXPECT_TRUE(runnable(dialect));
    }
}

TEST_F(AFinding, OnADefinitionWithoutItsColumnNamesTheDefinition) {
    const auto a = added(u"a");
    const auto lost = added(u"lost");
    const auto definition = defined(lost, u"id");
    query->ColumnDefinitions().Remove(definition->Key());
    query->DeleteTable(lost);
    // Only a damaged file can bring such a definition into a query.
    model::QueryRecord record = query->record();
    record.lastKeys.definition = 9;
    record.definitions.push_back({.key = u"x9"});
    query = model::Query::restored(record);
    EXPECT_EQ(only().kind, Finding::Kind::definitionWithoutColumn);
    EXPECT_EQ(only().definition, u"x9");
    EXPECT_TRUE(only().isError());
    EXPECT_EQ(toUtf8(only().text()), "The table of an output column is no longer in the query: "
                                     "delete the output column, or choose another field for it.");
}

TEST_F(AFinding, OnASortOfAllColumnsNamesTheDefinition) {
    const auto a = added(u"a");
    auto definition = library.NewZDColumnDefinition();
    definition->Column(a->Columns().Item(1));
    definition->SortOrder(1);
    query->AddColumnDefinition(definition);
    EXPECT_EQ(only().kind, Finding::Kind::sortOnAllColumns);
    EXPECT_EQ(only().definition, definition->Key());
    EXPECT_TRUE(runnable(Dialect::SQLite));
}

TEST_F(AFinding, IsNotMadeOfAColumnThatIsReallyNamedStar) {
    const auto odd = query->addTable({u"", u"odd", {{u"*", model::ColumnType::Text}}});
    auto definition = library.NewZDColumnDefinition();
    definition->Column(odd->Columns().Item(2));
    definition->SortOrder(1);
    definition->AddCriterium(u"x", u"4");
    query->AddColumnDefinition(definition);
    const auto text =
        model::sql::statementText(*query, Dialect::SQLite, model::sql::ValueForm::literal);
    EXPECT_TRUE(text.findings.empty());
    EXPECT_EQ(toUtf8(text.text),
              "SELECT\n    odd.\"*\"\nFROM odd\nWHERE odd.\"*\" = 'x'\nORDER BY odd.\"*\"");
}

TEST_F(AFinding, OnTwoOutputsOfOneNameNamesTheSecond) {
    const auto a = added(u"a");
    defined(a, u"id");
    const auto second = defined(a, u"word");
    second->Synonym(u"ID");
    EXPECT_EQ(only().kind, Finding::Kind::duplicateOutputName);
    EXPECT_EQ(only().definition, second->Key());
    second->Visible(false);
    EXPECT_TRUE(model::sql::validate(*query, Dialect::SQLite).empty());
}

TEST_F(AFinding, OnTablesThatNoJoinReachesNamesTheTable) {
    added(u"a");
    const auto b = added(u"b");
    EXPECT_EQ(only().kind, Finding::Kind::cartesianProduct);
    EXPECT_EQ(only().table, b->Key());
    EXPECT_TRUE(runnable(Dialect::SQLite));
}

TEST_F(AFinding, OnAJoinOfColumnsThatCannotBeComparedNamesTheJoin) {
    const auto join = joined(added(u"a"), added(u"b"), 0, u"id", u"word");
    EXPECT_EQ(only().kind, Finding::Kind::incomparableJoin);
    EXPECT_EQ(only().join, join->Key());
}

TEST_F(AFinding, OnAnAmbiguousOuterJoinNamesTheJoinThatMakesItSo) {
    const auto a = added(u"a");
    const auto b = added(u"b");
    const auto c = added(u"c");
    joined(a, b, 1);
    const auto second = joined(c, b, 1);
    EXPECT_EQ(only().kind, Finding::Kind::ambiguousOuterJoin);
    EXPECT_EQ(only().join, second->Key());
    EXPECT_TRUE(runnable(Dialect::SQLite));
    second->JoinType(2);
    EXPECT_TRUE(model::sql::validate(*query, Dialect::SQLite).empty());
}

TEST_F(AFinding, OnARingOfFullJoinsNamesTheOneThatClosesIt) {
    const auto a = added(u"a");
    const auto b = added(u"b");
    const auto c = added(u"c");
    joined(a, b, 3);
    joined(b, c, 3);
    EXPECT_TRUE(model::sql::validate(*query, Dialect::SQLite).empty());
    const auto last = joined(c, a, 3);
    EXPECT_EQ(only().kind, Finding::Kind::ambiguousOuterJoin);
    EXPECT_EQ(only().join, last->Key());
}

TEST_F(AFinding, OnABadCriterionNamesDefinitionRowAndPosition) {
    const auto definition = defined(added(u"a"), u"id");
    definition->AddCriterium(u"1 Or abc", u"6");
    EXPECT_EQ(only().kind, Finding::Kind::badCriterion);
    EXPECT_EQ(only().definition, definition->Key());
    EXPECT_EQ(only().row, 6);
    EXPECT_EQ(only().position, 5u);
    EXPECT_TRUE(only().isError());
    EXPECT_FALSE(runnable(Dialect::SQLite));
}

TEST_F(AFinding, OnANameThatIsNotCarriedNamesTheTable) {
    const auto table = added(String(64, u'n'));
    EXPECT_EQ(only(Dialect::PostgreSQL).kind, Finding::Kind::nameNotCarried);
    EXPECT_EQ(only(Dialect::PostgreSQL).table, table->Key());
    EXPECT_FALSE(runnable(Dialect::PostgreSQL));
    EXPECT_TRUE(runnable(Dialect::MySQL));
    query->renameTable(table, u"short");
    EXPECT_EQ(only(Dialect::PostgreSQL).table, table->Key()) << "the source's name is used too";
}

TEST_F(AFinding, OnANameThatIsNotCarriedIsMadeOfTheTablesOwnNameAndOfItsSources) {
    const auto renamed = added(u"short");
    query->renameTable(renamed, String(64, u'n'));
    EXPECT_EQ(only(Dialect::PostgreSQL).table, renamed->Key());
    query->DeleteTable(renamed);
    const auto table =
        query->addTable({u"sales", String(64, u'n'), {{u"id", model::ColumnType::Integer}}});
    query->renameTable(table, u"short");
    EXPECT_EQ(only(Dialect::PostgreSQL).table, table->Key());
    EXPECT_TRUE(runnable(Dialect::MySQL));
}

TEST_F(AFinding, OnASchemaThatIsNotCarriedNamesTheTable) {
    const auto table =
        query->addTable({String(64, u's'), u"short", {{u"id", model::ColumnType::Integer}}});
    EXPECT_EQ(only(Dialect::PostgreSQL).kind, Finding::Kind::nameNotCarried);
    EXPECT_EQ(only(Dialect::PostgreSQL).table, table->Key());
    EXPECT_FALSE(runnable(Dialect::PostgreSQL));
    EXPECT_TRUE(runnable(Dialect::SQLite));
}

TEST_F(AFinding, OnANameThatIsNotCarriedNamesTheDefinitionOrTheJoin) {
    const auto a = added(u"a");
    const auto b = added(u"b");
    const auto column = defined(a, String(70, u'l'));
    const auto synonym = defined(a, u"id");
    synonym->Synonym(String(u"x\0", 2));
    const auto join = joined(a, b, 0, u"id", String(70, u'l'));
    const auto findings = model::sql::validate(*query, Dialect::MySQL);
    ASSERT_EQ(findings.size(), 3u);
    EXPECT_EQ(findings[0].join, join->Key());
    EXPECT_EQ(findings[1].definition, column->Key());
    EXPECT_EQ(findings[2].definition, synonym->Key());
    EXPECT_EQ(toUtf8(findings[2].text()),
              "MySQL/MariaDB takes no name with the character zero in it: choose another one.");
    for (const auto& finding : findings) EXPECT_EQ(finding.kind, Finding::Kind::nameNotCarried);
}

TEST_F(AFinding, OnANameThatIsNotCarriedIsMadeOfEitherEndOfAJoin) {
    const auto a = added(u"a");
    const auto b = added(u"b");
    const auto join = joined(a, b, 0, String(70, u'l'), u"id");
    EXPECT_EQ(only(Dialect::PostgreSQL).join, join->Key());
    query->Joins().Remove(join->Key());
    const auto other = joined(a, b, 0, u"id", String(70, u'l'));
    EXPECT_EQ(only(Dialect::PostgreSQL).join, other->Key());
}

TEST_F(AFinding, IsNotMadeOfAJoinThatLostAColumnForItJoinsNothing) {
    const auto a = added(u"a");
    const auto b = added(u"b");
    const auto c = added(u"c");
    joined(a, b);
    joined(b, c);
    for (const bool left : {true, false}) {
        const auto join = joined(a, b, 1);
        left ? join->LeftTable(c) : join->RightTable(c);
        EXPECT_TRUE(model::sql::validate(*query, Dialect::SQLite).empty());
        EXPECT_TRUE(runnable(Dialect::SQLite));
        query->Joins().Remove(join->Key());
    }
}

TEST_F(AFinding, OnAPatternWithoutLikeIsOnlyAWord) {
    const auto definition = defined(added(u"a"), u"word");
    definition->AddCriterium(u"Berl*", u"5");
    EXPECT_EQ(only().kind, Finding::Kind::patternWithoutLike);
    EXPECT_EQ(only().definition, definition->Key());
    EXPECT_EQ(only().row, 5);
    EXPECT_FALSE(only().isError());
    EXPECT_TRUE(runnable(Dialect::SQLite));
}

TEST(AText, ThatIsEmptyIsNotRun) { EXPECT_FALSE(model::sql::Text().runnable()); }

TEST_F(AFinding, OnANameThatOnlyACriterionUsesIsMadeAsWell) {
    const auto a = added(u"a");
    defined(a, u"id")->AddCriterium(u"[" + String(70, u'l') + u"]", u"4");
    EXPECT_EQ(only(Dialect::PostgreSQL).kind, Finding::Kind::nameNotCarried);
    EXPECT_TRUE(runnable(Dialect::SQLite));
}

TEST_F(AFinding, OnAFullJoinThatTheDialectLacksNamesTheJoin) {
    const auto join = joined(added(u"a"), added(u"b"), 3);
    EXPECT_EQ(only(Dialect::MySQL).kind, Finding::Kind::notInDialect);
    EXPECT_EQ(only(Dialect::MySQL).join, join->Key());
    EXPECT_TRUE(model::sql::validate(*query, Dialect::PostgreSQL).empty());
    join->CompareOperator(2);
    EXPECT_EQ(only(Dialect::PostgreSQL).kind, Finding::Kind::notInDialect);
}

TEST_F(AFinding, IsOneLineWhateverIsInTheNames) {
    added(u"a\nb");
    added(u"c\r\n\u2028d");
    EXPECT_EQ(toUtf8(only().text()),
              "No join connects c   d with a b, so that every row of one comes "
              "with every row of the other: draw a join between them, add "
              "the table that lies between, or delete one.");
}

TEST(AllColumnsOfATable, ComeOutOnlyWhereTheyAreVisible) {
    model::Query query;
    const auto table = query.addTable(AllTypes::described(u"t"));
    const auto all = platform::makeRef<model::ColumnDefinition>();
    all->Column(table->Columns().Item(1));
    all->Visible(false);
    query.AddColumnDefinition(all);
    const auto one = platform::makeRef<model::ColumnDefinition>();
    one->Column(table->columnNamed(u"whole"));
    query.AddColumnDefinition(one);
    const auto statement = [&] {
        return platform::toUtf8(model::sql::statementText(query, model::sql::Dialect::SQLite,
                                                          model::sql::ValueForm::literal)
                                    .text);
    };
    EXPECT_EQ(statement(), "SELECT\n    t.whole\nFROM t");
    all->Visible(true);
    EXPECT_EQ(statement(), "SELECT\n    t.*,\n    t.whole\nFROM t");
}

TEST(AllColumnsOfATable, CannotBeAskedForAValueAndMayHaveABlankCell) {
    model::Query query;
    const auto table = query.addTable(AllTypes::described(u"t"));
    const auto all = platform::makeRef<model::ColumnDefinition>();
    all->Column(table->Columns().Item(1));
    all->AddCriterium(u"  ", u"4");
    query.AddColumnDefinition(all);
    EXPECT_TRUE(model::sql::build(query).findings.empty());
    all->AddCriterium(u"> 1", u"5");
    const auto findings = model::sql::build(query).findings;
    ASSERT_EQ(findings.size(), 1U);
    EXPECT_EQ(findings[0].kind, Finding::Kind::badCriterion);
    EXPECT_EQ(findings[0].definition, all->Key());
    EXPECT_EQ(findings[0].row, 5);
}
