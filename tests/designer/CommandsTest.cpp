#include "OpenWindow.h"

#include "designer/database/ConnectionBanner.h"
#include "designer/database/ErrorLine.h"
#include "designer/options/Languages.h"
#include "designer/run/ParameterDialog.h"
#include "designer/run/ResultTable.h"
#include "designer/run/ResultsPanel.h"
#include "frontends/qt/GridModel.h"
#include "frontends/qt/QtToolkit.h"

#include <QClipboard>
#include <QDialogButtonBox>
#include <QDockWidget>
#include <QFile>
#include <QImage>
#include <QLabel>
#include <QPushButton>
#include <QStatusBar>
#include <QTabWidget>
#include <QTableWidget>
#include <QTranslator>
#include <QTreeWidget>
#include <QUndoStack>

using namespace zandor;

using platform::qt::GridWidget;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::StartsWith;

namespace {

class TheWindowsCommands : public OpenWindow {
protected:
    /// Drags the selected entries of a table onto a column of the grid.
    void dragToGrid(const QString& table, const std::vector<int>& rows, int column) {
        auto& list = shownTable(table)->list();
        const auto at = [&](int row) {
            return QRectF(list.visualRect(list.model()->index(row, 0))).center();
        };
        auto& grid = part<GridWidget>("sprColumn");
        window->drawing().control().toolkit().drags().setCarrier([&](QDrag& carried) {
            hands::carry(carried, grid, grid.cellRect(1, column).center());
        });
        QWidget& view = *list.viewport();
        for (const int row : rows) {
            const auto held = row == rows.front() ? Qt::NoModifier : Qt::ControlModifier;
            hands::mouse(view, QEvent::MouseButtonPress, at(row), Qt::LeftButton, Qt::LeftButton,
                         held);
            if (row != rows.back())
                hands::mouse(view, QEvent::MouseButtonRelease, at(row), Qt::LeftButton,
                             Qt::NoButton, held);
        }
        hands::mouse(view, QEvent::MouseMove, at(rows.back()) + QPointF(1, 1), Qt::NoButton,
                     Qt::LeftButton);
        calm();
    }
    std::vector<std::string> fields(int count) {
        std::vector<std::string> result;
        for (int column = 1; column <= count; ++column)
            result.push_back(part<GridWidget>("sprColumn").model().text(0, column).toStdString());
        return result;
    }
    bool ended() {
        return until([&] { return !window->results().isRunning(); });
    }
    std::string status() { return window->findChild<QLabel*>("runStatus")->text().toStdString(); }
    int rows() { return window->findChild<designer::ResultTable*>()->rows().rowCount(); }
    void addColumn(const char16_t* table, const char16_t* column, const char16_t* criterion) {
        const auto definition = platform::makeRef<model::ColumnDefinition>();
        definition->Column(query().tableNamed(table)->columnNamed(column));
        definition->AddCriterium(criterion, platform::decimal(model::Criteria::firstRow));
        window->document().change(
            "Add", [&](model::Query& query) { query.AddColumnDefinition(definition); });
    }
};

/// The letters that the entries of a menu are chosen with.
std::vector<std::string> letters(const QList<QAction*>& actions) {
    std::vector<std::string> result;
    for (const QAction* action : actions) {
        const QString text = QString(action->text()).remove("&&");
        const auto mark = text.indexOf(u'&');
        if (action->isSeparator()) continue;
        result.push_back(mark < 0 ? "none in " + text.toStdString()
                                  : text.mid(mark + 1, 1).toLower().toStdString());
    }
    return result;
}

} // namespace

TEST_F(TheWindowsCommands, PutColumnsOnTheGridAndBackInOneStep) {
    open({.tables = {"orders"}});
    dragToGrid("orders", {1, 2, 5}, 1);
    EXPECT_THAT(fields(4), ElementsAre("orders.id", "orders.customer_id", "orders.ordered_at", ""));
    EXPECT_EQ(window->document().steps().count(), 1);
    command("undo");
    EXPECT_THAT(fields(1), ElementsAre(""));
    command("redo");
    EXPECT_THAT(fields(4), ElementsAre("orders.id", "orders.customer_id", "orders.ordered_at", ""));
    window->document().setModified(false);
}

