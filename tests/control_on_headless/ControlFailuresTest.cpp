#include "control/ShellFixture.h"

#include <Zandor/headless/Toolkit.h>

#include <algorithm>
#include <new>

using namespace zandor;

namespace {

const platform::RuntimeError refused{1234, u"The toolkit is broken"};

/// 9000 twips wide and 7500 high; 7000 and 8500 twips of the canvas are out of view.
class AToolkitThatFails : public AControl {
protected:
    AToolkitThatFails() {
        stage->resizeControl(9000, 7500);
        forget();
    }

    platform::headless::Faults& faults() {
        return dynamic_cast<platform::headless::Toolkit&>(toolkit()).faults;
    }
    void fail(const std::string& call, int nth = 1) { faults().failNext(call, refused, nth); }
    static Stage::Box refusedIn(StringView procedure) {
        return unexpected(procedure, u"1234", u"The toolkit is broken");
    }
    /// The one box shown since the last look is the procedure's.
    void expectReport(StringView procedure) {
        EXPECT_EQ(stage->boxes, std::vector{refusedIn(procedure)});
        forget();
    }

    using Getter = std::int16_t (TalvikDBxZandor::Zandor::*)() const;
    using Setter = void (TalvikDBxZandor::Zandor::*)(std::int16_t);
    struct ScrollProperty {
        Getter get;
        Setter set;
        StringView getterReport, setterReport;
        const char* getterCall;
        const char* setterCall;
    };
    static const std::vector<ScrollProperty>& scrollProperties() {
        using Z = TalvikDBxZandor::Zandor;
        static const std::vector<ScrollProperty> all = {
            {&Z::VisibleFrameLeft, &Z::VisibleFrameLeft, u"P_GET VisibleFrameLeft",
             u"P_LET VisibleFrameLeft", "fraTable.bounds", "ScaleWidth"},
            {&Z::VisibleFrameTop, &Z::VisibleFrameTop, u"P_GET VisibleFrameTop",
             u"P_LET VisibleFrameTop", "fraTable.bounds", "ScaleHeight"},
            {&Z::HorizMaxScrollPos, &Z::HorizMaxScrollPos, u"P_GET HorizMaxScrollPos",
             u"P_LET HorizMaxScrollPos", "hsbTable.Max", "hsbTable.Max="},
            {&Z::VertMaxScrollPos, &Z::VertMaxScrollPos, u"P_GET VertMaxScrollPos",
             u"P_LET VertMaxScrollPos", "vsbTable.Max", "vsbTable.Max="},
            {&Z::HorizontalScrollbarPos, &Z::HorizontalScrollbarPos,
             u"P_GET HorizontalScrollbarPos", u"P_LET HorizontalScrollbarPos", "hsbTable.Value",
             "hsbTable.Value="},
            {&Z::VerticalScrollbarPos, &Z::VerticalScrollbarPos, u"P_GET VerticalScrollbarPos",
             u"P_LET VerticalScrollbarPos", "vsbTable.Value", "vsbTable.Value="},
        };
        return all;
    }
};

} // namespace

TEST_F(AToolkitThatFails, MakesAScrollPropertyReportItsNameAndReadZero) {
    for (const ScrollProperty& property : scrollProperties()) {
        (zandor().*property.set)(300);
        fail(property.getterCall);
        EXPECT_EQ((zandor().*property.get)(), 0) << property.getterCall;
        expectReport(property.getterReport);
        EXPECT_EQ((zandor().*property.get)(), 300) << property.getterCall;
    }
}

TEST_F(AToolkitThatFails, MakesAScrollPropertyReportItsNameAndStayAsItWas) {
    for (const ScrollProperty& property : scrollProperties()) {
        (zandor().*property.set)(300);
        fail(property.setterCall);
        (zandor().*property.set)(200);
        expectReport(property.setterReport);
        EXPECT_EQ((zandor().*property.get)(), 300) << property.setterCall;
    }
}

TEST_F(AToolkitThatFails, AtTheLaterReadingOfAVisibleFrameStaysAsItWas) {
    zandor().VisibleFrameLeft(300);
    fail("hsbTable.Value=");
    zandor().VisibleFrameLeft(32767);
    expectReport(u"P_LET VisibleFrameLeft");
    fail("fraTable.bounds");
    zandor().VisibleFrameLeft(32767);
    expectReport(u"P_LET VisibleFrameLeft");
    EXPECT_EQ(zandor().VisibleFrameLeft(), 300);
}

