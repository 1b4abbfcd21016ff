#include <Zandor/model/Snapshot.h>

#include "Expect.h"
#include "SmallQuery.h"

using namespace zandor;

using model::SavedQuery;
using platform::Ref;
using platform::String;
using platform::toUtf8;

namespace {

/// The ids of a table, and the names with another name.
Ref<model::Query> idsOf(const String& table, model::ColumnType type = model::ColumnType::Integer) {
    auto query = platform::makeRef<model::Query>();
    auto described = SmallQuery::described(table);
    described.columns.front().type = type;
    query->addTable(described);
    const auto add = [&](const char16_t* column, const char16_t* synonym) {
        const auto definition = platform::makeRef<model::ColumnDefinition>();
        definition->Column(query->tableNamed(table)->columnNamed(column));
        definition->Synonym(synonym);
        query->AddColumnDefinition(definition);
    };
    add(u"id", u"");
    add(u"name", u"called");
    return query;
}

SavedQuery saved(const Ref<model::Query>& query) { return {u"paid.json", query->record()}; }

/// A table of the database and a saved query, joined.
class ASavedQuery : public testing::Test {
protected:
    std::string columns() const {
        std::string all;
        for (const auto& column : platform::Each<TalvikZandorLib::ZDColumn>(paid->Columns()))
            all += toUtf8(column->Key() + u" " + column->Name() + u"\n");
        return all;
    }
    void join() {
        const auto made = platform::makeRef<model::Join>();
        made->LeftColumn(small.orders->columnNamed(u"id"));
        made->RightColumn(paid->columnNamed(u"id"));
        query.AddJoin(made);
    }
    void output(const Ref<model::Column>& column) {
        const auto definition = platform::makeRef<model::ColumnDefinition>();
        definition->Column(column);
        query.AddColumnDefinition(definition);
    }
    Ref<model::ColumnDefinition> first() {
        return std::static_pointer_cast<model::ColumnDefinition>(query.ColumnDefinitions().Item(1));
    }

    SmallQuery small;
    model::Query& query = *small.query;
    Ref<model::Query> inner = idsOf(u"payments");
    Ref<model::Table> paid = query.addQuery(u"paid", saved(inner));
};

} // namespace

TEST_F(ASavedQuery, StandsAsATableOfItsOutputColumns) {
    EXPECT_EQ(paid->Name(), u"paid");
    EXPECT_EQ(paid->savedQuery()->file, u"paid.json");
    EXPECT_EQ(columns(), "c7 *\nc8 id\nc9 called\n");
    EXPECT_EQ(paid->columnNamed(u"called")->description().type, model::ColumnType::Text);
    EXPECT_EQ(paid->columnNamed(u"called")->description().declaredType, u"TEXT");
    EXPECT_FALSE(paid->columnNamed(u"id")->description().primaryKey);
    EXPECT_FALSE(small.orders->savedQuery());
}

TEST_F(ASavedQuery, GetsANameOfItsOwn) {
    EXPECT_EQ(query.addQuery(u"paid", saved(inner))->Name(), u"paid_1");
    EXPECT_EQ(query.addQuery(u"orders", saved(inner))->Name(), u"orders_1");
}

TEST_F(ASavedQuery, ComesBackWithItsRecord) {
    const auto record = query.record();
    const auto again = model::Query::restored(record);
    EXPECT_EQ(again->record(), record);
    EXPECT_EQ(again->tableNamed(u"paid")->savedQuery()->record, inner->record());
    auto other = record;
    other.tables.back().query = saved(idsOf(u"customers"));
    EXPECT_NE(other, record);
    other.tables.back().query = {};
    EXPECT_NE(other, record);
}

