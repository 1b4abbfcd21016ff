#include <Zandor/sql/Printer.h>

#include "model/sql/ExpressionPrinter.h"

#include <Zandor/model/Names.h>

#include <algorithm>
#include <set>
#include <unordered_map>

namespace zandor::model::sql {

namespace {

constexpr StringView inside = u"    ";

StringView words(JoinKind kind) {
    switch (kind) {
    case JoinKind::inner: return u"INNER JOIN ";
    case JoinKind::leftOuter: return u"LEFT JOIN ";
    case JoinKind::rightOuter: return u"RIGHT JOIN ";
    case JoinKind::fullOuter: break;
    }
    return u"FULL JOIN ";
}

bool hasEquality(const Expression& condition) {
    if (const auto* compare = std::get_if<Compare>(&condition.node))
        return compare->comparison == Comparison::equal;
    if (const auto* all = std::get_if<And>(&condition.node))
        for (const auto& term : all->terms)
            if (hasEquality(*term)) return true;
    return false;
}

/// How deep SQLite nests a condition that it reads term by term.
std::size_t depth(const Expression& expression) {
    const bool terms =
        std::holds_alternative<And>(expression.node) || std::holds_alternative<Or>(expression.node);
    const auto parts = partsOf(expression);
    // A long list is no deep one.
    if (std::holds_alternative<In>(expression.node)) return depth(*parts.front()) + 1;
    std::size_t deepest = 0;
    for (const Node& part : parts) deepest = std::max(deepest, depth(*part));
    return deepest + (terms ? parts.size() : 1);
}

/// How many entries of its stack SQLite's parser takes for one level of a kind of node, at most.
int entriesFor(const Expression& expression) {
    if (const auto* call = std::get_if<Call>(&expression.node)) {
        switch (call->function) {
        case Function::abs:
        case Function::length:
        case Function::upper:
        case Function::lower:
        case Function::trim: return 4;
        case Function::coalesce: return 6;
        case Function::right: return 14; // with functions of its own inside
        default: return 9;
        }
    }
    if (const auto* operation = std::get_if<Operation>(&expression.node))
        return operation->symbol == Operator::divide ? 6 : 3;
    if (std::holds_alternative<Choice>(expression.node)) return 6;
    if (std::holds_alternative<Not>(expression.node)) return 4;
    if (std::holds_alternative<Between>(expression.node)) return 6;
    return 3;
}

/// The entries for the deepest way down.
int entriesOf(const Expression& expression) {
    int most = 0;
    for (const Node& part : partsOf(expression)) most = std::max(most, entriesOf(*part));
    return most + entriesFor(expression);
}

/// The names of queries that are written before the statement.
using SharedQueries = std::unordered_map<const Statement*, String>;

class Printer {
public:
    /// Writes behind what is there, each line after `indent`, within so many statements; `shared`
    /// have names already.
    Printer(Output& out, const SharedQueries& shared, String indent, int depth)
        : mOut(out), mShared(shared), mIndent(std::move(indent)), mDepth(depth) {}

    void print(const Statement& statement) {
        writeGroupsOut(statement);
        const bool around = differsAround(statement);
        if (around) {
            mOut.text += u"SELECT DISTINCT * FROM (";
            line(u"");
        }
        mOut.text += statement.distinct && !around ? u"SELECT DISTINCT" : u"SELECT";
        for (const auto& item : statement.items) {
            if (&item != &statement.items.front()) mOut.text += u',';
            line(inside);
            selectItem(item);
        }
        line(u"FROM ");
        from(statement.from);
        filter(statement.where);
        group(statement);
        if (statement.having) having(statement);
        if (around) line(u") AS totals");
        order(statement, around);
        paging(statement);
    }

private:
    void line(StringView begin) {
        mOut.text += u'\n';
        mOut.text += mIndent;
        mOut.text += begin;
    }

    /// What begins a line within a clause.
    String nextLine() const { return u'\n' + mIndent + String(inside); }

    bool isFor(Dialect dialect) const { return mOut.dialect == dialect; }

