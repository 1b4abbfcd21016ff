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
/// Throws Refused where more of one are in a node than among the texts of the statement, and for a
/// date that becomes one and is not among those for which the statement says so.
void checkMoments(const Node& node, const std::vector<platform::String>& texts,
                  const std::vector<Node>& dates, std::size_t place);

/// SQLite makes no number or truth of a text. Throws Refused where more of these are in a node than
/// among the `others` of the statement, and one of its texts would come to the same.
void checkTexts(const Node& node, const std::vector<platform::String>& texts,
                const std::vector<platform::String>& others, std::size_t place);

} // namespace zandor::sql_reader
