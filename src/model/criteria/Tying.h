#pragma once

#include "model/criteria/Parser.h"

#include <Zandor/model/ColumnDefinition.h>

namespace zandor::model::criteria {

/// Ties the names in a definition's criteria to the columns that they name now. To be called
/// before the tables of the query change; names that are tied already stay so.
void tie(const ColumnDefinition& definition, const Resolver& resolver);

/// Writes the names of tables anew in a definition's criteria where the tables that they are tied
/// to have another name now.
void followNames(const ColumnDefinition& definition);

} // namespace zandor::model::criteria
