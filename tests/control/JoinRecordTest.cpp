#include "control/JoinScene.h"

using namespace zandor;

namespace {

using platform::String;
using platform::Variant;
using TalvikDBxZandor::clsJoinLine;

struct NoBoxes : platform::MessageBoxes {
    void MsgBox(const String&, std::int32_t, const String&) override { ADD_FAILURE(); }
};

struct TheJoinRecord : ::testing::Test {
    NoBoxes boxes;
    clsJoinLine record{boxes};
};

void fill(clsJoinLine& record) {
    record.JoinType(1);
    record.CompareOperator(2);
    record.LeftColumnName(u"left column");
    record.LeftColumnText(u"left text");
    record.RightColumnText(u"right text");
    record.RightColumnName(u"right column");
    record.LeftTableName(u"left table");
    record.RightTableName(u"right table");
    record.LeftTablehwnd(3);
    record.RightTablehwnd(4);
    record.JoinLineIndex(5);
    record.LeftConnectorIndex(6);
    record.RightConnectorIndex(7);
    record.Index(8);
    record.Tag(String(u"tag"));
}

void expectFilled(const clsJoinLine& record) {
    EXPECT_EQ(record.JoinType(), 1);
    EXPECT_EQ(record.CompareOperator(), 2);
    EXPECT_EQ(record.LeftColumnName(), u"left column");
    EXPECT_EQ(record.LeftColumnText(), u"left text");
    EXPECT_EQ(record.RightColumnText(), u"right text");
    EXPECT_EQ(record.RightColumnName(), u"right column");
    EXPECT_EQ(record.LeftTableName(), u"left table");
    EXPECT_EQ(record.RightTableName(), u"right table");
    EXPECT_EQ(record.LeftTablehwnd(), 3);
    EXPECT_EQ(record.RightTablehwnd(), 4);
    EXPECT_EQ(record.JoinLineIndex(), 5);
    EXPECT_EQ(record.LeftConnectorIndex(), 6);
    EXPECT_EQ(record.RightConnectorIndex(), 7);
    EXPECT_EQ(record.Index(), 8);
    EXPECT_EQ(record.Tag(), Variant(String(u"tag")));
}

TEST_F(TheJoinRecord, StartsAsANormalJoinOfEqualsWithNoElementAllotted) {
    EXPECT_EQ(record.JoinType(), 0);
    EXPECT_EQ(record.CompareOperator(), 0);
    EXPECT_EQ(record.JoinLineIndex(), -1);
    EXPECT_EQ(record.LeftConnectorIndex(), -1);
    EXPECT_EQ(record.RightConnectorIndex(), -1);
    EXPECT_EQ(record.LeftColumnName(), u"");
    EXPECT_EQ(record.LeftColumnText(), u"");
    EXPECT_EQ(record.RightColumnText(), u"");
    EXPECT_EQ(record.RightColumnName(), u"");
    EXPECT_EQ(record.LeftTableName(), u"");
    EXPECT_EQ(record.RightTableName(), u"");
    EXPECT_EQ(record.LeftTablehwnd(), 0);
    EXPECT_EQ(record.RightTablehwnd(), 0);
    EXPECT_EQ(record.Index(), 0);
    EXPECT_EQ(record.Tag(), Variant());
}

TEST_F(TheJoinRecord, KeepsEachOfItsFifteenFieldsApart) {
    fill(record);
    expectFilled(record);
}

TEST_F(TheJoinRecord, KeepsItsOtherTextsWhenOneBecomesLongerOrShorter) {
    fill(record);
    for (const auto* other : {u"", u"a far longer text than before", u"x"}) {
        record.LeftColumnText(other);
        record.RightTableName(other);
        EXPECT_EQ(record.LeftColumnText(), other);
        EXPECT_EQ(record.RightTableName(), other);
    }
    record.LeftColumnText(u"left text");
    record.RightTableName(u"right table");
    expectFilled(record);
}

TEST_F(TheJoinRecord, TakesOverAllFifteenFieldsOfAnother) {
    clsJoinLine other(boxes);
    fill(other);
    record.CopyFields(other);
    expectFilled(record);
}

TEST_F(TheJoinRecord, StoresCodesThatMeanNothingUnchanged) {
    record.JoinType(7);
    record.CompareOperator(-2);
    EXPECT_EQ(record.JoinType(), 7);
    EXPECT_EQ(record.CompareOperator(), -2);
}

TEST_F(TheJoinRecord, StoresTheWholeRangeOfHandlesAndIndexes) {
    record.LeftTablehwnd(INT32_MIN);
    record.JoinLineIndex(INT32_MAX);
    record.Index(INT16_MIN);
    EXPECT_EQ(record.LeftTablehwnd(), INT32_MIN);
    EXPECT_EQ(record.JoinLineIndex(), INT32_MAX);
    EXPECT_EQ(record.Index(), INT16_MIN);
}

TEST_F(TheJoinRecord, GivesBackTheTextPutIntoItsTag) {
    record.Tag(String(u"j12"));
    EXPECT_EQ(std::get<String>(record.Tag()), u"j12");
}

TEST_F(TheJoinRecord, GivesBackTheVeryObjectPutIntoItsTag) {
    const std::shared_ptr<void> object = std::make_shared<int>(3);
    record.Tag(object);
    EXPECT_EQ(std::get<std::shared_ptr<void>>(record.Tag()), object);
}

TEST_F(TheJoinRecord, ComparesColumnNamesExactly) {
    record.LeftColumnName(u"Id");
    record.RightColumnName(u"Number");
    EXPECT_TRUE(record.IsLeftColumn(u"Id"));
    EXPECT_FALSE(record.IsLeftColumn(u"id"));
    EXPECT_FALSE(record.IsLeftColumn(u"Number"));
    EXPECT_TRUE(record.IsRightColumn(u"Number"));
    EXPECT_FALSE(record.IsRightColumn(u"Numbers"));
    EXPECT_FALSE(record.IsRightColumn(u"Id"));
}

struct TheJoinsOfAControl : JoinScene {};

TEST_F(TheJoinsOfAControl, AreAnEmptyCollectionBeforeAnyJoinExists) {
    Record hit;
    EXPECT_EQ(joinCount(), 0);
    EXPECT_FALSE(Back::JoinHitTest(control, hit, 0.0F, 0.0F));
    EXPECT_FALSE(Back::JoinAllreadyExists(control, nullptr, nullptr, nullptr, nullptr));
    Back::DrawJoins(control);
    EXPECT_EQ(joinCount(), 0);
    EXPECT_EQ(stage->boxes, Boxes());
}

TEST_F(TheJoinsOfAControl, AreWalkedInTheOrderOfTheirMaking) {
    join();
    join();
    bind();
    Back::RemoveJoin(control, record(u"1"));
    const Record reusing = draw(entry(1, 1), entry(2, 1));
    EXPECT_EQ(reusing->Index(), 1);
    EXPECT_EQ(Back::mJoinLines(control).Item(1), record(u"2"));
    EXPECT_EQ(Back::mJoinLines(control).Item(2), reusing);
}

TEST_F(TheJoinsOfAControl, StayAtTheirTablesWhateverSlotsTheseHave) {
    join();
    bind();
    EXPECT_EQ(record()->LeftTablehwnd(), table(1).TableHandle());
    EXPECT_EQ(record()->RightTablehwnd(), table(2).TableHandle());
    EXPECT_NE(record()->LeftTablehwnd(), record()->RightTablehwnd());
}

} // namespace
