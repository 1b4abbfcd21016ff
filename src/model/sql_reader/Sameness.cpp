#include "model/sql_reader/Sameness.h"

#include "model/sql/Simplify.h"
#include "model/sql_reader/Terms.h"

#include <Zandor/model/Names.h>

#include <algorithm>
#include <cstdint>

namespace zandor::sql_reader {

namespace sql = model::sql;

namespace {

String number(std::size_t value) { return platform::decimal(static_cast<std::int64_t>(value)); }

/// With its length before it, so that no text can look like two.
String measured(const String& text) { return number(text.size()) + u':' + text; }

String own(const sql::ColumnRef& x) {
    return measured(model::foldedName(x.table)) + measured(x.column);
}
String own(const sql::Value& x) {
    return number(static_cast<std::size_t>(x.type)) + measured(x.text);
}
String own(const sql::Parameter& x) { return measured(x.name) + (x.pattern ? u"p" : u""); }
String own(const sql::Operation& x) { return number(static_cast<std::size_t>(x.symbol)); }
String own(const sql::Call& x) { return number(static_cast<std::size_t>(x.function)); }
String own(const sql::Aggregate& x) { return number(static_cast<std::size_t>(x.total)); }
String own(const sql::Choice& x) { return x.otherwise ? u"e" : u""; }
template <class Part>
String own(const Part& x) {
    if constexpr (requires { x.negated; }) return x.negated ? u"n" : u"";
    return {};
}

Node compare(sql::Comparison comparison, const Node& left, const Node& right) {
    return sql::make(sql::Compare{comparison, left, right});
}

/// Between and In by what they stand for, and no Not above a comparison.
Node plain(const Node& node) {
    if (const auto* x = std::get_if<sql::Between>(&node->node)) {
        using enum sql::Comparison;
        std::vector<Node> both{compare(x->negated ? less : greaterEqual, x->operand, x->low),
                               compare(x->negated ? greater : lessEqual, x->operand, x->high)};
        return x->negated ? sql::anyOf(std::move(both)) : sql::allOf(std::move(both));
    }
    if (const auto* x = std::get_if<sql::In>(&node->node)) {
        std::vector<Node> each;
        for (const Node& item : x->list)
            each.push_back(compare(x->negated ? sql::Comparison::notEqual : sql::Comparison::equal,
                                   x->operand, item));
        return x->negated ? sql::allOf(std::move(each)) : sql::anyOf(std::move(each));
    }
    return node;
}

class Normal {
public:
    using IsWhole = std::function<bool(const Node&)>;
    explicit Normal(std::size_t most, IsWhole isWhole = {})
        : mMost(most), mIsWhole(std::move(isWhole)) {}

    /// Nothing where there are too many ways.
    std::optional<Ways> of(const Node& given) {
        if (mIsWhole && mIsWhole(given)) return Ways{{given}};
        const Node node = mIsWhole ? given : plain(given);
        if (const auto* any = std::get_if<sql::Or>(&node->node)) {
            Ways all;
            for (const Node& term : any->terms) {
                const auto ways = of(term);
                if (!ways) return {};
                all.insert(all.end(), ways->begin(), ways->end());
                if (all.size() > mMost) return {};
            }
            return all;
        }
        if (const auto* all = std::get_if<sql::And>(&node->node)) return product(all->terms);
        return Ways{{node}};
    }

    std::optional<Ways> product(const std::vector<Node>& terms) {
        Ways all{{}};
        for (const Node& term : terms) {
            const auto ways = of(term);
            if (!ways || all.size() * ways->size() > mMost) return {};
            Ways longer;
            for (const auto& before : all)
                for (const auto& behind : *ways) {
                    longer.push_back(before);
                    longer.back().insert(longer.back().end(), behind.begin(), behind.end());
                }
            all = std::move(longer);
        }
        return all;
    }

private:
    const std::size_t mMost;
    const IsWhole mIsWhole;
};

using Keys = std::set<String>;

/// Keys with a sign that tells most of them apart at a glance: what is a part of another has no bit
/// that the other has not.
struct SignedKeys {
    explicit SignedKeys(Keys all) : keys(std::move(all)) {
        for (const String& key : keys) sign |= 1ULL << (std::hash<String>()(key) % 64);
    }

