#include "GridStage.h"

namespace gridstage {

namespace {

/// A join, two output columns, every comfort and a user who is only to look.
class ADrawingThatIsOnlyRead : public GridTest {
protected:
    ADrawingThatIsOnlyRead() {
        orders->place(1000, 500, 2000, 2000);
        customers->place(5000, 1500, 2000, 2000);
        model->join(orders, u"CUSTOMER", customers, u"ID");
        model->definition(customers, u"NAME", {u"'A'"});
        model->definition(orders, u"TOTAL");
        stage->comforts().setFlags(zandor::comforts::Flags::all());
        control().JoinModifyDisabled(1);
        control().ReadOnly(true);
        bind();
        changes.clear();
        library.calls->onPass = [this](const std::string& call) {
            if (call.ends_with("=") || call.find("Add") != std::string::npos ||
                call.find("Remove") != std::string::npos ||
                call.find("Delete") != std::string::npos)
                changes.push_back(call);
        };
    }
    ~ADrawingThatIsOnlyRead() override { library.calls->onPass = nullptr; }

    bool editing() {
        return shows("fraValue") || shows("fraSortOrder") || shows("fraVisibility") ||
               (stage->exists("lstFields") && shows("lstFields"));
    }
    void expectUnchanged() {
        EXPECT_EQ(changes, Names{});
        EXPECT_EQ(stage->boxes, Boxes{});
        EXPECT_FALSE(editing());
    }

    /// The entries of the menu seen last that can be chosen.
    Names onOffer() {
        std::erase_if(menu, [](const Stage::Entry& entry) { return !entry.visible; });
        return enabled();
    }

