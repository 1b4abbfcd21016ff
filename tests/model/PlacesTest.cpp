#include <Zandor/model/Snapshot.h>

#include "Expect.h"
#include "SmallQuery.h"

using namespace zandor;

// What names a table or a column that is gone, or that is none of the query's.

namespace {

using platform::makeRef;
using platform::Ref;

/// A host's own idea of a column.
class ForeignColumn final : public TalvikZandorLib::ZDColumn {
    platform::String Name() const override { return u"id"; }
    platform::String Key() const override { return u"c2"; }
    bool Marker() const override { return false; }
    bool Selected() const override { return false; }
    void Selected(bool) override {}
    void activated(std::int16_t) override {}
};

/// A query that reads the column "name" of a saved one no more.
class AColumnThatIsGone : public testing::Test {
protected:
    static model::SavedQuery of(const std::initializer_list<const char16_t*> names) {
        SmallQuery inner;
        for (const auto* name : names) {
            const auto definition = makeRef<model::ColumnDefinition>();
            definition->Column(inner.orders->columnNamed(name));
            inner.query->AddColumnDefinition(definition);
        }
        inner.query->DeleteTable(inner.customers);
        return {u"", inner.query->record()};
    }

    SmallQuery small;
    const Ref<model::Table> saved = small.query->addQuery(u"saved", of({u"id", u"name"}));
    const Ref<model::Column> gone = saved->columnNamed(u"name");

    void SetUp() override {
        small.query->refreshQuery(saved, of({u"id"}));
        ASSERT_FALSE(saved->columnNamed(u"name"));
    }
};

} // namespace

TEST_F(AColumnThatIsGone, IsTheEndOfNoNewJoin) {
    const auto join = small.library.NewZDJoin();
    join->LeftColumn(gone);
    join->RightColumn(small.id(small.orders));
    EXPECT_EQ(errorOf([&] { small.query->AddJoin(join); }), 5);
    EXPECT_EQ(small.query->Joins().Count(), 0);
}

TEST_F(AColumnThatIsGone, IsNotKeptAsTheEndOfAJoin) {
    const auto join = small.query->AddJoin(small.newJoin(small.orders, saved));
    join->RightColumn(gone);
    EXPECT_FALSE(join->RightColumn());
    const auto record = small.query->record();
    EXPECT_EQ(record.joins.front().right, (model::EndRecord{saved->Key(), u""}));
    EXPECT_FALSE(model::faultOf(record)) << "the query could not be saved";
}

TEST(ATableThatIsGone, IsNotRenamed) {
    SmallQuery small;
    small.query->DeleteTable(small.orders);
    EXPECT_EQ(errorOf([&] { small.query->renameTable(small.orders, u"sales"); }), 5);
    EXPECT_EQ(small.orders->Name(), u"orders");
}

TEST(AColumnOfAnotherLibrary, IsNone) {
    SmallQuery small;
    const auto definition = small.library.NewZDColumnDefinition();
    definition->Column(small.id(small.orders));
    const auto foreign = makeRef<ForeignColumn>();
    EXPECT_EQ(errorOf([&] { definition->Column(foreign); }), 5);
    EXPECT_EQ(definition->Column()->Name(), u"orders.id");
    const auto join = small.newJoin(small.orders, small.customers);
    EXPECT_EQ(errorOf([&] { join->LeftColumn(foreign); }), 5);
    EXPECT_EQ(join->LeftColumn(), small.id(small.orders));
}

// A host that makes changes of its own may bring a query there.
TEST(TheLastKey, IsFollowedByAnErrorAndByNoNegativeOne) {
    SmallQuery small;
    model::Change change;
    change.lastBefore = small.query->record().lastKeys;
    change.lastAfter = change.lastBefore;
    change.lastAfter.table = INT32_MAX;
    small.query->apply(change);
    EXPECT_EQ(errorOf([&] { small.query->addTable(SmallQuery::described(u"more")); }), 6);
    EXPECT_EQ(small.query->Tables().Count(), 2);
}

TEST(ATextThatIsNoName, IsNoChangeWhenItIsReadAgain) {
    SmallQuery small;
    const auto definition = small.library.NewZDColumnDefinition();
    definition->Column(small.orders->columnNamed(u"name"));
    definition->AddCriterium(u"later.name", u"4");
    small.query->AddColumnDefinition(definition);
    small.query->renameTable(small.customers, u"buyers"); // which looks what names are
    const auto again = model::Query::restored(small.query->record());
    model::Snapshot known(*again);
    again->renameTable(again->tableNamed(u"buyers"), u"people");
    const auto change = known.update(*again);
    EXPECT_EQ(change.tables.changed.size(), 1U);
    EXPECT_TRUE(change.definitions.empty());
}
