#include <Zandor/sql/Printer.h>

#include "model/sql/ExpressionPrinter.h"

#include <Zandor/model/Names.h>

#include <algorithm>
#include <set>

namespace zandor::model::sql {

namespace {

constexpr StringView nextLine = u"\n    ";

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

class Printer {
public:
    Printer(Dialect dialect, ValueForm form) : mOut{dialect, form} {}

    Printed print(const Statement& statement) {
        writeGroupsOut(statement);
        const bool around = differsAround(statement);
        if (around) mOut.text += u"SELECT DISTINCT * FROM (\n";
        mOut.text += statement.distinct && !around ? u"SELECT DISTINCT" : u"SELECT";
        const char16_t* separator = u"\n    ";
        for (const auto& item : statement.items) {
            mOut.text += separator;
            selectItem(item);
            separator = u",\n    ";
        }
        mOut.text += u"\nFROM ";
        from(statement.from);
        filter(u"\nWHERE ", statement.where);
        group(statement);
        if (statement.having) having(statement);
        if (around) mOut.text += u"\n) AS totals";
        order(statement, around);
        paging(statement);
        return {std::move(mOut.text), std::move(mOut.bindings)};
    }

private:
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

    void filter(StringView word, const Node& condition) {
        if (!condition) return;
        check(*condition);
        mOut.text += word;
        mExpressions.terms(*condition, nextLine, Tightness::disjunction);
    }

    void having(const Statement& statement) {
        ExpressionPrinter behind = mExpressions;
        behind.standBehind(statement.group);
        check(*statement.having);
        mOut.text += u"\nHAVING ";
        behind.terms(*statement.having, nextLine, Tightness::disjunction);
    }

    void group(const Statement& statement) {
        const char16_t* separator = u"\nGROUP BY ";
        for (const Node& node : statement.group) {
            // Engines take a number alone for that of a column, or nothing alone at all.
            const bool alone = std::holds_alternative<Value>(node->node);
            if (alone && isFor(Dialect::SqlServer)) continue;
            mOut.text += separator;
            if (groupedByNumber(statement, node)) {
                mOut.text += platform::decimal(static_cast<std::int64_t>(itemOf(statement, node)));
            } else {
                if (alone) mOut.text += u"COALESCE(";
                mExpressions.value(*node, Tightness::disjunction);
                if (alone) mOut.text += u", NULL)";
            }
            separator = u", ";
        }
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
                mOut.text += nextLine;
                mOut.text += u"CROSS JOIN ";
            }
            const bool joined = std::holds_alternative<JoinSource>(source->node);
            // A tree after the first would otherwise swallow what stands before it.
            if (joined && !first)
                inParentheses(*source);
            else
                sourceLines(*source, nextLine);
            first = false;
        }
    }

    void inParentheses(const Source& source) {
        mOut.text += u'(';
        sourceLines(source, u" ");
        mOut.text += u')';
    }

    /// A source with each of its joins behind a line break, or a blank when inside parentheses.
    void sourceLines(const Source& source, StringView lineBreak) {
        if (const auto* table = std::get_if<TableRef>(&source.node)) {
            tableRef(*table);
            return;
        }
        const auto& join = std::get<JoinSource>(source.node);
        check(join);
        sourceLines(*join.left, lineBreak);
        mOut.text += lineBreak;
        mOut.text += words(join.kind);
        if (std::holds_alternative<JoinSource>(join.right->node))
            inParentheses(*join.right);
        else
            sourceLines(*join.right, lineBreak);
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
        constexpr int mostEntries = 92; // and 100 of these, some for the statement around
        if (entriesOf(expression) > mostEntries)
            throw Refusal{Refusal::Reason::size, say<MessageCode::nestedTooDeepHere>()};
    }

    void tableRef(const TableRef& table) {
        if (!table.schema.empty()) {
            mOut.name(table.schema);
            mOut.text += u'.';
        }
        mOut.name(table.name);
        if (table.alias == table.name) return;
        mOut.text += u" AS ";
        mOut.name(table.alias);
    }

    /// `byNumber` where the names of tables cannot be seen any more.
    void order(const Statement& statement, bool byNumber) {
        const bool needed = isFor(Dialect::SqlServer) && (statement.limit || statement.offset);
        if (statement.order.empty() && needed)
            mOut.text += statement.distinct ? u"\nORDER BY 1" : u"\nORDER BY (SELECT NULL)";
        const char16_t* separator = u"\nORDER BY ";
        for (const auto& item : statement.order) {
            mOut.text += separator;
            const bool plain = std::holds_alternative<ColumnRef>(item.value->node);
            const std::size_t number = plain && !byNumber ? 0 : itemOf(statement, item.value);
            if (number != 0 && !followsAll(statement, number))
                mOut.text += platform::decimal(static_cast<std::int64_t>(number));
            else
                mExpressions.value(*item.value, Tightness::disjunction);
            if (item.descending) mOut.text += u" DESC";
            separator = u", ";
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
            mOut.text += u"\nOFFSET " + offset + u" ROWS";
            if (statement.limit)
                mOut.text += u"\nFETCH NEXT " + platform::decimal(*statement.limit) + u" ROWS ONLY";
            return;
        }
        if (statement.limit)
            mOut.text += u"\nLIMIT " + platform::decimal(*statement.limit);
        else if (mOut.dialect == Dialect::SQLite)
            mOut.text += u"\nLIMIT -1";
        else if (mOut.dialect == Dialect::MySQL)
            mOut.text += u"\nLIMIT 18446744073709551615";
        if (statement.offset == 0) return;
        mOut.text += statement.limit || mOut.dialect != Dialect::PostgreSQL ? u" " : u"\n";
        mOut.text += u"OFFSET " + offset;
    }

    Output mOut;
    ExpressionPrinter mExpressions{mOut};
};

} // namespace

std::variant<Printed, Refusal> print(const Statement& statement, Dialect dialect, ValueForm form) {
    try {
        return Printer(dialect, form).print(statement);
    } catch (Refusal& refusal) {
        return std::move(refusal);
    }
}

} // namespace zandor::model::sql