    bool isPartOf(const SignedKeys& other) const {
        return (sign & ~other.sign) == 0 && keys.size() < other.keys.size() &&
               std::includes(other.keys.begin(), other.keys.end(), keys.begin(), keys.end());
    }

    Keys keys;
    std::uint64_t sign = 0;
};

/// The ways that no other one is a part of; two conditions have the same exactly when they are the
/// same for all that And and Or know of what stands in them.
std::optional<std::set<Keys>> keysOf(const std::vector<Node>& terms) {
    constexpr std::size_t most = 4096;
    const auto ways = Normal(most).product(terms);
    if (!ways) return {};
    std::vector<SignedKeys> all;
    for (const auto& way : *ways) {
        Keys keys;
        for (const Node& node : way) keys.insert(keyOf(node));
        all.emplace_back(std::move(keys));
    }
    std::set<Keys> least;
    for (const SignedKeys& each : all) {
        const bool more = std::any_of(
            all.begin(), all.end(), [&](const SignedKeys& other) { return other.isPartOf(each); });
        if (!more) least.insert(each.keys);
    }
    return least;
}

/// Whether all columns in a node stand in one of these; and no total.
bool isMadeOf(const Node& node, const std::vector<Node>& groups) {
    const bool group = std::any_of(groups.begin(), groups.end(),
                                   [&](const Node& each) { return sql::same(each, node); });
    if (group) return true;
    if (std::holds_alternative<sql::ColumnRef>(node->node) ||
        std::holds_alternative<sql::Aggregate>(node->node))
        return false;
    const auto parts = sql::partsOf(*node);
    return std::all_of(parts.begin(), parts.end(),
                       [&](const Node& part) { return isMadeOf(part, groups); });
}

/// What cannot be compared by what is known here.
struct Incomparable {};

/// Sources by what they come to: those whose rows all must be there, with the conditions on them,
/// and what is added to these one by one.
struct Joined {
    struct Step;
    Keys leaves; ///< by name and by what they are
    std::set<String> names;
    std::vector<Node> conditions;
    std::vector<Step> steps;
};

struct Joined::Step {
    bool full = false;
    Joined right;
    Keys on;
    std::set<String> needs; ///< names of the tables that `on` speaks about
};

void addNames(const Node& node, std::set<String>& names) {
    if (const auto* column = std::get_if<sql::ColumnRef>(&node->node)) names.insert(column->table);
    for (const Node& part : sql::partsOf(*node)) addNames(part, names);
}

bool isWithin(const std::set<String>& inner, const std::set<String>& outer) {
    return std::includes(outer.begin(), outer.end(), inner.begin(), inner.end());
}

bool hasFull(const Joined& joined) {
    return std::any_of(joined.steps.begin(), joined.steps.end(),
                       [](const Joined::Step& step) { return step.full; });
}

Joined joined(const sql::Source& source);

void merge(Joined& into, Joined other) {
    if (hasFull(into) || hasFull(other)) throw Incomparable();
    into.leaves.merge(other.leaves);
    into.names.merge(other.names);
    into.conditions.insert(into.conditions.end(), other.conditions.begin(), other.conditions.end());
    for (auto& step : other.steps) into.steps.push_back(std::move(step));
}

/// Rows are added to those of `into` where `on` finds some.
void addStep(Joined& into, Joined right, const std::vector<Node>& on, bool full) {
    Joined::Step step{full, std::move(right), {}, {}};
    for (const Node& term : on) {
        step.on.insert(keyOf(term));
        addNames(term, step.needs);
    }
    // What is added to the right side alone, by a comparison with it that finds nothing where it is
    // missing, can as well be added behind.
    std::vector<Joined::Step> behind;
    if (!full && !hasFull(step.right)) {
        std::vector<Joined::Step> kept;
        for (auto& inner : step.right.steps) {
            const bool onRight =
                std::any_of(inner.needs.begin(), inner.needs.end(),
                            [&](const String& name) { return step.right.names.contains(name); });
            const bool unused =
                std::none_of(inner.right.names.begin(), inner.right.names.end(),
                             [&](const String& name) { return step.needs.contains(name); });
            (onRight && unused ? behind : kept).push_back(std::move(inner));
        }
        step.right.steps = std::move(kept);
    }
    into.steps.push_back(std::move(step));
    for (auto& each : behind) into.steps.push_back(std::move(each));
}

Joined joined(const sql::JoinSource& join) {
    Joined left = joined(*join.left);
    Joined right = joined(*join.right);
    const std::vector<Node> on = termsOf(join.on);
    switch (join.kind) {
    case sql::JoinKind::inner: {
        merge(left, std::move(right));
        std::set<String> needs;
        for (const Node& term : on) addNames(term, needs);
        // A condition on what is added takes the rows that were filled away.
        if (!isWithin(needs, left.names)) throw Incomparable();
        left.conditions.insert(left.conditions.end(), on.begin(), on.end());
        return left;
    }
    case sql::JoinKind::leftOuter: addStep(left, std::move(right), on, false); return left;
    case sql::JoinKind::rightOuter: addStep(right, std::move(left), on, false); return right;
    case sql::JoinKind::fullOuter: break;
    }
    addStep(left, std::move(right), on, true);
    return left;
}

Joined joined(const sql::Source& source) {
    if (const auto* join = std::get_if<sql::JoinSource>(&source.node)) return joined(*join);
    const String alias = sql::aliasOf(source);
    String leaf = measured(alias);
    if (const auto* table = std::get_if<sql::TableRef>(&source.node))
        leaf += measured(table->schema) + measured(table->name);
    return {{leaf}, {alias}, {}, {}};
}

bool speaksOf(const std::set<String>& needs, const std::set<String>& names) {
    return std::any_of(names.begin(), names.end(),
                       [&](const String& name) { return needs.contains(name); });
}

/// Whether what only adds rows can as well be added before another step: neither speaks of the
/// other's rows, and it finds nothing for those that FULL JOIN brings along.
bool canComeBefore(const Joined::Step& step, const Joined::Step& other) {
    if (speaksOf(step.needs, other.right.names)) return false;
    if (!other.full) return true;
    return !speaksOf(other.needs, step.right.names) && !isWithin(step.needs, step.right.names);
}

std::vector<Joined::Step> earliestFirst(std::vector<Joined::Step> steps) {
    for (std::size_t n = 1; n < steps.size(); ++n)
        for (std::size_t at = n; at > 0 && !steps[at].full; --at) {
            if (!canComeBefore(steps[at], steps[at - 1])) break;
            std::swap(steps[at], steps[at - 1]);
        }
    return steps;
}

String joinedKey(const Joined& joined, bool withConditions) {
    String key = u"(";
    for (const String& leaf : joined.leaves) key += leaf + u' ';
    if (withConditions) {
        key += u'|';
        Keys conditions;
        for (const Node& each : joined.conditions) conditions.insert(keyOf(each));
        for (const String& each : conditions) key += each + u' ';
    }
    // What only adds rows can be added in any order; FULL JOIN cannot.
    Keys run;
    const auto flush = [&] {
        for (const String& each : run) key += each;
        run.clear();
    };
    for (const auto& step : earliestFirst(joined.steps)) {
        String one = step.full ? u"F" : u"L";
        one += joinedKey(step.right, true) + u'[';
        for (const String& term : step.on) one += term + u' ';
        one += u']';
        if (step.full) flush();
        run.insert(one);
        if (step.full) flush();
    }
    flush();
    return key + u')';
}

/// All of FROM and WHERE.
struct Rows {
    String sources;
    std::optional<std::set<Keys>> where;
};

Rows rowsOf(const Statement& statement) {
    std::vector<Node> where = termsOf(sql::simplified(statement.where));
    const bool full = std::any_of(statement.from.begin(), statement.from.end(),
                                  [](const auto& source) { return hasFull(joined(*source)); });
    if (full) {
        Keys trees;
        for (const auto& source : statement.from) trees.insert(joinedKey(joined(*source), true));
        String all;
        for (const String& tree : trees) all += tree;
        return {all, keysOf(where)};
    }
    Joined all;
    for (const auto& source : statement.from) merge(all, joined(*source));
    where.insert(where.end(), all.conditions.begin(), all.conditions.end());
    return {joinedKey(all, false), keysOf(where)};
}

String itemKey(const sql::SelectItem& item) {
    if (const auto* all = std::get_if<sql::AllColumns>(&item.what))
        return u"*" + measured(model::foldedName(all->table));
    return keyOf(std::get<Node>(item.what));
}

bool sameItem(const sql::SelectItem& read, const sql::SelectItem& drawn) {
    if (itemKey(read) != itemKey(drawn)) return false;
    const auto* value = std::get_if<Node>(&read.what);
    const auto* column = value ? std::get_if<sql::ColumnRef>(&(*value)->node) : nullptr;
    if (!column) return read.name.empty() || read.name == drawn.name;
    const String& name = read.name.empty() ? column->column : read.name;
    return name == (drawn.name.empty() ? column->column : drawn.name);
}

Keys keysOfEach(const std::vector<Node>& nodes) {
    Keys keys;
    for (const Node& node : nodes) keys.insert(keyOf(node));
    return keys;
}

std::vector<String> keysOfOrder(const Statement& statement) {
    std::vector<String> keys;
    Keys sorted;
    for (const auto& item : statement.order) {
        const String key = keyOf(item.value);
        // What has sorted already sorts no more.
        if (sorted.insert(key).second) keys.push_back(key + (item.descending ? u'-' : u'+'));
    }
    return keys;
}

} // namespace

String keyOf(const Node& node) {
    const String kind = u"(" + number(node->node.index());
    if (const auto* x = std::get_if<sql::Compare>(&node->node)) {
        const String left = keyOf(x->left);
        const String right = keyOf(x->right);
        const bool turned = right < left;
        const auto comparison = turned ? sql::mirrored(x->comparison) : x->comparison;
        return kind + number(static_cast<std::size_t>(comparison)) +
               (turned ? right + left : left + right) + u')';
    }
    String key = kind + std::visit([](const auto& part) { return own(part); }, node->node);
    for (const Node& part : sql::partsOf(*node)) key += keyOf(part);
    return key + u')';
}

void askBefore(Statement& statement) {
    const auto isOfGroups = [&](const Node& term) { return isMadeOf(term, statement.group); };
    std::vector<Node> behind = termsOf(statement.having);
    const auto moved = std::stable_partition(behind.begin(), behind.end(), std::not_fn(isOfGroups));
    if (statement.group.empty() || moved == behind.end()) return;
    std::vector<Node> before = termsOf(statement.where);
    before.insert(before.end(), moved, behind.end());
    behind.erase(moved, behind.end());
    statement.where = sql::allOf(std::move(before));
    statement.having = sql::allOf(std::move(behind));
}

std::optional<Ways> waysOf(const std::vector<Node>& terms, std::size_t most,
                           const std::function<bool(const Node&)>& isWhole) {
    return Normal(most, isWhole).product(terms);
}

std::optional<model::Message> difference(const Statement& read, const Statement& written) {
    using model::say;
    Statement drawn = written;
    askBefore(drawn);
    const bool items = std::equal(read.items.begin(), read.items.end(), drawn.items.begin(),
                                  drawn.items.end(), sameItem);
    if (!items || read.distinct != drawn.distinct) return say<MessageCode::theColumns>();
    try {
        const Rows one = rowsOf(read);
        const Rows other = rowsOf(drawn);
        if (one.sources != other.sources) return say<MessageCode::theJoins>();
        if (!one.where || one.where != other.where) return say<MessageCode::theConditions>();
    } catch (const Incomparable&) {
        return say<MessageCode::theJoins>();
    }
    if (keysOfEach(read.group) != keysOfEach(drawn.group)) return say<MessageCode::theGroups>();
    const auto having = keysOf(termsOf(sql::simplified(read.having)));
    if (!having || having != keysOf(termsOf(sql::simplified(drawn.having))))
        return say<MessageCode::theConditions>();
    if (keysOfOrder(read) != keysOfOrder(drawn) || read.limit != drawn.limit ||
        read.offset != drawn.offset)
        return say<MessageCode::theOrder>();
    return {};
}

} // namespace zandor::sql_reader
