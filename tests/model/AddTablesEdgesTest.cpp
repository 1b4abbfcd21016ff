#include "SmallQuery.h"

#include <Zandor/reader/addTables.h>

#include <gtest/gtest.h>

#include <algorithm>

using namespace zandor;

using platform::Ref;
using platform::String;
using reader::ForeignKey;
using reader::TableId;

namespace {

/// Any table has the columns "id" and "name", and one that is wide a third one; the keys are given.
class AnyDatabase final : public reader::DatabaseReader {
public:
    reader::Result<std::vector<reader::TableEntry>> tables() override {
        return std::vector<reader::TableEntry>();
    }
    reader::Result<model::TableDescription> table(const TableId& id) override {
        auto described = SmallQuery::described(id.name);
        described.schema = id.schema;
        if (id.name == u"wide") described.columns.push_back({String(40, u'w')});
        return described;
    }
    reader::Result<std::vector<ForeignKey>> foreignKeys(const TableId& child) override {
        asked.push_back(child);
        std::vector<ForeignKey> own;
        std::copy_if(keys.begin(), keys.end(), std::back_inserter(own),
                     [&](const ForeignKey& key) { return key.child == child; });
        return own;
    }

    std::vector<ForeignKey> keys;
    std::vector<TableId> asked;
};

class AddingTablesOfAnyDatabase : public testing::Test {
protected:
    std::vector<Ref<model::Table>> add(const std::vector<TableId>& names) {
        const auto added = reader::addTables(query, database, names, 16000, &leftOut);
        EXPECT_TRUE(added) << added.error().toStdString();
        return added ? *added : std::vector<Ref<model::Table>>();
    }
    /// As "orders - customers".
    std::vector<std::string> joins() {
        std::vector<std::string> all;
        for (const auto& join : platform::Each<TalvikZandorLib::ZDJoin>(query.Joins()))
            all.push_back(
                platform::toUtf8(join->LeftTable()->Name() + u" - " + join->RightTable()->Name()));
        return all;
    }

    const TableId orders{u"", u"orders"};
    const TableId customers{u"", u"customers"};
    const ForeignKey key{orders, customers, {{u"name", u"id"}}};
    AnyDatabase database;
    model::Query query;
    std::vector<reader::LeftOut> leftOut;
};

using Joins = std::vector<std::string>;

} // namespace

TEST_F(AddingTablesOfAnyDatabase, TellsTablesOfOneNameInTwoSchemasApart) {
    const TableId ours{u"ours", u"customers"}, theirs{u"theirs", u"customers"};
    database.keys = {{orders, theirs, {{u"name", u"id"}}}};
    add({orders, ours});
    EXPECT_EQ(joins(), Joins());
    add({theirs});
    EXPECT_EQ(joins(), Joins{"orders - customers_1"});
}

TEST_F(AddingTablesOfAnyDatabase, JoinsOnlyTheFirstInstanceOfATableThatRefersToAnother) {
    database.keys = {key};
    add({orders, orders, customers});
    EXPECT_EQ(joins(), Joins{"orders - customers"});
}

TEST_F(AddingTablesOfAnyDatabase, DrawsAKeyThatIsDeclaredTwiceOnceAndLeavesNothingOut) {
    database.keys = {key, key};
    add({orders, customers});
    EXPECT_EQ(joins(), Joins{"orders - customers"});
    EXPECT_TRUE(leftOut.empty());
}

TEST_F(AddingTablesOfAnyDatabase, PassesOverAJoinThatLostAColumn) {
    database.keys = {key};
    const auto present = add({{u"", u"a"}, {u"", u"b"}});
    const auto join = platform::makeRef<model::Join>();
    join->LeftColumn(present[0]->columnNamed(u"id"));
    join->RightColumn(present[1]->columnNamed(u"id"));
    query.AddJoin(join);
    join->RightTable(present[0]);
    add({orders, customers});
    EXPECT_EQ(query.Joins().Count(), 2);
}

TEST_F(AddingTablesOfAnyDatabase, AsksForNoKeysOfASavedQueryAndDrawsNoneToIt) {
    database.keys = {key};
    SmallQuery inner;
    inner.query->DeleteTable(inner.customers);
    query.addQuery(u"customers", {u"", inner.query->record()});
    add({orders});
    EXPECT_EQ(joins(), Joins());
    EXPECT_EQ(database.asked, std::vector<TableId>{orders});
}

TEST_F(AddingTablesOfAnyDatabase, PlacesThemAsIfThoseWithoutAPlaceWereNotThere) {
    model::Query empty;
    const auto alone = reader::addTables(empty, database, {orders}, 16000);
    ASSERT_TRUE(alone);
    query.addTable(SmallQuery::described(u"unplaced"));
    const auto beside = add({orders});
    EXPECT_EQ(beside.front()->Left(), alone->front()->Left());
    EXPECT_EQ(beside.front()->Top(), alone->front()->Top());
}

TEST_F(AddingTablesOfAnyDatabase, MakesThemAsWideAsTheirLongestColumn) {
    const auto added = add({orders, {u"", u"wide"}});
    EXPECT_GT(added[1]->Width(), added[0]->Width());
}
