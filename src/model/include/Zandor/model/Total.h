#pragma once

#include <Zandor/model/Description.h>
#include <Zandor/model/export.h>
#include <Zandor/platform/String.h>

#include <cstdint>

namespace zandor::model {

/// What becomes of an output column's values when rows are put together. As soon as one column of
/// a query has a total other than None and Condition, its rows are put together, and a column with
/// None is one that they are grouped by, as with Group.
enum class Total : std::uint8_t {
    None,           ///< as the rows have it; groups where another column has a total
    Group,          ///< rows of equal values are put together
    Count,          ///< how many values there are; of the entry "*", how many rows
    CountDifferent, ///< how many different values there are
    Sum,            ///< of numbers
    Average,        ///< of numbers
    Smallest,       ///< of numbers, texts, dates and times
    Largest,        ///< as Smallest
    Condition,      ///< chooses rows by its criteria before they are put together, and stays inside
};

/// The last of them.
inline constexpr Total lastTotal = Total::Condition;

/// The word before the parentheses in which the grid shows what has the total: "sum". Empty for
/// None.
ZANDOR_MODEL_EXPORT platform::StringView wordOf(Total total);

/// Whether it is made of the values of several rows.
constexpr bool aggregates(Total total) { return total >= Total::Count && total <= Total::Largest; }

/// Whether values of a type have the total: sums and averages are of numbers, the smallest and the
/// largest of what has an order. Of an unknown type all may be.
ZANDOR_MODEL_EXPORT bool suits(Total total, ColumnType type);

/// What the total of values of a type is.
ZANDOR_MODEL_EXPORT ColumnType typeOf(Total total, ColumnType values);

} // namespace zandor::model
