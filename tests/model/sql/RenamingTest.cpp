#include <Zandor/Library.h>
#include <Zandor/model/Record.h>
#include <Zandor/sql/Builder.h>

#include <gtest/gtest.h>

using namespace zandor;

// Criteria are tied to tables, not to the names that the tables have at the moment.

namespace {

using model::sql::Dialect;
using model::sql::ValueForm;
using platform::toUtf8;

class CriteriaThatNameTables : public testing::Test {
protected:
    using TableRef = platform::Ref<model::Table>;
    using DefinitionRef = platform::Ref<TalvikZandorLib::ZDColumnDefinition>;

    static model::TableDescription described(platform::String name, platform::String column) {
        return {
            u"",
            std::move(name),
            {{u"id", model::ColumnType::Integer}, {std::move(column), model::ColumnType::Integer}}};
    }

    DefinitionRef defined(const TableRef& table, platform::StringView column,
                          const platform::String& text) {
        auto definition = library.NewZDColumnDefinition();
        definition->Column(table->columnNamed(column));
        definition->AddCriterium(text, u"4");
        return query->AddColumnDefinition(definition);
    }

    static std::string text(const DefinitionRef& definition) {
        return toUtf8(definition->Criteria().Item(u"4")->Criterium());
    }

    /// The statement's condition, or the text of its first error.
    std::string where() {
        const auto printed = model::sql::statementText(*query, Dialect::SQLite, ValueForm::literal);
        for (const auto& finding : printed.findings)
            if (finding.isError()) return toUtf8(finding.text());
        const std::string sql = toUtf8(printed.text);
        return sql.substr(sql.find("WHERE ") + 6);
    }

    model::Library library;
    platform::Ref<model::Query> query = platform::makeRef<model::Query>();
    TableRef a = query->addTable(described(u"a", u"size"));
    TableRef b = query->addTable(described(u"b", u"weight"));
};

} // namespace

TEST_F(CriteriaThatNameTables, FollowARenamedTableInEveryWayOfWriting) {
    const auto definition =
        defined(a, u"id", u"b.id Or [b].[id] Or b.[id] Or [B].id And > [weight] Or 7");
    query->renameTable(b, u"c");
    EXPECT_EQ(text(definition), "c.id Or [c].[id] Or c.[id] Or [c].id And > [weight] Or 7")
        << "in brackets where there were some";
    EXPECT_EQ(where(), "a.id = c.id\n"
                       "    OR (a.id = c.id AND a.id > c.weight)\n    OR a.id = 7");
}

TEST_F(CriteriaThatNameTables, KnowThePlacesOfTheirNamesAfterwards) {
    defined(a, u"id", u"b.id Or [b].weight Or [weight] Or b.id");
    for (const char16_t* const name : {u"a longer name", u"b"}) {
        query->renameTable(b, name);
        const auto record = query->record();
        EXPECT_FALSE(model::faultOf(record)) << toUtf8(name) << ": the query could not be saved";
        const auto& criterion = record.definitions.front().criteria.front();
        std::vector<std::string> named;
        for (const auto& each : criterion.names) {
            const auto begin = static_cast<std::size_t>(each.begin);
            const auto length = static_cast<std::size_t>(each.tableEnd) - begin;
            named.push_back(toUtf8(criterion.text.substr(begin, length)));
        }
        const std::string written = "[" + toUtf8(name) + "]";
        EXPECT_EQ(named, (std::vector<std::string>{written, written, "", written}))
            << toUtf8(criterion.text);
    }
}

TEST_F(CriteriaThatNameTables, GetBracketsWhereTheNewNameNeedsThem) {
    const auto definition = defined(a, u"id", u"> b.id And < [b].[id]");
    query->renameTable(b, u"my ]b[");
    EXPECT_EQ(text(definition), "> [my ]]b[].id And < [my ]]b[].[id]");
    EXPECT_EQ(where(), "a.id > \"my ]b[\".id\n    AND a.id < \"my ]b[\".id");
    query->renameTable(b, u"b2");
    EXPECT_EQ(text(definition), "> [b2].id And < [b2].[id]");
    EXPECT_EQ(where(), "a.id > b2.id\n    AND a.id < b2.id");
}

TEST_F(CriteriaThatNameTables, AreTheSameConditionUnderTheNewName) {
    defined(a, u"id", u"b.id");
    query->renameTable(b, u"c");
    EXPECT_EQ(where(), "a.id = c.id");
    query->renameTable(a, u"b");
    EXPECT_EQ(where(), "b.id = c.id");
}

TEST_F(CriteriaThatNameTables, DoNotSlipWhenTwoTablesSwapTheirNames) {
    const auto definition = defined(a, u"size", u"> a.id And < b.id");
    query->renameTable(a, u"x");
    query->renameTable(b, u"a");
    query->renameTable(a, u"b");
    EXPECT_EQ(text(definition), "> b.id And < a.id");
    EXPECT_EQ(where(), "b.size > b.id\n    AND b.size < a.id");
}

TEST_F(CriteriaThatNameTables, FollowAlthoughAnErrorComesLater) {
    const auto definition = defined(a, u"id", u"b.id Or abc");
    query->renameTable(b, u"c");
    EXPECT_EQ(text(definition), "c.id Or abc");
}

