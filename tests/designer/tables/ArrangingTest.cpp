#include "Drawing.h"

#include "designer/tables/placeTables.h"

#include <gmock/gmock.h>

using namespace zandor;

using designer::arrangeTables;

namespace {

class Arranging : public Drawing {
protected:
    static constexpr int canvasWidth = 1170 * 15;

    /// All tables of the sample on one heap.
    void addHeap() {
        openSample();
        for (const auto& table : database.tables()) adding.add({table.id}, QPoint(500, 500));
        ASSERT_EQ(query().Tables().Count(), 16);
    }
};

} // namespace

TEST_F(Arranging, PutsNoTableOnAnotherAndAllWithinTheWidth) {
    addHeap();
    arrangeTables(document, canvasWidth);
    const auto all = places();
    for (std::size_t n = 0; n < all.size(); ++n) {
        EXPECT_LE(all[n].second.x() + all[n].second.width(), canvasWidth) << all[n].first;
        for (std::size_t m = 0; m < n; ++m)
            EXPECT_FALSE(all[n].second.intersects(all[m].second))
                << all[n].first << " covers " << all[m].first;
    }
}

TEST_F(Arranging, PutsJoinedTablesSideBySide) {
    addHeap();
    arrangeTables(document, canvasWidth);
    int beside = 0;
    for (const auto& join : platform::Each<TalvikZandorLib::ZDJoin>(query().Joins()))
        beside += join->LeftTable()->Left() != join->RightTable()->Left();
    EXPECT_GE(beside, query().Joins().Count() - 2);
}

TEST_F(Arranging, IsOneStepThatBringsEveryPlaceBack) {
    addHeap();
    const auto before = places();
    const int steps = document.steps().count();
    arrangeTables(document, canvasWidth);
    const auto after = places();
    EXPECT_NE(after, before);
    EXPECT_EQ(document.steps().count(), steps + 1);
    EXPECT_EQ(document.steps().undoText(), "Arrange tables");
    document.undo();
    EXPECT_EQ(places(), before);
    document.redo();
    EXPECT_EQ(places(), after);
}

TEST_F(Arranging, TwiceIsOnce) {
    addHeap();
    arrangeTables(document, canvasWidth);
    const int steps = document.steps().count();
    arrangeTables(document, canvasWidth);
    EXPECT_EQ(document.steps().count(), steps);
}

TEST_F(Arranging, OfAnEmptyDrawingDoesNothing) {
    arrangeTables(document, canvasWidth);
    EXPECT_EQ(document.steps().count(), 0);
}