TEST_F(TheWindowsCommands, ArrangeTheTablesAndPutThemBack) {
    open();
    window->document().change("Move",
                              [](model::Query& query) { query.tableNamed(u"orders")->Top(4000); });
    const auto before = query().record();
    command("arrange");
    const auto after = query().record();
    EXPECT_NE(after, before);
    EXPECT_EQ(window->document().steps().count(), 2);
    command("undo");
    EXPECT_EQ(query().record(), before);
    command("redo");
    EXPECT_EQ(query().record(), after);
    window->document().setModified(false);
}

TEST_F(TheWindowsCommands, AreOfferedWhenThereIsSomethingForThem) {
    open();
    for (const char* name : {"arrange", "rename", "copySql", "copyPicture", "exportPicture"})
        EXPECT_TRUE(offers(name)) << name;
    command("new");
    for (const char* name : {"arrange", "rename", "copySql", "copyPicture", "exportPicture"})
        EXPECT_FALSE(offers(name)) << name;
    EXPECT_FALSE(offers("undo"));
    EXPECT_FALSE(offers("cancel"));
}

TEST_F(TheWindowsCommands, RunTheQueryWithTheValueOfAParameter) {
    open({.tables = {"orders"}});
    addColumn(u"orders", u"id", u"<= [most]");
    window->findChild<QDockWidget*>("resultsDock")->hide();
    {
        const Answering answers({[](QDialog& dialog) {
            ASSERT_TRUE(qobject_cast<designer::ParameterDialog*>(&dialog));
            auto* const field = dialog.findChild<QLineEdit*>("most");
            ASSERT_TRUE(field);
            EXPECT_EQ(dialog.focusWidget(), field);
            for (const char digit : {'1', '2'}) hands::key(*field, 0, QString(QLatin1Char(digit)));
            hands::key(*field, Qt::Key_Return, "\r");
        }});
        command("run");
    }
    ASSERT_TRUE(ended());
    EXPECT_EQ(rows(), 12);
    // Whoever runs a query wants to see its rows.
    EXPECT_TRUE(window->results().isVisible());
    window->document().setModified(false);
}

TEST_F(TheWindowsCommands, RunNothingWhenTheValueIsNotGiven) {
    open({.tables = {"orders"}});
    addColumn(u"orders", u"id", u"<= [most]");
    {
        const Answering answers({[](QDialog& dialog) { hands::key(dialog, Qt::Key_Escape); }});
        command("run");
    }
    EXPECT_FALSE(window->results().isRunning());
    EXPECT_EQ(rows(), 0);
    window->document().setModified(false);
}

TEST_F(TheWindowsCommands, CancelWhatIsRunning) {
    const QString file = folder.database(
        "numbers.db", {"CREATE TABLE numbers (n INTEGER)",
                       "INSERT INTO numbers WITH RECURSIVE c(n) AS (SELECT 1 UNION ALL SELECT n + "
                       "1 FROM c WHERE n < 1000) SELECT n FROM c"});
    open({.file = file, .tables = QStringList(4, "numbers")});
    // No four numbers are like that, which takes long to find out.
    addColumn(u"numbers", u"n", u"< numbers_1.n");
    addColumn(u"numbers_1", u"n", u"< numbers_2.n");
    addColumn(u"numbers_2", u"n", u"< numbers_3.n");
    addColumn(u"numbers_3", u"n", u"< numbers.n");
    command("run");
    ASSERT_TRUE(window->results().isRunning());
    EXPECT_FALSE(offers("run"));
    command("cancel");
    ASSERT_TRUE(ended());
    EXPECT_THAT(status(), StartsWith("Cancelled."));
    EXPECT_TRUE(offers("run"));
    window->document().setModified(false);
}

