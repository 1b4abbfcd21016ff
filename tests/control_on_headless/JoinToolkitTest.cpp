#include "control/JoinScene.h"
#include "control/joins/frmJoinDefinition.h"

#include <Zandor/headless/User.h>

#include <algorithm>
#include <utility>

using namespace zandor;

namespace {

using platform::errors::invalidPropertyValue;

constexpr char16_t invalidValue[] = u"Invalid property value";

/// Joins on a toolkit whose calls can be made to fail.
struct AJoinOnAFailingToolkit : JoinScene {
    platform::headless::Toolkit& toolkit =
        dynamic_cast<platform::headless::Toolkit&>(stage->toolkit());
    int opened = 0;

    AJoinOnAFailingToolkit() {
        join();
        bind();
        control.JoinModifyDisabled(1);
    }

    void open(std::function<void()> use = {}) {
        stage->onDialog = [this, use] {
            ++opened;
            if (use) use();
        };
        pointAt();
        Back::mnuJoinShowDefinition_Click(control);
        stage->onDialog = nullptr;
    }
    void expectOpenedWith(const std::string& failingCall, const Stage::Box& box,
                          std::function<void()> use = {}) {
        const int before = opened;
        forget();
        toolkit.faults.failNext(failingCall, invalidPropertyValue());
        open(use);
        EXPECT_FALSE(toolkit.faults.isArmed(failingCall)) << failingCall;
        EXPECT_EQ(opened, before + 1) << failingCall;
        EXPECT_EQ(stage->boxes, Boxes{box}) << failingCall;
        toolkit.faults.disarm();
    }
    /// The calls made from outside while an action runs, those of some members only.
    std::vector<std::string> callsOf(std::function<void()> action,
                                     std::function<bool(const std::string&)> wanted) {
        toolkit.faults.forget();
        toolkit.faults.remember(true);
        action();
        toolkit.faults.remember(false);
        std::vector<std::string> calls;
        std::copy_if(toolkit.faults.calls().begin(), toolkit.faults.calls().end(),
                     std::back_inserter(calls), wanted);
        return calls;
    }
};

TEST_F(AJoinOnAFailingToolkit, IsMadeVisibleLineFirst) {
    const auto calls = callsOf([this] { Back::DrawJoin(control, *record()); },
                               [](const std::string& call) { return call.ends_with(").Visible"); });
    EXPECT_EQ(calls, (std::vector<std::string>{"linJoin(1).Visible", "shpJoin(2).Visible",
                                               "shpJoin(1).Visible"}));
}

TEST_F(AJoinOnAFailingToolkit, ReportsEachStepOfADrawing) {
    for (const char* call :
         {"lstTable(1).TableHandle", "lstTable(2).ColumnItems", "shpJoin(1).ShapeStyle",
          "shpJoin(2).setBounds", "lstTable(1).ColumnItem.RightEdgePoint",
          "lstTable(2).ColumnItem.LeftEdgePoint", "linJoin(1).setEnds", "linJoin(1).Visible",
          "shpJoin(1).Visible"}) {
        forget();
        toolkit.faults.failNext(call, invalidPropertyValue());
        EXPECT_FALSE(Back::DrawJoin(control, *record())) << call;
        EXPECT_EQ(stage->boxes, Boxes{controlErrorBox(u"DrawJoin", 380, invalidValue)}) << call;
    }
}

TEST_F(AJoinOnAFailingToolkit, HasItsEndsLookedForOnceAndNotAtEveryStepOfAMove) {
    const auto calls =
        callsOf([this] { Back::lstTable_Moving(control, std::int16_t{1}); },
                [](const std::string& call) {
                    return call.ends_with(".Text") || call.ends_with(").ColumnItems.Item");
                });
    EXPECT_EQ(calls, (std::vector<std::string>{"lstTable(1).ColumnItems.Item",
                                               "lstTable(2).ColumnItems.Item"}));
}

TEST_F(AJoinOnAFailingToolkit, IsInPlaceAtTheNextStepWhateverCallOfAStepFails) {
    const auto step = [this](float left) {
        table(1).Left(left);
        Back::lstTable_Moving(control, std::int16_t{1});
    };
    const auto look = [this] {
        const Stage::Seen seen = stage->look("linJoin(1)");
        return std::vector{seen.X1,
                           seen.Y1,
                           seen.X2,
                           seen.Y2,
                           stage->look("shpJoin(1)").bounds.Left,
                           stage->look("shpJoin(2)").bounds.Left};
    };
    step(1200);
    const auto wanted = look();
    const auto all = callsOf([&] { step(1200); }, [](const std::string&) { return true; }).size();
    ASSERT_GT(all, 20U);
    for (std::size_t failing = 0; failing < all; ++failing) {
        step(9000);
        std::size_t passed = 0;
        table(1).Left(1200);
        toolkit.faults.onPass = [&](const std::string&) {
            if (passed++ == failing) throw invalidPropertyValue();
        };
        Back::lstTable_Moving(control, std::int16_t{1});
        toolkit.faults.onPass = nullptr;
        step(1200);
        EXPECT_EQ(look(), wanted) << failing;
    }
}

TEST_F(AJoinOnAFailingToolkit, OverflowsWhereALineEndIsBeyondAllNumbers) {
    line().setEnds(1, 2, 3, 4);
    table(1).setBounds({3e38F, 500, 3e38F, 2000});
    table(2).setBounds({3.1e38F, 500, 2000, 2000});
    EXPECT_FALSE(Back::DrawJoin(control, *record()));
    EXPECT_EQ(stage->boxes, Boxes{controlErrorBox(u"DrawJoin", 6, u"Overflow")});
    EXPECT_EQ(line().X1(), 1);
}

TEST_F(AJoinOnAFailingToolkit, LeavesTheMarkAtTheTopOfATableWhoseBottomIsBeyondAllNumbers) {
    // Only a row that is not above its table asks for the table's bottom.
    table(1).setBounds({1000, 3e38F, 2000, 3e38F});
    EXPECT_TRUE(Back::DrawJoin(control, *record()));
    EXPECT_EQ(stage->look("shpJoin(2)").bounds.Top, 3e38F);
}

TEST_F(AJoinOnAFailingToolkit, HasItsMarkAtTheEdgeOfATableWhoseTopCannotBeRead) {
    const float top = stage->look("shpJoin(2)").bounds.Top;
    table(1).setBounds({1500, 900, 2000, 2000});
    toolkit.faults.failNext("lstTable(1).bounds", invalidPropertyValue(), 2);
    EXPECT_FALSE(Back::DrawJoin(control, *record()));
    EXPECT_EQ(stage->look("shpJoin(2)").bounds.Left, 3500);
    EXPECT_EQ(stage->look("shpJoin(2)").bounds.Top, top);
}

TEST_F(AJoinOnAFailingToolkit, ReportsALineThatCannotBeReadWhileSearching) {
    Record hit;
    pointAt();
    toolkit.faults.failNext("linJoin(1).Y2", invalidPropertyValue());
    EXPECT_TRUE(Back::JoinHitTest(control, hit, Back::mPopupX(control), Back::mPopupY(control)));
    EXPECT_EQ(hit, nullptr);
    EXPECT_EQ(stage->boxes, Boxes{controlErrorBox(u"JoinHitTest", 380, invalidValue)});
}

TEST_F(AJoinOnAFailingToolkit, LeavesWhatWasLoadedWhenTheSecondMarkCannotBeMade) {
    toolkit.faults.failNext("makeShape", invalidPropertyValue(), 2);
    EXPECT_FALSE(draw(entry(1, 1), entry(2, 2)));
    EXPECT_EQ(stage->boxes, Boxes{controlErrorBox(u"DrawNewJoin", 380, invalidValue)});
    EXPECT_TRUE(stage->exists("linJoin(2)"));
    EXPECT_TRUE(stage->exists("shpJoin(4)"));
    EXPECT_FALSE(stage->exists("shpJoin(3)"));
    EXPECT_FALSE(isFree(2));
    EXPECT_EQ(joinCount(), 1);
}

TEST_F(AJoinOnAFailingToolkit, ReportsTheTextsOfItsDialogUnderTheirProcedure) {
    const Stage::Box box = controlErrorBox(u"SetLanguageOfJoinDefinition", 380, invalidValue);
    for (const char* call : {"lblLeftTable.Font", "lblLeftTable.Caption", "lblLeftColumn.Caption",
                             "lblRightTable.Caption", "lblRightColumn.Caption",
                             "lblJoinType.Caption", "cmdOk.Caption", "cmdCancel.Caption"})
        expectOpenedWith(call, box);
}

TEST_F(AJoinOnAFailingToolkit, KeepsTheTextsOfItsDialogAfterAFailedOne) {
    control.LNGJoinRightTable = u"R";
    control.LNGJoinLeftColumn = u"L";
    expectOpenedWith("lblRightTable.Font",
                     controlErrorBox(u"SetLanguageOfJoinDefinition", 380, invalidValue), [this] {
                         EXPECT_EQ(stage->look("lblLeftColumn").text, u"L");
                         EXPECT_EQ(stage->look("lblRightTable").text, u"Right Table:");
                     });
}

TEST_F(AJoinOnAFailingToolkit, DressesItsDialogInAFixedOrderLeavingTheOperatorsAsDesigned) {
    const auto calls = callsOf([this] { open(); },
                               [](const std::string& call) {
                                   return call.ends_with(".Font") ||
                                          (call.ends_with(".Caption") && call[0] != 'f');
                               });
    EXPECT_EQ(calls, (std::vector<std::string>{
                         "lblLeftTable.Font", "lblLeftTable.Caption", "lblLeftColumn.Font",
                         "lblLeftColumn.Caption", "lblRightTable.Font", "lblRightTable.Caption",
                         "lblRightColumn.Font", "lblRightColumn.Caption", "lblJoinType.Font",
                         "lblJoinType.Caption", "cmdOk.Font", "cmdOk.Caption", "cmdCancel.Font",
                         "cmdCancel.Caption", "cboJoinType.Font"}));
}

TEST_F(AJoinOnAFailingToolkit, ReportsBothListsOfItsDialogUnderTheOneName) {
    // Whatever is missing in a list lets the position of the join's code fail afterwards.
    const Stage::Box box = controlErrorBox(u"SetEnabledJoinTypes", 380, invalidValue);
    expectOpenedWith("cboJoinType.Font", box);
    expectOpenedWith("cboJoinType.Clear", box);
    for (const char* call : {"cboJoinType.AddItem", "cboJoinCompareOperator.Clear",
                             "cboJoinCompareOperator.AddItem"}) {
        forget();
        toolkit.faults.failNext(call, invalidPropertyValue());
        open();
        EXPECT_EQ(stage->boxes, (Boxes{box, dialogErrorBox(u"P_SET Join", 380, invalidValue)}))
            << call;
    }
}

TEST_F(AJoinOnAFailingToolkit, ReportsALockOfItsDialogThatFails) {
    expectOpenedWith("cboJoinCompareOperator.Enabled",
                     dialogErrorBox(u"P_LET JoinModifyDisabled", 380, invalidValue));
}

TEST_F(AJoinOnAFailingToolkit, ReportsAnInitialisationOfItsDialogThatFails) {
    expectOpenedWith("cmdOk.Default", dialogErrorBox(u"Form_Initialize", 380, invalidValue));
}

TEST_F(AJoinOnAFailingToolkit, HasItsDialogStayOpenWhenItCannotBeHidden) {
    open([this] {
        toolkit.faults.failNext("frmJoinDefinition.Hide", invalidPropertyValue());
        stage->clickButton("cmdCancel");
        EXPECT_EQ(stage->boxes, Boxes{dialogErrorBox(u"cmdCancel_Click", 380, invalidValue)});
        EXPECT_TRUE(stage->look("cmdCancel").visible);
    });
    EXPECT_FALSE(stage->exists("frmJoinDefinition"));
}

TEST_F(AJoinOnAFailingToolkit, HasOkAsTheButtonThatEnterPresses) {
    open([this] {
        EXPECT_TRUE(toolkit.find<platform::headless::CommandButton>("cmdOk").isDefault());
        stage->choose("cboJoinType", 2);
        stage->key("cboJoinType", 13);
    });
    EXPECT_EQ(model->joinAt(1).joinType, 2);
    EXPECT_EQ(events(), std::vector{Event::JoinModified});
}

TEST_F(AJoinOnAFailingToolkit, CannotBeChangedThroughALockedDialog) {
    control.JoinModifyDisabled(0);
    open([this] {
        stage->choose("cboJoinType", 2);
        EXPECT_EQ(stage->look("cboJoinType").listIndex, 0);
        stage->clickButton("cmdOk");
    });
    EXPECT_EQ(model->joinAt(1).joinType, 0);
    EXPECT_EQ(events(), std::vector<Event>());
}

TEST_F(AJoinOnAFailingToolkit, IsHandedToNobodyOnceTheHostHasClosedItsTable) {
    bool closed = false;
    toolkit.onBox = [&](const platform::headless::MessageBox&) {
        if (!std::exchange(closed, true)) Back::RemoveTable(control, 2);
    };
    toolkit.faults.failNext("linJoin(2).setEnds", invalidPropertyValue());
    EXPECT_EQ(draw(entry(1, 1), entry(2, 1)), nullptr);
    EXPECT_EQ(joinCount(), 0);
}

} // namespace
