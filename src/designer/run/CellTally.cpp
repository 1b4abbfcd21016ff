#include "designer/run/CellTally.h"

#include <QCoreApplication>
#include <QLocale>
#include <QStringList>

namespace zandor::designer {

namespace {

class TallyWords {
    Q_DECLARE_TR_FUNCTIONS(zandor::designer::CellTally)
};

} // namespace

void CellTally::add(const Cell& cell, const CellFormat& format) {
    ++mCells;
    const bool isText = cell.kind == Cell::Kind::text;
    if (cell.kind == Cell::Kind::null || (isText && cell.text.isEmpty())) ++mEmpty;
    if (cell.kind != Cell::Kind::number) return;
    const auto value = Decimal::from(cell.text);
    if (!value) return;
    if (mNumbers == 0 || *value < mSmallest) mSmallest = *value;
    if (mNumbers == 0 || *value > mLargest) mLargest = *value;
    if (mNumbers == 0)
        mFormat = format;
    else if (format != mFormat)
        mFormat = {};
    ++mNumbers;
    mSum.add(*value);
}

QString CellTally::inWords() const {
    const auto count = [](qint64 value) { return QLocale().toString(value); };
    QStringList parts{TallyWords::tr("Cells: %1").arg(count(mCells))};
    if (mEmpty > 0) parts << TallyWords::tr("Empty: %1").arg(count(mEmpty));
    if (mNumbers > 0) {
        if (mNumbers + mEmpty < mCells) parts << TallyWords::tr("Numbers: %1").arg(count(mNumbers));
        parts << TallyWords::tr("Sum: %1").arg(shown(sum(), mFormat))
              << TallyWords::tr("Average: %1").arg(shown(average(), mFormat))
              << TallyWords::tr("Smallest: %1").arg(shown(mSmallest, mFormat))
              << TallyWords::tr("Largest: %1").arg(shown(mLargest, mFormat));
    }
    return parts.join(QStringLiteral(" \u00b7 "));
}

} // namespace zandor::designer
