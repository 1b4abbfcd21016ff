#include "designer/chart/scales.h"

#include <QLocale>

#include <algorithm>
#include <cmath>

namespace zandor::designer {

namespace {

/// The smallest of 1, 2, 2.5, 5 and 10 times a power of ten that is not less.
double roundUp(double step) {
    const double power = std::pow(10, std::floor(std::log10(step)));
    for (const double times : {1.0, 2.0, 2.5, 5.0})
        if (times * power >= step * (1 - 1e-9)) return times * power;
    return 10 * power;
}

/// Steps through time that people count in.
struct TimeStep {
    int months = 0;
    int seconds = 0;
};

constexpr int minute = 60;
constexpr int hour = 60 * minute;
constexpr int day = 24 * hour;
constexpr TimeStep steps[] = {
    {0, minute},    {0, 5 * minute}, {0, 15 * minute}, {0, hour},    {0, 3 * hour}, {0, 6 * hour},
    {0, 12 * hour}, {0, day},        {0, 2 * day},     {0, 7 * day}, {0, 14 * day}, {1, 0},
    {2, 0},         {3, 0},          {6, 0},           {12, 0},      {24, 0},       {60, 0},
    {120, 0},       {240, 0},        {600, 0},         {1200, 0},    {6000, 0},     {12000, 0}};

/// The first beginning of a step that is not before a moment.
QDateTime beginning(const TimeStep& step, const QDateTime& from) {
    if (step.seconds > 0) {
        const qint64 seconds = (from.toMSecsSinceEpoch() + 999) / 1000;
        const qint64 over = ((seconds % step.seconds) + step.seconds) % step.seconds;
        return QDateTime::fromSecsSinceEpoch(seconds + (over == 0 ? 0 : step.seconds - over),
                                             Qt::UTC);
    }
    const int months = from.date().year() * 12 + from.date().month() - 1;
    const int begun = months - months % step.months;
    const QDateTime at(QDate(begun / 12, begun % 12 + 1, 1), QTime(0, 0), Qt::UTC);
    return at < from ? at.addMonths(step.months) : at;
}

QString labelOf(const TimeStep& step, const QDateTime& at) {
    const QLocale locale;
    if (step.months >= 12) return QString::number(at.date().year());
    if (step.months > 0) return locale.toString(at.date(), QStringLiteral("MMM yyyy"));
    if (step.seconds >= day || at.time() == QTime(0, 0))
        return locale.toString(at.date(), QLocale::ShortFormat);
    return locale.toString(at.time(), QStringLiteral("HH:mm"));
}

} // namespace

QString NumberScale::label(int mark) const {
    const double value = at(mark);
    // The noise of a sum is no number near zero.
    const double shown = std::abs(value) < step * 1e-6 ? 0 : value;
    const double largest = std::max(std::abs(first), std::abs(last()));
    if (largest >= 1e15 || largest < 1e-6) return QLocale().toString(shown, 'g', 4);
    int decimals = 0;
    for (double one = step; decimals < 9 && std::abs(one - std::round(one)) > 1e-6 * one;
         ++decimals)
        one *= 10;
    return QLocale().toString(shown, 'f', decimals);
}

NumberScale numberScale(double smallest, double largest, int most, bool withZero) {
    if (withZero || smallest == largest) {
        smallest = std::min(smallest, 0.0);
        largest = std::max(largest, 0.0);
    }
    if (smallest == largest) largest = smallest + 1;
    // Halves, for the span of the largest numbers is none itself.
    const double span = largest / 2 - smallest / 2;
    double step = roundUp(2 * (span / std::max(most, 2)));
    for (;; step = roundUp(step * 1.01)) {
        const double first = std::floor(smallest / step + 1e-9);
        const double last = std::ceil(largest / step - 1e-9);
        if (last - first <= std::max(most, 2))
            return {first * step, step, std::max(1, static_cast<int>(last - first))};
    }
}

std::vector<TimeMark> timeMarks(const QDateTime& first, const QDateTime& last, int most) {
    std::vector<TimeMark> marks;
    for (const TimeStep& step : steps) {
        marks.clear();
        const auto enough = static_cast<std::size_t>(std::max(most, 2));
        for (QDateTime at = beginning(step, first); at <= last && marks.size() <= enough;
             at = step.months > 0 ? at.addMonths(step.months) : at.addSecs(step.seconds))
            marks.push_back({at, labelOf(step, at)});
        if (marks.size() <= enough) break;
    }
    return marks;
}

} // namespace zandor::designer
