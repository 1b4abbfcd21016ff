#include "frontends/qt/Desk.h"

#include "frontends/qt/Adapter.h"
#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/QtToolkit.h"

#include <Zandor/qt/Twips.h>

using namespace zandor;

using platform::Bounds;
using platform::qt::toPixels;

namespace {

Bounds boundsOf(const QWidget& widget) {
    return static_cast<platform::Control*>(
               widget.property(platform::qt::controlProperty).value<void*>())
        ->bounds();
}

class Geometry : public Desk {
protected:
    /// Pulls a box at a place of it.
    static void drag(QWidget& box, QPointF grip, QPointF way) {
        const QPointF start = box.mapToGlobal(grip);
        const auto end = [&] { return box.mapFromGlobal(start + way); };
        hands::mouse(box, QEvent::MouseButtonPress, grip, Qt::LeftButton, Qt::LeftButton);
        hands::mouse(box, QEvent::MouseMove, end(), Qt::NoButton, Qt::LeftButton);
        hands::mouse(box, QEvent::MouseButtonRelease, end(), Qt::LeftButton);
    }
};

} // namespace

TEST(Pixels, AreFifteenTwipsEachAndKeepNeighboursTogetherAtEveryFraction) {
    EXPECT_EQ(toPixels(Bounds{150, 300, 1500, 45}), QRect(10, 20, 100, 3));
    const QRect left = toPixels(Bounds{7.4F, 0, 1000.3F, 15});
    const QRect right = toPixels(Bounds{7.4F + 1000.3F, 0, 333.3F, 15});
    EXPECT_EQ(left.right() + 1, right.left());
    EXPECT_EQ(toPixels(Bounds{7, 0, 7, 15}), QRect(0, 0, 1, 1)) << "the next one begins at 14";
}

TEST(Pixels, StayInReachForValuesThatNoScreenHas) {
    EXPECT_EQ(toPixels(1e30F), 1 << 20);
    EXPECT_EQ(toPixels(-1e30F), -(1 << 20));
    EXPECT_EQ(toPixels(std::numeric_limits<float>::quiet_NaN()), -(1 << 20));
    EXPECT_EQ(toPixels(Bounds{0, 0, -500, 15}).width(), 0);
}

TEST_F(Geometry, OfATableIsItsTwipsInPixels) {
    show();
    bind();
    EXPECT_EQ(table(1).geometry(), QRect(40, 40, 160, 180));
    EXPECT_EQ(table(2).geometry(), QRect(340, 30, 160, 120));
}

TEST_F(Geometry, KeepsTheFractionsThatTheScreenCannotShow) {
    show();
    bind();
    auto* box = static_cast<platform::Control*>(
        table(1).property(platform::qt::controlProperty).value<void*>());
    box->setBounds({601.25F, 607.5F, 2000, 2000.75F});
    EXPECT_EQ(boundsOf(table(1)), (Bounds{601.25F, 607.5F, 2000, 2000.75F}));
    EXPECT_EQ(table(1).geometry(), QRect(40, 41, 133, 133));
}

TEST_F(Geometry, FollowsTheMouseThatMovesATable) {
    show();
    bind();
    auto& box = table(1);
    const QPointF grip = QRectF(box.titleBar()).center();
    const QPointF start = box.mapToGlobal(grip);
    hands::mouse(box, QEvent::MouseButtonPress, grip, Qt::LeftButton, Qt::LeftButton);
    hands::mouse(box, QEvent::MouseMove, box.mapFromGlobal(start + QPointF(31, 12)), Qt::NoButton,
                 Qt::LeftButton);
    EXPECT_EQ(box.pos(), QPoint(71, 52)) << "while the button is held";
    EXPECT_EQ(orders->left, 600) << "the model learns of it at the end";
    hands::mouse(box, QEvent::MouseButtonRelease, box.mapFromGlobal(start + QPointF(31, 12)),
                 Qt::LeftButton);
    EXPECT_EQ(boundsOf(box), (Bounds{600 + 31 * 15, 600 + 12 * 15, 2400, 2700}));
    EXPECT_EQ(orders->left, 600 + 31 * 15);
    EXPECT_EQ(orders->top, 600 + 12 * 15);
}

TEST_F(Geometry, IsNotReportedForAClickOnATitle) {
    show();
    bind();
    int moved = 0;
    QObject::connect(widget.get(), &ZandorWidget::TableMoved, [&moved] { ++moved; });
    hands::click(table(2), QRectF(table(2).titleBar()).center());
    EXPECT_EQ(moved, 0);
}

