#include "GridStage.h"

namespace gridstage {

class TheEntriesThatComeOut : public GridTest {
protected:
    TheEntriesThatComeOut() {
        named = model->definition(customers, u"NAME");
        model->definition(orders, u"ID");
        bind();
        stage->comforts().setFlags({.AddsOnDoubleClick = true, .MarksOutput = true});
    }

    Texts marked(int table) {
        return stage->look("lstTable(" + std::to_string(table) + ")").output;
    }

    Ref<fake::Definition> named;
};

TEST_F(TheEntriesThatComeOut, AreMarkedInTheirTables) {
    EXPECT_EQ(marked(1), Texts{u"ID"});
    EXPECT_EQ(marked(2), Texts{u"NAME"});
}

TEST_F(TheEntriesThatComeOut, FollowWhatIsAddedAndDeleted) {
    stage->doubleClickEntry(1, total);
    EXPECT_EQ(marked(1), (Texts{u"ID", u"TOTAL"}));
    menuOverCell(synonymRow, 1, "mnuColumnDefinitionDelete");
    EXPECT_EQ(marked(2), Texts{});
}

TEST_F(TheEntriesThatComeOut, AreThoseThatAreVisible) {
    press(left, visibleRow, 1);
    stage->choose("cobVisibility", 1);
    stage->clickButton("cmdSetVisibility");
    EXPECT_EQ(marked(2), Texts{});
    EXPECT_EQ(marked(1), Texts{u"ID"});
}

TEST_F(TheEntriesThatComeOut, AreThoseOfTheModelBoundLast) {
    const auto other = library.newModel();
    const auto table = other->table(u"OTHERS", {u"*", u"ID", u"TEXT"});
    table->place(300, 300, 2400, 2400);
    other->definition(table, u"TEXT");
    control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(other));
    EXPECT_EQ(marked(1), Texts{u"TEXT"});
}

TEST_F(TheEntriesThatComeOut, FollowAModelThatIsShownAnew) {
    named->visible = false;
    model->definition(orders, u"TOTAL");
    control().ShowAnew();
    EXPECT_EQ(marked(1), (Texts{u"ID", u"TOTAL"}));
    EXPECT_EQ(marked(2), Texts{});
}

TEST_F(TheEntriesThatComeOut, StayWhenAnotherTableGoes) {
    stage->closeTable(2);
    EXPECT_EQ(marked(1), Texts{u"ID"});
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(TheEntriesThatComeOut, AreUnmarkedWhenTheComfortIsSwitchedOff) {
    stage->comforts().setFlags({});
    EXPECT_EQ(marked(1), Texts{});
    EXPECT_EQ(marked(2), Texts{});
}

} // namespace gridstage