TEST_F(TheWindowsCommands, ExportAllRowsIntoAFile) {
    open({.tables = {"categories"}});
    window->findChild<QDockWidget*>("resultsDock")->hide();
    const QString path = folder.path("rows");
    commandWithFile("exportRows", path);
    ASSERT_TRUE(ended());
    EXPECT_THAT(status(), StartsWith("Exported to " + path.toStdString() + ".csv. Rows: "));
    EXPECT_TRUE(window->results().isVisible());
    QFile file(path + ".csv");
    ASSERT_TRUE(file.open(QIODevice::ReadOnly));
    EXPECT_EQ(file.readLine(), "id,parent_id,name\r\n");
}

TEST_F(TheWindowsCommands, CopyTheDrawingAsAPicture) {
    open();
    QGuiApplication::clipboard()->clear();
    command("copyPicture");
    const QImage picture = QGuiApplication::clipboard()->image();
    EXPECT_GT(picture.width(), 2000);
    command("copySql");
    EXPECT_THAT(QGuiApplication::clipboard()->text().toStdString(), StartsWith("SELECT\n"));
}

TEST_F(TheWindowsCommands, ExportTheDrawingAsTheKindOfFileThatIsNamed) {
    open();
    commandWithFile("exportPicture", folder.path("drawing.svg"));
    QFile svg(folder.path("drawing.svg"));
    ASSERT_TRUE(svg.open(QIODevice::ReadOnly));
    EXPECT_TRUE(svg.readAll().contains(">order_lines</text>"));
    commandWithFile("exportPicture", folder.path("drawing"));
    EXPECT_FALSE(QImage(folder.path("drawing.png")).isNull());
}

TEST_F(TheWindowsCommands, ProposeANameForTheDrawingAndTheRows) {
    open();
    const auto proposed = [&](const char* exported) {
        QString name;
        const Answering answers({[&](QDialog& dialog) {
            name = dialog.findChild<QLineEdit*>("fileNameEdit")->text();
            dialog.reject();
        }});
        command(exported);
        return name;
    };
    EXPECT_EQ(proposed("exportPicture"), "drawing.png");
    EXPECT_EQ(proposed("exportRows"), "rows.csv");
    commandWithFile("save", folder.path("large orders.json"));
    EXPECT_EQ(window->statusBar()->currentMessage(), "Saved as large orders.json.");
    EXPECT_EQ(proposed("exportPicture"), "large orders.png");
    EXPECT_EQ(proposed("exportRows"), "large orders.csv");
}

TEST_F(TheWindowsCommands, CutTablesInPicturesWhenThatIsWanted) {
    open({.tables = {"customers"}});
    window->document().change(
        "Resize", [](model::Query& query) { query.tableNamed(u"customers")->Height(1500); });
    const auto height = [&] {
        command("copyPicture");
        return QGuiApplication::clipboard()->image().height();
    };
    const int whole = height();
    command("allColumns");
    EXPECT_LT(height(), whole);
    window->document().setModified(false);
    EXPECT_TRUE(window->close());
    open({.tables = {"customers"}});
    for (const QAction* action : menu("fileMenu").actions())
        if (action->objectName() == "allColumns") {
            EXPECT_FALSE(action->isChecked());
        }
    EXPECT_LT(height(), whole);
}

