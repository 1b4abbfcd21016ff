#include "Arithmetic.h"

#include <cmath>

namespace report {

namespace {

constexpr float twips = 15;
constexpr float markSize = 140;
constexpr float titleHeight = 300;
constexpr float rowHeight = 225;

} // namespace

Arithmetic::Arithmetic(const Setting& setting) {
    for (int t = 0; t < setting.tables; ++t) {
        const QRect box = Setting::place(t);
        mBoxes.push_back({static_cast<float>(box.x()) * twips, static_cast<float>(box.y()) * twips,
                          static_cast<float>(box.width()) * twips,
                          static_cast<float>(box.height()) * twips});
    }
    const auto row = [](int column) {
        return titleHeight + rowHeight * (static_cast<float>(column) + 1.5F);
    };
    for (const auto& join : setting.allJoins())
        mJoins.push_back({join.left, join.right, row(join.leftColumn), row(join.rightColumn)});
    mMarks.resize(2 * mJoins.size());
    mLines.resize(mJoins.size());
    for (std::size_t n = 0; n < mJoins.size(); ++n) place(n);
}

void Arithmetic::place(std::size_t join) {
    const Join& each = mJoins[join];
    const Box& left = mBoxes[static_cast<std::size_t>(each.left)];
    const Box& right = mBoxes[static_cast<std::size_t>(each.right)];
    const bool leftIsWest = right.left > left.left;
    const Box& west = leftIsWest ? left : right;
    const Box& east = leftIsWest ? right : left;
    const auto markTop = [](const Box& box, float row) {
        const float middle = box.top + row;
        if (box.top >= middle - markSize / 2) return box.top;
        if (box.top + box.height <= middle + markSize / 2) return box.top + box.height - markSize;
        return middle - markSize / 2;
    };
    Box& westMark = mMarks[2 * join];
    Box& eastMark = mMarks[2 * join + 1];
    westMark = {west.left + west.width, markTop(west, leftIsWest ? each.leftRow : each.rightRow),
                markSize, markSize};
    eastMark = {east.left - markSize, markTop(east, leftIsWest ? each.rightRow : each.leftRow),
                markSize, markSize};
    mLines[join] = {westMark.left + westMark.width, westMark.top + westMark.height / 2,
                    eastMark.left, eastMark.top + eastMark.height / 2};
}

void Arithmetic::move(int table, float left, float top) {
    Box& box = mBoxes[static_cast<std::size_t>(table)];
    box.left = left;
    box.top = top;
    for (std::size_t n = 0; n < mJoins.size(); ++n)
        if (mJoins[n].left == table || mJoins[n].right == table) place(n);
}

int Arithmetic::lineAt(float x, float y) const {
    int nearest = -1;
    float best = 50;
    for (std::size_t n = 0; n < mLines.size(); ++n) {
        Line line = mLines[n];
        if (line.x1 >= line.x2) {
            std::swap(line.x1, line.x2);
            std::swap(line.y1, line.y2);
        }
        if (x < line.x1 || x > line.x2) continue;
        const double dx = static_cast<double>(line.x2) - line.x1;
        const double dy = static_cast<double>(line.y2) - line.y1;
        const double length = std::sqrt(dx * dx + dy * dy);
        if (length == 0) continue;
        const double a = dx / length;
        const double b = dy / length;
        const auto distance =
            static_cast<float>(std::fabs((-x * b + y * a) - (-line.x1 * b + line.y1 * a)));
        if (distance >= best) continue;
        best = distance;
        nearest = static_cast<int>(n);
    }
    return nearest;
}

} // namespace report
