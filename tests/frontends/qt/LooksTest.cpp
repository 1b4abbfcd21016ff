#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/Desk.h"
#include "frontends/qt/GridCells.h"
#include "frontends/qt/darkPalette.h"

#include <Zandor/qt/Twips.h>

#include <QApplication>
#include <QDeadlineTimer>
#include <QHeaderView>
#include <QHelpEvent>
#include <QLineEdit>
#include <QPaintEvent>
#include <QToolTip>

using namespace zandor;

namespace {

/// The tooltip that a place of a widget shows; empty for none.
QString toolTipAt(QWidget& widget, QPoint at) {
    const QString before = QToolTip::isVisible() ? QToolTip::text() : QString();
    QHelpEvent help(QEvent::ToolTip, at, widget.mapToGlobal(at));
    QCoreApplication::sendEvent(&widget, &help);
    // A tooltip that is to go stays for a moment.
    const QDeadlineTimer moment(1000);
    while (QToolTip::isVisible() && QToolTip::text() == before && !moment.hasExpired())
        qApp->processEvents(QEventLoop::WaitForMoreEvents, 50);
    return QToolTip::isVisible() ? QToolTip::text() : QString();
}

class Looks : public Desk {};

} // namespace

TEST_F(Looks, ShowANameTooLongForItsListInATooltip) {
    show();
    bind();
    auto& list = table(3).list();
    const auto entry = [&](int row) {
        return list.visualRect(list.model()->index(row, 0)).center();
    };
    EXPECT_EQ(toolTipAt(*list.viewport(), entry(2)),
              "AMOUNT_OF_MONEY_INCLUDING_EVERY_TAX_THERE_IS");
    EXPECT_EQ(toolTipAt(*list.viewport(), entry(1)), "");
}

TEST_F(Looks, ShowATitleTooLongForItsTableInATooltip) {
    show();
    bind();
    EXPECT_EQ(toolTipAt(table(3), table(3).titleBar().center()),
              "ORDER_LINES_OF_ALL_THE_YEARS_TOGETHER");
    EXPECT_EQ(toolTipAt(table(1), table(1).titleBar().center()), "");
}

TEST_F(Looks, ShowACellTooLongForItsColumnInATooltip) {
    show();
    bind();
    grid().model().setText(4, 2, "BETWEEN 'A' AND 'ZZZZZZZZZZZZZ'");
    auto& viewport = *grid().view().viewport();
    const auto cell = [&](int row, int col) {
        return viewport.mapFrom(&grid(), grid().cellRect(row, col).center());
    };
    EXPECT_EQ(toolTipAt(viewport, cell(4, 2)), "BETWEEN 'A' AND 'ZZZZZZZZZZZZZ'");
    EXPECT_EQ(toolTipAt(viewport, cell(4, 1)), "");
    grid().model().setText(0, 2, "A.FIELD.NAME.THAT.IS.FAR.TOO.LONG");
    auto& header = *grid().view().horizontalHeader()->viewport();
    EXPECT_EQ(toolTipAt(header, header.mapFrom(&grid(), grid().cellRect(0, 2).center())),
              "A.FIELD.NAME.THAT.IS.FAR.TOO.LONG");
}

TEST_F(Looks, OfAFieldTooLongForItsColumnEndInAnEllipsis) {
    bind();
    show();
    auto& titles = *grid().view().horizontalHeader();
    grid().model().setWidth(1, 40 * platform::qt::twipsPerPixel);
    const auto title = [&](const QString& text) {
        grid().model().setText(0, 1, text);
        grid().touch();
        settle();
        return titles.grab({0, 0, 40, titles.height()}).toImage();
    };
    const QImage shown = title("ORDERS.ORDER_ID");
    EXPECT_EQ(shown, title(titles.fontMetrics().elidedText("ORDERS.ORDER_ID", Qt::ElideRight,
                                                           40 - 2 * platform::qt::cellMargin)));
    EXPECT_NE(shown, title(""));
}

TEST_F(Looks, HaveNoSeamBetweenTheCanvasAndWhatLiesBeyondIt) {
    widget->setMXHorzFrameSize(6000);
    widget->setMXVertFrameSize(6000);
    show();
    widget->resize(800, 600);
    settle();
    const QImage image = widget->grab().toImage();
    const qreal ratio = image.devicePixelRatio();
    const auto colour = [&](int x, int y) {
        return image.pixelColor(static_cast<int>(x * ratio), static_cast<int>(y * ratio));
    };
    EXPECT_EQ(child<QWidget>("fraTable").size(), QSize(400, 400));
    EXPECT_EQ(colour(390, 390), colour(410, 410));
    EXPECT_EQ(colour(390, 390), widget->palette().color(QPalette::Window));
}

