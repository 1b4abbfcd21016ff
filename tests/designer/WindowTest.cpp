#include "Databases.h"

#include "designer/Colours.h"
#include "designer/DesignerWindow.h"
#include "designer/options/Languages.h"
#include "designer/run/ResultsPanel.h"
#include "designer/tables/RenameDialog.h"
#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/GridModel.h"
#include "frontends/qt/GridWidget.h"
#include "frontends/qt/TabuletWidget.h"
#include "support/QtHands.h"

#include <gmock/gmock.h>

#include <QAbstractButton>
#include <QAction>
#include <QApplication>
#include <QComboBox>
#include <QDockWidget>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QMessageBox>
#include <QMimeData>
#include <QStatusBar>
#include <QTimer>
#include <QTranslator>
#include <QUrl>

using namespace zandor;

using platform::qt::Canvas;
using platform::qt::GridWidget;
using platform::qt::TabuletWidget;
using testing::ElementsAre;
using testing::UnorderedElementsAre;

namespace {

class TheDesignersWindow : public testing::Test {
protected:
    void open(const designer::Arguments& arguments = {}) {
        window = std::make_unique<designer::DesignerWindow>();
        const auto error = window->openAtFirst(arguments, sampleDatabase());
        EXPECT_EQ(error.value_or(QString()), QString());
        window->show();
        QCoreApplication::processEvents();
    }

    template <class Widget>
    Widget& part(const QString& name) {
        for (QWidget* widget : window->drawing().control().findChildren<QWidget*>(name))
            if (auto* found = dynamic_cast<Widget*>(widget)) return *found;
        throw std::runtime_error("no part " + name.toStdString());
    }

    std::vector<std::string> shownTables() {
        std::vector<std::string> titles;
        for (QWidget* widget : window->drawing().control().findChildren<QWidget*>())
            if (const auto* table = dynamic_cast<TabuletWidget*>(widget);
                table && table->isVisible())
                titles.push_back(table->title().toStdString());
        return titles;
    }

    /// Names of the lines and marks that the canvas paints.
    std::vector<std::string> paintedItems() {
        std::vector<std::string> names;
        for (const auto* item : part<Canvas>("fraTable").items())
            if (item->visible()) names.push_back(item->name().toStdString());
        return names;
    }

    std::vector<std::string> gridColumn(int column) {
        const auto& model = part<GridWidget>("sprColumn").model();
        std::vector<std::string> texts;
        for (int row = 0; row < 6; ++row) texts.push_back(model.text(row, column).toStdString());
        return texts;
    }

    std::unique_ptr<designer::DesignerWindow> window;
};

} // namespace

TEST_F(TheDesignersWindow, ShowsTheTablesOfTheQuery) {
    open();
    EXPECT_THAT(shownTables(), UnorderedElementsAre("customers", "orders", "order_lines",
                                                    "products", "categories"));
}

TEST_F(TheDesignersWindow, ShowsEachJoinAsALineBetweenTwoMarks) {
    open({.tables = {"customers", "orders", "products"}});
    EXPECT_THAT(paintedItems(), UnorderedElementsAre("linJoin(1)", "shpJoin(1)", "shpJoin(2)"));
    open();
    EXPECT_THAT(paintedItems(),
                UnorderedElementsAre("linJoin(1)", "linJoin(2)", "linJoin(3)", "linJoin(4)",
                                     "shpJoin(1)", "shpJoin(2)", "shpJoin(3)", "shpJoin(4)",
                                     "shpJoin(5)", "shpJoin(6)", "shpJoin(7)", "shpJoin(8)"));
}

TEST_F(TheDesignersWindow, ShowsTheOutputColumnsOfTheExample) {
    open();
    EXPECT_TRUE(part<GridWidget>("sprColumn").isVisible());
    EXPECT_THAT(gridColumn(0),
                ElementsAre("Field:", "Synonym:", "Sort:", "Visible:", "Criteria:", "Or:"));
    EXPECT_THAT(gridColumn(1), ElementsAre("customers.country_code", "country", "", "Visible",
                                           "= 'DE'", "= 'AT'"));
    EXPECT_THAT(gridColumn(2),
                ElementsAre("orders.ordered_at", "", "Ascending", "Visible", "", ""));
    EXPECT_THAT(gridColumn(3),
                ElementsAre("order_lines.quantity", "", "", "Visible", ">= 10", ">= 20"));
    EXPECT_THAT(gridColumn(4), ElementsAre("order_lines.unit_price", "", "", "Visible", "", ""));
    EXPECT_THAT(gridColumn(5),
                ElementsAre("products.is_discontinued", "", "", "Not Visible", "= 0", "= 0"));
    EXPECT_THAT(gridColumn(6), ElementsAre("", "", "", "", "", ""));
}

