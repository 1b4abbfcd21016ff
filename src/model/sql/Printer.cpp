#include <Zandor/sql/Printer.h>

#include "model/criteria/Tokens.h"

#include <algorithm>

namespace zandor::model::sql {

namespace {

constexpr StringView nextLine = u"\n    ";

StringView symbol(Comparison comparison) {
    switch (comparison) {
    case Comparison::equal: return u" = ";
    case Comparison::notEqual: return u" <> ";
    case Comparison::less: return u" < ";
    case Comparison::greater: return u" > ";
    case Comparison::lessEqual: return u" <= ";
    case Comparison::greaterEqual: break;
    }
    return u" >= ";
}

StringView words(JoinKind kind) {
    switch (kind) {
    case JoinKind::inner: return u"INNER JOIN ";
    case JoinKind::leftOuter: return u"LEFT JOIN ";
    case JoinKind::rightOuter: return u"RIGHT JOIN ";
    case JoinKind::fullOuter: break;
    }
    return u"FULL JOIN ";
}

/// How tightly a condition holds together; one that holds more loosely than its surroundings is
/// put in parentheses.
enum class Tightness { disjunction, conjunction, predicate };

bool hasEquality(const Expression& condition) {
    if (const auto* compare = std::get_if<Compare>(&condition.node))
        return compare->comparison == Comparison::equal;
    if (const auto* all = std::get_if<And>(&condition.node))
        for (const auto& term : all->terms)
            if (hasEquality(*term)) return true;
    return false;
}

std::size_t depth(const Expression& expression);

std::size_t depth(const std::vector<Node>& terms) {
    std::size_t deepest = 0;
    for (const Node& term : terms) deepest = std::max(deepest, depth(*term));
    return deepest + terms.size();
}

/// How deep an engine nests a condition that it reads term by term.
std::size_t depth(const Expression& expression) {
    if (const auto* all = std::get_if<And>(&expression.node)) return depth(all->terms);
    if (const auto* any = std::get_if<Or>(&expression.node)) return depth(any->terms);
    if (const auto* inverse = std::get_if<Not>(&expression.node))
        return depth(*inverse->operand) + 1;
    return 2;
}

class Printer {
public:
    Printer(Dialect dialect, ValueForm form) : mDialect(dialect), mForm(form) {}

    Printed print(const Statement& statement) {
        mOut += u"SELECT";
        const char16_t* separator = u"\n    ";
        for (const auto& item : statement.items) {
            mOut += separator;
            selectItem(item);
            separator = u",\n    ";
        }
        mOut += u"\nFROM ";
        from(statement.from);
        if (statement.where) {
            check(*statement.where);
            mOut += u"\nWHERE ";
            terms(*statement.where, nextLine, Tightness::disjunction);
        }
        order(statement);
        paging(statement);
        return {std::move(mOut), std::move(mBindings)};
    }

private:
    void name(StringView text) {
        if (const auto why = cannotCarry(text, mDialect))
            throw Refusal{Refusal::Reason::name, *why};
        mOut += identifier(text, mDialect);
    }

    void column(const ColumnRef& column) {
        name(column.table);
        mOut += u'.';
        name(column.column);
    }

    void selectItem(const SelectItem& item) {
        if (const auto* all = std::get_if<AllColumns>(&item.what)) {
            name(all->table);
            mOut += u".*";
            return;
        }
        column(std::get<ColumnRef>(item.what));
        if (item.name.empty()) return;
        mOut += u" AS ";
        name(item.name);
    }

