#pragma once

#include "model/sql_reader/Selected.h"

#include <functional>

namespace zandor::sql_reader {

using model::Query;

/// The query that draws a statement, without places for its tables. Throws Refused where none says
/// the same. Where a query `isWhole`, it may have hidden columns for nothing but the order of
/// conditions: a drawing that was written has that order from its columns.
Ref<Query> drawn(const Selected& selected, const std::function<bool(Query&)>& isWhole = {});

/// Which conditions on rows become joins: those that connect tables which nothing else does, those
/// between columns of one table too, or these alone, as a drawing that was written had them.
enum class JoinsOfRows { islands, loopsToo, loops };

/// Puts a statement's tables and joins into an empty query. Returns what its conditions ask for
/// beyond the joins.
std::vector<Node> drawSources(Query& query, const Selected& selected, JoinsOfRows joins);

} // namespace zandor::sql_reader
