#include "control_on_headless/MeanwhileTest.h"

#include <limits>

namespace gridstage {

namespace {

/// What a binding and its end leave behind where a host was in the way.
class BindingAtItsEdges : public MeanwhileTest {
protected:
    bool isFree(std::int32_t slot) { return Backstage::mTableFreeList(control())->IsFree(slot); }
};

TEST_F(BindingAtItsEdges, KeepsTheModelThatIsBoundWhileAnEmptyOneIsMade) {
    when("Library.NewZandor",
         [this] { control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(model)); });
    EXPECT_EQ(control().P_GET_Zandor(), model);
    EXPECT_EQ(control().P_GET_Zandor(), model);
}

TEST_F(BindingAtItsEdges, LeavesNoNumberInTheLastColumn) {
    const std::int32_t last = grid().Cols() - 1;
    grid().ColData(last, 7);
    bind();
    EXPECT_EQ(grid().ColData(last), 0);
}

TEST_F(BindingAtItsEdges, LeavesOutAJoinOfWhichEitherTableWasClosedMeanwhile) {
    for (const std::int16_t slot : {std::int16_t{1}, std::int16_t{2}}) {
        model->joins.items = {};
        model->join(orders, u"CUSTOMER", customers, u"ID");
        when("ZDJoin.CompareOperator", [&] { Backstage::RemoveTable(control(), slot); });
        control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(model));
        library.calls->onPass = nullptr;
        EXPECT_EQ(stage->boxes, Boxes{});
        EXPECT_TRUE(isFree(slot));
        EXPECT_FALSE(stage->exists("linJoin(1)"));
        EXPECT_EQ(Backstage::mJoinLines(control()).Count(), 0);
    }
}

TEST_F(BindingAtItsEdges, DrawsAJoinToTheTableInTheLastSlot) {
    Ref<fake::Table> last;
    for (int n = 3; n <= Backstage::lastTableSlot; ++n)
        last = model->table(u"T" + zandor::platform::decimal(n), {u"*", u"ID"});
    model->join(orders, u"ID", last, u"ID");
    control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(model));
    EXPECT_TRUE(shows("linJoin(1)"));
    EXPECT_EQ(Backstage::mJoinLines(control()).Count(), 1);
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(BindingAtItsEdges, EndsWithAnEmptyTemplate) {
    auto& entries = Backstage::lstTable(control())(0)->ColumnItems();
    entries.Add(u"k", u"LEFT OVER");
    control().Terminate();
    EXPECT_EQ(entries.Count(), 0);
}

TEST_F(BindingAtItsEdges, KeepsTheShareOfThePanesThatIsNoNumber) {
    const auto before = stage->look("sprColumn").bounds;
    control().UpperPaneShare(std::numeric_limits<float>::quiet_NaN());
    EXPECT_EQ(stage->look("sprColumn").bounds, before);
    EXPECT_EQ(stage->boxes, Boxes{});
}

} // namespace

} // namespace gridstage
