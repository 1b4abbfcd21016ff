#include "OpenPanel.h"

#include "designer/chart/ChartPanel.h"
#include "designer/chart/ChartView.h"
#include "designer/chart/ValuesMenu.h"
#include "document/Answers.h"

#include <QClipboard>
#include <QComboBox>
#include <QFile>
#include <QImage>
#include <QMenu>

using namespace zandor;

using testing::HasSubstr;
using testing::StartsWith;

namespace {

class TheChart : public OpenPanel {
protected:
    void openSales(const QString& rows = "('apple', 3, 7.5, 1), ('pear', 1, 2.5, 2)") {
        open({"CREATE TABLE sales (what TEXT, pieces INTEGER, price REAL, what_id INTEGER)",
              "INSERT INTO sales VALUES " + rows});
        show({"sales"});
    }
    void run() {
        pressRun();
        ASSERT_TRUE(ended());
    }
    designer::ChartView& view() { return *panel.findChild<designer::ChartView*>(); }
    QComboBox& combo(const char* name) { return *panel.findChild<QComboBox*>(name); }
    std::vector<std::string> drawn() {
        std::vector<std::string> names;
        if (view().data())
            for (const auto& series : view().data()->series)
                names.push_back(series.name.toStdString());
        return names;
    }
    std::string said() { return view().said().toStdString(); }
};

} // namespace

TEST_F(TheChart, IsShownInPlaceOfTheRowsAndBack) {
    openSales();
    press(panel.chartAction());
    EXPECT_EQ(message(), "Run the query to see its rows here.");
    run();
    EXPECT_TRUE(view().isVisible());
    EXPECT_FALSE(table().isVisible());
    EXPECT_EQ(view().data()->axis, "what");
    EXPECT_THAT(drawn(), testing::ElementsAre("pieces", "price"));
    EXPECT_EQ(view().data()->labels, QStringList({"apple", "pear"}));
    press(panel.chartAction());
    EXPECT_TRUE(table().isVisible());
    panel.goToChart();
    EXPECT_TRUE(view().isVisible());
    EXPECT_TRUE(until([&] { return view().hasFocus(); }));
    panel.goToTable();
    EXPECT_TRUE(until([&] { return table().hasFocus(); }));
}

TEST_F(TheChart, IsMadeOfWhatIsChosenAlsoOfTheNextRows) {
    openSales();
    press(panel.chartAction());
    run();
    combo("chartKind").setFocus();
    hands::key(combo("chartKind"), Qt::Key_Down);
    EXPECT_EQ(view().data()->kind, designer::ChartKind::lines);
    auto* const values = panel.findChild<designer::ValuesMenu*>();
    values->popup({});
    values->setActiveAction(values->actions().at(0));
    hands::key(*values, Qt::Key_Space, " ");
    EXPECT_TRUE(values->isVisible()) << "more can be ticked";
    EXPECT_THAT(drawn(), testing::ElementsAre("price"));
    hands::click(*values, values->actionGeometry(values->actions().at(2)).center());
    EXPECT_TRUE(values->isVisible());
    EXPECT_THAT(drawn(), testing::ElementsAre("price", "what_id"));
    hands::key(*values, Qt::Key_Escape);
    run();
    EXPECT_THAT(drawn(), testing::ElementsAre("price", "what_id"));
    EXPECT_EQ(view().data()->kind, designer::ChartKind::lines);
    // The axis is no value of its own.
    combo("chartAxis").setCurrentText("price");
    EXPECT_THAT(drawn(), testing::ElementsAre("what_id"));
    EXPECT_EQ(view().data()->labels[0], "7.5");
    // Other columns, another choice.
    show({"sales"}, {{"sales.what"}, {"sales.pieces"}});
    run();
    EXPECT_THAT(drawn(), testing::ElementsAre("pieces"));
    EXPECT_EQ(view().data()->axis, "what");
}

