#include "control/GridStage.h"

#include <Zandor/headless/Toolkit.h>

namespace gridstage {

namespace {

namespace headless = zandor::platform::headless;

/// What is done to the tables on the canvas, as only this toolkit tells it.
class TablesThatAreShown : public GridTest {
protected:
    headless::Toolkit& toolkit() { return dynamic_cast<headless::Toolkit&>(stage->toolkit()); }
    headless::Tabulet& list(std::int16_t slot) {
        return toolkit().find<headless::Tabulet>(headless::elementName(u"lstTable", slot));
    }
};

TEST_F(TablesThatAreShown, AreEmptiedAtTheEndThoughTheyCouldNotBeRemoved) {
    for (int n = 3; n <= Backstage::lastTableSlot; ++n)
        model->table(u"T" + zandor::platform::decimal(n), {u"*", u"ID"});
    for (const std::int16_t slot : {std::int16_t{1}, Backstage::lastTableSlot}) {
        bind();
        const auto kept = Backstage::lstTable(control())(slot);
        const auto entries = list(slot).entries();
        ASSERT_FALSE(entries.empty());
        toolkit().faults.failNext(headless::elementName(u"lstTable", slot) + ".Text", refusal());
        control().Terminate();
        EXPECT_EQ(stage->boxes, Boxes{report(u"RemoveTable", refusal())});
        EXPECT_TRUE(list(slot).entries().empty()) << slot;
    }
}

TEST_F(TablesThatAreShown, AreDrawnOnceMoreWhenOneIsMadeCurrent) {
    bind();
    stage->focus("lstTable(2)"); // or it would be made current by its focus, too
    const int before = list(2).completions();
    control().SetCurrentTable(u"CUSTOMERS");
    EXPECT_EQ(list(2).completions(), before + 1);
}

TEST_F(TablesThatAreShown, AreDrawnOnceMoreWhenTheyGrow) {
    bind();
    const int before = list(1).completions();
    control().ShowAnew();
    EXPECT_EQ(list(1).completions(), before) << "nothing has come";
    orders->addColumn(u"LAST");
    control().ShowAnew();
    EXPECT_EQ(list(1).completions(), before + 1);
}

TEST_F(TablesThatAreShown, StayBetweenTwoTwipsWhereTheModelHasTheNearest) {
    orders->place(300, 300, 2400, 2400);
    bind();
    const zandor::platform::Bounds between{300.25F, 299.75F, 2400.25F, 2399.75F};
    list(1).setBounds(between);
    control().ShowAnew();
    EXPECT_EQ(list(1).bounds(), between);
    orders->place(301, 302, 2403, 2404);
    control().ShowAnew();
    EXPECT_EQ(list(1).bounds(), (zandor::platform::Bounds{301, 302, 2403, 2404}));
}

TEST_F(TablesThatAreShown, AreTerminatedOnceThoughTheHostEndsTheControlTwice) {
    control().DebugSwitch(1);
    int ends = 0;
    toolkit().onBox = [&](const headless::MessageBox& box) {
        if (box.prompt != u"UserControl_Terminate") return;
        if (++ends < 3) control().End();
    };
    control().End();
    EXPECT_EQ(ends, 1);
    toolkit().onBox = nullptr;
}

TEST_F(TablesThatAreShown, HaveColumnsWhoseCellsStandAnewAsWhenTheyWereBound) {
    bind();
    const auto definition = model->definition(orders, u"ID", {u"> 1"});
    definition->synonym = u"Number";
    definition->sortOrder = 2;
    control().ShowAnew();
    const auto& cells = toolkit().find<headless::Grid>("sprColumn");
    for (const std::int32_t row : {fieldRow, sortRow, visibleRow})
        EXPECT_EQ(cells.cell(row, 1).alignment, MSFlexGridLib::alignCenterCenter) << row;
    for (const std::int32_t row : {synonymRow, criteriaRow})
        EXPECT_EQ(cells.cell(row, 1).alignment, MSFlexGridLib::alignLeftCenter) << row;
}

} // namespace

} // namespace gridstage
