#include "GridStage.h"

#include <Zandor/control/basZandor.h>

namespace gridstage {

class TheGridHitTest : public GridTest {
protected:
    struct Hit {
        std::int32_t col = -1;
        std::int32_t row = -1;
    };

    Hit at(float X, float Y) {
        Hit hit;
        TalvikDBxZandor::basZandor::SpreadHitTest(stage->toolkit(), hit.col, hit.row, grid(), X, Y);
        return hit;
    }

    static constexpr float justBefore = 1;
};

TEST_F(TheGridHitTest, GivesAPointOnTheLeftEdgeToTheColumnThatBeginsThere) {
    EXPECT_EQ(at(grid().ColPos(3), 0).col, 3);
    EXPECT_EQ(at(grid().ColPos(3) - justBefore, 0).col, 2);
}

TEST_F(TheGridHitTest, GivesAPointOnTheTopEdgeToTheRowThatBeginsThere) {
    EXPECT_EQ(at(0, grid().RowPos(3)).row, 3);
    EXPECT_EQ(at(0, grid().RowPos(3) - justBefore).row, 2);
}

TEST_F(TheGridHitTest, GivesAPointRightOfTheLastColumnToTheLastColumn) {
    EXPECT_EQ(at(1e7F, 0).col, grid().Cols() - 1);
}

TEST_F(TheGridHitTest, GivesAPointBelowTheLastRowToTheLastRow) {
    EXPECT_EQ(at(0, 1e7F).row, grid().Rows() - 1);
}

TEST_F(TheGridHitTest, GivesAPointInTheLabelsToColumnAndRowZeroWhileNothingIsScrolled) {
    const Hit hit = at(grid().ColPos(1) - justBefore, grid().RowPos(1) - justBefore);
    EXPECT_EQ(hit.col, 0);
    EXPECT_EQ(hit.row, 0);
}

TEST_F(TheGridHitTest, GivesAPointInTheLabelColumnOfAScrolledGridToTheColumnBeforeTheFirstSeen) {
    stage->scrollGrid(1, 4);
    ASSERT_EQ(grid().LeftCol(), 4);
    EXPECT_EQ(at(30, 0).col, 3);
}

TEST_F(TheGridHitTest, GivesAPointInTheFieldRowOfAScrolledGridToTheRowBeforeTheFirstSeen) {
    stage->resizeControl(12000, 3000); // the rows must not all fit, or the grid would not scroll
    stage->scrollGrid(4, 1);
    ASSERT_EQ(grid().TopRow(), 4);
    EXPECT_EQ(at(0, 30).row, 3);
    EXPECT_EQ(at(0, -30).row, 3) << "above the grid, where a held button may be let go";
}

} // namespace gridstage
