#pragma once

#include <Zandor/model/Description.h>
#include <Zandor/model/export.h>

#include <memory>
#include <variant>
#include <vector>

/// The tree of a condition. It holds no SQL text: names and values are data, and a printer writes
/// them in a dialect, with the parentheses that they need.
namespace zandor::model::sql {

struct Expression;
using Node = std::shared_ptr<const Expression>;

/// A column of a table in the statement.
struct ColumnRef {
    String table; ///< the name under which the table stands in the statement
    String column;
    ColumnType type = ColumnType::Unknown;

    friend bool operator==(const ColumnRef&, const ColumnRef&) = default;
};

/// A constant. The text is canonical for its type: an integer "-42", a decimal "1.50" or "1e10",
/// a boolean "true" or "false", a date "2024-05-01", a time "10:30:00", a timestamp
/// "2024-05-01 10:30:00"; a text and an unknown are as they stand.
struct Value {
    ColumnType type = ColumnType::Text;
    String text;

    friend bool operator==(const Value&, const Value&) = default;
};

/// A value that is asked for before the statement runs.
struct Parameter {
    String name;
    ColumnType type = ColumnType::Unknown; ///< of the column that it is compared with
    bool pattern = false; ///< whether the value asked for is a pattern as people type them

    friend bool operator==(const Parameter&, const Parameter&) = default;
};

/// In the order of the joins' operator codes.
enum class Comparison { equal, notEqual, less, greater, lessEqual, greaterEqual };

struct Compare {
    Comparison comparison;
    Node left;
    Node right;
};

/// `pattern` is a Value or a Parameter of that kind. In a value's text % stands for any run and _
/// for any one character; a backslash makes the next character stand for itself. Letters match
/// without regard to case as far as the engine knows them.
struct Like {
    bool negated;
    Node operand;
    Node pattern;
};

struct Between {
    bool negated;
    Node operand;
    Node low;
    Node high;
};

struct In {
    bool negated;
    Node operand;
    std::vector<Node> list; ///< never empty
};

struct IsNull {
    bool negated;
    Node operand;
};

struct Not {
    Node operand;
};

struct And {
    std::vector<Node> terms; ///< two or more
};

struct Or {
    std::vector<Node> terms; ///< two or more
};

struct Expression {
    std::variant<ColumnRef, Value, Parameter, Compare, Like, Between, In, IsNull, Not, And, Or>
        node;
};

template <class Part>
Node make(Part part) {
    return std::make_shared<const Expression>(Expression{std::move(part)});
}

/// The terms under one And, respectively Or; a single term stands for itself. Terms that are of
/// the same kind themselves are taken apart. Nothing for no terms.
ZANDOR_MODEL_EXPORT Node allOf(std::vector<Node> terms);
ZANDOR_MODEL_EXPORT Node anyOf(std::vector<Node> terms);

} // namespace zandor::model::sql
