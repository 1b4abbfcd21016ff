#include "model/sql_reader/Drawing.h"

#include "model/criteria/QueryColumns.h"
#include "model/criteria/Writer.h"
#include "model/sql/NodeSet.h"
#include "model/sql/Simplify.h"
#include "model/sql_reader/Columns.h"
#include "model/sql_reader/Refused.h"
#include "model/sql_reader/Sameness.h"
#include "model/sql_reader/Terms.h"

#include <Zandor/sql/Builder.h>

#include <algorithm>
#include <array>

namespace zandor::sql_reader {

namespace sql = model::sql;

namespace {

/// How conditions stand in the grid: each in one cell where they speak of one column alone; a row
/// for each way in which they hold, maybe beside joins of tables with themselves, or in hidden
/// columns where nothing else keeps their order; the first of such rows twice, so that what rows
/// are put together by is asked behind that; all in the first row, in cells that name other columns
/// too, or so in hidden columns.
enum class Layout { cells, rows, loops, ordered, doubled, mixed, orderedMixed };

bool keepsOrder(Layout layout) {
    return layout == Layout::ordered || layout == Layout::doubled || layout == Layout::orderedMixed;
}

bool isInOneRow(Layout layout) {
    return layout == Layout::cells || layout == Layout::mixed || layout == Layout::orderedMixed;
}

/// What a condition speaks about: the first value in it that is no constant.
Node subjectOf(const Node& condition) {
    const auto parts = sql::partsOf(*condition);
    if (std::holds_alternative<sql::Compare>(condition->node)) {
        const bool constant = std::holds_alternative<sql::Value>(parts[0]->node) ||
                              std::holds_alternative<sql::Parameter>(parts[0]->node);
        return constant ? parts[1] : parts[0];
    }
    if (sql::isCondition(*condition) && !std::holds_alternative<sql::And>(condition->node) &&
        !std::holds_alternative<sql::Or>(condition->node) &&
        !std::holds_alternative<sql::Not>(condition->node))
        return parts[0];
    return parts.empty() ? condition : subjectOf(parts[0]);
}

/// Whether all of a condition speaks about one value.
bool isAbout(const Node& condition, const Node& subject) {
    const bool joint = std::holds_alternative<sql::And>(condition->node) ||
                       std::holds_alternative<sql::Or>(condition->node) ||
                       std::holds_alternative<sql::Not>(condition->node);
    if (!joint) return sql::same(subjectOf(condition), subject);
    const auto parts = sql::partsOf(*condition);
    return std::all_of(parts.begin(), parts.end(),
                       [&](const Node& part) { return isAbout(part, subject); });
}

/// Conditions of a row by what they speak about.
using Cells = std::vector<std::pair<Node, std::vector<Node>>>;

/// Conditions on one value that follow each other share a cell.
Cells runsOf(const std::vector<Node>& terms) {
    Cells cells;
    for (const Node& term : terms) {
        const Node subject = subjectOf(term);
        if (cells.empty() || !sql::same(cells.back().first, subject))
            cells.push_back({subject, {}});
        cells.back().second.push_back(term);
    }
    return cells;
}

/// All conditions on one value share a cell.
Cells cellsOf(const std::vector<Node>& terms) {
    Cells cells;
    sql::NodeMap<std::size_t> known;
    for (const Node& term : terms) {
        const Node subject = subjectOf(term);
        const auto [at, added] = known.emplace(subject, cells.size());
        if (added) cells.push_back({subject, {}});
        cells[at->second].second.push_back(term);
    }
    return cells;
}

class Drawing {
public:
    Drawing(const Selected& selected, Layout layout) : mSelected(selected), mLayout(layout) {}

    Ref<Query> draw() {
        const auto joins = keepsOrder(mLayout)        ? JoinsOfRows::loops
                           : mLayout == Layout::loops ? JoinsOfRows::loopsToo
                                                      : JoinsOfRows::islands;
        const std::vector<Node> rest = drawSources(*mQuery, mSelected, joins);
        Columns columns(*mQuery, mSelected, keepsOrder(mLayout));
        columns.addItems();
        columns.sort();
        addCriteria(columns, groupsFirst(simplifiedTerms(rest)),
                    termsOf(sql::simplified(mSelected.statement.having)));
        model::QueryOptions options;
        options.distinct = mSelected.statement.distinct;
        options.first = static_cast<std::int32_t>(mSelected.statement.limit.value_or(0));
        for (const sql::Remark& remark : mSelected.statement.remarks)
            options.comments.push_back(commentOf(remark, columns));
        mQuery->options(std::move(options));
        columns.dropOwnNames();
        return mQuery;
    }

private:
    /// Nothing twice.
    static std::vector<Node> simplifiedTerms(const std::vector<Node>& terms) {
        std::vector<Node> all;
        sql::NodeSet known;
        for (const Node& term : terms)
            for (const Node& each : termsOf(sql::simplified(term)))
                if (known.insert(each).second) all.push_back(each);
        return all;
    }

