#include "control/GridStage.h"

#include <Zandor/headless/Toolkit.h>

namespace gridstage {

namespace {

namespace headless = zandor::platform::headless;

/// What comforts show, as only this toolkit tells it: a join, and a table to rename.
class WhatComfortsShow : public GridTest {
protected:
    WhatComfortsShow() {
        join = model->join(orders, u"CUSTOMER", customers, u"ID", 1, 4);
        bind();
        stage->comforts().setFlags(
            {.ReadsJoins = true, .HasTitleMenu = true, .KeepsSelectionUnderDrags = true});
    }

    headless::Toolkit& toolkit() { return dynamic_cast<headless::Toolkit&>(stage->toolkit()); }
    const zandor::platform::LineNotes& notes() {
        return toolkit().find<headless::Line>("linJoin(1)").notes();
    }

    Ref<fake::Join> join;
};

TEST_F(WhatComfortsShow, IsInTheWordsOfTheMoment) {
    zandor::platform::Words words;
    words.Rename = u"&Umbenennen …";
    words.All = u"alle";
    stage->comforts().setWords(words);
    EXPECT_EQ(stage->look("mnuTableRename").text, u"&Umbenennen …");
    EXPECT_EQ(notes().First, u"alle");
}

TEST_F(WhatComfortsShow, ReadsAnOperatorFromWestToEast) {
    const Texts forth = {u"<>", u"<", u">", u"<=", u">="};
    const Texts back = {u"<>", u">", u"<", u">=", u"<="};
    for (std::int16_t code = 1; code <= 5; ++code) {
        join->compareOperator = code;
        orders->place(300, 300, 2400, 2400);
        control().ShowAnew();
        control().UserControl_Paint();
        Backstage::DrawJoins(control());
        EXPECT_EQ(notes().Middle, forth[static_cast<std::size_t>(code) - 1]) << code;
        stage->moveTable(1, 9000, 300);
        EXPECT_EQ(notes().Middle, back[static_cast<std::size_t>(code) - 1]) << code;
        EXPECT_EQ(notes().Second, stage->comforts().words().All) << "it is the left table's end";
        stage->moveTable(1, 300, 300);
    }
}

TEST_F(WhatComfortsShow, HasEntriesThatLookAsTheyAreBehindADrag) {
    stage->selectEntries(2, {id});
    stage->dragAcross(1, total, 2, name, synonymRow, 1);
    const auto& list = toolkit().find<headless::Tabulet>("lstTable(2)");
    for (const std::int32_t entry : {allColumns, id, name})
        EXPECT_EQ(list.entry(entry).drawnSelected(), entry == id) << entry;
}

} // namespace

} // namespace gridstage
