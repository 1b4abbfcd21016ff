#pragma once

#include "designer/run/CellFormat.h"

namespace zandor::designer {

/// What cells come to: how many they are, and what the numbers among them make.
class CellTally {
public:
    /// The format is that of its column.
    void add(const Cell& cell, const CellFormat& format = {});

    qint64 cells() const { return mCells; }
    qint64 empty() const { return mEmpty; } ///< without a value, or with a text of no character
    qint64 numbers() const { return mNumbers; }
    // Of the numbers, of which there has to be one.
    Decimal sum() const { return mSum.total(); }
    Decimal average() const { return mSum.average(mNumbers); }
    const Decimal& smallest() const { return mSmallest; }
    const Decimal& largest() const { return mLargest; }

    /// One line for a user; of the numbers only if there are any, shown as they are where they
    /// are all of one format.
    QString inWords() const;

private:
    qint64 mCells = 0;
    qint64 mEmpty = 0;
    qint64 mNumbers = 0;
    CellFormat mFormat; ///< of all numbers
    DecimalSum mSum;
    Decimal mSmallest;
    Decimal mLargest;
};

} // namespace zandor::designer
