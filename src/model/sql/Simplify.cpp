#include "model/sql/Simplify.h"

#include "model/sql/NodeSet.h"

#include <algorithm>
#include <optional>

namespace zandor::model::sql {

namespace {

Comparison opposite(Comparison comparison) {
    switch (comparison) {
    case Comparison::equal: return Comparison::notEqual;
    case Comparison::notEqual: return Comparison::equal;
    case Comparison::less: return Comparison::greaterEqual;
    case Comparison::greater: return Comparison::lessEqual;
    case Comparison::lessEqual: return Comparison::greater;
    case Comparison::greaterEqual: break;
    }
    return Comparison::less;
}

/// What a condition says of one value: that it is one of these constants of one type.
struct Choices {
    Node operand;
    std::vector<Node> list;
};

bool isConstant(const Node& node, ColumnType type) {
    const auto* value = std::get_if<Value>(&node->node);
    return value && value->type == type;
}

std::optional<Choices> choicesOf(const Node& term) {
    if (const auto* compare = std::get_if<Compare>(&term->node)) {
        const bool equal = compare->comparison == Comparison::equal &&
                           std::holds_alternative<Value>(compare->right->node);
        if (equal) return Choices{compare->left, {compare->right}};
    }
    if (const auto* in = std::get_if<In>(&term->node)) {
        const ColumnType type = typeOf(*in->list.front());
        const bool constants =
            !in->negated && std::all_of(in->list.begin(), in->list.end(),
                                        [&](const Node& item) { return isConstant(item, type); });
        if (constants) return Choices{in->operand, in->list};
    }
    return {};
}

std::vector<Node> withoutRepeats(std::vector<Node> terms) {
    std::vector<Node> kept;
    NodeSet known;
    for (Node& term : terms)
        if (known.insert(term).second) kept.push_back(std::move(term));
    return kept;
}

/// Terms one of which must hold: those that give one value constants become one list, where the
/// first of them stands.
std::vector<Node> withLists(std::vector<Node> terms) {
    struct Given {
        std::size_t place; ///< of the first
        ColumnType type;
        std::vector<Node> list;
        bool again = false; ///< there were more
    };
    std::vector<Node> kept;
    NodeMap<std::vector<Given>> given; // by what they are given to
    for (Node& term : terms) {
        const auto choices = choicesOf(term);
        kept.push_back(std::move(term));
        if (!choices) continue;
        const ColumnType type = typeOf(*choices->list.front());
        auto& all = given[choices->operand];
        const auto same = std::find_if(all.begin(), all.end(),
                                       [&](const Given& each) { return each.type == type; });
        if (same == all.end()) {
            all.push_back({.place = kept.size() - 1, .type = type, .list = choices->list});
            continue;
        }
        same->list.insert(same->list.end(), choices->list.begin(), choices->list.end());
        same->again = true;
        kept.pop_back();
    }
    for (auto& [operand, all] : given)
        for (Given& each : all) {
            if (!each.again) continue;
            auto list = withoutRepeats(std::move(each.list));
            if (list.size() > 1) kept[each.place] = make(In{false, operand, std::move(list)});
        }
    return kept;
}

Node simplified(const Node& node, bool negated) {
    const auto each = [&](const std::vector<Node>& terms) {
        std::vector<Node> all;
        all.reserve(terms.size());
        for (const Node& term : terms) all.push_back(simplified(term, negated));
        return all;
    };
    const auto toggled = [&](auto part) {
        part.negated = part.negated != negated;
        return make(std::move(part));
    };
    const auto* all = std::get_if<And>(&node->node);
    const auto* any = std::get_if<Or>(&node->node);
    if (all || any) {
        // Nested terms come up before they are looked at together.
        Node flat = (all != nullptr) != negated ? allOf(each(all ? all->terms : any->terms))
                                                : anyOf(each(all ? all->terms : any->terms));
        if (const auto* terms = std::get_if<And>(&flat->node))
            return allOf(withoutRepeats(terms->terms));
        if (const auto* terms = std::get_if<Or>(&flat->node))
            return anyOf(withLists(withoutRepeats(terms->terms)));
        return flat;
    }
    if (const auto* inverse = std::get_if<Not>(&node->node))
        return simplified(inverse->operand, !negated);
    if (const auto* compare = std::get_if<Compare>(&node->node))
        return negated ? make(Compare{opposite(compare->comparison), compare->left, compare->right})
                       : node;
    if (const auto* like = std::get_if<Like>(&node->node)) return toggled(*like);
    if (const auto* between = std::get_if<Between>(&node->node)) return toggled(*between);
    if (const auto* in = std::get_if<In>(&node->node)) return toggled(*in);
    if (const auto* isNull = std::get_if<IsNull>(&node->node)) return toggled(*isNull);
    return negated ? make(Not{node}) : node;
}

} // namespace

Node simplified(const Node& condition) {
    return condition ? simplified(condition, false) : condition;
}

} // namespace zandor::model::sql