TEST_F(TheWindowsCommands, ChangeTheControlsOptionsForGood) {
    open();
    {
        const Answering answers({[](QDialog& dialog) {
            auto& texts = *dialog.findChild<QTableWidget*>();
            for (int row = 0; row < texts.rowCount(); ++row) {
                auto* const text = texts.item(row, 1);
                if (text->text() != "Field:") continue;
                texts.setCurrentItem(text);
                texts.editItem(text);
                auto* const editor = texts.viewport()->findChild<QLineEdit*>();
                ASSERT_TRUE(editor);
                editor->selectAll();
                for (const QChar letter : QStringLiteral("Column"))
                    hands::key(*editor, 0, QString(letter));
                hands::key(*editor, Qt::Key_Return, "\r");
            }
            QCoreApplication::processEvents(); // what was typed is taken over then
            auto* const ok = dialog.findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok);
            hands::click(*ok, ok->rect().center());
        }});
        command("options");
    }
    EXPECT_EQ(part<GridWidget>("sprColumn").model().text(0, 0), "Column");
    EXPECT_TRUE(window->close());
    open();
    EXPECT_EQ(part<GridWidget>("sprColumn").model().text(0, 0), "Column");
}

TEST_F(TheWindowsCommands, ShowTheEventsOfTheControl) {
    open();
    auto* const events = window->findChild<QDockWidget*>("eventsDock");
    EXPECT_FALSE(events->isVisible());
    command("eventsDockShown");
    EXPECT_TRUE(events->isVisible());
    auto& close = shownTable("orders")->closeButton();
    hands::click(close, QRectF(close.rect()).center());
    calm();
    auto& log = *events->findChild<QTreeWidget*>();
    ASSERT_GT(log.topLevelItemCount(), 0);
    EXPECT_EQ(log.topLevelItem(log.topLevelItemCount() - 1)->text(2), "TableDeleted");
    // The control that is made for the step back is listened to as well.
    command("undo");
    auto& again = shownTable("customers")->closeButton();
    hands::click(again, QRectF(again.rect()).center());
    calm();
    EXPECT_EQ(log.topLevelItem(log.topLevelItemCount() - 1)->text(3), "DeletedTable: customers");
    window->document().setModified(false);
}

TEST_F(TheWindowsCommands, FindTheTablesWhereverThePanelIs) {
    open();
    auto* const dock = window->findChild<QDockWidget*>("tablesDock");
    dock->hide();
    command("findTable");
    EXPECT_TRUE(dock->isVisible());
    EXPECT_EQ(window->focusWidget(), window->findChild<QLineEdit*>("tableFilter"));
}

TEST_F(TheWindowsCommands, DarkenEverythingAndBack) {
    open();
    const auto lightness = [](QPalette::ColorRole role, const QWidget* widget) {
        return widget->palette().color(role).lightness();
    };
    const auto* const error = window->findChild<designer::ErrorLine*>();
    const auto* const banner = window->findChild<designer::ConnectionBanner*>();
    for (int n = 0; n < 2; ++n) {
        command("dark");
        EXPECT_LT(lightness(QPalette::Window, window.get()), 100);
        EXPECT_LT(lightness(QPalette::Window, banner), 100);
        EXPECT_GT(lightness(QPalette::WindowText, error), 150);
        command("dark");
        EXPECT_GT(lightness(QPalette::Window, window.get()), 150);
        EXPECT_GT(lightness(QPalette::Window, banner), 150);
        EXPECT_LT(lightness(QPalette::WindowText, error), 120);
    }
}

TEST_F(TheWindowsCommands, HaveLettersOfTheirOwnInEveryLanguage) {
    for (const char* language : {"en", "de", "fr", "es"}) {
        QTranslator translator;
        ASSERT_TRUE(designer::loadCatalogue(translator, QLocale(QLatin1String(language))));
        QCoreApplication::installTranslator(&translator);
        open();
        QList<QList<QAction*>> menus{window->menuBar()->actions()};
        for (const QMenu* menu : this->menus()) menus << menu->actions();
        for (const auto& actions : menus) {
            std::vector<std::string> used = letters(actions);
            std::sort(used.begin(), used.end());
            EXPECT_EQ(std::adjacent_find(used.begin(), used.end()), used.end())
                << language << " " << testing::PrintToString(used);
            EXPECT_THAT(used, testing::Not(testing::Contains(StartsWith("none in"))));
        }
        QCoreApplication::removeTranslator(&translator);
    }
}
