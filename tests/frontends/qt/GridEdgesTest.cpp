#include "frontends/qt/Desk.h"

#include "frontends/qt/Adapter.h"

#include <Zandor/platform/RuntimeError.h>

#include <limits>

using namespace zandor;

// What the control's grid answers to what is not there.

namespace {

/// Counts what is moved in it.
class Ordered final : public fake::Model, public TalvikZandorLib::OrderedDefinitions {
public:
    using Model::Model;
    void StandsBehind(const platform::Ref<TalvikZandorLib::ZDColumnDefinition>&,
                      const platform::Ref<TalvikZandorLib::ZDColumnDefinition>&) override {
        ++moved;
    }
    int moved = 0;
};

class TheGrid : public Desk {
protected:
    TheGrid() {
        show();
        bind();
    }
    template <class Call>
    static std::int32_t errorFrom(Call call) {
        try {
            call();
        } catch (const platform::RuntimeError& error) {
            return error.Number;
        }
        return 0;
    }
    MSFlexGridLib::MSFlexGrid& shown() {
        return dynamic_cast<MSFlexGridLib::MSFlexGrid&>(*static_cast<platform::Control*>(
            grid().property(platform::qt::controlProperty).value<void*>()));
    }
};

} // namespace

TEST_F(TheGrid, RefusesARowAndAColumnThatItHasNot) {
    shown().Row(2);
    shown().Col(3);
    for (const std::int32_t row : {-1, shown().Rows()}) {
        EXPECT_EQ(errorFrom([&] { shown().Row(row); }), 30009);
        EXPECT_EQ(errorFrom([&] { shown().RowPos(row); }), 30009);
        EXPECT_EQ(errorFrom([&] { shown().TextMatrix(row, 1); }), 381);
        EXPECT_EQ(errorFrom([&] { shown().CellNote(row, 1, u"x"); }), 381);
    }
    for (const std::int32_t col : {-1, shown().Cols()}) {
        EXPECT_EQ(errorFrom([&] { shown().Col(col); }), 30010);
        EXPECT_EQ(errorFrom([&] { shown().ColWidth(col, 100); }), 30010);
        EXPECT_EQ(errorFrom([&] { shown().ColData(col); }), 30010);
        EXPECT_EQ(errorFrom([&] { shown().ColPosition(1, col); }), 30010);
        EXPECT_EQ(errorFrom([&] { shown().TextMatrix(1, col); }), 381);
    }
    EXPECT_EQ(shown().Row(), 2);
    EXPECT_EQ(shown().Col(), 3);
}

TEST_F(TheGrid, RefusesANegativeWidthAndAnAlignmentThatIsNone) {
    const float before = shown().ColWidth(1);
    EXPECT_EQ(errorFrom([&] { shown().ColWidth(1, -15); }), 380);
    EXPECT_EQ(errorFrom([&] { shown().ColWidth(1, std::numeric_limits<float>::quiet_NaN()); }),
              380);
    EXPECT_EQ(shown().ColWidth(1), before);
    EXPECT_EQ(errorFrom([&] { shown().CellAlignment(10); }), 380);
    EXPECT_EQ(errorFrom([&] { shown().CellAlignment(-1); }), 380);
}

TEST_F(TheGrid, IsNotPaintedAgainForANoteThatItHas) {
    struct : QObject {
        bool eventFilter(QObject*, QEvent* event) override {
            seen += event->type() == QEvent::Paint;
            return false;
        }
        int seen = 0;
    } paints;
    shown().CellNote(4, 1, u"no number");
    settle();
    grid().view().viewport()->installEventFilter(&paints);
    shown().CellNote(4, 1, u"no number");
    settle();
    EXPECT_EQ(paints.seen, 0);
    shown().CellNote(4, 1, u"no date");
    settle();
    EXPECT_GT(paints.seen, 0);
}

TEST_F(TheGrid, KeepsItsCurrentCellWhileTheMouseGoesOnWithItsButtonHeld) {
    press(2, 2);
    QWidget& cells = *grid().view().viewport();
    const QPointF other = cells.mapFrom(&grid(), QPointF(grid().cellRect(4, 3).center()));
    hands::mouse(cells, QEvent::MouseMove, other, Qt::NoButton, Qt::LeftButton);
    settle();
    EXPECT_EQ(grid().currentRow(), 2);
    EXPECT_EQ(grid().currentCol(), 2);
}

namespace {

class AColumnOfTheGrid : public TheGrid {
protected:
    AColumnOfTheGrid() {
        const auto table = ordered->table(u"ORDERS", {u"*", u"ID", u"TOTAL"});
        table->place(300, 300, 2400, 2400);
        for (const char16_t* column : {u"ID", u"TOTAL"}) ordered->definition(table, column);
        widget->setComforts(comforts::Flags::all());
        widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(ordered));
        settle();
    }
    void drag(QPointF from, QPointF end, bool escaped = false) {
        QWidget& titles = *grid().childAt(from.toPoint());
        const QPointF to = titles.mapFrom(&grid(), end);
        hands::mouse(titles, QEvent::MouseButtonPress, titles.mapFrom(&grid(), from),
                     Qt::LeftButton, Qt::LeftButton);
        hands::mouse(titles, QEvent::MouseMove, to, Qt::NoButton, Qt::LeftButton);
        if (escaped) hands::key(grid().view(), Qt::Key_Escape);
        hands::mouse(titles, QEvent::MouseButtonRelease, to, Qt::LeftButton);
        settle();
    }

    const Ref<Ordered> ordered = platform::makeRef<Ordered>(library.calls);
};

} // namespace

TEST_F(AColumnOfTheGrid, IsLetGoByEscape) {
    const QPointF first = grid().cellRect(0, 1).center();
    const QPointF pastSecond = grid().cellRect(0, 2).center() + QPoint(20, 0);
    drag(first, pastSecond, true);
    EXPECT_EQ(ordered->moved, 0);
    drag(first, pastSecond);
    EXPECT_EQ(ordered->moved, 1);
}

TEST_F(AColumnOfTheGrid, BecomesNarrowAtItsBorderAndStaysWhereItIs) {
    const float before = shown().ColWidth(2);
    const QRect first = grid().cellRect(0, 1), second = grid().cellRect(0, 2);
    drag(QPointF(second.right(), second.center().y()), QPointF(first.left() + 10, 5));
    EXPECT_EQ(ordered->moved, 0);
    EXPECT_LT(shown().ColWidth(2), before);
}
