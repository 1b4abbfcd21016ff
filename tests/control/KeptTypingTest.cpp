#include "GridStage.h"

using namespace zandor;

namespace gridstage {

/// Two output columns, ID with a criterion and TOTAL.
class TypingInACell : public GridTest {
protected:
    TypingInACell() {
        first = model->definition(orders, u"ID");
        first->AddCriterium(u"> 1", u"4");
        second = model->definition(orders, u"TOTAL");
        bind();
        stage->comforts().setFlags({.KeepsTyping = true});
    }

    static constexpr std::int16_t tab = 9, end = 35, home = 36, keyLeft = 37, keyUp = 38,
                                  keyRight = 39, keyDown = 40, shift = 1;

    void typeOver(std::int32_t row, std::int32_t col, const String& text) {
        press(left, row, col);
        stage->type("txtValue", text);
    }

    void standOn(std::int32_t row, std::int32_t col) {
        grid().Row(row);
        grid().Col(col);
    }

    using Cell = std::pair<std::int32_t, std::int32_t>;
    Cell current() { return {grid().Row(), grid().Col()}; }

    bool anyOpen() { return shows("fraSortOrder") || shows("fraVisibility") || shows("fraValue"); }

    void expectKept(const String& text) {
        EXPECT_EQ(stage->cell(criteriaRow, 1), text);
        EXPECT_EQ(first->Criteria().Item(u"4")->Criterium(), text);
        EXPECT_EQ(events(), Names{"ColumnModified"});
        EXPECT_EQ(stage->boxes, Boxes{});
    }

    void expectNothing() {
        EXPECT_EQ(events(), Names{});
        EXPECT_EQ(stage->boxes, Boxes{});
    }