    /// MariaDB leaves equal rows of averages in, but for a select around them; which takes no two
    /// columns of one name.
    bool differsAround(const Statement& statement) const {
        if (!isFor(Dialect::MySQL) || !statement.distinct) return false;
        std::set<String> names;
        bool totals = false;
        for (const SelectItem& item : statement.items) {
            const auto* value = std::get_if<Node>(&item.what);
            if (!value) return false;
            totals = totals || holds<Aggregate>(**value);
            const auto* column = std::get_if<ColumnRef>(&(*value)->node);
            const String& name = item.name.empty() && column ? column->column : item.name;
            if (!names.insert(foldedName(name)).second) return false;
        }
        return totals;
    }

    /// The number of the item that a value comes out as, from 1; 0 for none.
    static std::size_t itemOf(const Statement& statement, const Node& value) {
        for (std::size_t n = 0; n < statement.items.size(); ++n) {
            const auto* item = std::get_if<Node>(&statement.items[n].what);
            if (item && *item == value) return n + 1;
        }
        return 0;
    }

    /// Engines know an expression again by its text, and two placeholders are two values to them.
    void writeGroupsOut(const Statement& statement) {
        std::vector<Node> groups;
        for (const Node& node : statement.group)
            if (!groupedByNumber(statement, node) &&
                (holds<Value>(*node) || holds<Parameter>(*node)))
                groups.push_back(node);
        mExpressions.writeOut(groups);
    }

    /// With a parameter in it only the number of its item says that it is the same.
    bool groupedByNumber(const Statement& statement, const Node& node) const {
        const bool numbers = !isFor(Dialect::SqlServer) && !isFor(Dialect::Standard);
        return numbers && holds<Parameter>(*node) && itemOf(statement, node) != 0;
    }

    void filter(const Node& condition) {
        if (!condition) return;
        check(*condition);
        line(u"WHERE ");
        mExpressions.terms(*condition, nextLine(), Tightness::disjunction);
    }

    void having(const Statement& statement) {
        ExpressionPrinter behind = mExpressions;
        behind.standBehind(statement.group);
        check(*statement.having);
        line(u"HAVING ");
        behind.terms(*statement.having, nextLine(), Tightness::disjunction);
    }

    void group(const Statement& statement) {
        bool first = true;
        for (const Node& node : statement.group) {
            // Engines take a number alone for that of a column, or nothing alone at all.
            const bool alone = std::holds_alternative<Value>(node->node);
            if (alone && isFor(Dialect::SqlServer)) continue;
            begin(first, u"GROUP BY ");
            if (groupedByNumber(statement, node)) {
                mOut.text += platform::decimal(static_cast<std::int64_t>(itemOf(statement, node)));
            } else {
                if (alone) mOut.text += u"COALESCE(";
                mExpressions.value(*node, Tightness::disjunction);
                if (alone) mOut.text += u", NULL)";
            }
        }
    }

    /// Before the first of several a line with `word`, before the others a comma.
    void begin(bool& first, StringView word) {
        if (first)
            line(word);
        else
            mOut.text += u", ";
        first = false;
    }

    void selectItem(const SelectItem& item) {
        if (const auto* all = std::get_if<AllColumns>(&item.what)) {
            mOut.name(all->table);
            mOut.text += u".*";
            return;
        }
        const Expression& value = *std::get<Node>(item.what);
        check(value);
        mExpressions.item(value);
        if (item.name.empty()) return;
        mOut.text += u" AS ";
        mOut.name(item.name);
    }

    void from(const std::vector<SourceNode>& sources) {
        bool first = true;
        for (const auto& source : sources) {
            if (!first) {
                line(inside);
                mOut.text += u"CROSS JOIN ";
            }
            const bool joined = std::holds_alternative<JoinSource>(source->node);
            // A tree after the first would otherwise swallow what stands before it.
            if (joined && !first)
                inParentheses(*source, inside);
            else
                sourceLines(*source, inside, first ? u"" : inside);
            first = false;
        }
    }

