#include "frontends/qt/Desk.h"
#include "frontends/qt/darkPalette.h"

#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/CanvasWindow.h"
#include "frontends/qt/ColumnListModel.h"

#include <QListView>
#include <QPaintEvent>
#include <QPainter>
#include <QProxyStyle>

using namespace zandor;

using platform::qt::CanvasItem;
using platform::qt::CanvasLine;
using platform::qt::CanvasWindow;
using platform::qt::TabuletWidget;

// What is painted, and how much of it.

namespace {

/// Counts what some widgets paint: how often, and how many logical pixels.
class Painted : public QObject {
public:
    explicit Painted(const std::vector<QWidget*>& widgets) {
        for (QWidget* widget : widgets) widget->installEventFilter(this);
    }

    int events = 0;
    int pixels = 0;
    QRegion region;

    bool eventFilter(QObject*, QEvent* event) override {
        if (event->type() != QEvent::Paint) return false;
        ++events;
        region += static_cast<QPaintEvent*>(event)->region();
        for (const QRect& part : static_cast<QPaintEvent*>(event)->region())
            pixels += part.width() * part.height();
        return false;
    }
};

/// Counts the entries of lists that are drawn, and scroll bars.
class CountingStyle : public QProxyStyle {
public:
    mutable int entries = 0;
    mutable int bars = 0;

    void drawComplexControl(ComplexControl control, const QStyleOptionComplex* option,
                            QPainter* painter, const QWidget* on) const override {
        if (control == CC_ScrollBar) ++bars;
        QProxyStyle::drawComplexControl(control, option, painter, on);
    }

    void drawPrimitive(PrimitiveElement element, const QStyleOption* option, QPainter* painter,
                       const QWidget* on) const override {
        const bool ofTable =
            qobject_cast<const QListView*>(on) || qobject_cast<const TabuletWidget*>(on);
        if (element == PE_PanelItemViewItem && ofTable) ++entries;
        QProxyStyle::drawPrimitive(element, option, painter, on);
    }
};

class Painting : public Desk {
protected:
    Painting() {
        show();
        bind();
        settle();
    }

    platform::qt::Canvas& canvas() { return child<platform::qt::Canvas>("fraTable"); }
    CanvasLine& line(std::size_t n) { return *canvas().lines().at(n); }

    QImage picture() {
        settle();
        return widget->grab().toImage();
    }
    /// Paints as often as it takes for all that does not change to be kept.
    QImage pictureAtRest() {
        for (int i = 0; i < 4; ++i) picture();
        return picture();
    }
    /// Nothing kept from before takes part in it.
    QImage pictureAnew() {
        settle();
        for (CanvasItem* item : canvas().items()) item->fontChanged();
        for (TabuletWidget* box : canvas().tables()) {
            QEvent any(QEvent::User);
            QCoreApplication::sendEvent(box, &any);
        }
        return picture();
    }

    /// Pulls a table by its title, one step each way.
    void drag(TabuletWidget& box, const std::vector<QPoint>& ways) {
        const QPointF grip = QRectF(box.titleBar()).center();
        const QPointF start = box.mapToGlobal(grip);
        const auto at = [&](QPoint way) { return box.mapFromGlobal(start + way); };
        hands::mouse(box, QEvent::MouseButtonPress, grip, Qt::LeftButton, Qt::LeftButton);
        for (const QPoint way : ways) {
            hands::mouse(box, QEvent::MouseMove, at(way), Qt::NoButton, Qt::LeftButton);
            settle();
        }
        hands::mouse(box, QEvent::MouseButtonRelease, at(ways.back()), Qt::LeftButton);
        settle();
    }
};

/// Empty for pictures that are the same, but for what the smoothing of a line makes of it where it
/// is cut off at another place.
std::string difference(const QImage& one, const QImage& other) {
    constexpr int smoothing = 6; // of 255
    if (one == other) return {};
    if (one.size() != other.size() || one.depth() != 32) return "all of it";
    QRect place;
    int most = 0;
    for (int y = 0; y < one.height(); ++y) {
        const auto* a = reinterpret_cast<const QRgb*>(one.constScanLine(y));
        const auto* b = reinterpret_cast<const QRgb*>(other.constScanLine(y));
        for (int x = 0; x < one.width(); ++x) {
            if (a[x] == b[x]) continue;
            const int by =
                std::max({std::abs(qRed(a[x]) - qRed(b[x])), std::abs(qGreen(a[x]) - qGreen(b[x])),
                          std::abs(qBlue(a[x]) - qBlue(b[x]))});
            most = std::max(most, by);
            if (by > smoothing) place |= QRect(x, y, 1, 1);
        }
    }
    if (place.isNull()) return {};
    return "by up to " + std::to_string(most) + ", " + std::to_string(place.width()) + "x" +
           std::to_string(place.height()) + " pixels at " + std::to_string(place.left()) + "," +
           std::to_string(place.top());
}

} // namespace

