#include "OpenWindow.h"

#include <QDrag>
#include <QLabel>
#include <QMimeData>
#include <QUndoStack>

using testing::ElementsAre;
using testing::IsEmpty;
using testing::UnorderedElementsAre;

namespace {

class ATableOfThePanel : public OpenWindow {
protected:
    /// Carries a table from the panel over a part of the window.
    void carry(const QString& table, QWidget& over, QPointF at) {
        QDrag drag(&list());
        drag.setMimeData(list().model()->mimeData({row(table)}));
        hands::carry(drag, over, at);
        calm();
    }
    QLabel& invitation() { return *window->findChild<QLabel*>("invitation"); }
    QWidget& canvas() { return part<QWidget>("fraTable"); }
};

} // namespace

TEST_F(ATableOfThePanel, IsInvitedOnAnEmptyDrawing) {
    open();
    EXPECT_FALSE(invitation().isVisible());
    command("new");
    EXPECT_TRUE(invitation().isVisible());
    EXPECT_THAT(invitation().text().toStdString(), testing::StartsWith("Drag a table here"));
    // It is to be read, and in nobody's way.
    const QPoint middle = invitation().geometry().center();
    EXPECT_TRUE(window->drawing().rect().contains(invitation().geometry()));
    EXPECT_NE(window->drawing().childAt(middle), &invitation());
    // A control that is made anew does not cover it.
    emit window->document().outdated();
    EXPECT_EQ(window->drawing().children().last(), &invitation());
    add("orders");
    EXPECT_FALSE(invitation().isVisible());
    command("undo");
    EXPECT_TRUE(invitation().isVisible());
    command("redo");
    EXPECT_FALSE(invitation().isVisible());
}

TEST_F(ATableOfThePanel, SaysBelowHowItsColumnsAreChosen) {
    open({.file = sampleDatabase()});
    QLabel& hint = *window->findChild<QLabel*>("gridHint");
    EXPECT_FALSE(hint.isVisible());
    add("orders");
    EXPECT_TRUE(hint.isVisible());
    const auto& grid = part<QWidget>("sprColumn");
    const QRect cells(grid.mapTo(&window->drawing(), QPoint()), grid.size());
    EXPECT_TRUE(cells.contains(hint.geometry()));
    EXPECT_GE(hint.height(), hint.heightForWidth(hint.width()));
    EXPECT_NE(window->drawing().childAt(hint.geometry().center()), &hint);
    window->document().change("Add", [](zandor::model::Query& drawn) {
        const auto definition = zandor::platform::makeRef<zandor::model::ColumnDefinition>();
        definition->Column(drawn.tableNamed(u"orders")->columnNamed(u"id"));
        drawn.AddColumnDefinition(definition);
    });
    EXPECT_FALSE(hint.isVisible());
    command("undo");
    EXPECT_TRUE(hint.isVisible());
    window->document().setModified(false);
}

TEST_F(ATableOfThePanel, IsInvitedWhenADatabaseIsNamedAtTheStart) {
    open({.file = sampleDatabase()});
    EXPECT_THAT(shownTables(), IsEmpty());
    EXPECT_TRUE(invitation().isVisible());
    EXPECT_EQ(list().model()->rowCount(), 16);
    EXPECT_FALSE(window->isWindowModified());
    add("orders");
    EXPECT_THAT(shownTables(), ElementsAre("orders"));
    window->document().setModified(false);
}

TEST_F(ATableOfThePanel, ComesWithItsJoinsByADoubleClick) {
    open({.tables = {"customers"}});
    add("orders");
    EXPECT_THAT(shownTables(), UnorderedElementsAre("customers", "orders"));
    EXPECT_EQ(query().Joins().Count(), 1);
    EXPECT_EQ(window->findChild<QLabel*>("counts")->text(), "Tables: 2   Joins: 1");
    EXPECT_EQ(window->document().steps().count(), 1);
    // The canvas was scrolled to the table that was added, and is smaller then.
    const Answering nothing({});
    command("undo");
    EXPECT_THAT(shownTables(), ElementsAre("customers"));
    EXPECT_FALSE(window->isWindowModified());
}

TEST_F(ATableOfThePanel, StandsWhereItIsDropped) {
    open({.tables = {"customers"}});
    carry("orders", canvas(), {500, 40});
    auto* const orders = shownTable("orders");
    ASSERT_TRUE(orders);
    EXPECT_EQ(orders->mapTo(&canvas(), QPoint()), QPoint(500, 40));
    EXPECT_EQ(query().Joins().Count(), 1);
    EXPECT_EQ(window->document().steps().undoText(), "Add table orders");
}

TEST_F(ATableOfThePanel, IsTakenByAnEmptyDrawingThroughTheInvitation) {
    open();
    command("new");
    carry("orders", window->drawing(), invitation().geometry().center());
    EXPECT_THAT(shownTables(), ElementsAre("orders"));
}

TEST_F(ATableOfThePanel, GetsAnotherNameWhenItIsThereAlready) {
    open();
    command("new");
    add("employees");
    add("employees");
    add("employees");
    EXPECT_THAT(shownTables(), UnorderedElementsAre("employees", "employees_1", "employees_2"));
}

TEST_F(ATableOfThePanel, IsRefusedAsTheSeventeenth) {
    open({.tables = sampleTables()});
    ASSERT_EQ(shownTables().size(), 16U);
    std::string text;
    answering([&](QMessageBox& box) { text = box.text().toStdString(), box.accept(); },
              [&] { add("orders"); });
    EXPECT_EQ(text, "The drawing takes 16 tables, and has them; delete one first.");
    EXPECT_EQ(shownTables().size(), 16U);
    EXPECT_FALSE(window->isWindowModified());
}
