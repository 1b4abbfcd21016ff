#pragma once

#include <Zandor/sql/Statement.h>
#include <Zandor/sql_reader/Messages.h>

#include <functional>
#include <optional>
#include <set>
#include <vector>

/// Whether two statements say the same. What is taken for different may still be the same; what is
/// taken for the same is.
namespace zandor::sql_reader {

using model::sql::Node;
using model::sql::Statement;
using platform::String;

/// What they differ in, in words; nothing where they say the same. The first asks of the rows what
/// can be asked of them; the columns of what comes out may have other names where it gives them
/// none.
std::optional<model::Message> difference(const Statement& read, const Statement& written);

/// Asks of the rows what is asked behind GROUP BY of nothing but what they are put together by.
void askBefore(Statement& statement);

/// A condition as the ways in which it holds: one of these rows, in which all stands. Nothing where
/// there are too many. What `isWhole` says so of is not taken apart.
using Ways = std::vector<std::vector<Node>>;
std::optional<Ways> waysOf(const std::vector<Node>& terms, std::size_t most,
                           const std::function<bool(const Node&)>& isWhole);

/// A text that two nodes share exactly when they say the same by the same parts.
String keyOf(const Node& node);

} // namespace zandor::sql_reader
