#pragma once

#include "designer/chart/ChartData.h"
#include "designer/chart/ChartLook.h"
#include "designer/chart/scales.h"

#include <QRectF>

class QPainter;

namespace zandor::designer {

/// A value as it stands in a chart: a column, or a point of a line.
struct ChartMark {
    int series = 0;
    int point = 0;
    QRectF area; ///< of a point a small square around it
};

/// A chart laid out for a size, in logical pixels.
class ChartDrawing {
public:
    /// The data has at least a point and a series.
    ChartDrawing(ChartData data, ChartLook look, const QSizeF& size);

    void paint(QPainter& painter) const;
    /// Paints one value so that it stands out.
    void highlight(QPainter& painter, const ChartMark& mark) const;

    /// Point by point, and in each series by series; cells without a value have none.
    const std::vector<ChartMark>& marks() const { return mMarks; }
    /// The value nearest to a place, -1 where none is near.
    int markAt(const QPointF& place) const;
    /// "Berlin\ntotal: 12.5"
    QString words(const ChartMark& mark) const;

private:
    struct Label {
        double x;
        QString text;
    };

    void placeLegend(double width);
    void placeNote(const QSizeF& size);
    void placeAxes(const QSizeF& size);
    void placeLabels();
    void placeMarks();
    QString scaleLabel(int mark) const;
    double height(double value) const;
    double across(int point) const;
    void paintLegend(QPainter& painter) const;
    void paintScale(QPainter& painter) const;
    void paintLabels(QPainter& painter) const;
    void paintColumns(QPainter& painter) const;
    void paintValues(QPainter& painter) const;
    void paintLines(QPainter& painter) const;
    void paintPoint(QPainter& painter, const QPointF& at, int series, double size) const;
    const QColor& colour(int series) const;

    const ChartData mData;
    const ChartLook mLook;
    double mLine;        ///< the height of a line of text
    QRectF mPlot;        ///< what the values stand in
    double mAxisTop = 0; ///< of the axis' name; below the picture where there is no room for it
    QPointF mNote;       ///< where the note begins; below the picture where there is no room for it
    bool mLabelled = true;
    NumberScale mScale;
    std::vector<QRectF> mLegend; ///< one a series
    std::vector<Label> mLabels;
    bool mSlanted = false; ///< the labels are
    double mLongest = 0;   ///< so long they are at most
    std::vector<ChartMark> mMarks;
};

} // namespace zandor::designer
