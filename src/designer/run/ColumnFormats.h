#pragma once

#include "designer/run/CellFormat.h"

#include <vector>

namespace zandor::model {
class ColumnDefinition;
class Query;
} // namespace zandor::model

namespace zandor::designer {

/// Whether it stands for all columns of a table, which the query does not count.
bool isOfSeveral(const model::ColumnDefinition& definition);

/// How the columns of a result are shown: as the query says whose result it is.
class ColumnFormats {
public:
    ColumnFormats() = default;
    explicit ColumnFormats(model::Query& query);

    /// Of a column of a result of so many. Those that an entry of all columns stands for have none.
    CellFormat at(int column, int columns) const;

    friend bool operator==(const ColumnFormats&, const ColumnFormats&) = default;

private:
    std::vector<CellFormat> mFirst; ///< before the first entry of all columns
    std::vector<CellFormat> mLast;  ///< behind the last one, from the right
};

} // namespace zandor::designer
