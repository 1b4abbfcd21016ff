#include "control/CanvasTest.h"

#include <Zandor/headless/Toolkit.h>

using namespace zandor;

namespace {

namespace headless = platform::headless;

/// What the canvas does when the toolkit fails under it, and what only this toolkit shows.
class CanvasOnAToolkit : public CanvasTest {
protected:
    CanvasOnAToolkit() {
        first = table(u"A", {u"ID", u"NAME"}, 600);
        second = table(u"B", {u"ID"}, 6000);
    }

    headless::Toolkit& toolkit() { return dynamic_cast<headless::Toolkit&>(stage->toolkit()); }
    const headless::Tabulet& list(int index) {
        return toolkit().find<headless::Tabulet>("lstTable(" + std::to_string(index) + ")");
    }
    void fail(const std::string& call, int nth = 1) {
        toolkit().faults.failNext(call, platform::RuntimeError{31, u"Cannot draw"}, nth);
    }
    static std::string failedIn(const std::string& procedure) {
        return report(procedure, 31, "Cannot draw");
    }
    bool remove(int index) {
        return Back::RemoveTable(control(), static_cast<std::int16_t>(index));
    }

    Ref<fake::Table> first, second;
};

using ShowingTablesOnAToolkit = CanvasOnAToolkit;

TEST_F(ShowingTablesOnAToolkit, MarksTheEntriesOfMarkedColumns) {
    first->column(u"NAME").marker = true;
    bind();
    EXPECT_EQ(list(1).entry(1).image(), 0);
    EXPECT_EQ(list(1).entry(2).image(), 1);
}

TEST_F(ShowingTablesOnAToolkit, PlacesATableFillsItShowsItAndCompletesIt) {
    first->column(u"ID").selected = true;
    model->tables.items.Remove(u"tB");
    toolkit().faults.remember(true);
    bind();
    Texts calls;
    for (const std::string& call : toolkit().faults.calls())
        if (call.starts_with("lstTable(1).") && !call.ends_with(".bounds"))
            calls.push_back(call.substr(12));
    ASSERT_GE(calls.size(), 20U);
    calls.resize(20);
    EXPECT_EQ(calls, (Texts{"Text=",
                            "Tag=",
                            "setBounds",
                            "setBounds",
                            "setBounds",
                            "setBounds",
                            "ColumnItems",
                            "ColumnItems.Add",
                            "ColumnItem.Selected=",
                            "ColumnItem.Refresh",
                            "ColumnItem.EnsureVisible",
                            "ColumnItems",
                            "ColumnItems.Add",
                            "Activated",
                            "Visible=",
                            "ZOrder",
                            "Complete",
                            "Text",
                            "Text",
                            "Visible"}));
}

TEST_F(ShowingTablesOnAToolkit, BringsEachTableInFrontOfTheOnesBefore) {
    bind();
    const auto& front = toolkit().find<headless::Frame>("fraTable").children().back();
    EXPECT_EQ(front->name(), "lstTable(2)");
    EXPECT_TRUE(list(1).activated());
}

TEST_F(ShowingTablesOnAToolkit, MakesTheLastOneShownActiveWhenTheCurrentOneCannotTakeTheFocus) {
    fail("lstTable(1).SetFocus");
    bind();
    EXPECT_EQ(Back::mActiveTableIndex(control()), 2);
    EXPECT_EQ(told(), Texts{});
}

TEST_F(ShowingTablesOnAToolkit, KeepsTheSlotOfATableThatCouldNotBeMade) {
    fail("makeTabulet");
    control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(model));
    EXPECT_EQ(told(), Texts{failedIn("SetZandor")});
    EXPECT_FALSE(slotIsFree(1));
    EXPECT_FALSE(stage->exists("lstTable(1)"));
}

TEST_F(ShowingTablesOnAToolkit, ShowsTheNextModelBesideASlotThatHasNoTable) {
    fail("makeTabulet");
    bind();
    stage->boxes.clear();
    const auto next = library.newModel();
    const auto left = next->table(u"C", {u"ID"});
    const auto right = next->table(u"D", {u"ID"});
    next->join(left, u"ID", right, u"ID");
    next->definition(left, u"ID");
    control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(next));
    EXPECT_EQ(told(), Texts{});
    EXPECT_TRUE(stage->look("linJoin(1)").visible);
    EXPECT_EQ(stage->cell(0, 1), u"ID");
}

using FindingOnAToolkit = CanvasOnAToolkit;

TEST_F(FindingOnAToolkit, ATableReportsUnderItsName) {
    bind();
    fail("lstTable(1).Text");
    Ref<Tabulet> found = element(1);
    Back::FindTable(control(), u"B", found);
    EXPECT_EQ(told(), Texts{failedIn("FindTable")});
    EXPECT_FALSE(found);
}

