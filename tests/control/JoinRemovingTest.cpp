#include "control/JoinScene.h"

using namespace zandor;

namespace {

struct ARemovedJoin : JoinScene {
    ARemovedJoin() {
        join();
        bind();
    }

    void expectGone() {
        EXPECT_FALSE(stage->exists("linJoin(1)"));
        EXPECT_FALSE(stage->exists("shpJoin(1)"));
        EXPECT_FALSE(stage->exists("shpJoin(2)"));
        EXPECT_EQ(joinCount(), 0);
        EXPECT_TRUE(isFree(1));
    }
    void expectThere() {
        EXPECT_TRUE(stage->exists("linJoin(1)"));
        EXPECT_TRUE(stage->exists("shpJoin(1)"));
        EXPECT_TRUE(stage->exists("shpJoin(2)"));
        EXPECT_EQ(joinCount(), 1);
        EXPECT_FALSE(isFree(1));
    }
    void press(std::int16_t button) {
        stage->pressCanvas(button, (line().X1() + line().X2()) / 2,
                           (line().Y1() + line().Y2()) / 2);
    }
};

TEST_F(ARemovedJoin, TakesItsElementsItsRecordAndItsNumberAway) {
    EXPECT_TRUE(Back::RemoveJoin(control, record()));
    expectGone();
    EXPECT_EQ(stage->boxes, Boxes());
}

TEST_F(ARemovedJoin, LeavesTheOthersAlone) {
    const Record second = draw(entry(1, 1), entry(2, 2));
    EXPECT_TRUE(Back::RemoveJoin(control, record()));
    EXPECT_EQ(joinCount(), 1);
    EXPECT_EQ(record(u"2"), second);
    EXPECT_TRUE(stage->look("linJoin(2)").visible);
    EXPECT_TRUE(stage->look("shpJoin(3)").visible);
    EXPECT_TRUE(stage->look("shpJoin(4)").visible);
}

Stage::Box removalFailed(const Stage::String& index) {
    return controlErrorBox(u"RemoveJoin", 340,
                           u"Control array element '" + index + u"' doesn't exist");
}

TEST_F(ARemovedJoin, LosesItsLineFirst) {
    Back::linJoin(control).Unload(1);
    EXPECT_FALSE(Back::RemoveJoin(control, record()));
    EXPECT_EQ(stage->boxes, Boxes{removalFailed(u"1")});
    EXPECT_TRUE(stage->exists("shpJoin(1)"));
    EXPECT_TRUE(stage->exists("shpJoin(2)"));
    EXPECT_EQ(joinCount(), 1);
    EXPECT_FALSE(isFree(1));
}

TEST_F(ARemovedJoin, LosesTheMarkOfTheOddNumberBeforeTheEvenOne) {
    Back::shpJoin(control).Unload(1);
    EXPECT_FALSE(Back::RemoveJoin(control, record()));
    EXPECT_EQ(stage->boxes, Boxes{removalFailed(u"1")});
    EXPECT_FALSE(stage->exists("linJoin(1)"));
    EXPECT_TRUE(stage->exists("shpJoin(2)"));
    EXPECT_EQ(joinCount(), 1);
}

TEST_F(ARemovedJoin, LosesTheMarkOfTheEvenNumberLast) {
    Back::shpJoin(control).Unload(2);
    EXPECT_FALSE(Back::RemoveJoin(control, record()));
    EXPECT_EQ(stage->boxes, Boxes{removalFailed(u"2")});
    EXPECT_FALSE(stage->exists("shpJoin(1)"));
    EXPECT_EQ(joinCount(), 1);
    EXPECT_FALSE(isFree(1));
}

TEST_F(ARemovedJoin, KeepsItsNumberTakenWhenItsRecordIsNotHeld) {
    const Record gone = record();
    Back::mJoinLines(control).Remove(u"1");
    EXPECT_FALSE(Back::RemoveJoin(control, gone));
    EXPECT_EQ(stage->boxes,
              Boxes{controlErrorBox(u"RemoveJoin", 5, u"Invalid procedure call or argument")});
    EXPECT_FALSE(stage->exists("linJoin(1)"));
    EXPECT_FALSE(isFree(1));
}

TEST_F(ARemovedJoin, OverflowsWhenTwiceItsNumberExceeds16Bits) {
    Back::linJoin(control).Load(20000);
    record()->Index(20000);
    EXPECT_FALSE(Back::RemoveJoin(control, record()));
    EXPECT_EQ(stage->boxes, Boxes{controlErrorBox(u"RemoveJoin", 6, u"Overflow")});
    EXPECT_FALSE(stage->exists("linJoin(20000)"));
    EXPECT_EQ(joinCount(), 1);
}

TEST_F(ARemovedJoin, GoesWithItsTable) {
    stage->closeTable(2);
    expectGone();
    EXPECT_EQ(stage->boxes, Boxes());
}

TEST_F(ARemovedJoin, IsForgottenAsTheOneClickedLast) {
    const float x = (line().X1() + line().X2()) / 2;
    press(leftButton);
    ASSERT_EQ(Back::mLastJoin(control), record());
    Back::RemoveJoin(control, record());
    EXPECT_EQ(Back::mLastJoin(control), nullptr);
    stage->pressCanvas(leftButton, x, 7000);
    EXPECT_EQ(stage->boxes, Boxes());
}

TEST_F(ARemovedJoin, LeavesAnotherOneHighlighted) {
    const Record second = draw(entry(1, 3), entry(2, 2));
    press(leftButton);
    Back::RemoveJoin(control, second);
    EXPECT_EQ(Back::mLastJoin(control), record());
    EXPECT_EQ(stage->look("linJoin(1)").borderWidth, 2);
}

// The menu command.

TEST_F(ARemovedJoin, IsTheOneUnderTheMenuAndIsToldToTheHost) {
    const fake::Join* const stored = &model->joinAt(1);
    const platform::Ref<TalvikZandorLib::ZDJoin> held = model->joins.items.Item(1);
    stage->onMenu = [](const auto&) { return String(u"mnuJoinDelete"); };
    const float x = (line().X1() + line().X2()) / 2;
    const float y = (line().Y1() + line().Y2()) / 2;
    stage->pressCanvas(rightButton, x, y);
    stage->releaseCanvas(rightButton, x, y);
    expectGone();
    EXPECT_EQ(model->joinCount(), 0);
    EXPECT_EQ(events(), (std::vector{Event::Activate, Event::JoinRemoved}));
    EXPECT_EQ(stage->raised.back().arguments.Join.get(), stored);
    // The right press had highlighted it; the next press must not look for its line.
    stage->pressCanvas(leftButton, x, y);
    EXPECT_EQ(stage->boxes, Boxes());
}

TEST_F(ARemovedJoin, IsNoneWhereNoLineIsNear) {
    pointNowhere();
    Back::mnuJoinDelete_Click(control);
    expectThere();
    EXPECT_EQ(model->joinCount(), 1);
    EXPECT_EQ(events(), std::vector<Event>());
    EXPECT_EQ(stage->boxes, Boxes());
}

TEST_F(ARemovedJoin, IsNoneWhereTheLineIs50Away) {
    put(1, 3000, 1000, 5000, 1000);
    Back::mPopupX(control) = 4000;
    Back::mPopupY(control) = 1050;
    Back::mnuJoinDelete_Click(control);
    expectThere();
    EXPECT_EQ(events(), std::vector<Event>());
}

const Stage::Box deletionFailed =
    controlErrorBox(u"mnuJoinDelete_Click", 5, u"Invalid procedure call or argument");

TEST_F(ARemovedJoin, StaysWhenTheModelHoldsNoJoinUnderItsTag) {
    record()->Tag(String(u"unknown"));
    pointAt();
    Back::mnuJoinDelete_Click(control);
    EXPECT_EQ(stage->boxes, Boxes{deletionFailed});
    expectThere();
    EXPECT_EQ(model->joinCount(), 1);
    EXPECT_EQ(events(), std::vector<Event>());
}

TEST_F(ARemovedJoin, GoesFromTheDrawingAloneWhenTheModelNeverTookIt) {
    record()->Tag({});
    pointAt();
    Back::mnuJoinDelete_Click(control);
    EXPECT_EQ(stage->boxes, Boxes());
    EXPECT_EQ(joinCount(), 0);
    EXPECT_FALSE(stage->exists("linJoin(1)"));
    EXPECT_TRUE(isFree(1));
    EXPECT_EQ(model->joinCount(), 1);
    EXPECT_EQ(events(), std::vector<Event>());
}

TEST_F(ARemovedJoin, StaysWhenItsTagIsNoText) {
    record()->Tag(std::int32_t{1});
    pointAt();
    Back::mnuJoinDelete_Click(control);
    EXPECT_EQ(stage->boxes, Boxes{controlErrorBox(u"mnuJoinDelete_Click", 13, u"Type mismatch")});
    expectThere();
}

TEST_F(ARemovedJoin, StaysWhenTheModelsJoinsCannotBeReached) {
    model->fail("Zandor.Joins", platform::errors::invalidProcedureCall());
    pointAt();
    Back::mnuJoinDelete_Click(control);
    EXPECT_EQ(stage->boxes, Boxes{deletionFailed});
    expectThere();
}

TEST_F(ARemovedJoin, LeavesTheModelUnderItsOwnKeyThere) {
    // The key that the join itself gives is what counts, not the one it was found by.
    model->joinAt(1).key = u"own";
    pointAt();
    Back::mnuJoinDelete_Click(control);
    EXPECT_EQ(stage->boxes, Boxes{deletionFailed});
    expectGone();
    EXPECT_EQ(model->joinCount(), 1);
    EXPECT_EQ(events(), std::vector<Event>());
}

TEST_F(ARemovedJoin, IsGoneFromTheCanvasWhenTheModelRefusesToRemoveIt) {
    model->fail("Joins.Remove", platform::errors::invalidProcedureCall());
    pointAt();
    Back::mnuJoinDelete_Click(control);
    EXPECT_EQ(stage->boxes, Boxes{deletionFailed});
    expectGone();
    EXPECT_EQ(model->joinCount(), 1);
    EXPECT_EQ(events(), std::vector<Event>());
}

TEST_F(ARemovedJoin, IsRemovedFromTheModelEvenWhenTheCanvasFails) {
    Back::shpJoin(control).Unload(2);
    pointAt();
    Back::mnuJoinDelete_Click(control);
    EXPECT_EQ(stage->boxes, Boxes{removalFailed(u"2")});
    EXPECT_EQ(model->joinCount(), 0);
    EXPECT_EQ(events(), std::vector{Event::JoinRemoved});
}

} // namespace
