#include "Databases.h"
#include "Queries.h"

#include <gmock/gmock.h>

using namespace zandor;

using designer::makeCommand;
using designer::questions;
using designer::statementFor;
using model::sql::Dialect;
using testing::ElementsAre;

namespace {

platform::Ref<model::Query> asking() {
    return draw(sampleDatabase(), {"stock", "products"},
                {{"stock.quantity", {"< :n", "Like [which]"}},
                 {"stock.reorder_level", {"> :n"}},
                 {"products.name", {"Like [which]"}}});
}

} // namespace

TEST(TheQuestionsOfAQuery, AskForAParameterOnceHoweverOftenItIsUsed) {
    const auto asked = questions(statementFor(*asking(), Dialect::SQLite, {}));
    ASSERT_EQ(asked.size(), 2u);
    EXPECT_EQ(asked[0].name, "n");
    EXPECT_EQ(asked[0].uses.size(), 2u);
    EXPECT_EQ(asked[1].name, "which");
}

TEST(TheQuestionsOfAQuery, AskForTheTypeOfTheColumnComparedWith) {
    const auto query = draw(sampleDatabase(), {"orders", "products"},
                            {{"orders.ordered_at", {"> :since"}},
                             {"products.unit_price", {"> :price"}},
                             {"products.name", {"Like :like"}}});
    const auto asked = questions(statementFor(*query, Dialect::SQLite, {}));
    ASSERT_EQ(asked.size(), 3u);
    EXPECT_FALSE(fits(asked[0], "yesterday"));
    EXPECT_TRUE(fits(asked[0], " 2024-05-01 "));
    EXPECT_EQ(wanted(asked[0]), "a date and time such as 2024-12-31 23:59");
    EXPECT_FALSE(fits(asked[1], ""));
    EXPECT_TRUE(fits(asked[1], "1.50"));
    EXPECT_EQ(wanted(asked[1]), "a number");
    EXPECT_TRUE(fits(asked[2], ""));
    EXPECT_EQ(wanted(asked[2]), "a pattern: * for any characters, ? for one");
}

TEST(TheQuestionsOfAQuery, WantWhatFitsEverywhereAParameterIsUsed) {
    const auto query = draw(sampleDatabase(), {"products"},
                            {{"products.name", {"= :x"}}, {"products.id", {"= :x"}}});
    const auto asked = questions(statementFor(*query, Dialect::SQLite, {}));
    ASSERT_EQ(asked.size(), 1u);
    EXPECT_FALSE(fits(asked[0], "tea"));
    EXPECT_TRUE(fits(asked[0], "7"));
    EXPECT_EQ(wanted(asked[0]), "a number");
}

TEST(TheCommandOfAQuery, HasAValueForEveryPlaceholder) {
    const auto query =
        draw(sampleDatabase(), {"stock"},
             {{"stock.quantity", {"Between 3 And :n"}}, {"stock.reorder_level", {"> :n"}}});
    const auto text = statementFor(*query, Dialect::SQLite, {});
    const auto command = makeCommand(text, Dialect::SQLite, {{"n", "20"}}, {});
    EXPECT_EQ(command.statement.count(u'?'), 3);
    EXPECT_EQ(command.values, QVariantList({3LL, 20LL, 20LL}));
}

TEST(TheCommandOfAQuery, TakesAPatternAsPeopleTypeIt) {
    const auto query = draw(sampleDatabase(), {"products"}, {{"products.name", {"Like :p"}}});
    const auto text = statementFor(*query, Dialect::SQLite, {});
    EXPECT_EQ(makeCommand(text, Dialect::SQLite, {{"p", "a*[*]?"}}, {}).values,
              QVariantList({QString("a%*_")}));
}

TEST(TheCommandOfAQuery, TakesBytesInHexadecimalDigitsOrAsAText) {
    const auto query = draw(sampleDatabase(), {"employees"}, {{"employees.badge", {"= :badge"}}});
    const auto text = statementFor(*query, Dialect::SQLite, {});
    const auto bytes = [&](const char* typed) {
        return makeCommand(text, Dialect::SQLite, {{"badge", typed}}, {}).values.value(0);
    };
    EXPECT_EQ(bytes(" x'0AFF' "), QByteArray("\x0A\xFF"));
    EXPECT_EQ(bytes("0x0aff"), QByteArray("\x0A\xFF"));
    EXPECT_EQ(bytes("BADGE"), QByteArray("BADGE"));
}

TEST(TheCommandOfAQuery, LeavesItToPostgresWhatIsAskedForOfAColumnOfUnknownKind) {
    const auto query = platform::makeRef<model::Query>();
    const auto definition = platform::makeRef<model::ColumnDefinition>();
    const auto table = query->addTable({u"", u"t", {{u"mood"}}});
    definition->Column(table->columnNamed(u"mood"));
    definition->AddCriterium(u"= :mood", u"4");
    query->AddColumnDefinition(definition);
    for (const auto& [dialect, value] : {std::pair(Dialect::PostgreSQL, QVariant(u"5"_qs)),
                                         std::pair(Dialect::SQLite, QVariant(qlonglong(5)))}) {
        const auto text = statementFor(*query, dialect, {});
        EXPECT_EQ(makeCommand(text, dialect, {{"mood", "5"}}, {}).values.value(0), value);
    }
}

TEST(TheCommandOfAQuery, TellsTheEngineToGiveOneRowMoreThanIsShown) {
    const auto query = draw(sampleDatabase(), {"products"});
    for (const auto dialect : {Dialect::SQLite, Dialect::PostgreSQL, Dialect::MySQL})
        EXPECT_TRUE(commandFor(query, dialect, 10).statement.endsWith("\nLIMIT 11"));
    EXPECT_FALSE(commandFor(query, Dialect::SQLite).statement.contains("LIMIT"));
}

TEST(TheCommandOfAQuery, LeavesAnEngineAloneWhoseWordsForALimitAreNotKnown) {
    const auto query = draw(sampleDatabase(), {"products"});
    const auto command = commandFor(query, Dialect::Standard, 10);
    EXPECT_FALSE(command.statement.contains("ROWS"));
    EXPECT_EQ(command.limit, 10);
}
