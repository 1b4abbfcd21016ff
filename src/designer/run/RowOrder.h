#pragma once

#include <Qt>
#include <QtGlobal>

#include <atomic>
#include <optional>
#include <vector>

namespace zandor::designer {

class Spool;

/// Numbers of rows, from 0, in the order in which they are to be shown.
using RowOrder = std::vector<quint32>;

/// More rows than these are sorted by the engine or not at all: their keys would fill the memory.
inline constexpr qint64 mostRowsSorted = 2'000'000;

/// The first `count` rows of a spool by one of their columns; for any thread. Numbers stand as
/// numbers, texts as the user's language orders them by their beginnings, blobs by their size; what
/// holds nothing comes before everything, and numbers before texts where a column has both. Rows
/// that are alike stay in the order in which they came, in both directions. Nothing when it was
/// stopped or a page of the spool cannot be read.
std::optional<RowOrder> sortedRows(Spool& spool, int column, Qt::SortOrder direction, qint64 count,
                                   const std::atomic<bool>& stop);

} // namespace zandor::designer
