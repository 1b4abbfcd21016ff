#include "GridStage.h"

using namespace zandor;

namespace gridstage {

class TheContextMenu : public GridTest {
protected:
    TheContextMenu() {
        model->definition(customers, u"ID");
        model->join(orders, u"ID", customers, u"ID");
        bind();
    }

    void menuOverCanvas(float X, float Y, const std::string& chosen = {}) {
        willChoose(chosen);
        stage->pressCanvas(right, X, Y);
        stage->releaseCanvas(right, X, Y);
    }

    const Stage::Entry& entry(platform::StringView wanted) const {
        for (const auto& shown : menu)
            if (shown.name == wanted) return shown;
        throw std::logic_error("the menu has no such entry");
    }

    static constexpr float blankX = 4500;
    static constexpr float blankY = 4200;
};

TEST_F(TheContextMenu, HoldsItsNineEntriesInOrder) {
    menuOverCell(synonymRow, 1);
    Names names;
    for (const auto& shown : menu) names.push_back(platform::toUtf8(shown.name));
    EXPECT_EQ(names, (Names{"mnuJoinShowDefinition", "mnuJoinDelete", "mnuJoinSep",
                            "mnuTableDefinitionCopy", "mnuTableDefinitionPaste",
                            "mnuTableDefinitionDelete", "mnuTableDefinitionSep",
                            "mnuColumnDefinitionPaste", "mnuColumnDefinitionDelete"}));
}

TEST_F(TheContextMenu, HasEveryEntryDisabledAwayFromEveryJoin) {
    menuOverCanvas(blankX, blankY);
    ASSERT_EQ(menu.size(), 9U);
    EXPECT_EQ(enabled(), Names{});
}

TEST_F(TheContextMenu, OffersTheJoinCommandsOverAJoin) {
    const auto line = stage->look("linJoin(1)");
    menuOverCanvas((line.X1 + line.X2) / 2, (line.Y1 + line.Y2) / 2);
    EXPECT_EQ(enabled(), (Names{"mnuJoinShowDefinition", "mnuJoinDelete"}));
}

TEST_F(TheContextMenu, DeletesTheJoinUnderIt) {
    const auto line = stage->look("linJoin(1)");
    menuOverCanvas((line.X1 + line.X2) / 2, (line.Y1 + line.Y2) / 2, "mnuJoinDelete");
    EXPECT_FALSE(stage->exists("linJoin(1)"));
    EXPECT_EQ(model->joinCount(), 0);
    EXPECT_EQ(events(), (Names{"Activate", "JoinRemoved"}));
}

TEST_F(TheContextMenu, OffersNoPasteOverTheGridWithoutACopy) {
    menuOverCell(synonymRow, 1);
    EXPECT_EQ(enabled(), Names{"mnuColumnDefinitionDelete"});
}

TEST_F(TheContextMenu, OffersPasteOverTheGridWithACopy) {
    copy(1, {id});
    menuOverCell(synonymRow, 1);
    EXPECT_EQ(enabled(), (Names{"mnuColumnDefinitionPaste", "mnuColumnDefinitionDelete"}));
}

TEST_F(TheContextMenu, OffersNoDeletionOverABlankColumn) {
    menuOverCell(synonymRow, 2);
    EXPECT_EQ(enabled(), Names{});
}

TEST_F(TheContextMenu, OffersNoDeletionOverTheLabelColumn) {
    menuOverCell(synonymRow, 0);
    EXPECT_EQ(enabled(), Names{});
}

TEST_F(TheContextMenu, OffersCopyAndDeletionOverATable) {
    menuOverEntry(1, id);
    EXPECT_EQ(enabled(), (Names{"mnuTableDefinitionCopy", "mnuTableDefinitionDelete"}));
}

TEST_F(TheContextMenu, OffersAJoinOverATableOtherThanTheCopiedOne) {
    copy(1, {id});
    menuOverEntry(1, customer);
    EXPECT_EQ(enabled(), (Names{"mnuTableDefinitionCopy", "mnuTableDefinitionDelete"}));
    menuOverEntry(2, id);
    EXPECT_EQ(enabled(), (Names{"mnuTableDefinitionCopy", "mnuTableDefinitionPaste",
                                "mnuTableDefinitionDelete"}));
}

TEST_F(TheContextMenu, ComparesTheTagsOfTheTablesAndNotTheirPlaces) {
    copy(1, {id});
    Backstage::lstTable(control())(2)->Tag(u"tORDERS");
    menuOverEntry(2, id);
    EXPECT_EQ(enabled(), (Names{"mnuTableDefinitionCopy", "mnuTableDefinitionDelete"}));
}

TEST_F(TheContextMenu, OffersNothingForAnUnknownSource) {
    copy(1, {id});
    willChoose({});
    Backstage::PopupZandorMenu(control(), std::int16_t{3}, 0.0F, 0.0F);
    EXPECT_EQ(enabled(), Names{});
}

TEST_F(TheContextMenu, OpensAsEverAfterTheTableCopiedFromHasGone) {
    copy(1, {id});
    stage->closeTable(1);
    forget();
    menuOverEntry(2, id);
    EXPECT_EQ(stage->boxes, Boxes{});
    EXPECT_EQ(enabled(), (Names{"mnuTableDefinitionCopy", "mnuTableDefinitionPaste",
                                "mnuTableDefinitionDelete"}));
}

TEST_F(TheContextMenu, RaisesActivateBeforeItOpens) {
    menuOverCell(synonymRow, 1);
    EXPECT_EQ(stage->transcript, (Names{"event:Activate", "message:0", "menu", "message:1"}));
}

TEST_F(TheContextMenu, OffersWhatTheHostLeavesOfItInActivate) {
    stage->onEvent = [this] {
        EXPECT_FALSE(Backstage::mMenuPrepared(control()));
        control().ReadOnly(true);
    };
    menuOverEntry(1, id);
    EXPECT_EQ(enabled(), Names{"mnuTableDefinitionCopy"});
    EXPECT_EQ(events(), Names{"Activate"});
}

TEST_F(TheContextMenu, TellsTheWindowWhenItOpensAndWhenItHasClosed) {
    menuOverEntry(1, id);
    ASSERT_EQ(stage->messages.size(), 2U);
    EXPECT_EQ(stage->messages[0].name, u"TALVIKDISABLEVELT");
    EXPECT_EQ(stage->messages[0].wParam, 0U);
    EXPECT_FALSE(stage->messages[0].menuOpen);
    EXPECT_EQ(stage->messages[1].name, u"TALVIKDISABLEVELT");
    EXPECT_EQ(stage->messages[1].wParam, 1U);
    EXPECT_FALSE(stage->messages[1].menuOpen);
}

TEST_F(TheContextMenu, TellsTheWindowOfEachOpening) {
    menuOverCell(synonymRow, 1);
    menuOverCanvas(blankX, blankY);
    std::vector<std::uintptr_t> parameters;
    for (const auto& message : stage->messages) parameters.push_back(message.wParam);
    EXPECT_EQ(parameters, (std::vector<std::uintptr_t>{0, 1, 0, 1}));
}

TEST_F(TheContextMenu, HasRunTheChosenEntryBeforeItTellsOfItsClosing) {
    menuOverCell(synonymRow, 1, "mnuColumnDefinitionDelete");
    EXPECT_EQ(stage->transcript,
              (Names{"event:Activate", "message:0", "menu", "event:ColumnRemoved", "message:1"}));
}

TEST_F(TheContextMenu, ReadsItsCaptionsAnewAtEachOpening) {
    menuOverCell(synonymRow, 1);
    EXPECT_EQ(entry(u"mnuColumnDefinitionDelete").caption, u"Delete Coumn");
    control().LNGMnuShowJoinDef = u"A";
    control().LNGMnuDelJoin = u"B";
    control().LNGMnuCopyCol = u"C";
    control().LNGMnuCreateJoin = u"D";
    control().LNGMnuDelTable = u"E";
    control().LNGMnuPasteCol = u"F";
    control().LNGMnuDelCol = u"G";
    menuOverCell(synonymRow, 1);
    Texts captions;
    for (const auto& shown : menu)
        if (shown.name.find(u"Sep") == String::npos) captions.push_back(shown.caption);
    EXPECT_EQ(captions, (Texts{u"A", u"B", u"C", u"D", u"E", u"F", u"G"}));
}

TEST_F(TheContextMenu, DisablesEverythingWhenItOpensUnprepared) {
    copy(1, {id});
    menuOverCell(synonymRow, 1);
    ASSERT_EQ(enabled().size(), 2U);
    ASSERT_FALSE(Backstage::mMenuPrepared(control()));
    willChoose({});
    Backstage::mnuZandor(control())->PopupMenuAtMouse();
    EXPECT_EQ(enabled(), Names{});
}

TEST_F(TheContextMenu, IsPreparedFromTheCheckUntilItOpens) {
    Backstage::CheckMenus(control(), std::int16_t{2}, 300.0F, 400.0F);
    EXPECT_TRUE(Backstage::mMenuPrepared(control()));
    Backstage::mnuZandor_Click(control());
    EXPECT_FALSE(Backstage::mMenuPrepared(control()));
}

TEST_F(TheContextMenu, RemembersWhereItOpened) {
    menuOverCanvas(blankX, blankY);
    EXPECT_EQ(Backstage::mPopupX(control()), blankX);
    EXPECT_EQ(Backstage::mPopupY(control()), blankY);
    menuOverEntry(1, id);
    EXPECT_EQ(Backstage::mPopupX(control()), 0);
    EXPECT_EQ(Backstage::mPopupY(control()), 0);
}

TEST_F(TheContextMenu, ClosesAnOpenEditorWhereverItOpens) {
    press(left, synonymRow, 1);
    ASSERT_TRUE(shows("fraValue"));
    Backstage::PopupZandorMenu(control(), std::int16_t{0}, 0.0F, 0.0F);
    EXPECT_FALSE(shows("fraValue"));
}

} // namespace gridstage
