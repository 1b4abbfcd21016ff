#include "designer/chart/ChartDrawing.h"
#include "designer/Colours.h"
#include "designer/chart/ChartPicture.h"

#include <gmock/gmock.h>

#include <QApplication>
#include <QImage>
#include <QPainter>

#include <cmath>

using namespace zandor::designer;

using testing::HasSubstr;

namespace {

constexpr QSizeF size(600, 300);

ChartData twoSeries(ChartKind kind = ChartKind::columns) {
    return {.kind = kind,
            .axis = "name",
            .labels = {"a", "b", "c"},
            .moments = {},
            .series = {{"total", {10, 20, -10}}, {"paid", {5, std::nullopt, 0}}},
            .note = "Drawn are the first 3 of 9 rows."};
}

ChartLook look() { return ChartLook::ofPage(QApplication::font()); }

QRectF area(const ChartDrawing& chart, int series, int point) {
    for (const ChartMark& mark : chart.marks())
        if (mark.series == series && mark.point == point) return mark.area;
    return {};
}

/// Of two colours, from 1 to 21.
double contrast(const QColor& one, const QColor& other) {
    const auto brightness = [](const QColor& colour) {
        const auto part = [](double value) {
            return value <= 0.03928 ? value / 12.92 : std::pow((value + 0.055) / 1.055, 2.4);
        };
        return 0.2126 * part(colour.redF()) + 0.7152 * part(colour.greenF()) +
               0.0722 * part(colour.blueF()) + 0.05;
    };
    const double ratio = brightness(one) / brightness(other);
    return std::max(ratio, 1 / ratio);
}

/// How people see a colour who lack one of the kinds of cones, roughly.
QColor seenWithout(const QColor& colour, bool red) {
    const double r = colour.redF(), g = colour.greenF(), b = colour.blueF();
    const auto in = [](double value) { return std::clamp(value, 0.0, 1.0); };
    return red ? QColor::fromRgbF(in(0.152 * r + 1.053 * g - 0.205 * b),
                                  in(0.115 * r + 0.786 * g + 0.099 * b),
                                  in(-0.004 * r - 0.048 * g + 1.052 * b))
               : QColor::fromRgbF(in(0.367 * r + 0.861 * g - 0.228 * b),
                                  in(0.280 * r + 0.673 * g + 0.047 * b),
                                  in(-0.012 * r + 0.043 * g + 0.969 * b));
}

double apart(const QColor& a, const QColor& b) {
    return std::hypot(a.red() - b.red(), a.green() - b.green(), a.blue() - b.blue());
}

} // namespace

TEST(AChart, WritesValuesAsTheirColumnsAreShown) {
    ChartData data = twoSeries();
    for (auto& series : data.series) series.format = {zandor::model::Format::Percent, 1};
    const ChartDrawing chart(data, look(), size);
    EXPECT_THAT(chart.words(chart.marks()[0]).toStdString(), HasSubstr("total: 1000.0%"));
    const auto drawn = [](const ChartData& shown) {
        return ChartPicture(shown, QApplication::font(), size.toSize()).svg().toStdString();
    };
    EXPECT_THAT(drawn(data), HasSubstr(">2000%<")) << "on the scale";
    EXPECT_THAT(drawn(twoSeries()), testing::Not(HasSubstr("%<")));
}

TEST(AChart, SaysLessWhereItIsLowAndWritesNothingOverAnother) {
    const auto svg = [](int height) {
        return ChartPicture(twoSeries(), QApplication::font(), QSize(600, height))
            .svg()
            .toStdString();
    };
    EXPECT_THAT(svg(120), HasSubstr(">b<"));
    EXPECT_THAT(svg(80), testing::Not(HasSubstr(">b<")));
    EXPECT_THAT(svg(80), HasSubstr(">total<"));
    const ChartDrawing low(twoSeries(), look(), QSizeF(600, 80));
    for (const ChartMark& mark : low.marks()) {
        EXPECT_LE(mark.area.bottom(), 80);
        EXPECT_GE(mark.area.top(), 12 + QFontMetricsF(look().font).height()) << "the legend's line";
    }
}

