#include "frontends/qt/Desk.h"

#include "frontends/qt/QtToolkit.h"

#include <QDeadlineTimer>

using namespace zandor;

// What a drag shows and scrolls on its way.

namespace {

class ADrag : public Desk {
protected:
    QPointF entry(int index, int row) {
        auto& list = table(index).list();
        return QRectF(list.visualRect(list.model()->index(row, 0))).center();
    }

    /// Drags an entry of the first table; the carrier is the mouse until the drag ends.
    void drag(int row, platform::qt::DragSession::Carrier carrier) {
        widget->toolkit().drags().setCarrier(std::move(carrier));
        QWidget& viewport = *table(1).list().viewport();
        hands::mouse(viewport, QEvent::MouseButtonPress, entry(1, row), Qt::LeftButton,
                     Qt::LeftButton);
        hands::mouse(viewport, QEvent::MouseMove, entry(1, row) + QPointF(1, 1), Qt::NoButton,
                     Qt::LeftButton);
    }

    /// True where the place takes the drag.
    bool hover(QDrag& drag, QWidget& over, QPointF at) {
        QWindow* const window = widget->windowHandle();
        const QPoint place = over.mapTo(widget.get(), at).toPoint();
        if (!std::exchange(mInside, true)) {
            QDragEnterEvent enter(place, Qt::CopyAction, drag.mimeData(), Qt::LeftButton, {});
            QCoreApplication::sendEvent(window, &enter);
        }
        QDragMoveEvent move(place, Qt::CopyAction, drag.mimeData(), Qt::LeftButton, {});
        QCoreApplication::sendEvent(window, &move);
        return move.isAccepted();
    }

    void leave() {
        mInside = false;
        QDragLeaveEvent gone;
        QCoreApplication::sendEvent(widget->windowHandle(), &gone);
    }

    static bool forbidden(const QDrag& drag) { return !drag.dragCursor(Qt::CopyAction).isNull(); }

    static void wait(const std::function<bool()>& until) {
        for (const QDeadlineTimer limit(5000); !limit.hasExpired() && !until();)
            qApp->processEvents(QEventLoop::WaitForMoreEvents, 50);
    }

private:
    bool mInside = false;
};

} // namespace

TEST_F(ADrag, ShowsWhereADropCounts) {
    show();
    bind();
    drag(2, [this](QDrag& drag) {
        QWidget& other = *table(2).list().viewport();
        EXPECT_TRUE(hover(drag, other, entry(2, 1)));
        EXPECT_FALSE(forbidden(drag)) << "an entry";
        hover(drag, other, entry(2, 0));
        EXPECT_TRUE(forbidden(drag)) << "all columns";
        hover(drag, other, entry(2, 2));
        EXPECT_FALSE(forbidden(drag)) << "an entry again";
        hover(drag, table(2), {50, 5});
        EXPECT_TRUE(forbidden(drag)) << "a title";
        hover(drag, *table(1).list().viewport(), entry(1, 3));
        EXPECT_TRUE(forbidden(drag)) << "the table it comes from";
        EXPECT_FALSE(hover(drag, child<QWidget>("fraTable"), {5, 5})) << "the canvas";
        EXPECT_TRUE(hover(drag, grid(), {200, 60}));
        EXPECT_FALSE(forbidden(drag)) << "the grid";
        leave();
    });
}

TEST_F(ADrag, ThatIsGivenUpBeforeItsDropIsDealtWithDropsNothing) {
    show();
    bind();
    const int before = model->joinCount();
    for (const bool givenUp : {true, false}) {
        drag(2, [&](QDrag& drag) {
            auto& drags = widget->toolkit().drags();
            hands::carry(drag, *table(2).list().viewport(), entry(2, 1));
            if (givenUp) drags.giveUp(drags.source());
        });
        settle();
        EXPECT_EQ(model->joinCount(), givenUp ? before : before + 1);
    }
}

TEST_F(ADrag, ScrollsTheListNearItsEdges) {
    show();
    bind();
    orders->place(600, 600, 2400, 1500);
    table(1).resize(160, 100);
    settle();
    // The list is the target here, so that the drag comes from another table.
    widget->toolkit().drags().setCarrier([this](QDrag& drag) {
        auto& list = table(1).list();
        QScrollBar& bar = *list.verticalScrollBar();
        QWidget& viewport = *list.viewport();
        ASSERT_GT(bar.maximum(), 0);
        hover(drag, viewport, {30, viewport.height() - 4.0});
        wait([&] { return bar.value() == bar.maximum(); });
        EXPECT_EQ(bar.value(), bar.maximum());
        EXPECT_TRUE(list.selectionModel()->isRowSelected(list.model()->rowCount() - 1))
            << "the entry that has come below the mouse";
        hover(drag, viewport, {30, 4});
        wait([&] { return bar.value() == 0; });
        EXPECT_EQ(bar.value(), 0);
        hover(drag, viewport, {30, viewport.height() - 4.0});
        leave();
        const int left = bar.value();
        const QDeadlineTimer moment(200);
        wait([&] { return moment.hasExpired(); });
        EXPECT_EQ(bar.value(), left) << "a drag that has gone scrolls nothing";
    });
    QWidget& viewport = *table(2).list().viewport();
    hands::mouse(viewport, QEvent::MouseButtonPress, entry(2, 1), Qt::LeftButton, Qt::LeftButton);
    hands::mouse(viewport, QEvent::MouseMove, entry(2, 1), Qt::NoButton, Qt::LeftButton);
}

TEST_F(ADrag, ScrollsTheCanvasNearItsEdges) {
    show();
    bind();
    auto& down = child<QScrollBar>("vsbTable");
    auto& across = child<QScrollBar>("hsbTable");
    drag(2, [&, this](QDrag& drag) {
        const QRect seen = widget->toolkit().view().seen();
        hover(drag, child<QWidget>("fraTable"), seen.bottomRight() - QPoint(5, 5));
        wait([&] { return down.value() > 600 && across.value() > 600; });
        EXPECT_GT(down.value(), 600);
        EXPECT_GT(across.value(), 600);
        leave();
    });
}
