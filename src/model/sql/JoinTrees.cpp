#include "model/sql/JoinTrees.h"

#include "model/criteria/Literals.h"
#include "model/criteria/Parser.h"

#include <algorithm>
#include <numeric>

namespace zandor::model::sql {

namespace {

/// A join between the tables of two positions.
struct Edge {
    String key;
    std::size_t left;
    std::size_t right;
    std::int16_t type;
    Node condition;
};

constexpr std::int16_t normal = 0;
constexpr std::int16_t rightOuter = 2;
constexpr std::int16_t bothOuter = 3;

class Joiner {
public:
    Joiner(Query& query, std::vector<SourceNode> leaves, Findings& findings)
        : mFindings(findings), mLeaves(std::move(leaves)) {
        for (std::int32_t i = 1; i <= query.Tables().Count(); ++i)
            mTables.emplace_back(std::dynamic_pointer_cast<Table>(query.Tables().Item(i)));
        for (std::int32_t i = 1; i <= query.Joins().Count(); ++i)
            addEdge(*std::dynamic_pointer_cast<Join>(query.Joins().Item(i)));
    }

    JoinTrees run() {
        makeGroups();
        std::vector<bool> joined(mGroups.size(), false);
        while (const auto root = nextRoot(joined)) mResult.trees.push_back(island(*root, joined));
        if (mResult.trees.size() > 1) reportIslands();
        return std::move(mResult);
    }

private:
    void addEdge(const Join& join) {
        const auto leftTable = join.left().table().table();
        const auto rightTable = join.right().table().table();
        const auto leftColumn = join.left().column();
        const auto rightColumn = join.right().column();
        if (!leftTable || !rightTable || !leftColumn || !rightColumn) return;
        const auto position = [this](const Ref<Table>& table) {
            return static_cast<std::size_t>(std::find(mTables.begin(), mTables.end(), table) -
                                            mTables.begin());
        };
        const ColumnType leftType = leftColumn->description().type;
        const ColumnType rightType = rightColumn->description().type;
        const String leftName = leftTable->Name() + u"." + leftColumn->Name();
        const String rightName = rightTable->Name() + u"." + rightColumn->Name();
        if (!criteria::comparable(leftType, rightType))
            report(Finding::Kind::incomparableJoin, join.Key(),
                   say<MessageCode::incomparableJoin>(leftName, rightName));
        Node condition = make(Compare{static_cast<Comparison>(join.CompareOperator()),
                                      make(criteria::columnRef(*leftColumn, *leftTable)),
                                      make(criteria::columnRef(*rightColumn, *rightTable))});
        Edge edge{join.Key(), position(leftTable), position(rightTable), join.JoinType(),
                  std::move(condition)};
        if (edge.left == edge.right) {
            mOwnConditions.emplace_back(edge.left, std::move(edge.condition));
            return;
        }
        mEdges.push_back(std::move(edge));
    }

    void report(Finding::Kind kind, const String& join, Message message) {
        Finding finding{kind, std::move(message)};
        finding.join = join;
        mFindings.push_back(std::move(finding));
    }

    void makeGroups() {
        mGroupOf.resize(mTables.size());
        std::iota(mGroupOf.begin(), mGroupOf.end(), std::size_t{0});
        for (const Edge& edge : mEdges) {
            if (edge.type != normal) continue;
            const std::size_t from = std::max(mGroupOf[edge.left], mGroupOf[edge.right]);
            const std::size_t to = std::min(mGroupOf[edge.left], mGroupOf[edge.right]);
            std::replace(mGroupOf.begin(), mGroupOf.end(), from, to);
        }
        // A group's number is its first table's until here; from here on its position.
        std::vector<std::size_t> numbers = mGroupOf;
        std::sort(numbers.begin(), numbers.end());
        numbers.erase(std::unique(numbers.begin(), numbers.end()), numbers.end());
        mGroups.resize(numbers.size());
        for (std::size_t table = 0; table < mTables.size(); ++table) {
            mGroupOf[table] = static_cast<std::size_t>(
                std::find(numbers.begin(), numbers.end(), mGroupOf[table]) - numbers.begin());
            mGroups[mGroupOf[table]].push_back(table);
        }
        for (const Edge& edge : mEdges)
            if (edge.type != normal && mGroupOf[edge.left] == mGroupOf[edge.right])
                report(Finding::Kind::ambiguousOuterJoin, edge.key,
                       say<MessageCode::uselessOuterJoin>(mTables[edge.left]->Name(),
                                                          mTables[edge.right]->Name()));
    }

