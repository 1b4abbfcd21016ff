#include "OrderedModel.h"

using namespace zandor;

namespace gridstage {

class AColumnMovedByHand : public GridTest {
protected:
    AColumnMovedByHand() {
        model = ordered;
        orders = model->table(u"ORDERS", {u"*", u"ID", u"CUSTOMER", u"TOTAL"});
        orders->place(300, 300, 2400, 2400);
        for (const char16_t* column : {u"ID", u"CUSTOMER", u"TOTAL"})
            model->definition(orders, column);
        bind();
        stage->comforts().setFlags(
            {.KeepsTyping = true, .OffersFields = true, .MovesColumns = true});
    }

    Texts keys() const {
        Texts result;
        for (const auto& each : platform::Each(model->definitions.items))
            result.push_back(each->Key());
        return result;
    }

    const Ref<OrderedModel> ordered = platform::makeRef<OrderedModel>(library.calls);
};

TEST_F(AColumnMovedByHand, StandsWhereItsFieldWasDragged) {
    stage->dragField(1, 3);
    EXPECT_EQ(fields(4), (Texts{u"CUSTOMER", u"TOTAL", u"ID", u""}));
    EXPECT_EQ(keys(), (Texts{u"x2", u"x3", u"x1"}));
    EXPECT_EQ(events(), Names{"ColumnModified"});
    stage->dragField(3, 2);
    EXPECT_EQ(fields(4), (Texts{u"CUSTOMER", u"ID", u"TOTAL", u""}));
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AColumnMovedByHand, StandsLastWhenItIsDraggedBehindAll) {
    stage->dragField(1, 5);
    EXPECT_EQ(fields(5), (Texts{u"CUSTOMER", u"TOTAL", u"ID", u"", u""}));
}

TEST_F(AColumnMovedByHand, OffersNoFieldsAfterADrag) {
    stage->dragField(1, 2);
    EXPECT_FALSE(stage->exists("lstFields") && shows("lstFields"));
}

TEST_F(AColumnMovedByHand, GoesByAltAndAnArrowWithTheCurrentCell) {
    grid().Row(criteriaRow);
    grid().Col(1);
    stage->moveCurrentColumn(1);
    stage->moveCurrentColumn(1);
    EXPECT_EQ(fields(4), (Texts{u"CUSTOMER", u"TOTAL", u"ID", u""}));
    EXPECT_EQ(grid().Col(), 3);
    EXPECT_EQ(grid().Row(), criteriaRow);
    stage->moveCurrentColumn(1);
    EXPECT_EQ(grid().Col(), 3) << "there is nowhere to go";
    stage->moveCurrentColumn(-1);
    EXPECT_EQ(fields(4), (Texts{u"CUSTOMER", u"ID", u"TOTAL", u""}));
    EXPECT_EQ(events().size(), 3U);
}

TEST_F(AColumnMovedByHand, TakesOverWhatWasBeingTyped) {
    press(left, criteriaRow, 1);
    stage->type("txtValue", u"> 7");
    stage->dragField(1, 2);
    EXPECT_EQ(stage->cell(criteriaRow, 2), u"> 7");
    EXPECT_EQ(events(), (Names{"ColumnModified", "ColumnModified"}));
}

TEST_F(AColumnMovedByHand, StaysWhenItIsBlank) {
    stage->dragField(5, 1);
    EXPECT_EQ(fields(4), (Texts{u"ID", u"CUSTOMER", u"TOTAL", u""}));
    EXPECT_EQ(events(), Names{});
}

TEST_F(AColumnMovedByHand, StaysWhereTheModelKeepsNoOrder) {
    const auto plain = library.newModel();
    const auto table = plain->table(u"ORDERS", {u"*", u"ID", u"TOTAL"});
    plain->definition(table, u"ID");
    plain->definition(table, u"TOTAL");
    control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(plain));
    forget();
    stage->dragField(1, 2);
    grid().Col(1);
    stage->moveCurrentColumn(1);
    EXPECT_EQ(stage->cell(fieldRow, 1), u"ID");
    EXPECT_EQ(events(), Names{});
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AColumnMovedByHand, StaysInTheBareControl) {
    stage->comforts().setFlags({});
    stage->dragField(1, 3);
    grid().Col(1);
    stage->moveCurrentColumn(1);
    EXPECT_EQ(fields(3), (Texts{u"ID", u"CUSTOMER", u"TOTAL"}));
    EXPECT_EQ(events(), Names{});
}

TEST_F(AColumnMovedByHand, IsReportedWhereTheModelRefuses) {
    ordered->refuses = true;
    stage->dragField(1, 3);
    EXPECT_EQ(fields(3), (Texts{u"ID", u"CUSTOMER", u"TOTAL"}));
    EXPECT_EQ(stage->boxes, Boxes{report(u"MoveColumn", refusal())});
}

} // namespace gridstage
