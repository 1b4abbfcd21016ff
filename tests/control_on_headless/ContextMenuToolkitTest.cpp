#include "control/GridStage.h"

#include <Zandor/headless/Toolkit.h>

using namespace zandor;

namespace gridstage {

namespace headless = platform::headless;

/// The context menu where the window system does not play along.
class TheContextMenuOnAFailingToolkit : public GridTest {
protected:
    TheContextMenuOnAFailingToolkit() {
        model->definition(orders, u"ID");
        bind();
    }

    headless::Toolkit& toolkit() { return dynamic_cast<headless::Toolkit&>(stage->toolkit()); }
    void fail(const std::string& call) { toolkit().faults.failNext(call, refusal()); }
};

TEST_F(TheContextMenuOnAFailingToolkit, OpensWithoutAMessageWhenRegistrationFails) {
    toolkit().registrationFails = true;
    menuOverCell(synonymRow, 1);
    EXPECT_EQ(menu.size(), 9U);
    EXPECT_EQ(stage->transcript, (Names{"event:Activate", "menu"}));
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(TheContextMenuOnAFailingToolkit, SendsAPlaceForAnAnswerWithEachMessage) {
    menuOverCell(synonymRow, 1);
    ASSERT_EQ(toolkit().messages().size(), 2U);
    EXPECT_TRUE(toolkit().messages()[0].hasLParam);
    EXPECT_TRUE(toolkit().messages()[1].hasLParam);
}

TEST_F(TheContextMenuOnAFailingToolkit, ReportsAMenuThatCannotBeShown) {
    fail("mnuZandor.PopupMenuAtMouse");
    menuOverCell(synonymRow, 1);
    EXPECT_EQ(stage->boxes, Boxes{report(u"PopupZandorMenu", refusal())});
    EXPECT_EQ(stage->messages.size(), 1U);
}

TEST_F(TheContextMenuOnAFailingToolkit, ReportsACheckThatFailsAndOpensAllTheSame) {
    fail("sprColumn.TextMatrix");
    menuOverCell(synonymRow, 1);
    EXPECT_EQ(stage->boxes, Boxes{report(u"CheckMenus", refusal())});
    EXPECT_EQ(menu.size(), 9U);
    EXPECT_EQ(enabled(), Names{});
}

TEST_F(TheContextMenuOnAFailingToolkit, DisablesTheCommandsInTheirOrderUntilOneFails) {
    copy(1, {id});
    Backstage::CheckMenus(control(), std::int16_t{2}, grid().ColPos(1), 0.0F);
    fail("mnuJoinDelete.Enabled");
    Backstage::SwitchSpecialMenusOff(control());
    EXPECT_EQ(stage->boxes, Boxes{report(u"SwitchSpecialMenusOff", refusal())});
    EXPECT_FALSE(stage->look("mnuColumnDefinitionDelete").enabled);
    EXPECT_FALSE(stage->look("mnuColumnDefinitionPaste").enabled);
}

TEST_F(TheContextMenuOnAFailingToolkit, KeepsItsOldCaptionsBehindOneThatFails) {
    control().LNGMnuDelJoin = u"new";
    control().LNGMnuDelCol = u"new";
    fail("mnuTableDefinitionCopy.Caption");
    menuOverCell(synonymRow, 1);
    EXPECT_EQ(stage->boxes, Boxes{report(u"mnuZandor_Click", refusal())});
    EXPECT_EQ(stage->look("mnuJoinDelete").text, u"new");
    EXPECT_EQ(stage->look("mnuColumnDefinitionDelete").text, u"&Delete Column");
}

} // namespace gridstage
