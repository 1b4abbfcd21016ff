#include "control/ShellFixture.h"

namespace {

/// 9000 twips wide and 7500 high, so that 7000 by 8500 twips of the canvas are out of view.
class TheScrollProperties : public AControl {
protected:
    TheScrollProperties() {
        stage->resizeControl(9000, 7500);
        forget();
    }
};

class TheOnlyJoinProperty : public AControl {};

class TheObjectProperties : public AControl {
protected:
    void expectNothing() {
        EXPECT_FALSE(zandor().lastjoin());
        EXPECT_FALSE(zandor().activetable());
        EXPECT_FALSE(zandor().ActiveColumn());
    }
};

} // namespace

TEST_F(TheScrollProperties, TellHowFarTheCanvasIsScrolled) {
    EXPECT_EQ(zandor().VisibleFrameLeft(), 0);
    EXPECT_EQ(zandor().VisibleFrameTop(), 0);
    zandor().VisibleFrameLeft(1200);
    zandor().VisibleFrameTop(2400);
    EXPECT_EQ(zandor().VisibleFrameLeft(), 1200);
    EXPECT_EQ(zandor().VisibleFrameTop(), 2400);
    EXPECT_EQ(look("fraTable").bounds.Left, -1200);
    EXPECT_EQ(look("fraTable").bounds.Top, -2400);
    EXPECT_EQ(look("hsbTable").value, 1200);
    EXPECT_EQ(look("vsbTable").value, 2400);
}

TEST_F(TheScrollProperties, RoundThePlaceOfTheCanvasHalvesToEven) {
    canvas().Left(-10.5F);
    canvas().Top(-11.5F);
    EXPECT_EQ(zandor().VisibleFrameLeft(), 10);
    EXPECT_EQ(zandor().VisibleFrameTop(), 12);
}

TEST_F(TheScrollProperties, ReportACanvasFurtherAwayThanAnIntegerCanTell) {
    canvas().Left(-40000);
    EXPECT_EQ(zandor().VisibleFrameLeft(), 0);
    canvas().Top(-40000);
    EXPECT_EQ(zandor().VisibleFrameTop(), 0);
    EXPECT_EQ(stage->boxes, (std::vector{unexpected(u"P_GET VisibleFrameLeft", u"6", u"Overflow"),
                                         unexpected(u"P_GET VisibleFrameTop", u"6", u"Overflow")}));
}

TEST_F(TheScrollProperties, StopTheVisibleFrameAtTheEndOfTheRange) {
    zandor().VisibleFrameLeft(7001);
    EXPECT_EQ(zandor().VisibleFrameLeft(), 7000);
    zandor().VisibleFrameLeft(0);
    zandor().VisibleFrameLeft(32767);
    EXPECT_EQ(zandor().VisibleFrameLeft(), 7000);
    zandor().VisibleFrameTop(8501);
    EXPECT_EQ(zandor().VisibleFrameTop(), 8500);
    EXPECT_TRUE(stage->boxes.empty());
}

TEST_F(TheScrollProperties, KeepTheVisibleFrameAtTheOriginOfACanvasThatIsInView) {
    canvas().Width(9000.75F);
    canvas().Height(7500.75F);
    zandor().HorizontalScrollbarPos(500);
    zandor().VerticalScrollbarPos(500);
    zandor().VisibleFrameLeft(600);
    zandor().VisibleFrameTop(600);
    EXPECT_EQ(look("hsbTable").value, 0);
    EXPECT_EQ(look("vsbTable").value, 0);
}

TEST_F(TheScrollProperties, TakeACanvasOneTwipLargerAsARangeOfOne) {
    canvas().Width(9001);
    canvas().Height(7501);
    zandor().VisibleFrameLeft(600);
    zandor().VisibleFrameTop(600);
    EXPECT_EQ(look("hsbTable").value, 1);
    EXPECT_EQ(look("vsbTable").value, 1);
}

TEST_F(TheScrollProperties, PassANegativeVisibleFrameToTheScrollBarWhichRefusesIt) {
    zandor().VisibleFrameLeft(100);
    zandor().VisibleFrameTop(100);
    zandor().VisibleFrameLeft(-1);
    zandor().VisibleFrameTop(-1);
    EXPECT_EQ(zandor().VisibleFrameLeft(), 100);
    EXPECT_EQ(zandor().VisibleFrameTop(), 100);
    EXPECT_EQ(stage->boxes, (std::vector{invalidValue(u"P_LET VisibleFrameLeft"),
                                         invalidValue(u"P_LET VisibleFrameTop")}));
}

TEST_F(TheScrollProperties, ReckonTheVisibleFrameTopWithTheUpperPane) {
    zandor().OnlyJoin(false);
    zandor().VisibleFrameTop(32767);
    EXPECT_EQ(zandor().VisibleFrameTop(), 16000 - 3750);
}

TEST_F(TheScrollProperties, ReadAndWriteThePositionsAndScrollTheCanvas) {
    zandor().HorizontalScrollbarPos(300);
    zandor().VerticalScrollbarPos(450);
    EXPECT_EQ(zandor().HorizontalScrollbarPos(), 300);
    EXPECT_EQ(zandor().VerticalScrollbarPos(), 450);
    EXPECT_EQ(look("fraTable").bounds.Left, -300);
    EXPECT_EQ(look("fraTable").bounds.Top, -450);
    stage->scrollBarTo("hsbTable", 600);
    EXPECT_EQ(zandor().HorizontalScrollbarPos(), 600);
}