TEST_F(Painting, OfAScrolledCanvasIsThatOfWhatComesIntoView) {
    const QRect window = canvas().parentWidget()->geometry();
    for (const char* name : {"hsbTable", "vsbTable"}) {
        auto& bar = child<QScrollBar>(name);
        ASSERT_GT(bar.maximum(), 600);
        Painted painted({&canvas()});
        bar.setValue(600); // 40 logical pixels
        settle();
        EXPECT_GT(painted.pixels, 0) << name;
        EXPECT_LE(painted.pixels, 40 * std::max(window.width(), window.height())) << name;
    }
}

TEST_F(Painting, OfTheCanvasEndsWhereItsBarsBegin) {
    auto& across = child<QScrollBar>("hsbTable");
    auto& down = child<QScrollBar>("vsbTable");
    const auto* const window = dynamic_cast<CanvasWindow*>(canvas().parentWidget());
    ASSERT_TRUE(window);
    EXPECT_EQ(window->geometry(), QRect(0, 0, down.x(), across.y()));
    widget->resize(700, 500);
    settle();
    EXPECT_EQ(window->geometry(), QRect(0, 0, down.x(), across.y()));
    down.hide();
    EXPECT_EQ(window->geometry(), QRect(0, 0, 700, across.y())) << "nothing is left bare";
    down.show();
    EXPECT_EQ(window->geometry(), QRect(0, 0, down.x(), across.y()));
}

TEST_F(Painting, OfAStepOfADragLeavesTheTablesAloneThatStandStill) {
    drag(table(1), {{3, 2}});
    std::vector<QWidget*> others;
    for (const int slot : {2, 3}) {
        others.push_back(&table(slot));
        for (auto* part : table(slot).findChildren<QWidget*>()) others.push_back(part);
    }
    Painted still(others);
    Painted below({&canvas()});
    drag(table(1), {{5, 3}, {8, 5}, {11, 8}});
    EXPECT_EQ(still.events, 0);
    EXPECT_GT(below.events, 0);
}

TEST_F(Painting, OfWhatRestsIsACopyOfWhatWasPainted) {
    // Before the lists are there, and with them.
    for (const bool made : {false, true}) {
        if (made)
            for (const int slot : {1, 2, 3}) table(slot).list();
        CountingStyle style;
        widget->setStyle(&style);
        for (auto* part : widget->findChildren<QWidget*>()) part->setStyle(&style);
        pictureAtRest();
        EXPECT_TRUE(line(0).rests());
        style.entries = 0;
        picture();
        EXPECT_EQ(style.entries, 0);
        made ? table(2).list().selectAll() : table(2).setTitle("ANOTHER");
        settle();
        style.entries = 0;
        widget->grab();
        EXPECT_EQ(style.entries, 4) << "those of the table that has changed";
        for (auto* part : widget->findChildren<QWidget*>()) part->setStyle(nullptr);
        widget->setStyle(nullptr);
    }
}

TEST_F(Painting, OfABarThatRestsIsACopyOfWhatWasPainted) {
    CountingStyle style;
    auto& bar = child<QScrollBar>("vsbTable");
    bar.setStyle(&style);
    pictureAtRest();
    style.bars = 0;
    const QImage before = picture();
    EXPECT_EQ(style.bars, 0);
    bar.setValue(300);
    EXPECT_NE(bar.grab().toImage(), before.copy(bar.geometry()));
    EXPECT_GT(style.bars, 0);
    bar.setStyle(nullptr);
}

TEST_F(Painting, OfALineThatMovesIsAlsoWhereItWas) {
    CanvasLine& moved = line(0);
    const QPoint before = (moved.at(0.5) / 15).toPoint();
    const Painted painted({&canvas()});
    moved.setEnds(moved.X1(), moved.Y1() + 900, moved.X2(), moved.Y2() + 900);
    const QPoint after = (moved.at(0.5) / 15).toPoint();
    settle();
    EXPECT_TRUE(painted.region.contains(after));
    EXPECT_TRUE(painted.region.contains(before)) << "it leaves a trace";
    EXPECT_FALSE(painted.region.contains((before + after) / 2));
}

TEST_F(Painting, OfALineThatMovesWaitsUntilItRests) {
    pictureAtRest();
    ASSERT_TRUE(line(0).rests());
    ASSERT_TRUE(line(1).rests());
    drag(table(2), {{3, 2}});
    EXPECT_FALSE(line(0).rests()) << "between ORDERS and CUSTOMERS";
    EXPECT_TRUE(line(1).rests());
    pictureAtRest();
    EXPECT_TRUE(line(0).rests());
}

TEST_F(Painting, OfAPictureOfAnotherScaleIsDoneAnew) {
    pictureAtRest();
    const QSize size = widget->size() * 3;
    const auto large = [&] {
        QImage image(size, QImage::Format_RGB32);
        QPainter painter(&image);
        painter.scale(3, 3);
        widget->render(&painter);
        return image;
    };
    const QImage atRest = large();
    pictureAnew();
    EXPECT_EQ(atRest, large());
}

