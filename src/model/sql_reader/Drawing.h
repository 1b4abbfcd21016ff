#pragma once

#include "model/sql_reader/Selected.h"

#include <functional>

namespace zandor::sql_reader {

using model::Query;

/// The query that draws a statement, without places for its tables. Throws Refused where none says
/// the same. Where a query `isWhole`, it may have hidden columns for nothing but the order of
/// conditions: a drawing that was written has that order from its columns.
Ref<Query> drawn(const Selected& selected, const std::function<bool(Query&)>& isWhole = {});

/// What is drawn of a condition that compares two columns of one table: a criterion, or a join of
/// the table with itself.
enum class Loops { criteria, joins };

/// Puts a statement's tables and joins into an empty query. Returns what its conditions ask for
/// beyond the joins.
std::vector<Node> drawSources(Query& query, const Selected& selected, Loops loops);

} // namespace zandor::sql_reader