TEST_F(Geometry, IsNotReportedForATitleThatIsHeldStill) {
    show();
    bind();
    int moved = 0;
    QObject::connect(widget.get(), &ZandorWidget::TableMoved, [&moved] { ++moved; });
    drag(table(2), QRectF(table(2).titleBar()).center(), {0, 0});
    EXPECT_EQ(moved, 0);
}

TEST_F(Geometry, StaysWhenTheButtonCameUpOverAnotherWindow) {
    show();
    bind();
    auto& box = table(2);
    const QRect before = box.geometry();
    const QPointF grip = QRectF(box.titleBar()).center();
    hands::mouse(box, QEvent::MouseButtonPress, grip, Qt::LeftButton, Qt::LeftButton);
    hands::mouse(box, QEvent::MouseMove, grip + QPointF(50, 20), Qt::NoButton);
    EXPECT_EQ(box.geometry(), before);
}

TEST_F(Geometry, OfATableShrinksNoFurtherThanItsNameAndOneEntry) {
    show();
    bind();
    auto& box = table(1);
    const QPointF grip(box.width() - 2, box.height() - 2);
    const QPointF start = box.mapToGlobal(grip);
    hands::mouse(box, QEvent::MouseButtonPress, grip, Qt::LeftButton, Qt::LeftButton);
    hands::mouse(box, QEvent::MouseMove, box.mapFromGlobal(start - QPointF(900, 900)), Qt::NoButton,
                 Qt::LeftButton);
    hands::mouse(box, QEvent::MouseButtonRelease, box.mapFromGlobal(start - QPointF(900, 900)),
                 Qt::LeftButton);
    EXPECT_EQ(box.size(), box.smallest());
}

TEST_F(Geometry, GrownByTheLeftEdgeKeepsTheRightOne) {
    show();
    bind();
    auto& box = table(2);
    const QPointF grip(1, box.height() / 2.0);
    const QPointF start = box.mapToGlobal(grip);
    hands::mouse(box, QEvent::MouseButtonPress, grip, Qt::LeftButton, Qt::LeftButton);
    hands::mouse(box, QEvent::MouseMove, box.mapFromGlobal(start - QPointF(40, 0)), Qt::NoButton,
                 Qt::LeftButton);
    hands::mouse(box, QEvent::MouseButtonRelease, box.mapFromGlobal(start - QPointF(40, 0)),
                 Qt::LeftButton);
    EXPECT_EQ(box.geometry(), QRect(300, 30, 200, 120));
    EXPECT_EQ(customers->left, 4500);
    EXPECT_EQ(customers->width, 3000);
}

TEST_F(Geometry, ResizedNearACornerIsReportedAsMovedWhenTheCornerMoves) {
    show();
    bind();
    int moved = 0;
    QObject::connect(widget.get(), &ZandorWidget::TableMoved, [&moved] { ++moved; });
    auto& box = table(2);
    const auto at = [&box](double x, double y) {
        return QPointF(x < 0 ? box.width() + x : x, y < 0 ? box.height() + y : y);
    };
    const struct {
        QPointF grip, way;
        int moved;
    } pulls[] = {
        {at(6, -2), {0, 30}, 0},   // near the lower left corner, downwards
        {at(2, -6), {0, 20}, 0},   //
        {at(2, -6), {10, 0}, 1},   // its left edge
        {at(-2, 6), {20, 0}, 0},   // near the upper right corner, to the right
        {at(-6, 2), {0, 10}, 1},   // its top edge
        {at(2, 2), {0, 2}, 1},     // the upper left corner
        {at(-2, -2), {15, 15}, 0}, // the lower right one
        {at(-2, 50), {15, 7}, 0},  // an edge
        {at(50, -2), {15, 7}, 0},  //
        {at(2, 50), {-15, 0}, 1},  //
        {at(50, 2), {15, -7}, 1},  //
    };
    int pull = 0;
    for (const auto& [grip, way, expected] : pulls) {
        moved = 0;
        // The grips were reckoned with the box as it was at first.
        customers->place(5100, 450, 2400, 1800);
        widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(model));
        settle();
        drag(table(2), grip, way);
        EXPECT_EQ(moved, expected) << pull;
        ++pull;
        EXPECT_EQ(
            toPixels(Bounds{customers->left, customers->top, customers->width, customers->height}),
            table(2).geometry());
    }
}

TEST_F(Geometry, GrownBeyondTheVisibleEdgeKeepsTheOppositeOne) {
    show();
    bind();
    widget->setHorizontalScrollbarPos(300);
    widget->setVerticalScrollbarPos(150);
    settle();
    auto& box = table(1);
    const QPoint corner = box.geometry().bottomRight();
    drag(box, QPointF(1, 1), QPointF(-200, -200));
    EXPECT_EQ(box.geometry(), QRect(QPoint(20, 10), corner));
    EXPECT_EQ(orders->left, 300);
    EXPECT_EQ(orders->width, 600 + 2400 - 300);
    EXPECT_EQ(orders->top, 150);
    EXPECT_EQ(orders->height, 600 + 2700 - 150);
}