TEST_F(ASavedQuery, IsRefusedWhereNothingComesOutOfIt) {
    const SavedQuery empty{u"", model::QueryRecord()};
    EXPECT_EQ(toUtf8(model::Query::refusalOf(empty)->text()),
              "No column comes out of that query, so that it cannot stand as a table: give it "
              "output columns, and save it.");
    const auto before = query.record();
    EXPECT_EQ(errorOf([&] { query.addQuery(u"empty", empty); }), 5);
    EXPECT_EQ(errorOf([&] { query.addQuery(u"", saved(inner)); }), 5);
    EXPECT_EQ(query.record(), before);
}

TEST_F(ASavedQuery, IsRefusedWithItsFault) {
    SavedQuery broken = saved(inner);
    broken.record.tables.front().key = u"x";
    EXPECT_EQ(toUtf8(model::Query::refusalOf(broken)->text()),
              "/tables/0/key is not the letter t and a number from 1 to 1000000000");
    auto record = query.record();
    record.tables.back().query = broken;
    EXPECT_EQ(toUtf8(model::faultOf(record)->message.text()),
              "/tables/2/source/query/tables/0/key is not the letter t and a number from 1 to "
              "1000000000");
}

TEST_F(ASavedQuery, StandsInOthersAsDeepAsTheyMayBe) {
    auto deep = inner;
    for (int depth = 1; depth <= model::deepestSavedQuery; ++depth) {
        ASSERT_FALSE(model::Query::refusalOf(saved(deep))) << depth;
        auto around = platform::makeRef<model::Query>();
        around->addQuery(u"inner", saved(deep));
        EXPECT_EQ(model::depthOf(around->record()), depth);
        EXPECT_FALSE(model::faultOf(around->record()));
        deep = around;
    }
    EXPECT_EQ(toUtf8(model::Query::refusalOf(saved(deep))->text()),
              "Saved queries stand more than 8 deep in each other then: make one query of some of "
              "them.");
    auto record = query.record();
    record.tables.back().query = saved(deep);
    EXPECT_EQ(toUtf8(model::faultOf(record)->message.text()),
              "/tables has saved queries more than 8 deep in each other");
}

TEST_F(ASavedQuery, IsReadAgainWithWhatHangsOnIt) {
    join();
    output(paid->columnNamed(u"called"));
    first()->AddCriterium(u"> paid.id", u"4");
    const auto column = paid->columnNamed(u"called");
    auto changed = idsOf(u"payments");
    changed->ColumnDefinitions().Remove(changed->ColumnDefinitions().Item(1)->Key());
    const auto more = platform::makeRef<model::ColumnDefinition>();
    more->expression(u"id + 1");
    changed->AddColumnDefinition(more);
    EXPECT_EQ(toUtf8(query.refusalOf(*paid, saved(changed))->text()),
              "paid gives no column id any more, which is used here: take it out of this query, or "
              "give it back to that one.");
    EXPECT_EQ(errorOf([&] { query.refreshQuery(paid, saved(changed)); }), 5);

    query.Joins().Remove(query.Joins().Item(1)->Key());
    EXPECT_TRUE(query.refusalOf(*paid, saved(changed))); // by the criterion
    first()->Criteria().Remove(u"4");
    query.refreshQuery(paid, saved(changed));
    EXPECT_EQ(columns(), "c7 *\nc9 called\nc10 id + 1\n");
    EXPECT_EQ(first()->place().column(), column);
    EXPECT_EQ(paid->savedQuery()->record, changed->record());
}

TEST_F(ASavedQuery, KeepsAColumnWhoseTypeIsAnotherUnderItsKey) {
    join();
    const auto key = paid->columnNamed(u"id")->Key();
    query.refreshQuery(paid, saved(idsOf(u"payments", model::ColumnType::Text)));
    const auto column = paid->columnNamed(u"id");
    EXPECT_EQ(column->Key(), key);
    EXPECT_EQ(column->description().type, model::ColumnType::Text);
    EXPECT_EQ(query.Joins().Item(1)->RightColumn(), column) << "the join has lost its column";
}

