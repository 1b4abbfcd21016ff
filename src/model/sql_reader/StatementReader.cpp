#include "model/sql_reader/StatementReader.h"

#include "model/sql_reader/Refused.h"
#include "model/sql_reader/Sameness.h"
#include "model/sql_reader/Terms.h"
#include "model/sql_reader/TreeChecks.h"

#include <Zandor/model/Names.h>
#include <Zandor/model/QueryOptions.h>

#include <algorithm>
#include <functional>

namespace zandor::sql_reader {

namespace sql = model::sql;

namespace {

/// Whether all columns are meant: "*" or "table.*".
bool isStar(const Tree& tree) {
    return tree.is("ColumnRef") && tree.list("fields").back().is("A_Star");
}

/// A name without a table before it; empty for all else.
String bareName(const Tree& tree) {
    if (!tree.is("ColumnRef")) return {};
    const auto fields = tree.list("fields");
    return fields.size() == 1 && fields.front().is("String") ? fields.front().text("sval")
                                                             : String();
}

/// What the printer groups by where that is a constant, which engines take for a place.
std::optional<Tree> constantGroup(const Tree& group) {
    if (!group.is("CoalesceExpr")) return {};
    const auto arguments = group.list("args");
    if (arguments.size() != 2 || !isConstant(arguments[1], "isnull")) return {};
    return arguments[0];
}

bool isGrouped(const Node& node, const std::vector<Node>& groups) {
    return std::holds_alternative<sql::Aggregate>(node->node) ||
           std::any_of(groups.begin(), groups.end(),
                       [&](const Node& each) { return sql::same(each, node); });
}

} // namespace

Selected StatementReader::select(const Tree& tree) {
    if (!tree.is("SelectStmt")) refuse<MessageCode::selectOnly>(tree.place());
    if (tree.word("op") != "SETOP_NONE") refusePart<MessageCode::aSetOperation>(tree.place());
    if (tree.has("lockingClause")) refusePart<MessageCode::aLock>(tree.place());
    if (tree.has("windowClause")) refusePart<MessageCode::aWindow>(tree.place());
    tree.only({"distinctClause", "targetList", "fromClause", "whereClause", "groupClause",
               "havingClause", "sortClause", "limitOffset", "limitCount", "limitOption",
               "withClause", "op"});
    const std::size_t known = mNamed.size();
    if (tree.has("withClause")) with(tree.part("withClause"));
    Selected selected = selectNamed(tree);
    mNamed.erase(mNamed.begin() + static_cast<std::ptrdiff_t>(known), mNamed.end());
    return selected;
}

/// Where WITH has given its names.
Selected StatementReader::selectNamed(const Tree& tree) {
    if (const auto inner = differsAround(tree)) {
        Selected selected = select(*inner);
        selected.statement.distinct = true;
        order(tree, ValueReader(selected.scope, mText, mDialect, selected.places), selected);
        limits(tree, selected);
        takeComments(tree, selected);
        return selected;
    }

    Selected selected;
    selected.scope = Scope(mDialect);
    selected.place = tree.place();
    if (!tree.has("fromClause")) refusePart<MessageCode::noTable>(tree.place());
    from(tree, selected);

    ValueReader values(selected.scope, mText, mDialect, selected.places);
    items(tree, values, selected);
    for (const Tree& target : tree.list("targetList"))
        if (target.has("name")) values.add(target.text("name"), target.node("val"));
    if (tree.has("whereClause"))
        selected.statement.where =
            sql::allOf(ValueReader(selected.scope, mText, mDialect, selected.places)
                           .conditions(tree.node("whereClause")));
    for (const Tree& each : tree.list("groupClause")) {
        if (each.is("GroupingSet")) refusePart<MessageCode::groupingSets>(each.place());
        const auto constant = constantGroup(each);
        selected.statement.group.push_back(constant ? values.value(*constant)
                                                    : byNameOrPlace(each, values, selected, false));
        selected.commented.emplace(each.place(), model::CommentPlace::groups);
    }
    if (tree.has("havingClause"))
        selected.statement.having =
            behindGroups(values.conditions(tree.node("havingClause")), selected.statement);
    selected.asked = {selected.statement.where, selected.statement.having};
    askBefore(selected.statement);
    order(tree, values, selected);
    limits(tree, selected);
    checkGroups(selected);
    noteConditions(selected.statement.where, selected);
    noteConditions(selected.statement.having, selected);
    takeComments(tree, selected);
    return selected;
}

void StatementReader::takeComments(const Tree& tree, Selected& into) const {
    const std::size_t first = tree.list("targetList").front().place();
    for (auto& remark : commentsAround(first, mText, into.commented))
        into.statement.remarks.push_back(std::move(remark));
}

/// Conditions have comments each for itself, however they are put together.
void StatementReader::noteConditions(const Node& condition, Selected& in) {
    if (!condition) return;
    const bool joint = std::holds_alternative<sql::And>(condition->node) ||
                       std::holds_alternative<sql::Or>(condition->node);
    if (joint) {
        for (const Node& part : sql::partsOf(*condition)) noteConditions(part, in);
    } else if (const auto begin = in.firstPlaceOf(condition)) {
        in.commented.emplace(*begin, condition);
    }
}

/// MySQL knows no expression again behind GROUP BY, so that the printer asks for the smallest of
/// what is the same in a whole group. Where that comes out, it is meant.
Node StatementReader::behindGroups(std::vector<Node> terms, const sql::Statement& statement) const {
    const auto comesOut = [&](const Node& total) {
        return std::any_of(statement.items.begin(), statement.items.end(), [&](const auto& item) {
            const auto* value = std::get_if<Node>(&item.what);
            return value && sql::same(*value, total);
        });
    };
    const std::function<Node(const Node&)> plain = [&](const Node& node) {
        const auto* total = std::get_if<sql::Aggregate>(&node->node);
        if (total && total->total == model::Total::Smallest &&
            isGrouped(total->operand, statement.group) && !comesOut(node))
            return total->operand;
        auto parts = sql::partsOf(*node);
        if (parts.empty()) return node;
        for (Node& part : parts) part = plain(part);
        return sql::withParts(*node, std::move(parts));
    };
    if (mDialect == Dialect::MySQL)
        for (Node& term : terms) term = plain(term);
    return sql::allOf(std::move(terms));
}

/// The select within another that does nothing but leave equal rows out, as the printer has it for
/// totals in MySQL.
std::optional<Tree> StatementReader::differsAround(const Tree& tree) const {
    if (mDialect != Dialect::MySQL || !tree.has("distinctClause")) return {};
    for (const char* part : {"whereClause", "groupClause", "havingClause"})
        if (tree.has(part)) return {};
    const auto from = tree.list("fromClause");
    const auto targets = tree.list("targetList");
    if (from.size() != 1 || targets.size() != 1 || !from.front().is("RangeSubselect")) return {};
    if (!isStar(targets.front().node("val"))) return {};
    const bool named = from.front().has("alias") && from.front().part("alias").has("colnames");
    if (named || from.front().has("lateral")) return {};
    const Tree inner = from.front().node("subquery");
    for (const char* part : {"distinctClause", "sortClause", "limitCount", "limitOffset"})
        if (inner.has(part)) return {};
    return inner;
}

void StatementReader::with(const Tree& tree) {
    if (tree.flag("recursive")) refusePart<MessageCode::recursiveWith>(tree.place());
    for (const Tree& each : tree.list("ctes")) {
        if (each.has("aliascolnames")) refusePart<MessageCode::namedColumns>(each.place());
        each.only({"ctename", "ctequery", "ctematerialized"});
        mNamed.push_back(named(each.node("ctequery"), each.text("ctename")));
    }
}

void StatementReader::items(const Tree& tree, const ValueReader& values, Selected& into) {
    if (tree.has("distinctClause")) {
        for (const Tree& each : tree.list("distinctClause"))
            if (!each.kind().empty()) refusePart<MessageCode::distinctOn>(each.place());
        into.statement.distinct = true;
    }
    if (!tree.has("targetList")) refusePart<MessageCode::noColumns>(tree.place());
    for (const Tree& target : tree.list("targetList")) item(target, values, into);
}

/// SQLite takes the word for the column wherever else it stands; a nameless one comes out under its
/// own word.
void StatementReader::checkTruthAsName(const Tree& target) const {
    const bool nameless = !target.has("name") && isConstant(target.node("val"), "boolval");
    if (mDialect != Dialect::SQLite || mText.truths <= (nameless && mDepth == 0 ? 1 : 0)) return;
    const bool truth =
        target.node("val").has("boolval") && target.node("val").part("boolval").flag("boolval");
    const String name =
        nameless ? (truth ? u"true" : u"false") : model::foldedName(target.text("name"));
    if (name == u"true" || name == u"false")
        refuse<MessageCode::noPlaceFor>(target.place(),
                                        model::say<MessageCode::thisPart>(u"AS " + name));
}

void StatementReader::item(const Tree& target, const ValueReader& values, Selected& into) {
    target.only({"name", "val"});
    const Tree value = target.node("val");
    auto& items = into.statement.items;
    into.commented.emplace(target.place(), items.size());
    checkTruthAsName(target);
    if (value.is("FuncCall") && value.names("funcname").back() == topFunction) {
        limit(value.list("args").front(), into);
        return;
    }
    if (!isStar(value)) {
        items.push_back({values.value(value), target.text("name")});
        return;
    }
    const auto fields = value.list("fields");
    if (fields.size() > 1) {
        std::vector<String> names;
        for (const Tree& field : fields)
            if (field.is("String")) names.push_back(field.text("sval"));
        items.push_back({sql::AllColumns{into.scope.source(names, value.place()).alias}, {}});
    } else if (const auto all = into.scope.everything()) {
        for (const ColumnRef& column : *all) items.push_back({sql::make(column), {}});
    } else {
        for (const ScopedTable& table : into.scope.tables())
            items.push_back({sql::AllColumns{table.alias}, {}});
    }
}

void StatementReader::limits(const Tree& tree, Selected& into) {
    if (tree.word("limitOption") == "LIMIT_OPTION_WITH_TIES")
        refusePart<MessageCode::ties>(tree.node("limitCount").place());
    if (tree.has("limitOffset")) {
        const Tree offset = tree.node("limitOffset");
        const bool none =
            offset.is("A_Const") && offset.has("ival") && offset.part("ival").number("ival") == 0;
        if (!none) refusePart<MessageCode::anOffset>(offset.place());
    }
    if (!tree.has("limitCount")) return;
    limit(tree.node("limitCount"), into);
    into.commented.emplace(tree.node("limitCount").place(), model::CommentPlace::end);
}

void StatementReader::limit(const Tree& count, Selected& into) const {
    const bool constant = count.is("A_Const");
    if (constant && count.has("isnull")) return;
    const bool whole = constant && count.has("ival");
    const std::int64_t rows = whole ? count.part("ival").number("ival") : 0;
    // SQLite takes a negative one for none.
    if (whole && rows < 0 && mDialect == Dialect::SQLite) return;
    constexpr std::int32_t most = model::QueryOptions::greatestFirst;
    if (rows < 1 || rows > most)
        refuse<MessageCode::noPlaceFor>(count.place(), model::say<MessageCode::aLimit>(most));
    into.statement.limit = rows;
}

/// What GROUP BY and ORDER BY have: the number or the name of what comes out, or a value.
Node StatementReader::byNameOrPlace(const Tree& tree, const ValueReader& values, const Selected& in,
                                    bool outputFirst) const {
    const auto& items = in.statement.items;
    if (tree.is("A_Const") && tree.has("ival")) {
        const std::int64_t place = tree.part("ival").number("ival");
        const auto beyond = static_cast<std::int64_t>(items.size()) + 1;
        if (place < 1 || place >= beyond) refuse<MessageCode::noSuchPosition>(tree.place(), place);
        const bool counts =
            std::none_of(items.begin(), items.begin() + place, [](const auto& item) {
                return std::holds_alternative<sql::AllColumns>(item.what);
            });
        if (!counts) refuse<MessageCode::noSuchPosition>(tree.place(), place);
        return std::get<Node>(items[static_cast<std::size_t>(place - 1)].what);
    }
    const String name = bareName(tree);
    if (name.empty() || (!outputFirst && in.scope.find(name, tree.place())))
        return values.value(tree);
    const Node* found = nullptr;
    for (const auto& item : items) {
        const auto* value = std::get_if<Node>(&item.what);
        if (!value || !model::sameName(item.name, name)) continue;
        if (found && !sql::same(*found, *value))
            refuse<MessageCode::sameOutput>(tree.place(), name);
        found = value;
    }
    return found ? *found : values.value(tree);
}

void StatementReader::order(const Tree& tree, const ValueReader& values, Selected& into) const {
    for (const Tree& each : tree.list("sortClause")) {
        const Tree node = each.node("node");
        // SQL Server asks for an order where rows are counted, whatever it is.
        if (mDialect == Dialect::SqlServer && node.is("SubLink")) continue;
        if (each.word("sortby_nulls") != "SORTBY_NULLS_DEFAULT")
            refusePart<MessageCode::nullsPlaced>(each.place());
        each.only({"node", "sortby_dir", "sortby_nulls"});
        into.statement.order.push_back(
            {byNameOrPlace(node, values, into, true), each.word("sortby_dir") == "SORTBY_DESC"});
        into.commented.emplace(each.place(), model::CommentPlace::order);
    }
}

/// Where rows are put together, what comes out is a total or what they are put together by.
void StatementReader::checkGroups(const Selected& selected) {
    const sql::Statement& statement = selected.statement;
    const auto isTotal = [](const Node& node) { return node && sql::holds<sql::Aggregate>(*node); };
    bool grouped = !statement.group.empty() || isTotal(statement.having);
    for (const auto& item : statement.items)
        if (const auto* node = std::get_if<Node>(&item.what)) grouped = grouped || isTotal(*node);
    for (const auto& item : statement.order) grouped = grouped || isTotal(item.value);
    if (!grouped) {
        if (statement.having)
            refuse<MessageCode::criterionNotDrawn>(selected.placeOf(statement.having));
        return;
    }
    for (const auto& item : statement.items) {
        const auto* node = std::get_if<Node>(&item.what);
        if (!node || !isGrouped(*node, statement.group))
            refuse<MessageCode::ungrouped>(node ? selected.placeOf(*node) : selected.place);
    }
    for (const auto& item : statement.order)
        if (!isGrouped(item.value, statement.group))
            refuse<MessageCode::ungrouped>(selected.placeOf(item.value));
}

} // namespace zandor::sql_reader
