#include "CanvasTest.h"

namespace {

class Scrolling : public CanvasTest {
protected:
    Scrolling() {
        table(u"A", {u"ID", u"NAME", u"CITY", u"ZIP", u"STREET", u"PHONE", u"MAIL", u"NOTE"}, 600);
        bind();
    }
    void openEditor() {
        control().OnlyJoin(false);
        stage->pressCell(1, 1, 1);
        ASSERT_TRUE(stage->look("fraValue").visible);
    }
};

TEST_F(Scrolling, MovesTheCanvasAgainstTheBars) {
    stage->scrollBarTo("hsbTable", 300);
    EXPECT_EQ(boundsOf("fraTable").Left, -300);
    EXPECT_EQ(boundsOf("fraTable").Top, 0);

    stage->scrollBarTo("vsbTable", 1200);
    EXPECT_EQ(boundsOf("fraTable").Left, -300);
    EXPECT_EQ(boundsOf("fraTable").Top, -1200);
    EXPECT_EQ(control().VisibleFrameLeft(), 300);
    EXPECT_EQ(control().VisibleFrameTop(), 1200);
}

TEST_F(Scrolling, MovesTheCanvasForTheHostToo) {
    control().HorizontalScrollbarPos(450);
    control().VerticalScrollbarPos(600);
    EXPECT_EQ(boundsOf("fraTable").Left, -450);
    EXPECT_EQ(boundsOf("fraTable").Top, -600);
}

TEST_F(Scrolling, GoesHomeThroughBothBars) {
    stage->scrollBarTo("hsbTable", 300);
    stage->scrollBarTo("vsbTable", 1200);

    stage->clickButton("cmdHome");
    EXPECT_EQ(stage->look("hsbTable").value, 0);
    EXPECT_EQ(stage->look("vsbTable").value, 0);
    EXPECT_EQ(boundsOf("fraTable").Left, 0);
    EXPECT_EQ(boundsOf("fraTable").Top, 0);
}

TEST_F(Scrolling, SetsTheFocusBackAfterGoingHome) {
    Back::mActiveTableIndex(control()) = 5;
    Back::cmdHome_Click(control());
    EXPECT_EQ(Back::mActiveTableIndex(control()), 1);
}

TEST_F(Scrolling, SetsTheFocusBackFromTheBars) {
    Back::mActiveTableIndex(control()) = 5;
    Back::hsbTable_GotFocus(control());
    EXPECT_EQ(Back::mActiveTableIndex(control()), 1);

    Back::mActiveTableIndex(control()) = 6;
    Back::vsbTable_GotFocus(control());
    EXPECT_EQ(Back::mActiveTableIndex(control()), 1);
}

TEST_F(Scrolling, ClosesAnOpenCellEditorWhenTheHorizontalBarGetsTheFocus) {
    openEditor();
    Back::hsbTable_GotFocus(control());
    EXPECT_FALSE(stage->look("fraValue").visible);
}

TEST_F(Scrolling, ClosesAnOpenCellEditorWhenTheVerticalBarGetsTheFocus) {
    openEditor();
    Back::vsbTable_GotFocus(control());
    EXPECT_FALSE(stage->look("fraValue").visible);
}

TEST_F(Scrolling, ClosesAnOpenCellEditorWhenTheHomeButtonGetsTheFocus) {
    openEditor();
    Back::cmdHome_GotFocus(control());
    EXPECT_FALSE(stage->look("fraValue").visible);
}

TEST_F(Scrolling, RedrawsTheJoinsOfATableWhoseListIsScrolled) {
    const auto a = table(u"LEFT",
                         {u"ID", u"NAME", u"CITY", u"ZIP", u"STREET", u"PHONE", u"MAIL", u"NOTE",
                          u"FAX", u"WEB", u"TAX", u"BANK"},
                         3000);
    a->height = 1500;
    model->join(a, u"NAME", table(u"RIGHT", {u"ID"}, 6000), u"ID");
    bind();
    const float before = stage->look("linJoin(1)").Y1;

    stage->scrollList(2, 2);
    EXPECT_LT(stage->look("linJoin(1)").Y1, before);
    EXPECT_EQ(told(), Texts{});
}

} // namespace
