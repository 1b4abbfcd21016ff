#include "model/Expect.h"
#include "model/SmallQuery.h"

using namespace zandor;

using platform::makeRef;
using platform::Ref;

TEST(AQuery, OfTheLibraryIsEmpty) {
    model::Library library;
    const auto query = library.NewZandor();
    EXPECT_EQ(query->Tables().Count(), 0);
    EXPECT_EQ(query->Joins().Count(), 0);
    EXPECT_EQ(query->ColumnDefinitions().Count(), 0);
}

TEST(AQuery, GivesEveryObjectAKeyOfItsKindAndFindsItByIt) {
    SmallQuery small;
    const auto join = small.query->AddJoin(small.newJoin(small.orders, small.customers));
    const auto definition = small.query->AddColumnDefinition(small.newDefinition(small.orders));
    EXPECT_EQ(small.orders->Key(), u"t1");
    EXPECT_EQ(small.customers->Key(), u"t2");
    EXPECT_EQ(join->Key(), u"j1");
    EXPECT_EQ(definition->Key(), u"x1");
    EXPECT_EQ(small.query->Tables().Item(u"t2"), small.customers);
    EXPECT_EQ(small.query->Joins().Item(u"j1"), join);
    EXPECT_EQ(small.query->ColumnDefinitions().Item(u"x1"), definition);
}

TEST(AQuery, GivesColumnsKeysThatAreUniqueAcrossTables) {
    SmallQuery small;
    EXPECT_EQ(small.orders->Columns().Item(1)->Key(), u"c1");
    EXPECT_EQ(small.orders->Columns().Item(3)->Key(), u"c3");
    EXPECT_EQ(small.customers->Columns().Item(1)->Key(), u"c4");
    EXPECT_EQ(small.customers->Columns().Item(u"c5")->Name(), u"id");
}

TEST(AQuery, NeverGivesAKeyTwice) {
    SmallQuery small;
    const auto add = [&] {
        const auto join = small.query->AddJoin(small.newJoin(small.orders, small.customers));
        const auto definition = small.query->AddColumnDefinition(small.newDefinition(small.orders));
        return join->Key() + u" " + definition->Key();
    };
    EXPECT_EQ(add(), u"j1 x1");
    small.query->Joins().Remove(u"j1");
    small.query->ColumnDefinitions().Remove(u"x1");
    EXPECT_EQ(add(), u"j2 x2");

    small.query->DeleteTable(small.customers);
    const auto again = small.query->addTable(SmallQuery::described(u"customers"));
    EXPECT_EQ(again->Key(), u"t3");
    EXPECT_EQ(again->Columns().Item(1)->Key(), u"c7");
}

TEST(AQuery, SpendsNoKeyOnWhatItRefuses) {
    SmallQuery small;
    EXPECT_EQ(errorOf([&] { small.query->AddJoin(small.library.NewZDJoin()); }), 91);
    EXPECT_EQ(
        errorOf([&] { small.query->AddColumnDefinition(makeRef<model::ColumnDefinition>()); }), 91);
    EXPECT_EQ(small.query->AddJoin(small.newJoin(small.orders, small.customers))->Key(), u"j1");
    EXPECT_EQ(small.query->AddColumnDefinition(small.newDefinition(small.orders))->Key(), u"x1");
}

TEST(AQuery, ReturnsTheJoinAndTheDefinitionThatItStores) {
    SmallQuery small;
    const auto join = small.newJoin(small.orders, small.customers);
    EXPECT_EQ(join->Key(), u"");
    EXPECT_EQ(small.query->AddJoin(join), join);
    const auto definition = small.newDefinition(small.orders);
    EXPECT_EQ(definition->Key(), u"");
    EXPECT_EQ(small.query->AddColumnDefinition(definition), definition);
}

TEST(AQuery, RefusesNothing) {
    SmallQuery small;
    EXPECT_EQ(errorOf([&] { small.query->AddJoin({}); }), 91);
    EXPECT_EQ(errorOf([&] { small.query->AddColumnDefinition({}); }), 91);
    EXPECT_EQ(errorOf([&] { small.query->DeleteTable({}); }), 91);
    EXPECT_EQ(small.query->Joins().Count(), 0);
    EXPECT_EQ(small.query->ColumnDefinitions().Count(), 0);
    EXPECT_EQ(small.query->Tables().Count(), 2);
}

TEST(AQuery, RefusesAJoinWithAnEndThatIsNotSet) {
    SmallQuery small;
    const auto withoutRightColumn = small.newJoin(small.orders, small.customers);
    withoutRightColumn->RightColumn({});
    EXPECT_EQ(errorOf([&] { small.query->AddJoin(withoutRightColumn); }), 91);
    const auto withoutLeftTable = small.newJoin(small.orders, small.customers);
    withoutLeftTable->LeftTable({});
    EXPECT_EQ(errorOf([&] { small.query->AddJoin(withoutLeftTable); }), 91);
    EXPECT_EQ(small.query->Joins().Count(), 0);
}

TEST(AQuery, RefusesAJoinWithAnEndInAnotherQuery) {
    SmallQuery small;
    SmallQuery other; // whose keys are the same
    EXPECT_EQ(errorOf([&] { small.query->AddJoin(other.newJoin(other.orders, small.customers)); }),
              5);
    EXPECT_EQ(errorOf([&] { small.query->AddJoin(small.newJoin(small.orders, other.customers)); }),
              5);
    EXPECT_EQ(small.query->Joins().Count(), 0);
}

TEST(AQuery, RefusesADefinitionOfAColumnOfAnotherQuery) {
    SmallQuery small;
    SmallQuery other;
    EXPECT_EQ(errorOf([&] { small.query->AddColumnDefinition(other.newDefinition(other.orders)); }),
              5);
    EXPECT_EQ(small.query->ColumnDefinitions().Count(), 0);
}

