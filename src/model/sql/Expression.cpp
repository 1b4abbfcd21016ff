#include <Zandor/sql/Expression.h>

#include <algorithm>
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

/// The lists below name the parts of a kind of node that are nodes, and those that are not.
struct Parts {
    std::vector<Node> nodes;
    void add(const Node& node) {
        if (node) nodes.push_back(node);
    }
    void add(const std::vector<Node>& more) { nodes.insert(nodes.end(), more.begin(), more.end()); }

    void operator()(const ColumnRef&) {}
    void operator()(const Value&) {}
    void operator()(const Parameter&) {}
    void operator()(const Compare& x) { add(x.left), add(x.right); }
    void operator()(const Like& x) { add(x.operand), add(x.pattern); }
    void operator()(const Between& x) { add(x.operand), add(x.low), add(x.high); }
    void operator()(const In& x) { add(x.operand), add(x.list); }
    void operator()(const IsNull& x) { add(x.operand); }
    void operator()(const Not& x) { add(x.operand); }
    void operator()(const And& x) { add(x.terms); }
    void operator()(const Or& x) { add(x.terms); }
    void operator()(const Operation& x) { add(x.left), add(x.right); }
    void operator()(const Negative& x) { add(x.operand); }
    void operator()(const Call& x) { add(x.arguments); }
    void operator()(const Choice& x) { add(x.condition), add(x.then), add(x.otherwise); }
    void operator()(const Aggregate& x) { add(x.operand); }
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

bool same(const Node& left, const Node& right) {
    if (left == right) return true;
    if (!left || !right || left->node.index() != right->node.index()) return false;
    const bool own = std::visit(
        [&](const auto& part) {
            return alike(part, std::get<std::decay_t<decltype(part)>>(right->node));
        },
        left->node);
    if (!own) return false;
    const auto a = partsOf(*left);
    const auto b = partsOf(*right);
    return std::equal(a.begin(), a.end(), b.begin(), b.end(), same);
}

Node allOf(std::vector<Node> terms) { return joined<And>(std::move(terms)); }
Node anyOf(std::vector<Node> terms) { return joined<Or>(std::move(terms)); }

} // namespace zandor::model::sql