TEST_F(ASavedQuery, KeepsAColumnThatIsUsedInAnyOneWay) {
    inner->ColumnDefinitions().Remove(inner->ColumnDefinitions().Item(1)->Key());
    const auto column = paid->columnNamed(u"id");
    const auto isUsed = [&] { return query.refusalOf(*paid, saved(inner)).has_value(); };
    EXPECT_FALSE(isUsed());
    join();
    EXPECT_TRUE(isUsed()) << "on the right of a join";
    query.Joins().Remove(query.Joins().Item(1)->Key());
    const auto turned = platform::makeRef<model::Join>();
    turned->LeftColumn(column);
    turned->RightColumn(small.orders->columnNamed(u"id"));
    query.AddJoin(turned);
    EXPECT_TRUE(isUsed()) << "on the left of a join";
    query.Joins().Remove(turned->Key());
    output(column);
    EXPECT_TRUE(isUsed()) << "as an output column";
    query.ColumnDefinitions().Remove(first()->Key());
    output(small.orders->columnNamed(u"id"));
    first()->AddCriterium(u"> paid.id", u"4");
    EXPECT_TRUE(isUsed()) << "in a criterion";
    query.ColumnDefinitions().Remove(first()->Key());
    const auto expression = platform::makeRef<model::ColumnDefinition>();
    expression->expression(u"paid.id + 1");
    query.AddColumnDefinition(expression);
    EXPECT_TRUE(isUsed()) << "in an expression";
    query.ColumnDefinitions().Remove(expression->Key());
    EXPECT_FALSE(isUsed());
}

TEST_F(ASavedQuery, IsAskedAboutWithoutAChange) {
    output(small.orders->columnNamed(u"id"));
    first()->AddCriterium(u"> paid.id", u"4"); // nobody knows yet which column that is
    const auto before = query.record();
    EXPECT_FALSE(query.refusalOf(*paid, saved(inner)));
    inner->ColumnDefinitions().Remove(inner->ColumnDefinitions().Item(1)->Key());
    EXPECT_TRUE(query.refusalOf(*paid, saved(inner)));
    EXPECT_EQ(query.record(), before);
}

TEST_F(ASavedQuery, ThatIsNoneIsNotReadAgain) {
    SmallQuery other;
    const auto foreign = other.query->addQuery(u"paid", saved(inner));
    EXPECT_EQ(errorOf([&] { query.refreshQuery(small.orders, saved(inner)); }), 5);
    EXPECT_EQ(errorOf([&] { query.refreshQuery(foreign, saved(inner)); }), 5);
    EXPECT_EQ(errorOf([&] { query.refreshQuery({}, saved(inner)); }), 91);
}

TEST_F(ASavedQuery, IsUndoneWhenItWasReadAgain) {
    model::Snapshot known(query);
    const auto before = query.record();
    query.refreshQuery(paid, saved(idsOf(u"customers")));
    const auto after = query.record();
    ASSERT_NE(before, after);
    const auto change = known.update(query);
    EXPECT_EQ(change.tables.changed.size(), 1u);
    query.apply(change.reversed());
    EXPECT_EQ(query.record(), before);
    query.apply(change);
    EXPECT_EQ(query.record(), after);
    EXPECT_TRUE(known.update(query).empty());
}

TEST_F(ASavedQuery, TakesWhatHangsOnItAlongWhenItIsDeleted) {
    join();
    output(paid->columnNamed(u"called"));
    query.DeleteTable(paid);
    EXPECT_EQ(query.Joins().Count(), 0);
    EXPECT_EQ(query.ColumnDefinitions().Count(), 0);
}

TEST_F(ASavedQuery, HasNoTwoColumnsThatDifferByCapitalsAlone) {
    inner->ColumnDefinitions().Item(1)->Synonym(u"CALLED");
    const auto table = query.addQuery(u"twice", saved(inner));
    EXPECT_EQ(table->Columns().Item(2)->Name(), u"CALLED");
    EXPECT_EQ(table->Columns().Item(3)->Name(), u"called_1");
}
