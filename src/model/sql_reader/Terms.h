#pragma once

#include <Zandor/sql/Expression.h>

#include <vector>

namespace zandor::sql_reader {

using model::sql::Node;

/// What must hold together for a condition to hold: the terms of an And, else itself; none of
/// nothing, and of what always holds.
inline std::vector<Node> termsOf(const Node& condition) {
    if (!condition) return {};
    if (const auto* all = std::get_if<model::sql::And>(&condition->node)) return all->terms;
    const auto* value = std::get_if<model::sql::Value>(&condition->node);
    if (value && value->type == model::ColumnType::Boolean && value->text == u"true") return {};
    return {condition};
}

} // namespace zandor::sql_reader