TEST_F(Geometry, OfAJoinEndsAtTheRowsOfItsColumns) {
    show();
    bind();
    auto& list = table(2).list();
    const QRect row = list.visualRect(list.model()->index(1, 0));
    const QPoint middle =
        list.viewport()->mapTo(&child<QWidget>("fraTable"), QPoint(0, row.center().y()));
    const auto& items = child<platform::qt::Canvas>("fraTable").items();
    const platform::qt::CanvasLine* line = nullptr;
    for (const auto* item : items)
        if (item->name() == "linJoin(1)")
            line = dynamic_cast<const platform::qt::CanvasLine*>(item);
    ASSERT_TRUE(line);
    EXPECT_NEAR(line->Y2() / 15, middle.y(), 1.0F);
}

TEST_F(Geometry, StacksTheCanvasBelowTheGridTheBarsTheHomeButtonAndTheEditors) {
    show();
    bind();
    press(2, 2);
    const QObjectList& children = widget->children();
    const auto layer = [&](const char* name) {
        return children.indexOf(widget->findChild<QWidget*>(name));
    };
    // The canvas is alone in the window that it moves behind.
    EXPECT_EQ(child<QWidget>("fraTable").parentWidget()->children().size(), 1);
    EXPECT_LT(children.indexOf(child<QWidget>("fraTable").parentWidget()), layer("sprColumn"));
    EXPECT_LT(layer("sprColumn"), layer("hsbTable"));
    EXPECT_LT(layer("hsbTable"), layer("vsbTable"));
    EXPECT_LT(layer("vsbTable"), layer("cmdHome"));
    EXPECT_LT(layer("cmdHome"), layer("fraSortOrder"));
    EXPECT_EQ(children.last(), widget->findChild<QWidget*>("fraSortOrder"));
}

TEST_F(Geometry, OfAListEndsWithItsLastPixel) {
    show();
    bind();
    const auto* tabulet = dynamic_cast<TalvikTabulet::Tabulet*>(static_cast<platform::Control*>(
        table(1).property(platform::qt::controlProperty).value<void*>()));
    ASSERT_TRUE(tabulet);
    QWidget& viewport = *table(1).list().viewport();
    const QRect inside(viewport.mapTo(&table(1), QPoint()), viewport.size());
    const auto hasEntryAt = [&](double x, double y) {
        return tabulet->ColumnAt(static_cast<float>(x * 15), static_cast<float>(y * 15)) != nullptr;
    };
    const double y = inside.top() + 5;
    EXPECT_FALSE(hasEntryAt(inside.left() - 0.5, y));
    EXPECT_TRUE(hasEntryAt(inside.left(), y));
    EXPECT_TRUE(hasEntryAt(inside.right() + 0.5, y));
    EXPECT_FALSE(hasEntryAt(inside.right() + 1, y));
    EXPECT_FALSE(hasEntryAt(inside.left(), inside.top() - 0.5)) << "the title";
}

TEST_F(Geometry, OfAListIsSuchThatASelectedColumnIsSeen) {
    show();
    bind();
    orders->place(600, 600, 2400, 1500);
    orders->column(u"PRIORITY").selected = true;
    widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(model));
    settle();
    auto& list = table(1).list();
    EXPECT_TRUE(list.viewport()->rect().contains(list.visualRect(list.model()->index(9, 0))));
}

TEST_F(Geometry, PutsATableThatIsPressedInFrontOfTheOthers) {
    show();
    bind();
    const auto& siblings = child<QWidget>("fraTable").children();
    ASSERT_NE(siblings.last(), &table(1));
    auto& list = table(1).list();
    hands::click(*list.viewport(), QRectF(list.visualRect(list.model()->index(2, 0))).center());
    EXPECT_EQ(siblings.last(), &table(1));
}

TEST_F(Geometry, OfAnEditorIsAsLargeAsItsParts) {
    show();
    bind();
    for (const auto& [row, name] :
         {std::pair{2, "fraSortOrder"}, std::pair{3, "fraVisibility"}, std::pair{4, "fraValue"}}) {
        press(row, 1);
        auto& frame = child<QWidget>(name);
        ASSERT_TRUE(frame.isVisible()) << name;
        EXPECT_EQ(frame.size(), frame.sizeHint()) << name;
        for (const auto* part : frame.findChildren<QWidget*>())
            if (!part->isHidden() && part->parentWidget()->parentWidget() == &frame) {
                EXPECT_GE(part->width(), part->minimumSizeHint().width()) << name;
            }
    }
}
