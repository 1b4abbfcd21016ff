#include "OrderedModel.h"

using namespace zandor;

namespace gridstage {

/// The columns of the grid, which the model is to have in the same order.
class TheOrderOfTheGrid : public GridTest {
protected:
    TheOrderOfTheGrid() {
        model = ordered;
        orders = model->table(u"ORDERS", {u"*", u"ID", u"CUSTOMER", u"TOTAL"});
        orders->place(300, 300, 2400, 2400);
        customers = model->table(u"CUSTOMERS", {u"*", u"ID", u"NAME"});
        customers->place(6000, 300, 2400, 2400);
        model->definition(customers, u"ID");
        model->definition(customers, u"NAME");
        model->definition(orders, u"TOTAL");
        bind();
    }

    Texts keys() const {
        Texts result;
        for (const auto& each : platform::Each(model->definitions.items))
            result.push_back(each->Key());
        return result;
    }

    /// What the grid shows from its first column on, for as many as the model has.
    Texts shown() {
        Texts result;
        for (std::int32_t column = 1; column <= model->definitionCount(); ++column)
            result.push_back(u"x" + platform::decimal(grid().ColData(column)));
        return result;
    }

    const Ref<OrderedModel> ordered = platform::makeRef<OrderedModel>(library.calls);
};

TEST_F(TheOrderOfTheGrid, IsTheModelsAfterADropBetweenOtherColumns) {
    drag(1, {id, customer}, 2);
    EXPECT_EQ(keys(), (Texts{u"x1", u"x4", u"x5", u"x2", u"x3"}));
    EXPECT_EQ(shown(), keys());
    EXPECT_EQ(events(), (Names{"ColumnCreated", "ColumnCreated", "Activate"}));
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(TheOrderOfTheGrid, IsTheModelsAfterADropBeforeAllAndFarBehindAll) {
    drag(1, {id}, 1);
    drag(1, {customer}, 9);
    EXPECT_EQ(keys(), (Texts{u"x4", u"x1", u"x2", u"x3", u"x5"}));
}

TEST_F(TheOrderOfTheGrid, IsTheModelsAfterAPaste) {
    copy(1, {id, total});
    menuOverCell(synonymRow, 2, "mnuColumnDefinitionPaste");
    EXPECT_EQ(keys(), (Texts{u"x1", u"x4", u"x5", u"x2", u"x3"}));
    EXPECT_EQ(shown(), keys());
}

TEST_F(TheOrderOfTheGrid, IsTheModelsAlreadyWhenTheHostIsToldOfAColumn) {
    drag(1, {id}, 2);
    ASSERT_EQ(events().front(), "ColumnCreated");
    EXPECT_EQ(stage->raised.front().arguments.Definition, model->definitions.items.Item(2));
}

TEST_F(TheOrderOfTheGrid, GoesByTheNextColumnOnTheLeftThatStillHasADefinition) {
    // The grid knows nothing of it until it is bound again.
    model->definitions.items.Remove(u"x2");
    drag(1, {id}, 3);
    EXPECT_EQ(keys(), (Texts{u"x1", u"x4", u"x3"}));
}

TEST_F(TheOrderOfTheGrid, LeavesTheNewColumnWhereTheModelRefusesToOrderIt) {
    ordered->refuses = true;
    drag(1, {id}, 2);
    EXPECT_EQ(stage->boxes, Boxes{report(u"sprColumn_DragDrop", refusal())});
    EXPECT_EQ(keys(), (Texts{u"x1", u"x2", u"x3", u"x4"}));
}

TEST_F(TheOrderOfTheGrid, ChangesWithTheColumnThatIsMoved) {
    for (std::int32_t from = 1; from <= 3; ++from)
        for (std::int32_t to = 1; to <= 3; ++to) {
            const String moved = keys().at(std::size_t(from) - 1);
            forget();
            EXPECT_TRUE(control().MoveColumn(from, to));
            EXPECT_EQ(keys().at(std::size_t(to) - 1), moved) << from << " to " << to;
            EXPECT_EQ(shown(), keys());
            EXPECT_EQ(events(), from == to ? Names{} : Names{"ColumnModified"});
        }
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(TheOrderOfTheGrid, CarriesACellWithItsTextsAndItsWidth) {
    grid().TextMatrix(synonymRow, 1, u"first");
    grid().ColWidth(1, 2400);
    control().MoveColumn(1, 3);
    EXPECT_EQ(stage->cell(synonymRow, 3), u"first");
    EXPECT_EQ(grid().ColWidth(3), 2400);
    EXPECT_EQ(fields(4), (Texts{u"NAME", u"TOTAL", u"ID", u""}));
}

TEST_F(TheOrderOfTheGrid, KeepsTheCurrentCell) {
    for (std::int32_t current = 1; current <= 4; ++current)
        for (std::int32_t from = 1; from <= 3; ++from)
            for (std::int32_t to = 1; to <= 3; ++to) {
                grid().Row(criteriaRow);
                grid().Col(current);
                const std::int32_t data = grid().ColData(current);
                control().MoveColumn(from, to);
                EXPECT_EQ(grid().ColData(grid().Col()), data);
                EXPECT_EQ(grid().Row(), criteriaRow);
            }
}

TEST_F(TheOrderOfTheGrid, HasNoBlankColumnWithin) {
    EXPECT_TRUE(control().MoveColumn(1, 200));
    EXPECT_EQ(shown(), (Texts{u"x2", u"x3", u"x1"}));
    EXPECT_FALSE(control().MoveColumn(4, 1)) << "a blank one";
    EXPECT_FALSE(control().MoveColumn(0, 1)) << "the labels";
    EXPECT_FALSE(control().MoveColumn(1, 0));
    EXPECT_EQ(shown(), (Texts{u"x2", u"x3", u"x1"}));
    EXPECT_EQ(keys(), shown());
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(TheOrderOfTheGrid, StaysWhereTheModelRefusesToChangeIt) {
    ordered->refuses = true;
    EXPECT_FALSE(control().MoveColumn(1, 3));
    EXPECT_EQ(shown(), (Texts{u"x1", u"x2", u"x3"}));
    EXPECT_EQ(stage->boxes, Boxes{report(u"MoveColumn", refusal())});
    EXPECT_EQ(events(), Names{});
}

TEST_F(TheOrderOfTheGrid, ClosesAnOpenEditorWhenAColumnIsMoved) {
    press(left, criteriaRow, 1);
    ASSERT_TRUE(shows("fraValue"));
    control().MoveColumn(1, 2);
    EXPECT_FALSE(shows("fraValue"));
}

/// A model that keeps no order: it is asked for none.
class AModelWithoutOrder : public GridTest {};

TEST_F(AModelWithoutOrder, HasItsColumnsWhereTheyWereDroppedAndNoneMoved) {
    model->definition(customers, u"ID");
    model->definition(customers, u"NAME");
    bind();
    drag(1, {id}, 1);
    EXPECT_EQ(fields(3), (Texts{u"ORDERS.ID", u"ID", u"NAME"}));
    EXPECT_EQ(model->definitionAt(3).key, u"x3");
    EXPECT_FALSE(control().MoveColumn(1, 2));
    EXPECT_EQ(fields(3), (Texts{u"ORDERS.ID", u"ID", u"NAME"}));
    EXPECT_EQ(events(), (Names{"ColumnCreated", "Activate"}));
}

} // namespace gridstage