    void inParentheses(const Source& source, StringView within) {
        const String deeper = String(within) + String(inside);
        mOut.text += u'(';
        line(deeper);
        sourceLines(source, deeper, deeper);
        line(within);
        mOut.text += u')';
    }

    /// A source with each of its joins on a line of its own, which is indented by `joins`; `within`
    /// is how far the line is in which it begins.
    void sourceLines(const Source& source, StringView joins, StringView within) {
        if (const auto* table = std::get_if<TableRef>(&source.node)) {
            tableRef(*table);
            return;
        }
        if (const auto* query = std::get_if<SubSelect>(&source.node)) {
            subSelect(*query, within);
            return;
        }
        const auto& join = std::get<JoinSource>(source.node);
        check(join);
        sourceLines(*join.left, joins, within);
        line(joins);
        mOut.text += words(join.kind);
        if (std::holds_alternative<JoinSource>(join.right->node))
            inParentheses(*join.right, joins);
        else
            sourceLines(*join.right, joins, joins);
        mOut.text += u" ON ";
        mExpressions.condition(*join.on, Tightness::conjunction);
    }

    void check(const JoinSource& join) const {
        if (join.kind != JoinKind::fullOuter) return;
        if (mOut.dialect == Dialect::MySQL)
            throw Refusal{Refusal::Reason::join, say<MessageCode::noFullJoin>(), join.key};
        if (mOut.dialect == Dialect::PostgreSQL && !hasEquality(*join.on))
            throw Refusal{Refusal::Reason::join, say<MessageCode::unequalFullJoin>(), join.key};
    }

    void check(const Expression& expression) const {
        if (mOut.dialect != Dialect::SQLite) return;
        constexpr std::size_t deepest = 950; // SQLite takes 1000
        if (depth(expression) > deepest)
            throw Refusal{Refusal::Reason::size, say<MessageCode::tooManyConditions>()};
        constexpr int mostEntries = 92;  // and 100 of these, some for the statement
        constexpr int entriesAround = 8; // for each statement around that one
        if (entriesOf(expression) > mostEntries - entriesAround * mDepth)
            throw Refusal{Refusal::Reason::size, say<MessageCode::nestedTooDeepHere>()};
    }

    void tableRef(const TableRef& table) {
        if (!table.schema.empty()) {
            mOut.name(table.schema);
            mOut.text += u'.';
        }
        named(table.name, table.alias);
    }

    void named(const String& name, const String& alias) {
        mOut.name(name);
        if (alias == name) return;
        mOut.text += u" AS ";
        mOut.name(alias);
    }

    void subSelect(const SubSelect& query, StringView within) {
        if (const auto known = mShared.find(query.statement.get()); known != mShared.end()) {
            named(known->second, query.alias);
            return;
        }
        const String indent = mIndent + String(within);
        mOut.text += u"(\n" + indent + String(inside);
        Printer(mOut, mShared, indent + String(inside), mDepth + 1).print(*query.statement);
        mOut.text += u'\n' + indent + u") AS ";
        mOut.name(query.alias);
    }

    /// `byNumber` where the names of tables cannot be seen any more.
    void order(const Statement& statement, bool byNumber) {
        const bool needed = isFor(Dialect::SqlServer) && (statement.limit || statement.offset);
        if (statement.order.empty() && needed)
            line(statement.distinct ? u"ORDER BY 1" : u"ORDER BY (SELECT NULL)");
        bool first = true;
        for (const auto& item : statement.order) {
            begin(first, u"ORDER BY ");
            const bool plain = std::holds_alternative<ColumnRef>(item.value->node);
            const std::size_t number = plain && !byNumber ? 0 : itemOf(statement, item.value);
            if (number != 0 && !followsAll(statement, number))
                mOut.text += platform::decimal(static_cast<std::int64_t>(number));
            else
                mExpressions.value(*item.value, Tightness::disjunction);
            if (item.descending) mOut.text += u" DESC";
        }
    }

    /// Whether all columns of a table come before an item, so that nobody knows its number.
    static bool followsAll(const Statement& statement, std::size_t number) {
        const auto end = statement.items.begin() + static_cast<std::ptrdiff_t>(number);
        return std::any_of(statement.items.begin(), end, [](const SelectItem& item) {
            return std::holds_alternative<AllColumns>(item.what);
        });
    }

