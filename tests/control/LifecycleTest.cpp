#include "control/ShellFixture.h"

namespace {

class ANewControl : public AControl {};
class AClosingControl : public AControl {};

} // namespace

TEST_F(ANewControl, HasSixteenFreeTableSlotsAndSixtyFourFreeJoinSlots) {
    const auto& tables = Backstage::mTableFreeList(zandor());
    const auto& joins = Backstage::mJoinFreeList(zandor());
    ASSERT_TRUE(tables && joins);
    EXPECT_EQ(tables->RangeFrom(), 1);
    EXPECT_EQ(tables->RangeTo(), 16);
    EXPECT_EQ(tables->FreeCount(), 16);
    EXPECT_EQ(joins->RangeFrom(), 1);
    EXPECT_EQ(joins->RangeTo(), 64);
    EXPECT_EQ(joins->FreeCount(), 64);
}

TEST_F(ANewControl, HasTheRowTitlesInItsGrid) {
    const StringView titles[] = {u"Field:",    u"Synonym:", u"Sort:", u"Visible:",
                                 u"Criteria:", u"Or:",      u""};
    for (std::int32_t row = 0; row < 7; ++row) EXPECT_EQ(stage->cell(row, 0), titles[row]);
}

TEST_F(ANewControl, HidesItsGrid) {
    EXPECT_TRUE(zandor().OnlyJoin());
    EXPECT_FALSE(look("sprColumn").visible);
}

TEST_F(ANewControl, HoldsNoModelAndShowsNoTable) {
    EXPECT_FALSE(Backstage::mModel(zandor()));
    EXPECT_EQ(Backstage::lstTable(zandor()).Count(), 1U);
    EXPECT_FALSE(stage->exists("lstTable(1)"));
    EXPECT_FALSE(look("lstTable(0)").visible) << "the template is never seen";
}

TEST_F(ANewControl, OffersTheChoicesOfItsCellEditors) {
    EXPECT_EQ(look("cobSortOrder").items,
              (std::vector<String>{u"(None)", u"Ascending", u"Descending"}));
    EXPECT_EQ(look("cobVisibility").items, (std::vector<String>{u"Visible", u"Not Visible"}));
    for (const char* button : {"cmdSetSortOrder", "cmdSetVisibility", "cmdSetTextValue"})
        EXPECT_EQ(look(button).text, u"&Set") << button;
}

TEST_F(ANewControl, HasItsCellEditorsClosed) {
    stage->repaint();
    for (const char* frame : {"fraSortOrder", "fraVisibility", "fraValue"})
        EXPECT_FALSE(look(frame).visible) << frame;
}

TEST(AControlLeftAsItWasMade, ShowsItsClosingTracesWhenItIsClosed) {
    fake::Library library;
    const auto stage = Stage::open(library);
    stage->boxes.clear();
    stage->closeControl();
    ASSERT_GE(stage->boxes.size(), 2U);
    const Stage::Box closing{u"UserControl_Terminate", u"TalvikDBxZandor.Zandor", 4096};
    const Stage::Box terminating{u"Terminate", u"TalvikDBxZandor.Zandor", 4096};
    EXPECT_EQ(stage->boxes[0], closing);
    EXPECT_EQ(stage->boxes[1], terminating);
}

TEST_F(AClosingControl, ShowsNoBoxWithTheTracesOff) {
    auto model = library.newModel();
    model->table(u"ORDERS", {u"ID"});
    bind(model);
    stage->closeControl();
    EXPECT_TRUE(stage->boxes.empty());
}

TEST_F(AClosingControl, ReleasesTheModel) {
    auto model = library.newModel();
    bind(model);
    EXPECT_GT(model.use_count(), 1);
    stage->closeControl();
    EXPECT_EQ(model.use_count(), 1);
}

TEST_F(AClosingControl, TerminatesAsTheHostCould) {
    auto model = library.newModel();
    model->table(u"ORDERS", {u"ID"});
    bind(model);
    Backstage::UserControl_Terminate(zandor());
    EXPECT_FALSE(stage->exists("lstTable(1)"));
    EXPECT_EQ(zandor().DeletedTable, u"ORDERS");
    EXPECT_EQ(model.use_count(), 1) << "an empty model has taken its place";
}
