#pragma once

#include <Zandor/platform/String.h>
#include <Zandor/sql/Expression.h>

namespace zandor::sql_reader {

using model::sql::Node;

/// A condition with what it speaks about on the left, and for a value alone that it is true.
Node asCondition(const Node& node);

/// Whether what is joined by And, Or and Not, or chooses, is true or false, however deep it stands.
bool asksForTruth(const Node& node);

/// Whether it holds in every row, as people write it to have an AND before each of the others.
bool holdsAlways(const Node& node);

/// SQLite compares moments as texts, so that one written otherwise than it was typed is another.
/// Throws Refused for one that is not among the texts of the statement.
void checkMoments(const Node& node, const std::vector<platform::String>& texts, std::size_t place);

} // namespace zandor::sql_reader
