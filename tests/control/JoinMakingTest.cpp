#include "control/JoinScene.h"

using namespace zandor;

namespace {

struct ANewJoin : JoinScene {
    ANewJoin() { bind(); }

    Record drawFirst() { return draw(entry(1, 2), entry(2, 1)); }
};

TEST_F(ANewJoin, TakesTheLowestFreeNumberForItsElementsAndItsKey) {
    const Record made = drawFirst();
    ASSERT_TRUE(made);
    EXPECT_FALSE(isFree(1));
    EXPECT_TRUE(isFree(2));
    EXPECT_TRUE(stage->exists("linJoin(1)"));
    EXPECT_TRUE(stage->exists("shpJoin(1)"));
    EXPECT_TRUE(stage->exists("shpJoin(2)"));
    EXPECT_FALSE(stage->exists("shpJoin(3)"));
    EXPECT_EQ(record(u"1"), made);
}

TEST_F(ANewJoin, OwnsTheMarksTwiceItsNumberAndOneLess) {
    drawFirst();
    drawFirst();
    const Record third = drawFirst();
    EXPECT_EQ(third->Index(), 3);
    EXPECT_EQ(third->JoinLineIndex(), 3);
    EXPECT_EQ(third->LeftConnectorIndex(), 6);
    EXPECT_EQ(third->RightConnectorIndex(), 5);
    EXPECT_EQ(record(u"3"), third);
}

TEST_F(ANewJoin, KnowsItsTablesColumnsTypeAndOperator) {
    const Record made = draw(entry(1, 3), entry(2, 2), 2, 5);
    EXPECT_EQ(made->LeftTablehwnd(), table(1).TableHandle());
    EXPECT_EQ(made->RightTablehwnd(), table(2).TableHandle());
    EXPECT_EQ(made->LeftTableName(), u"Orders");
    EXPECT_EQ(made->LeftColumnName(), u"Total");
    EXPECT_EQ(made->RightTableName(), u"Customers");
    EXPECT_EQ(made->RightColumnName(), u"Name");
    EXPECT_EQ(made->JoinType(), 2);
    EXPECT_EQ(made->CompareOperator(), 5);
}

TEST_F(ANewJoin, HasNoColumnTextsAndNoTag) {
    const Record made = drawFirst();
    EXPECT_EQ(made->LeftColumnText(), u"");
    EXPECT_EQ(made->RightColumnText(), u"");
    EXPECT_EQ(made->Tag(), platform::Variant());
}

TEST_F(ANewJoin, IsDrawn) {
    drawFirst();
    EXPECT_TRUE(stage->look("linJoin(1)").visible);
    EXPECT_TRUE(stage->look("shpJoin(1)").visible);
    EXPECT_TRUE(stage->look("shpJoin(2)").visible);
    EXPECT_EQ(stage->look("linJoin(1)").X2, stage->look("shpJoin(1)").bounds.Left);
    EXPECT_EQ(stage->boxes, Boxes());
}

TEST_F(ANewJoin, IsMadeEvenWhenItCannotBeDrawn) {
    Record made;
    const auto orders = Back::lstTable(control)(1);
    EXPECT_TRUE(Back::DrawNewJoin(control, made, orders, entry(1, 1), orders, entry(1, 2), 0, 0));
    EXPECT_EQ(stage->boxes, Boxes{controlErrorBox(u"DrawJoin", 91, objectNotSet)});
    EXPECT_EQ(record(u"1"), made);
    EXPECT_FALSE(stage->look("linJoin(1)").visible);
}

TEST_F(ANewJoin, ReusesTheNumberOfARemovedOne) {
    drawFirst();
    const Record second = drawFirst();
    drawFirst();
    EXPECT_TRUE(Back::RemoveJoin(control, second));
    EXPECT_EQ(drawFirst()->Index(), 2);
    EXPECT_EQ(drawFirst()->Index(), 4);
}

TEST_F(ANewJoin, IsRefusedWhenAll64NumbersAreInUse) {
    for (int n = 1; n <= 64; ++n) ASSERT_TRUE(drawFirst());
    EXPECT_TRUE(stage->exists("linJoin(64)"));
    EXPECT_TRUE(stage->exists("shpJoin(128)"));
    Record kept = record(u"1");
    EXPECT_FALSE(Back::DrawNewJoin(control, kept, Back::lstTable(control)(1), entry(1, 2),
                                   Back::lstTable(control)(2), entry(2, 1), 0, 0));
    EXPECT_EQ(kept, record(u"1"));
    EXPECT_EQ(joinCount(), 64);
    EXPECT_FALSE(stage->exists("linJoin(65)"));
    EXPECT_FALSE(stage->exists("shpJoin(129)"));
    EXPECT_EQ(stage->boxes, Boxes());
}

TEST_F(ANewJoin, LeavesElementsAndNumberTakenWhenItFailsHalfway) {
    EXPECT_FALSE(draw(nullptr, entry(2, 1)));
    EXPECT_EQ(stage->boxes, Boxes{controlErrorBox(u"DrawNewJoin", 91, objectNotSet)});
    EXPECT_TRUE(stage->exists("linJoin(1)"));
    EXPECT_TRUE(stage->exists("shpJoin(1)"));
    EXPECT_TRUE(stage->exists("shpJoin(2)"));
    EXPECT_FALSE(isFree(1));
    EXPECT_EQ(joinCount(), 0);
    EXPECT_EQ(drawFirst()->Index(), 2);
}

const Stage::Box alreadyLoaded = controlErrorBox(u"DrawNewJoin", 360, u"Object already loaded");

TEST_F(ANewJoin, MakesItsLineFirst) {
    Back::linJoin(control).Load(1);
    EXPECT_FALSE(drawFirst());
    EXPECT_EQ(stage->boxes, Boxes{alreadyLoaded});
    EXPECT_FALSE(stage->exists("shpJoin(1)"));
    EXPECT_FALSE(stage->exists("shpJoin(2)"));
    EXPECT_FALSE(isFree(1));
}

TEST_F(ANewJoin, MakesTheMarkOfTwiceItsNumberBeforeTheOther) {
    Back::shpJoin(control).Load(1);
    EXPECT_FALSE(drawFirst());
    EXPECT_EQ(stage->boxes, Boxes{alreadyLoaded});
    EXPECT_TRUE(stage->exists("linJoin(1)"));
    EXPECT_TRUE(stage->exists("shpJoin(2)"));
}

TEST_F(ANewJoin, OverflowsWhenTwiceItsNumberExceeds16Bits) {
    const TalvikDBxZandor::clsFreeList factory(stage->toolkit());
    Back::mJoinFreeList(control) = factory.CreateFreeList(16384, 16385);
    EXPECT_FALSE(drawFirst());
    EXPECT_EQ(stage->boxes, Boxes{controlErrorBox(u"DrawNewJoin", 6, u"Overflow")});
    EXPECT_TRUE(stage->exists("linJoin(16384)"));
    EXPECT_FALSE(isFree(16384));
}

TEST_F(ANewJoin, IsReportedWhenItsKeyIsTaken) {
    const Record first = drawFirst();
    Back::mJoinFreeList(control)->FreeIndex(1);
    Back::linJoin(control).Unload(1);
    Back::shpJoin(control).Unload(1);
    Back::shpJoin(control).Unload(2);
    EXPECT_FALSE(drawFirst());
    EXPECT_EQ(stage->boxes,
              Boxes{controlErrorBox(
                  u"DrawNewJoin", 457,
                  u"This key is already associated with an element of this collection")});
    EXPECT_EQ(record(u"1"), first);
}

// The test for an existing join.

struct AJoinThatExists : ANewJoin {
    bool exists(const Item& left, const Item& right) {
        return Back::JoinAllreadyExists(control, Back::lstTable(control)(1), left,
                                        Back::lstTable(control)(2), right);
    }
};

TEST_F(AJoinThatExists, IsNoneMadeOnTheCanvasSoThatItCanBeDrawnTwice) {
    ASSERT_TRUE(drawFirst());
    EXPECT_FALSE(exists(entry(1, 2), entry(2, 1)));
    EXPECT_TRUE(drawFirst());
    EXPECT_EQ(joinCount(), 2);
}

TEST_F(AJoinThatExists, IsOneOfTheSameTablesAndColumnTexts) {
    const Record made = drawFirst();
    made->LeftColumnText(u"Customer");
    EXPECT_FALSE(exists(entry(1, 2), entry(2, 1)));
    made->RightColumnText(u"Number");
    EXPECT_TRUE(exists(entry(1, 2), entry(2, 1)));
    EXPECT_FALSE(exists(entry(1, 1), entry(2, 1)));
    EXPECT_FALSE(exists(entry(1, 2), entry(2, 2)));
}

TEST_F(AJoinThatExists, IsComparedWithRegardToCase) {
    const Record made = drawFirst();
    made->LeftColumnText(u"customer");
    made->RightColumnText(u"Number");
    EXPECT_FALSE(exists(entry(1, 2), entry(2, 1)));
}

TEST_F(AJoinThatExists, CountsInItsOwnDirectionOnly) {
    const Record made = drawFirst();
    made->LeftColumnText(u"Customer");
    made->RightColumnText(u"Number");
    EXPECT_FALSE(Back::JoinAllreadyExists(control, Back::lstTable(control)(2), entry(2, 1),
                                          Back::lstTable(control)(1), entry(1, 2)));
}

TEST_F(AJoinThatExists, BelongsToBothTables) {
    const Record made = drawFirst();
    made->LeftColumnText(u"Customer");
    made->RightColumnText(u"Number");
    made->LeftTablehwnd(0);
    EXPECT_FALSE(exists(entry(1, 2), entry(2, 1)));
    made->LeftTablehwnd(table(1).TableHandle());
    made->RightTablehwnd(0);
    EXPECT_FALSE(exists(entry(1, 2), entry(2, 1)));
}

TEST_F(AJoinThatExists, IsFoundBehindOthers) {
    drawFirst();
    const Record second = drawFirst();
    second->LeftColumnText(u"Customer");
    second->RightColumnText(u"Number");
    EXPECT_TRUE(exists(entry(1, 2), entry(2, 1)));
}

TEST_F(AJoinThatExists, IsNotMadeAgain) {
    const Record made = drawFirst();
    made->LeftColumnText(u"Customer");
    made->RightColumnText(u"Number");
    EXPECT_FALSE(drawFirst());
    EXPECT_EQ(joinCount(), 1);
    EXPECT_TRUE(isFree(2));
    EXPECT_FALSE(stage->exists("linJoin(2)"));
    EXPECT_EQ(stage->boxes, Boxes());
}

TEST_F(AJoinThatExists, IsOneMadeOnTheCanvasBetweenColumnsWithoutName) {
    const Item left = table(1).ColumnItems().Add(u"kBlank", u"");
    const Item right = table(2).ColumnItems().Add(u"kBlank", u"");
    EXPECT_TRUE(draw(left, right));
    EXPECT_FALSE(draw(left, right));
    EXPECT_EQ(joinCount(), 1);
}

TEST_F(AJoinThatExists, IsReportedAndDeniedWhenATableIsMissing) {
    drawFirst();
    EXPECT_FALSE(Back::JoinAllreadyExists(control, nullptr, entry(1, 2), nullptr, entry(2, 1)));
    EXPECT_EQ(stage->boxes, Boxes{controlErrorBox(u"JoinAllreadyExists", 91, objectNotSet)});
}

// Entering the model.

struct AJoinEnteringTheModel : ANewJoin {
    Record made = drawFirst();

