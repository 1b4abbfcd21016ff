#include "control/OrderedModel.h"

namespace gridstage {

namespace {

constexpr std::int16_t shift = 1, ctrl = 2, tab = 9, keyLeft = 37, keyUp = 38, keyDown = 40;

/// ID with a synonym and a criterion, and TOTAL; every comfort that has to do with cells.
class AComfort : public GridTest {
protected:
    AComfort() {
        first = model->definition(orders, u"ID", {u"> 1"});
        first->synonym = u"Number";
        second = model->definition(orders, u"TOTAL");
        bind();
        stage->comforts().setFlags({.AddsOnDoubleClick = true,
                                    .KeepsTyping = true,
                                    .MarksOutput = true,
                                    .OffersFields = true,
                                    .MovesColumns = true});
    }

    void typeOver(std::int32_t row, std::int32_t col, const String& text) {
        press(left, row, col);
        stage->type("txtValue", text);
        forget();
    }
    void standOn(std::int32_t row, std::int32_t col) {
        grid().Row(row);
        grid().Col(col);
    }
    bool anyOpen() { return shows("fraSortOrder") || shows("fraVisibility") || shows("fraValue"); }
    bool offers() { return stage->exists("lstFields") && shows("lstFields"); }
    using Cell = std::pair<std::int32_t, std::int32_t>;
    Cell current() { return {grid().Row(), grid().Col()}; }

