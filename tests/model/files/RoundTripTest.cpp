#include "Files.h"
#include "RandomQuery.h"

#include "model/SmallQuery.h"

using namespace zandor;

namespace {

using platform::makeRef;
using platform::Ref;

model::QueryRecord again(const model::Query& query, const Ref<model::Query>& itself) {
    EXPECT_EQ(&query, itself.get());
    return documentOf(jsonOf(itself)).query->record();
}

} // namespace

TEST(ASavedQuery, LoadsAsTheSameQueryWhateverAUserDidToIt) {
    std::size_t tables = 0, joins = 0, definitions = 0;
    for (std::uint32_t seed = 0; seed < 200; ++seed) {
        SCOPED_TRACE(seed);
        const auto query = randomQuery(seed);
        const std::string text = jsonOf(query);
        const auto loaded = documentOf(text);
        ASSERT_EQ(loaded.query->record(), query->record());
        ASSERT_EQ(jsonOf(loaded), text);
        tables += query->record().tables.size();
        joins += query->record().joins.size();
        definitions += query->record().definitions.size();
    }
    // The users did something.
    EXPECT_GT(tables, 400U);
    EXPECT_GT(joins, 200U);
    EXPECT_GT(definitions, 200U);
}

TEST(ASavedQuery, LoadsWithObjectsThatWorkTogether) {
    SmallQuery small;
    small.query->AddJoin(small.newJoin(small.orders, small.customers));
    const auto definition = small.query->AddColumnDefinition(small.newDefinition(small.customers));
    definition->AddCriterium(u"> 5", u"7");
    const auto loaded = documentOf(jsonOf(small.query)).query;

    const auto join = loaded->Joins().Item(u"j1");
    EXPECT_EQ(join->LeftTable(), loaded->tableNamed(u"orders"));
    EXPECT_EQ(join->RightColumn(), loaded->tableNamed(u"customers")->columnNamed(u"id"));
    const auto restored = loaded->ColumnDefinitions().Item(u"x1");
    EXPECT_EQ(restored->Column()->Key(),
              loaded->tableNamed(u"customers")->columnNamed(u"id")->Key());
    EXPECT_EQ(restored->Column()->Name(), u"customers.id");
    EXPECT_EQ(restored->Criteria().Item(u"7")->Criterium(), u"> 5");
    loaded->DeleteTable(loaded->tableNamed(u"customers"));
    EXPECT_EQ(loaded->Joins().Count(), 0);
    EXPECT_EQ(loaded->ColumnDefinitions().Count(), 0);
}