TEST_F(Looks, FollowADarkPalette) {
    show();
    bind();
    widget->setPalette(darkPalette());
    settle();
    const QImage image = widget->grab().toImage();
    const qreal ratio = image.devicePixelRatio();
    const auto colour = [&](QPoint at) {
        return image.pixelColor((QPointF(at) * ratio).toPoint());
    };
    EXPECT_EQ(colour({700, 150}), darkPalette().color(QPalette::Window)) << "the canvas";
    const QPoint list = table(2).mapTo(widget.get(), QPoint(100, 105));
    EXPECT_EQ(colour(list), darkPalette().color(QPalette::Base)) << "a list below its entries";
    EXPECT_LT(colour(table(2).mapTo(widget.get(), QPoint(100, 3))).lightness(), 100) << "a title";
}

TEST_F(Looks, MarkTheTableThatHasTheFocus) {
    show();
    bind();
    widget->activateWindow();
    table(2).list().setFocus();
    settle();
    ASSERT_TRUE(table(2).list().hasFocus());
    const auto title = [&](int index) {
        return table(index).grab().toImage().pixelColor(table(index).width() / 2, 3);
    };
    EXPECT_EQ(title(2), widget->palette().color(QPalette::Highlight));
    EXPECT_NE(title(1), title(2));
}

TEST_F(Looks, OfAMarkedColumnDifferFromThoseOfAnUnmarkedOne) {
    show();
    bind();
    auto& list = table(1).list();
    const auto gutter = [&](int row) {
        QRect place = list.visualRect(list.model()->index(row, 0));
        place.setWidth(place.height());
        return list.viewport()->grab(place).toImage();
    };
    list.setFocus(); // the current row is the first one
    EXPECT_EQ(gutter(4), gutter(5));
    EXPECT_NE(gutter(1), gutter(5));
}

TEST_F(Looks, OfAnOpenEditorStayUntilSomethingClosesIt) {
    show();
    bind();
    for (const auto& [row, name] :
         {std::pair{2, "fraSortOrder"}, std::pair{3, "fraVisibility"}, std::pair{4, "fraValue"}}) {
        press(row, 1);
        settle();
        EXPECT_TRUE(child<QWidget>(name).isVisible()) << name;
    }
}

TEST_F(Looks, OfAnOpenEditorEndWhenTheControlPaintsItself) {
    show();
    bind();
    QPaintEvent paint(widget->rect());
    const std::function<void()> ways[] = {
        [&] { QCoreApplication::sendEvent(widget.get(), &paint); },
        [this] { widget->update(); },
        [this] { widget->repaint(); },
        [this] {
            widget->hide();
            widget->show();
        },
    };
    int way = 0;
    for (const auto& ask : ways) {
        press(4, 1);
        ASSERT_TRUE(child<QWidget>("fraValue").isVisible()) << way;
        ask();
        EXPECT_TRUE(child<QWidget>("fraValue").isVisible()) << way << ", while Qt is painting";
        settle();
        EXPECT_FALSE(child<QWidget>("fraValue").isVisible()) << way;
        ++way;
    }
}

TEST_F(Looks, OfAnOpenEditorStayWhateverTheControlDoesBesides) {
    widget->setMXHorzFrameSize(6000);
    widget->setMXVertFrameSize(6000); // a canvas that leaves much of the surface uncovered
    show();
    bind();
    const std::function<void()> works[] = {
        [this] { table(1).move(table(1).pos() + QPoint(40, 10)); },
        [this] { table(1).raise(); },
        [this] { child<QWidget>("fraTable").raise(); },
        [this] { child<QWidget>("fraTable").move(-30, -30); },
        [this] { child<QWidget>("vsbTable").hide(); },
        [this] { child<QWidget>("vsbTable").show(); },
        [this] { grid().model().setWidth(1, 3000); },
        [this] { widget->grab(); },
        [this] { widget->control().UserControl_Resize(); },
    };
    press(4, 1);
    int work = 0;
    for (const auto& go : works) {
        go();
        for (QWidget* part : widget->findChildren<QWidget*>()) part->update();
        settle();
        EXPECT_TRUE(child<QWidget>("fraValue").isVisible()) << work++;
    }
}

TEST_F(Looks, OfAClosedEditorLeaveTheFocusInTheGrid) {
    show();
    bind();
    press(4, 1);
    auto& text = child<QLineEdit>("txtValue");
    ASSERT_EQ(widget->focusWidget(), &text);
    hands::key(text, Qt::Key_Escape);
    EXPECT_EQ(widget->focusWidget(), &grid().view());
}

