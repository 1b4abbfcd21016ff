#include "control/JoinScene.h"

using namespace zandor;

namespace {

using platform::String;

constexpr std::int16_t escape = 27;

/// Opens the definition of the first join and does something in it; a dialog left open is
/// cancelled.
struct TheJoinDialog : JoinScene {
    int opened = 0;

    void open(std::function<void()> use = {}) {
        stage->onDialog = [this, use] {
            ++opened;
            if (use) use();
        };
        pointAt();
        Back::mnuJoinShowDefinition_Click(control);
        stage->onDialog = nullptr;
    }
    void bindJoin(std::int16_t type = 0, std::int16_t compareOperator = 0) {
        join(type, compareOperator);
        bind();
    }
    String shown(const std::string& name) { return stage->look(name).text; }
    std::int16_t chosen(const std::string& name) { return stage->look(name).listIndex; }
    fake::Join& stored() { return model->joinAt(1); }
};

TEST_F(TheJoinDialog, ShowsTheTwoTablesAndColumns) {
    bindJoin();
    open([this] {
        EXPECT_EQ(shown("txtLeftTable"), u"Orders");
        EXPECT_EQ(shown("txtLeftColumn"), u"Customer");
        EXPECT_EQ(shown("txtRightTable"), u"Customers");
        EXPECT_EQ(shown("txtRightColumn"), u"Number");
    });
    EXPECT_EQ(opened, 1);
    EXPECT_EQ(stage->boxes, Boxes());
}

TEST_F(TheJoinDialog, HasTheDefaultTexts) {
    bindJoin();
    open([this] {
        EXPECT_EQ(shown("frmJoinDefinition"), u"Join Defintion");
        EXPECT_EQ(shown("lblLeftTable"), u"Left Table:");
        EXPECT_EQ(shown("lblLeftColumn"), u"Left Column:");
        EXPECT_EQ(shown("lblRightTable"), u"Right Table:");
        EXPECT_EQ(shown("lblRightColumn"), u"Right Column:");
        EXPECT_EQ(shown("lblJoinType"), u"Join Type");
        EXPECT_EQ(shown("lblJoinCompareOperator"), u"Join Compare Operator");
        EXPECT_EQ(shown("cmdOk"), u"&Ok");
        EXPECT_EQ(shown("cmdCancel"), u"&Cancel");
    });
    EXPECT_EQ(opened, 1);
}

TEST_F(TheJoinDialog, HasTheHostsTexts) {
    bindJoin();
    control.LNGJoinForm = u"Verbindung";
    control.LNGJoinLeftTable = u"Linke Tabelle";
    control.LNGJoinLeftColumn = u"Linke Spalte";
    control.LNGJoinRightTable = u"Rechte Tabelle";
    control.LNGJoinRightColumn = u"Rechte Spalte";
    control.LNGJoinType = u"Art";
    control.LNGJoinOk = u"&Gut";
    control.LNGJoinCancel = u"&Abbrechen";
    control.LNGJoinTypeNormal = u"Innen";
    control.LNGJoinTypeLeftOuter = u"Links";
    control.LNGJoinTypeRightOuter = u"Rechts";
    control.LNGJoinTypeBothOuter = u"Beide";
    open([this] {
        EXPECT_EQ(shown("frmJoinDefinition"), u"Verbindung");
        EXPECT_EQ(shown("lblLeftTable"), u"Linke Tabelle");
        EXPECT_EQ(shown("lblLeftColumn"), u"Linke Spalte");
        EXPECT_EQ(shown("lblRightTable"), u"Rechte Tabelle");
        EXPECT_EQ(shown("lblRightColumn"), u"Rechte Spalte");
        EXPECT_EQ(shown("lblJoinType"), u"Art");
        EXPECT_EQ(shown("lblJoinCompareOperator"), u"Join Compare Operator");
        EXPECT_EQ(shown("cmdOk"), u"&Gut");
        EXPECT_EQ(shown("cmdCancel"), u"&Abbrechen");
        EXPECT_EQ(stage->look("cboJoinType").items,
                  (std::vector<String>{u"Innen", u"Links", u"Rechts", u"Beide"}));
    });
    EXPECT_EQ(opened, 1);
}

TEST_F(TheJoinDialog, WearsTheControlsFont) {
    bindJoin();
    open([this] {
        for (const char* name : {"lblLeftTable", "lblLeftColumn", "lblRightTable", "lblRightColumn",
                                 "lblJoinType", "cmdOk", "cmdCancel", "cboJoinType"})
            EXPECT_EQ(stage->look(name).font, stage->toolkit().ControlFont().Name) << name;
    });
    EXPECT_EQ(opened, 1);
}

TEST_F(TheJoinDialog, OffersAllTypesAndOperatorsInTheOrderOfTheirCodes) {
    bindJoin();
    open([this] {
        EXPECT_EQ(stage->look("cboJoinType").items,
                  (std::vector<String>{u"Normal", u"Left Outer", u"Right Outer", u"Both Outer"}));
        EXPECT_EQ(stage->look("cboJoinCompareOperator").items,
                  (std::vector<String>{u"=", u"<>", u"<", u">", u"<=", u">="}));
    });
    EXPECT_EQ(opened, 1);
}

TEST_F(TheJoinDialog, OffersNoTypeThatIsSwitchedOff) {
    bindJoin();
    const std::vector<String> all = {u"Normal", u"Left Outer", u"Right Outer", u"Both Outer"};
    const auto use = [this](std::size_t code, bool on) {
        if (code == 0) control.UseJoinTypeNormal(on);
        if (code == 1) control.UseJoinTypeLeft(on);
        if (code == 2) control.UseJoinTypeRight(on);
        if (code == 3) control.UseJoinTypeBoth(on);
    };
    for (std::size_t code = 0; code < all.size(); ++code) {
        auto others = all;
        others.erase(others.begin() + static_cast<std::ptrdiff_t>(code));
        use(code, false);
        open([&] { EXPECT_EQ(stage->look("cboJoinType").items, others); });
        use(code, true);
    }
    EXPECT_EQ(opened, 4);
}

TEST_F(TheJoinDialog, OffersNoOperatorThatIsSwitchedOff) {
    bindJoin();
    const std::vector<String> all = {u"=", u"<>", u"<", u">", u"<=", u">="};
    const auto use = [this](std::size_t code, bool on) {
        if (code == 0) control.UseJoinCompareOperatorEquals(on);
        if (code == 1) control.UseJoinCompareOperatorNotEquals(on);
        if (code == 2) control.UseJoinCompareOperatorLess(on);
        if (code == 3) control.UseJoinCompareOperatorGreater(on);
        if (code == 4) control.UseJoinCompareOperatorLessEquals(on);
        if (code == 5) control.UseJoinCompareOperatorGreaterEquals(on);
    };
    for (std::size_t code = 0; code < all.size(); ++code) {
        auto others = all;
        others.erase(others.begin() + static_cast<std::ptrdiff_t>(code));
        use(code, false);
        open([&] { EXPECT_EQ(stage->look("cboJoinCompareOperator").items, others); });
        use(code, true);
    }
    EXPECT_EQ(opened, 6);
}

TEST_F(TheJoinDialog, SelectsThePositionOfEachCodeWhenEverythingIsOffered) {
    bindJoin();
    for (std::int16_t code = 0; code < 6; ++code) {
        const auto type = static_cast<std::int16_t>(code % 4);
        record()->JoinType(type);
        record()->CompareOperator(code);
        open([&] {
            EXPECT_EQ(chosen("cboJoinType"), type);
            EXPECT_EQ(chosen("cboJoinCompareOperator"), code);
        });
    }
    EXPECT_EQ(opened, 6);
    EXPECT_EQ(stage->boxes, Boxes());
}

TEST_F(TheJoinDialog, StartsFromTheCanvasWhateverTheModelHolds) {
    bindJoin();
    record()->JoinType(2);
    record()->CompareOperator(3);
    model->calls->remember(true);
    open([this] {
        EXPECT_EQ(shown("cboJoinType"), u"Right Outer");
        EXPECT_EQ(shown("cboJoinCompareOperator"), u">");
    });
    EXPECT_EQ(stored().joinType, 2);
    EXPECT_EQ(stored().compareOperator, 3);
    std::vector<std::string> written;
    for (const std::string& call : model->calls->calls())
        if (call.ends_with("=")) written.push_back(call);
    EXPECT_EQ(written, (std::vector<std::string>{"ZDJoin.CompareOperator=", "ZDJoin.JoinType="}));
}

TEST_F(TheJoinDialog, OpensOnlyWhereALineIsNear) {
    bindJoin();
    stage->onDialog = [this] { ++opened; };
    pointNowhere();
    Back::mnuJoinShowDefinition_Click(control);
    EXPECT_EQ(opened, 0);
    EXPECT_EQ(stage->boxes, Boxes());
}

TEST_F(TheJoinDialog, OpensFromTheMenu) {
    bindJoin();
    stage->onMenu = [](const auto&) { return String(u"mnuJoinShowDefinition"); };
    stage->onDialog = [this] { EXPECT_EQ(shown("txtRightColumn"), u"Number"); };
    const float x = (line().X1() + line().X2()) / 2;
    const float y = (line().Y1() + line().Y2()) / 2;
    stage->pressCanvas(rightButton, x, y);
    stage->releaseCanvas(rightButton, x, y);
    EXPECT_EQ(stage->transcript, (std::vector<std::string>{"event:Activate", "message:0", "menu",
                                                           "dialog", "message:1"}));
    EXPECT_FALSE(stage->exists("frmJoinDefinition"));
}

// Names shown as they are set.

Stage::Box nameBox(const String& text) {
    return {u"Module:\tTalvikDBxZandor.frmJoinDefinition\r\nFunction:\tP_SET Join\r\nMessage:\t" +
                text,
            u"Debug Message:", 48};
}

TEST_F(TheJoinDialog, ShowsEachNameInADebugBoxFirstWhenDebugging) {
    bindJoin();
    control.DebugSwitch(1);
    forget();
    open();
    EXPECT_EQ(
        stage->boxes,
        (Boxes{nameBox(u"Left Table Name: Orders"), nameBox(u"Left Column Name: Customer"),
               nameBox(u"Right Table Name: Customers"), nameBox(u"Right Column Name: Number")}));
    EXPECT_EQ(stage->transcript.back(), "dialog");
    control.DebugSwitch(0);
}

TEST_F(TheJoinDialog, ShowsNoDebugBoxWhenNotDebugging) {
    bindJoin();
    open();
    EXPECT_EQ(opened, 1);
    EXPECT_EQ(stage->boxes, Boxes());
}

// Read-only unless JoinModifyDisabled is nonzero.

TEST_F(TheJoinDialog, CannotBeChangedWithJoinModifyDisabledZero) {
    bindJoin(1, 2);
    ASSERT_EQ(control.JoinModifyDisabled(), 0);
    open([this] {
        EXPECT_FALSE(stage->look("cboJoinType").enabled);
        EXPECT_FALSE(stage->look("cboJoinCompareOperator").enabled);
        stage->clickButton("cmdOk");
    });
    EXPECT_EQ(opened, 1);
    EXPECT_EQ(events(), std::vector<Event>());
    EXPECT_EQ(stored().joinType, 1);
    EXPECT_EQ(stored().compareOperator, 2);
}

TEST_F(TheJoinDialog, CanBeChangedWithJoinModifyDisabledNonzero) {
    bindJoin();
    for (const std::int16_t value : {1, -1, 300}) {
        control.JoinModifyDisabled(value);
        open([this] {
            EXPECT_TRUE(stage->look("cboJoinType").enabled);
            EXPECT_TRUE(stage->look("cboJoinCompareOperator").enabled);
        });
    }
    EXPECT_EQ(opened, 3);
}

// Ok.

struct AChangeInTheJoinDialog : TheJoinDialog {
    AChangeInTheJoinDialog() { control.JoinModifyDisabled(1); }

