#pragma once

#include "model/Finding.h"
#include "model/Query.h"
#include "model/sql/Dialect.h"

namespace model::sql {

/// The names of a query that a dialect cannot carry: of its tables, of the columns that its joins
/// and definitions use, and synonyms. One finding for each thing that has such a name.
Findings uncarriedNames(Query& query, Dialect dialect);

} // namespace model::sql