TEST_F(FindingOnAToolkit, AColumnReportsUnderItsName) {
    bind();
    fail("lstTable(1).ColumnItem.Text");
    Ref<ColumnItem> found;
    Back::FindColumn(control(), element(1), u"ID", found);
    EXPECT_EQ(told(), Texts{failedIn("FindColumn")});
    EXPECT_FALSE(found);
}

using RemovingOnAToolkit = CanvasOnAToolkit;

TEST_F(RemovingOnAToolkit, StopsAtAGridThatCannotBeReadAndKeepsTheNameItSet) {
    bind();
    fail("sprColumn.TextMatrix", 3);
    Back::sprColumn(control())->TextMatrix(0, 1, u"A.ID");
    EXPECT_FALSE(remove(1));
    EXPECT_EQ(told(), Texts{failedIn("RemoveTable")});
    EXPECT_EQ(control().DeletedTable, u"A");
    EXPECT_EQ(stage->cell(0, 1), u"") << "the column before the failure is gone";
    EXPECT_TRUE(stage->exists("lstTable(1)"));
    EXPECT_FALSE(slotIsFree(1));
}

TEST_F(RemovingOnAToolkit, GoesOnWhenTheElementCannotTerminate) {
    bind();
    fail("lstTable(1).Terminate");
    EXPECT_TRUE(remove(1));
    EXPECT_EQ(told(), Texts{failedIn("TerminateTable")});
    EXPECT_FALSE(stage->exists("lstTable(1)"));
    EXPECT_TRUE(slotIsFree(1));
}

TEST_F(RemovingOnAToolkit, StopsBeforeAnythingWhenTheNameCannotBeRead) {
    bind();
    fail("lstTable(1).Text");
    EXPECT_FALSE(remove(1));
    EXPECT_EQ(told(), Texts{failedIn("RemoveTable")});
    EXPECT_EQ(control().DeletedTable, u"  ");
}

using ArrangingOnAToolkit = CanvasOnAToolkit;

TEST_F(ArrangingOnAToolkit, LeavesTheHorizontalStepWhenTheVerticalOneFails) {
    bind();
    control().VertMaxScrollPos(100);
    control().HorizMaxScrollPos(200);
    Back::OrganizeTables(control());
    control().VertMaxScrollPos(1000);
    control().HorizMaxScrollPos(2000);
    fail("hsbTable.Max");
    Back::OrganizeTables(control());
    EXPECT_EQ(told(), Texts{failedIn("OrganizeTables")});
    EXPECT_EQ(stage->look("vsbTable").largeChange, 200);
    EXPECT_EQ(stage->look("hsbTable").largeChange, 40);
}

TEST_F(ArrangingOnAToolkit, AMovedTableReportsUnderItsName) {
    bind();
    fail("lstTable(1).bounds");
    Back::lstTable_Moved(control(), std::int16_t{1});
    EXPECT_EQ(told(), Texts{failedIn("lstTable_Moved")});
    EXPECT_EQ(events(), Texts{});
}

TEST_F(ArrangingOnAToolkit, AResizedTableReportsUnderItsName) {
    bind();
    fail("lstTable(1).bounds");
    Back::lstTable_Resized(control(), std::int16_t{1});
    EXPECT_EQ(told(), Texts{failedIn("lstTable_Resized")});
}

TEST_F(ArrangingOnAToolkit, AHorizontalScrollReportsUnderItsName) {
    bind();
    fail("fraTable.setBounds");
    stage->scrollBarTo("hsbTable", 300);
    EXPECT_EQ(told(), Texts{failedIn("hsbTable_Change")});
    EXPECT_EQ(boundsOf("fraTable").Left, 0);
}

TEST_F(ArrangingOnAToolkit, AVerticalScrollReportsUnderItsName) {
    bind();
    fail("fraTable.setBounds");
    stage->scrollBarTo("vsbTable", 300);
    EXPECT_EQ(told(), Texts{failedIn("vsbTable_Change")});
    EXPECT_EQ(boundsOf("fraTable").Top, 0);
}

TEST_F(ArrangingOnAToolkit, TheWayHomeReportsUnderItsNameAndKeepsTheHalfGone) {
    bind();
    stage->scrollBarTo("hsbTable", 300);
    stage->scrollBarTo("vsbTable", 600);
    fail("hsbTable.Value=");
    Back::cmdHome_Click(control());
    EXPECT_EQ(told(), Texts{failedIn("cmdHome_Click")});
    EXPECT_EQ(boundsOf("fraTable").Top, 0);
    EXPECT_EQ(boundsOf("fraTable").Left, -300);
}

