#include "designer/chart/ChartDrawing.h"

#include <QFontMetricsF>
#include <QPainter>
#include <QPainterPath>

#include <algorithm>
#include <cmath>

namespace zandor::designer {

namespace {

// Logical pixels.
constexpr double around = 12;
constexpr double gap = 6;
constexpr double swatch = 10;
constexpr double betweenMarks = 36; // of the scale, at least
constexpr double longestSlanted = 110;
constexpr double widestColumn = 64;
constexpr double pointSize = 7;
constexpr double nearAPoint = 24;
constexpr double betweenPoints = 26; // with a shape each
constexpr double slant = 45;         // degrees
constexpr double smallestPlot = 20;
constexpr double lowestWithAxis = 160;
constexpr double lowestWithLabels = 110;

constexpr double shareOfColumns = 0.74; // of the room of a row

constexpr int digitsDrawn = 12;
constexpr int digitsTold = 15;

QString inWords(double value, int digits, const CellFormat& format) {
    return shown(Cell{Cell::Kind::number, QString::number(value, 'g', digits)}, format);
}

QRectF squareAround(const QPointF& at, double size) {
    return {at.x() - size / 2, at.y() - size / 2, size, size};
}

} // namespace

ChartDrawing::ChartDrawing(ChartData data, ChartLook look, const QSizeF& size)
    : mData(std::move(data)), mLook(std::move(look)), mLine(QFontMetricsF(mLook.font).height()) {
    placeLegend(size.width());
    placeAxes(size);
    placeLabels();
    placeMarks();
}

void ChartDrawing::placeLegend(double width) {
    const QFontMetricsF metrics(mLook.font);
    double x = around;
    double y = around;
    for (const auto& series : mData.series) {
        const double wide =
            std::min(swatch + gap + metrics.horizontalAdvance(series.name) + 1, width - 2 * around);
        if (x > around && x + wide > width - around) {
            x = around;
            y += mLine + gap / 2;
        }
        mLegend.emplace_back(x, y, wide, mLine);
        x += wide + 3 * gap;
    }
}

/// Below everything; in a low picture beside the legend.
void ChartDrawing::placeNote(const QSizeF& size) {
    mNote = QPointF(around, size.height() - around - mLine);
    if (size.height() >= lowestWithAxis) return;
    const double wide = QFontMetricsF(mLook.font).horizontalAdvance(mData.note);
    mNote = QPointF(size.width() - around - wide, mLegend.back().top());
    if (mNote.x() < mLegend.back().right() + 3 * gap) mNote.setY(size.height());
}

void ChartDrawing::placeAxes(const QSizeF& size) {
    const QFontMetricsF metrics(mLook.font);
    double smallest = HUGE_VAL;
    double largest = -HUGE_VAL;
    for (const auto& series : mData.series)
        for (const auto& value : series.values)
            if (value) {
                smallest = std::min(smallest, *value);
                largest = std::max(largest, *value);
            }
    if (smallest > largest) smallest = largest = 0;
    // What is about as high everywhere shows how it changes; columns tell by their length.
    const bool withZero = mData.kind == ChartKind::columns || smallest * 2 < largest;

    const double top = mLegend.back().bottom() + 2 * gap;
    placeNote(size);
    const bool isLow = size.height() < lowestWithAxis;
    mLabelled = size.height() >= lowestWithLabels;
    double bottom = isLow || mData.note.isEmpty() ? size.height() - around : mNote.y() - gap;
    mAxisTop = isLow ? size.height() : bottom - mLine;
    if (!isLow) bottom = mAxisTop - gap;
    const double slot = (size.width() - 2 * around) / mData.points();
    double widest = 0;
    if (mData.moments.empty())
        for (const QString& label : mData.labels)
            widest = std::max(widest, metrics.horizontalAdvance(label));
    mSlanted = mData.moments.empty() && widest + gap > slot * 0.94; // as wide as the plot will be
    mLongest = mSlanted ? std::min({widest + 1, longestSlanted, size.height() / 3}) : widest + 1;
    const double down = mSlanted ? mLongest * std::sin(slant * M_PI / 180) + mLine * 0.7 : mLine;
    if (mLabelled) bottom -= down + gap;
    bottom = std::max(bottom, top + smallestPlot);
    const int most = std::max(2, static_cast<int>((bottom - top) / betweenMarks));
    mScale = numberScale(smallest, largest, most, withZero);
    double left = 0;
    for (int mark = 0; mark <= mScale.steps; ++mark)
        left = std::max(left, metrics.horizontalAdvance(scaleLabel(mark)));
    left += around + gap;
    // The first slanted label begins left of its place.
    const double first = std::min(metrics.horizontalAdvance(mData.labels.front()), mLongest);
    if (mSlanted) left = std::max(left, around + first * std::cos(slant * M_PI / 180) - slot / 2);
    mPlot = QRectF(left, top, std::max(size.width() - around - left, smallestPlot), bottom - top);
}

void ChartDrawing::placeLabels() {
    if (!mLabelled) return;
    const QFontMetricsF metrics(mLook.font);
    if (!mData.moments.empty()) {
        // As wide as a label of the year's longest month, more or less.
        const double wide = metrics.horizontalAdvance(QStringLiteral("00.00.00000"));
        for (const TimeMark& mark : timeMarks(mData.moments.front(), mData.moments.back(),
                                              static_cast<int>(mPlot.width() / wide))) {
            const auto span =
                static_cast<double>(mData.moments.front().msecsTo(mData.moments.back()));
            const double share =
                span > 0 ? static_cast<double>(mData.moments.front().msecsTo(mark.at)) / span : 0.5;
            mLabels.push_back({mPlot.left() + gap + share * (mPlot.width() - 2 * gap), mark.label});
        }
        return;
    }
    const double slot = mPlot.width() / mData.points();
    const int every = mSlanted ? std::max(1, static_cast<int>(std::ceil(1.3 * mLine / slot))) : 1;
    for (int point = 0; point < mData.points(); point += every) {
        const double x = across(point);
        const double room = mSlanted ? mLongest : mPlot.width();
        mLabels.push_back({x, metrics.elidedText(mData.labels[point], Qt::ElideRight, room)});
    }
}

void ChartDrawing::placeMarks() {
    const auto count = static_cast<int>(mData.series.size());
    const double slot = mPlot.width() / mData.points();
    const double wide = std::min(slot * shareOfColumns / count, widestColumn);
    const double zero = height(std::clamp(0.0, mScale.first, mScale.last()));
    for (int point = 0; point < mData.points(); ++point)
        for (int n = 0; n < count; ++n) {
            const auto& value =
                mData.series[static_cast<std::size_t>(n)].values[static_cast<std::size_t>(point)];
            if (!value) continue;
            const double y = height(*value);
            if (mData.kind == ChartKind::lines) {
                mMarks.push_back({n, point, squareAround({across(point), y}, pointSize)});
                continue;
            }
            const double x = across(point) + (n - count / 2.0) * wide;
            const double apart = wide > 6 ? 1 : 0;
            mMarks.push_back(
                {n, point,
                 QRectF(x + apart, std::min(y, zero), wide - 2 * apart, std::abs(zero - y))});
        }
}

double ChartDrawing::height(double value) const {
    const double share = (value - mScale.first) / (mScale.last() - mScale.first);
    return mPlot.bottom() - share * mPlot.height();
}

double ChartDrawing::across(int point) const {
    if (mData.moments.empty()) return mPlot.left() + (point + 0.5) * mPlot.width() / mData.points();
    const QDateTime& first = mData.moments.front();
    const auto span = static_cast<double>(first.msecsTo(mData.moments.back()));
    const auto gone =
        static_cast<double>(first.msecsTo(mData.moments[static_cast<std::size_t>(point)]));
    const double share = span > 0 ? gone / span : 0.5;
    return mPlot.left() + gap + share * (mPlot.width() - 2 * gap);
}

const QColor& ChartDrawing::colour(int series) const {
    return mLook.series[static_cast<std::size_t>(series) % mLook.series.size()];
}

void ChartDrawing::paint(QPainter& painter) const {
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setFont(mLook.font);
    paintLegend(painter);
    paintScale(painter);
    if (mData.kind == ChartKind::columns)
        paintColumns(painter);
    else
        paintLines(painter);
    paintLabels(painter);
    painter.restore();
}

void ChartDrawing::paintLegend(QPainter& painter) const {
    const QFontMetricsF metrics(mLook.font);
    for (std::size_t n = 0; n < mLegend.size(); ++n) {
        const QRectF& place = mLegend[n];
        const QPointF middle(place.left() + swatch / 2, place.center().y());
        const auto series = static_cast<int>(n);
        if (mData.kind == ChartKind::columns)
            painter.fillRect(squareAround(middle, swatch), colour(series));
        else
            paintPoint(painter, middle, series, pointSize + 2);
        const QRectF words = place.adjusted(swatch + gap, 0, 0, 0);
        painter.setPen(mLook.text);
        painter.drawText(
            words, Qt::AlignLeft | Qt::AlignVCenter | Qt::TextSingleLine,
            metrics.elidedText(mData.series[n].name, Qt::ElideRight, words.width() + 1));
    }
}

/// In percent where all values are, and else as the steps need it.
QString ChartDrawing::scaleLabel(int mark) const {
    const bool percent =
        std::all_of(mData.series.begin(), mData.series.end(),
                    [](const auto& each) { return each.format.format == model::Format::Percent; });
    if (!percent) return mScale.label(mark);
    const double value = mScale.at(mark);
    return inWords(std::abs(value) < mScale.step * 1e-6 ? 0 : value, digitsDrawn,
                   {model::Format::Percent});
}

void ChartDrawing::paintScale(QPainter& painter) const {
    for (int mark = 0; mark <= mScale.steps; ++mark) {
        const double y = std::round(height(mScale.at(mark))) + 0.5; // a sharp line
        const bool zero = std::abs(mScale.at(mark)) < mScale.step * 1e-6;
        painter.setPen(QPen(zero ? mLook.faint : mLook.grid, 1));
        painter.drawLine(QPointF(mPlot.left(), y), QPointF(mPlot.right(), y));
        painter.setPen(mLook.faint);
        painter.drawText(QRectF(0, y - mLine / 2, mPlot.left() - gap, mLine),
                         Qt::AlignRight | Qt::AlignVCenter, scaleLabel(mark));
    }
}

void ChartDrawing::paintLabels(QPainter& painter) const {
    const QFontMetricsF metrics(mLook.font);
    const double top = mPlot.bottom() + gap;
    painter.setPen(mLook.faint);
    for (const Label& label : mLabels) {
        const double wide = metrics.horizontalAdvance(label.text);
        if (mSlanted) {
            painter.save();
            painter.translate(label.x + mLine * 0.25, top + mLine * 0.25);
            painter.rotate(-slant);
            painter.drawText(QPointF(-wide, metrics.ascent() * 0.5), label.text);
            painter.restore();
            continue;
        }
        const double most = std::max(mPlot.right() + around / 2 - wide, 0.0);
        painter.drawText(QPointF(std::clamp(label.x - wide / 2, 0.0, most), top + metrics.ascent()),
                         label.text);
        if (mData.moments.empty()) continue;
        painter.setPen(QPen(mLook.grid, 1));
        const double x = std::round(label.x) + 0.5;
        painter.drawLine(QPointF(x, mPlot.bottom()), QPointF(x, mPlot.bottom() + gap / 2));
        painter.setPen(mLook.faint);
    }
    painter.setPen(mLook.text);
    painter.drawText(QRectF(mPlot.left(), mAxisTop, mPlot.width(), mLine),
                     Qt::AlignCenter | Qt::TextSingleLine,
                     metrics.elidedText(mData.axis, Qt::ElideRight, mPlot.width()));
    painter.setPen(mLook.faint);
    painter.drawText(mNote + QPointF(0, metrics.ascent()), mData.note);
}

void ChartDrawing::paintColumns(QPainter& painter) const {
    for (const ChartMark& mark : mMarks) {
        // What is nearly nothing is still seen.
        const QRectF area = mark.area.height() < 1 ? mark.area.adjusted(0, -1, 0, 0) : mark.area;
        painter.fillRect(area, colour(mark.series));
    }
    paintValues(painter);
}

/// At the ends of the columns, where all of them have room.
void ChartDrawing::paintValues(QPainter& painter) const {
    const QFontMetricsF metrics(mLook.font);
    const auto valueOf = [&](const ChartMark& mark) {
        const auto& series = mData.series[static_cast<std::size_t>(mark.series)];
        return *series.values[static_cast<std::size_t>(mark.point)];
    };
    const auto text = [&](const ChartMark& mark) {
        return inWords(valueOf(mark), digitsDrawn,
                       mData.series[static_cast<std::size_t>(mark.series)].format);
    };
    const double slot = mPlot.width() / mData.points() / static_cast<double>(mData.series.size());
    for (const ChartMark& mark : mMarks)
        if (metrics.horizontalAdvance(text(mark)) > slot - gap) return;
    painter.setPen(mLook.text);
    for (const ChartMark& mark : mMarks) {
        const double wide = metrics.horizontalAdvance(text(mark));
        const double y = valueOf(mark) < 0 ? mark.area.bottom() + metrics.ascent()
                                           : mark.area.top() - metrics.descent();
        painter.drawText(QPointF(mark.area.center().x() - wide / 2, y), text(mark));
    }
}

void ChartDrawing::paintLines(QPainter& painter) const {
    const double slot = mPlot.width() / mData.points();
    const int every = std::max(1, static_cast<int>(std::ceil(betweenPoints / slot)));
    for (int n = 0; n < static_cast<int>(mData.series.size()); ++n) {
        const auto& values = mData.series[static_cast<std::size_t>(n)].values;
        QPainterPath path;
        std::vector<QPointF> shapes;
        bool isBroken = true;
        for (int point = 0; point < mData.points(); ++point) {
            const auto& value = values[static_cast<std::size_t>(point)];
            if (!value) {
                isBroken = true;
                continue;
            }
            const QPointF at(across(point), height(*value));
            isBroken ? path.moveTo(at) : path.lineTo(at);
            const bool isLast =
                point + 1 == mData.points() || !values[static_cast<std::size_t>(point) + 1];
            const bool isAlone = isBroken && isLast;
            isBroken = false;
            // A line that goes on is told by a shape now and then, each by its own.
            if (isAlone || (point + n) % every == 0) shapes.push_back(at);
        }
        painter.setBrush(Qt::NoBrush);
        painter.setPen(QPen(colour(n), 2, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
        painter.drawPath(path);
        for (const QPointF& at : shapes) paintPoint(painter, at, n, pointSize);
    }
}

void ChartDrawing::paintPoint(QPainter& painter, const QPointF& at, int series, double size) const {
    const double half = size / 2;
    QPainterPath shape;
    switch (series % mostSeries) {
    case 0: shape.addEllipse(at, half, half); break;
    case 1: shape.addRect(squareAround(at, size * 0.9)); break;
    case 2: // a triangle
        shape.addPolygon(QPolygonF{at + QPointF(0, -half * 1.1),
                                   at + QPointF(half * 1.1, half * 0.9),
                                   at + QPointF(-half * 1.1, half * 0.9)});
        break;
    case 3: // a diamond
        shape.addPolygon(QPolygonF{at + QPointF(0, -half * 1.3), at + QPointF(half * 1.3, 0),
                                   at + QPointF(0, half * 1.3), at + QPointF(-half * 1.3, 0)});
        break;
    case 4: // a triangle on its head
        shape.addPolygon(QPolygonF{at + QPointF(0, half * 1.1),
                                   at + QPointF(half * 1.1, -half * 0.9),
                                   at + QPointF(-half * 1.1, -half * 0.9)});
        break;
    default: // a bar
        shape.addRect(at.x() - half * 1.2, at.y() - half * 0.5, size * 1.2, size * 0.5);
    }
    shape.closeSubpath();
    painter.setPen(QPen(mLook.background, 1));
    painter.setBrush(colour(series));
    painter.drawPath(shape);
}

void ChartDrawing::highlight(QPainter& painter, const ChartMark& mark) const {
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    if (mData.kind == ChartKind::lines) {
        paintPoint(painter, mark.area.center(), mark.series, pointSize * 1.8);
    } else {
        painter.setPen(QPen(mLook.text, 2));
        painter.setBrush(Qt::NoBrush);
        painter.drawRect(mark.area);
    }
    painter.restore();
}

int ChartDrawing::markAt(const QPointF& place) const {
    if (!mPlot.adjusted(-gap, -gap, gap, gap).contains(place)) return -1;
    const bool columns = mData.kind == ChartKind::columns;
    int best = -1;
    double nearest = HUGE_VAL;
    for (std::size_t n = 0; n < mMarks.size(); ++n) {
        const QRectF& area = mMarks[n].area;
        // A low column is found above itself too.
        const double aside =
            columns ? std::max({area.left() - place.x(), place.x() - area.right(), 0.0})
                    : std::abs(area.center().x() - place.x());
        const double off = columns ? aside : std::hypot(aside, area.center().y() - place.y());
        if (off < nearest && off <= (columns ? 1 : nearAPoint)) {
            nearest = off;
            best = static_cast<int>(n);
        }
    }
    return best;
}

QString ChartDrawing::words(const ChartMark& mark) const {
    const auto& series = mData.series[static_cast<std::size_t>(mark.series)];
    const double value = *series.values[static_cast<std::size_t>(mark.point)];
    return mData.labels[mark.point] + u'\n' + series.name + QStringLiteral(": ") +
           inWords(value, digitsTold, series.format);
}

} // namespace zandor::designer
