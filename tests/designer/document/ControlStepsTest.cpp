#include "Drawing.h"

#include "designer/DrawingArea.h"
#include "frontends/qt/GridModel.h"
#include "frontends/qt/GridWidget.h"
#include "frontends/qt/QtToolkit.h"
#include "frontends/qt/TabuletWidget.h"
#include "support/QtHands.h"

#include <QMenu>
#include <QTimer>

using namespace zandor;

// What a user does on the control becomes steps.

namespace {

using platform::qt::GridWidget;
using platform::qt::TabuletWidget;

/// The control selects the table that has the focus, which is part of no step.
model::QueryRecord unselected(model::QueryRecord record) {
    for (auto& table : record.tables) table.selected = 0;
    return record;
}

class TheControl : public testing::Test {
protected:
    TheControl() {
        drawing.table(u"customers")->Left(300);
        drawing.table(u"customers")->Top(300);
        drawing.table(u"orders")->Left(4500);
        drawing.table(u"orders")->Top(300);
        drawing.document.setQuery(drawing.document.query());
        area.resize(900, 600);
        area.show();
        calm();
    }

    static void calm() {
        for (int n = 0; n < 3; ++n) {
            QCoreApplication::processEvents();
            QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        }
    }

    template <class Widget>
    Widget& part(const QString& name) {
        auto* found = dynamic_cast<Widget*>(area.control().findChild<QWidget*>(name));
        if (!found) throw std::logic_error("no part " + name.toStdString());
        return *found;
    }
    TabuletWidget& box(int index) {
        return part<TabuletWidget>(QStringLiteral("lstTable(%1)").arg(index));
    }
    QPointF entry(int index, int row) {
        auto& list = box(index).list();
        return QRectF(list.visualRect(list.model()->index(row, 0))).center();
    }

    void pull(QWidget& widget, QPointF grip, QPointF by) {
        const QPointF end = widget.mapToGlobal(grip) + by;
        hands::mouse(widget, QEvent::MouseButtonPress, grip, Qt::LeftButton, Qt::LeftButton);
        hands::mouse(widget, QEvent::MouseMove, widget.mapFromGlobal(end), Qt::NoButton,
                     Qt::LeftButton);
        hands::mouse(widget, QEvent::MouseButtonRelease, widget.mapFromGlobal(end), Qt::LeftButton);
        calm();
    }

    /// Drags the selected entries of the first table.
    void drag(QWidget& over, QPointF at) {
        area.control().toolkit().drags().setCarrier(
            [&](QDrag& carried) { hands::carry(carried, over, at); });
        QWidget& list = *box(1).list().viewport();
        hands::mouse(list, QEvent::MouseButtonPress, entry(1, 1), Qt::LeftButton, Qt::LeftButton);
        hands::mouse(list, QEvent::MouseMove, entry(1, 1) + QPointF(1, 1), Qt::NoButton,
                     Qt::LeftButton);
        calm();
    }

    /// Chooses from the menu over an entry, the way the menu key does.
    void choose(int table, int row, const QString& name) {
        QWidget& list = *box(table).list().viewport();
        hands::click(list, entry(table, row));
        calm();
        QTimer::singleShot(0, [name] {
            auto* menu = qobject_cast<QMenu*>(QApplication::activePopupWidget());
            ASSERT_TRUE(menu);
            for (QAction* action : menu->actions())
                if (action->objectName() == name) menu->setActiveAction(action);
            hands::key(*menu, Qt::Key_Return);
            menu->close();
        });
        hands::mouse(list, QEvent::MouseButtonRelease, entry(table, row), Qt::RightButton);
        calm();
        area.activateWindow(); // off screen nobody gives it the focus back
        calm();
    }

    int steps() { return drawing.steps.count(); }
    std::string step() { return drawing.lastStep().toStdString(); }

    Drawing drawing;
    designer::DrawingArea area{drawing.document};
};

} // namespace

TEST_F(TheControl, ModifiesNothingByShowingAQuery) {
    drawing.document.setQuery(platform::makeRef<model::Query>());
    drawing.query().addTable(Drawing::described(u"unplaced"));
    drawing.document.setQuery(drawing.document.query());
    calm();
    hands::click(*box(1).list().viewport(), entry(1, 1));
    calm();
    EXPECT_FALSE(drawing.document.isModified());
}

TEST_F(TheControl, MovesATableAsAStepThatMovesItBack) {
    const QRect before = box(1).geometry();
    pull(box(1), QRectF(box(1).titleBar()).center(), {60, 30});
    EXPECT_EQ(step(), "Move table customers");
    const QRect after = box(1).geometry();
    EXPECT_EQ(after, before.translated(60, 30));
    drawing.document.undo();
    calm();
    EXPECT_EQ(box(1).geometry(), before);
    drawing.document.redo();
    calm();
    EXPECT_EQ(box(1).geometry(), after);
}

TEST_F(TheControl, ResizesATableAsAStepAlthoughItTellsNobody) {
    const QRect before = box(2).geometry();
    pull(box(2), QPointF(box(2).width() - 2, box(2).height() - 2), {50, 40});
    EXPECT_EQ(step(), "Resize table orders");
    EXPECT_EQ(box(2).size(), before.size() + QSize(50, 40));
    drawing.document.undo();
    calm();
    EXPECT_EQ(box(2).geometry(), before);
}

TEST_F(TheControl, AddsTheColumnsOfOneDropAsOneStep) {
    auto& list = box(1).list();
    list.selectAll();
    drag(part<GridWidget>(QStringLiteral("sprColumn")), {200, 60});
    EXPECT_EQ(drawing.query().ColumnDefinitions().Count(), 3);
    EXPECT_EQ(step(), "Add 3 column(s)");
    EXPECT_EQ(steps(), 1);
    drawing.document.undo();
    calm();
    EXPECT_EQ(part<GridWidget>(QStringLiteral("sprColumn")).model().text(0, 1), "");
}

TEST_F(TheControl, JoinsByADropAndByItsMenu) {
    drag(*box(2).list().viewport(), entry(2, 2));
    EXPECT_EQ(step(), "Add join customers - orders");
    choose(1, 1, QStringLiteral("mnuTableDefinitionCopy"));
    EXPECT_EQ(steps(), 1);
    choose(2, 1, QStringLiteral("mnuTableDefinitionPaste"));
    EXPECT_EQ(drawing.query().Joins().Count(), 2);
    EXPECT_EQ(steps(), 2) << "of which the control tells nobody";
}

TEST_F(TheControl, DeletesATableWithAllThatHangsOnItAsOneStep) {
    drawing.join(u"customers", u"orders");
    drawing.define(u"orders", u"status");
    drawing.document.setQuery(drawing.document.query());
    calm();
    const auto before = drawing.query().record();
    hands::click(*box(2).list().viewport(), entry(2, 1));
    calm();
    hands::key(*area.window()->focusWidget(), Qt::Key_Delete);
    calm();
    EXPECT_EQ(drawing.query().Tables().Count(), 1);
    EXPECT_EQ(step(), "Delete table orders");
    EXPECT_EQ(steps(), 1);
    drawing.document.undo();
    calm();
    EXPECT_EQ(unselected(drawing.query().record()), unselected(before));
    EXPECT_EQ(box(2).title(), "orders");
    EXPECT_EQ(part<GridWidget>(QStringLiteral("sprColumn")).model().text(0, 1), "orders.status");
}
