#include "Drawing.h"
#include "database/Answers.h"

#include "designer/tables/TableDropTarget.h"
#include "designer/tables/tableMime.h"
#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/TabuletWidget.h"

#include <gmock/gmock.h>

#include <QDrag>
#include <QMimeData>

using namespace zandor;

using testing::ElementsAre;

namespace {

class DroppingTables : public Drawing {
protected:
    DroppingTables() {
        openSample();
        QObject::connect(&target, &designer::TableDropTarget::dropped, &adding,
                         &designer::TableAdding::add);
    }

    /// Over whatever part of the control is there.
    void drop(const QStringList& names, QPoint at) {
        std::vector<reader::TableId> tables;
        for (const QString& name : names) tables.push_back({u"", name.toStdU16String()});
        QDrag drag(&area);
        drag.setMimeData(designer::tablesAsMime(tables).release());
        hands::carry(drag, area, at);
        QCoreApplication::processEvents();
    }

    QWidget* shownTable(const QString& title) {
        for (QWidget* widget : area.findChildren<QWidget*>())
            if (const auto* table = dynamic_cast<platform::qt::TabuletWidget*>(widget);
                table && table->isVisible() && table->title() == title)
                return widget;
        return nullptr;
    }

    designer::TableDropTarget target{area};
};

} // namespace

TEST_F(DroppingTables, AddsThemWhereTheyAreDropped) {
    drop({QStringLiteral("orders")}, {300, 120});
    const QWidget* const orders = shownTable(QStringLiteral("orders"));
    ASSERT_NE(orders, nullptr);
    EXPECT_EQ(orders->mapTo(&area, QPoint()), QPoint(300, 120));
}

TEST_F(DroppingTables, AddsThemWhereTheyAreDroppedOnACanvasThatIsScrolled) {
    add({QStringLiteral("customers")}, QPoint(25000, 25000));
    auto& control = area.control();
    control.setHorizontalScrollbarPos(control.HorizMaxScrollPos());
    control.setVerticalScrollbarPos(control.VertMaxScrollPos());
    ASSERT_NE(area.canvasPlace({}), QPoint());
    const QPoint expected = area.canvasPlace({40, 30});
    drop({QStringLiteral("orders")}, {40, 30});
    EXPECT_EQ(place(QStringLiteral("orders")).topLeft(), expected);
}

TEST_F(DroppingTables, AddsThemOverAnotherTableToo) {
    drop({QStringLiteral("orders")}, {300, 120});
    drop({QStringLiteral("customers")}, {320, 150});
    const QWidget* const customers = shownTable(QStringLiteral("customers"));
    ASSERT_NE(customers, nullptr);
    EXPECT_EQ(customers->mapTo(&area, QPoint()), QPoint(320, 150));
    EXPECT_THAT(joins(), ElementsAre("orders.customer_id = customers.id"));
}

TEST_F(DroppingTables, FindsAPlaceForThoseDroppedOnTheGrid) {
    drop({QStringLiteral("orders")}, {300, 600});
    EXPECT_EQ(place(QStringLiteral("orders")).topLeft(), QPoint(300, 300));
}

TEST_F(DroppingTables, TakesNothingElse) {
    QDrag drag(&area);
    auto* const text = new QMimeData;
    text->setText(QStringLiteral("orders"));
    drag.setMimeData(text);
    hands::carry(drag, area, {300, 120});
    QCoreApplication::processEvents();
    EXPECT_EQ(query().Tables().Count(), 0);
}
