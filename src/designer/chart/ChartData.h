#pragma once

#include "designer/run/CellFormat.h"

#include <QDateTime>

#include <functional>
#include <optional>

namespace zandor::designer {

/// What a chart shows of a result.
enum class ChartKind { columns, lines };

/// The rows of a result as a chart takes them: row by row in the order in which they are shown.
struct ChartSource {
    QStringList columns = {};
    int rows = 0;
    std::function<Cell(int row, int column)> cell = {};
    std::vector<CellFormat> formats = {}; ///< of the first columns; the others have none

    CellFormat format(int column) const {
        const auto place = static_cast<std::size_t>(column);
        return place < formats.size() ? formats[place] : CellFormat();
    }
};

/// What a column of a result is good for, told from its first rows.
enum class ColumnUse { none, text, date, number };
std::vector<ColumnUse> columnUses(const ChartSource& source);

/// Which columns a chart is made of, by their numbers from 0.
struct ChartChoice {
    int axis = -1;
    std::vector<int> values = {};
    ChartKind kind = ChartKind::columns;

    friend bool operator==(const ChartChoice&, const ChartChoice&) = default;
};

/// As many columns of values as colours that can be told apart.
inline constexpr int mostSeries = 6;

/// The choice that seems best: a column of dates for the axis, or else of texts, or else the first
/// of several of numbers; for the values the columns of numbers but for those that are named as
/// keys are, unless there are no others. Dates give lines, all else columns. What is missing is
/// left out: `axis` is -1, or there are no values.
ChartChoice bestChoice(const QStringList& columns, const std::vector<ColumnUse>& uses);

/// A moment that a text names, "2024-12-31", "2024-12" or with a time behind; nothing if it names
/// none.
std::optional<QDateTime> momentIn(const QString& text);

/// What is drawn.
struct ChartData {
    struct Series {
        QString name;
        std::vector<std::optional<double>> values; ///< one a point, nothing where the cell is empty
        CellFormat format = {};
    };

    ChartKind kind = ChartKind::columns;
    QString axis = {}; ///< its name
    QStringList labels = {};
    /// Of lines over dates: where the points stand, rising. Otherwise empty: side by side.
    std::vector<QDateTime> moments = {};
    std::vector<Series> series = {};
    QString note = {}; ///< what has to be said below, such as that these are not all rows

    int points() const { return static_cast<int>(labels.size()); }
};

/// The most rows that are drawn.
int mostPoints(ChartKind kind);

/// The choice has to be one that the source can give: with an axis and values.
ChartData readChart(const ChartSource& source, const ChartChoice& choice);

} // namespace zandor::designer