    /// A drawing asks for what rows are put together by before all that only chooses rows.
    std::vector<Node> groupsFirst(std::vector<Node> terms) const {
        const auto& all = mSelected.statement.group;
        const sql::NodeSet groups(all.begin(), all.end());
        std::stable_partition(terms.begin(), terms.end(),
                              [&](const Node& term) { return groups.contains(subjectOf(term)); });
        return terms;
    }

    /// The place of a condition, also of one that was made of it.
    [[noreturn]] void refuseCondition() const {
        const Node& where = mSelected.statement.where;
        const auto terms = termsOf(where ? where : mSelected.statement.having);
        refuse<MessageCode::criterionNotDrawn>(terms.empty() ? mSelected.place
                                                             : mSelected.placeOf(terms.front()));
    }

    void addCriteria(Columns& columns, const std::vector<Node>& before,
                     const std::vector<Node>& behind) {
        const std::vector<Node>& ways = behind.empty() ? before : behind;
        constexpr std::size_t mostRows = 12; // of the grid
        std::vector<std::vector<Node>> rows{ways};
        if (!isInOneRow(mLayout)) {
            auto all = waysOf(ways, mostRows, [](const Node& condition) {
                return isAbout(condition, subjectOf(condition));
            });
            if (!all || all->size() > mostRows) refuseCondition();
            rows = std::move(*all);
            if (mLayout == Layout::doubled) rows.push_back(rows.front());
        }
        if (mLayout == Layout::cells)
            for (const Node& term : ways)
                if (!isAbout(term, subjectOf(term))) refuseCondition();
        std::int16_t row = model::Criteria::firstRow;
        for (const auto& way : rows) {
            addRow(columns, way, row, false);
            if (!behind.empty()) addRow(columns, before, row, rows.size() > 1);
            ++row;
        }
    }

    void addRow(Columns& columns, const std::vector<Node>& terms, std::int16_t row, bool apart) {
        Cells cells = runsOf(terms);
        auto places = placesInOrder(columns, cells, apart);
        if (places.empty()) {
            cells = cellsOf(terms);
            std::vector<Node> subjects;
            for (const auto& cell : cells) subjects.push_back(cell.first);
            places = columns.forConditions(subjects, apart);
        }
        const model::criteria::QueryColumns names(mQuery->Tables());
        const String key = platform::decimal(row);
        for (std::size_t n = 0; n < cells.size(); ++n) {
            const Columns::Column& column = *places[n];
            const auto text =
                model::criteria::written(sql::allOf(cells[n].second), column.subject, names);
            if (!text || column.definition->HasCriterium(key)) refuseCondition();
            column.definition->AddCriterium(*text, key);
            for (const Node& term : cells[n].second)
                mCells.push_back({term, column.definition->Key(), row});
        }
    }

    model::Comment commentOf(const sql::Remark& remark, const Columns& columns) const {
        model::Comment comment{.beside = remark.beside, .text = remark.text};
        if (const auto* place = std::get_if<model::CommentPlace>(&remark.by)) {
            comment.place = *place;
        } else if (const auto* item = std::get_if<std::size_t>(&remark.by)) {
            comment.place = model::CommentPlace::column;
            comment.key = columns.definitionOf(*item)->Key();
        } else if (const auto* alias = std::get_if<String>(&remark.by)) {
            comment.place = model::CommentPlace::table;
            comment.key = mQuery->tableNamed(*alias)->Key();
        } else {
            standBy(std::get<Node>(remark.by), comment);
        }
        return comment;
    }

