#include "model/sql/NodeSet.h"

namespace zandor::model::sql {

namespace {

/// What most nodes of one kind differ in.
std::size_t own(const ColumnRef& x) { return std::hash<platform::String>()(x.column); }
std::size_t own(const Value& x) { return std::hash<platform::String>()(x.text); }
std::size_t own(const auto& /*x*/) { return 0; }

} // namespace

std::size_t NodeHash::operator()(const Node& node) const {
    constexpr std::size_t mixing = 0x9e3779b1;
    std::size_t hash =
        node->node.index() + std::visit([](const auto& x) { return own(x); }, node->node);
    for (const Node& part : partsOf(*node)) hash = hash * mixing + (*this)(part);
    return hash;
}

} // namespace zandor::model::sql
