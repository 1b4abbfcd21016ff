#pragma once

#include "model/criteria/Output.h"

#include <Zandor/model/ColumnDefinition.h>

namespace zandor::model::criteria {

/// Ties the names in a definition's expression and criteria to the columns that they name now. To
/// be called before the tables of the query change; names that are tied already stay so.
void tie(ColumnDefinition& definition, const Resolver& resolver);

/// Writes the names of tables anew in a definition's expression and criteria where the tables that
/// they are tied to have another name now.
void followNames(ColumnDefinition& definition);

} // namespace zandor::model::criteria
