#include "Report.h"

#include <QPainter>
#include <QPainterPath>
#include <QSvgGenerator>

#include <algorithm>
#include <cmath>

namespace report {

namespace {

constexpr int width = 1000;
constexpr int rowHeight = 26;
constexpr int plotHeight = 220;
constexpr int plotsInARow = 3;
const QColor good(0x2e, 0x7d, 0x32), bad(0xc6, 0x28, 0x28), soft(0x99, 0x99, 0x99);

/// A value beside its goal, which is the middle of the row; logarithmic, a decade to each side.
void drawFigure(QPainter& painter, const Figure& figure, int top) {
    constexpr int names = 480, middle = 730, decade = 220;
    painter.setPen(Qt::black);
    painter.drawText(QRect(10, top, names - 20, rowHeight), Qt::AlignVCenter, figure.name);
    const double share = std::clamp(std::log10(figure.value() / figure.goal), -1.0, 1.0);
    const QRectF bar(QPointF(middle - decade, top + 6),
                     QPointF(middle + decade * share, top + rowHeight - 6));
    painter.fillRect(bar, figure.met() ? good : bad);
    painter.setPen(Qt::black);
    painter.drawLine(middle, top, middle, top + rowHeight);
    // Behind the mark of the goal, too.
    painter.drawText(QRectF(std::max<double>(bar.right(), middle) + 6, top, 180, rowHeight),
                     Qt::AlignVCenter,
                     QStringLiteral("%1 of %2").arg(figure.value(), 0, 'g', 3).arg(figure.goal));
}

/// Both axes logarithmic, so that what grows in proportion runs at 45 degrees.
void drawGrowth(QPainter& painter, const Growth& growth, const QRectF& place) {
    const QRectF plot = place.adjusted(50, 30, -15, -35);
    double low = 1e300, high = 0;
    for (const auto& [size, value] : growth.points)
        if (value > 0) {
            low = std::min(low, value);
            high = std::max(high, value);
        }
    if (high <= 0) return;
    const double floor = std::pow(10, std::floor(std::log10(low)));
    const double ceiling = std::max(floor * 10, std::pow(10, std::ceil(std::log10(high))));
    const double first = std::max(1, growth.points.front().first);
    const double last = growth.points.back().first;
    const auto at = [&](double size, double value) {
        const double across = std::log(std::max(size, first) / first) / std::log(last / first);
        const double up = std::log(std::max(value, floor) / floor) / std::log(ceiling / floor);
        return QPointF(plot.left() + across * plot.width(), plot.bottom() - up * plot.height());
    };
    painter.setPen(Qt::black);
    painter.drawText(QRectF(place.left(), place.top(), place.width(), 26), Qt::AlignCenter,
                     QStringLiteral("%1 (%2)").arg(growth.name, growth.unit));
    painter.setPen(soft);
    painter.drawRect(plot);
    painter.setPen(Qt::black);
    for (double line = floor; line <= ceiling * 1.01; line *= 10)
        painter.drawText(QRectF(place.left(), at(first, line).y() - 10, 44, 20),
                         Qt::AlignRight | Qt::AlignVCenter, QString::number(line));
    QPainterPath curve;
    for (const auto& [size, value] : growth.points) {
        if (value <= 0) continue;
        const QPointF point = at(size, value);
        if (curve.elementCount() == 0)
            curve.moveTo(point);
        else
            curve.lineTo(point);
        painter.drawText(QRectF(point.x() - 25, plot.bottom() + 2, 50, 16), Qt::AlignCenter,
                         QString::number(size));
        painter.fillRect(QRectF(point - QPointF(2, 2), QSizeF(4, 4)), good);
    }
    painter.drawText(QRectF(plot.left(), plot.bottom() + 15, plot.width(), 16), Qt::AlignCenter,
                     growth.of);
    painter.setPen(QPen(good, 1.5));
    painter.setBrush(Qt::NoBrush);
    painter.drawPath(curve);
}

} // namespace

void Report::draw(const QString& svgFile) const {
    const int rows = static_cast<int>(figures.size());
    const int plots = static_cast<int>(growths.size());
    const int height =
        20 + rows * rowHeight + (plots + plotsInARow - 1) / plotsInARow * (plotHeight + 10);
    QSvgGenerator generator;
    generator.setFileName(svgFile);
    generator.setSize({width, height});
    generator.setViewBox(QRect(0, 0, width, height));
    generator.setTitle(QStringLiteral("Measured against goals, on %1").arg(platform));
    QPainter painter;
    if (!painter.begin(&generator)) qFatal("%s cannot be written", qPrintable(svgFile));
    QFont font(QStringLiteral("sans-serif"));
    font.setPixelSize(13);
    painter.setFont(font);
    painter.fillRect(0, 0, width, height, Qt::white);
    int top = 10;
    for (const Figure& figure : figures) {
        drawFigure(painter, figure, top);
        top += rowHeight;
    }
    constexpr double across = static_cast<double>(width) / plotsInARow;
    for (int n = 0; n < plots; ++n)
        drawGrowth(painter, growths[static_cast<std::size_t>(n)],
                   QRectF(n % plotsInARow * across, top + 10 + n / plotsInARow * (plotHeight + 10),
                          across, plotHeight));
}

} // namespace report