    void change(std::int16_t type, std::int16_t compareOperator, const char* button = "cmdOk") {
        open([=, this] {
            stage->choose("cboJoinType", type);
            stage->choose("cboJoinCompareOperator", compareOperator);
            stage->clickButton(button);
        });
    }
};

TEST_F(AChangeInTheJoinDialog, IsWrittenToTheModelAndToldToTheHost) {
    bindJoin();
    change(3, 5);
    EXPECT_EQ(stored().joinType, 3);
    EXPECT_EQ(stored().compareOperator, 5);
    ASSERT_EQ(events(), std::vector{Event::JoinModified});
    EXPECT_EQ(stage->raised[0].arguments.Join.get(), &stored());
    EXPECT_EQ(stage->transcript, (std::vector<std::string>{"dialog", "event:JoinModified"}));
}

TEST_F(AChangeInTheJoinDialog, IsOfOneJoinAndNoOther) {
    join();
    join(2, 4);
    bind();
    put(2, 9000, 100, 9500, 100); // out of the first one's way
    change(3, 5);
    EXPECT_EQ(record(u"1")->JoinType(), 3);
    EXPECT_EQ(record(u"1")->CompareOperator(), 5);
    EXPECT_EQ(record(u"2")->JoinType(), 2);
    EXPECT_EQ(record(u"2")->CompareOperator(), 4);
    EXPECT_EQ(model->joinAt(2).joinType, 2);
}

TEST_F(AChangeInTheJoinDialog, MayBeOfTheTypeAlone) {
    bindJoin(0, 4);
    change(2, 4);
    EXPECT_EQ(stored().joinType, 2);
    EXPECT_EQ(stored().compareOperator, 4);
    EXPECT_EQ(events(), std::vector{Event::JoinModified});
}

TEST_F(AChangeInTheJoinDialog, MayBeOfTheOperatorAlone) {
    bindJoin(3, 0);
    change(3, 1);
    EXPECT_EQ(stored().joinType, 3);
    EXPECT_EQ(stored().compareOperator, 1);
    EXPECT_EQ(events(), std::vector{Event::JoinModified});
}

TEST_F(AChangeInTheJoinDialog, IsFollowedByTheCanvas) {
    bindJoin();
    ASSERT_EQ(stage->look("shpJoin(1)").shape, 1);
    change(1, 2);
    EXPECT_EQ(record()->JoinType(), 1);
    EXPECT_EQ(record()->CompareOperator(), 2);
    EXPECT_EQ(stage->look("shpJoin(1)").shape, 3);
    change(0, 2);
    EXPECT_EQ(record()->JoinType(), 0);
    EXPECT_EQ(stage->look("shpJoin(1)").shape, 1);
}

TEST_F(AChangeInTheJoinDialog, IsShownWhenTheDialogIsOpenedAgain) {
    bindJoin();
    change(2, 3);
    open([this] {
        EXPECT_EQ(shown("cboJoinType"), u"Right Outer");
        EXPECT_EQ(shown("cboJoinCompareOperator"), u">");
        stage->clickButton("cmdOk");
    });
    EXPECT_EQ(opened, 2);
    EXPECT_EQ(events(), std::vector{Event::JoinModified});
}

TEST_F(AChangeInTheJoinDialog, IsOnTheCanvasByTheTimeTheHostHears) {
    bindJoin();
    change(1, 0);
    ASSERT_EQ(events(), std::vector{Event::JoinModified});
    EXPECT_EQ(stage->raised[0].arguments.Join->JoinType(), record()->JoinType());
}

TEST_F(AChangeInTheJoinDialog, IsNoneWhenOkIsPressedAtOnce) {
    bindJoin(2, 4);
    model->calls->remember(true);
    open([this] {
        model->calls->forget();
        stage->clickButton("cmdOk");
    });
    EXPECT_EQ(events(), std::vector<Event>());
    for (const std::string& call : model->calls->calls()) EXPECT_FALSE(call.ends_with("=")) << call;
}

TEST_F(AChangeInTheJoinDialog, IsNoneWhenTheOldValuesAreChosenAgain) {
    bindJoin(2, 4);
    open([this] {
        stage->choose("cboJoinType", 0);
        stage->choose("cboJoinType", 2);
        stage->clickButton("cmdOk");
    });
    EXPECT_EQ(opened, 1);
    EXPECT_EQ(events(), std::vector<Event>());
}

// Lists shorter than the codes.

TEST_F(AChangeInTheJoinDialog, IsNoneWithATypeSwitchedOffAlthoughAnotherTypeIsShown) {
    bindJoin(1);
    control.UseJoinTypeNormal(false);
    open([this] {
        EXPECT_EQ(shown("cboJoinType"), u"Right Outer");
        stage->clickButton("cmdOk");
    });
    EXPECT_EQ(opened, 1);
    EXPECT_EQ(stored().joinType, 1);
    EXPECT_EQ(events(), std::vector<Event>());
}

TEST_F(AChangeInTheJoinDialog, IsReadBackByPositionWithTypesAndOperatorsSwitchedOff) {
    bindJoin(1, 1);
    control.UseJoinTypeNormal(false);
    control.UseJoinCompareOperatorEquals(false);
    open([this] {
        EXPECT_EQ(shown("cboJoinCompareOperator"), u"<");
        stage->choose("cboJoinType", 2);
        EXPECT_EQ(shown("cboJoinType"), u"Both Outer");
        stage->choose("cboJoinCompareOperator", 0);
        EXPECT_EQ(shown("cboJoinCompareOperator"), u"<>");
        stage->clickButton("cmdOk");
    });
    EXPECT_EQ(stored().joinType, 2);
    EXPECT_EQ(stored().compareOperator, 0);
}

// Cancel.

TEST_F(AChangeInTheJoinDialog, IsDroppedByCancel) {
    bindJoin(1, 2);
    change(3, 5, "cmdCancel");
    EXPECT_EQ(opened, 1);
    EXPECT_EQ(stored().joinType, 1);
    EXPECT_EQ(stored().compareOperator, 2);
    EXPECT_EQ(record()->JoinType(), 1);
    EXPECT_EQ(record()->CompareOperator(), 2);
    EXPECT_EQ(stage->look("shpJoin(1)").shape, 3);
    EXPECT_EQ(events(), std::vector<Event>());
}

TEST_F(AChangeInTheJoinDialog, IsDroppedByEscape) {
    bindJoin();
    open([this] {
        stage->choose("cboJoinType", 3);
        stage->key("cboJoinType", escape);
    });
    EXPECT_EQ(stored().joinType, 0);
    EXPECT_EQ(events(), std::vector<Event>());
    EXPECT_EQ(stage->boxes, Boxes());
    EXPECT_FALSE(stage->exists("frmJoinDefinition"));
}

TEST_F(AChangeInTheJoinDialog, IsDroppedByTheDialogsCross) {
    bindJoin(1, 2);
    open([this] {
        record()->JoinType(3); // as a dialog in between would have left it
        stage->choose("cboJoinType", 2);
    });
    EXPECT_EQ(opened, 1);
    EXPECT_EQ(record()->JoinType(), 1);
    EXPECT_EQ(stored().joinType, 1);
    EXPECT_EQ(events(), std::vector<Event>());
    EXPECT_EQ(stage->boxes, Boxes());
    EXPECT_FALSE(stage->exists("frmJoinDefinition"));
}

TEST_F(AChangeInTheJoinDialog, IsTakenBackFromAllFieldsOfTheRecordByCancel) {
    bindJoin(1, 2);
    const platform::Variant tag = record()->Tag();
    const std::int32_t left = record()->LeftTablehwnd();
    const std::int32_t right = record()->RightTablehwnd();
    open([this] {
        const Record changed = record();
        changed->JoinType(9);
        changed->CompareOperator(9);
        changed->LeftColumnName(u"x");
        changed->LeftColumnText(u"x");
        changed->RightColumnText(u"x");
        changed->RightColumnName(u"x");
        changed->LeftTableName(u"x");
        changed->RightTableName(u"x");
        changed->LeftTablehwnd(9);
        changed->RightTablehwnd(9);
        changed->JoinLineIndex(9);
        changed->LeftConnectorIndex(9);
        changed->RightConnectorIndex(9);
        changed->Index(9);
        changed->Tag(String(u"x"));
        stage->clickButton("cmdCancel");
    });
    const Record after = record();
    EXPECT_EQ(after->JoinType(), 1);
    EXPECT_EQ(after->CompareOperator(), 2);
    EXPECT_EQ(after->LeftColumnName(), u"Customer");
    EXPECT_EQ(after->LeftColumnText(), u"");
    EXPECT_EQ(after->RightColumnText(), u"");
    EXPECT_EQ(after->RightColumnName(), u"Number");
    EXPECT_EQ(after->LeftTableName(), u"Orders");
    EXPECT_EQ(after->RightTableName(), u"Customers");
    EXPECT_EQ(after->LeftTablehwnd(), left);
    EXPECT_EQ(after->RightTablehwnd(), right);
    EXPECT_EQ(after->JoinLineIndex(), 1);
    EXPECT_EQ(after->LeftConnectorIndex(), 2);
    EXPECT_EQ(after->RightConnectorIndex(), 1);
    EXPECT_EQ(after->Index(), 1);
    EXPECT_EQ(after->Tag(), tag);
}

} // namespace
