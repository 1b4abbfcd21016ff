#include "model/Expect.h"
#include "model/SmallQuery.h"

#include <vector>

using namespace zandor;

using platform::String;

namespace {

std::vector<String>
texts(const TalvikZandorLib::Collection<TalvikZandorLib::ZDCriterium>& criteria) {
    std::vector<String> result;
    for (const auto& criterium : platform::Each(criteria)) result.push_back(criterium->Criterium());
    return result;
}

} // namespace

TEST(ADefinition, IsVisibleUnsortedAndWithoutSynonymWhenNew) {
    model::Library library;
    const auto definition = library.NewZDColumnDefinition();
    EXPECT_TRUE(definition->Visible());
    EXPECT_EQ(definition->SortOrder(), 0);
    EXPECT_EQ(definition->Synonym(), u"");
    EXPECT_EQ(definition->Column(), nullptr);
    EXPECT_EQ(definition->Criteria().Count(), 0);
}

TEST(ADefinition, KeepsWhatIsSet) {
    SmallQuery small;
    const auto definition = small.query->AddColumnDefinition(small.newDefinition(small.orders));
    definition->Synonym(u"Größe");
    definition->SortOrder(2);
    definition->Visible(false);
    EXPECT_EQ(definition->Synonym(), u"Größe");
    EXPECT_EQ(definition->SortOrder(), 2);
    EXPECT_FALSE(definition->Visible());
    EXPECT_EQ(definition->Column()->Key(), SmallQuery::id(small.orders)->Key());
}

TEST(ADefinition, RefusesAnUnknownSortOrder) {
    model::ColumnDefinition definition;
    definition.SortOrder(1);
    EXPECT_EQ(errorOf([&] { definition.SortOrder(3); }), 380);
    EXPECT_EQ(errorOf([&] { definition.SortOrder(-1); }), 380);
    EXPECT_EQ(definition.SortOrder(), 1);
}