TEST(AQuery, RefusesWhatHangsOnADeletedTable) {
    SmallQuery small;
    const auto join = small.newJoin(small.orders, small.customers);
    const auto definition = small.newDefinition(small.customers);
    small.query->DeleteTable(small.customers);
    EXPECT_EQ(errorOf([&] { small.query->AddJoin(join); }), 5);
    EXPECT_EQ(errorOf([&] { small.query->AddColumnDefinition(definition); }), 5);
    EXPECT_EQ(errorOf([&] { small.query->DeleteTable(small.customers); }), 5);
}

TEST(AQuery, RefusesToStoreAnObjectTwice) {
    SmallQuery small;
    const auto join = small.query->AddJoin(small.newJoin(small.orders, small.customers));
    const auto definition = small.query->AddColumnDefinition(small.newDefinition(small.orders));
    EXPECT_EQ(errorOf([&] { small.query->AddJoin(join); }), 457);
    EXPECT_EQ(errorOf([&] { small.query->AddColumnDefinition(definition); }), 457);
    EXPECT_EQ(small.query->Joins().Count(), 1);
    EXPECT_EQ(small.query->ColumnDefinitions().Count(), 1);
}

TEST(AQuery, TakesARemovedObjectBackUnderItsOldKey) {
    SmallQuery small;
    const auto join = small.query->AddJoin(small.newJoin(small.orders, small.customers));
    const auto definition = small.query->AddColumnDefinition(small.newDefinition(small.orders));
    small.query->Joins().Remove(u"j1");
    small.query->ColumnDefinitions().Remove(u"x1");
    EXPECT_EQ(small.query->AddJoin(join)->Key(), u"j1");
    EXPECT_EQ(small.query->AddColumnDefinition(definition)->Key(), u"x1");
}

TEST(AQuery, DropsTheJoinsAndDefinitionsThatHangOnADeletedTable) {
    SmallQuery small;
    const auto third = small.query->addTable(SmallQuery::described(u"items"));
    small.query->AddJoin(small.newJoin(small.orders, small.customers));
    small.query->AddJoin(small.newJoin(small.customers, third));
    const auto kept = small.query->AddJoin(small.newJoin(third, small.orders));
    small.query->AddColumnDefinition(small.newDefinition(small.customers));
    const auto keptDefinition = small.query->AddColumnDefinition(small.newDefinition(third));
    small.query->AddColumnDefinition(small.newDefinition(small.customers));

    small.query->DeleteTable(small.customers);

    ASSERT_EQ(small.query->Tables().Count(), 2);
    EXPECT_EQ(small.query->Tables().Item(1), small.orders);
    EXPECT_EQ(small.query->Tables().Item(2), third);
    ASSERT_EQ(small.query->Joins().Count(), 1);
    EXPECT_EQ(small.query->Joins().Item(1), kept);
    ASSERT_EQ(small.query->ColumnDefinitions().Count(), 1);
    EXPECT_EQ(small.query->ColumnDefinitions().Item(1), keptDefinition);
}

TEST(AQuery, KeepsWhatHangsOnTheOtherInstanceOfADeletedTable) {
    SmallQuery small;
    const auto second = small.query->addTable(SmallQuery::described(u"orders"));
    small.query->AddJoin(small.newJoin(second, small.customers));
    small.query->AddColumnDefinition(small.newDefinition(second));
    small.query->DeleteTable(small.orders);
    EXPECT_EQ(small.query->Joins().Count(), 1);
    EXPECT_EQ(small.query->ColumnDefinitions().Count(), 1);
}

TEST(AQuery, DoesNotDeleteATableOfTheSameKeyInAnotherQuery) {
    SmallQuery small;
    SmallQuery other;
    EXPECT_EQ(errorOf([&] { small.query->DeleteTable(other.orders); }), 5);
    EXPECT_EQ(small.query->Tables().Count(), 2);
}

namespace {

/// A table of a host that mixes model libraries.
class ForeignTable final : public TalvikZandorLib::ZDTable {
public:
    platform::String Name() const override { return u"orders"; }
    platform::String Key() const override { return u"t1"; }
    std::int32_t Left() const override { return 0; }
    std::int32_t Top() const override { return 0; }
    std::int32_t Width() const override { return 0; }
    std::int32_t Height() const override { return 0; }
    void Left(float) override {}
    void Top(float) override {}
    void Width(float) override {}
    void Height(float) override {}
    std::int16_t Selected() const override { return 0; }
    void Selected(std::int16_t) override {}
    TalvikZandorLib::Collection<TalvikZandorLib::ZDColumn>& Columns() override { return mColumns; }

private:
    platform::KeyedCollection<TalvikZandorLib::ZDColumn> mColumns;
};

} // namespace

TEST(AQuery, RefusesObjectsOfAnotherModelLibrary) {
    SmallQuery small;
    const Ref<TalvikZandorLib::ZDTable> foreign = makeRef<ForeignTable>();
    EXPECT_EQ(errorOf([&] { small.query->DeleteTable(foreign); }), 5);
    EXPECT_EQ(errorOf([&] { small.library.NewZDJoin()->LeftTable(foreign); }), 5);
}

TEST(TheNameOfATable, IsFoundInCapitalsOfAllLetters) {
    model::Query query;
    const auto table = query.addTable(SmallQuery::described(u"abcdefghijklmnopqrstuvwxyz"));
    EXPECT_EQ(query.tableNamed(u"ABCDEFGHIJKLMNOPQRSTUVWXYZ"), table);
    EXPECT_FALSE(query.tableNamed(u"@BCDEFGHIJKLMNOPQRSTUVWXY["));
}
