#pragma once

#include <QColor>
#include <QFont>
#include <QPalette>

#include <vector>

namespace zandor::designer {

/// The colours and the font of a chart.
struct ChartLook {
    QFont font;
    QColor background;
    QColor text;
    QColor faint; ///< of what is less important, and of the line at zero
    QColor grid;
    /// One a series; people who see colours differently can tell them apart, and from the
    /// background.
    std::vector<QColor> series;

    /// As the window around looks.
    static ChartLook of(const QPalette& palette, const QFont& font);
    /// For paper: dark on white.
    static ChartLook ofPage(const QFont& font);
};

} // namespace zandor::designer