    Ref<fake::Definition> first, second;
};

TEST_F(AComfort, IsNoneOnceTheControlHasEnded) {
    control().End();
    EXPECT_FALSE(stage->comforts().entryDoubleClicked(1, id));
    EXPECT_FALSE(stage->comforts().fieldClicked(3));
}

TEST_F(AComfort, TakesAMarkAwayWhenADeletedTableTakesTheColumnAlong) {
    class Dropping final : public fake::Model {
    public:
        using Model::Model;
        void DeleteTable(const Ref<TalvikZandorLib::ZDTable>& table) override {
            Model::DeleteTable(table);
            definitions.items.Remove(u"x1");
        }
    };
    model = zandor::platform::makeRef<Dropping>(library.calls);
    orders = addOrders(*model);
    addCustomers(*model);
    model->definition(orders, u"ID");
    bind();
    ASSERT_EQ(stage->look("lstTable(1)").output, Texts{u"ID"});
    stage->closeTable(2);
    EXPECT_EQ(stage->look("lstTable(1)").output, Texts{});
}

TEST_F(AComfort, KeepsATextInTheColumnThatItWasTypedIntoOfTwoWithOneDefinition) {
    grid().TextMatrix(fieldRow, 3, u"ID");
    grid().ColData(3, 1);
    typeOver(criteriaRow, 3, u"> 3");
    stage->repaint();
    EXPECT_EQ(stage->cell(criteriaRow, 3), u"> 3");
    EXPECT_EQ(stage->cell(criteriaRow, 1), u"> 1");
}

TEST_F(AComfort, KeepsThatASynonymWasTakenAway) {
    typeOver(synonymRow, 1, u"");
    stage->repaint();
    EXPECT_EQ(first->synonym, u"");
    EXPECT_EQ(events(), Names{"ColumnModified"});
}

TEST_F(AComfort, LeavesWhatTheHostChangedUnderAnEditorThatNobodyTypedInto) {
    press(left, criteriaRow, 1);
    first->Criteria().Item(u"4")->Criterium(u"> 5");
    forget();
    stage->repaint();
    EXPECT_EQ(first->criterion(u"4"), u"> 5");
    EXPECT_EQ(events(), Names{});
}

TEST_F(AComfort, LeavesTheCurrentCellWhereItIsByTheTimeATextIsKept) {
    typeOver(criteriaRow, 1, u"> 7");
    standOn(synonymRow, 2);
    stage->repaint();
    EXPECT_EQ(first->criterion(u"4"), u"> 7");
    EXPECT_EQ(current(), Cell(synonymRow, 2));
}

TEST_F(AComfort, KeepsNoTextForAnotherModelThatWasBoundUnderTheEditor) {
    // Without a table nothing that goes takes the focus, and the editor with it.
    model->tables.items = {};
    bind();
    const auto other = library.newModel();
    const auto theirs = other->definition(orders, u"ID");
    typeOver(criteriaRow, 1, u"> 9");
    control().P_SET_Zandor(other);
    stage->repaint();
    EXPECT_EQ(theirs->criteria.items.Count(), 0);
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AComfort, ClosesTheListOfFieldsWhenTheControlIsLaidOutAnew) {
    stage->clickField(3);
    ASSERT_TRUE(offers());
    stage->resizeControl(11000, 8000);
    EXPECT_FALSE(offers());
}

TEST_F(AComfort, OpensNoListForATextThatIsBeingComposed) {
    for (const std::int32_t row : {sortRow, visibleRow}) {
        standOn(row, 1);
        stage->typeInGrid(u"");
        EXPECT_FALSE(anyOpen()) << row;
    }
    standOn(criteriaRow, 1);
    stage->typeInGrid(u"");
    EXPECT_TRUE(shows("fraValue"));
}

TEST_F(AComfort, StaysInTheEditorForKeysThatAreNotItsOwn) {
    press(left, criteriaRow, 1);
    stage->key("txtValue", tab, ctrl);
    EXPECT_TRUE(shows("fraValue"));
    stage->key("txtValue", keyDown, shift);
    EXPECT_TRUE(shows("fraValue"));
    EXPECT_EQ(current(), Cell(criteriaRow, 1));
}

TEST_F(AComfort, LeavesATextByTheArrowsAtItsEndsOnly) {
    auto& comforts = stage->comforts();
    press(left, criteriaRow, 2);
    EXPECT_FALSE(comforts.editorKey(keyLeft, 0, false, true));
    EXPECT_TRUE(shows("fraValue"));
    EXPECT_TRUE(comforts.editorKey(keyLeft, 0, true, false));
    EXPECT_EQ(current(), Cell(criteriaRow, 1));
}

TEST_F(AComfort, LeavesTheArrowsUpAndDownToAList) {
    for (const std::int32_t row : {sortRow, visibleRow}) {
        press(left, row, 1);
        EXPECT_FALSE(stage->comforts().editorKey(keyUp, 0, true, true)) << row;
        EXPECT_FALSE(stage->comforts().editorKey(keyDown, 0, true, true)) << row;
        EXPECT_EQ(current(), Cell(row, 1));
    }
}

TEST_F(AComfort, DoesNotGoUpFromASynonymToTheField) {
    press(left, synonymRow, 1);
    EXPECT_TRUE(stage->comforts().editorKey(keyUp, 0, true, true));
    EXPECT_EQ(current(), Cell(synonymRow, 1));
}

TEST_F(AComfort, AddsNothingToAFullGrid) {
    const std::int32_t last = grid().Cols() - 1;
    grid().TextMatrix(fieldRow, last, u"ORDERS.LAST");
    forget();
    stage->doubleClickEntry(1, customer);
    EXPECT_EQ(model->definitionCount(), 2);
    EXPECT_EQ(stage->cell(fieldRow, last), u"ORDERS.LAST");
    EXPECT_EQ(stage->boxes, Boxes{});
    for (const std::string& event : events()) EXPECT_NE(event, "ColumnCreated");
}

TEST_F(AComfort, LeavesTheCurrentCellToTheRightButton) {
    standOn(synonymRow, 1);
    menuOverCell(criteriaRow, 3);
    EXPECT_EQ(current(), Cell(synonymRow, 1));
    press(left, criteriaRow, 3);
    EXPECT_EQ(current(), Cell(criteriaRow, 3));
}

TEST_F(AComfort, GivesNoFieldOfATableThatWentWhileTheListStoodOpen) {
    stage->clickField(3);
    ASSERT_TRUE(offers());
    Backstage::RemoveTable(control(), 2);
    forget();
    stage->pickField(u"CUSTOMERS.NAME");
    EXPECT_EQ(fields(3), (Texts{u"ID", u"TOTAL", u""}));
    EXPECT_EQ(model->definitionCount(), 2);
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AComfort, GivesNoFieldToAnotherModelThanTheListWasOpenedOver) {
    stage->clickField(3);
    ASSERT_TRUE(offers());
    const auto other = library.newModel();
    addOrders(*other);
    addCustomers(*other);
    control().P_SET_Zandor(other);
    forget();
    // The list may have gone with the tables, which is as good.
    if (offers()) stage->pickField(u"CUSTOMERS.NAME");
    EXPECT_EQ(other->definitionCount(), 0);
    EXPECT_EQ(events(), Names{});
}

TEST_F(AComfort, MovesColumnsOnlyWhereTheQueryKeepsTheirOrderAndMayBeChanged) {
    EXPECT_FALSE(stage->comforts().columnMovable(1)) << "this model knows no order";
    model = zandor::platform::makeRef<OrderedModel>(library.calls);
    orders = addOrders(*model);
    model->definition(orders, u"ID");
    model->definition(orders, u"TOTAL");
    bind();
    EXPECT_TRUE(stage->comforts().columnMovable(1));
    EXPECT_FALSE(stage->comforts().columnMovable(0));
    EXPECT_FALSE(stage->comforts().columnMovable(3));
    control().ReadOnly(true);
    EXPECT_FALSE(stage->comforts().columnMovable(1));
}

TEST_F(AComfort, ForgetsWhatWasSaidAboutAField) {
    stage->comforts().setFindings({{.definition = u"x1", .row = fieldRow, .text = u"No such."},
                                   {.definition = u"x1", .row = criteriaRow, .text = u"No."}});
    ASSERT_EQ(stage->note(fieldRow, 1), u"No such.");
    stage->comforts().setFindings({});
    EXPECT_EQ(stage->note(fieldRow, 1), u"");
    EXPECT_EQ(stage->note(criteriaRow, 1), u"");
}

/// A join of each type and operator, in one sentence.
TEST_F(AComfort, SaysOfEachJoinWhichTableKeepsAllItsRows) {
    const auto sentence = [this](std::int32_t type, std::int32_t compareOperator) {
        return zandor::platform::toUtf8(
            stage->comforts().sentenceOf({.LeftTable = u"A",
                                          .LeftColumn = u"x",
                                          .RightTable = u"B",
                                          .RightColumn = u"y",
                                          .JoinType = type,
                                          .CompareOperator = compareOperator,
                                          .LeftIsWest = true}));
    };
    const auto filled = [this](const String& pattern, const char* one, const char* other) {
        std::string text = zandor::platform::toUtf8(pattern);
        for (const auto& [place, name] : {std::pair("%1", one), std::pair("%2", other)})
            for (std::size_t at; (at = text.find(place)) != std::string::npos;)
                text.replace(at, 2, name);
        return text;
    };
    const auto& words = stage->comforts().words();
    EXPECT_EQ(sentence(0, 0), filled(words.Matching, "A", "B"));
    EXPECT_EQ(sentence(1, 0), filled(words.AllOfOne, "A", "B"));
    EXPECT_EQ(sentence(2, 0), filled(words.AllOfOne, "B", "A"));
    EXPECT_EQ(sentence(3, 0), filled(words.AllOfBoth, "A", "B"));
    EXPECT_EQ(sentence(2, 2), filled(words.AllOfOne, "B", "A") + ": A.x < B.y");
}

} // namespace

} // namespace gridstage