TEST_F(CriteriaThatNameTables, KeepWordsThatOnlyLookLikeNames) {
    a = query->addTable({u"", u"texts", {{u"word", model::ColumnType::Text}}});
    const auto words = defined(a, u"word", u"New b.id Or 'b.id' Or Like b.id");
    query->renameTable(b, u"c");
    EXPECT_EQ(text(words), "New b.id Or 'b.id' Or Like b.id");
}

TEST_F(CriteriaThatNameTables, AreAFindingWhenTheTableIsDeleted) {
    defined(a, u"id", u"1 Or b.id");
    query->DeleteTable(b);
    EXPECT_EQ(where(),
              "a.id: At character 6: the table of this column was deleted from the query.");
}

TEST_F(CriteriaThatNameTables, NeverTurnToAnotherTableOfTheDeletedOnesName) {
    const auto definition = defined(a, u"id", u"b.id");
    query->DeleteTable(b);
    query->addTable(described(u"b", u"weight"));
    EXPECT_EQ(where(),
              "a.id: At character 1: the table of this column was deleted from the query.");
    definition->Criteria().Item(u"4")->Criterium(u"b.id");
    EXPECT_EQ(where(), "a.id = b.id") << "typed anew it means the table of now";
}

TEST_F(CriteriaThatNameTables, NeverTurnToAColumnOfAnotherTableNorToAParameter) {
    defined(a, u"id", u"[weight]");
    query->DeleteTable(b);
    EXPECT_EQ(where(),
              "a.id: At character 1: the table of this column was deleted from the query.");
    query->addTable(described(u"d", u"weight"));
    EXPECT_EQ(where(),
              "a.id: At character 1: the table of this column was deleted from the query.");
}

TEST_F(CriteriaThatNameTables, StayWithTheColumnThatWasMeantWhenAnotherTableGetsItToo) {
    defined(a, u"id", u"[weight]");
    query->addTable(described(u"d", u"weight"));
    EXPECT_EQ(where(), "a.id = b.weight");
}

TEST_F(CriteriaThatNameTables, StayParametersAndTextsWhateverTablesComeLater) {
    const auto texts = query->addTable({u"", u"texts", {{u"word", model::ColumnType::Text}}});
    defined(a, u"id", u"[height]");
    defined(texts, u"word", u"late.word");
    query->addTable(
        {u"",
         u"late",
         {{u"word", model::ColumnType::Text}, {u"height", model::ColumnType::Integer}}});
    EXPECT_EQ(where(), "a.id = :height\n    AND texts.word = 'late.word'");
}

TEST_F(CriteriaThatNameTables, MayNameATableBeforeItIsThere) {
    defined(a, u"id", u"[late].[id] Or late.size");
    EXPECT_EQ(where(), "a.id: At character 1: the query has no column late.id.");
    const auto late = query->addTable(described(u"late", u"size"));
    EXPECT_EQ(where(), "a.id = late.id\n    OR a.id = late.size");
    query->renameTable(late, u"now");
    EXPECT_EQ(where(), "a.id = now.id\n    OR a.id = now.size");
}

TEST_F(CriteriaThatNameTables, FollowAlsoInADefinitionThatWasAwayAtTheTime) {
    const auto definition = defined(a, u"id", u"b.id");
    query->addTable(described(u"other", u"x"));
    query->ColumnDefinitions().Remove(definition->Key());
    query->renameTable(b, u"c");
    query->AddColumnDefinition(definition);
    EXPECT_EQ(text(definition), "c.id");
    EXPECT_EQ(where(), "a.id = c.id");
}

TEST_F(CriteriaThatNameTables, AreLeftAloneByAFailedRenaming) {
    const auto definition = defined(a, u"id", u"b.id");
    EXPECT_THROW(query->renameTable(b, u"A"), platform::RuntimeError);
    EXPECT_EQ(text(definition), "b.id");
    EXPECT_EQ(where(), "a.id = b.id");
}

TEST_F(CriteriaThatNameTables, StayWithTheOthersWhenOneOfThemIsGone) {
    const auto c = query->addTable(described(u"c", u"height"));
    const auto definition = defined(a, u"id", u"b.id Or c.id Or c.height");
    query->DeleteTable(b);
    query->renameTable(c, u"d");
    query->renameTable(c, u"e");
    EXPECT_EQ(text(definition), "b.id Or e.id Or e.height");
}

TEST_F(CriteriaThatNameTables, AreReadOverAndOverAsTheSame) {
    defined(a, u"id", u"> [limit]")->AddCriterium(u"later.name", u"5");
    const auto words = query->addTable({u"", u"words", {{u"word", model::ColumnType::Text}}});
    defined(words, u"word", u"later.name");
    for (const char16_t* const name : {u"c", u"d", u"e"}) {
        query->renameTable(b, name);
        for (const auto& each : query->record().definitions)
            EXPECT_LE(each.criteria.front().names.size(), 1U) << toUtf8(name);
        EXPECT_FALSE(model::faultOf(query->record()));
    }
}
