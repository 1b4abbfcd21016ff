#include <Zandor/sql/Printer.h>

#include "model/sql/ExpressionPrinter.h"
#include "model/sql/Remarks.h"

#include <Zandor/model/Names.h>

#include <algorithm>
#include <map>
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
    Printer(Output& out, const Statement& statement, const SharedQueries& shared, String indent,
            int depth)
        : mOut(out), mStatement(statement), mShared(shared), mIndent(std::move(indent)),
          mDepth(depth) {}

    /// What stands above the whole statement.
    void head() {
        const auto remarks = mRemarks.of(CommentPlace::start);
        for (const String& each : remarks.above) mOut.text += each + u'\n' + mIndent;
        mBesideSelect = remarks.beside;
    }

    /// All behind it.
    void body() {
        const Statement& statement = mStatement;
        writeGroupsOut(statement);
        const bool around = differsAround(statement);
        if (around) {
            mOut.text += u"SELECT DISTINCT * FROM (";
            line(u"");
        }
        mOut.text += statement.distinct && !around ? u"SELECT DISTINCT" : u"SELECT";
        String beside = mBesideSelect;
        for (std::size_t n = 0; n < statement.items.size(); ++n) {
            if (n > 0) mOut.text += u',';
            comment(beside);
            const auto remarks = mRemarks.of(n);
            lines(remarks.above, inside);
            beside = remarks.beside;
            line(inside);
            selectItem(statement.items[n]);
        }
        comment(beside);
        from(statement.from);
        filter(statement);
        group(statement);
        if (statement.having) having(statement);
        if (around) line(u") AS totals");
        order(statement, around);
        paging(statement);
        end();
    }

