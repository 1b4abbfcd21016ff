#include "OpenProperties.h"

#include "designer/run/ResultsPanel.h"

#include <QCheckBox>
#include <QPlainTextEdit>
#include <QSpinBox>

using namespace zandor;

namespace {

class TheQueryPanel : public OpenProperties {
protected:
    TheQueryPanel() {
        click(menu("viewMenu"), [](const QAction& action) {
            return action.objectName() == QLatin1String("queryDockShown");
        });
    }

    QPlainTextEdit& description() { return found<QPlainTextEdit>("queryDescription"); }
    void describe(const QString& text) {
        window->activateWindow();
        description().setFocus();
        EXPECT_TRUE(until([&] { return description().hasFocus(); }));
        for (const QChar sign : text) hands::key(description(), 0, QString(sign));
    }
};

} // namespace

TEST_F(TheQueryPanel, AsksForDifferentRowsAndTheFirstOfThem) {
    auto& distinct = found<QCheckBox>("queryDistinct");
    hands::click(distinct, QPointF(10, distinct.height() / 2.0));
    EXPECT_TRUE(query().options().distinct);
    EXPECT_EQ(made(), 1);
    auto& first = found<QSpinBox>("queryFirst");
    EXPECT_EQ(first.text(), "all");
    first.setFocus();
    first.selectAll();
    for (const char* digit : {"1", "2"}) hands::key(first, 0, digit);
    EXPECT_EQ(query().options().first, 0) << "until it counts";
    hands::key(first, Qt::Key_Return);
    EXPECT_EQ(query().options().first, 12);
    EXPECT_EQ(made(), 2);
    EXPECT_EQ(lastStep(), "Change which rows come out");
    window->document().undo();
    EXPECT_EQ(first.text(), "all");
    window->document().redo();
    window->results().run();
    ASSERT_TRUE(until([&] { return !window->results().isRunning(); }));
    EXPECT_LE(found<QTableView>("resultTable").model()->rowCount(), 12);
    EXPECT_GT(found<QTableView>("resultTable").model()->rowCount(), 0);
}

TEST_F(TheQueryPanel, KeepsADescriptionInTheFile) {
    describe("Who owes us money?");
    EXPECT_EQ(query().options().description, u"") << "until it counts";
    const QString path = folder.path("described.json");
    hands::shortcut(description(), Qt::Key_F5);
    EXPECT_EQ(query().options().description, u"Who owes us money?");
    EXPECT_EQ(made(), 1);
    EXPECT_EQ(lastStep(), "Describe the query");
    commandWithFile("saveAs", path);
    open({.file = path});
    EXPECT_EQ(description().toPlainText(), "Who owes us money?");
    open({.file = sampleDatabase(), .tables = {"orders"}});
    EXPECT_EQ(description().toPlainText(), "");
}
