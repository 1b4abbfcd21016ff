#pragma once

#include <Zandor/Query.h>
#include <Zandor/model/Finding.h>
#include <Zandor/sql/Dialect.h>

namespace zandor::model::sql {

/// The names of a query that a dialect cannot carry: of its tables, of the columns that its joins
/// and definitions use, and synonyms. One finding for each thing that has such a name.
Findings uncarriedNames(Query& query, Dialect dialect);

} // namespace zandor::model::sql
