#include "designer/chart/ChartData.h"
#include "designer/chart/scales.h"

#include <gmock/gmock.h>

#include <QLocale>

using namespace zandor::designer;

using testing::ElementsAre;
using testing::Optional;
using Kind = Cell::Kind;

namespace {

/// Rows of texts: what reads as a number is one, "-" is nothing.
ChartSource source(const QStringList& columns, const std::vector<QStringList>& rows) {
    return {columns, static_cast<int>(rows.size()), [rows](int row, int column) {
                const QString text = rows[static_cast<std::size_t>(row)][column];
                bool number = false;
                text.toDouble(&number);
                if (text == "-") return Cell{};
                return Cell{number ? Kind::number : Kind::text, text};
            }};
}

ChartChoice best(const ChartSource& rows) { return bestChoice(rows.columns, columnUses(rows)); }

std::vector<std::string> labels(const NumberScale& scale) {
    std::vector<std::string> result;
    for (int mark = 0; mark <= scale.steps; ++mark)
        result.push_back(scale.label(mark).toStdString());
    return result;
}

std::vector<std::string> labels(const QString& first, const QString& last, int most) {
    std::vector<std::string> result;
    for (const TimeMark& mark : timeMarks(*momentIn(first), *momentIn(last), most))
        result.push_back(mark.label.toStdString());
    return result;
}

} // namespace

TEST(AChartsData, IsLabelledAsTheColumnIsShownAndCountedByTheValues) {
    ChartSource rows = source({"at", "share"}, {{"2026-07-22", "0.25"}, {"2026-07-21", "0.5"}});
    rows.formats = {{zandor::model::Format::Weekday}, {zandor::model::Format::Percent}};
    const ChartData data = readChart(rows, best(rows));
    EXPECT_EQ(data.labels, (QStringList{"Tuesday", "Wednesday"})) << "in the order of time";
    EXPECT_EQ(data.series.front().values, (std::vector<std::optional<double>>{0.5, 0.25}));
    EXPECT_EQ(data.series.front().format.format, zandor::model::Format::Percent);
}

TEST(TheColumnsOfAResult, AreTakenForWhatTheyHold) {
    const auto uses = columnUses(source(
        {"name", "day", "month", "n", "mixed", "nothing"},
        {{"a", "2024-01-31", "2024-01", "1", "1", "-"}, {"b", "-", "2024-02", "-", "x", "-"}}));
    using enum ColumnUse;
    EXPECT_THAT(uses, ElementsAre(text, date, date, number, none, none));
    EXPECT_FALSE(momentIn("2024-02-31"));
    EXPECT_FALSE(momentIn("2024-01 10:00"));
    EXPECT_FALSE(momentIn("20240131"));
    EXPECT_EQ(momentIn("2024-01-31 10:30:15.5")->time(), QTime(10, 30, 15, 500));
}

TEST(TheChoiceForAChart, IsDatesAsLinesThenTextsAsColumns) {
    const auto dated = best(source({"name", "total", "day"}, {{"a", "1", "2024-01-31"}}));
    EXPECT_EQ(dated, (ChartChoice{2, {1}, ChartKind::lines}));
    const auto named =
        best(source({"id", "name", "customer_id", "total", "paid"}, {{"7", "a", "3", "1", "2"}}));
    EXPECT_EQ(named, (ChartChoice{1, {3, 4}, ChartKind::columns}));
    // A key is better than nothing, one of them.
    EXPECT_EQ(best(source({"name", "id", "x_id"}, {{"a", "1", "2"}})).values,
              std::vector<int>({1}));
    // Years and what they come to.
    EXPECT_EQ(best(source({"year", "total"}, {{"2024", "10"}})),
              (ChartChoice{0, {1}, ChartKind::columns}));
    EXPECT_EQ(best(source({"total"}, {{"10"}})).axis, -1);
    EXPECT_TRUE(best(source({"name"}, {{"a"}})).values.empty());
    const auto many = best(source({"name", "a", "b", "c", "d", "e", "f", "g"},
                                  {{"x", "1", "2", "3", "4", "5", "6", "7"}}));
    EXPECT_EQ(many.values.size(), 6u);
}