    /// A condition stands in a cell, maybe with others, or has become a join.
    void standBy(const Node& condition, model::Comment& comment) const {
        const auto cell = [&](const auto& isMeant) {
            const auto found = std::find_if(mCells.begin(), mCells.end(), isMeant);
            if (found == mCells.end()) return false;
            comment.place = model::CommentPlace::criterion;
            comment.key = found->definition;
            comment.row = found->row;
            return true;
        };
        const Node subject = subjectOf(condition);
        if (cell([&](const Cell& each) { return sql::same(each.term, condition); }) ||
            cell([&](const Cell& each) { return sql::same(subjectOf(each.term), subject); }))
            return;
        comment.place = model::CommentPlace::end;
        const auto parts = sql::partsOf(*condition);
        const auto* column = parts.empty() ? nullptr : std::get_if<ColumnRef>(&parts.back()->node);
        if (!column) return;
        comment.place = model::CommentPlace::table;
        comment.key = mQuery->tableNamed(column->table)->Key();
    }

    /// Columns for the cells from left to right, as a value that comes out twice allows it; none
    /// where there are none.
    std::vector<Columns::Column*> placesInOrder(Columns& columns, const Cells& cells,
                                                bool apart) const {
        std::vector<Columns::Column*> places;
        for (const auto& cell : cells) {
            const auto known = columns.knownFor(cell.first, apart);
            const auto next = std::find_if(known.begin(), known.end(), [&](const auto* column) {
                return places.empty() || columns.placeOf(*places.back()) < columns.placeOf(*column);
            });
            if (next != known.end()) {
                places.push_back(*next);
                continue;
            }
            if (!keepsOrder(mLayout)) return {};
            const auto* behind = places.empty() ? nullptr : places.back();
            places.push_back(&columns.ownForCondition(cell.first, behind));
        }
        return places;
    }

    /// Where a condition stands.
    struct Cell {
        Node term;
        String definition; ///< key
        std::int16_t row;
    };

    const Selected& mSelected;
    const Layout mLayout;
    std::vector<Cell> mCells;
    const Ref<Query> mQuery = platform::makeRef<Query>();
};

/// The statement that a query says. Throws Refused where it is another than the one that was read.
sql::Statement saidBy(Query& query, const Selected& selected) {
    sql::Built built = sql::build(query);
    for (const model::Finding& finding : built.findings)
        if (finding.isError()) refuse<MessageCode::notUnderstood>(selected.place, finding.message);
    if (const auto other = difference(selected.statement, *built.statement))
        refuse<MessageCode::otherMeaning>(selected.place, *other);
    return std::move(*built.statement);
}

/// Whether conditions stand in the same words and order, as a statement's writer leaves them, and
/// all has the names and sorts that were given.
bool hasSameWords(const sql::Statement& one, const sql::Statement& other) {
    const auto same = [](const Node& left, const Node& right) {
        const Node first = sql::simplified(left);
        const Node second = sql::simplified(right);
        return first && second ? sql::same(first, second) : !first && !second;
    };
    const bool names =
        std::equal(one.items.begin(), one.items.end(), other.items.begin(), other.items.end(),
                   [](const auto& item, const auto& its) { return item.name == its.name; });
    return names && one.order.size() == other.order.size() && same(one.where, other.where) &&
           same(one.having, other.having);
}

/// With the conditions behind GROUP BY left there; nothing where that cannot be drawn.
Ref<Query> doubled(const Selected& selected) {
    Selected asked = selected;
    asked.statement.where = selected.asked.where;
    asked.statement.having = selected.asked.having;
    try {
        const auto query = Drawing(asked, Layout::doubled).draw();
        saidBy(*query, selected);
        return query;
    } catch (const Refused&) {
        return {};
    }
}

} // namespace

Ref<Query> drawn(const Selected& selected, const std::function<bool(Query&)>& isWhole) {
    std::optional<Refused> first;
    Ref<Query> sound;
    const auto isDone = [&](Layout layout) {
        Ref<Query> query;
        try {
            query = Drawing(selected, layout).draw();
            const bool exact = hasSameWords(saidBy(*query, selected), selected.statement);
            if (!sound || (exact && (!keepsOrder(layout) || isWhole(*query)))) sound = query;
            return exact;
        } catch (const Refused& refused) {
            // What was drawn and says something else tells more than what was not.
            if (!first || query) first = refused;
            return false;
        }
    };
    const bool movesConditions = selected.asked.having != selected.statement.having;
    if (isWhole && movesConditions)
        if (const auto query = doubled(selected); query && isWhole(*query)) return query;
    for (const Layout layout : {Layout::cells, Layout::rows, Layout::loops})
        if (isDone(layout)) return sound;
    if (!sound) isDone(Layout::mixed);
    if (!sound) throw Refused(*first);
    if (isWhole && !isDone(Layout::ordered)) isDone(Layout::orderedMixed);
    return sound;
}

} // namespace zandor::sql_reader
