#pragma once

#include "model/sql_reader/Selected.h"

namespace zandor::sql_reader {

using model::Query;

/// The query that draws a statement, without places for its tables. Throws Refused where none says
/// the same.
Ref<Query> drawn(const Selected& selected);

/// Puts a statement's tables and joins into an empty query. Returns what its conditions ask for
/// beyond the joins.
std::vector<Node> drawSources(Query& query, const Selected& selected);

} // namespace zandor::sql_reader
