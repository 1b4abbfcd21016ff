#include "Drawn.h"

#include "designer/DrawingArea.h"
#include "designer/statement/FindingPlace.h"
#include "frontends/qt/GridModel.h"
#include "frontends/qt/GridWidget.h"

#include <gmock/gmock.h>

using namespace zandor;

namespace {

class ThePlaceOfAFinding : public testing::Test {
protected:
    /// A table where the view begins, and one far from it.
    void SetUp() override {
        near = drawn.table(u"orders");
        far = drawn.table(u"customers", 20000, 14000);
        join = drawn.join(near, far);
        output = drawn.output(far, u"name");
        drawn.finish();
        area = std::make_unique<designer::DrawingArea>(drawn.document);
        area->resize(800, 600);
        area->show();
        QCoreApplication::processEvents();
    }

    void show(const model::Finding& finding) {
        designer::showPlace(area->control(), *drawn.query, finding);
    }

    bool isInView(const platform::Ref<model::Table>& table) {
        ZandorWidget& control = area->control();
        const int height = static_cast<int>(600 * 15 * control.upperPaneShare());
        const QRect seen(control.VisibleFrameLeft(), control.VisibleFrameTop(), 800 * 15, height);
        return seen.contains(QRect(table->Left(), table->Top(), table->Width(), table->Height()));
    }

    platform::qt::GridWidget& grid() {
        return dynamic_cast<platform::qt::GridWidget&>(
            *area->control().findChild<QWidget*>("sprColumn"));
    }

    static bool isSelected(const platform::Ref<model::Table>& table, const char16_t* column) {
        return table->columnNamed(column)->Selected();
    }

    Drawn drawn;
    platform::Ref<model::Table> near;
    platform::Ref<model::Table> far;
    platform::Ref<TalvikZandorLib::ZDJoin> join;
    platform::Ref<TalvikZandorLib::ZDColumnDefinition> output;
    std::unique_ptr<designer::DrawingArea> area;
};

model::Message said(const char16_t* words) {
    return model::say<model::MessageCode::asItStands>(words);
}

model::Finding at(const char16_t* table, const platform::String& joinKey = {},
                  const platform::String& definition = {}) {
    model::Finding finding{model::Finding::Kind::badCriterion, {}};
    finding.table = table;
    finding.join = joinKey;
    finding.definition = definition;
    return finding;
}

} // namespace

TEST_F(ThePlaceOfAFinding, IsATableBroughtIntoView) {
    ASSERT_FALSE(isInView(far));
    show(at(u"t2"));
    EXPECT_TRUE(isInView(far));
    EXPECT_EQ(far->Selected(), 1);
    EXPECT_EQ(near->Selected(), 0);
    show(at(u"t1"));
    EXPECT_TRUE(isInView(near));
    EXPECT_EQ(near->Selected(), 1);
}

TEST_F(ThePlaceOfAFinding, IsTheColumnOfAnOutputColumn) {
    show(at(u"", u"", output->Key()));
    EXPECT_TRUE(isInView(far));
    EXPECT_TRUE(isSelected(far, u"name"));
    EXPECT_FALSE(isSelected(far, u"id"));
}

TEST_F(ThePlaceOfAFinding, IsTheCellOfACriterion) {
    model::Finding finding = at(u"", u"", output->Key());
    finding.row = 5;
    show(finding);
    EXPECT_EQ(grid().currentRow(), 5);
    EXPECT_EQ(grid().currentCol(), 1);
}

TEST_F(ThePlaceOfAFinding, IsMarkedInItsCell) {
    model::Finding finding = at(u"", u"", output->Key());
    finding.row = 4;
    finding.message = said(u"There is no end.");
    model::Finding other{model::Finding::Kind::cartesianProduct, said(u"Too many rows.")};
    area->showFindings({other, finding});
    EXPECT_EQ(grid().model().note(4, 1), "There is no end.");
    // The mark outlives the control that is made when the query is changed from elsewhere.
    drawn.document.setQuery(drawn.query);
    EXPECT_EQ(grid().model().note(4, 1), "There is no end.");
    area->showFindings({});
    EXPECT_EQ(grid().model().note(4, 1), "");
}

TEST_F(ThePlaceOfAFinding, IsBothColumnsOfAJoinWithTheLeftOneInView) {
    show(at(u"", join->Key()));
    EXPECT_TRUE(isInView(near));
    EXPECT_TRUE(isSelected(near, u"customer_id"));
    EXPECT_TRUE(isSelected(far, u"id"));
    EXPECT_EQ(near->Selected(), 1);
}

TEST_F(ThePlaceOfAFinding, DoesNotScrollToWhatCanBeSeen) {
    show(at(u"t1"));
    EXPECT_EQ(area->control().VisibleFrameLeft(), 0);
    EXPECT_EQ(area->control().VisibleFrameTop(), 0);
}

TEST_F(ThePlaceOfAFinding, IsNowhereWhenItIsGone) {
    show(at(u"t99", u"j99", u"x99"));
    drawn.query->DeleteTable(far);
    show(at(u"t2", join->Key(), output->Key()));
    EXPECT_EQ(area->control().VisibleFrameLeft(), 0);
}
