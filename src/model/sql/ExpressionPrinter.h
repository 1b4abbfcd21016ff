#pragma once

#include "model/sql/ShellNames.h"

#include <unordered_set>

namespace zandor::model::sql {

/// How tightly a part holds together; one that holds more loosely than its surroundings is put in
/// parentheses.
enum class Tightness { disjunction, conjunction, predicate, joined, sum, product, factor };

/// What a dialect makes of a statement, written piece by piece.
struct Output {
    Dialect dialect;
    ValueForm form;
    ShellNames names{}; ///< where the form is that of the engine's shell
    String text{};
    std::vector<Binding> bindings{};
    std::size_t commentEnd = 0; ///< of the newest comment; 0: none
    bool countsTruth = false;   ///< writes 1 and 0 for true and false

    /// A name in the dialect's quotes. Throws a Refusal where it cannot carry it.
    void name(StringView name);
    void column(const ColumnRef& column);
};

/// A condition in pieces for a line each.
struct TermLines {
    std::vector<Node> terms; ///< those of an And or Or, else the condition itself
    StringView word;         ///< before each but the first
    Tightness around;        ///< each of them
};
TermLines termLinesOf(const Node& condition);

/// Writes conditions and values.
class ExpressionPrinter {
public:
    explicit ExpressionPrinter(Output& output) : mOut(output) {}

    /// What is here is written with its values in it, so that an engine sees that it stands in
    /// several places.
    void writeOut(const std::vector<Node>& nodes) {
        for (const Node& node : nodes) mWrittenOut.insert(node.get());
    }

    /// From now on conditions are on rows that were put together by these.
    void standBehind(const std::vector<Node>& groups) { mGroups = &groups; }

    /// What comes out as a column.
    void item(const Expression& expression);
    void condition(const Expression& expression, Tightness around);
    void value(const Expression& expression, Tightness around);

private:
    void parenthesised(const std::vector<Node>& parts, StringView word, Tightness inner,
                       bool parentheses);
    void any(const Expression& expression, Tightness around);
    bool asSmallest(const Expression& expression) const;
    void write(const ColumnRef& reference, Tightness around);
    void write(const Value& value, Tightness around);
    void write(const Parameter& parameter, Tightness around);
    void write(const Compare& compare, Tightness around);
    void write(const Like& like, Tightness around);
    void likeOperand(const Expression& operand);
    enum class Side { asItIs, untyped, asText };
    Side sideOf(const std::vector<Node>& operands, StringView ordering) const;
    void side(const Expression& operand, Side how);
    void write(const Between& between, Tightness around);
    void write(const In& in, Tightness around);
    void write(const IsNull& isNull, Tightness around);
    void write(const Not& inverse, Tightness around);
    void write(const And& all, Tightness around);
    void write(const Or& any, Tightness around);
    void write(const Operation& operation, Tightness around);
    bool needsRoom(const Operation& operation) const;
    void divide(const Operation& operation);
    void concatenate(const Operation& operation, Tightness around);
    void write(const Negative& negative, Tightness around);
    void write(const Call& call, Tightness around);
    void piece(const Call& call, StringView piece);
    void clamped(const Expression& number, StringView least);
    void write(const Choice& choice, Tightness around);
    void write(const Aggregate& aggregate, Tightness around);

    Output& mOut;
    std::unordered_set<const Expression*> mWrittenOut;
    bool mWritesOut = false;
    bool mInItem = false;
    const std::vector<Node>* mGroups = nullptr;
};

} // namespace zandor::model::sql
