#pragma once

#include <Zandor/Query.h>

#include <QPoint>
#include <QRect>
#include <QString>

#include <vector>

namespace report {

/// What every contestant shows: tables of columns in a window of 1200 by 800, the joins between
/// them, and the first eight of those on the first table, which is the one that moves.
struct Setting {
    int tables = 16;
    int columns = 100;
    int joins = 64;

    static constexpr int joinsOfMoving = 8;
    static constexpr QSize window{1200, 800};
    static constexpr QSize canvas{1600, 1200}; ///< scrolls in the window

    struct Join {
        int left, leftColumn, right, rightColumn; ///< from 0
    };

    static QString tableName(int table);
    static QString columnName(int column);
    /// Where a table stands, in pixels.
    static QRect place(int table);
    /// As many as there are columns and tables for.
    std::vector<Join> allJoins() const;
    zandor::platform::Ref<zandor::model::Query> query() const;
};

} // namespace report