    void from(const std::vector<SourceNode>& sources) {
        bool first = true;
        for (const auto& source : sources) {
            if (!first) {
                mOut += nextLine;
                mOut += u"CROSS JOIN ";
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
        mOut += u'(';
        sourceLines(source, u" ");
        mOut += u')';
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
        mOut += lineBreak;
        mOut += words(join.kind);
        if (std::holds_alternative<JoinSource>(join.right->node))
            inParentheses(*join.right);
        else
            sourceLines(*join.right, lineBreak);
        mOut += u" ON ";
        condition(*join.on, Tightness::conjunction);
    }

    void check(const JoinSource& join) const {
        if (join.kind != JoinKind::fullOuter) return;
        if (mDialect == Dialect::MySQL)
            throw Refusal{Refusal::Reason::join, say<MessageCode::noFullJoin>(), join.key};
        if (mDialect == Dialect::PostgreSQL && !hasEquality(*join.on))
            throw Refusal{Refusal::Reason::join, say<MessageCode::unequalFullJoin>(), join.key};
    }

    void check(const Expression& where) const {
        constexpr std::size_t deepest = 950; // SQLite takes 1000
        if (mDialect == Dialect::SQLite && depth(where) > deepest)
            throw Refusal{Refusal::Reason::size, say<MessageCode::tooManyConditions>()};
    }

    void tableRef(const TableRef& table) {
        if (!table.schema.empty()) {
            name(table.schema);
            mOut += u'.';
        }
        name(table.name);
        if (table.alias == table.name) return;
        mOut += u" AS ";
        name(table.alias);
    }

    void order(const Statement& statement) {
        const bool needed = mDialect == Dialect::SqlServer && (statement.limit || statement.offset);
        if (statement.order.empty() && needed) mOut += u"\nORDER BY (SELECT NULL)";
        const char16_t* separator = u"\nORDER BY ";
        for (const auto& item : statement.order) {
            mOut += separator;
            column(item.column);
            if (item.descending) mOut += u" DESC";
            separator = u", ";
        }
    }

    void paging(const Statement& statement) {
        if (!statement.limit && statement.offset == 0) return;
        const String offset = platform::decimal(statement.offset);
        if (mDialect == Dialect::SqlServer || mDialect == Dialect::Standard) {
            mOut += u"\nOFFSET " + offset + u" ROWS";
            if (statement.limit)
                mOut += u"\nFETCH NEXT " + platform::decimal(*statement.limit) + u" ROWS ONLY";
            return;
        }
        if (statement.limit)
            mOut += u"\nLIMIT " + platform::decimal(*statement.limit);
        else if (mDialect == Dialect::SQLite)
            mOut += u"\nLIMIT -1";
        else if (mDialect == Dialect::MySQL)
            mOut += u"\nLIMIT 18446744073709551615";
        if (statement.offset == 0) return;
        mOut += statement.limit || mDialect != Dialect::PostgreSQL ? u" " : u"\n";
        mOut += u"OFFSET " + offset;
    }

    void condition(const Expression& expression, Tightness around) {
        std::visit([&](const auto& part) { write(part, around); }, expression.node);
    }

    /// The terms of a top-level And or Or, a line each; anything else on one line.
    void terms(const Expression& expression, StringView lineBreak, Tightness around) {
        if (const auto* all = std::get_if<And>(&expression.node))
            joined(all->terms, u"AND ", lineBreak, Tightness::conjunction);
        else if (const auto* any = std::get_if<Or>(&expression.node))
            joined(any->terms, u"OR ", lineBreak, Tightness::predicate);
        else
            condition(expression, around);
    }

    void joined(const std::vector<Node>& parts, StringView word, StringView lineBreak,
                Tightness inner) {
        bool first = true;
        for (const auto& part : parts) {
            if (!first) {
                mOut += lineBreak;
                mOut += word;
            }
            first = false;
            condition(*part, inner);
        }
    }

    void parenthesised(const std::vector<Node>& parts, StringView word, Tightness inner,
                       bool parentheses) {
        if (parentheses) mOut += u'(';
        joined(parts, word, u" ", inner);
        if (parentheses) mOut += u')';
    }

    void write(const ColumnRef& reference, Tightness) { column(reference); }

    void write(const Value& value, Tightness) {
        if (mForm == ValueForm::literal) {
            mOut += literal(value, mDialect);
            return;
        }
        mOut += placeholder(value.type, mDialect);
        mBindings.push_back(value);
    }

    /// For showing, a parameter is shown by its name.
    void write(const Parameter& parameter, Tightness) {
        mBindings.push_back(parameter);
        if (mForm == ValueForm::bound) {
            // What the user will answer may be a fraction even where the column holds whole
            // numbers.
            const bool whole = parameter.type == ColumnType::Integer;
            mOut += placeholder(whole ? ColumnType::Decimal : parameter.type, mDialect);
            return;
        }
        mOut += u':';
        mOut += criteria::isBareName(parameter.name)
                    ? parameter.name
                    : identifier(parameter.name, Dialect::Standard);
    }

    void write(const Compare& compare, Tightness) {
        condition(*compare.left, Tightness::predicate);
        mOut += symbol(compare.comparison);
        condition(*compare.right, Tightness::predicate);
    }

    void write(const Like& like, Tightness) {
        likeOperand(*like.operand);
        mOut += like.negated ? u" NOT" : u"";
        // The other engines' Like takes no notice of case.
        mOut += mDialect == Dialect::PostgreSQL ? u" ILIKE " : u" LIKE ";
        bool escapes = true;
        if (const auto* value = std::get_if<Value>(&like.pattern->node)) {
            const String pattern = likePattern(value->text, mDialect);
            write(Value{ColumnType::Text, pattern}, Tightness::predicate);
            escapes = pattern.find(u'\\') != String::npos;
        } else {
            write(std::get<Parameter>(like.pattern->node), Tightness::predicate);
        }
        const bool byDefault = mDialect == Dialect::PostgreSQL || mDialect == Dialect::MySQL;
        if (escapes && !byDefault) mOut += u" ESCAPE '\\'";
    }

    /// PostgreSQL matches nothing but text, and what type the column has may be unknown here.
    void likeOperand(const Expression& operand) {
        const auto* reference = std::get_if<ColumnRef>(&operand.node);
        const bool cast =
            mDialect == Dialect::PostgreSQL && reference && reference->type == ColumnType::Unknown;
        if (cast) mOut += u"CAST(";
        condition(operand, Tightness::predicate);
        if (cast) mOut += u" AS text)";
    }

    void write(const Between& between, Tightness) {
        condition(*between.operand, Tightness::predicate);
        mOut += between.negated ? u" NOT BETWEEN " : u" BETWEEN ";
        condition(*between.low, Tightness::predicate);
        mOut += u" AND ";
        condition(*between.high, Tightness::predicate);
    }

    void write(const In& in, Tightness) {
        condition(*in.operand, Tightness::predicate);
        mOut += in.negated ? u" NOT IN (" : u" IN (";
        const char16_t* separator = u"";
        for (const auto& item : in.list) {
            mOut += separator;
            condition(*item, Tightness::predicate);
            separator = u", ";
        }
        mOut += u')';
    }

    void write(const IsNull& isNull, Tightness) {
        condition(*isNull.operand, Tightness::predicate);
        mOut += isNull.negated ? u" IS NOT NULL" : u" IS NULL";
    }

    void write(const Not& inverse, Tightness) {
        mOut += u"NOT (";
        condition(*inverse.operand, Tightness::disjunction);
        mOut += u')';
    }

    void write(const And& all, Tightness around) {
        parenthesised(all.terms, u"AND ", Tightness::conjunction, around > Tightness::conjunction);
    }

    void write(const Or& any, Tightness around) {
        // An And within an Or needs no parentheses; people who read it do.
        parenthesised(any.terms, u"OR ", Tightness::predicate, around > Tightness::disjunction);
    }

    const Dialect mDialect;
    const ValueForm mForm;
    String mOut;
    std::vector<Binding> mBindings;
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