TEST(ASavedQuery, HasTheWidthOfAColumnWhereSomebodyGaveItOne) {
    SmallQuery small;
    for (const std::int32_t width : {0, 1, 2250, model::ColumnDefinition::greatestWidth}) {
        const auto definition = small.query->AddColumnDefinition(small.newDefinition(small.orders));
        dynamic_cast<model::ColumnDefinition&>(*definition).Width(width);
    }
    const std::string text = jsonOf(small.query);
    EXPECT_NE(text.find("\"width\": 2250,"), std::string::npos) << text;
    const auto record = documentOf(text).query->record();
    std::vector<std::int32_t> widths;
    for (const auto& definition : record.definitions) widths.push_back(definition.width);
    EXPECT_EQ(widths, (std::vector<std::int32_t>{0, 1, 2250, 100'000}));
    small.query->ColumnDefinitions().Remove(u"x2");
    small.query->ColumnDefinitions().Remove(u"x3");
    small.query->ColumnDefinitions().Remove(u"x4");
    EXPECT_NE(jsonOf(small.query).find("\"visible\": true, \"criteria\": []"), std::string::npos)
        << "a file without widths is as files were before";
}

TEST(ASavedQuery, NeverGivesAKeyTwiceAfterLoading) {
    SmallQuery small;
    small.query->AddJoin(small.newJoin(small.orders, small.customers));
    small.query->AddColumnDefinition(small.newDefinition(small.customers));
    small.query->DeleteTable(small.customers); // t2, c4 to c6, j1 and x1 are gone
    const auto loaded = documentOf(jsonOf(small.query)).query;

    const auto table = loaded->addTable(SmallQuery::described(u"later"));
    EXPECT_EQ(table->Key(), u"t3");
    EXPECT_EQ(table->Columns().Item(1)->Key(), u"c7");
    small.query = loaded;
    EXPECT_EQ(loaded->AddJoin(small.newJoin(table, table))->Key(), u"j2");
    EXPECT_EQ(loaded->AddColumnDefinition(small.newDefinition(table))->Key(), u"x2");
}

TEST(ASavedQuery, KeepsPlacesToTheLastTwip) {
    model::QueryRecord record;
    record.lastKeys = {.table = 1, .column = 1};
    record.tables = {{.key = u"t1",
                      .name = u"far",
                      .sourceName = u"far",
                      .left = 16'777'217, // beyond what a single can tell from its neighbour
                      .top = INT32_MIN,
                      .width = INT32_MAX,
                      .height = -1,
                      .selected = -1,
                      .columns = {{.key = u"c1", .description = {.name = u"*"}}}}};
    const auto query = model::Query::restored(record);
    EXPECT_EQ(query->record(), record);
    EXPECT_EQ(again(*query, query), record);
}

TEST(ASavedQuery, KeepsAJoinOneEndOfWhichReadsAsNothing) {
    SmallQuery small;
    const auto join = small.query->AddJoin(small.newJoin(small.orders, small.customers));
    const auto third = small.query->addTable(SmallQuery::described(u"third"));
    small.query->DeleteTable(third);
    join->RightTable(third);
    ASSERT_FALSE(join->RightTable());
    const auto loaded = documentOf(jsonOf(small.query)).query;
    EXPECT_FALSE(loaded->Joins().Item(1)->RightTable());
    // The end can be set again, to a table of this query only.
    loaded->Joins().Item(1)->RightTable(loaded->tableNamed(u"customers"));
    EXPECT_EQ(loaded->Joins().Item(1)->RightTable(), loaded->tableNamed(u"customers"));
    EXPECT_THROW(loaded->Joins().Item(1)->RightTable(small.orders), platform::RuntimeError);
}

TEST(ASavedQuery, IsRefusedWithHalfACharacterAndNamesThePlace) {
    SmallQuery small;
    small.query->AddColumnDefinition(small.newDefinition(small.orders))->Synonym(u"a\xD83D");
    const auto text = files::toJson(small.query);
    ASSERT_FALSE(text);
    EXPECT_EQ(text.error(), "/definitions/0/synonym has half a character in it (an unpaired "
                            "surrogate). Type that text afresh and save again.");
}

TEST(ASavedQuery, IsRefusedWhenItCouldNotBeReadAgain) {
    SmallQuery small;
    const auto definition = small.query->AddColumnDefinition(small.newDefinition(small.orders));
    definition->Synonym(std::u16string(1, u'\0'));
    EXPECT_EQ(files::toJson(small.query).error(),
              "The query could not be read again: /definitions/0/synonym has a NUL character in "
              "it. Mend the file there, or restore it from a copy.");
    definition->Synonym(std::u16string(100'001, u'a'));
    EXPECT_EQ(files::toJson(small.query).error(),
              "The query could not be read again: /definitions/0/synonym is longer than 100000 "
              "characters. Mend the file there, or restore it from a copy.");
    definition->Synonym(std::u16string(100'000, u'\u00e4'));
    EXPECT_TRUE(files::toJson(small.query));
}

TEST(ASavedQuery, IsRefusedWhenItWouldBeReadAsAnotherOne) {
    SmallQuery small;
    small.query->AddColumnDefinition(small.newDefinition(small.orders));
    auto record = small.query->record();
    record.definitions.front().names = {{0, 0, u"", u""}}; // of an expression that there is none of
    EXPECT_EQ(files::toJson(model::Query::restored(record)).error(),
              "The query would not be the same when read again. Report this, please.");
}

TEST(ASavedQuery, HasItsFirstRowAlone) {
    SmallQuery small;
    small.query->options({.first = 1});
    EXPECT_EQ(documentOf(jsonOf(small.query)).query->options().first, 1);
}

TEST(ASavedQuery, RemembersItsDatabase) {
    SmallQuery small;
    files::QueryDocument document(small.query);
    EXPECT_EQ(jsonOf(document).find("database"), std::string::npos);
    document.database = u"postgresql://ann@host/tr\u00e4de";
    const auto loaded = documentOf(jsonOf(document));
    EXPECT_EQ(loaded.database, document.database);
    EXPECT_FALSE(loaded.unknown) << "it is known";
}

TEST(ASavedQuery, KnowsWhatTheNamesInItsCriteriaMeant) {
    SmallQuery small;
    const auto definition = small.query->AddColumnDefinition(small.newDefinition(small.orders));
    definition->AddCriterium(u"> customers.id And < [limit]", u"4");
    small.query->DeleteTable(small.customers);
    small.query->addTable(SmallQuery::described(u"customers"));
    small.query->addTable({u"", u"limits", {{u"limit", model::ColumnType::Integer}}});

    const std::string text = jsonOf(small.query);
    EXPECT_EQ(text.find("\"table\": \"\""), std::string::npos) << "what is no name has no table";
    const auto loaded = documentOf(text).query;
    EXPECT_EQ(loaded->record(), small.query->record());
    loaded->renameTable(loaded->tableNamed(u"customers"), u"buyers");
    loaded->renameTable(loaded->tableNamed(u"limits"), u"bounds");
    EXPECT_EQ(loaded->ColumnDefinitions().Item(1)->Criteria().Item(u"4")->Criterium(),
              u"> customers.id And < [limit]")
        << "neither the new table nor the new column was meant";
}

TEST(ASavedQuery, LetsACriterionFollowItsTableAfterLoading) {
    SmallQuery small;
    const auto definition = small.query->AddColumnDefinition(small.newDefinition(small.orders));
    definition->AddCriterium(u"> customers.id", u"4");
    small.query->renameTable(small.orders, u"sales"); // ties the names
    const auto loaded = documentOf(jsonOf(small.query)).query;
    ASSERT_EQ(loaded->record().definitions[0].criteria[0].names.size(), 1u);
    loaded->renameTable(loaded->tableNamed(u"customers"), u"buyers");
    EXPECT_EQ(loaded->ColumnDefinitions().Item(1)->Criteria().Item(u"4")->Criterium(),
              u"> buyers.id");
}