    void paging(const Statement& statement) {
        if (!statement.limit && statement.offset == 0) return;
        const String offset = platform::decimal(statement.offset);
        if (mOut.dialect == Dialect::SqlServer || mOut.dialect == Dialect::Standard) {
            line(u"OFFSET " + offset + u" ROWS");
            if (statement.limit)
                line(u"FETCH NEXT " + platform::decimal(*statement.limit) + u" ROWS ONLY");
            return;
        }
        if (statement.limit)
            line(u"LIMIT " + platform::decimal(*statement.limit));
        else if (mOut.dialect == Dialect::SQLite)
            line(u"LIMIT -1");
        else if (mOut.dialect == Dialect::MySQL)
            line(u"LIMIT 18446744073709551615");
        if (statement.offset == 0) return;
        if (statement.limit || mOut.dialect != Dialect::PostgreSQL)
            mOut.text += u" OFFSET " + offset;
        else
            line(u"OFFSET " + offset);
    }

    Output& mOut;
    const SharedQueries& mShared;
    const String mIndent;
    const int mDepth;
    ExpressionPrinter mExpressions{mOut};
};

/// Finds what is written before the statement: the queries that it reads from more than once.
class Sharing {
public:
    explicit Sharing(const Statement& statement) {
        visit(statement);
        for (const SubSelect* query : mInOrder)
            if (mTimes[query->statement.get()] > 1) mQueries.push_back(query);
    }

    /// Those that others read from come first.
    const std::vector<const SubSelect*>& queries() const { return mQueries; }

    /// Under such a name no table of the database is read from.
    String nameFor(const SubSelect& query) {
        String name = query.alias;
        for (std::int32_t n = 1; !mTaken.insert(foldedName(name)).second; ++n)
            name = query.alias + u'_' + platform::decimal(n);
        return name;
    }

private:
    void visit(const Statement& statement) {
        for (const SourceNode& source : statement.from) visit(*source);
    }

    void visit(const Source& source) {
        if (const auto* join = std::get_if<JoinSource>(&source.node)) {
            visit(*join->left);
            visit(*join->right);
        } else if (const auto* table = std::get_if<TableRef>(&source.node)) {
            mTaken.insert(foldedName(table->name));
        } else {
            const auto& query = std::get<SubSelect>(source.node);
            if (++mTimes[query.statement.get()] > 1) return;
            visit(*query.statement);
            mInOrder.push_back(&query);
        }
    }

    std::unordered_map<const Statement*, int> mTimes;
    std::vector<const SubSelect*> mInOrder;
    std::vector<const SubSelect*> mQueries;
    std::set<String> mTaken;
};

Printed whole(const Statement& statement, Output out) {
    Sharing sharing(statement);
    SharedQueries shared;
    StringView before = u"WITH ";
    for (const SubSelect* query : sharing.queries()) {
        const String name = sharing.nameFor(*query);
        out.text += before;
        out.name(name);
        out.text += u" AS (\n" + String(inside);
        Printer(out, shared, String(inside), 1).print(*query->statement);
        out.text += u"\n)";
        shared.emplace(query->statement.get(), name);
        before = u",\n";
    }
    if (!shared.empty()) out.text += u'\n';
    Printer(out, shared, {}, 0).print(statement);
    return {std::move(out.text), std::move(out.bindings)};
}

} // namespace

std::variant<Printed, Refusal> print(const Statement& statement, Dialect dialect, ValueForm form) {
    try {
        if (form != ValueForm::script) return whole(statement, {dialect, form});
        // What one parameter is called depends on all of them.
        const Printed shown = whole(statement, {dialect, ValueForm::literal});
        Printed written = whole(statement, {dialect, form, ShellNames(shown.bindings)});
        written.text += u';';
        return written;
    } catch (Refusal& refusal) {
        return std::move(refusal);
    }
}

} // namespace zandor::model::sql