    Names changes; ///< what was called of the model that writes
};

TEST_F(ADrawingThatIsOnlyRead, OpensNoEditor) {
    for (const std::int32_t row : {fieldRow, synonymRow, sortRow, visibleRow, criteriaRow})
        for (const std::int32_t col : {1, 2, 3}) {
            press(left, row, col);
            grid().Row(row);
            grid().Col(col);
            stage->editCell();
            stage->typeInGrid(u" ");
            stage->typeInGrid(u"x");
            EXPECT_FALSE(editing()) << row << ", " << col;
        }
    stage->clickField(1);
    stage->clickField(3);
    expectUnchanged();
}

TEST_F(ADrawingThatIsOnlyRead, KeepsItsTablesWhereTheyAre) {
    const auto before = stage->look("lstTable(1)").bounds;
    stage->moveTable(1, 3000, 900);
    stage->resizeTable(1, 2700, 2700);
    EXPECT_EQ(stage->look("lstTable(1)").bounds, before);
    expectUnchanged();
}

TEST_F(ADrawingThatIsOnlyRead, KeepsItsTables) {
    stage->closeTable(1);
    EXPECT_TRUE(shows("lstTable(1)"));
    Backstage::lstTable_CloseClick(control(), 1);
    EXPECT_TRUE(shows("lstTable(1)"));
    expectUnchanged();
}

TEST_F(ADrawingThatIsOnlyRead, TakesNoDragAndNoDoubleClick) {
    stage->selectEntries(1, {id});
    changes.clear();
    stage->doubleClickEntry(1, id);
    EXPECT_EQ(fields(3), (Texts{u"NAME", u"TOTAL", u""}));
    stage->pressEntry(1, id, left);
    changes.clear(); // of the selection
    stage->moveOverEntry(1, customer, left);
    EXPECT_TRUE(Backstage::mDragColumns(control()).empty());
    EXPECT_FALSE(stage->exists("linJoin(2)"));
    expectUnchanged();
}

TEST_F(ADrawingThatIsOnlyRead, OffersOnlyWhatChangesNothing) {
    copy(1, {id});
    changes.clear();
    menuOverEntry(2, name);
    EXPECT_EQ(onOffer(), Names{"mnuTableDefinitionCopy"});
    menuOverTheLine();
    EXPECT_EQ(onOffer(), Names{"mnuJoinShowDefinition"});
    menuOverCell(synonymRow, 1);
    EXPECT_EQ(onOffer(), Names{});
}

TEST_F(ADrawingThatIsOnlyRead, ShowsTheDefinitionOfAJoin) {
    int shown = 0;
    stage->onDialog = [&] {
        ++shown;
        EXPECT_FALSE(stage->look("cboJoinType").enabled);
        EXPECT_FALSE(stage->look("cboJoinCompareOperator").enabled);
        EXPECT_FALSE(stage->look("cmdOk").enabled);
        stage->clickButton("cmdCancel");
    };
    menuOverTheLine("mnuJoinShowDefinition");
    EXPECT_EQ(shown, 1);
    expectUnchanged();
}

TEST_F(ADrawingThatIsOnlyRead, KeepsAJoinWhoseTypeTheDialogDoesNotOffer) {
    control().ReadOnly(false);
    model->joinAt(1).joinType = 1;
    control().UseJoinTypeLeft(false);
    control().UseJoinTypeRight(false);
    control().UseJoinTypeBoth(false);
    control().ReadOnly(true);
    bind();
    stage->onDialog = [&] {
        stage->clickButton("cmdOk");
        stage->clickButton("cmdCancel");
    };
    menuOverTheLine("mnuJoinShowDefinition");
    EXPECT_EQ(model->joinAt(1).joinType, 1);
}

TEST_F(ADrawingThatIsOnlyRead, KeepsTheOrderOfItsColumns) {
    stage->dragField(2, 1);
    grid().Col(2);
    stage->moveCurrentColumn(-1);
    EXPECT_FALSE(control().MoveColumn(2, 1));
    EXPECT_EQ(fields(2), (Texts{u"NAME", u"TOTAL"}));
    expectUnchanged();
}

TEST_F(ADrawingThatIsOnlyRead, ScrollsSelectsAndCopies) {
    stage->scrollBarTo("hsbTable", 300);
    EXPECT_EQ(control().VisibleFrameLeft(), 300);
    stage->selectEntries(1, {total});
    stage->pressEntry(1, total, left);
    EXPECT_EQ(orders->column(u"TOTAL").activatedValue, 1);
    copy(1, {total});
    ASSERT_EQ(Backstage::mDragColumns(control()).size(), 1U);
    EXPECT_EQ(Backstage::mDragColumns(control())[0]->Column()->Text(), u"TOTAL");
}

TEST_F(ADrawingThatIsOnlyRead, ShowsWhatItsHostChanges) {
    model->table(u"NEW", {u"ID"})->place(3000, 3000, 1500, 1500);
    control().ShowAnew();
    const auto before = stage->look("lstTable(3)").bounds;
    stage->moveTable(3, 600, 600);
    EXPECT_EQ(stage->look("lstTable(3)").bounds, before);
    control().SetCurrentTable(u"CUSTOMERS");
    control().Terminate();
    EXPECT_FALSE(stage->exists("lstTable(1)"));
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(ADrawingThatIsOnlyRead, TakesNothingFromAMenuThatWasOpenBefore) {
    control().ReadOnly(false);
    copy(1, {total});
    stage->selectEntries(2, {name});
    changes.clear();
    for (const std::string entry : {"mnuTableDefinitionPaste", "mnuTableDefinitionDelete"}) {
        stage->onMenu = [&](const std::vector<Stage::Entry>&) {
            control().ReadOnly(true);
            return zandor::platform::fromUtf8(entry);
        };
        stage->pressEntry(2, name, right);
        changes.clear(); // of the selection
        stage->releaseEntry(2, name, right);
        expectUnchanged();
        EXPECT_FALSE(stage->exists("linJoin(2)")) << entry;
        control().ReadOnly(false);
    }
}

TEST_F(ADrawingThatIsOnlyRead, IsWorkedInAgainOnceItMay) {
    control().ReadOnly(false);
    stage->moveTable(1, 3000, 900);
    EXPECT_NEAR(orders->left, 3000, 15);
    press(left, criteriaRow, 1);
    EXPECT_TRUE(shows("fraValue"));
    stage->closeTable(2);
    EXPECT_EQ(model->tableCount(), 1);
    EXPECT_EQ(stage->boxes, Boxes{});
}

/// What the user holds when the host takes the drawing away from him.
class ADragThatTheHostEnds : public ADrawingThatIsOnlyRead,
                             public testing::WithParamInterface<bool> {
protected:
    ADragThatTheHostEnds() {
        stage->comforts().setFlags(GetParam() ? zandor::comforts::Flags::all()
                                              : zandor::comforts::Flags());
        control().ReadOnly(false);
        stage->selectEntries(1, {id});
        forget();
        changes.clear();
        stage->onHeld = [this] {
            ++held;
            control().ReadOnly(true);
            changes.clear(); // what a press has selected
        };
    }
    ~ADragThatTheHostEnds() override {
        EXPECT_EQ(held, 1);
        EXPECT_EQ(stage->raised.size(), 0U) << "nothing has been done that an event would tell of";
        expectUnchanged();
        stage->onHeld = nullptr;
        control().ReadOnly(false);
    }

    int held = 0;
};

TEST_P(ADragThatTheHostEnds, LeavesTheTableWhereItWas) {
    const auto before = stage->look("lstTable(1)").bounds;
    const auto line = stage->look("linJoin(1)");
    stage->moveTable(1, 3000, 900);
    EXPECT_EQ(stage->look("lstTable(1)").bounds, before);
    EXPECT_EQ(stage->look("linJoin(1)").X1, line.X1);
    EXPECT_EQ(stage->look("linJoin(1)").Y1, line.Y1);
}

TEST_P(ADragThatTheHostEnds, LeavesTheTableItsSize) {
    const auto before = stage->look("lstTable(1)").bounds;
    stage->resizeTable(1, 2700, 2700);
    EXPECT_EQ(stage->look("lstTable(1)").bounds, before);
}

TEST_P(ADragThatTheHostEnds, TakesNothingBackThatWasDoneBefore) {
    stage->onHeld = nullptr;
    stage->moveTable(1, 3000, 900);
    const auto moved = stage->look("lstTable(1)").bounds;
    control().ReadOnly(true);
    EXPECT_EQ(stage->look("lstTable(1)").bounds, moved);
    control().ReadOnly(false);
    stage->moveTable(1, moved.Left + 300, moved.Top);
    EXPECT_NEAR(orders->left, moved.Left + 300, 15) << "it is moved again from where it is";
    held = 1;
    changes.clear();
    forget();
}

TEST_P(ADragThatTheHostEnds, MakesNoJoin) {
    stage->selectEntries(2, {name});
    stage->dragToEntry(1, id, 2, id);
    EXPECT_FALSE(stage->exists("linJoin(2)"));
    if (GetParam()) {
        EXPECT_EQ(stage->look("lstTable(2)").selected, Texts{u"NAME"})
            << "what was selected under the drag";
    }
}

TEST_P(ADragThatTheHostEnds, MakesNoColumn) {
    stage->dragToCell(1, id, fieldRow, 3);
    EXPECT_EQ(fields(3), (Texts{u"NAME", u"TOTAL", u""}));
}

TEST_P(ADragThatTheHostEnds, MakesNoColumnBeyondATableEither) {
    stage->selectEntries(2, {name});
    stage->dragAcross(1, id, 2, id, fieldRow, 3);
    EXPECT_EQ(fields(3), (Texts{u"NAME", u"TOTAL", u""}));
    if (GetParam()) {
        EXPECT_EQ(stage->look("lstTable(2)").selected, Texts{u"NAME"});
    }
}

TEST_P(ADragThatTheHostEnds, LeavesTheColumnsTheirOrder) {
    stage->dragField(2, 1);
    EXPECT_EQ(fields(2), (Texts{u"NAME", u"TOTAL"}));
}

TEST_P(ADragThatTheHostEnds, IsFollowedByOneThatCounts) {
    stage->dragToEntry(1, id, 2, id);
    expectUnchanged();
    stage->onHeld = nullptr;
    control().ReadOnly(false);
    stage->dragToEntry(1, id, 2, id);
    EXPECT_TRUE(stage->exists("linJoin(2)"));
    changes.clear();
    forget();
}

INSTANTIATE_TEST_SUITE_P(WithoutAndWithComforts, ADragThatTheHostEnds, testing::Bool());

TEST_F(ADrawingThatIsOnlyRead, KeepsWhatWasBeingTypedBefore) {
    control().ReadOnly(false);
    press(left, criteriaRow, 1);
    stage->type("txtValue", u"'B'");
    control().ReadOnly(true);
    EXPECT_EQ(model->definitionAt(1).criterion(u"4"), u"'B'");
    EXPECT_FALSE(editing());
}

} // namespace

} // namespace gridstage
