#pragma once

#include <Zandor/model/Description.h>
#include <Zandor/model/Total.h>
#include <Zandor/model/export.h>

#include <memory>
#include <variant>
#include <vector>

/// The tree of a condition or of a value. It holds no SQL text: names and values are data, and a
/// printer writes them in a dialect, with the parentheses that they need.
namespace zandor::model::sql {

struct Expression;
using Node = std::shared_ptr<const Expression>; ///< A part of a tree; shared, and never changed

/// A column of a table in the statement.
struct ColumnRef {
    String table;  ///< the name under which the table stands in the statement
    String column; ///< its name
    ColumnType type = ColumnType::Unknown; ///< of its values
    String declared = {};                  ///< its type in the database's words; may be empty

    friend bool operator==(const ColumnRef&, const ColumnRef&) = default;
};

/// A constant. The text is canonical for its type: an integer "-42", a decimal "1.50" or "1e10",
/// a boolean "true" or "false", a date "2024-05-01", a time "10:30:00", a timestamp
/// "2024-05-01 10:30:00", bytes "0AFF" in hexadecimal digits; a text and an unknown are as they
/// stand.
struct Value {
    ColumnType type = ColumnType::Text; ///< of the constant
    String text;                        ///< canonical

    friend bool operator==(const Value&, const Value&) = default;
};

/// A value that is asked for before the statement runs.
struct Parameter {
    String name;                           ///< what the one who runs the statement is asked for
    ColumnType type = ColumnType::Unknown; ///< of the column that it is compared with
    bool pattern = false; ///< whether the value asked for is a pattern as people type them

    friend bool operator==(const Parameter&, const Parameter&) = default;
};

/// In the order of the joins' operator codes.
enum class Comparison { equal, notEqual, less, greater, lessEqual, greaterEqual };

/// The one that says the same of two values that have changed places.
ZANDOR_MODEL_EXPORT Comparison mirrored(Comparison comparison);

/// Two values by an operator.
struct Compare {
    Comparison comparison; ///< the operator
    Node left;             ///< before it
    Node right;            ///< behind it
};

/// `pattern` is a Value or a Parameter of that kind. In a value's text % stands for any run and _
/// for any one character; a backslash makes the next character stand for itself. Letters match
/// without regard to case as far as the engine knows them.
struct Like {
    bool negated; ///< NOT LIKE
    Node operand; ///< what is compared
    Node pattern; ///< with what
};

/// A value within two bounds, these included.
struct Between {
    bool negated; ///< outside them
    Node operand; ///< the value
    Node low;     ///< the lower bound
    Node high;    ///< the upper bound
};

/// A value among others.
struct In {
    bool negated;           ///< not among them
    Node operand;           ///< the value
    std::vector<Node> list; ///< never empty
};

/// No value at all.
struct IsNull {
    bool negated; ///< any value
    Node operand; ///< what is asked
};

/// The opposite of a condition.
struct Not {
    Node operand; ///< the condition
};

/// Conditions that hold together.
struct And {
    std::vector<Node> terms; ///< two or more
};

/// Conditions one of which holds.
struct Or {
    std::vector<Node> terms; ///< two or more
};

/// What joins two values into a third.
enum class Operator { add, subtract, multiply, divide, concatenate };

/// Two values by an operator. A division is one of fractions, and by 0 it gives nothing.
struct Operation {
    Operator symbol; ///< the operator
    Node left;       ///< before it
    Node right;      ///< behind it
    ColumnType type; ///< of the result
};

/// A number with the other sign.
struct Negative {
    Node operand; ///< the number
};

/// What can be asked of values; the three last have no name of their own in an expression.
enum class Function {
    round,        ///< a number to whole ones, or to decimals: a Value from 0 to 15
    abs,          ///< a number without its sign
    length,       ///< of a text, in characters
    upper,        ///< a text in capital letters
    lower,        ///< a text in small letters
    trim,         ///< a text without blanks at its ends
    left,         ///< the first characters of a text
    right,        ///< its last characters
    mid,          ///< those from one on, counted from 1; so many of them or all
    coalesce,     ///< the first of its arguments that is there
    year,         ///< of a date
    month,        ///< of a date
    day,          ///< of a date, in its month
    dateDiff,     ///< days from the first date to the second
    today,        ///< the date
    now,          ///< the date and time
    text,         ///< anything as text
    number,       ///< a text as number
    date,         ///< a text or moment as date
    moment,       ///< a date as its first moment
    addDays,      ///< a date and a number of days
    addDaysLater, ///< a moment and a number of days
};

/// What a function makes of its arguments.
struct Call {
    Function function;           ///< the function
    std::vector<Node> arguments; ///< as many as it takes
    ColumnType type;             ///< of the result
};

/// One value where a condition holds, another where it does not.
struct Choice {
    Node condition;  ///< what decides
    Node then;       ///< where it holds
    Node otherwise;  ///< elsewhere; nothing: no value
    ColumnType type; ///< of both
};

/// What is made of the values of the rows that are put together.
struct Aggregate {
    Total total;     ///< one that aggregates
    Node operand;    ///< the values; nothing: the rows themselves are counted
    ColumnType type; ///< of the result
};

/// One node of the tree.
struct Expression {
    std::variant<ColumnRef, Value, Parameter, Compare, Like, Between, In, IsNull, Not, And, Or,
                 Operation, Negative, Call, Choice, Aggregate>
        node; ///< what it is
};

template <class Part>
/// A node of one kind.
Node make(Part part) {
    return std::make_shared<const Expression>(Expression{std::move(part)});
}

/// The terms under one And, respectively Or; a single term stands for itself. Terms that are of
/// the same kind themselves are taken apart. Nothing for no terms.
ZANDOR_MODEL_EXPORT Node allOf(std::vector<Node> terms);
ZANDOR_MODEL_EXPORT Node anyOf(std::vector<Node> terms); ///< as allOf, under one Or

/// What a node's values are; Boolean for a condition.
ZANDOR_MODEL_EXPORT ColumnType typeOf(const Expression& expression);

/// Whether it is made by a comparison or by And, Or and Not, and is no value of a table or row.
ZANDOR_MODEL_EXPORT bool isCondition(const Expression& expression);

/// Whether two nodes say the same.
ZANDOR_MODEL_EXPORT bool same(const Node& left, const Node& right);

/// The nodes right below one, in the order in which they are written; none is nothing.
ZANDOR_MODEL_EXPORT std::vector<Node> partsOf(const Expression& expression);

/// The same with other nodes right below, as many and in the same order as partsOf has them.
ZANDOR_MODEL_EXPORT Node withParts(const Expression& expression, std::vector<Node> parts);

/// Whether a node of a kind is it, or stands below it.
template <class Kind>
bool holds(const Expression& expression) {
    if (std::holds_alternative<Kind>(expression.node)) return true;
    for (const Node& part : partsOf(expression))
        if (holds<Kind>(*part)) return true;
    return false;
}

} // namespace zandor::model::sql
