#include "model/SmallQuery.h"
#include "support/Stage.h"

#include <gtest/gtest.h>

using namespace zandor;

using model::Total;
using platform::String;

namespace {

/// The ready-made query under the control, with what the control's own words have no name for.
class AReadyMadeQuery : public testing::Test {
protected:
    AReadyMadeQuery() {
        stage->control().DebugSwitch(0);
        stage->control().OnlyJoin(false);
    }

    void add(const String& expression, Total total) {
        const auto definition = platform::makeRef<model::ColumnDefinition>();
        if (expression.empty())
            definition->Column(SmallQuery::id(small.orders));
        else
            definition->expression(expression);
        definition->total(total);
        small.query->AddColumnDefinition(definition);
    }

    std::vector<String> fields() {
        std::vector<String> all;
        for (std::int32_t column = 1; column < 6; ++column) all.push_back(stage->cell(0, column));
        return all;
    }

    SmallQuery small;
    std::unique_ptr<Stage> stage = Stage::open(small.library);
};

using Fields = std::vector<String>;

} // namespace

TEST_F(AReadyMadeQuery, MarksTheColumnsOfItsTotals) {
    add(u"", Total::Sum);
    add(u"customers.id + 1", Total::None);
    stage->control().P_SET_Zandor(small.query);
    stage->comforts().setFlags({.MarksOutput = true});
    EXPECT_EQ(stage->look("lstTable(1)").output, std::vector<String>{u"id"});
    EXPECT_EQ(stage->look("lstTable(2)").output, std::vector<String>{});
}

TEST_F(AReadyMadeQuery, IsShownWithItsTotalsAndExpressionsAndLosesThemWithTheirTable) {
    add(u"", Total::Sum);
    add(u"customers.id + 1", Total::None);
    add(u"Upper(orders.name)", Total::Count);
    add(u"", Total::None);
    stage->control().P_SET_Zandor(small.query);
    EXPECT_EQ(fields(), (Fields{u"sum(orders.id)", u"customers.id + 1",
                                u"count(Upper(orders.name))", u"orders.id", u""}));
    stage->closeTable(1);
    EXPECT_EQ(fields(), (Fields{u"customers.id + 1", u"", u"", u"", u""}));
    EXPECT_EQ(small.query->ColumnDefinitions().Count(), 1);
    EXPECT_TRUE(stage->boxes.empty());
}

TEST_F(AReadyMadeQuery, HasThoseColumnsActivatedWhoseEntriesAreSelected) {
    stage->control().P_SET_Zandor(small.query);
    const auto activated = [&](const char16_t* name) {
        return small.orders->columnNamed(name)->activated();
    };
    stage->selectEntries(1, {2, 3});
    stage->pressEntry(1, 3, 1);
    EXPECT_EQ(activated(u"id"), 1);
    EXPECT_EQ(activated(u"name"), 1);
    stage->releaseEntry(1, 3, 1);
    EXPECT_EQ(activated(u"id"), 0);
    EXPECT_EQ(activated(u"name"), 1);
    EXPECT_TRUE(stage->boxes.empty());
}

TEST_F(AReadyMadeQuery, HasAColumnThatItsSavedQueryNoLongerGivesReported) {
    const auto inner = [](const char16_t* second) {
        const auto query = platform::makeRef<model::Query>();
        const auto table = query->addTable(SmallQuery::described(u"payments"));
        for (const char16_t* name : {u"id", second}) {
            const auto definition = platform::makeRef<model::ColumnDefinition>();
            definition->Column(table->columnNamed(u"name"));
            definition->Synonym(name);
            query->AddColumnDefinition(definition);
        }
        return model::SavedQuery{u"paid.json", query->record()};
    };
    const auto paid = small.query->addQuery(u"paid", inner(u"called"));
    stage->control().P_SET_Zandor(small.query);
    stage->selectEntries(3, {2});
    stage->pressEntry(3, 2, 1);
    EXPECT_EQ(paid->columnNamed(u"id")->activated(), 1);
    EXPECT_TRUE(stage->boxes.empty());
    small.query->refreshQuery(paid, inner(u"titled")); // as many columns as before
    stage->pressEntry(3, 2, 1);
    ASSERT_EQ(stage->boxes.size(), 1U);
    EXPECT_NE(stage->boxes[0].text.find(u"lstTable_ColumnMouseDown"), String::npos);
}

TEST_F(AReadyMadeQuery, TracesEachSelectedColumnAsAnyOtherDoes) {
    stage->control().P_SET_Zandor(small.query);
    stage->selectEntries(1, {2});
    stage->boxes.clear();
    stage->control().DebugSwitch(1);
    stage->pressEntry(1, 2, 1);
    stage->control().DebugSwitch(0);
    ASSERT_EQ(stage->boxes.size(), 3U);
    EXPECT_EQ(stage->boxes[1].text, u"Selected column found: id");
    EXPECT_EQ(stage->boxes[2].text, u"Tabulet Column selected: id");
    EXPECT_EQ(small.orders->columnNamed(u"id")->activated(), 1);
}
