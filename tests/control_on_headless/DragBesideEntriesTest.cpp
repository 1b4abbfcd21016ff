#include "../control/GridStage.h"

#include <Zandor/headless/User.h>

using namespace zandor;

namespace gridstage {

/// A drag over an entry of another table to a place below its entries.
class ADragPastAnEntry : public GridTest {
protected:
    ADragPastAnEntry() {
        bind();
        stage->selectEntries(2, {id});
    }

    void dragPast(std::int32_t passed) {
        auto& toolkit = dynamic_cast<platform::headless::Toolkit&>(stage->toolkit());
        platform::headless::User user(toolkit);
        user.pressEntry("lstTable(1)", customer, left);
        user.moveOverEntry("lstTable(1)", customer, left);
        auto& list = *Backstage::lstTable(control())(2);
        for (float y = 0; y < list.Height(); y += 15) {
            if (list.ColumnAt(300, y) != list.ColumnItems().Item(passed)) continue;
            user.dragOver("lstTable(2)", 300, y);
            break;
        }
        ASSERT_EQ(stage->look("lstTable(2)").selected, Texts{u"NAME"}) << "on its way";
        user.dropOn("lstTable(2)", 300, list.Height() - 150);
    }
};

TEST_F(ADragPastAnEntry, LeavesTheSelectionAsItWas) {
    stage->comforts().setFlags({.KeepsSelectionUnderDrags = true});
    dragPast(name);
    EXPECT_EQ(model->joinCount(), 0);
    EXPECT_EQ(stage->look("lstTable(2)").selected, Texts{u"ID"});
}

TEST_F(ADragPastAnEntry, LeavesItSelectedInTheBareControl) {
    dragPast(name);
    EXPECT_EQ(stage->look("lstTable(2)").selected, Texts{u"NAME"});
}

} // namespace gridstage
