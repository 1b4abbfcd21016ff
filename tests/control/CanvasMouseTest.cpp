#include "CanvasTest.h"

namespace {

/// Two tables with a join each to a third, far enough apart to click on the lines.
class ClickingTheCanvas : public CanvasTest {
protected:
    ClickingTheCanvas() {
        const auto a = table(u"A", {u"ID"}, 600, 600);
        const auto b = table(u"B", {u"ID"}, 600, 4500);
        const auto c = table(u"C", {u"ID"}, 7500, 2400);
        model->join(a, u"ID", c, u"ID");
        model->join(b, u"ID", c, u"ID");
        bind();
    }

    TalvikTabulet::Point middleOf(int join) {
        const auto line = stage->look("linJoin(" + std::to_string(join) + ")");
        return {(line.X1 + line.X2) / 2, (line.Y1 + line.Y2) / 2};
    }
    int widthOf(int join) {
        return stage->look("linJoin(" + std::to_string(join) + ")").borderWidth;
    }
    void press(std::int16_t button, int join) {
        const auto at = middleOf(join);
        stage->pressCanvas(button, at.X, at.Y);
    }
    void release(std::int16_t button, int join) {
        const auto at = middleOf(join);
        stage->releaseCanvas(button, at.X, at.Y);
    }
};

TEST_F(ClickingTheCanvas, HighlightsTheJoinUnderTheMouse) {
    ASSERT_EQ(widthOf(1), 1);
    press(1, 1);
    EXPECT_EQ(widthOf(1), 2);
    EXPECT_EQ(widthOf(2), 1);
    EXPECT_EQ(Back::mLastJoin(control())->JoinLineIndex(), 1);
}

TEST_F(ClickingTheCanvas, HighlightsForEveryButton) {
    for (const std::int16_t button : {1, 2, 4}) {
        press(button, 1);
        EXPECT_EQ(widthOf(1), 2) << button;
        Back::MakeGetValueFieldsInvisible(control());
        ASSERT_EQ(widthOf(1), 1);
        release(button, 1);
    }
}

TEST_F(ClickingTheCanvas, TakesTheHighlightFromTheJoinBefore) {
    press(1, 1);
    release(1, 1);
    press(1, 2);
    EXPECT_EQ(widthOf(1), 1);
    EXPECT_EQ(widthOf(2), 2);
    EXPECT_EQ(Back::mLastJoin(control())->JoinLineIndex(), 2);
}

TEST_F(ClickingTheCanvas, TakesTheHighlightAwayBesideEveryJoinAndRemembersTheJoin) {
    press(1, 1);
    release(1, 1);
    stage->pressCanvas(1, 4500, 8400);
    EXPECT_EQ(widthOf(1), 1);
    EXPECT_EQ(Back::mLastJoin(control())->JoinLineIndex(), 1);
    EXPECT_EQ(told(), Texts{});
}

TEST_F(ClickingTheCanvas, ClosesAnOpenCellEditor) {
    control().OnlyJoin(false);
    stage->pressCell(1, 1, 1);
    ASSERT_TRUE(stage->look("fraValue").visible);
    Back::fraTable_MouseDown(control(), std::int16_t{1}, std::int16_t{0}, 15.0F, 15.0F);
    EXPECT_FALSE(stage->look("fraValue").visible);
}

TEST_F(ClickingTheCanvas, HighlightsAJoinWithTheRightButtonBeforeItsMenuOpens) {
    press(2, 1);
    EXPECT_EQ(widthOf(1), 2);
    EXPECT_EQ(stage->transcript, Texts{});

    bool opened = false;
    stage->onMenu = [&](const std::vector<Stage::Entry>& entries) {
        opened = true;
        for (const auto& entry : entries) {
            const bool ofTheJoin =
                entry.name == u"mnuJoinShowDefinition" || entry.name == u"mnuJoinDelete";
            if (entry.name.ends_with(u"Sep")) continue;
            EXPECT_EQ(entry.enabled, ofTheJoin) << utf8(entry.name);
        }
        return String();
    };
    release(2, 1);
    EXPECT_TRUE(opened);
    EXPECT_EQ(events(), Texts{"Activate"});
}

TEST_F(ClickingTheCanvas, OpensTheMenuAtThePlaceOfTheRelease) {
    stage->pressCanvas(2, 4500, 8400);
    stage->releaseCanvas(2, 4500, 8400);
    EXPECT_EQ(Back::mPopupX(control()), 4500);
    EXPECT_EQ(Back::mPopupY(control()), 8400);
}

TEST_F(ClickingTheCanvas, OpensTheMenuForTheRightButtonAlone) {
    int opened = 0;
    stage->onMenu = [&](const auto&) {
        ++opened;
        return String();
    };
    for (const std::int16_t button : {1, 3, 4, 6})
        Back::fraTable_MouseUp(control(), button, std::int16_t{0}, 4500.0F, 8400.0F);
    EXPECT_EQ(opened, 0);
    EXPECT_EQ(events(), Texts{});

    Back::fraTable_MouseUp(control(), std::int16_t{2}, std::int16_t{0}, 4500.0F, 8400.0F);
    EXPECT_EQ(opened, 1);
}

TEST_F(ClickingTheCanvas, ReportsAJoinWhoseLineIsGone) {
    const auto at = middleOf(1);
    Back::linJoin(control()).Unload(1);
    stage->pressCanvas(1, at.X, at.Y);
    EXPECT_EQ(told(), (Texts{noElement("JoinHitTest", 1), notSet("fraTable_MouseDown")}));
}

} // namespace
