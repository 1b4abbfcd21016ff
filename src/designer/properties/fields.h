#pragma once

#include <Zandor/Query.h>
#include <Zandor/model/Finding.h>

#include <QStringList>

namespace zandor::designer {

/// What an output column is made of, without its total: "table.column", or an expression as it was
/// typed. Empty for nothing.
QString fieldOf(const model::ColumnDefinition& definition);

/// Makes it a column of the query where the text is the name of one, "table.column", and else an
/// expression.
void setField(model::Query& query, model::ColumnDefinition& definition, const QString& text);

/// What there would be to say about an output column, apart from its criteria, if its field were
/// this text; an empty key stands for a new one. The query stays as it is.
model::Findings findingsOf(const model::Query& query, const platform::String& key,
                           const QString& text);

/// The columns of a query as they are written in an expression, and the functions with an opening
/// parenthesis behind them.
QStringList completions(model::Query& query);

/// Of such names those that contain what has been typed: first those that begin with it, themselves
/// or with their column, each in the order given.
QStringList matching(const QStringList& names, const QString& typed);

/// What its values are, Unknown where that cannot be told, as of an expression.
model::ColumnType typeOf(const model::ColumnDefinition& definition);

/// The same of what its total makes of them.
model::ColumnType outputTypeOf(const model::ColumnDefinition& definition);

} // namespace zandor::designer