TEST_F(TheChart, SaysWhyThereIsNone) {
    openSales();
    press(panel.chartAction());
    show({"sales"}, {{"sales.what"}});
    run();
    EXPECT_EQ(said(), "A chart needs a column of numbers, and these rows have none.");
    EXPECT_EQ(view().accessibleDescription().toStdString(), said());
    show({"sales"}, {{"sales.price"}});
    run();
    EXPECT_THAT(said(), StartsWith("A chart needs a column of texts or dates beside the numbers"));
    show({"sales"}, {{"sales.what", {"plum"}}, {"sales.price"}});
    run();
    EXPECT_EQ(said(), "There are no rows to draw.");
    EXPECT_FALSE(panel.chart().copyAction()->isEnabled());
    show({"sales"}, {{"sales.what"}, {"sales.price"}});
    run();
    EXPECT_TRUE(panel.chart().copyAction()->isEnabled());
    panel.findChild<designer::ValuesMenu*>()->actions().at(0)->toggle();
    EXPECT_EQ(said(), "Choose under \"Values\" what is to be drawn.");
}

TEST_F(TheChart, WaitsForTheRowsAndSaysHowManyItShows) {
    open(numbersTable(3000));
    show({"numbers"}, {{"numbers.word"}, {"numbers.n"}});
    press(panel.chartAction());
    pressRun();
    EXPECT_EQ(said(), "The chart is drawn when the rows have come.");
    ASSERT_TRUE(ended());
    EXPECT_EQ(view().data()->points(), 100);
    EXPECT_EQ(view().data()->note, "Drawn are the first 100 of 3,000 rows.");
    EXPECT_EQ(view().accessibleDescription(), view().data()->note);
}

TEST_F(TheChart, FollowsTheOrderInWhichTheRowsAreShown) {
    open(numbersTable(10));
    show({"numbers"}, {{"numbers.word"}, {"numbers.n"}});
    press(panel.chartAction());
    run();
    table().sortByColumn(1, Qt::DescendingOrder);
    EXPECT_EQ(view().data()->labels[0], "word 9");
}

TEST_F(TheChart, TellsItsValuesByMouseAndKeys) {
    openSales();
    press(panel.chartAction());
    run();
    QCoreApplication::processEvents();
    view().setFocus();
    hands::key(view(), Qt::Key_Home);
    EXPECT_EQ(view().accessibleDescription(), "apple, pieces: 3");
    hands::key(view(), Qt::Key_Right);
    EXPECT_EQ(view().accessibleDescription(), "pear, pieces: 1");
    hands::key(view(), Qt::Key_Right);
    hands::key(view(), Qt::Key_Down);
    EXPECT_EQ(view().accessibleDescription(), "pear, price: 2.5");
    hands::key(view(), Qt::Key_Left);
    EXPECT_EQ(view().accessibleDescription(), "apple, price: 7.5");
    const QPointF pear = view().drawing()->marks()[2].area.center();
    hands::mouse(view(), QEvent::MouseMove, pear, Qt::NoButton);
    EXPECT_EQ(view().accessibleDescription(), "pear, pieces: 1");
}

TEST_F(TheChart, GoesToTheClipboardAndIntoFiles) {
    openSales();
    press(panel.chartAction());
    run();
    QGuiApplication::clipboard()->clear();
    view().setFocus();
    panel.activateWindow();
    EXPECT_TRUE(until([&] { return view().hasFocus(); }));
    hands::shortcut(view(), Qt::Key_C, Qt::ControlModifier);
    EXPECT_FALSE(QGuiApplication::clipboard()->image().isNull());
    for (const char* name : {"chart.png", "chart.svg", "chart.pdf"}) {
        const QString path = folder.path(name);
        const Answering answers({[&](QDialog& dialog) { choose(dialog, path); }});
        panel.chart().exportAction()->trigger();
        EXPECT_GT(QFile(path).size(), 500) << name;
    }
    EXPECT_GE(QImage(folder.path("chart.png")).width(), 1280);
}