TEST(AChart, HasColumnsAsHighAsTheirValues) {
    const ChartDrawing chart(twoSeries(), look(), size);
    EXPECT_EQ(chart.marks().size(), 5u); // a cell is empty
    EXPECT_NEAR(area(chart, 0, 1).height(), 2 * area(chart, 0, 0).height(), 0.01);
    EXPECT_NEAR(area(chart, 0, 0).height(), 2 * area(chart, 1, 0).height(), 0.01);
    const double zero = area(chart, 0, 0).bottom();
    EXPECT_NEAR(area(chart, 0, 1).bottom(), zero, 0.01);
    EXPECT_NEAR(area(chart, 0, 2).top(), zero, 0.01); // below it
    EXPECT_NEAR(area(chart, 1, 2).height(), 0, 0.01);
    for (const ChartMark& one : chart.marks()) {
        EXPECT_TRUE(QRectF(QPointF(), size).contains(one.area.topLeft()));
        EXPECT_TRUE(QRectF(QPointF(), size).contains(one.area.bottomRight()));
        for (const ChartMark& other : chart.marks())
            EXPECT_TRUE(&one == &other || !one.area.intersects(other.area));
    }
}

TEST(AChart, HasPointsOfALineWhereTheirMomentsAre) {
    ChartData data = twoSeries(ChartKind::lines);
    for (const char* day : {"2024-01-01", "2024-01-11", "2024-01-12"})
        data.moments.push_back(*momentIn(day));
    const ChartDrawing chart(data, look(), size);
    const double first = area(chart, 0, 0).center().x();
    const double second = area(chart, 0, 1).center().x();
    const double third = area(chart, 0, 2).center().x();
    EXPECT_NEAR(second - first, 10 * (third - second), 0.01);
    EXPECT_LT(area(chart, 0, 1).center().y(), area(chart, 0, 0).center().y());
}

TEST(AChart, TellsTheValueUnderAPlace) {
    const ChartDrawing chart(twoSeries(), look(), size);
    const int found = chart.markAt(area(chart, 0, 1).center());
    ASSERT_GE(found, 0);
    EXPECT_EQ(chart.words(chart.marks()[static_cast<std::size_t>(found)]), "b\ntotal: 20");
    EXPECT_EQ(chart.markAt({1, 1}), -1);
}

TEST(AChart, IsLaidOutForAnySizeAndAnyValues) {
    for (const ChartKind kind : {ChartKind::columns, ChartKind::lines})
        for (const QSizeF room : {QSizeF(1, 1), QSizeF(60, 40), QSizeF(120, 900), QSizeF(4000, 90)})
            for (const double value : {0.0, 1e300, -1e300, 1e-300}) {
                ChartData data = twoSeries(kind);
                data.series[0].values[1] = value;
                data.labels[1] = QString(500, u'W');
                const ChartDrawing chart(data, look(), room);
                for (const ChartMark& mark : chart.marks())
                    EXPECT_TRUE(std::isfinite(mark.area.height()) && std::isfinite(mark.area.x()));
                QImage image(40, 40, QImage::Format_ARGB32_Premultiplied);
                QPainter painter(&image);
                chart.paint(painter);
                chart.highlight(painter, chart.marks().front());
            }
}

TEST(AChart, HasColoursThatCanBeToldApart) {
    const QPalette own;
    for (const bool dark : {false, true}) {
        if (dark) useDarkColours();
        const ChartLook look = ChartLook::of(QApplication::palette(), QApplication::font());
        useOwnColours();
        EXPECT_EQ(look.background.lightness() < 128, dark);
        EXPECT_GE(contrast(look.text, look.background), 7);
        EXPECT_GE(contrast(look.faint, look.background), 4.5);
        ASSERT_EQ(look.series.size(), static_cast<std::size_t>(mostSeries));
        for (std::size_t a = 0; a < look.series.size(); ++a) {
            EXPECT_GE(contrast(look.series[a], look.background), 3) << a;
            for (std::size_t b = a + 1; b < look.series.size(); ++b)
                for (const bool red : {false, true})
                    EXPECT_GT(
                        apart(seenWithout(look.series[a], red), seenWithout(look.series[b], red)),
                        30)
                        << dark << a << b << red;
        }
    }
}

TEST(AChart, IsTakenOutOfTheWindowOnWhiteWithItsTexts) {
    const ChartPicture picture(twoSeries(), QApplication::font(), {600, 300});
    EXPECT_EQ(picture.image(2).size(), QSize(1200, 600));
    EXPECT_EQ(picture.image(1).pixelColor(0, 0), QColor(Qt::white));
    const std::string svg = picture.svg().toStdString();
    for (const char* text : {"total", "paid", "name", ">b<", "first 3 of 9 rows"})
        EXPECT_THAT(svg, HasSubstr(text));
    useDarkColours();
    const QImage dark = picture.image(1);
    useOwnColours();
    EXPECT_EQ(dark.pixelColor(0, 0), QColor(Qt::white));
}
