#include "CanvasTest.h"

using namespace zandor;

namespace {

class Arranging : public CanvasTest {
protected:
    std::int16_t verticalStepOf(std::int16_t max) {
        control().VertMaxScrollPos(max);
        Back::OrganizeTables(control());
        return stage->look("vsbTable").largeChange;
    }
    std::int16_t horizontalStepOf(std::int16_t max) {
        control().HorizMaxScrollPos(max);
        Back::OrganizeTables(control());
        return stage->look("hsbTable").largeChange;
    }
    std::vector<bool> enabled() {
        return {stage->look("vsbTable").enabled, stage->look("hsbTable").enabled,
                stage->look("cmdHome").enabled};
    }
};

TEST_F(Arranging, ScrollsAFifthOfTheRangeAtATimeRoundedDownAndAtLeastOne) {
    bind();
    EXPECT_EQ(verticalStepOf(4), 1);
    EXPECT_EQ(verticalStepOf(12), 2);
    EXPECT_EQ(verticalStepOf(0), 1);
    EXPECT_EQ(verticalStepOf(14), 2);
    EXPECT_EQ(verticalStepOf(15), 3);
    EXPECT_EQ(horizontalStepOf(4), 1);
    EXPECT_EQ(horizontalStepOf(12), 2);
    EXPECT_EQ(horizontalStepOf(0), 1);
    EXPECT_EQ(horizontalStepOf(4000), 800);
}

TEST_F(Arranging, DisablesTheScrollingWhileNoTableIsShown) {
    bind();
    EXPECT_EQ(enabled(), (std::vector<bool>{false, false, false}));
}

TEST_F(Arranging, EnablesTheScrollingFromTheFirstTableOn) {
    bind();
    ASSERT_EQ(enabled(), (std::vector<bool>{false, false, false}));
    table(u"A", {}, 600);
    Back::SetZandor(control());
    EXPECT_EQ(enabled(), (std::vector<bool>{false, false, false})) << "not before it arranges";

    Back::OrganizeTables(control());
    EXPECT_EQ(enabled(), (std::vector<bool>{true, true, true}));
}

TEST_F(Arranging, MovesNoTable) {
    model->table(u"A")->place(9000, 7500, 1500, 1200);
    bind();
    element(1)->setBounds({-300, -450, 150, 15});

    Back::OrganizeTables(control());
    EXPECT_EQ(boundsOf("lstTable(1)"), (platform::Bounds{-300, -450, 150, 15}));
}

TEST_F(Arranging, RedrawsTheJoins) {
    const auto a = table(u"A", {u"ID"}, 600);
    const auto b = table(u"B", {u"ID"}, 6000);
    model->join(a, u"ID", b, u"ID");
    bind();
    const float before = stage->look("linJoin(1)").X2;
    element(2)->Left(4500);

    Back::OrganizeTables(control());
    EXPECT_EQ(stage->look("linJoin(1)").X2, before - 1500);
}

TEST_F(Arranging, TracesItsNameOnlyWhileTheSwitchIsOn) {
    bind();
    Back::OrganizeTables(control());
    EXPECT_EQ(told(), Texts{});

    control().DebugSwitch(1);
    Back::OrganizeTables(control());
    control().DebugSwitch(0);
    EXPECT_EQ(told(), Texts{trace("OrganizeTables")});
}

} // namespace
