#include "GridStage.h"

namespace gridstage {

class TheWidthOfAColumn : public GridTest {
protected:
    TheWidthOfAColumn() {
        first = model->definition(customers, u"NAME");
        second = model->definition(orders, u"ID");
        bind();
        stage->comforts().setFlags({.KeepsTyping = true, .FitsColumns = true});
    }

    static constexpr float narrowest = 1200, widest = 4500;

    float width(std::int32_t col) { return grid().ColWidth(col); }

    void write(std::int32_t row, std::int32_t col, const String& text) {
        press(left, row, col);
        stage->type("txtValue", text);
        stage->key("txtValue", enter);
    }

    Ref<fake::Definition> first, second;
};

TEST_F(TheWidthOfAColumn, IsNeverLessThanItsWordsNeed) {
    EXPECT_EQ(width(1), narrowest);
    EXPECT_EQ(width(2), narrowest);
}

TEST_F(TheWidthOfAColumn, GrowsAndShrinksWithWhatItHolds) {
    const String text = u"In ('Berlin', 'Wien')";
    write(criteriaRow, 1, text);
    EXPECT_EQ(width(1), stage->toolkit().TextWidth(text) + 300);
    EXPECT_EQ(width(2), narrowest);
    write(criteriaRow, 1, u"");
    EXPECT_EQ(width(1), narrowest);
}

TEST_F(TheWidthOfAColumn, HasALimit) {
    write(synonymRow, 1, String(200, u'W'));
    EXPECT_EQ(width(1), widest);
}

TEST_F(TheWidthOfAColumn, FitsAColumnThatIsDroppedAndOneThatIsBound) {
    const auto table = model->table(u"ORDERS_OF_THE_LAST_YEAR", {u"*", u"REMARKS"});
    table->place(300, 3000, 2400, 1200);
    bind();
    drag(3, {2}, 3);
    const String field = u"ORDERS_OF_THE_LAST_YEAR.REMARKS";
    EXPECT_EQ(stage->cell(fieldRow, 3), field);
    EXPECT_EQ(width(3), stage->toolkit().TextWidth(field) + 300);
    first->synonym = u"a rather long synonym";
    bind();
    EXPECT_EQ(width(1), stage->toolkit().TextWidth(first->synonym) + 300);
}

TEST_F(TheWidthOfAColumn, StaysAsItWasSetByHand) {
    stage->dragBorder(1, 2250);
    EXPECT_EQ(width(1), 2250);
    write(criteriaRow, 1, u"In ('Berlin', 'Wien', 'London', 'Paris')");
    EXPECT_EQ(width(1), 2250);
}

TEST_F(TheWidthOfAColumn, SetByHandIsThatOfItsQueryAlone) {
    stage->dragBorder(1, 2250);
    bind();
    EXPECT_EQ(width(1), 2250);
    const auto other = library.newModel();
    other->definition(other->table(u"OTHERS", {u"*", u"ID"}), u"ID");
    control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(other));
    EXPECT_EQ(width(1), narrowest);
}

TEST_F(TheWidthOfAColumn, GoesWithItsColumn) {
    stage->dragBorder(1, 2250);
    drag(1, {total}, 1);
    EXPECT_EQ(width(2), 2250);
    write(criteriaRow, 2, u"In ('Berlin', 'Wien', 'London', 'Paris')");
    EXPECT_EQ(width(2), 2250);
}

TEST_F(TheWidthOfAColumn, FitsAgainByADoubleClickOnItsBorder) {
    const String text = u"In ('Berlin', 'Wien')";
    stage->dragBorder(1, 2250);
    write(criteriaRow, 1, text);
    stage->dragBorder(1, 0);
    EXPECT_EQ(width(1), stage->toolkit().TextWidth(text) + 300);
}

TEST_F(TheWidthOfAColumn, IsThatOfItsFieldInTheBareControl) {
    stage->comforts().setFlags({});
    bind();
    EXPECT_EQ(width(1), stage->toolkit().TextWidth(u"NAME") + 120);
}

} // namespace gridstage