    Ref<fake::Definition> first, second;
};

/// A way to leave an open editor, and its name.
struct Way {
    const char* name;
    std::function<void(Stage&)> go;
};

class LeavingAnEditor : public TypingInACell, public testing::WithParamInterface<Way> {};

TEST_P(LeavingAnEditor, KeepsWhatWasTyped) {
    typeOver(criteriaRow, 1, u"> 20");
    forget();
    GetParam().go(*stage);
    EXPECT_FALSE(shows("fraValue")) << "or it is another one";
    std::erase_if(stage->raised, [](const auto& it) { return it.event == Event::Activate; });
    expectKept(u"> 20");
}

TEST_P(LeavingAnEditor, WritesNothingWhereNothingWasChanged) {
    typeOver(criteriaRow, 1, u"> 1");
    forget();
    GetParam().go(*stage);
    std::erase_if(stage->raised, [](const auto& it) { return it.event == Event::Activate; });
    expectNothing();
    EXPECT_EQ(stage->cell(criteriaRow, 1), u"> 1");
}

TEST_P(LeavingAnEditor, DropsWhatWasTypedWithoutTheComfort) {
    stage->comforts().setFlags({});
    typeOver(criteriaRow, 1, u"> 20");
    forget();
    if (std::string(GetParam().name) == "Enter") return; // that sets it either way
    GetParam().go(*stage);
    std::erase_if(stage->raised, [](const auto& it) { return it.event == Event::Activate; });
    expectNothing();
    EXPECT_EQ(stage->cell(criteriaRow, 1), u"> 1");
}

INSTANTIATE_TEST_SUITE_P(
    By, LeavingAnEditor,
    testing::Values(Way{"ClickOnAnotherCell", [](Stage& s) { s.pressCell(left, sortRow, 2); }},
                    Way{"ClickOnAField", [](Stage& s) { s.pressCell(left, fieldRow, 2); }},
                    Way{"RightClickInTheGrid",
                        [](Stage& s) {
                            s.pressCell(right, criteriaRow, 1);
                            s.releaseCell(right, criteriaRow, 1);
                        }},
                    Way{"ScrollingTheGrid", [](Stage& s) { s.scrollGrid(1, 3); }},
                    Way{"ClickOnTheCanvas", [](Stage& s) { s.pressCanvas(left, 4000, 4000); }},
                    Way{"ClickOnATable", [](Stage& s) { s.pressEntry(1, customer, left); }},
                    Way{"ScrollingTheCanvas", [](Stage& s) { s.scrollBarTo("hsbTable", 300); }},
                    Way{"HomeButton", [](Stage& s) { s.focus("cmdHome"); }},
                    Way{"FieldOfTheHost", [](Stage& s) { s.leaveControl(); }},
                    Way{"HostThatTakesItOver", [](Stage& s) { s.comforts().takeOver(); }},
                    Way{"Tab", [](Stage& s) { s.key("txtValue", 9, 1); }},
                    Way{"Enter", [](Stage& s) { s.key("txtValue", enter); }},
                    Way{"ArrowRight", [](Stage& s) { s.key("txtValue", 39); }},
                    Way{"ArrowUp", [](Stage& s) { s.key("txtValue", 38); }},
                    Way{"ArrowDown", [](Stage& s) { s.key("txtValue", 40); }},
                    Way{"PaintingAgain", [](Stage& s) { s.repaint(); }}),
    [](const auto& way) { return way.param.name; });

TEST_F(TypingInACell, IsDiscardedByEscape) {
    typeOver(criteriaRow, 1, u"> 20");
    stage->key("txtValue", escape);
    EXPECT_FALSE(anyOpen());
    stage->leaveControl();
    press(left, criteriaRow, 2);
    expectNothing();
    EXPECT_EQ(stage->cell(criteriaRow, 1), u"> 1");
}

TEST_F(TypingInACell, IsWrittenOnceByTheSetButton) {
    typeOver(criteriaRow, 1, u"> 20");
    stage->clickButton("cmdSetTextValue");
    press(left, criteriaRow, 2);
    expectKept(u"> 20");
}

TEST_F(TypingInACell, GoesOnToTheNextColumnByTabWithItsEditorOpen) {
    typeOver(synonymRow, 1, u"a");
    stage->key("txtValue", tab);
    EXPECT_EQ(current(), Cell(synonymRow, 2));
    ASSERT_TRUE(shows("fraValue"));
    EXPECT_TRUE(stage->look("txtValue").focused);
    stage->type("txtValue", u"b");
    stage->key("txtValue", tab, shift);
    EXPECT_EQ(current(), Cell(synonymRow, 1));
    EXPECT_EQ(first->synonym, u"a");
    EXPECT_EQ(second->synonym, u"b");
    EXPECT_EQ(events(), (Names{"ColumnModified", "ColumnModified"}));
}

TEST_F(TypingInACell, GoesOnToTheCellBelowByEnterWhichIsThenTypedIn) {
    typeOver(criteriaRow, 1, u"> 20");
    stage->key("txtValue", enter);
    EXPECT_EQ(current(), Cell(criteriaRow + 1, 1));
    EXPECT_FALSE(anyOpen());
    EXPECT_TRUE(stage->look("sprColumn").focused);
    stage->typeInGrid(u"x");
    EXPECT_EQ(stage->look("txtValue").text, u"x");
    EXPECT_TRUE(shows("fraValue"));
}

TEST_F(TypingInACell, BehindTheLastColumnEndsOnABlankOneWithoutAnEditor) {
    typeOver(synonymRow, 2, u"b");
    stage->key("txtValue", tab);
    EXPECT_EQ(current(), Cell(synonymRow, 3));
    EXPECT_FALSE(anyOpen());
}

TEST_F(TypingInACell, StaysInTheFirstColumnAndTheLastRow) {
    const std::int32_t last = grid().Rows() - 1;
    stage->scrollGrid(last, 1);
    typeOver(last, 1, u"z");
    stage->key("txtValue", tab, shift);
    EXPECT_EQ(current(), Cell(last, 1));
    EXPECT_FALSE(anyOpen());
    press(left, last, 1);
    stage->key("txtValue", enter);
    EXPECT_EQ(current(), Cell(last, 1));
    EXPECT_EQ(stage->cell(last, 1), u"z");
}

TEST_F(TypingInACell, KeepsTheArrowsWhileTheWholeTextIsSelected) {
    press(left, criteriaRow, 1);
    stage->key("txtValue", keyRight);
    EXPECT_EQ(current(), Cell(criteriaRow, 1));
}

TEST_F(TypingInACell, BeginsWithTheCharacterTyped) {
    standOn(criteriaRow, 1);
    stage->typeInGrid(u"<");
    EXPECT_TRUE(shows("fraValue"));
    EXPECT_TRUE(stage->look("txtValue").focused);
    EXPECT_EQ(stage->look("txtValue").text, u"<");
    stage->key("txtValue", enter);
    expectKept(u"<");
}

TEST_F(TypingInACell, BringsTheCellIntoViewFirst) {
    standOn(criteriaRow, 1);
    stage->scrollGrid(1, 20);
    stage->typeInGrid(u"<");
    EXPECT_TRUE(shows("fraValue"));
    EXPECT_EQ(grid().LeftCol(), 1);
}

TEST_F(TypingInACell, OpensNothingOverABlankColumn) {
    standOn(criteriaRow, 3);
    stage->typeInGrid(u"<");
    EXPECT_FALSE(anyOpen());
    expectNothing();
}

TEST_F(TypingInACell, OfABlankColumnIsDroppedWithoutABox) {
    typeOver(criteriaRow, 3, u"lost");
    press(left, criteriaRow, 1);
    expectNothing();
}

TEST_F(TypingInACell, SetsTheSortOrderByAChoice) {
    press(left, sortRow, 1);
    stage->pick("cobSortOrder", 2);
    EXPECT_EQ(first->sortOrder, 2);
    EXPECT_EQ(stage->cell(sortRow, 1), u"Descending");
    EXPECT_EQ(events(), Names{"ColumnModified"});
    EXPECT_FALSE(anyOpen());
    EXPECT_TRUE(stage->look("sprColumn").focused);
}

TEST_F(TypingInACell, DropsAListDownAtWhatTheCellHolds) {
    first->sortOrder = 2;
    second->visible = false;
    bind();
    press(left, sortRow, 1);
    stage->releaseCell(left, sortRow, 1);
    EXPECT_TRUE(stage->look("cobSortOrder").dropped);
    EXPECT_EQ(stage->look("cobSortOrder").listIndex, 2);
    standOn(visibleRow, 2);
    stage->editCell();
    EXPECT_FALSE(stage->look("cobSortOrder").dropped);
    EXPECT_TRUE(stage->look("cobVisibility").dropped);
    EXPECT_EQ(stage->look("cobVisibility").listIndex, 1);
}

TEST_F(TypingInACell, LeavesListsUpWithoutTheComfort) {
    stage->comforts().setFlags({});
    press(left, sortRow, 1);
    EXPECT_TRUE(shows("fraSortOrder"));
    EXPECT_FALSE(stage->look("cobSortOrder").dropped);
}

TEST_F(TypingInACell, StaysOverItsCellWhateverTheSizeOfTheControl) {
    for (const std::int32_t row : {sortRow, criteriaRow}) {
        press(left, row, 1);
        if (row == criteriaRow) stage->type("txtValue", u"> 20");
        const std::string frame = row == criteriaRow ? "fraValue" : "fraSortOrder";
        for (const float height : {12000.0F, 6000.0F, 9000.0F}) {
            stage->resizeControl(12000, height);
            ASSERT_TRUE(shows(frame)) << row << ' ' << height;
            const platform::Bounds editor = stage->look(frame).bounds;
            const float middle = grid().Top() + grid().CellTop() + grid().CellHeight() / 2;
            EXPECT_NEAR(editor.Top + editor.Height / 2, middle, 15) << row << ' ' << height;
        }
    }
    EXPECT_EQ(events(), Names{});
    stage->leaveControl();
    expectKept(u"> 20");
}

TEST_F(TypingInACell, StaysWhereItWasWithoutTheComfortUntilTheControlIsPainted) {
    stage->comforts().setFlags({});
    press(left, criteriaRow, 1);
    stage->resizeControl(12000, 12000);
    stage->repaint();
    EXPECT_FALSE(anyOpen());
}

TEST_F(TypingInACell, WritesNoChoiceOfWhatIsSoAlready) {
    press(left, sortRow, 1);
    stage->pick("cobSortOrder", 0);
    EXPECT_FALSE(anyOpen());
    expectNothing();
    EXPECT_EQ(stage->cell(sortRow, 1), u"");
}

TEST_F(TypingInACell, SetsASortOrderThatWasWalkedToWhenItIsLeft) {
    press(left, sortRow, 1);
    stage->choose("cobSortOrder", 1);
    EXPECT_EQ(events(), Names{});
    stage->key("cobSortOrder", tab);
    EXPECT_EQ(first->sortOrder, 1);
    EXPECT_EQ(events(), Names{"ColumnModified"});
    EXPECT_EQ(current(), Cell(sortRow, 2));
    EXPECT_TRUE(shows("fraSortOrder"));
    EXPECT_EQ(stage->look("cobSortOrder").listIndex, 0) << "the next column's own";
}

TEST_F(TypingInACell, ShowsAnInvisibleColumnAsSuchAndSetsItByAChoice) {
    second->visible = false;
    bind();
    press(left, visibleRow, 2);
    EXPECT_EQ(stage->look("cobVisibility").listIndex, 1);
    stage->pick("cobVisibility", 0);
    EXPECT_TRUE(second->visible);
    EXPECT_EQ(stage->cell(visibleRow, 2), u"Visible");
    EXPECT_EQ(events(), Names{"ColumnModified"});
}

TEST_F(TypingInACell, TogglesTheVisibilityBySpace) {
    standOn(visibleRow, 2);
    stage->typeInGrid(u" ");
    EXPECT_FALSE(second->visible);
    EXPECT_EQ(stage->cell(visibleRow, 2), u"Not Visible");
    stage->typeInGrid(u" ");
    EXPECT_TRUE(second->visible);
    EXPECT_EQ(stage->cell(visibleRow, 2), u"Visible");
    EXPECT_EQ(events(), (Names{"ColumnModified", "ColumnModified"}));
    EXPECT_FALSE(anyOpen());
}

TEST_F(TypingInACell, GoesWithItsColumnWhereverThatGoes) {
    typeOver(criteriaRow, 2, u"> 20");
    grid().ColPosition(2, 1);
    press(left, criteriaRow, 3);
    EXPECT_EQ(second->Criteria().Item(u"4")->Criterium(), u"> 20");
    EXPECT_EQ(stage->cell(criteriaRow, 1), u"> 20");
}

TEST_F(TypingInACell, IsKeptWhenADropShiftsItsColumn) {
    typeOver(criteriaRow, 1, u"> 20");
    stage->dragToCell(1, total, synonymRow, 1);
    EXPECT_EQ(stage->cell(criteriaRow, 2), u"> 20");
    EXPECT_EQ(first->criterion(u"4"), u"> 20");
    EXPECT_FALSE(anyOpen());
}

TEST_F(TypingInACell, IsLostWithItsColumn) {
    typeOver(criteriaRow, 1, u"> 20");
    model->definitions.items.Remove(first->key);
    Backstage::RemoveColumn(control(), 1);
    stage->comforts().takeOver();
    EXPECT_FALSE(anyOpen());
    expectNothing();
}

TEST_F(TypingInACell, NeverGoesIntoAnotherModel) {
    typeOver(criteriaRow, 1, u"> 20");
    const auto other = library.newModel();
    const auto table = other->table(u"OTHERS", {u"*", u"ID"});
    const auto definition = other->definition(table, u"ID");
    control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(other));
    forget();
    press(left, criteriaRow, 3);
    expectNothing();
    EXPECT_FALSE(definition->HasCriterium(u"4"));
}

