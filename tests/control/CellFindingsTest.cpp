#include "GridStage.h"

namespace gridstage {

class AFindingInACell : public GridTest {
protected:
    AFindingInACell() {
        first = model->definition(customers, u"NAME");
        second = model->definition(orders, u"ID");
        bind();
        stage->comforts().setFindings({{second->key, criteriaRow, u"This is no number."}});
    }

    Ref<fake::Definition> first, second;
};

TEST_F(AFindingInACell, MarksThatCellAlone) {
    EXPECT_EQ(stage->note(criteriaRow, 2), u"This is no number.");
    EXPECT_EQ(stage->note(criteriaRow, 1), u"");
    EXPECT_EQ(stage->note(sortRow, 2), u"");
}

TEST_F(AFindingInACell, GoesWithItsColumn) {
    drag(1, {total}, 1);
    EXPECT_EQ(stage->note(criteriaRow, 3), u"This is no number.");
    EXPECT_EQ(stage->note(criteriaRow, 2), u"");
}

TEST_F(AFindingInACell, StaysWhenTheModelIsShownAfresh) {
    bind();
    EXPECT_EQ(stage->note(criteriaRow, 2), u"This is no number.");
}

TEST_F(AFindingInACell, GoesWhenOthersAreSet) {
    stage->comforts().setFindings({{first->key, 5, u"Another one."}});
    EXPECT_EQ(stage->note(criteriaRow, 2), u"");
    EXPECT_EQ(stage->note(5, 1), u"Another one.");
}

TEST_F(AFindingInACell, OfNoCellIsShownNowhere) {
    stage->comforts().setFindings({{u"x99", criteriaRow, u"a"},
                                   {u"", criteriaRow, u"b"},
                                   {first->key, 99, u"c"},
                                   {first->key, -1, u"d"}});
    for (std::int32_t col = 0; col < 4; ++col)
        for (std::int32_t row = 0; row < grid().Rows(); ++row)
            EXPECT_EQ(stage->note(row, col), u"");
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AFindingInACell, LeadsToTheCell) {
    stage->scrollGrid(1, 9);
    EXPECT_TRUE(stage->comforts().showCell(second->key, criteriaRow));
    EXPECT_EQ(grid().Row(), criteriaRow);
    EXPECT_EQ(grid().Col(), 2);
    EXPECT_EQ(grid().LeftCol(), 2);
    EXPECT_TRUE(stage->look("sprColumn").focused);
    EXPECT_FALSE(shows("fraValue"));
}

TEST_F(AFindingInACell, LeadsNowhereWhereThereIsNone) {
    EXPECT_FALSE(stage->comforts().showCell(u"x99", criteriaRow));
    EXPECT_FALSE(stage->comforts().showCell(second->key, 99));
    control().OnlyJoin(true);
    EXPECT_FALSE(stage->comforts().showCell(second->key, criteriaRow));
    EXPECT_EQ(stage->boxes, Boxes{});
}

} // namespace gridstage
