#include "Databases.h"

#include "designer/DesignerWindow.h"
#include "platform/qt/CanvasItems.h"
#include "platform/qt/GridModel.h"
#include "platform/qt/GridWidget.h"
#include "platform/qt/TabuletWidget.h"

#include <gmock/gmock.h>

#include <QApplication>
#include <QLabel>
#include <QStatusBar>

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
    EXPECT_THAT(gridColumn(1),
                ElementsAre("country_code", "country", "", "Visible", "= 'DE'", "= 'AT'"));
    EXPECT_THAT(gridColumn(2), ElementsAre("ordered_at", "", "Ascending", "Visible", "", ""));
    EXPECT_THAT(gridColumn(3), ElementsAre("quantity", "", "", "Visible", ">= 10", ">= 20"));
    EXPECT_THAT(gridColumn(4), ElementsAre("unit_price", "", "", "Visible", "", ""));
    EXPECT_THAT(gridColumn(5), ElementsAre("is_discontinued", "", "", "Invisible", "= 0", "= 0"));
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

TEST_F(TheDesignersWindow, ShowsNoTraceBoxesAndNoReports) {
    open();
    EXPECT_EQ(window->drawing().control().DebugSwitch(), 0);
    EXPECT_EQ(QApplication::activeModalWidget(), nullptr);
}

TEST_F(TheDesignersWindow, BindsTheWholeSample) {
    open({.file = sampleDatabase()});
    EXPECT_EQ(shownTables().size(), 16U);
    EXPECT_EQ(paintedItems().size(), 3U * 19U);
}