TEST_F(Looks, UseTheHostsFontForTablesAndGrid) {
    QWidget host;
    QFont font = host.font();
    font.setPointSizeF(13);
    host.setFont(font);
    open(&host);
    host.show();
    bind();
    EXPECT_EQ(table(1).font().pointSizeF(), 13);
    EXPECT_EQ(grid().font().pointSizeF(), 13);
    EXPECT_GE(grid().rowHeight(), QFontMetrics(font).height()) << "no text is cut off";
    widget.reset();
}

TEST_F(Looks, FrameTheCurrentCellAndFrameItMoreWithTheFocus) {
    show();
    bind();
    widget->activateWindow();
    auto& view = grid().view();
    view.setCurrentIndex(view.model()->index(4, 3)); // an empty one
    const QColor highlight = widget->palette().color(QPalette::Active, QPalette::Highlight);
    const auto pixel = [&](QPoint inside) {
        const QImage image = view.viewport()->grab().toImage();
        const QPoint at = view.visualRect(view.currentIndex()).topLeft() + inside;
        return image.pixelColor((QPointF(at) * image.devicePixelRatio()).toPoint());
    };
    table(1).list().setFocus();
    settle();
    EXPECT_EQ(pixel({10, 8}), widget->palette().color(QPalette::Base)) << "no block";
    EXPECT_NE(pixel({10, 0}), widget->palette().color(QPalette::Base));
    EXPECT_EQ(pixel({10, 1}), widget->palette().color(QPalette::Base)) << "thin";
    view.setFocus();
    settle();
    EXPECT_EQ(pixel({10, 8}), widget->palette().color(QPalette::Base));
    EXPECT_EQ(pixel({10, 0}), highlight);
    EXPECT_EQ(pixel({10, 1}), highlight);
}

TEST_F(Looks, KeepTheRowTitlesAwayFromTheFrame) {
    show();
    bind();
    const auto leftmost = [](QWidget& part, QRect row) {
        const QImage image = part.grab(row.adjusted(1, 2, -1, -2)).toImage();
        for (int x = 0; x < image.width(); ++x)
            for (int y = 0; y < image.height(); ++y)
                if (image.pixelColor(x, y).lightness() < 110)
                    return x / image.devicePixelRatio() + 1;
        return -1.0;
    };
    auto& titles = *grid().view().verticalHeader();
    const int height = grid().rowHeight();
    const QRect first(0, 0, grid().cellRect(1, 0).width(), height);
    EXPECT_GE(leftmost(*titles.viewport(), first), 4);
    EXPECT_LE(leftmost(*titles.viewport(), first), 9);
}

TEST_F(Looks, ShowTheLineWithTheFocus) {
    show();
    bind();
    widget->activateWindow();
    auto& canvas = child<platform::qt::Canvas>("fraTable");
    auto* line = canvas.lines().front();
    const QPoint mark = (line->at(0) / 15).toPoint() - QPoint(5, 0);
    const QPoint other = (line->at(1) / 15).toPoint() + QPoint(5, 0);
    const auto colour = [&](QPoint at) {
        const QImage image = canvas.grab().toImage();
        return image.pixelColor((QPointF(at) * image.devicePixelRatio()).toPoint());
    };
    const QColor highlight = widget->palette().color(QPalette::Active, QPalette::Highlight);
    EXPECT_NE(colour(mark), highlight);
    canvas.focusOn(line, Qt::TabFocusReason);
    settle();
    EXPECT_EQ(colour(mark), highlight) << "the mark at its end is filled";
    EXPECT_EQ(colour(other), highlight) << "and that at the other";
    table(1).list().setFocus();
    settle();
    EXPECT_NE(colour(mark), highlight);
}

TEST_F(Looks, OfAnOuterJoinHaveACircleAtTheTableThatKeepsItsRows) {
    show();
    bind();
    auto& canvas = child<platform::qt::Canvas>("fraTable");
    const QImage image = canvas.grab().toImage();
    const auto colour = [&](double x, double y) {
        return image.pixelColor((QPointF(x, y) / 15 * image.devicePixelRatio()).toPoint());
    };
    int circles = 0, squares = 0;
    for (const auto* item : canvas.items()) {
        const auto* mark = dynamic_cast<const platform::qt::CanvasShape*>(item);
        if (!mark || !mark->visible()) continue;
        const auto [left, top, width, height] = mark->bounds();
        const bool hasCorner = colour(left, top) == colour(left + width / 2, top);
        ++(hasCorner ? squares : circles);
        EXPECT_NE(hasCorner, mark->shapeStyle() == platform::shapeCircle);
    }
    EXPECT_EQ(circles, 1);
    EXPECT_EQ(squares, 3);
}