private:
    void line(StringView begin) {
        mOut.text += u'\n';
        mOut.text += mIndent;
        mOut.text += begin;
    }

    /// Comments before what comes next.
    void lines(const std::vector<String>& comments, StringView within) {
        for (const String& each : comments) line(String(within) + each);
    }

    /// A comment at the end of a line.
    void comment(StringView beside) {
        mOut.text += beside;
        if (!beside.empty()) mOut.commentEnd = mOut.text.size();
    }

    void end() {
        Remarks::Lines remarks = mRemarks.of(CommentPlace::end);
        const Remarks::Lines rest = mRemarks.rest();
        comment(remarks.beside);
        remarks.above.insert(remarks.above.end(), rest.above.begin(), rest.above.end());
        if (!rest.beside.empty()) remarks.above.push_back(rest.beside.substr(1));
        lines(remarks.above, {});
        if (!remarks.above.empty()) mOut.commentEnd = mOut.text.size();
    }

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

    void filter(const Statement& statement) {
        if (!statement.where) return;
        check(*statement.where);
        terms(statement.where, u"WHERE ", mExpressions, !statement.having);
    }

    /// A line for each; in the `last` ones stands what was said of those that are no more.
    void terms(const Node& condition, StringView word, ExpressionPrinter& printer, bool last) {
        const TermLines all = termLinesOf(condition);
        std::vector<Remarks::Lines> remarks;
        for (const Node& term : all.terms) remarks.push_back(mRemarks.within(term));
        if (last) {
            const Remarks::Lines others = mRemarks.ofOtherConditions();
            auto& above = remarks.front().above;
            if (!others.beside.empty()) above.insert(above.begin(), others.beside.substr(1));
            above.insert(above.begin(), others.above.begin(), others.above.end());
        }
        for (std::size_t n = 0; n < all.terms.size(); ++n) {
            lines(remarks[n].above, n == 0 ? u"" : inside);
            line(n == 0 ? String(word) : String(inside) + String(all.word));
            printer.condition(*all.terms[n], all.around);
            comment(remarks[n].beside);
        }
    }

    void having(const Statement& statement) {
        ExpressionPrinter behind = mExpressions;
        behind.standBehind(statement.group);
        check(*statement.having);
        terms(statement.having, u"HAVING ", behind, true);
    }

    void group(const Statement& statement) {
        bool first = true;
        String beside;
        for (const Node& node : statement.group) {
            // Engines take a number alone for that of a column, or nothing alone at all.
            const bool alone = std::holds_alternative<Value>(node->node);
            if (alone && isFor(Dialect::SqlServer)) continue;
            if (first) beside = besideBehind(CommentPlace::groups);
            begin(first, u"GROUP BY ");
            if (groupedByNumber(statement, node)) {
                mOut.text += platform::decimal(static_cast<std::int64_t>(itemOf(statement, node)));
            } else {
                if (alone) mOut.text += u"COALESCE(";
                mExpressions.value(*node, Tightness::disjunction);
                if (alone) mOut.text += u", NULL)";
            }
        }
        comment(beside);
    }

    /// Writes what stands above a clause, and returns what stands beside it.
    String besideBehind(CommentPlace clause) {
        const auto remarks = mRemarks.of(clause);
        lines(remarks.above, {});
        return remarks.beside;
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
            const bool joined = std::holds_alternative<JoinSource>(source->node);
            if (first || !joined) lines(above(*source), first ? u"" : inside);
            line(first ? u"FROM " : String(inside) + u"CROSS JOIN ");
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
        lines(above(source), deeper);
        line(deeper);
        sourceLines(source, deeper, deeper);
        line(within);
        mOut.text += u')';
    }

    /// What stands above a source, or above the first of joined ones.
    std::vector<String> above(const Source& source) {
        Remarks::Lines remarks = mRemarks.of(aliasOf(source));
        mBeside[aliasOf(source)] = std::move(remarks.beside);
        return std::move(remarks.above);
    }

    /// A source with each of its joins on a line of its own, which is indented by `joins`; `within`
    /// is how far the line is in which it begins.
    void sourceLines(const Source& source, StringView joins, StringView within) {
        const auto* join = std::get_if<JoinSource>(&source.node);
        if (!join) {
            single(source, within);
            comment(mBeside[aliasOf(source)]);
            return;
        }
        check(*join);
        sourceLines(*join->left, joins, within);
        const Source& right = *join->right;
        const bool several = std::holds_alternative<JoinSource>(right.node);
        if (!several) lines(above(right), joins);
        line(joins);
        mOut.text += words(join->kind);
        if (several)
            inParentheses(right, joins);
        else
            single(right, joins);
        mOut.text += u" ON ";
        mExpressions.condition(*join->on, Tightness::conjunction);
        if (!several) comment(mBeside[aliasOf(right)]);
    }

    void single(const Source& source, StringView within) {
        if (const auto* table = std::get_if<TableRef>(&source.node))
            tableRef(*table);
        else
            subSelect(std::get<SubSelect>(source.node), within);
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
        Printer inner(mOut, *query.statement, mShared, indent + String(inside), mDepth + 1);
        inner.head();
        inner.body();
        mOut.text += u'\n' + indent + u") AS ";
        mOut.name(query.alias);
    }

    /// `byNumber` where the names of tables cannot be seen any more.
    void order(const Statement& statement, bool byNumber) {
        const bool needed = isFor(Dialect::SqlServer) && (statement.limit || statement.offset);
        if (statement.order.empty() && needed)
            line(statement.distinct ? u"ORDER BY 1" : u"ORDER BY (SELECT NULL)");
        bool first = true;
        String beside;
        for (const auto& item : statement.order) {
            if (first) beside = besideBehind(CommentPlace::order);
            begin(first, u"ORDER BY ");
            const bool plain = std::holds_alternative<ColumnRef>(item.value->node);
            const std::size_t number = plain && !byNumber ? 0 : itemOf(statement, item.value);
            if (number != 0 && !followsAll(statement, number))
                mOut.text += platform::decimal(static_cast<std::int64_t>(number));
            else
                mExpressions.value(*item.value, Tightness::disjunction);
            if (item.descending) mOut.text += u" DESC";
        }
        comment(beside);
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
    const Statement& mStatement;
    const SharedQueries& mShared;
    const String mIndent;
    const int mDepth;
    Remarks mRemarks{mStatement, mOut.form != ValueForm::bound};
    String mBesideSelect;
    std::map<String, String> mBeside; ///< of sources, by alias
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

bool namesTruth(const Statement& statement);

bool namesTruth(const Source& source) {
    if (const auto* join = std::get_if<JoinSource>(&source.node))
        return namesTruth(*join->left) || namesTruth(*join->right);
    const auto* query = std::get_if<SubSelect>(&source.node);
    return query && namesTruth(*query->statement);
}

/// Whether a column comes out under a name that SQLite then takes TRUE or FALSE for.
bool namesTruth(const Statement& statement) {
    return std::any_of(statement.items.begin(), statement.items.end(),
                       [](const SelectItem& item) {
                           return sameName(item.name, u"true") || sameName(item.name, u"false");
                       }) ||
           std::any_of(statement.from.begin(), statement.from.end(),
                       [](const SourceNode& source) { return namesTruth(*source); });
}

Printed whole(const Statement& statement, Output out) {
    out.countsTruth = out.dialect == Dialect::SQLite && namesTruth(statement);
    Sharing sharing(statement);
    SharedQueries shared;
    Printer all(out, statement, shared, {}, 0);
    all.head();
    StringView before = u"WITH ";
    for (const SubSelect* query : sharing.queries()) {
        const String name = sharing.nameFor(*query);
        out.text += before;
        out.name(name);
        out.text += u" AS (\n" + String(inside);
        Printer inner(out, *query->statement, shared, String(inside), 1);
        inner.head();
        inner.body();
        out.text += u"\n)";
        shared.emplace(query->statement.get(), name);
        before = u",\n";
    }
    if (!shared.empty()) out.text += u'\n';
    all.body();
    // A comment would swallow it.
    if (out.form == ValueForm::script) out.text += out.commentEnd == out.text.size() ? u"\n;" : u";";
    return {std::move(out.text), std::move(out.bindings)};
}

} // namespace

std::variant<Printed, Refusal> print(const Statement& statement, Dialect dialect, ValueForm form) {
    try {
        if (form != ValueForm::script) return whole(statement, {dialect, form});
        // What one parameter is called depends on all of them.
        const Printed shown = whole(statement, {dialect, ValueForm::literal});
        return whole(statement, {dialect, form, ShellNames(shown.bindings)});
    } catch (Refusal& refusal) {
        return std::move(refusal);
    }
}

} // namespace zandor::model::sql
