#include "control/ShellFixture.h"

using namespace zandor;

namespace {

class BindingTheGrid : public AControl {
protected:
    BindingTheGrid() {
        zandor().OnlyJoin(false);
        forget();
        table = model->table(u"ORDERS", {u"ID", u"TOTAL"});
    }

    platform::Ref<fake::Model> model = library.newModel();
    platform::Ref<fake::Table> table;
};

} // namespace

TEST_F(BindingTheGrid, LeavesTheSortCellOfAnUnsortedDefinitionAsItWas) {
    const auto definition = model->definition(table, u"ID");
    definition->sortOrder = 2;
    bind(model);
    ASSERT_EQ(stage->cell(2, 1), u"Descending");
    for (const std::int16_t other : {0, 3, -1}) {
        definition->sortOrder = other;
        bind(model);
        EXPECT_EQ(stage->cell(2, 1), u"Descending") << other;
    }
    definition->sortOrder = 1;
    bind(model);
    EXPECT_EQ(stage->cell(2, 1), u"Ascending");
}

TEST_F(BindingTheGrid, ShowsAsManyCriteriaAsThereAreRows) {
    const auto definition = model->definition(table, u"ID");
    const std::int32_t rows = grid().Rows();
    for (std::int32_t row = 4; row < rows + 3; ++row)
        definition->addCriterion(u"= " + platform::decimal(row), platform::decimal(row));
    model->definition(table, u"TOTAL");
    bind(model);
    EXPECT_EQ(stage->cell(4, 1), u"= 4");
    EXPECT_EQ(stage->cell(rows - 1, 1), u"= " + platform::decimal(rows - 1));
    EXPECT_EQ(stage->cell(0, 2), u"TOTAL") << "the next definition follows all the same";
    EXPECT_TRUE(stage->boxes.empty());
}

TEST_F(BindingTheGrid, ReadsNoCriterionThatItCannotShow) {
    const auto definition = model->definition(table, u"ID");
    const std::int32_t rows = grid().Rows();
    for (std::int32_t row = 4; row < rows + 1; ++row)
        definition->addCriterion(u"= 1", platform::decimal(row));
    library.calls->failNext("Criteria.Item(position)", platform::errors::invalidProcedureCall(),
                            rows - 4 + 1);
    bind(model);
    EXPECT_TRUE(stage->boxes.empty());
    library.calls->disarm();
}

TEST_F(BindingTheGrid, LeavesTheCurrentCellBelowTheLastCriterion) {
    model->definition(table, u"ID", {u"> 1", u"< 9"});
    bind(model);
    EXPECT_EQ(grid().Col(), 1);
    EXPECT_EQ(grid().Row(), 6);
    const auto full = model->definition(table, u"TOTAL");
    for (std::int32_t row = 4; row < grid().Rows(); ++row)
        full->addCriterion(u"= 1", platform::decimal(row));
    bind(model);
    EXPECT_EQ(grid().Col(), 2);
    EXPECT_EQ(grid().Row(), grid().Rows() - 1);
}

TEST_F(BindingTheGrid, EndsAtTheDefinitionBeyondTheLastColumn) {
    const std::int32_t last = grid().Cols() - 1;
    for (std::int32_t n = 0; n <= last; ++n) model->definition(table, u"ID");
    model->definitionAt(last).synonym = u"LAST";
    bind(model);
    EXPECT_EQ(stage->cell(0, last), u"ID");
    EXPECT_EQ(stage->cell(1, last), u"LAST");
    EXPECT_EQ(stage->boxes, std::vector{unexpected(u"SetZandor", u"30010", u"Invalid Col value")});
    EXPECT_EQ(grid().ColData(last), last) << "the columns shown can be edited";
}

TEST_F(BindingTheGrid, TiesAColumnOnlyToAKeyThatItsNumberLeadsBackTo) {
    model->definition(table, u"ID")->key = u"x12";
    model->definition(table, u"ID")->key = u"x012";
    model->definition(table, u"ID")->key = u"x99999999999";
    model->definition(table, u"ID")->key = u"x2147483647";
    bind(model);
    EXPECT_EQ(grid().ColData(1), 12);
    EXPECT_EQ(grid().ColData(2), 0);
    EXPECT_EQ(grid().ColData(3), 0);
    EXPECT_EQ(grid().ColData(4), 2147483647);
    EXPECT_TRUE(stage->boxes.empty());
}

TEST_F(BindingTheGrid, TakesTheColumnsOfRemovedTablesAwayByTheirPrefixOnly) {
    model->definition(table, u"ID");
    bind(model);
    grid().TextMatrix(0, 2, u"ORDERS.TOTAL");
    bind(library.newModel());
    EXPECT_EQ(stage->cell(0, 1), u"ID") << "shown by its column's name, it is not recognised";
    EXPECT_EQ(stage->cell(0, 2), u"");
}
