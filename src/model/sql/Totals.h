#pragma once

#include <Zandor/model/ColumnDefinition.h>
#include <Zandor/model/Finding.h>
#include <Zandor/sql/Statement.h>

#include <map>

namespace zandor::model::sql {

/// A condition of one cell of the grid.
struct Term {
    Node condition;
    const ColumnDefinition* definition;
    std::int16_t row;
};

/// What the criteria of one row of the grid say, all of which must hold.
struct RowTerms {
    std::vector<Term> ofTotals;     ///< on what rows were put together into
    std::vector<Term> ofGroups;     ///< on what rows are put together by, or on rows as they are
    std::vector<Term> ofConditions; ///< on rows before they are put together, and not seen after
};

/// Puts criteria where they mean what the grid says: before rows are put together, or behind. What
/// can stand in neither place is a finding, and left out.
void place(const std::map<std::int16_t, RowTerms>& rows, Statement& statement, Findings& findings);

/// Why a column's values have no such total, or nothing.
std::optional<Message> refusalOf(Total total, ColumnType type, const String& name);

} // namespace zandor::model::sql
