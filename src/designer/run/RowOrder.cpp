#include "designer/run/RowOrder.h"

#include "designer/run/Spool.h"

#include <QCollator>

#include <algorithm>
#include <charconv>
#include <cmath>
#include <numeric>

namespace zandor::designer {

namespace {

constexpr qint64 mostBytes = 4000;        // of a cell
constexpr qsizetype mostCharacters = 200; // of a text; beyond it two are alike

enum class Rank : quint8 { nothing, number, notANumber, boolean, text, blob };

struct Key {
    Rank rank = Rank::nothing;
    /// As exact as the whole numbers of an engine are; of a text its place in the list of texts.
    long double value = 0;
};

std::optional<long double> numberIn(const QString& words) {
    const QByteArray bytes = words.toLatin1();
    long double value = 0;
    const auto [end, error] = std::from_chars(bytes.begin(), bytes.end(), value);
    if (error == std::errc::result_out_of_range)
        return bytes.startsWith('-') ? -HUGE_VALL : HUGE_VALL;
    if (error != std::errc() || end != bytes.end()) return {};
    return value;
}

/// The keys of a column, row by row.
class Keys {
public:
    void add(const Cell& cell) {
        switch (cell.kind) {
        case Cell::Kind::null: mKeys.push_back({}); break;
        case Cell::Kind::boolean:
            mKeys.push_back({Rank::boolean, cell.text == QLatin1String("true") ? 1.0L : 0.0L});
            break;
        case Cell::Kind::blob:
            mKeys.push_back({Rank::blob, static_cast<long double>(cell.text.toLongLong())});
            break;
        case Cell::Kind::number:
            if (const auto value = numberIn(cell.text)) {
                mKeys.push_back(std::isnan(*value) ? Key{Rank::notANumber}
                                                   : Key{Rank::number, *value});
                break;
            }
            [[fallthrough]];
        case Cell::Kind::text:
            mKeys.push_back({Rank::text, static_cast<long double>(mTexts.size())});
            mTexts.push_back(mCollator.sortKey(cell.text.left(mostCharacters)));
            break;
        }
    }

    RowOrder order(Qt::SortOrder direction) const {
        RowOrder rows(mKeys.size());
        std::iota(rows.begin(), rows.end(), 0U);
        if (direction == Qt::AscendingOrder)
            std::stable_sort(rows.begin(), rows.end(),
                             [this](quint32 a, quint32 b) { return less(mKeys[a], mKeys[b]); });
        else
            std::stable_sort(rows.begin(), rows.end(),
                             [this](quint32 a, quint32 b) { return less(mKeys[b], mKeys[a]); });
        return rows;
    }

private:
    bool less(const Key& a, const Key& b) const {
        if (a.rank != b.rank) return a.rank < b.rank;
        if (a.rank != Rank::text) return a.value < b.value;
        return mTexts[static_cast<std::size_t>(a.value)].compare(
                   mTexts[static_cast<std::size_t>(b.value)]) < 0;
    }

    QCollator mCollator;
    std::vector<Key> mKeys;
    std::vector<QCollatorSortKey> mTexts;
};

} // namespace

std::optional<RowOrder> sortedRows(Spool& spool, int column, Qt::SortOrder direction, qint64 count,
                                   const std::atomic<bool>& stop) {
    Keys keys;
    for (qint64 first = 0; first < count; first += Spool::rowsInAPage) {
        if (stop) return {};
        const auto page = spool.page(first / Spool::rowsInAPage, mostBytes);
        const auto wanted = static_cast<std::size_t>(std::min(Spool::rowsInAPage, count - first));
        if (page.size() < wanted) return {};
        for (std::size_t row = 0; row < wanted; ++row)
            keys.add(page[row][static_cast<std::size_t>(column)]);
    }
    return keys.order(direction);
}

} // namespace zandor::designer
