#include "designer/chart/ChartData.h"

#include <QCoreApplication>
#include <QLocale>
#include <QRegularExpression>

#include <algorithm>
#include <cmath>
#include <numeric>

namespace zandor::designer {

namespace {

constexpr int rowsLookedAt = 200;
constexpr int mostColumnsDrawn = 100;
constexpr int mostPointsOfALine = 2000;
constexpr int longestLabel = 200;
constexpr double largest = 1e300; // beyond it no scale has marks

class Words {
    Q_DECLARE_TR_FUNCTIONS(zandor::designer::ChartData)
};

std::optional<double> number(const Cell& cell) {
    if (cell.kind != Cell::Kind::number) return {};
    bool good = false;
    const double value = cell.text.toDouble(&good);
    if (!good || !(std::abs(value) < largest)) return {};
    return value;
}

QString label(const Cell& cell, const CellFormat& format) {
    if (cell.kind == Cell::Kind::null) return QStringLiteral("NULL");
    return shown(cell, format).left(longestLabel).simplified();
}

bool isNamedAsKey(const QString& name) {
    static const QRegularExpression key(QStringLiteral("^id$|_id$|[a-z]Id$"));
    return key.match(name).hasMatch() || name == QLatin1String("ID");
}

} // namespace

std::vector<ColumnUse> columnUses(const ChartSource& source) {
    std::vector<ColumnUse> result;
    for (int column = 0; column < source.columns.size(); ++column) {
        bool numbers = true, dates = true, texts = true, any = false;
        for (int row = 0; row < std::min(source.rows, rowsLookedAt); ++row) {
            const Cell cell = source.cell(row, column);
            if (cell.kind == Cell::Kind::null) continue;
            any = true;
            const bool isText = cell.kind == Cell::Kind::text;
            numbers = numbers && number(cell);
            dates = dates && isText && momentIn(cell.text);
            texts = texts && (isText || cell.kind == Cell::Kind::boolean);
        }
        result.push_back(!any      ? ColumnUse::none
                         : numbers ? ColumnUse::number
                         : dates   ? ColumnUse::date
                         : texts   ? ColumnUse::text
                                   : ColumnUse::none);
    }
    return result;
}

ChartChoice bestChoice(const QStringList& columns, const std::vector<ColumnUse>& uses) {
    const auto first = [&](ColumnUse use) {
        const auto found = std::find(uses.begin(), uses.end(), use);
        return found == uses.end() ? -1 : static_cast<int>(found - uses.begin());
    };
    ChartChoice choice{.axis = first(ColumnUse::date)};
    if (choice.axis >= 0)
        choice.kind = ChartKind::lines;
    else if (choice.axis = first(ColumnUse::text); choice.axis < 0)
        if (std::count(uses.begin(), uses.end(), ColumnUse::number) > 1)
            choice.axis = first(ColumnUse::number);
    for (const bool keysToo : {false, true})
        for (int column = 0; column < columns.size() && choice.values.size() < mostSeries; ++column)
            if (uses[static_cast<std::size_t>(column)] == ColumnUse::number &&
                column != choice.axis && isNamedAsKey(columns[column]) == keysToo &&
                (!keysToo || choice.values.empty()))
                choice.values.push_back(column);
    return choice;
}

std::optional<QDateTime> momentIn(const QString& text) {
    static const QRegularExpression form(
        QStringLiteral("^(\\d{4}-\\d{2})(-\\d{2})?([ T]\\d{2}:\\d{2}(:\\d{2}(\\.\\d+)?)?)?$"));
    const auto found = form.match(text);
    if (!found.hasMatch()) return {};
    const QString day = found.captured(2).isEmpty() ? QStringLiteral("-01") : found.captured(2);
    const QDate date = QDate::fromString(found.captured(1) + day, Qt::ISODate);
    QTime time(0, 0);
    if (const QString words = found.captured(3); !words.isEmpty()) {
        if (found.captured(2).isEmpty()) return {};
        time = QTime::fromString(words.mid(1), Qt::ISODateWithMs);
    }
    if (!date.isValid() || !time.isValid()) return {};
    return QDateTime(date, time, Qt::UTC); // without hours that come twice
}

int mostPoints(ChartKind kind) {
    return kind == ChartKind::columns ? mostColumnsDrawn : mostPointsOfALine;
}

ChartData readChart(const ChartSource& source, const ChartChoice& choice) {
    const int count = std::min(source.rows, mostPoints(choice.kind));
    ChartData data{.kind = choice.kind, .axis = source.columns[choice.axis]};
    std::vector<std::optional<QDateTime>> moments;
    for (int row = 0; row < count; ++row) {
        const Cell cell = source.cell(row, choice.axis);
        data.labels << label(cell, source.format(choice.axis));
        moments.push_back(cell.kind == Cell::Kind::text ? momentIn(cell.text) : std::nullopt);
    }
    // A line goes through time from left to right, however the rows are sorted.
    std::vector<int> order(static_cast<std::size_t>(count));
    std::iota(order.begin(), order.end(), 0);
    const auto momentOf = [&](int row) { return *moments[static_cast<std::size_t>(row)]; };
    int withoutMoment = 0;
    if (choice.kind == ChartKind::lines &&
        std::any_of(moments.begin(), moments.end(), [](const auto& each) { return each; })) {
        withoutMoment = static_cast<int>(
            std::erase_if(order, [&](int row) { return !moments[static_cast<std::size_t>(row)]; }));
        std::stable_sort(order.begin(), order.end(),
                         [&](int a, int b) { return momentOf(a) < momentOf(b); });
        QStringList sorted;
        for (const int row : order) {
            sorted << data.labels[row];
            data.moments.push_back(momentOf(row));
        }
        data.labels = sorted;
    }
    for (const int column : choice.values) {
        ChartData::Series series{source.columns[column], {}, source.format(column)};
        for (const int row : order) series.values.push_back(number(source.cell(row, column)));
        data.series.push_back(std::move(series));
    }
    const QLocale locale;
    QStringList notes;
    if (count < source.rows)
        notes << Words::tr("Drawn are the first %1 of %2 rows.")
                     .arg(locale.toString(count), locale.toString(source.rows));
    if (withoutMoment > 0)
        notes << Words::tr("Rows left out because they have no date: %1.")
                     .arg(locale.toString(withoutMoment));
    data.note = notes.join(u' ');
    return data;
}

} // namespace zandor::designer
