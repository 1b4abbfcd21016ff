#include <Zandor/model/Names.h>
#include <Zandor/model/OutputName.h>

#include "Expect.h"
#include "SmallQuery.h"

#include <limits>

using namespace zandor;

using model::ColumnType;
using model::Total;

namespace {

model::ColumnDefinition& stored(SmallQuery& small) {
    return dynamic_cast<model::ColumnDefinition&>(
        *small.query->AddColumnDefinition(small.newDefinition(small.orders)));
}

} // namespace

TEST(ADefinition, TakesWhatIsInRangeToItsEndsAndNothingBeyond) {
    model::ColumnDefinition definition;
    const std::int16_t last = model::ColumnDefinition::greatestSortPriority;
    definition.sortPriority(last);
    EXPECT_EQ(definition.sortPriority(), last);
    for (const int outside : {-1, last + 1})
        EXPECT_EQ(errorOf([&] { definition.sortPriority(static_cast<std::int16_t>(outside)); }),
                  380);
    EXPECT_EQ(definition.sortPriority(), last);

    definition.decimals(model::ColumnDefinition::mostDecimals);
    EXPECT_EQ(definition.decimals(), model::ColumnDefinition::mostDecimals);
    definition.decimals(model::asManyAsThereAre);
    EXPECT_EQ(definition.decimals(), model::asManyAsThereAre);
    for (const int outside :
         {model::asManyAsThereAre - 1, model::ColumnDefinition::mostDecimals + 1})
        EXPECT_EQ(errorOf([&] { definition.decimals(static_cast<std::int16_t>(outside)); }), 380);

    definition.format(model::lastFormat);
    EXPECT_EQ(definition.format(), model::lastFormat);
    const int none = static_cast<int>(model::lastFormat) + 1;
    EXPECT_EQ(errorOf([&] { definition.format(static_cast<model::Format>(none)); }), 380);
    EXPECT_EQ(definition.format(), model::lastFormat);
}

TEST(ADefinition, HasAColumnOrAnExpression) {
    SmallQuery small;
    auto& definition = stored(small);
    EXPECT_TRUE(definition.place().column());
    definition.expression(u"");
    EXPECT_TRUE(definition.place().column()) << "there was none before";
    definition.expression(u"orders.id + 1");
    EXPECT_FALSE(definition.place().column());
    EXPECT_EQ(definition.Column()->Name(), u"orders.id + 1");
    definition.Column(small.id(small.orders));
    EXPECT_TRUE(definition.place().column());
    EXPECT_FALSE(definition.isExpression());
}

TEST(ADefinition, OfATotalHasNoColumnWithoutOneAndANameWhereOneWasHeld) {
    model::ColumnDefinition alone;
    alone.total(Total::Count);
    EXPECT_FALSE(alone.Column());
    SmallQuery small;
    auto& definition = stored(small);
    definition.total(Total::Count);
    const auto held = definition.Column();
    EXPECT_EQ(held->Name(), u"count(orders.id)");
    small.query->DeleteTable(small.orders);
    EXPECT_EQ(held->Name(), u"count()");
}

TEST(Criteria, HaveNoKeyWithAColon) {
    model::ColumnDefinition definition;
    EXPECT_EQ(errorOf([&] { definition.AddCriterium(u"= 1", u"1:"); }), 5);
    EXPECT_FALSE(definition.HasCriterium(u"4:"));
}

TEST(AQuery, TakesAsManyFirstRowsAsThereMayBe) {
    model::Query query;
    auto options = query.options();
    options.first = model::QueryOptions::greatestFirst;
    query.options(options);
    EXPECT_EQ(query.options().first, model::QueryOptions::greatestFirst);
    for (const std::int32_t outside : {-1, model::QueryOptions::greatestFirst + 1}) {
        options.first = outside;
        EXPECT_EQ(errorOf([&] { query.options(options); }), 380);
    }
    EXPECT_EQ(query.options().first, model::QueryOptions::greatestFirst);
}

TEST(ATotal, HasATypeOfItsOwn) {
    for (const auto values : {ColumnType::Text, ColumnType::Integer, ColumnType::Date}) {
        EXPECT_EQ(model::typeOf(Total::Count, values), ColumnType::Integer);
        EXPECT_EQ(model::typeOf(Total::CountDifferent, values), ColumnType::Integer);
        EXPECT_EQ(model::typeOf(Total::Average, values), ColumnType::Decimal);
        EXPECT_EQ(model::typeOf(Total::Largest, values), values);
        EXPECT_EQ(model::typeOf(Total::Sum, values), values);
    }
}

TEST(ATotal, SuitsWhatItCanBeMadeOf) {
    for (const auto total : {Total::Sum, Total::Average}) {
        for (const auto type : {ColumnType::Integer, ColumnType::Decimal, ColumnType::Unknown})
            EXPECT_TRUE(model::suits(total, type));
        for (const auto type : {ColumnType::Text, ColumnType::Date, ColumnType::Boolean})
            EXPECT_FALSE(model::suits(total, type));
    }
    for (const auto total : {Total::Smallest, Total::Largest}) {
        EXPECT_TRUE(model::suits(total, ColumnType::Text));
        EXPECT_FALSE(model::suits(total, ColumnType::Boolean));
        EXPECT_FALSE(model::suits(total, ColumnType::Blob));
    }
    EXPECT_TRUE(model::suits(Total::Count, ColumnType::Blob));
}

TEST(ANameInAMessage, IsOneLineWhateverBreaksLines) {
    for (const char16_t c : {u'\n', u'\r', u'\t', u'\u0085', u'\u2028', u'\u2029'})
        EXPECT_EQ(model::oneLine(platform::String(u"a") + c + u"b"), u"a b") << static_cast<int>(c);
}
