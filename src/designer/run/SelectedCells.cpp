#include "designer/run/SelectedCells.h"

#include "designer/run/ResultModel.h"

#include <algorithm>
#include <utility>

namespace zandor::designer {

namespace {

constexpr qint64 mostBytesOfANumber = 4000; // longer numbers there are none

} // namespace

SelectedCells::SelectedCells(const ResultModel& rows, const QItemSelection& selection)
    : mSpool(rows.spool()) {
    const auto count = static_cast<std::size_t>(rows.rowCount());
    for (const QItemSelectionRange& range : selection) {
        mCount += qint64(range.width()) * range.height();
        auto part = std::find_if(mParts.begin(), mParts.end(), [&](const Part& each) {
            return each.left == range.left() && each.right == range.right();
        });
        if (part == mParts.end())
            part = mParts.insert(part, {range.left(), range.right(), std::vector<bool>(count)});
        for (int row = range.top(); row <= range.bottom(); ++row)
            part->rows[static_cast<std::size_t>(rows.spooled(row))] = true;
    }
    for (int column = 0; column < rows.columnCount(); ++column)
        mFormats.push_back(rows.format(column));
    if (mSpool && mCount > 0)
        mPages = (rows.rowCount() + Spool::rowsInAPage - 1) / Spool::rowsInAPage;
}

void SelectedCells::goOn(const QDeadlineTimer& until) {
    while (!isOver()) {
        const qint64 page = mPage++;
        const auto first = static_cast<std::size_t>(page * Spool::rowsInAPage);
        bool isRead = false;
        std::vector<Row> rows;
        for (const Part& part : mParts) {
            const std::size_t end =
                std::min<std::size_t>(part.rows.size(), first + Spool::rowsInAPage);
            for (std::size_t row = first; row < end; ++row) {
                if (!part.rows[row]) continue;
                if (!std::exchange(isRead, true)) rows = mSpool->page(page, mostBytesOfANumber);
                if (row - first >= rows.size()) break;
                for (auto column = static_cast<std::size_t>(part.left);
                     column <= static_cast<std::size_t>(part.right); ++column)
                    mTally.add(rows[row - first][column], mFormats[column]);
            }
        }
        if (until.hasExpired()) return;
    }
}

} // namespace zandor::designer