    /// The tables of one group under inner joins.
    SourceNode groupTree(std::size_t group) const {
        std::vector<std::size_t> waiting = mGroups[group];
        std::vector<bool> in(mTables.size(), false);
        SourceNode tree = mLeaves[waiting.front()];
        in[waiting.front()] = true;
        waiting.erase(waiting.begin());
        while (!waiting.empty()) {
            for (auto next = waiting.begin();; ++next) {
                std::vector<Node> on = conditionsTo(*next, in);
                if (on.empty()) continue;
                const bool first = waiting.size() + 1 == mGroups[group].size();
                if (first) addOwnConditions(mGroups[group].front(), on);
                addOwnConditions(*next, on);
                tree = std::make_shared<const Source>(Source{
                    JoinSource{JoinKind::inner, tree, mLeaves[*next], allOf(std::move(on)), {}}});
                in[*next] = true;
                waiting.erase(next);
                break;
            }
        }
        return tree;
    }

    /// All conditions between a table and those joined. Only an inner join lets a table in.
    std::vector<Node> conditionsTo(std::size_t table, const std::vector<bool>& in) const {
        std::vector<Node> conditions;
        bool reached = false;
        for (const Edge& edge : mEdges) {
            const bool touches =
                (edge.left == table && in[edge.right]) || (edge.right == table && in[edge.left]);
            if (!touches) continue;
            reached = reached || edge.type == normal;
            conditions.push_back(edge.condition);
        }
        if (!reached) conditions.clear();
        return conditions;
    }

    void addOwnConditions(std::size_t table, std::vector<Node>& conditions) const {
        for (const auto& [owner, condition] : mOwnConditions)
            if (owner == table) conditions.push_back(condition);
    }

    /// The side of an outer join that is filled with nulls; both outer fills either.
    std::size_t filledSide(const Edge& edge) const {
        return mGroupOf[edge.type == rightOuter ? edge.left : edge.right];
    }

    bool isFilled(std::size_t group) const {
        return std::any_of(mEdges.begin(), mEdges.end(), [&](const Edge& edge) {
            return connectsGroups(edge) && edge.type != bothOuter && filledSide(edge) == group;
        });
    }

    /// The groups that outer joins reach from one.
    std::vector<bool> reach(std::size_t group) const {
        std::vector<bool> reached(mGroups.size(), false);
        reached[group] = true;
        for (bool grown = true; grown;) {
            grown = false;
            for (const Edge& edge : mEdges) {
                const std::size_t left = mGroupOf[edge.left];
                const std::size_t right = mGroupOf[edge.right];
                if (reached[left] == reached[right]) continue;
                reached[left] = reached[right] = grown = true;
            }
        }
        return reached;
    }

    std::optional<std::size_t> nextRoot(const std::vector<bool>& joined) const {
        const auto first = std::find(joined.begin(), joined.end(), false);
        if (first == joined.end()) return {};
        const auto group = static_cast<std::size_t>(first - joined.begin());
        const std::vector<bool> island = reach(group);
        for (std::size_t other = group; other < mGroups.size(); ++other)
            if (island[other] && !isFilled(other)) return other;
        return group;
    }

    SourceNode island(std::size_t root, std::vector<bool>& joined) {
        SourceNode tree = groupTree(root);
        joined[root] = true;
        if (isSingle(root)) addOwnConditions(mGroups[root].front(), mResult.conditions);
        while (const Edge* deciding = nextEdge(joined)) {
            const std::size_t group = groupToCome(*deciding, joined);
            const JoinKind kind = kindTowards(*deciding, group);
            bool conflict = false;
            std::vector<Node> on;
            for (const Edge& edge : mEdges) {
                if (!connects(edge, group, joined)) continue;
                on.push_back(edge.condition);
                if (kindTowards(edge, group) == kind) continue;
                conflict = true;
                reportConflict(edge);
            }
            if (!conflict) reportOpenOrder(group, kind, joined);
            if (isSingle(group))
                addOwnConditions(mGroups[group].front(),
                                 kind == JoinKind::leftOuter ? on : mResult.conditions);
            tree = std::make_shared<const Source>(Source{
                JoinSource{kind, tree, groupTree(group), allOf(std::move(on)), deciding->key}});
            joined[group] = true;
        }
        return tree;
    }

    bool isSingle(std::size_t group) const { return mGroups[group].size() == 1; }

    void reportConflict(const Edge& edge) {
        report(Finding::Kind::ambiguousOuterJoin, edge.key,
               say<MessageCode::contradictingOuterJoins>(mTables[edge.left]->Name(),
                                                         mTables[edge.right]->Name()));
    }

