#include "../control/GridStage.h"

#include <Zandor/headless/Intrinsic.h>
#include <Zandor/headless/Toolkit.h>

using namespace zandor;

namespace gridstage {

/// What a join's line and a table's title say with their comforts, and do not say without.
class ComfortableLooks : public GridTest {
protected:
    platform::headless::Toolkit& headless() {
        return dynamic_cast<platform::headless::Toolkit&>(stage->toolkit());
    }
    const platform::LineNotes& notes() {
        return headless().find<platform::headless::Line>("linJoin(1)").notes();
    }
    void join(std::int16_t type, std::int16_t compareOperator, bool turned = false) {
        auto& from = turned ? customers : orders;
        auto& to = turned ? orders : customers;
        model->joins.items = {};
        model->join(from, u"ID", to, u"ID", type)->compareOperator = compareOperator;
        bind();
    }
};

TEST_F(ComfortableLooks, AreThoseOfTheBareControlUntilTheyAreWanted) {
    join(3, 2);
    EXPECT_EQ(notes(), platform::LineNotes());
    EXPECT_FALSE(stage->comforts().titleClicked(1));
    EXPECT_FALSE(stage->exists("mnuTableRename"));
}

TEST_F(ComfortableLooks, NameTheTablesThatKeepAllTheirRows) {
    stage->comforts().setFlags({.ReadsJoins = true});
    const String all = u"all";
    const String none;
    for (const bool turned : {false, true}) {
        join(0, 0, turned);
        EXPECT_EQ(notes().First + notes().Middle + notes().Second, none);
        join(1, 0, turned);
        EXPECT_EQ(notes().First, turned ? none : all);
        EXPECT_EQ(notes().Second, turned ? all : none);
        join(2, 0, turned);
        EXPECT_EQ(notes().First, turned ? all : none);
        EXPECT_EQ(notes().Second, turned ? none : all);
        join(3, 0, turned);
        EXPECT_EQ(notes().First, all);
        EXPECT_EQ(notes().Second, all);
    }
}

TEST_F(ComfortableLooks, ReadAnOperatorFromWestToEast) {
    stage->comforts().setFlags({.ReadsJoins = true});
    join(0, 2);
    EXPECT_EQ(notes().Middle, u"<");
    join(0, 2, true);
    EXPECT_EQ(notes().Middle, u">");
    EXPECT_EQ(notes().Sentence,
              u"the rows of CUSTOMERS and ORDERS that match: CUSTOMERS.ID < ORDERS.ID");
}

TEST_F(ComfortableLooks, FollowATableToTheOtherSide) {
    stage->comforts().setFlags({.ReadsJoins = true});
    join(1, 0);
    stage->moveTable(1, 9000, 300);
    EXPECT_EQ(notes().First, u"");
    EXPECT_EQ(notes().Second, u"all");
}

TEST_F(ComfortableLooks, GoWithTheirComfort) {
    stage->comforts().setFlags({.ReadsJoins = true});
    join(3, 2);
    stage->comforts().setFlags({});
    EXPECT_EQ(notes(), platform::LineNotes());
}

TEST_F(ComfortableLooks, PutRenameIntoTheMenuOfATitle) {
    bind();
    stage->comforts().setFlags({.HasTitleMenu = true});
    String renamed;
    stage->comforts().RenameRequested = [&](const String& key) { renamed = key; };
    willChoose("mnuTableRename");
    EXPECT_TRUE(stage->comforts().titleClicked(2));
    EXPECT_EQ(renamed, customers->key);
    Texts names;
    for (const auto& entry : menu) names.push_back(entry.name);
    EXPECT_EQ(names,
              (Texts{u"mnuJoinShowDefinition", u"mnuJoinDelete", u"mnuJoinSep",
                     u"mnuTableDefinitionCopy", u"mnuTableDefinitionPaste",
                     u"mnuTableDefinitionDelete", u"mnuTableRename", u"mnuTableDefinitionSep",
                     u"mnuColumnDefinitionPaste", u"mnuColumnDefinitionDelete"}));
    willChoose({});
    menuOverCell(synonymRow, 1);
    ASSERT_EQ(menu.at(6).name, u"mnuTableRename");
    EXPECT_FALSE(menu.at(6).visible) << "over a cell";
}

TEST_F(ComfortableLooks, DivideThePanesWhereTheHostSays) {
    bind();
    control().UpperPaneShare(0.7F);
    EXPECT_FLOAT_EQ(stage->look("sprColumn").bounds.Top, 6300);
    EXPECT_FLOAT_EQ(stage->look("sprColumn").bounds.Height, 2700);
    control().UpperPaneShare(7);
    EXPECT_FLOAT_EQ(stage->look("sprColumn").bounds.Top, 8550) << "at most 0.95";
}

} // namespace gridstage
