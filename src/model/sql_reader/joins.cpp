#include "model/sql_reader/Drawing.h"

#include "model/sql_reader/Refused.h"
#include "model/sql_reader/Terms.h"

#include <Zandor/model/Names.h>

#include <algorithm>
#include <set>

namespace zandor::sql_reader {

namespace sql = model::sql;

namespace {

using Aliases = std::set<String>;

/// Constants of JoinType.
constexpr std::int16_t keepsLeft = 1;
constexpr std::int16_t keepsRight = 2;
constexpr std::int16_t keepsBoth = 3;

class Sources {
public:
    Sources(Query& query, const Selected& selected, JoinsOfRows joins)
        : mQuery(query), mSelected(selected), mJoins(joins) {}

    std::vector<Node> draw() {
        for (const auto& source : mSelected.statement.from) addTables(*source);
        for (const auto& source : mSelected.statement.from) addJoins(*source, true);
        for (const Node& term : termsOf(mSelected.statement.where))
            if (!joinsIslands(term) && !joinsItself(term)) mRest.push_back(term);
        return std::move(mRest);
    }

private:
    void addTables(const sql::Source& source) {
        if (const auto* join = std::get_if<sql::JoinSource>(&source.node)) {
            addTables(*join->left);
            addTables(*join->right);
            return;
        }
        const String& alias = sql::aliasOf(source);
        const auto table = mSelected.tables.find(alias);
        const auto added = table != mSelected.tables.end()
                               ? mQuery.addTable(table->second)
                               : mQuery.addQuery(alias, mSelected.queries.find(alias)->second);
        if (added->Name() != alias) mQuery.renameTable(added, alias);
        mIslands[alias] = alias;
        mPlaces.emplace(alias, mPlaces.size());
    }

    /// Whether a source's rows are all there, whatever it is joined with.
    Aliases addJoins(const sql::Source& source, bool whole) {
        const auto* join = std::get_if<sql::JoinSource>(&source.node);
        if (!join) {
            if (whole) mWhole.insert(sql::aliasOf(source));
            return {sql::aliasOf(source)};
        }
        const bool inner = join->kind == sql::JoinKind::inner;
        const Aliases left =
            addJoins(*join->left, whole && (inner || join->kind == sql::JoinKind::leftOuter));
        const Aliases right =
            addJoins(*join->right, whole && (inner || join->kind == sql::JoinKind::rightOuter));
        const auto terms = termsOf(join->on);
        if (terms.empty() && !inner)
            refuse<MessageCode::outerCondition>(mSelected.placeOf(join->on));
        for (const Node& term : terms) {
            if (drawJoin(term, join->kind, left, right)) continue;
            if (!inner || !whole) refuse<MessageCode::outerCondition>(mSelected.placeOf(term));
            mRest.push_back(term);
        }
        Aliases both = left;
        both.insert(right.begin(), right.end());
        return both;
    }

    /// The two columns that a term compares; nothing for any other term.
    static std::optional<std::pair<ColumnRef, ColumnRef>> columnsOf(const Node& term) {
        const auto* compare = std::get_if<sql::Compare>(&term->node);
        if (!compare) return {};
        const auto* left = std::get_if<ColumnRef>(&compare->left->node);
        const auto* right = std::get_if<ColumnRef>(&compare->right->node);
        if (!left || !right) return {};
        return std::pair(*left, *right);
    }

    bool drawJoin(const Node& term, sql::JoinKind kind, const Aliases& left, const Aliases& right) {
        const auto columns = columnsOf(term);
        if (!columns) return false;
        const auto& [one, other] = *columns;
        const bool along = left.contains(one.table) && right.contains(other.table);
        const bool against = right.contains(one.table) && left.contains(other.table);
        std::int16_t type = 0;
        switch (kind) {
        case sql::JoinKind::inner: break;
        case sql::JoinKind::leftOuter: type = along ? keepsLeft : keepsRight; break;
        case sql::JoinKind::rightOuter: type = along ? keepsRight : keepsLeft; break;
        case sql::JoinKind::fullOuter: type = keepsBoth; break;
        }
        // What stands about one table chooses among its rows before they are added.
        const bool chooses = one.table == other.table &&
                             ((kind == sql::JoinKind::leftOuter && right.contains(one.table)) ||
                              (kind == sql::JoinKind::rightOuter && left.contains(one.table)));
        if (chooses) type = 0;
        if (type != 0 && !along && !against) return false;
        add(one, other, type, std::get<sql::Compare>(term->node).comparison);
        return true;
    }

    void add(const ColumnRef& left, const ColumnRef& right, std::int16_t type,
             sql::Comparison comparison) {
        const auto join = platform::makeRef<model::Join>();
        join->LeftColumn(columnOf(left));
        join->RightColumn(columnOf(right));
        join->JoinType(type);
        join->CompareOperator(static_cast<std::int16_t>(comparison));
        mQuery.AddJoin(join);
        mIslands[islandOf(left.table)] = islandOf(right.table);
    }

    Ref<model::Column> columnOf(const ColumnRef& column) const {
        return mQuery.tableNamed(column.table)->columnNamed(column.column);
    }

    String islandOf(String alias) const {
        while (mIslands.at(alias) != alias) alias = mIslands.at(alias);
        return alias;
    }

    /// Whether a condition on rows joins tables that nothing has joined before it; it is drawn
    /// then.
    bool joinsIslands(const Node& term) {
        const auto columns = columnsOf(term);
        if (mJoins == JoinsOfRows::loops) return false;
        if (!columns || std::get<sql::Compare>(term->node).comparison != sql::Comparison::equal)
            return false;
        const auto& [left, right] = *columns;
        const auto pair = std::minmax(left.table, right.table);
        const bool drawn = mPairs.contains({pair.first, pair.second});
        if (!mWhole.contains(left.table) || !mWhole.contains(right.table)) return false;
        if (!drawn && islandOf(left.table) == islandOf(right.table)) return false;
        mPairs.insert({pair.first, pair.second});
        add(left, right, 0, sql::Comparison::equal);
        return true;
    }

    /// Joins stand before all that is asked in cells, so that only what begins the conditions can
    /// come back as one; and in the order of their tables, which counts where they alone are drawn.
    bool joinsItself(const Node& term) {
        const auto columns = columnsOf(term);
        if (mJoins == JoinsOfRows::islands || !mRest.empty() || !columns ||
            columns->first.table != columns->second.table || !mWhole.contains(columns->first.table))
            return false;
        const std::size_t place = mPlaces.at(columns->first.table);
        if (mJoins == JoinsOfRows::loops && place < mLastLoop) return false;
        mLastLoop = place;
        add(columns->first, columns->second, 0, std::get<sql::Compare>(term->node).comparison);
        return true;
    }

    Query& mQuery;
    const Selected& mSelected;
    const JoinsOfRows mJoins;
    std::map<String, std::size_t> mPlaces;      ///< of the tables, in their order
    std::size_t mLastLoop = 0;                  ///< of the table that was last joined with itself
    std::map<String, String> mIslands;          ///< tables that are joined lead to one of them
    std::set<std::pair<String, String>> mPairs; ///< of tables that conditions on rows join
    Aliases mWhole;                             ///< of which no row is filled with nothing
    std::vector<Node> mRest;
};

} // namespace

std::vector<Node> drawSources(Query& query, const Selected& selected, JoinsOfRows joins) {
    return Sources(query, selected, joins).draw();
}

} // namespace zandor::sql_reader
