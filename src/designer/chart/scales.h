#pragma once

#include <QDateTime>
#include <QStringList>

#include <vector>

namespace zandor::designer {

/// The marks of an axis of numbers: from a round number to a round number in round steps.
struct NumberScale {
    double first = 0;
    double step = 1;
    int steps = 1;

    double last() const { return first + step * steps; }
    double at(int mark) const { return first + step * mark; }
    /// The number of a mark in the user's language, with as many decimals as the steps need.
    QString label(int mark) const;
};

/// With no more steps than `most`, at least 2. Zero is on it where `withZero` says so.
NumberScale numberScale(double smallest, double largest, int most, bool withZero);

/// A mark of an axis of time.
struct TimeMark {
    QDateTime at;
    QString label; ///< in the user's language
};

/// Marks at beginnings of years, months, days or hours between two moments, no more than `most`,
/// at least 2.
std::vector<TimeMark> timeMarks(const QDateTime& first, const QDateTime& last, int most);

} // namespace zandor::designer