    void add() {
        Back::AddNewJoin(control, made, orders, orders->columnRef(u"Customer"), customers,
                         customers->columnRef(u"Number"));
    }
};

TEST_F(AJoinEnteringTheModel, CarriesItsTablesAndColumns) {
    add();
    ASSERT_EQ(model->joinCount(), 1);
    const fake::Join& stored = model->joinAt(1);
    EXPECT_EQ(stored.leftTable, orders);
    EXPECT_EQ(stored.leftColumn, orders->columnRef(u"Customer"));
    EXPECT_EQ(stored.rightTable, customers);
    EXPECT_EQ(stored.rightColumn, customers->columnRef(u"Number"));
}

TEST_F(AJoinEnteringTheModel, IsANormalJoinOfEqualsWhateverItsRecordHolds) {
    made->JoinType(2);
    made->CompareOperator(4);
    add();
    EXPECT_EQ(model->joinAt(1).joinType, 0);
    EXPECT_EQ(model->joinAt(1).compareOperator, 0);
    EXPECT_EQ(made->JoinType(), 2);
    EXPECT_EQ(made->CompareOperator(), 4);
}

TEST_F(AJoinEnteringTheModel, GivesItsRecordTheKeyOfTheJoinAsStored) {
    model->storesCopies = true;
    add();
    EXPECT_EQ(made->Tag(), platform::Variant(model->joinAt(1).key));
    EXPECT_NE(model->joinAt(1).key, u"");
}

TEST_F(AJoinEnteringTheModel, IsFilledInAFixedOrder) {
    model->calls->remember(true);
    add();
    EXPECT_EQ(
        model->calls->calls(),
        (std::vector<std::string>{"Library.NewZDJoin", "ZDJoin.LeftTable=", "ZDJoin.LeftColumn=",
                                  "ZDJoin.RightTable=", "ZDJoin.RightColumn=", "ZDJoin.JoinType=",
                                  "ZDJoin.CompareOperator=", "Zandor.AddJoin", "ZDJoin.Key"}));
}

TEST_F(AJoinEnteringTheModel, IsReportedWhicheverStepTheModelRefuses) {
    for (const char* member :
         {"Library.NewZDJoin", "ZDJoin.LeftTable=", "ZDJoin.LeftColumn=", "ZDJoin.RightTable=",
          "ZDJoin.RightColumn=", "ZDJoin.JoinType=", "ZDJoin.CompareOperator=", "Zandor.AddJoin"}) {
        forget();
        model->fail(member, platform::errors::invalidProcedureCall());
        add();
        EXPECT_EQ(stage->boxes, Boxes{controlErrorBox(u"AddNewJoin", 5, invalidCall)}) << member;
        EXPECT_EQ(model->joinCount(), 0) << member;
    }
    EXPECT_EQ(made->Tag(), platform::Variant());
    EXPECT_TRUE(stage->look("linJoin(1)").visible);
}

TEST_F(AJoinEnteringTheModel, IsInTheModelButNotLinkedWhenItsKeyCannotBeRead) {
    model->fail("ZDJoin.Key", platform::errors::unsupportedMember());
    add();
    EXPECT_EQ(stage->boxes,
              Boxes{controlErrorBox(u"AddNewJoin", 438,
                                    u"Object doesn't support this property or method")});
    EXPECT_EQ(model->joinCount(), 1);
    EXPECT_EQ(made->Tag(), platform::Variant());
}

TEST_F(AJoinEnteringTheModel, IsReportedWithoutARecord) {
    made = nullptr;
    add();
    EXPECT_EQ(stage->boxes, Boxes{controlErrorBox(u"AddNewJoin", 91, objectNotSet)});
    EXPECT_EQ(model->joinCount(), 1);
}

} // namespace
