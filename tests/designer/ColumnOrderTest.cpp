#include "OpenWindow.h"

#include "designer/document/Document.h"
#include "designer/run/ResultTable.h"
#include "designer/run/ResultsPanel.h"
#include "designer/statement/SqlView.h"
#include "frontends/qt/GridModel.h"
#include "frontends/qt/QtToolkit.h"

#include <QAbstractItemModel>
#include <QComboBox>
#include <QMenu>
#include <QRegularExpression>
#include <QTimer>
#include <QUndoStack>

using namespace zandor;

using platform::qt::GridWidget;
using testing::ElementsAre;

namespace {

/// A table of four columns, the first and the last of which come out; another one is dropped
/// between them.
class TheOrderOfColumns : public OpenWindow {
protected:
    using Names = std::vector<std::string>;

    TheOrderOfColumns() {
        const QString database = folder.database(
            "shop.db", {"CREATE TABLE things (id INTEGER PRIMARY KEY, name TEXT, price INTEGER, "
                        "weight INTEGER)",
                        "INSERT INTO things VALUES (1, 'Lamp', 20, 300)"});
        open({.file = database, .tables = {"things"}});
        window->resize(1340, 900);
        calm();
        addEntry("id");
        addEntry("weight");
    }
    ~TheOrderOfColumns() override {
        if (window) window->document().setModified(false);
    }

    QPointF entry(const QString& column) {
        auto& entries = shownTable("things")->list();
        for (int row = 0; row < entries.model()->rowCount(); ++row) {
            const QModelIndex index = entries.model()->index(row, 0);
            if (index.data().toString() == column)
                return QRectF(entries.visualRect(index)).center();
        }
        ADD_FAILURE() << "no entry " << column.toStdString();
        return {};
    }

    void addEntry(const QString& column) {
        QWidget& view = *shownTable("things")->list().viewport();
        const QPointF at = entry(column);
        hands::click(view, at);
        hands::mouse(view, QEvent::MouseButtonDblClick, at, Qt::LeftButton, Qt::LeftButton);
        hands::mouse(view, QEvent::MouseButtonRelease, at, Qt::LeftButton);
        calm();
    }

    void dropOnColumn(const QString& column, int onto) {
        const QPoint cell = grid().cellRect(1, onto).center();
        QWidget& over = *grid().childAt(cell);
        window->drawing().control().toolkit().drags().setCarrier(
            [&](QDrag& carried) { hands::carry(carried, over, over.mapFrom(&grid(), cell)); });
        QWidget& view = *shownTable("things")->list().viewport();
        const QPointF at = entry(column);
        hands::mouse(view, QEvent::MouseButtonPress, at, Qt::LeftButton, Qt::LeftButton);
        hands::mouse(view, QEvent::MouseMove, at + QPointF(2, 2), Qt::NoButton, Qt::LeftButton);
        calm();
    }

    GridWidget& grid() { return part<GridWidget>("sprColumn"); }

    Names fields() {
        grid().bringUpToDate();
        Names names;
        for (int col = 1; !grid().model().text(0, col).isEmpty(); ++col)
            names.push_back(grid().model().text(0, col).toStdString());
        return names;
    }

    /// What the statement asks for, in its order, without quotes.
    Names asked() {
        static const QRegularExpression list("^SELECT\\s(.*)\\sFROM\\s",
                                             QRegularExpression::DotMatchesEverythingOption);
        Names names;
        const QString statement = window->findChild<designer::SqlView*>()->statement();
        for (const QString& one : list.match(statement).captured(1).split(u','))
            names.push_back(one.simplified().remove(u'"').toStdString());
        return names;
    }

    /// The cells of the first row of a run.
    Names row() {
        window->results().run();
        EXPECT_TRUE(until([&] { return !window->results().isRunning(); }));
        const auto& rows = window->findChild<designer::ResultTable*>()->rows();
        Names cells;
        for (int col = 0; rows.rowCount() > 0 && col < rows.columnCount(); ++col)
            cells.push_back(rows.index(0, col).data().toString().toStdString());
        return cells;
    }