TEST_F(Painting, IsTheSameWithWhatWasKeptAsAnew) {
    const std::vector<std::pair<const char*, std::function<void()>>> changes = {
        {"nothing", [] {}},
        {"a palette", [&] { widget->setPalette(darkPalette()); }},
        {"the old palette", [&] { widget->setPalette(QPalette()); }},
        {"a palette of the application", [&] { QApplication::setPalette(darkPalette()); }},
        {"that taken back", [&] { QApplication::setPalette(QPalette()); }},
        {"a colour of the canvas alone",
         [&] {
             QPalette other = canvas().palette();
             other.setColor(QPalette::Window, Qt::yellow);
             canvas().setPalette(other);
         }},
        {"that taken back", [&] { canvas().setPalette(QPalette()); }},
        {"a font",
         [&] {
             QFont font = widget->font();
             font.setPointSizeF(font.pointSizeF() + 3);
             widget->setFont(font);
         }},
        {"the old font", [&] { widget->setFont(QFont()); }},
        {"a style sheet", [&] { widget->setStyleSheet("QListView { color: red; }"); }},
        {"none", [&] { widget->setStyleSheet({}); }},
        {"right to left", [&] { QApplication::setLayoutDirection(Qt::RightToLeft); }},
        {"left to right", [&] { QApplication::setLayoutDirection(Qt::LeftToRight); }},
        {"disabled", [&] { widget->setEnabled(false); }},
        {"enabled", [&] { widget->setEnabled(true); }},
        {"the focus in a list", [&] { table(2).list().setFocus(Qt::TabFocusReason); }},
        {"another current entry",
         [&] { table(2).list().setCurrentIndex(table(2).model().index(2)); }},
        {"the focus on a line", [&] { canvas().focusOn(&line(0), Qt::TabFocusReason); }},
        {"the focus on the next", [&] { canvas().focusOn(&line(1), Qt::TabFocusReason); }},
        {"the focus on the canvas", [&] { canvas().focusOn(nullptr, Qt::TabFocusReason); }},
        {"the canvas scrolled with it", [&] { child<QScrollBar>("vsbTable").setValue(450); }},
        {"and sideways", [&] { child<QScrollBar>("hsbTable").setValue(615); }},
        {"and back",
         [&] {
             child<QScrollBar>("vsbTable").setValue(0);
             child<QScrollBar>("hsbTable").setValue(0);
         }},
        {"the focus in the grid", [&] { grid().view().setFocus(Qt::TabFocusReason); }},
        {"a line highlighted", [&] { line(0).BorderWidth(2); }},
        {"no longer", [&] { line(0).BorderWidth(1); }},
        {"notes on a line",
         [&] { line(0).Notes({.First = u"1", .Middle = u"=", .Second = u"n", .Sentence = {}}); }},
        {"other notes",
         [&] { line(0).Notes({.First = u"n", .Middle = {}, .Second = u"1", .Sentence = {}}); }},
        {"a line hidden", [&] { line(1).Visible(false); }},
        {"a note on a table", [&] { table(1).setNote("is not in the database"); }},
        {"another title", [&] { table(1).setTitle("ANOTHER"); }},
        {"the tables locked", [&] { widget->setReadOnly(true); }},
        {"and free", [&] { widget->setReadOnly(false); }},
        {"another current table", [&] { widget->SetCurrentTable("CUSTOMERS"); }},
        {"entries selected", [&] { table(1).list().selectAll(); }},
        {"entries not selected", [&] { table(1).list().clearSelection(); }},
        {"a list scrolled", [&] { table(1).list().verticalScrollBar()->setValue(23); }},
        {"a column that comes out", [&] { table(1).model().setComesOut(4, true); }},
        {"a key", [&] { table(1).model().setPicture(5, platform::Picture::key); }},
        {"one more column", [&] { table(2).model().append(u"ONE_MORE"); }},
        {"a table moved",
         [&] {
             drag(table(2), {{3, 2}, {31, 45}});
         }},
        {"a table over another",
         [&] {
             drag(table(2), {{30, 20}, {30, 90}});
         }},
        {"the other raised", [&] { table(3).raise(); }},
        {"a table smaller", [&] { table(1).resize(table(1).size() - QSize(15, 31)); }},
        {"a table hidden", [&] { table(3).hide(); }},
        {"and shown", [&] { table(3).show(); }},
        {"the window smaller", [&] { widget->resize(620, 410); }},
        {"and larger", [&] { widget->resize(1000, 700); }},
        {"a table closed", [&] { table(3).closeButton().click(); }},
        {"another query", [&] { bind(); }},
    };
    for (const auto& [name, change] : changes) {
        pictureAtRest();
        change();
        const QImage first = picture();
        const QImage rest = pictureAtRest();
        const QImage anew = pictureAnew();
        EXPECT_EQ(difference(first, anew), "") << name << ", at once";
        EXPECT_EQ(difference(rest, anew), "") << name << ", at rest";
    }
}