    /// Whether other rows would come out if the joins were carried out in another order. That is so
    /// when a group that is kept, or filled and kept, meets joined ones that are kept or filled for
    /// others already.
    void reportOpenOrder(std::size_t group, JoinKind kind, const std::vector<bool>& joined) {
        const auto count = std::count(joined.begin(), joined.end(), true);
        if (kind == JoinKind::leftOuter || count < 2) return;
        const Edge* meeting = nullptr;
        bool several = false;
        for (const Edge& edge : mEdges) {
            if (!connects(edge, group, joined)) continue;
            several = several || (meeting && otherSide(*meeting, group) != otherSide(edge, group));
            meeting = &edge;
        }
        const std::size_t met = otherSide(*meeting, group);
        if (kind == JoinKind::fullOuter && !several && !isFilledWithin(met, joined)) return;
        report(Finding::Kind::ambiguousOuterJoin, meeting->key,
               say<MessageCode::openOuterJoins>(mTables[mGroups[met].front()]->Name()));
    }

    /// Whether one of the joined groups fills another.
    bool isFilledWithin(std::size_t group, const std::vector<bool>& joined) const {
        return std::any_of(mEdges.begin(), mEdges.end(), [&](const Edge& edge) {
            return connectsGroups(edge) && edge.type != bothOuter && filledSide(edge) == group &&
                   joined[otherSide(edge, group)];
        });
    }

    bool connectsGroups(const Edge& edge) const {
        return edge.type != normal && mGroupOf[edge.left] != mGroupOf[edge.right];
    }

    /// Whether an edge connects a group with one of those joined.
    bool connects(const Edge& edge, std::size_t group, const std::vector<bool>& joined) const {
        const std::size_t left = mGroupOf[edge.left];
        const std::size_t right = mGroupOf[edge.right];
        return left != right &&
               ((left == group && joined[right]) || (right == group && joined[left]));
    }

    std::size_t otherSide(const Edge& edge, std::size_t group) const {
        return mGroupOf[mGroupOf[edge.left] == group ? edge.right : edge.left];
    }

    std::size_t groupToCome(const Edge& edge, const std::vector<bool>& joined) const {
        return mGroupOf[joined[mGroupOf[edge.left]] ? edge.right : edge.left];
    }

    /// How an edge joins one of its groups to the other.
    JoinKind kindTowards(const Edge& edge, std::size_t group) const {
        if (edge.type == bothOuter) return JoinKind::fullOuter;
        return filledSide(edge) == group ? JoinKind::leftOuter : JoinKind::rightOuter;
    }

    /// The edge that decides which group comes next, and how; nothing when all are joined.
    const Edge* nextEdge(const std::vector<bool>& joined) const {
        const Edge* best = nullptr;
        int bestRank = 0;
        std::vector<bool> seen(mGroups.size(), false);
        for (const Edge& edge : mEdges) {
            if (joined[mGroupOf[edge.left]] == joined[mGroupOf[edge.right]]) continue;
            const std::size_t group = groupToCome(edge, joined);
            if (seen[group]) continue;
            seen[group] = true;
            const int rank =
                rankOf(kindTowards(edge, group)) + (awaitsSource(group, joined) ? 10 : 0);
            if (best && rank >= bestRank) continue;
            best = &edge;
            bestRank = rank;
        }
        return best;
    }

    static int rankOf(JoinKind kind) {
        return kind == JoinKind::leftOuter ? 0 : kind == JoinKind::fullOuter ? 1 : 2;
    }

    /// Whether a group whose rows another one is kept for would come before that one.
    bool awaitsSource(std::size_t group, const std::vector<bool>& joined) const {
        return std::any_of(mEdges.begin(), mEdges.end(), [&](const Edge& edge) {
            return connectsGroups(edge) && edge.type != bothOuter && filledSide(edge) == group &&
                   !joined[otherSide(edge, group)];
        });
    }

    void reportIslands() {
        const String first = aliasOf(*mResult.trees.front());
        for (std::size_t i = 1; i < mResult.trees.size(); ++i) {
            const String other = aliasOf(*mResult.trees[i]);
            Finding finding{Finding::Kind::cartesianProduct,
                            say<MessageCode::cartesianProduct>(other, first)};
            for (const auto& table : mTables)
                if (table->Name() == other) finding.table = table->Key();
            mFindings.push_back(std::move(finding));
        }
    }

    Findings& mFindings;
    const std::vector<SourceNode> mLeaves; ///< by table
    std::vector<Ref<Table>> mTables;
    std::vector<Edge> mEdges;
    std::vector<std::pair<std::size_t, Node>> mOwnConditions; ///< of joins within one table
    std::vector<std::size_t> mGroupOf;                        ///< by table
    std::vector<std::vector<std::size_t>> mGroups;            ///< their tables
    JoinTrees mResult;
};

} // namespace

const String& aliasOf(const Source& source) {
    if (const auto* join = std::get_if<JoinSource>(&source.node)) return aliasOf(*join->left);
    if (const auto* query = std::get_if<SubSelect>(&source.node)) return query->alias;
    return std::get<TableRef>(source.node).alias;
}

JoinTrees joinTrees(Query& query, std::vector<SourceNode> leaves, Findings& findings) {
    return Joiner(query, std::move(leaves), findings).run();
}

} // namespace zandor::model::sql