TEST_F(TheScrollProperties, RefuseAPositionOutsideTheRangeAndStayWhereTheyWere) {
    zandor().HorizontalScrollbarPos(300);
    zandor().VerticalScrollbarPos(450);
    zandor().HorizontalScrollbarPos(7001);
    zandor().VerticalScrollbarPos(-1);
    EXPECT_EQ(zandor().HorizontalScrollbarPos(), 300);
    EXPECT_EQ(zandor().VerticalScrollbarPos(), 450);
    EXPECT_EQ(stage->boxes, (std::vector{invalidValue(u"P_LET HorizontalScrollbarPos"),
                                         invalidValue(u"P_LET VerticalScrollbarPos")}));
}

TEST_F(TheScrollProperties, ReadAndWriteTheRangesUntilTheNextLayout) {
    EXPECT_EQ(zandor().HorizMaxScrollPos(), 7000);
    EXPECT_EQ(zandor().VertMaxScrollPos(), 8500);
    zandor().HorizMaxScrollPos(123);
    zandor().VertMaxScrollPos(456);
    EXPECT_EQ(zandor().HorizMaxScrollPos(), 123);
    EXPECT_EQ(zandor().VertMaxScrollPos(), 456);
    EXPECT_EQ(look("hsbTable").max, 123);
    zandor().UserControl_Resize();
    EXPECT_EQ(zandor().HorizMaxScrollPos(), 7000);
    EXPECT_EQ(zandor().VertMaxScrollPos(), 8500);
}

TEST_F(TheScrollProperties, RefuseANegativeRangeAndStayWhereTheyWere) {
    zandor().HorizMaxScrollPos(-1);
    zandor().VertMaxScrollPos(-1);
    EXPECT_EQ(zandor().HorizMaxScrollPos(), 7000);
    EXPECT_EQ(zandor().VertMaxScrollPos(), 8500);
    EXPECT_EQ(stage->boxes, (std::vector{invalidValue(u"P_LET HorizMaxScrollPos"),
                                         invalidValue(u"P_LET VertMaxScrollPos")}));
}

TEST_F(TheOnlyJoinProperty, IsTrueWithTheGridHiddenUntilTheHostSetsItToFalse) {
    EXPECT_TRUE(zandor().OnlyJoin());
    stage->resizeControl(9000, 7500);
    stage->repaint();
    EXPECT_FALSE(look("sprColumn").visible);
    zandor().OnlyJoin(false);
    EXPECT_FALSE(zandor().OnlyJoin());
    EXPECT_TRUE(look("sprColumn").visible);
}

TEST_F(TheOnlyJoinProperty, HidesTheGridAgainWhenSetToTrue) {
    zandor().OnlyJoin(false);
    zandor().OnlyJoin(true);
    EXPECT_TRUE(zandor().OnlyJoin());
    EXPECT_FALSE(look("sprColumn").visible);
}

TEST_F(TheOnlyJoinProperty, LaysTheControlOutAfreshBothWays) {
    stage->resizeControl(9000, 7500);
    const float bar = look("hsbTable").bounds.Height;
    zandor().OnlyJoin(false);
    EXPECT_EQ(look("vsbTable").bounds.Height, 3750 - bar);
    EXPECT_EQ(look("sprColumn").bounds.Top, 3750);
    zandor().OnlyJoin(true);
    EXPECT_EQ(look("vsbTable").bounds.Height, 7500 - bar);
}

TEST_F(TheOnlyJoinProperty, WritesTheRowTitlesOfTheMomentWhenSetToFalse) {
    zandor().LNGSpreadField = u"Feld:";
    zandor().LNGSpreadSynonym = u"Alias:";
    zandor().LNGSpreadSort = u"Sortierung:";
    zandor().LNGSpreadVisible = u"Sichtbar:";
    zandor().LNGSpreadCriteria = u"Kriterien:";
    zandor().LNGSpreadOr = u"Oder:";
    EXPECT_EQ(stage->cell(0, 0), u"Field:") << "the texts alone change nothing";
    zandor().OnlyJoin(true);
    EXPECT_EQ(stage->cell(0, 0), u"Field:") << "nor does the grid's being hidden";
    zandor().OnlyJoin(false);
    const StringView titles[] = {u"Feld:",     u"Alias:",     u"Sortierung:",
                                 u"Sichtbar:", u"Kriterien:", u"Oder:"};
    for (std::int32_t row = 0; row < 6; ++row) EXPECT_EQ(stage->cell(row, 0), titles[row]);
    EXPECT_EQ(stage->cell(6, 0), u"");
}

TEST_F(TheObjectProperties, AreNothingAfterATableHasBeenMadeCurrent) {
    auto model = library.newModel();
    model->table(u"ORDERS", {u"ID"});
    bind(model);
    zandor().SetCurrentTable(u"ORDERS");
    zandor().SelectColumnNames(u"ORDERS", u"ID");
    expectNothing();
}

TEST_F(TheObjectProperties, AreNothingAfterAJoinHasBeenCreated) {
    auto model = library.newModel();
    model->table(u"ORDERS", {u"ID"})->place(0, 0, 2400, 2400);
    model->table(u"ITEMS", {u"ORDER_ID"})->place(3000, 0, 2400, 2400);
    bind(model);
    forget();
    stage->dragToEntry(1, 1, 2, 1);
    ASSERT_FALSE(stage->raised.empty());
    EXPECT_EQ(stage->raised[0].event, TalvikDBxZandor::Event::JoinCreated);
    expectNothing();
}

TEST_F(TheObjectProperties, AreNothingAfterAColumnHasBeenCreated) {
    auto model = library.newModel();
    model->table(u"ORDERS", {u"ID"})->place(0, 0, 2400, 2400);
    zandor().OnlyJoin(false);
    bind(model);
    forget();
    stage->dragToCell(1, 1, 1, 1);
    ASSERT_FALSE(stage->raised.empty());
    EXPECT_EQ(stage->raised[0].event, TalvikDBxZandor::Event::ColumnCreated);
    expectNothing();
}