TEST_F(AToolkitThatFails, AtItsSizeIsAskedForItAfreshAtEachUseByAVisibleFrame) {
    faults().remember(true);
    zandor().VisibleFrameLeft(32767);
    zandor().VisibleFrameTop(32767);
    const auto& calls = faults().calls();
    EXPECT_EQ(std::count(calls.begin(), calls.end(), "ScaleWidth"), 2);
    EXPECT_EQ(std::count(calls.begin(), calls.end(), "ScaleHeight"), 2);
}

TEST_F(AToolkitThatFails, AtTheCanvasReportsTheScrollingAndNotTheProperty) {
    fail("fraTable.setBounds");
    zandor().HorizontalScrollbarPos(300);
    expectReport(u"hsbTable_Change");
    EXPECT_EQ(zandor().HorizontalScrollbarPos(), 300);
    EXPECT_EQ(look("fraTable").bounds.Left, 0);
}

TEST_F(AToolkitThatFails, AtTheGridsShowingLeavesOnlyJoinStored) {
    fail("sprColumn.Visible");
    zandor().OnlyJoin(false);
    expectReport(u"P_LET OnlyJoin");
    EXPECT_FALSE(zandor().OnlyJoin());
    EXPECT_FALSE(look("sprColumn").visible);
    EXPECT_EQ(look("vsbTable").bounds.Height, 7500 - look("hsbTable").bounds.Height)
        << "nothing has been laid out";
}

TEST_F(AToolkitThatFails, AtTheGridsHidingLeavesOnlyJoinStored) {
    zandor().OnlyJoin(false);
    fail("sprColumn.Visible");
    zandor().OnlyJoin(true);
    expectReport(u"P_LET OnlyJoin");
    EXPECT_TRUE(zandor().OnlyJoin());
    EXPECT_TRUE(look("sprColumn").visible);
}

TEST_F(AToolkitThatFails, AtTheThirdRowTitleLeavesTheFirstTwoWritten) {
    zandor().LNGSpreadField = zandor().LNGSpreadSynonym = zandor().LNGSpreadSort = u"new";
    fail("sprColumn.TextMatrix=", 3);
    zandor().OnlyJoin(false);
    expectReport(u"P_LET OnlyJoin");
    EXPECT_EQ(stage->cell(0, 0), u"new");
    EXPECT_EQ(stage->cell(1, 0), u"new");
    EXPECT_EQ(stage->cell(2, 0), u"Sort:");
    EXPECT_TRUE(look("sprColumn").visible);
}

TEST_F(AToolkitThatFails, InTheLayoutOfOnlyJoinReportsTheLayout) {
    fail("hsbTable.Max=");
    zandor().OnlyJoin(false);
    expectReport(u"ResizeControls");
    EXPECT_TRUE(look("sprColumn").visible);
}

TEST_F(AToolkitThatFails, InTheLayoutLeavesTheControlsAsFarAsTheyWerePlaced) {
    fail("cmdHome.setBounds");
    stage->resizeControl(6000, 6000);
    expectReport(u"ResizeControls");
    EXPECT_EQ(look("hsbTable").max, 10000);
    EXPECT_EQ(look("sprColumn").bounds.Width, 6000);
    EXPECT_EQ(look("vsbTable").bounds.Left, 6000 - look("vsbTable").bounds.Width);
    EXPECT_EQ(look("hsbTable").bounds.Width, look("vsbTable").bounds.Left);
    EXPECT_EQ(look("cmdHome").bounds.Left, 9000 - look("vsbTable").bounds.Width);
    EXPECT_EQ(look("vsbTable").max, 8500);
}

TEST_F(AToolkitThatFails, AtAnyStepOfTheLayoutIsReportedAsTheLayout) {
    zandor().OnlyJoin(false);
    for (const char* call :
         {"ScaleWidth", "hsbTable.Max=", "fraTable.setBounds", "sprColumn.setBounds",
          "vsbTable.bounds", "vsbTable.setBounds", "hsbTable.setBounds", "cmdHome.setBounds",
          "ScaleHeight", "vsbTable.Max="}) {
        fail(call);
        zandor().UserControl_Resize();
        EXPECT_FALSE(faults().isArmed(call)) << call;
        expectReport(u"ResizeControls");
    }
}

TEST_F(AToolkitThatFails, AtTheEditorsDoesNotKeepAPaintFromTheLayout) {
    zandor().HorizMaxScrollPos(77);
    fail("fraValue.Visible");
    stage->repaint();
    expectReport(u"MakeGetValueFieldsInvisible");
    EXPECT_EQ(look("hsbTable").max, 7000);
}