TEST(WhatAChartShows, IsTheRowsInTheirOrderWithGapsWhereCellsAreEmpty) {
    const auto rows = source({"name", "total"}, {{"b", "2.5"}, {"a", "-"}, {"-", "-1"}});
    const ChartData data = readChart(rows, best(rows));
    EXPECT_EQ(data.axis, "name");
    EXPECT_EQ(data.labels, QStringList({"b", "a", "NULL"}));
    ASSERT_EQ(data.series.size(), 1u);
    EXPECT_EQ(data.series[0].name, "total");
    EXPECT_THAT(data.series[0].values, ElementsAre(Optional(2.5), std::nullopt, Optional(-1.0)));
    EXPECT_EQ(data.note, "");
    EXPECT_TRUE(data.moments.empty());
}

TEST(WhatAChartShows, IsInTheOrderOfTimeWhereItIsALineOverDates) {
    const auto rows =
        source({"day", "total"},
               {{"2024-03-01", "3"}, {"-", "9"}, {"2024-01-01", "1"}, {"2024-02-01", "2"}});
    const ChartData data = readChart(rows, best(rows));
    EXPECT_EQ(data.labels, QStringList({"2024-01-01", "2024-02-01", "2024-03-01"}));
    EXPECT_THAT(data.series[0].values, ElementsAre(Optional(1.0), Optional(2.0), Optional(3.0)));
    EXPECT_EQ(data.moments.size(), 3u);
    EXPECT_EQ(data.note, "Rows left out because they have no date: 1.");
    // Columns of the same stand as the rows do.
    const ChartData columns = readChart(rows, {0, {1}, ChartKind::columns});
    EXPECT_EQ(columns.labels[0], "2024-03-01");
    EXPECT_TRUE(columns.moments.empty());
}

TEST(WhatAChartShows, EndsAfterSoManyRowsAndSaysSo) {
    ChartSource rows = source({"name", "total"}, {{"a", "1"}});
    const auto one = rows.cell;
    rows.cell = [one](int, int column) { return one(0, column); };
    rows.rows = 123456;
    const ChartData columns = readChart(rows, {0, {1}, ChartKind::columns});
    EXPECT_EQ(columns.points(), 100);
    EXPECT_EQ(columns.note, "Drawn are the first 100 of 123,456 rows.");
    EXPECT_EQ(readChart(rows, {0, {1}, ChartKind::lines}).points(), 2000);
}

TEST(AScaleOfNumbers, GoesInRoundStepsAroundTheValues) {
    EXPECT_THAT(labels(numberScale(0, 97, 5, true)),
                ElementsAre("0", "20", "40", "60", "80", "100"));
    EXPECT_THAT(labels(numberScale(3, 7, 5, true)), ElementsAre("0", "2", "4", "6", "8"));
    EXPECT_THAT(labels(numberScale(-30, 70, 5, true)),
                ElementsAre("-50", "-25", "0", "25", "50", "75"));
    EXPECT_THAT(labels(numberScale(1001, 1009, 5, false)),
                ElementsAre("1,000", "1,002", "1,004", "1,006", "1,008", "1,010"));
    EXPECT_THAT(labels(numberScale(0.1, 0.6, 3, true)), ElementsAre("0.0", "0.2", "0.4", "0.6"));
    EXPECT_THAT(labels(numberScale(0, 0, 4, true)).front(), "0.00");
    EXPECT_THAT(labels(numberScale(5, 5, 4, false)).front(), "0");
    for (const double huge : {1e300, 1e-300}) {
        const NumberScale scale = numberScale(-huge, huge, 6, true);
        EXPECT_LE(scale.first, -huge);
        EXPECT_GE(scale.last(), huge);
        EXPECT_LE(scale.steps, 6);
    }
}

TEST(AScaleOfTime, HasBeginningsThatPeopleCountIn) {
    EXPECT_THAT(labels("2021-05-03", "2024-02-01", 4), ElementsAre("2022", "2023", "2024"));
    EXPECT_THAT(
        labels("2024-01-15", "2024-07-02", 8),
        ElementsAre("Feb 2024", "Mar 2024", "Apr 2024", "May 2024", "Jun 2024", "Jul 2024"));
    EXPECT_THAT(labels("2024-01-01 08:10", "2024-01-01 11:50", 4),
                ElementsAre("09:00", "10:00", "11:00"));
    EXPECT_EQ(labels("2024-01-01", "2024-01-03", 8).size(), 5u); // at noon too
    EXPECT_EQ(labels("2024-01-01", "2024-01-01", 8).size(), 1u);
    EXPECT_LE(labels("0100-01-01", "9999-01-01", 5).size(), 6u);
}