TEST_F(TheDesignersWindow, ShowsAnEmptyGridForAQueryWithoutOutputColumns) {
    open({.tables = {"orders"}});
    EXPECT_TRUE(part<GridWidget>("sprColumn").isVisible());
    EXPECT_EQ(gridColumn(1), std::vector<std::string>(6));
}

TEST_F(TheDesignersWindow, NamesTheDatabaseAndSaysWhatIsInTheQuery) {
    open();
    EXPECT_EQ(window->windowTitle(),
              QStringLiteral("Untitled[*] \u2014 trading.sqlite \u2014 Zandor Designer"));
    EXPECT_EQ(window->statusBar()->findChild<QLabel*>("counts")->text(), "Tables: 5   Joins: 4");
}

TEST_F(TheDesignersWindow, NeverWritesOneTextOverAnotherInItsStatusBar) {
    open();
    auto& counts = *window->statusBar()->findChild<QLabel*>("counts");
    EXPECT_TRUE(counts.isVisible());
    const QString message(300, u'x');
    // Also one that was there before the window.
    for (const bool shown : {true, false}) {
        window->setVisible(shown);
        window->statusBar()->showMessage(message);
        window->show();
        QCoreApplication::processEvents();
        EXPECT_TRUE(counts.isVisible());
        const QRect place(counts.mapTo(window->statusBar(), QPoint()), counts.size());
        const QImage with = window->statusBar()->grab(place).toImage();
        window->statusBar()->clearMessage();
        EXPECT_EQ(with, window->statusBar()->grab(place).toImage());
    }
    window->statusBar()->showMessage(message);
    EXPECT_EQ(window->statusBar()->toolTip(), message);
    window->document().setQuery(platform::makeRef<model::Query>());
    EXPECT_EQ(window->statusBar()->currentMessage(), "");
}

TEST_F(TheDesignersWindow, TicksTheColoursThatAreUsed) {
    designer::useDarkColours(); // as the command line asks for it
    open();
    auto* const dark = window->findChild<QAction*>("dark");
    EXPECT_TRUE(dark->isChecked());
    dark->trigger();
    EXPECT_FALSE(designer::areColoursDark());
    open();
    EXPECT_FALSE(window->findChild<QAction*>("dark")->isChecked());
    QSettings().clear();
}

TEST_F(TheDesignersWindow, ShowsNoTraceBoxesAndNoReports) {
    open();
    EXPECT_EQ(window->drawing().control().DebugSwitch(), 0);
    EXPECT_EQ(QApplication::activeModalWidget(), nullptr);
}

TEST_F(TheDesignersWindow, BindsTheWholeSample) {
    open({.tables = sampleTables()});
    EXPECT_EQ(shownTables().size(), 16U);
    EXPECT_EQ(paintedItems().size(), 3U * 19U);
}

TEST_F(TheDesignersWindow, MarksAQueryThatIsNotSaved) {
    open();
    EXPECT_FALSE(window->isWindowModified());
    window->document().change(
        "Delete", [](model::Query& query) { query.DeleteTable(query.tableNamed(u"orders")); });
    EXPECT_TRUE(window->isWindowModified());
    window->document().undo();
    EXPECT_FALSE(window->isWindowModified());
}

TEST_F(TheDesignersWindow, AsksBeforeAnUnsavedQueryIsLost) {
    open();
    window->document().change(
        "Delete", [](model::Query& query) { query.DeleteTable(query.tableNamed(u"orders")); });
    bool asked = false;
    const auto answer = [&](QMessageBox::StandardButton button) {
        QTimer::singleShot(0, [&asked, button] {
            auto* const box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget());
            ASSERT_TRUE(box);
            asked = true;
            box->button(button)->click();
        });
    };
    answer(QMessageBox::Cancel);
    EXPECT_FALSE(window->close());
    EXPECT_TRUE(asked);
    EXPECT_TRUE(window->isVisible());
    answer(QMessageBox::Discard);
    EXPECT_TRUE(window->close());
}