    /// Renames the table of this title by the menu on it.
    void rename(const QString& title, const QString& name) {
        auto& box = *shownTable(title);
        const Answering answers({[&](QDialog& dialog) {
            EXPECT_EQ(dialog.findChild<QComboBox*>("renameTable")->currentText(), title);
            dialog.findChild<QLineEdit*>("renameName")->setText(name);
            ::press(dialog, "&Rename");
        }});
        QTimer::singleShot(0, [] {
            auto* const menu = qobject_cast<QMenu*>(QApplication::activePopupWidget());
            ASSERT_TRUE(menu);
            for (QAction* action : menu->actions())
                if (action->objectName() == "mnuTableRename") menu->setActiveAction(action);
            hands::key(*menu, Qt::Key_Return);
        });
        const QPointF at = QRectF(box.titleBar()).center();
        hands::mouse(box, QEvent::MouseButtonPress, at, Qt::RightButton, Qt::RightButton);
        hands::mouse(box, QEvent::MouseButtonRelease, at, Qt::RightButton);
        calm();
    }

    void expectBetween() {
        EXPECT_THAT(fields(), ElementsAre("things.id", "things.name", "things.weight"));
        EXPECT_THAT(asked(), ElementsAre("things.id", "things.name", "things.weight"));
        EXPECT_THAT(row(), ElementsAre("1", "Lamp", "300"));
    }
};

} // namespace

TEST_F(TheOrderOfColumns, IsThatOfTheGridInStatementAndRows) {
    EXPECT_THAT(fields(), ElementsAre("things.id", "things.weight"));
    dropOnColumn("name", 2);
    expectBetween();
}

TEST_F(TheOrderOfColumns, IsUndoneAndRedoneWithTheDrop) {
    dropOnColumn("name", 2);
    command("undo");
    EXPECT_THAT(fields(), ElementsAre("things.id", "things.weight"));
    EXPECT_THAT(asked(), ElementsAre("things.id", "things.weight"));
    EXPECT_THAT(row(), ElementsAre("1", "300"));
    command("redo");
    expectBetween();
    dropOnColumn("price", 1);
    EXPECT_THAT(fields(), ElementsAre("things.price", "things.id", "things.name", "things.weight"));
    command("undo");
    expectBetween();
}

TEST_F(TheOrderOfColumns, ComesBackWithTheFile) {
    dropOnColumn("name", 2);
    const QString path = folder.path("order.json");
    commandWithFile("saveAs", path);
    open({.file = path});
    window->resize(1340, 900);
    calm();
    expectBetween();
    EXPECT_FALSE(window->document().isModified());
    dropOnColumn("price", 2); // and goes on to be one that can be changed
    EXPECT_THAT(fields(), ElementsAre("things.id", "things.price", "things.name", "things.weight"));
    EXPECT_THAT(asked(), ElementsAre("things.id", "things.price", "things.name", "things.weight"));
}

TEST_F(TheOrderOfColumns, StaysWhenTheTableIsRenamedByItsMenuWhichIsOneStep) {
    dropOnColumn("name", 2);
    const int steps = window->document().steps().count();
    rename("things", "wares");
    EXPECT_EQ(window->document().steps().count(), steps + 1);
    ASSERT_TRUE(shownTable("wares"));
    EXPECT_FALSE(shownTable("things"));
    EXPECT_THAT(fields(), ElementsAre("wares.id", "wares.name", "wares.weight"));
    EXPECT_THAT(asked(), ElementsAre("wares.id", "wares.name", "wares.weight"));
    EXPECT_THAT(row(), ElementsAre("1", "Lamp", "300"));
    command("undo");
    ASSERT_TRUE(shownTable("things"));
    expectBetween();
    command("redo");
    EXPECT_THAT(fields(), ElementsAre("wares.id", "wares.name", "wares.weight"));
}
