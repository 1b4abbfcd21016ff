#pragma once

#include <QColor>

#include <cmath>

namespace zandor::platform::qt {

/// A colour between two: `share` of the way from the one to the other, from 0 to 1.
inline QColor mixed(const QColor& one, const QColor& other, qreal share) {
    const auto mix = [share](int a, int b) {
        return static_cast<int>(std::lround(a + (b - a) * share));
    };
    return {mix(one.red(), other.red()), mix(one.green(), other.green()),
            mix(one.blue(), other.blue())};
}

} // namespace zandor::platform::qt