TEST_F(TheDesignersWindow, PutsItsPanelsWhereTheyWereLastTime) {
    open();
    auto* const tables = window->findChild<QDockWidget*>("tablesDock");
    EXPECT_EQ(window->dockWidgetArea(tables), Qt::LeftDockWidgetArea);
    window->addDockWidget(Qt::RightDockWidgetArea, tables);
    window->findChild<QDockWidget*>("resultsDock")->hide();
    window->resize(900, 700);
    EXPECT_TRUE(window->close());

    open();
    EXPECT_EQ(window->dockWidgetArea(window->findChild<QDockWidget*>("tablesDock")),
              Qt::RightDockWidgetArea);
    EXPECT_FALSE(window->findChild<QDockWidget*>("resultsDock")->isVisible());
    EXPECT_EQ(window->size(), QSize(900, 700));
    QSettings().clear();
}

TEST_F(TheDesignersWindow, UndoesWhatWasDoneWithTheControl) {
    open();
    const auto before = window->document().query()->record();
    auto& close = part<TabuletWidget>("lstTable(2)").closeButton();
    hands::click(close, QRectF(close.rect()).center());
    QCoreApplication::processEvents();
    EXPECT_THAT(shownTables(),
                UnorderedElementsAre("customers", "order_lines", "products", "categories"));
    QAction* const undo = window->findChild<QAction*>("undo");
    EXPECT_EQ(undo->text(), "&Undo Delete table orders");
    undo->trigger();
    EXPECT_EQ(window->document().query()->record(), before);
    EXPECT_EQ(shownTables().size(), 5U);
    EXPECT_EQ(paintedItems().size(), 12U);
    window->findChild<QAction*>("redo")->trigger();
    EXPECT_EQ(shownTables().size(), 4U);
    window->document().setModified(false);
}

TEST_F(TheDesignersWindow, RedoesByBothKeysThatPeopleKnow) {
    open({.tables = {"orders"}});
    const auto keys = window->findChild<QAction*>("redo")->shortcuts();
    EXPECT_TRUE(keys.contains(QKeySequence(Qt::CTRL | Qt::Key_Y)));
    EXPECT_TRUE(keys.contains(QKeySequence(Qt::CTRL | Qt::SHIFT | Qt::Key_Z)));
}

TEST_F(TheDesignersWindow, GivesTheControlTheOptionsThatAreChosen) {
    open();
    QVariantMap options = window->drawing().options();
    options["LNGSpreadField"] = "Feld:";
    window->drawing().setOptions(options);
    EXPECT_EQ(gridColumn(0).front(), "Feld:");
    // And every control that is made later.
    emit window->document().outdated();
    EXPECT_EQ(gridColumn(0).front(), "Feld:");
}

TEST_F(TheDesignersWindow, OpensADatabaseThatIsDroppedOnIt) {
    DatabaseFolder folder;
    open();
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(
        folder.database("dropped.db", {"CREATE TABLE only (id INTEGER PRIMARY KEY)"}))});
    const QPoint at(5, 5);
    QDragEnterEvent enter(at, Qt::CopyAction, &data, Qt::LeftButton, {});
    QCoreApplication::sendEvent(window.get(), &enter);
    EXPECT_TRUE(enter.isAccepted());
    QDropEvent drop(at, Qt::CopyAction, &data, Qt::NoButton, {});
    QCoreApplication::sendEvent(window.get(), &drop);
    QCoreApplication::processEvents();
    EXPECT_EQ(window->database().name(), "dropped.db");
    EXPECT_TRUE(shownTables().empty());
    // What is no database is none to it.
    data.setUrls({QUrl::fromLocalFile(folder.file("words.txt", "words"))});
    QDragEnterEvent other(at, Qt::CopyAction, &data, Qt::LeftButton, {});
    QCoreApplication::sendEvent(window.get(), &other);
    EXPECT_FALSE(other.isAccepted());
}