TEST_F(ArrangingOnAToolkit, APressOnAJoinReportsUnderItsNameAndRemembersTheJoin) {
    model->join(first, u"ID", second, u"ID");
    bind();
    fail("linJoin(1).BorderWidth");
    const auto line = stage->look("linJoin(1)");
    stage->pressCanvas(1, (line.X1 + line.X2) / 2, (line.Y1 + line.Y2) / 2);
    EXPECT_EQ(told(), Texts{failedIn("fraTable_MouseDown")});
    EXPECT_EQ(Back::mLastJoin(control())->JoinLineIndex(), 1);
}

using DraggingOnAToolkit = CanvasOnAToolkit;

TEST_F(DraggingOnAToolkit, TheSourceOfTheDragIsTheTableItself) {
    bind();
    stage->selectEntries(1, {1});
    stage->pressEntry(1, 1, 1);
    stage->moveOverEntry(1, 1, 1);
    EXPECT_EQ(toolkit().dragged(), &list(1));
}

TEST_F(DraggingOnAToolkit, KeepsTheRecordsOfADragThatCannotStart) {
    bind();
    stage->selectEntries(1, {1});
    fail("lstTable(1).Drag");
    Back::lstTable_ColumnMouseMove(control(), std::int16_t{1}, Ref<ColumnItem>(), std::int16_t{1},
                                   std::int16_t{0});
    EXPECT_EQ(told(), Texts{failedIn("lstTable_ColumnMouseMove")});
    EXPECT_EQ(Back::mDragColumns(control()).size(), 1U);
    EXPECT_EQ(Back::mDragTableIndex(control()), 1);
}

TEST_F(DraggingOnAToolkit, RepeatsTheStartAtEveryMove) {
    bind();
    stage->selectEntries(1, {1});
    toolkit().faults.remember(true);
    for (int i = 0; i < 3; ++i)
        Back::lstTable_ColumnMouseMove(control(), std::int16_t{1}, Ref<ColumnItem>(),
                                       std::int16_t{1}, std::int16_t{0});
    const auto& calls = toolkit().faults.calls();
    EXPECT_EQ(std::count(calls.begin(), calls.end(), "lstTable(1).Drag"), 3);
}

TEST_F(DraggingOnAToolkit, DrawsTheSelectionOfEveryEntryItIsOver) {
    bind();
    stage->selectEntries(1, {1});
    const auto at = entryPoint(1, 2);
    Back::mDragTableIndex(control()) = 2;
    Back::lstTable_DragOver(control(), std::int16_t{1}, nullptr, at.X, at.Y, std::int16_t{0});
    EXPECT_FALSE(list(1).entry(1).drawnSelected());
    EXPECT_TRUE(list(1).entry(2).drawnSelected());
}

TEST_F(DraggingOnAToolkit, StopsAtAnEntryThatCannotBeDrawn) {
    bind();
    stage->selectEntries(1, {1});
    const auto at = entryPoint(1, 2);
    fail("lstTable(1).ColumnItem.Refresh");
    Back::mDragTableIndex(control()) = 2;
    Back::lstTable_DragOver(control(), std::int16_t{1}, nullptr, at.X, at.Y, std::int16_t{0});
    EXPECT_EQ(told(), Texts{failedIn("lstTable_DragOver")});
    EXPECT_EQ(selectedIn(1), std::vector<String>{});
}

TEST_F(DraggingOnAToolkit, FollowsAMoveWithTheJoinsAtEveryStep) {
    model->join(first, u"ID", second, u"ID");
    bind();
    toolkit().faults.remember(true);
    stage->moveTable(1, 1500, 1500);
    const auto& calls = toolkit().faults.calls();
    EXPECT_EQ(std::count(calls.begin(), calls.end(), "linJoin(1).setEnds"), 3)
        << "half-way, at the end, and once the move is over";
    EXPECT_EQ(events(), Texts{"TableMoved"});
}

TEST_F(DraggingOnAToolkit, FollowsAMoveWithTheJoinsOfTheTableThatMovesAlone) {
    const auto third = table(u"C", {u"ID"}, 9000);
    model->join(first, u"ID", second, u"ID");
    model->join(second, u"ID", third, u"ID");
    bind();
    toolkit().faults.remember(true);
    Back::lstTable_Moving(control(), std::int16_t{1});
    const auto& calls = toolkit().faults.calls();
    EXPECT_EQ(std::count(calls.begin(), calls.end(), "linJoin(1).setEnds"), 1);
    EXPECT_EQ(std::count(calls.begin(), calls.end(), "linJoin(2).setEnds"), 0);
}

TEST_F(DraggingOnAToolkit, FollowsAMoveInSilenceWhateverAJoinFailsWith) {
    model->join(first, u"ID", second, u"ID");
    bind();
    toolkit().faults.failNext("linJoin(1).setEnds", std::bad_alloc());
    Back::lstTable_Moving(control(), std::int16_t{1});
    EXPECT_FALSE(toolkit().faults.isArmed("linJoin(1).setEnds"));
    EXPECT_EQ(told(), Texts{});
}

} // namespace
