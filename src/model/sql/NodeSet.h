#pragma once

#include <Zandor/model/export.h>
#include <Zandor/sql/Expression.h>

#include <unordered_map>
#include <unordered_set>

namespace zandor::model::sql {

/// Nodes that are the same count as one.
struct NodeHash {
    ZANDOR_MODEL_EXPORT std::size_t operator()(const Node& node) const;
};
struct NodeEqual {
    bool operator()(const Node& one, const Node& other) const { return same(one, other); }
};
using NodeSet = std::unordered_set<Node, NodeHash, NodeEqual>;
template <class Value>
using NodeMap = std::unordered_map<Node, Value, NodeHash, NodeEqual>;

} // namespace zandor::model::sql