TEST(ADefinition, LeavesTheWidthOfItsColumnToTheControlUntilThatIsSet) {
    model::ColumnDefinition definition;
    EXPECT_EQ(definition.Width(), 0);
    definition.Width(model::ColumnDefinition::greatestWidth);
    EXPECT_EQ(errorOf([&] { definition.Width(-1); }), 380);
    EXPECT_EQ(errorOf([&] { definition.Width(model::ColumnDefinition::greatestWidth + 1); }), 380);
    EXPECT_EQ(definition.Width(), 100'000);
    definition.Width(0);
    EXPECT_EQ(definition.Width(), 0);
}

TEST(ADefinition, StaysWithItsQueryOnceItIsStored) {
    SmallQuery small;
    SmallQuery other;
    const auto definition = small.query->AddColumnDefinition(small.newDefinition(small.orders));
    definition->Column(SmallQuery::id(small.customers));
    EXPECT_EQ(errorOf([&] { definition->Column(SmallQuery::id(other.orders)); }), 5);
    EXPECT_EQ(errorOf([&] { definition->Column({}); }), 91);
    EXPECT_EQ(definition->Column()->Key(), SmallQuery::id(small.customers)->Key());
    small.query->DeleteTable(small.customers);
    EXPECT_EQ(small.query->ColumnDefinitions().Count(), 0);
}

TEST(ADefinition, MayStandForAllColumnsOfItsTable) {
    SmallQuery small;
    const auto definition = small.library.NewZDColumnDefinition();
    definition->Column(small.orders->Columns().Item(1));
    EXPECT_EQ(small.query->AddColumnDefinition(definition)->Column()->Key(),
              small.orders->Columns().Item(1)->Key());
}

TEST(ADefinition, HeldByAHostHasNoColumnOnceItsQueryIsGone) {
    SmallQuery small;
    const auto definition = small.query->AddColumnDefinition(small.newDefinition(small.orders));
    definition->AddCriterium(u"> 3", u"4");
    small.query.reset();
    EXPECT_EQ(definition->Column(), nullptr);
    EXPECT_EQ(definition->Criteria().Item(u"4")->Criterium(), u"> 3");
}

TEST(Criteria, AreFoundByTheirRow) {
    model::ColumnDefinition definition;
    definition.AddCriterium(u"= 1", u"4");
    EXPECT_TRUE(definition.HasCriterium(u"4"));
    EXPECT_FALSE(definition.HasCriterium(u"5"));
    EXPECT_EQ(definition.Criteria().Item(u"4")->Criterium(), u"= 1");
    EXPECT_EQ(errorOf([&] { definition.Criteria().Item(u"5"); }), 5);
}

TEST(Criteria, AreInTheOrderOfTheirRows) {
    model::ColumnDefinition definition;
    definition.AddCriterium(u"c", u"6");
    definition.AddCriterium(u"a", u"4");
    definition.AddCriterium(u"b", u"5");
    EXPECT_EQ(texts(definition.Criteria()), (std::vector<String>{u"a", u"b", u"c"}));
    for (int row = 7; row <= 11; ++row) definition.AddCriterium(u"d", platform::decimal(row));
    EXPECT_EQ(definition.criteria().rows().rbegin()->first, 11); // not "9" by its text
}

TEST(Criteria, KeepTheirRowsWhenARowBetweenHasNone) {
    model::ColumnDefinition definition;
    definition.AddCriterium(u"b", u"5");
    definition.AddCriterium(u"d", u"7");
    EXPECT_EQ(texts(definition.Criteria()), (std::vector<String>{u"", u"b", u"", u"d"}));
    EXPECT_EQ(definition.criteria().rows().size(), 2U);
    definition.Criteria().Item(1)->Criterium(u"of nobody");
    EXPECT_FALSE(definition.HasCriterium(u"4"));
}

TEST(Criteria, RefuseASecondOneForARow) {
    model::ColumnDefinition definition;
    definition.AddCriterium(u"first", u"4");
    EXPECT_EQ(errorOf([&] { definition.AddCriterium(u"second", u"4"); }), 457);
    EXPECT_EQ(texts(definition.Criteria()), std::vector<String>{u"first"});
}

TEST(Criteria, RefuseAKeyThatIsNoCriteriaRow) {
    model::ColumnDefinition definition;
    for (const auto* key : {u"", u"3", u"0", u"-4", u"04", u" 4", u"4 ", u"x", u"4.0", u"32768",
                            u"99999", u"4294967300"}) {
        EXPECT_EQ(errorOf([&] { definition.AddCriterium(u"= 1", key); }), 5)
            << platform::toUtf8(key);
        EXPECT_FALSE(definition.HasCriterium(key));
    }
    EXPECT_EQ(definition.Criteria().Count(), 0);
}

TEST(Criteria, GoDownToTheLastRowThatHasANumber) {
    model::ColumnDefinition definition;
    definition.AddCriterium(u"= 1", u"32767");
    EXPECT_TRUE(definition.HasCriterium(u"32767"));
    EXPECT_EQ(definition.Criteria().Count(), 32764);
    EXPECT_EQ(definition.Criteria().Item(32764)->Criterium(), u"= 1");
}

TEST(Criteria, CanBeChangedAndRemoved) {
    model::ColumnDefinition definition;
    definition.AddCriterium(u"a", u"4");
    definition.AddCriterium(u"b", u"6");
    definition.Criteria().Item(u"6")->Criterium(u"B");
    EXPECT_EQ(texts(definition.Criteria()), (std::vector<String>{u"a", u"", u"B"}));
    definition.Criteria().Remove(u"6");
    EXPECT_EQ(texts(definition.Criteria()), std::vector<String>{u"a"});
    EXPECT_EQ(errorOf([&] { definition.Criteria().Remove(u"6"); }), 5);
    EXPECT_EQ(errorOf([&] { definition.Criteria().Item(2); }), 9);
    EXPECT_EQ(errorOf([&] { definition.Criteria().Item(0); }), 9);
}
