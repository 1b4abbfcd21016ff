#pragma once

#include <Zandor/Query.h>

namespace zandor::designer {

/// Makes a query say what another one says, by as few changes as that takes: tables, joins and
/// output columns that stay are the same objects, so that places and sizes stay, and the widths and
/// formats of columns, of which no statement speaks. A table of another name over the same source
/// is the one before, renamed. Tables that come have no place, unless one of their name had one.
void becomeQuery(model::Query& query, model::Query& other);

} // namespace zandor::designer