TEST_F(AToolkitThatFails, AtARowTitleOfANewControlReportsItsInitialisation) {
    fail("sprColumn.TextMatrix=", 2);
    Backstage::UserControl_Initialize(zandor());
    expectReport(u"UserControl_Initialize");
    EXPECT_EQ(Backstage::mTableFreeList(zandor())->FreeCount(), 16) << "the lists come first";
}

TEST_F(AToolkitThatFails, AtTheClosingTraceKeepsTheControlFromTerminating) {
    auto model = library.newModel();
    model->table(u"ORDERS", {u"ID"});
    bind(model);
    zandor().DebugSwitch(1);
    fail("MsgBox");
    forget();
    Backstage::UserControl_Terminate(zandor());
    expectReport(u"UserControl_Terminate");
    EXPECT_TRUE(stage->exists("lstTable(1)"));
}

TEST_F(AToolkitThatFails, AtTheFontEndsTheBindingWithTheModelHeldAndNothingShown) {
    auto model = library.newModel();
    model->table(u"ORDERS", {u"ID"});
    for (const char* call : {"AmbientFont", "lstTable(0).Font", "sprColumn.Font"}) {
        fail(call);
        bind(model);
        expectReport(u"P_SET Zandor");
        EXPECT_EQ(zandor().P_GET_Zandor().get(), model.get()) << call;
        EXPECT_FALSE(stage->exists("lstTable(1)")) << call;
    }
}

TEST_F(AToolkitThatFails, AtAMenuEntryLeavesTheOnesBeforeItSet) {
    zandor().LNGMnuShowJoinDefVis = zandor().LNGMnuDelColVis = false;
    fail("mnuJoinDelete.Visible");
    bind(library.newModel());
    expectReport(u"P_SET Zandor");
    EXPECT_FALSE(look("mnuJoinShowDefinition").visible);
    EXPECT_TRUE(look("mnuColumnDefinitionDelete").visible);
}

TEST_F(AToolkitThatFails, AtTheFocusDoesNotKeepATableFromBeingMadeCurrent) {
    auto model = library.newModel();
    auto table = model->table(u"ORDERS", {u"ID"});
    bind(model);
    table->selected = 0;
    forget();
    fail("lstTable(1).SetFocus");
    zandor().SetCurrentTable(u"ORDERS");
    EXPECT_FALSE(faults().isArmed("lstTable(1).SetFocus"));
    EXPECT_TRUE(stage->boxes.empty());
    EXPECT_EQ(table->selected, 1);

    table->selected = 0;
    faults().failNext("lstTable(1).SetFocus", std::bad_alloc());
    zandor().SetCurrentTable(u"ORDERS");
    EXPECT_TRUE(stage->boxes.empty());
    EXPECT_EQ(table->selected, 1);
}

TEST_F(AToolkitThatFails, AtTheActivationLeavesTheModelsSelectionAlone) {
    auto model = library.newModel();
    auto table = model->table(u"ORDERS", {u"ID"});
    bind(model);
    table->selected = 0;
    forget();
    fail("lstTable(1).Activated");
    zandor().SetCurrentTable(u"ORDERS");
    expectReport(u"SetCurrentTable");
    EXPECT_EQ(table->selected, 0);
}

TEST_F(AToolkitThatFails, AtAnEntryLeavesTheModelsColumnsAlone) {
    auto model = library.newModel();
    auto table = model->table(u"ORDERS", {u"ID", u"TOTAL"});
    bind(model);
    forget();
    fail("lstTable(1).ColumnItem.EnsureVisible");
    zandor().SelectColumnNames(u"ORDERS", u"ID");
    expectReport(u"SelectColumnNames");
    EXPECT_EQ(look("lstTable(1)").selected, std::vector<String>{u"ID"});
    EXPECT_FALSE(table->column(u"ID").selected);
}

TEST_F(AToolkitThatFails, WithAMessageBoxLeavesTheCallerUnharmed) {
    fail("MsgBox");
    zandor().HorizMaxScrollPos(-1);
    EXPECT_TRUE(stage->boxes.empty()) << "the report itself failed";
    EXPECT_EQ(zandor().HorizMaxScrollPos(), 7000);
    zandor().HorizMaxScrollPos(-1);
    EXPECT_EQ(stage->boxes, std::vector{invalidValue(u"P_LET HorizMaxScrollPos")});
}

TEST_F(AToolkitThatFails, ForLackOfMemoryIsReportedAsSuch) {
    faults().failNext("hsbTable.Max", std::bad_alloc());
    EXPECT_EQ(zandor().HorizMaxScrollPos(), 0);
    EXPECT_EQ(stage->boxes,
              std::vector{unexpected(u"P_GET HorizMaxScrollPos", u"7", u"Out of memory")});
}
