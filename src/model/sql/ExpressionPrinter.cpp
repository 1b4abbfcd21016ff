#include "model/sql/ExpressionPrinter.h"

#include "model/criteria/Literals.h"
#include "model/criteria/Tokens.h"
#include "model/sql/PostgresTypes.h"
#include "model/sql/Templates.h"

#include <algorithm>
#include <utility>

namespace zandor::model::sql {

namespace {

StringView symbolOf(Comparison comparison) {
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

bool isZero(StringView number) {
    return number.find_first_of(u"123456789") >= number.find_first_of(u"eE");
}

/// A condition that is not put together of others.
bool isPredicate(const Expression& expression) {
    return isCondition(expression) && !std::holds_alternative<And>(expression.node) &&
           !std::holds_alternative<Or>(expression.node);
}

/// A placeholder of MySQL whose answer has room.
StringView roomFor(ColumnType type) {
    switch (type) {
    case ColumnType::Integer:
    case ColumnType::Boolean: return u"CAST(? AS SIGNED)";
    case ColumnType::Decimal: return u"CAST(? AS DOUBLE)";
    case ColumnType::Date: return u"CAST(? AS DATE)";
    case ColumnType::Time: return u"CAST(? AS TIME(6))";
    case ColumnType::Timestamp: return u"CAST(? AS DATETIME(6))";
    case ColumnType::Text:
    case ColumnType::Blob:
    case ColumnType::Unknown: break;
    }
    return u"CAST(? AS CHAR(100)) COLLATE utf8mb4_general_ci";
}

} // namespace

void Output::name(StringView name) {
    if (const auto why = cannotCarry(name, dialect)) throw Refusal{Refusal::Reason::name, *why};
    text += identifier(name, dialect);
}

void Output::column(const ColumnRef& column) {
    name(column.table);
    text += u'.';
    name(column.column);
}

void ExpressionPrinter::any(const Expression& expression, Tightness around) {
    // Some forms write their arguments twice, and those of these again.
    constexpr std::size_t longest = 1'000'000;
    if (mOut.text.size() > longest)
        throw Refusal{Refusal::Reason::size, say<MessageCode::statementTooLong>()};
    const bool outer = mWritesOut;
    mWritesOut = outer || mWrittenOut.contains(&expression);
    const bool within = isPredicate(expression) && around > Tightness::predicate;
    const bool smallest = asSmallest(expression);
    const auto* groups = smallest ? std::exchange(mGroups, nullptr) : mGroups;
    if (within) mOut.text += u'(';
    if (smallest) mOut.text += u"MIN(";
    std::visit([&](const auto& part) { write(part, smallest ? Tightness::disjunction : around); },
               expression.node);
    if (smallest) mOut.text += u')';
    if (within) mOut.text += u')';
    mGroups = groups;
    mWritesOut = outer;
}

/// MySQL knows no expression again behind GROUP BY, and PostgreSQL none with a placeholder in it;
/// of values that are all the same the smallest is that value.
bool ExpressionPrinter::asSmallest(const Expression& expression) const {
    if (!mGroups) return false;
    const bool mysql = mOut.dialect == Dialect::MySQL;
    const bool question = mOut.dialect == Dialect::PostgreSQL && holds<Parameter>(expression) &&
                          typeOf(expression) != ColumnType::Boolean;
    if (!mysql && !question) return false;
    return std::any_of(mGroups->begin(), mGroups->end(),
                       [&](const Node& group) { return same(group, Node(Node(), &expression)); });
}

/// Qt's driver for MySQL makes room for what comes out before the values are known, and finds no
/// rows where there is too little.
void ExpressionPrinter::item(const Expression& expression) {
    mInItem = mOut.dialect == Dialect::MySQL;
    value(expression, Tightness::disjunction);
    mInItem = false;
}

void ExpressionPrinter::condition(const Expression& expression, Tightness around) {
    // SQL Server has bits, and conditions, and takes none for the other.
    const bool bit = mOut.dialect == Dialect::SqlServer && !isCondition(expression);
    any(expression, bit ? Tightness::joined : around);
    if (bit) mOut.text += u" = 1";
}

void ExpressionPrinter::value(const Expression& expression, Tightness around) {
    if (mOut.dialect != Dialect::SqlServer || !isCondition(expression)) {
        any(expression, around);
        return;
    }
    mOut.text += u"CASE WHEN ";
    any(expression, Tightness::disjunction);
    mOut.text += u" THEN 1 WHEN NOT (";
    any(expression, Tightness::disjunction);
    mOut.text += u") THEN 0 END";
}

TermLines termLinesOf(const Node& condition) {
    if (const auto* all = std::get_if<And>(&condition->node))
        return {all->terms, u"AND ", Tightness::conjunction};
    if (const auto* any = std::get_if<Or>(&condition->node))
        return {any->terms, u"OR ", Tightness::predicate};
    return {{condition}, {}, Tightness::disjunction};
}

void ExpressionPrinter::parenthesised(const std::vector<Node>& parts, StringView word,
                                      Tightness inner, bool parentheses) {
    if (parentheses) mOut.text += u'(';
    bool first = true;
    for (const auto& part : parts) {
        if (!first) mOut.text += u' ' + String(word);
        first = false;
        condition(*part, inner);
    }
    if (parentheses) mOut.text += u')';
}

void ExpressionPrinter::write(const ColumnRef& reference, Tightness) { mOut.column(reference); }

void ExpressionPrinter::write(const Value& value, Tightness) {
    if (mOut.form != ValueForm::bound || mWritesOut || mInItem) {
        const bool counted = mOut.countsTruth && value.type == ColumnType::Boolean;
        mOut.text += !counted                ? literal(value, mOut.dialect)
                     : value.text == u"true" ? String(u"1")
                                             : String(u"0");
        return;
    }
    mOut.text += placeholder(value.type, mOut.dialect);
    mOut.bindings.emplace_back(value);
}

void ExpressionPrinter::write(const Parameter& parameter, Tightness) {
    if (mWritesOut)
        throw Refusal{Refusal::Reason::expression,
                      say<MessageCode::parameterInGroup>(parameter.name)};
    mOut.bindings.emplace_back(parameter);
    // What the user will answer may be a fraction even where the column holds whole numbers.
    const bool whole = parameter.type == ColumnType::Integer;
    const ColumnType type = whole ? ColumnType::Decimal : parameter.type;
    switch (mOut.form) {
    case ValueForm::bound:
        mOut.text += mInItem ? roomFor(type) : placeholder(type, mOut.dialect);
        break;
    case ValueForm::script:
        mOut.text += mOut.names.placeholder(parameter.name, type, mOut.dialect);
        break;
    case ValueForm::literal:
        mOut.text += u':';
        mOut.text += criteria::isBareName(parameter.name)
                         ? parameter.name
                         : identifier(parameter.name, Dialect::Standard);
    }
}

/// PostgreSQL compares only what it has an operator for. What is the same can be told by the texts
/// of two values, what is less cannot.
ExpressionPrinter::Side ExpressionPrinter::sideOf(const std::vector<Node>& operands,
                                                  StringView ordering) const {
    if (mOut.dialect != Dialect::PostgreSQL) return Side::asItIs;
    const auto holdValue = [&operands](auto&& which) {
        return std::any_of(operands.begin(), operands.end(), [&](const Node& operand) {
            const auto* const value = std::get_if<Value>(&operand->node);
            return value && which(value->type);
        });
    };
    const bool number = holdValue(criteria::isNumber);
    const bool fraction = holdValue([](ColumnType type) { return type == ColumnType::Decimal; });
    Side how = Side::asItIs;
    for (const Node& operand : operands) {
        const auto* const column = std::get_if<ColumnRef>(&operand->node);
        if (!column || column->type != ColumnType::Unknown) continue;
        using Numbers = PostgresComparing::Numbers;
        const PostgresComparing type = postgresComparing(column->declared);
        const bool refused = (number && type.numbers == Numbers::none) ||
                             (fraction && type.numbers == Numbers::whole);
        const bool asText = !type.equal || refused;
        if (!ordering.empty() && (asText || !type.ordered))
            throw Refusal{Refusal::Reason::expression,
                          say<MessageCode::noSuchFunction>(column->table + u"." + column->column +
                                                               String(ordering) + u"…",
                                                           nameOf(mOut.dialect))};
        if (asText) return Side::asText;
        if (number && type.numbers == Numbers::written) how = Side::untyped;
    }
    return how;
}

void ExpressionPrinter::side(const Expression& operand, Side how) {
    const auto* const number = std::get_if<Value>(&operand.node);
    if (how == Side::asItIs || (how == Side::untyped && !number)) {
        value(operand, Tightness::joined);
    } else if (number) {
        write(Value{ColumnType::Text, number->text}, Tightness::joined);
    } else {
        mOut.text += u"CAST(";
        value(operand, Tightness::disjunction);
        mOut.text += u" AS text)";
    }
}

void ExpressionPrinter::write(const Compare& compare, Tightness) {
    const bool equality =
        compare.comparison == Comparison::equal || compare.comparison == Comparison::notEqual;
    const StringView symbol = symbolOf(compare.comparison);
    const Side how = sideOf({compare.left, compare.right}, equality ? StringView() : symbol);
    side(*compare.left, how);
    mOut.text += symbol;
    side(*compare.right, how);
}

void ExpressionPrinter::write(const Like& like, Tightness) {
    likeOperand(*like.operand);
    mOut.text += like.negated ? u" NOT" : u"";
    // The other engines' Like takes no notice of case.
    mOut.text += mOut.dialect == Dialect::PostgreSQL ? u" ILIKE " : u" LIKE ";
    bool escapes = true;
    if (const auto* value = std::get_if<Value>(&like.pattern->node)) {
        const String pattern = likePattern(value->text, mOut.dialect);
        write(Value{ColumnType::Text, pattern}, Tightness::factor);
        escapes = pattern.find(u'\\') != String::npos;
    } else {
        write(std::get<Parameter>(like.pattern->node), Tightness::factor);
    }
    const bool byDefault = mOut.dialect == Dialect::PostgreSQL || mOut.dialect == Dialect::MySQL;
    if (escapes && !byDefault) mOut.text += u" ESCAPE '\\'";
}

/// PostgreSQL matches nothing but text, and what type the column has may be unknown here.
void ExpressionPrinter::likeOperand(const Expression& operand) {
    const auto* reference = std::get_if<ColumnRef>(&operand.node);
    const bool cast = mOut.dialect == Dialect::PostgreSQL && reference &&
                      (reference->type == ColumnType::Unknown || reference->declared == u"money");
    if (cast) mOut.text += u"CAST(";
    value(operand, Tightness::joined);
    if (cast) mOut.text += u" AS text)";
}

void ExpressionPrinter::write(const Between& between, Tightness) {
    const Side how = sideOf({between.operand, between.low, between.high}, u" Between ");
    side(*between.operand, how);
    mOut.text += between.negated ? u" NOT BETWEEN " : u" BETWEEN ";
    side(*between.low, how);
    mOut.text += u" AND ";
    side(*between.high, how);
}

void ExpressionPrinter::write(const In& in, Tightness) {
    std::vector<Node> operands = in.list;
    operands.push_back(in.operand);
    const Side how = sideOf(operands, {});
    side(*in.operand, how);
    mOut.text += in.negated ? u" NOT IN (" : u" IN (";
    const char16_t* separator = u"";
    for (const auto& item : in.list) {
        mOut.text += separator;
        side(*item, how);
        separator = u", ";
    }
    mOut.text += u')';
}

void ExpressionPrinter::write(const IsNull& isNull, Tightness) {
    value(*isNull.operand, Tightness::joined);
    mOut.text += isNull.negated ? u" IS NOT NULL" : u" IS NULL";
}

void ExpressionPrinter::write(const Not& inverse, Tightness) {
    mOut.text += u"NOT (";
    condition(*inverse.operand, Tightness::disjunction);
    mOut.text += u')';
}

void ExpressionPrinter::write(const And& all, Tightness around) {
    parenthesised(all.terms, u"AND ", Tightness::conjunction, around > Tightness::conjunction);
}

void ExpressionPrinter::write(const Or& any, Tightness around) {
    // An And within an Or needs no parentheses; people who read it do.
    parenthesised(any.terms, u"OR ", Tightness::predicate, around > Tightness::disjunction);
}

void ExpressionPrinter::write(const Operation& operation, Tightness around) {
    if (operation.symbol == Operator::concatenate) {
        concatenate(operation, around);
        return;
    }
    const bool sum = operation.symbol == Operator::add || operation.symbol == Operator::subtract;
    const Tightness own = sum ? Tightness::sum : Tightness::product;
    const bool within = around > own;
    if (within) mOut.text += u'(';
    if (operation.symbol == Operator::divide) {
        divide(operation);
    } else {
        const bool cast = needsRoom(operation);
        if (cast) mOut.text += u"CAST(";
        value(*operation.left, cast ? Tightness::disjunction : own);
        if (cast) mOut.text += u" AS bigint)";
        mOut.text += operation.symbol == Operator::add        ? u" + "
                     : operation.symbol == Operator::subtract ? u" - "
                                                              : u" * ";
        value(*operation.right, sum ? Tightness::product : Tightness::factor);
    }
    if (within) mOut.text += u')';
}

/// PostgreSQL and SQL Server multiply whole numbers into one of 32 bits, and stop where it is too
/// small; the other engines have 64.
bool ExpressionPrinter::needsRoom(const Operation& operation) const {
    const bool narrow = mOut.dialect == Dialect::PostgreSQL || mOut.dialect == Dialect::SqlServer;
    return narrow && operation.symbol == Operator::multiply &&
           operation.type == ColumnType::Integer &&
           !std::holds_alternative<Value>(operation.left->node) &&
           !std::holds_alternative<Value>(operation.right->node);
}

/// Whole numbers are divided as fractions, and by 0 into nothing, as SQLite and MySQL have it.
void ExpressionPrinter::divide(const Operation& operation) {
    const bool mysql = mOut.dialect == Dialect::MySQL;
    if (!mysql) mOut.text += u"CAST(";
    value(*operation.left, mysql ? Tightness::product : Tightness::disjunction);
    switch (mOut.dialect) {
    case Dialect::SQLite: mOut.text += u" AS REAL)"; break;
    case Dialect::MySQL: mOut.text += u" * 1e0"; break;
    case Dialect::SqlServer: mOut.text += u" AS float)"; break;
    case Dialect::PostgreSQL:
    case Dialect::Standard: mOut.text += u" AS double precision)"; break;
    }
    mOut.text += u" / ";
    const auto* number = std::get_if<Value>(&operation.right->node);
    const bool guarded =
        !mysql && mOut.dialect != Dialect::SQLite && !(number && !isZero(number->text));
    if (guarded) mOut.text += u"NULLIF(";
    value(*operation.right, guarded ? Tightness::disjunction : Tightness::factor);
    if (guarded) mOut.text += u", 0)";
}

/// Engines differ in how tightly they join texts, so the parts stand in parentheses of their own.
void ExpressionPrinter::concatenate(const Operation& operation, Tightness around) {
    const bool call = mOut.dialect == Dialect::MySQL;
    const bool within = !call && around > Tightness::joined;
    if (call) mOut.text += u"CONCAT";
    if (call || within) mOut.text += u'(';
    value(*operation.left, call ? Tightness::joined : Tightness::factor);
    mOut.text += call ? u", " : mOut.dialect == Dialect::SqlServer ? u" + " : u" || ";
    value(*operation.right, call ? Tightness::joined : Tightness::factor);
    if (call || within) mOut.text += u')';
}

void ExpressionPrinter::write(const Negative& negative, Tightness around) {
    const bool within = around > Tightness::product;
    // Two signs beside each other would begin a comment.
    mOut.text += within ? u"(-(" : u"-(";
    value(*negative.operand, Tightness::disjunction);
    mOut.text += within ? u"))" : u")";
}

void ExpressionPrinter::write(const Call& call, Tightness) {
    StringView form = templateOf(call.function, call.arguments.size(), mOut.dialect);
    if (form.empty())
        throw Refusal{
            Refusal::Reason::expression,
            say<MessageCode::noSuchFunction>(nameOf(call.function), nameOf(mOut.dialect))};
    while (!form.empty()) {
        const std::size_t open = std::min(form.find(u'{'), form.size());
        mOut.text += form.substr(0, open);
        form.remove_prefix(open);
        if (form.empty()) break;
        const std::size_t close = form.find(u'}');
        piece(call, form.substr(1, close - 1));
        form.remove_prefix(close + 1);
    }
}

void ExpressionPrinter::piece(const Call& call, StringView piece) {
    if (piece == u"*") {
        const char16_t* separator = u"";
        for (const Node& argument : call.arguments) {
            mOut.text += separator;
            value(*argument, Tightness::disjunction);
            separator = u", ";
        }
        return;
    }
    const Expression& argument = *call.arguments[static_cast<std::size_t>(piece[0] - u'1')];
    const StringView kind = piece.size() > 2 ? piece.substr(2) : StringView();
    if (kind.empty()) {
        value(argument, Tightness::disjunction);
    } else if (kind == u"tight") {
        value(argument, Tightness::factor);
    } else if (kind == u"digits") {
        mOut.text += std::get<Value>(argument.node).text;
    } else if (kind == u"moment") {
        const bool cast = typeOf(argument) == ColumnType::Unknown;
        if (cast) mOut.text += u"CAST(";
        value(argument, Tightness::joined);
        if (cast) mOut.text += u" AS timestamp)";
    } else {
        clamped(argument, kind);
    }
}

/// What is less than a number that a function takes stands for that number.
void ExpressionPrinter::clamped(const Expression& number, StringView least) {
    if (const auto* whole = std::get_if<Value>(&number.node)) {
        const bool below = whole->text.front() == u'-' || (least == u"1" && whole->text == u"0");
        // A number of digits only, of which an engine may take 32 bits and no text has more.
        constexpr std::size_t mostDigits = 9;
        const bool beyond = whole->text.size() > mostDigits;
        mOut.text += below ? String(least) : beyond ? String(mostDigits, u'9') : whole->text;
        return;
    }
    // GREATEST of PostgreSQL takes no notice of what is missing.
    if (mOut.dialect == Dialect::SQLite || mOut.dialect == Dialect::MySQL) {
        mOut.text += mOut.dialect == Dialect::SQLite ? u"MAX(" : u"GREATEST(";
        value(number, Tightness::disjunction);
        mOut.text += u", " + String(least) + u')';
        return;
    }
    const bool cast = mOut.dialect == Dialect::PostgreSQL;
    mOut.text += cast ? u"CAST(CASE WHEN " : u"CASE WHEN ";
    value(number, Tightness::joined);
    mOut.text += u" < " + String(least) + u" THEN " + String(least) + u" ELSE ";
    value(number, Tightness::joined);
    mOut.text += cast ? u" END AS integer)" : u" END";
}

void ExpressionPrinter::write(const Choice& choice, Tightness) {
    mOut.text += u"CASE WHEN ";
    condition(*choice.condition, Tightness::disjunction);
    mOut.text += u" THEN ";
    value(*choice.then, Tightness::disjunction);
    if (choice.otherwise) {
        mOut.text += u" ELSE ";
        value(*choice.otherwise, Tightness::disjunction);
    }
    mOut.text += u" END";
}

void ExpressionPrinter::write(const Aggregate& aggregate, Tightness) {
    // Its values are those of the rows before.
    const auto* groups = std::exchange(mGroups, nullptr);
    switch (aggregate.total) {
    case Total::Count: mOut.text += u"COUNT("; break;
    case Total::CountDifferent: mOut.text += u"COUNT(DISTINCT "; break;
    case Total::Sum: mOut.text += u"SUM("; break;
    case Total::Average: mOut.text += u"AVG("; break;
    case Total::Smallest: mOut.text += u"MIN("; break;
    default: mOut.text += u"MAX("; break;
    }
    // The average of whole numbers is none.
    const bool average = aggregate.total == Total::Average;
    const bool cast = average && mOut.dialect == Dialect::SqlServer;
    const bool scaled = average && mOut.dialect == Dialect::MySQL;
    if (!aggregate.operand) {
        mOut.text += u'*';
    } else {
        if (cast) mOut.text += u"CAST(";
        value(*aggregate.operand, scaled ? Tightness::product : Tightness::disjunction);
        if (cast) mOut.text += u" AS float)";
        if (scaled) mOut.text += u" * 1e0";
    }
    mOut.text += u')';
    mGroups = groups;
}

} // namespace zandor::model::sql
