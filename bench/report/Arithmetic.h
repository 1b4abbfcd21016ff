#pragma once

#include "Setting.h"

#include <vector>

namespace report {

/// What the drawing of joins comes down to, on plain numbers and with nothing around it: where
/// marks and line ends are, in singles, and which line is under a point.
class Arithmetic {
public:
    explicit Arithmetic(const Setting& setting);

    struct Line {
        float x1, y1, x2, y2;
    };

    /// Places the joins of a table that stands somewhere else now.
    void move(int table, float left, float top);
    /// The line nearest to a point within 50 twips, or -1.
    int lineAt(float x, float y) const;

    std::vector<Line>& lines() { return mLines; }

private:
    struct Box {
        float left, top, width, height;
    };
    struct Join {
        int left, right;
        float leftRow, rightRow; ///< below the top of the table
    };

    void place(std::size_t join);

    std::vector<Box> mBoxes;
    std::vector<Join> mJoins;
    std::vector<Box> mMarks; ///< two for each join
    std::vector<Line> mLines;
};

} // namespace report
