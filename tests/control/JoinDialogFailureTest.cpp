#include "control/JoinScene.h"

#include "control/joins/frmJoinDefinition.h"

using namespace zandor;

namespace {

using TalvikDBxZandor::frmJoinDefinition;

const Stage::Box invalidPosition = dialogErrorBox(u"P_SET Join", 380, u"Invalid property value");

struct AJoinDialogInTrouble : JoinScene {
    int opened = 0;

    AJoinDialogInTrouble() {
        join(1, 2);
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
    fake::Join& stored() { return model->joinAt(1); }
};

TEST_F(AJoinDialogInTrouble, ReportsATypeBeyondItsListAndLeavesTheOperatorsUnchosen) {
    record()->JoinType(4);
    open([this] {
        EXPECT_EQ(stage->boxes, Boxes{invalidPosition});
        EXPECT_EQ(stage->look("txtRightColumn").text, u"Number");
        EXPECT_EQ(stage->look("cboJoinType").listIndex, -1);
        EXPECT_EQ(stage->look("cboJoinCompareOperator").listIndex, -1);
    });
    EXPECT_EQ(opened, 1);
    EXPECT_EQ(events(), std::vector<Event>());
}

TEST_F(AJoinDialogInTrouble, ReportsAnOperatorBeyondItsListWithTheTypeChosen) {
    record()->CompareOperator(6);
    open([this] {
        EXPECT_EQ(stage->boxes, Boxes{invalidPosition});
        EXPECT_EQ(stage->look("cboJoinType").listIndex, 1);
        EXPECT_EQ(stage->look("cboJoinCompareOperator").listIndex, -1);
    });
    EXPECT_EQ(opened, 1);
}

TEST_F(AJoinDialogInTrouble, ReportsACodeBeyondAListThatIsShorterThanTheCodes) {
    control.UseJoinTypeBoth(false);
    record()->JoinType(3);
    open();
    EXPECT_EQ(opened, 1);
    EXPECT_EQ(stage->boxes, Boxes{invalidPosition});
}

TEST_F(AJoinDialogInTrouble, LeavesTheNamesAfterAFailedOneEmpty) {
    model->fail("ZDJoin.RightTable", platform::errors::invalidProcedureCall());
    open([this] {
        EXPECT_EQ(stage->look("txtLeftTable").text, u"Orders");
        EXPECT_EQ(stage->look("txtLeftColumn").text, u"Customer");
        EXPECT_EQ(stage->look("txtRightTable").text, u"");
        EXPECT_EQ(stage->look("txtRightColumn").text, u"");
        EXPECT_EQ(stage->look("cboJoinType").listIndex, -1);
    });
    EXPECT_EQ(opened, 1);
    EXPECT_EQ(stage->boxes, Boxes{dialogErrorBox(u"P_SET Join", 5, invalidCall)});
}

TEST_F(AJoinDialogInTrouble, ReportsEachMemberOfTheJoinThatCannotBeRead) {
    for (const char* member :
         {"ZDJoin.LeftTable", "ZDJoin.LeftColumn", "ZDJoin.RightTable", "ZDJoin.RightColumn",
          "ZDJoin.JoinType", "ZDJoin.CompareOperator", "ZDTable.Name", "ZDColumn.Name"}) {
        forget();
        model->fail(member, platform::errors::invalidProcedureCall());
        open();
        EXPECT_EQ(stage->boxes, Boxes{dialogErrorBox(u"P_SET Join", 5, invalidCall)}) << member;
    }
    EXPECT_EQ(opened, 8);
}

TEST_F(AJoinDialogInTrouble, ReportsAJoinWithoutATable) {
    stored().leftTable = nullptr;
    open();
    EXPECT_EQ(stage->boxes, Boxes{dialogErrorBox(u"P_SET Join", 91, objectNotSet)});
}

TEST_F(AJoinDialogInTrouble, StaysOpenWhenOkCannotWriteTheOperator) {
    open([this] {
        stage->choose("cboJoinType", 3);
        stage->choose("cboJoinCompareOperator", 5);
        model->fail("ZDJoin.CompareOperator=", platform::errors::invalidProcedureCall());
        stage->clickButton("cmdOk");
        // Both buttons report under the one name.
        EXPECT_EQ(stage->boxes, Boxes{dialogErrorBox(u"cmdCancel_Click", 5, invalidCall)});
        EXPECT_TRUE(stage->look("cboJoinType").visible);
        stage->clickButton("cmdCancel");
    });
    EXPECT_EQ(stored().joinType, 1);
    EXPECT_EQ(stored().compareOperator, 2);
}

TEST_F(AJoinDialogInTrouble, KeepsTheOperatorThatOkWroteBeforeTheTypeFailed) {
    open([this] {
        stage->choose("cboJoinType", 3);
        stage->choose("cboJoinCompareOperator", 5);
        model->fail("ZDJoin.JoinType=", platform::errors::invalidProcedureCall());
        stage->clickButton("cmdOk");
        stage->clickButton("cmdCancel");
    });
    EXPECT_EQ(stage->boxes, Boxes{dialogErrorBox(u"cmdCancel_Click", 5, invalidCall)});
    EXPECT_EQ(stored().joinType, 1);
    EXPECT_EQ(stored().compareOperator, 5);
}

TEST_F(AJoinDialogInTrouble, TellsOfNoChangeWhenOkCannotReadTheJoin) {
    open([this] {
        stage->choose("cboJoinType", 3);
        model->fail("ZDJoin.CompareOperator", platform::errors::invalidProcedureCall());
        stage->clickButton("cmdOk");
        stage->clickButton("cmdCancel");
    });
    EXPECT_EQ(stage->boxes, Boxes{dialogErrorBox(u"cmdCancel_Click", 5, invalidCall)});
    EXPECT_EQ(stored().joinType, 1);
    EXPECT_EQ(events(), std::vector<Event>());
}

// The menu command.

const Stage::Box notShown = controlErrorBox(u"mnuJoinShowDefinition_Click", 5, invalidCall);

TEST_F(AJoinDialogInTrouble, IsNotShownForAJoinThatTheModelDoesNotHold) {
    record()->Tag(String(u"unknown"));
    open();
    EXPECT_EQ(opened, 0);
    EXPECT_EQ(stage->boxes, Boxes{notShown});
    EXPECT_FALSE(stage->exists("frmJoinDefinition"));
    EXPECT_TRUE(stage->look("linJoin(1)").visible);
}

TEST_F(AJoinDialogInTrouble, IsNotShownForAJoinWithoutTag) {
    record()->Tag({});
    open();
    EXPECT_EQ(opened, 0);
    EXPECT_EQ(stage->boxes,
              Boxes{controlErrorBox(u"mnuJoinShowDefinition_Click", 13, u"Type mismatch")});
}

TEST_F(AJoinDialogInTrouble, IsNotShownWhenTheJoinRefusesTheTypeOfTheCanvas) {
    record()->JoinType(3);
    record()->CompareOperator(5);
    model->fail("ZDJoin.JoinType=", platform::errors::invalidProcedureCall());
    open();
    EXPECT_EQ(opened, 0);
    EXPECT_EQ(stage->boxes, Boxes{notShown});
    EXPECT_EQ(stored().joinType, 1);
    EXPECT_EQ(stored().compareOperator, 5);
}

TEST_F(AJoinDialogInTrouble, IsNotShownForACodeThatNoIntegerHolds) {
    record()->CompareOperator(32768);
    open();
    EXPECT_EQ(opened, 0);
    EXPECT_EQ(stage->boxes, Boxes{controlErrorBox(u"mnuJoinShowDefinition_Click", 6, u"Overflow")});
    EXPECT_EQ(stored().compareOperator, 2);
}

// The dialog by itself.

struct TheDialogByItself : JoinScene {
    TalvikDBxZandor::Life life{stage->toolkit(), {}};
    frmJoinDefinition dialog{life, stage->toolkit(), false};
};

TEST_F(TheDialogByItself, HasItsTextsOfDesignTime) {
    EXPECT_EQ(stage->look("frmJoinDefinition").text, u"Join Definition");
    EXPECT_EQ(stage->look("lblJoinType").text, u"Join Type");
    EXPECT_EQ(stage->look("cboJoinType").items,
              (std::vector<String>{u"Normal", u"Left Outer", u"Right Outer", u"Both Outer"}));
    EXPECT_EQ(stage->look("cboJoinCompareOperator").items, std::vector<String>());
    EXPECT_FALSE(dialog.JoinIsModified());
    EXPECT_EQ(dialog.JoinModifyDisabled(), 0);
}

TEST_F(TheDialogByItself, GivesBackTheFlagPutIntoIt) {
    dialog.JoinModifyDisabled(-5);
    EXPECT_EQ(dialog.JoinModifyDisabled(), -5);
    EXPECT_TRUE(stage->look("cboJoinType").enabled);
    dialog.JoinModifyDisabled(0);
    EXPECT_EQ(dialog.JoinModifyDisabled(), 0);
    EXPECT_FALSE(stage->look("cboJoinType").enabled);
}

TEST_F(TheDialogByItself, ReportsAMissingJoin) {
    dialog.Join(nullptr);
    EXPECT_EQ(stage->boxes, Boxes{dialogErrorBox(u"P_SET Join", 91, objectNotSet)});
}

TEST_F(TheDialogByItself, ReportsAMissingRecord) {
    dialog.JoinLine(nullptr);
    EXPECT_EQ(stage->boxes, Boxes{dialogErrorBox(u"P_SET JoinLine", 91, objectNotSet)});
}

} // namespace

TEST_F(TheDialogByItself, HasNothingToTakeBackWithoutARecord) {
    stage->onDialog = [this] {
        stage->clickButton("cmdCancel");
        EXPECT_EQ(stage->boxes, Boxes{dialogErrorBox(u"cmdCancel_Click", 91, objectNotSet)});
        forget();
        dialog.JoinLine(nullptr);
        stage->clickButton("cmdCancel");
        EXPECT_EQ(stage->boxes, (Boxes{dialogErrorBox(u"P_SET JoinLine", 91, objectNotSet),
                                       dialogErrorBox(u"cmdCancel_Click", 91, objectNotSet)}));
        dialog.form->Hide();
    };
    dialog.form->ShowModal();
}
