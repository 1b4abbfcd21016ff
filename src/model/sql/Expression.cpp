#include <Zandor/sql/Expression.h>

#include <algorithm>
#include <array>
#include <cstddef>
#include <memory_resource>
#include <type_traits>

namespace zandor::model::sql {

namespace {

template <class Joint>
Node joined(std::vector<Node> terms) {
    Joint joint;
    for (auto& term : terms) {
        if (const auto* same = std::get_if<Joint>(&term->node))
            joint.terms.insert(joint.terms.end(), same->terms.begin(), same->terms.end());
        else
            joint.terms.push_back(std::move(term));
    }
    if (joint.terms.empty()) return {};
    if (joint.terms.size() == 1) return joint.terms.front();
    return make(std::move(joint));
}

} // namespace

namespace {

/// What is done with each part of a node that is a node, in their order. The list below names them.
template <class Kind, class Do>
void eachPart(Kind& x, Do take) {
    const auto each = [&](auto& list) {
        for (auto& node : list) take(node);
    };
    using Plain = std::remove_const_t<Kind>;
    constexpr bool leaf = std::is_same_v<Plain, ColumnRef> || std::is_same_v<Plain, Value> ||
                          std::is_same_v<Plain, Parameter>;
    if constexpr (leaf) {
    } else if constexpr (std::is_same_v<Plain, Choice>) {
        take(x.condition), take(x.then), take(x.otherwise);
    } else if constexpr (requires { x.terms; }) {
        each(x.terms);
    } else if constexpr (requires { x.arguments; }) {
        each(x.arguments);
    } else if constexpr (requires { x.left; }) {
        take(x.left), take(x.right);
    } else {
        take(x.operand);
        if constexpr (requires { x.pattern; }) take(x.pattern);
        if constexpr (requires { x.low; }) take(x.low), take(x.high);
        if constexpr (requires { x.list; }) each(x.list);
    }
}

struct Parts {
    std::vector<Node> nodes;
    template <class Kind>
    void operator()(const Kind& x) {
        eachPart(x, [this](const Node& node) {
            if (node) nodes.push_back(node);
        });
    }
};

struct Replacing {
    std::vector<Node>::iterator next;
    template <class Kind>
    void operator()(Kind& x) {
        eachPart(x, [this](Node& node) {
            if (node) node = std::move(*next++);
        });
    }
};

bool alike(const ColumnRef& a, const ColumnRef& b) { return a == b; }
bool alike(const Value& a, const Value& b) { return a == b; }
bool alike(const Parameter& a, const Parameter& b) { return a == b; }
bool alike(const Compare& a, const Compare& b) { return a.comparison == b.comparison; }
bool alike(const Operation& a, const Operation& b) { return a.symbol == b.symbol; }
bool alike(const Call& a, const Call& b) { return a.function == b.function; }
bool alike(const Aggregate& a, const Aggregate& b) { return a.total == b.total; }
template <class Part>
bool alike(const Part& a, const Part& b) {
    if constexpr (requires { a.negated; }) return a.negated == b.negated;
    return true;
}

struct Types {
    ColumnType operator()(const Negative& x) const {
        const ColumnType type = typeOf(*x.operand);
        return type == ColumnType::Unknown ? ColumnType::Decimal : type;
    }
    template <class Part>
    ColumnType operator()(const Part& x) const {
        if constexpr (requires { x.type; })
            return x.type;
        else
            return ColumnType::Boolean;
    }
};

} // namespace

Comparison mirrored(Comparison comparison) {
    switch (comparison) {
    case Comparison::less: return Comparison::greater;
    case Comparison::greater: return Comparison::less;
    case Comparison::lessEqual: return Comparison::greaterEqual;
    case Comparison::greaterEqual: return Comparison::lessEqual;
    default: return comparison;
    }
}

ColumnType typeOf(const Expression& expression) { return std::visit(Types(), expression.node); }

bool isCondition(const Expression& expression) {
    return std::visit(
        [](const auto& part) {
            return !requires { part.type; }
            &&!std::is_same_v<decltype(part), const Negative&>;
        },
        expression.node);
}

std::vector<Node> partsOf(const Expression& expression) {
    Parts parts;
    std::visit(parts, expression.node);
    return std::move(parts.nodes);
}

Node withParts(const Expression& expression, std::vector<Node> parts) {
    Expression other = expression;
    Replacing replacing{parts.begin()};
    std::visit(replacing, other.node);
    return std::make_shared<const Expression>(std::move(other));
}

bool same(const Node& left, const Node& right) {
    if (left == right) return true;
    if (!left || !right || left->node.index() != right->node.index()) return false;
    const bool own = std::visit(
        [&](const auto& part) {
            return alike(part, std::get<std::decay_t<decltype(part)>>(right->node));
        },
        left->node);
    if (!own) return false;
    // Without memory of its own: conditions are compared each with each.
    std::array<std::byte, 512> room;
    std::pmr::monotonic_buffer_resource memory(room.data(), room.size());
    std::pmr::vector<const Node*> parts(&memory);
    const auto collect = [&](const auto& part) {
        eachPart(part, [&](const Node& node) { parts.push_back(&node); });
    };
    std::visit(collect, left->node);
    const std::size_t count = parts.size();
    std::visit(collect, right->node);
    if (parts.size() != 2 * count) return false;
    return std::equal(parts.begin(), parts.begin() + static_cast<std::ptrdiff_t>(count),
                      parts.begin() + static_cast<std::ptrdiff_t>(count),
                      [](const Node* a, const Node* b) { return same(*a, *b); });
}

Node allOf(std::vector<Node> terms) { return joined<And>(std::move(terms)); }
Node anyOf(std::vector<Node> terms) { return joined<Or>(std::move(terms)); }

} // namespace zandor::model::sql
