#include "model/sql_reader/StatementReader.h"

#include "model/sql_reader/Drawing.h"
#include "model/sql_reader/Refused.h"
#include "model/sql_reader/Terms.h"

#include <Zandor/model/Names.h>
#include <Zandor/sql/Builder.h>

#include <algorithm>

namespace zandor::sql_reader {

namespace sql = model::sql;

namespace {

/// The name given to a source; empty where there is none.
String aliasOf(const Tree& tree) {
    if (!tree.has("alias")) return {};
    const Tree alias = tree.part("alias");
    if (alias.has("colnames")) refusePart<MessageCode::namedColumns>(tree.place());
    return alias.text("aliasname");
}

sql::SourceNode made(auto source) {
    return std::make_shared<const sql::Source>(sql::Source{std::move(source)});
}

/// What joins no rows in particular.
Node always() { return sql::make(sql::Value{model::ColumnType::Boolean, u"true"}); }

sql::JoinKind kindOf(const Tree& join) {
    const std::string_view type = join.word("jointype");
    if (type == "JOIN_LEFT") return sql::JoinKind::leftOuter;
    if (type == "JOIN_RIGHT") return sql::JoinKind::rightOuter;
    if (type == "JOIN_FULL") return sql::JoinKind::fullOuter;
    return sql::JoinKind::inner;
}

sql::SourceNode beside(sql::SourceNode left, sql::SourceNode right) {
    return made(
        sql::JoinSource{sql::JoinKind::inner, std::move(left), std::move(right), always(), {}});
}

/// Sources that nothing joins stand beside each other.
void addSources(const sql::SourceNode& source, std::vector<sql::SourceNode>& all) {
    const auto* join = std::get_if<sql::JoinSource>(&source->node);
    if (!join || join->kind != sql::JoinKind::inner || !termsOf(join->on).empty()) {
        all.push_back(source);
        return;
    }
    addSources(join->left, all);
    addSources(join->right, all);
}

} // namespace

/// In SQLite a comma joins like any other word, from left to right; elsewhere after all joins.
void StatementReader::from(const Tree& tree, Selected& into) {
    std::vector<Source> all;
    std::size_t outside = 0; // of the item before
    for (const Tree& each : tree.list("fromClause")) {
        const bool takesAll = mDialect == Dialect::SQLite && !all.empty() && each.is("JoinExpr") &&
                              !hasParentheses(each, outside);
        if (takesAll) {
            Before before{all.front(), std::move(into.scope)};
            for (std::size_t n = 1; n < all.size(); ++n)
                before.source = beside(before.source, all[n]);
            into.scope = Scope(mDialect);
            all = {join(each, into.scope, into, &before)};
        } else {
            all.push_back(source(each, into.scope, into));
        }
        outside = each.place();
    }
    for (const Source& each : all) addSources(each, into.statement.from);
}

/// Whether parentheses stand around a join that leave a place out.
bool StatementReader::hasParentheses(const Tree& join, std::size_t outside) const {
    const std::size_t left = join.node("larg").place();
    const std::size_t right = join.node("rarg").place();
    return std::any_of(mText.parentheses.begin(), mText.parentheses.end(), [&](const auto& each) {
        const auto holds = [&](std::size_t byte) { return each.begin < byte && byte < each.end; };
        return holds(left) && holds(right) && !holds(outside);
    });
}

StatementReader::Source StatementReader::source(const Tree& tree, Scope& scope, Selected& into) {
    if (tree.is("RangeVar")) return table(tree, scope, into);
    if (tree.is("RangeSubselect")) return subSelect(tree, scope, into);
    if (tree.is("JoinExpr")) return join(tree, scope, into);
    if (tree.is("RangeFunction")) refusePart<MessageCode::aTableFunction>(tree.place());
    refuse<MessageCode::noPlaceFor>(tree.place(),
                                    model::say<MessageCode::thisPart>(tree.sqlName()));
}

StatementReader::Source StatementReader::table(const Tree& tree, Scope& scope, Selected& into) {
    tree.only({"schemaname", "relname", "inh", "relpersistence", "alias"});
    if (!tree.flag("inh"))
        refuse<MessageCode::noPlaceFor>(tree.place(), model::say<MessageCode::thisPart>(u"ONLY"));
    const String schema = tree.text("schemaname");
    const String name = tree.text("relname");
    const String alias = aliasOf(tree);
    if (schema.empty())
        for (auto query = mNamed.rbegin(); query != mNamed.rend(); ++query)
            if (model::sameName(query->name, name))
                return queryAs(*query, alias.empty() ? query->name : alias, tree.place(), scope,
                               into);
    const auto found = mSchema.table ? mSchema.table(schema, name) : std::nullopt;
    if (!found) {
        if (const auto near = nearest(name, mSchema.names))
            refuse<MessageCode::unknownTableNear>(tree.place(), name, *near);
        refuse<MessageCode::unknownTable>(tree.place(), name);
    }
    const String called = alias.empty() ? found->name : alias;
    scope.add({called, found->columns, {schema, found->schema}, true}, tree.place());
    into.tables.emplace(called, *found);
    into.commented.emplace(tree.place(), called);
    return made(sql::TableRef{found->schema, found->name, called});
}

StatementReader::Named StatementReader::named(const Tree& select, String name) {
    constexpr int deepest = model::deepestSavedQuery;
    if (++mDepth > deepest) refuse<MessageCode::tooDeep>(select.place());
    Selected inner = this->select(select);
    --mDepth;
    const auto query = drawn(inner, mIsWritten);
    const model::SavedQuery saved{{}, query->record()};
    if (depthOf(saved.record) >= deepest) refuse<MessageCode::tooDeep>(select.place());
    std::vector<model::ColumnDescription> columns = sql::outputColumns(*query);
    for (std::size_t n = 0; n < inner.statement.items.size(); ++n) {
        const auto& item = inner.statement.items[n];
        const auto* value = std::get_if<Node>(&item.what);
        const auto* column = value ? std::get_if<ColumnRef>(&(*value)->node) : nullptr;
        const String& own = !item.name.empty() ? item.name : column ? column->column : item.name;
        for (std::size_t m = 0; !own.empty() && m < n; ++m) {
            const auto* other = std::get_if<Node>(&inner.statement.items[m].what);
            const auto* before = other ? std::get_if<ColumnRef>(&(*other)->node) : nullptr;
            const String& named = inner.statement.items[m].name;
            if (model::sameName(own, !named.empty() ? named : before ? before->column : named))
                refuse<MessageCode::sameOutput>(select.place(), own);
        }
    }
    return {std::move(name), std::make_shared<const sql::Statement>(std::move(inner.statement)),
            saved, std::move(columns)};
}

StatementReader::Source StatementReader::subSelect(const Tree& tree, Scope& scope, Selected& into) {
    if (tree.flag("lateral")) refusePart<MessageCode::aLateral>(tree.place());
    tree.only({"subquery", "alias"});
    String alias = aliasOf(tree);
    // SQLite and others ask for none.
    for (std::int64_t n = 1; alias.empty(); ++n) {
        const String free = u"query_" + platform::decimal(n);
        if (!scope.tableNamed(free)) alias = free;
    }
    return queryAs(named(tree.node("subquery"), alias), alias, tree.place(), scope, into);
}

StatementReader::Source StatementReader::queryAs(const Named& query, const String& alias,
                                                 std::size_t place, Scope& scope, Selected& into) {
    scope.add({alias, query.columns}, place);
    into.queries.emplace(alias, query.query);
    into.commented.emplace(place, alias);
    return made(sql::SubSelect{query.statement, alias});
}

/// What USING and NATURAL compare.
std::vector<Node> StatementReader::shared(const Tree& tree, const Scope& left, const Scope& right,
                                          Scope& both) {
    std::vector<String> names = tree.names("usingClause");
    if (tree.flag("isNatural"))
        for (const ScopedTable& table : left.tables())
            for (const auto& column : table.columns)
                if (left.find(column.name, tree.place()) && right.find(column.name, tree.place()))
                    names.push_back(column.name);
    if (!names.empty() && kindOf(tree) == sql::JoinKind::fullOuter)
        refusePart<MessageCode::aFullUsing>(tree.place());
    std::vector<Node> terms;
    for (const String& name : names) {
        const ColumnRef one = left.column({}, name, tree.place());
        const ColumnRef other = right.column({}, name, tree.place());
        terms.push_back(
            sql::make(sql::Compare{sql::Comparison::equal, sql::make(one), sql::make(other)}));
        const bool keepsRight = kindOf(tree) == sql::JoinKind::rightOuter;
        both.share(keepsRight ? other : one, keepsRight ? one : other);
    }
    return terms;
}

/// The left side of a join; what stands before it belongs to its first table.
StatementReader::Source StatementReader::leftOf(const Tree& join, Scope& scope, Selected& into,
                                                const Before* before) {
    const Tree left = join.node("larg");
    if (!before) return source(left, scope, into);
    if (left.is("JoinExpr") && !hasParentheses(left, join.node("rarg").place()))
        return this->join(left, scope, into, before);
    scope.add(before->scope, left.place());
    return beside(before->source, source(left, scope, into));
}

StatementReader::Source StatementReader::join(const Tree& tree, Scope& scope, Selected& into,
                                              const Before* before) {
    tree.only({"jointype", "isNatural", "larg", "rarg", "usingClause", "quals", "rtindex"});
    Scope leftScope(mDialect);
    Scope rightScope(mDialect);
    Source left = leftOf(tree, leftScope, into, before);
    Source right = source(tree.node("rarg"), rightScope, into);
    Scope both = leftScope;
    both.add(rightScope, tree.place());
    std::vector<Node> terms = shared(tree, leftScope, rightScope, both);
    if (tree.has("quals"))
        terms = ValueReader(both, mText, mDialect, into.places).conditions(tree.node("quals"));
    scope.add(both, tree.place());
    Node on = sql::allOf(std::move(terms));
    return made(sql::JoinSource{
        kindOf(tree), std::move(left), std::move(right), on ? std::move(on) : always(), {}});
}

} // namespace zandor::sql_reader