TEST_F(TheDesignersWindow, WarnsWhenTheGridIsFull) {
    open({.tables = {"orders"}});
    const auto fill = [&](int count) {
        window->document().change("Add", [&](model::Query& query) {
            const auto column = query.tableNamed(u"orders")->columnNamed(u"id");
            while (query.ColumnDefinitions().Count() < count) {
                const auto definition = platform::makeRef<model::ColumnDefinition>();
                definition->Column(column);
                query.AddColumnDefinition(definition);
            }
        });
    };
    fill(254);
    bool warned = false;
    QTimer::singleShot(0, [&] {
        auto* const box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget());
        ASSERT_TRUE(box);
        warned = box->text().contains("255 output columns");
        box->accept();
    });
    fill(255);
    EXPECT_TRUE(warned);
    window->document().setModified(false);
}

TEST_F(TheDesignersWindow, RenamesATableEverywhere) {
    open();
    designer::RenameDialog dialog(window->document(), window.get());
    dialog.findChild<QComboBox*>("renameTable")->setCurrentText("orders");
    auto* const name = dialog.findChild<QLineEdit*>("renameName");
    name->setText("Customers");
    dialog.accept();
    EXPECT_EQ(dialog.findChild<QLabel*>("renameFault")->text(),
              "Another table of this query is called \"Customers\"; choose another name.");
    name->setText("sold");
    dialog.accept();
    EXPECT_EQ(dialog.result(), QDialog::Accepted);
    EXPECT_THAT(shownTables(), testing::Contains("sold"));
    EXPECT_EQ(window->document().query()->tableNamed(u"orders"), nullptr);
    window->document().undo();
    EXPECT_THAT(shownTables(), testing::Contains("orders"));
}

TEST_F(TheDesignersWindow, HasRoomForItsPanelsOnASmallScreen) {
    open();
    window->resize(1366, 720); // what a task bar leaves of 768
    QCoreApplication::processEvents();
    EXPECT_EQ(window->size(), QSize(1366, 720));
    EXPECT_GE(window->drawing().height(), 400);
    EXPECT_GE(window->drawing().width(), 1000);
    EXPECT_LE(window->minimumSizeHint().height(), 720);
}

TEST_F(TheDesignersWindow, FitsTheScreensThatPeopleHaveInEveryLanguage) {
    // 1600x1000 at 150 %, and 1024x600, each without a task bar and a title.
    constexpr QSize smallest(1024, 540);
    for (const char* language : {"en", "de", "fr", "es"}) {
        QTranslator translator;
        ASSERT_TRUE(designer::loadCatalogue(translator, QLocale(QLatin1String(language))));
        QCoreApplication::installTranslator(&translator);
        open();
        window->findChild<QDockWidget*>("eventsDock")->show();
        QCoreApplication::processEvents();
        const QSize least = window->minimumSizeHint();
        EXPECT_LE(least.width(), smallest.width()) << language;
        EXPECT_LE(least.height(), smallest.height()) << language;
        window->resize(smallest);
        QCoreApplication::processEvents();
        EXPECT_EQ(window->size(), smallest) << language;
        EXPECT_GE(window->drawing().height(), 240) << language;
        QCoreApplication::removeTranslator(&translator);
    }
}

TEST_F(TheDesignersWindow, LeadsToEachOfItsPartsByAKey) {
    open();
    window->activateWindow();
    const auto go = [&](const char* name) {
        for (QAction* action : window->findChild<QMenu*>("goMenu")->actions())
            if (action->objectName() == name) action->trigger();
        QCoreApplication::processEvents();
        return window->focusWidget();
    };
    const auto isIn = [&](const QWidget* focus, const char* dock) {
        return focus && window->findChild<QDockWidget*>(dock)->isAncestorOf(focus);
    };
    window->findChild<QDockWidget*>("tablesDock")->hide();
    EXPECT_TRUE(isIn(go("goTables"), "tablesDock"));
    EXPECT_TRUE(isIn(go("goStatement"), "statementDock"));
    EXPECT_TRUE(window->drawing().isAncestorOf(go("goDrawing")));
    go("goResults");
    EXPECT_TRUE(window->results().isVisible());
}
