#include "GridStage.h"

namespace gridstage {

class ADragAcrossATable : public GridTest {
protected:
    ADragAcrossATable() {
        bind();
        stage->comforts().setFlags({.KeepsSelectionUnderDrags = true});
        stage->selectEntries(2, {id});
    }
    Texts selected(int table) {
        return stage->look("lstTable(" + std::to_string(table) + ")").selected;
    }
};

TEST_F(ADragAcrossATable, LeavesItsSelectionAsItWas) {
    stage->dragAcross(1, total, 2, name, synonymRow, 1);
    EXPECT_EQ(selected(2), (Texts{u"ID"}));
    EXPECT_EQ(fields(1), (Texts{u"ORDERS.TOTAL"}));
    EXPECT_EQ(selected(1), (Texts{u"TOTAL"}));
}

TEST_F(ADragAcrossATable, SelectsWhatItPassesInTheBareControl) {
    stage->comforts().setFlags({});
    stage->dragAcross(1, total, 2, name, synonymRow, 1);
    EXPECT_EQ(selected(2), (Texts{u"NAME"}));
}

TEST_F(ADragAcrossATable, ThatEndsInAJoinLeavesItsPartnerSelected) {
    stage->dragToEntry(1, customer, 2, name);
    EXPECT_EQ(model->joinCount(), 1);
    EXPECT_EQ(selected(2), (Texts{u"NAME"}));
}

TEST_F(ADragAcrossATable, LeavesSeveralSelectedEntries) {
    stage->selectEntries(2, {id, allColumns});
    stage->dragAcross(1, total, 2, name, synonymRow, 1);
    EXPECT_EQ(selected(2), (Texts{u"*", u"ID"}));
}

} // namespace gridstage
