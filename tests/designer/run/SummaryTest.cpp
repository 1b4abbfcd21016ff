#include "OpenPanel.h"

#include "designer/run/SummaryLine.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QLocale>

using namespace zandor;

using testing::StartsWith;

namespace {

class TheSummary : public OpenPanel {
protected:
    ~TheSummary() override { QLocale::setDefault(before); }

    void run() {
        panel.setLimit(designer::ResultsPanel::mostRows);
        pressRun();
        ASSERT_TRUE(ended());
    }
    void select(int top, int left, int bottom, int right) {
        const auto& rows = table().rows();
        table().selectionModel()->select({rows.index(top, left), rows.index(bottom, right)},
                                         QItemSelectionModel::ClearAndSelect);
    }
    designer::SummaryLine& line() { return *panel.findChild<designer::SummaryLine*>(); }
    /// Once it is made.
    std::string words() {
        until([&] { return !line().text().contains("adding up"); });
        QCoreApplication::processEvents();
        until([&] { return !line().text().contains("adding up"); });
        return line().isVisible() ? line().text().toStdString() : "";
    }

    const QLocale before;
    const QStringList sales{
        "CREATE TABLE sales (what TEXT, price DECIMAL(8,2), rabatt REAL)",
        "INSERT INTO sales VALUES ('apple', '1.25', 0.1), ('pear', '10.05', 0.2), "
        "('', NULL, NULL), (NULL, '-2.5', 0.3)"};
};

} // namespace

TEST_F(TheSummary, CountsTheCellsAndAddsUpTheNumbersAmongThem) {
    open(sales);
    show({"sales"});
    run();
    EXPECT_EQ(words(), "");
    select(0, 1, 3, 1);
    EXPECT_EQ(words(), "Cells: 4 \u00b7 Empty: 1 \u00b7 Sum: 8.80 \u00b7 Average: 2.933333 \u00b7 "
                       "Smallest: -2.5 \u00b7 Largest: 10.05");
    select(0, 2, 1, 2);
    EXPECT_EQ(words(), "Cells: 2 \u00b7 Sum: 0.3 \u00b7 Average: 0.15 \u00b7 Smallest: 0.1 \u00b7 "
                       "Largest: 0.2");
    select(0, 0, 3, 0);
    EXPECT_EQ(words(), "Cells: 4 \u00b7 Empty: 2");
    select(0, 0, 1, 1);
    EXPECT_THAT(words(), StartsWith("Cells: 4 \u00b7 Numbers: 2 \u00b7 Sum: 11.30 "));
    select(1, 1, 1, 1);
    EXPECT_EQ(words(), "");
}

TEST_F(TheSummary, IsOfWhatIsSelectedHoweverTheRowsAreSorted) {
    open(numbersTable(3000));
    show({"numbers"}, {{"numbers.n"}});
    run();
    table().sortByColumn(0, Qt::DescendingOrder);
    select(0, 0, 9, 0);
    EXPECT_THAT(words(), testing::EndsWith("Smallest: 2990 \u00b7 Largest: 2999"));
    table().selectionModel()->select(table().rows().index(2999, 0), QItemSelectionModel::Select);
    EXPECT_THAT(words(), StartsWith("Cells: 11 \u00b7 Sum: 29945 "));
    pressRun();
    ASSERT_TRUE(ended());
    EXPECT_EQ(words(), "");
}

TEST_F(TheSummary, OfAMillionCellsIsMadeWhileTheWindowLives) {
    open(numbersTable(350'000));
    show({"numbers"});
    run();
    ASSERT_EQ(table().rows().rowCount(), 350'000);
    table().selectAll();
    QStringList said;
    QObject::connect(&line(), &QLineEdit::textChanged, [&](const QString& text) { said << text; });
    int beats = 0;
    QTimer heart;
    QObject::connect(&heart, &QTimer::timeout, [&] { ++beats; });
    heart.start(10);
    ASSERT_TRUE(until([&] { return line().text().contains("Sum"); }));
    EXPECT_EQ(words(), "Cells: 1,050,000 \u00b7 Empty: 350,000 \u00b7 Numbers: 350,000 \u00b7 "
                       "Sum: 61249825000 \u00b7 Average: 174999.5 \u00b7 Smallest: 0 \u00b7 "
                       "Largest: 349999");
    EXPECT_GT(beats, 3);
    ASSERT_GT(said.size(), 3);
    EXPECT_TRUE(said[1].startsWith("Cells: 1,050,000 \u00b7 adding up, ")) << said[1].toStdString();
    // Another selection does not wait for it.
    table().selectAll();
    QCoreApplication::processEvents();
    select(0, 0, 1, 0);
    EXPECT_THAT(words(), StartsWith("Cells: 2 \u00b7 Sum: 1 "));
}

TEST_F(TheSummary, IsWrittenAsTheCellsAreInTheUsersLanguage) {
    QLocale::setDefault(QLocale(QLocale::German));
    open(sales);
    show({"sales"});
    run();
    EXPECT_EQ(at(1, 1), "10,05");
    select(0, 1, 1, 1);
    EXPECT_THAT(words(), testing::HasSubstr("Sum: 11,30 \u00b7 Average: 5,65 "));
    table().copyAction()->trigger();
    EXPECT_EQ(QGuiApplication::clipboard()->text(), "1,25\n10,05");
}

TEST_F(TheSummary, HasTheFormatOfTheColumnsThatItIsOf) {
    open(sales);
    show({"sales"}, {{"sales.what"}, {"sales.price"}, {"sales.rabatt"}});
    const auto definition = [&](std::int32_t position) -> auto& {
        return dynamic_cast<model::ColumnDefinition&>(
            *document.query()->ColumnDefinitions().Item(position));
    };
    definition(2).format(model::Format::Number);
    definition(2).decimals(1);
    definition(3).format(model::Format::Percent);
    run();
    select(0, 0, 3, 1);
    EXPECT_EQ(words(), "Cells: 8 \u00b7 Empty: 3 \u00b7 Numbers: 3 \u00b7 Sum: 8.8 \u00b7 "
                       "Average: 2.9 \u00b7 Smallest: -2.5 \u00b7 Largest: 10.1");
    select(0, 2, 1, 2);
    EXPECT_THAT(words(), StartsWith("Cells: 2 \u00b7 Sum: 30% "));
    select(0, 1, 0, 2);
    EXPECT_THAT(words(), StartsWith("Cells: 2 \u00b7 Sum: 1.35 ")) << "of two formats";
}

TEST_F(TheSummary, IsCopiedByMouseAndKeys) {
    open(sales);
    show({"sales"});
    run();
    select(0, 2, 1, 2);
    const QString all = QString::fromStdString(words());
    EXPECT_EQ(line().accessibleName(), "What the selected cells come to");
    table().findChild<QAction*>("copySummary")->trigger();
    EXPECT_EQ(QGuiApplication::clipboard()->text(), all);
    QGuiApplication::clipboard()->clear();
    line().setFocus();
    hands::key(line(), Qt::Key_A, "\x01", Qt::ControlModifier);
    hands::key(line(), Qt::Key_C, "\x03", Qt::ControlModifier);
    EXPECT_EQ(QGuiApplication::clipboard()->text(), all);
    hands::mouse(line(), QEvent::MouseButtonDblClick, QPointF(line().width() - 10, 8),
                 Qt::LeftButton, Qt::LeftButton);
    EXPECT_FALSE(line().selectedText().isEmpty());
    hands::key(line(), Qt::Key_X, "x");
    EXPECT_EQ(line().text(), all);
}