TEST_F(TypingInACell, IsReportedOnceWhereTheModelRefusesIt) {
    typeOver(criteriaRow, 1, u"> 20");
    model->calls->failNext("ZDCriterium.Criterium=", refusal());
    press(left, criteriaRow, 2);
    EXPECT_EQ(stage->boxes, Boxes{report(u"cmdSetTextValue_Click", refusal())});
    EXPECT_EQ(events(), Names{});
}

TEST_F(TypingInACell, CanBeWrittenIntoACopyOfTheModelAndGoesOn) {
    const auto copy = library.newModel();
    const auto definition = copy->definition(copy->table(u"ORDERS", {u"*", u"ID"}), u"ID");
    ASSERT_EQ(definition->Key(), first->Key());
    EXPECT_FALSE(stage->comforts().writeTyping(copy)) << "no editor is open";
    press(left, criteriaRow, 1);
    EXPECT_FALSE(stage->comforts().writeTyping(copy)) << "it says what the model says";
    stage->type("txtValue", u"> 20");
    forget();
    EXPECT_TRUE(stage->comforts().writeTyping(copy));
    EXPECT_EQ(definition->Criteria().Item(u"4")->Criterium(), u"> 20");
    EXPECT_EQ(first->Criteria().Item(u"4")->Criterium(), u"> 1");
    EXPECT_TRUE(shows("fraValue"));
    expectNothing();
}

} // namespace gridstage
