#pragma once

#include "model/criteria/Parser.h"

#include <Zandor/model/ColumnDefinition.h>

namespace zandor::model::criteria {

/// What comes out of a definition.
struct Output {
    ExpressionReading reading; ///< of an expression
    sql::Node value;           ///< of a row; nothing where it cannot be told
    Subject subject;           ///< the value by its total, which criteria speak about
};

/// A definition of a column that is there, or of an expression; one of the entry "*" has a subject
/// only where it counts rows.
Output outputOf(const ColumnDefinition& definition, const Resolver& resolver);

} // namespace zandor::model::criteria
