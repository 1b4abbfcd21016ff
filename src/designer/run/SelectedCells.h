#pragma once

#include "designer/run/CellTally.h"
#include "designer/run/Spool.h"

#include <QDeadlineTimer>
#include <QItemSelection>

#include <memory>

namespace zandor::designer {

class ResultModel;

/// The selected cells of a result, to be gone through bit by bit: page by page of the spool, in
/// whatever order its rows are shown.
class SelectedCells {
public:
    SelectedCells() = default;
    SelectedCells(const ResultModel& rows, const QItemSelection& selection);

    qint64 count() const { return mCount; }
    qint64 done() const { return mTally.cells(); }
    /// Goes on until all cells are done or the time has come; at least by a page.
    void goOn(const QDeadlineTimer& until);
    /// Nothing is left to be done; cells of pages that the disk does not give back never are.
    bool isOver() const { return mPage >= mPages; }
    const CellTally& tally() const { return mTally; }

private:
    /// Rows of the spool of which the same columns are selected.
    struct Part {
        int left = 0;
        int right = 0;
        std::vector<bool> rows = {};
    };

    std::shared_ptr<Spool> mSpool;
    std::vector<Part> mParts;
    std::vector<CellFormat> mFormats; ///< of all columns
    qint64 mCount = 0;
    qint64 mPage = 0;
    qint64 mPages = 0;
    CellTally mTally;
};

} // namespace zandor::designer
