#include "model/sql_reader/Precedence.h"

#include "model/sql_reader/Refused.h"
#include "model/sql_reader/TreeChecks.h"

namespace zandor::sql_reader {

namespace {

/// SQLite's, the loosest first. What is no operator has the last one.
enum class Rank { either, both, inverse, equality, order, sum, product, joining, operand };

Rank rankOf(const Tree& tree) {
    if (tree.is("NullTest") || tree.is("BooleanTest")) return Rank::equality;
    if (tree.is("BoolExpr")) {
        const std::string_view word = tree.word("boolop");
        return word == "OR_EXPR" ? Rank::either : word == "AND_EXPR" ? Rank::both : Rank::inverse;
    }
    if (!tree.is("A_Expr")) return Rank::operand;
    if (tree.word("kind") == "AEXPR_NULLIF") return Rank::operand;
    if (tree.word("kind") != "AEXPR_OP") return Rank::equality;
    // A sign binds tighter than all between two operands.
    if (!tree.has("lexpr")) return Rank::operand;
    const String symbol = operatorOf(tree);
    if (symbol == u"=" || symbol == u"<>") return Rank::equality;
    if (symbol.front() == u'<' || symbol.front() == u'>') return Rank::order;
    if (symbol == u"+" || symbol == u"-") return Rank::sum;
    return symbol == u"||" ? Rank::joining : Rank::product;
}

std::size_t placeOfOperator(const Tree& tree) {
    return static_cast<std::size_t>(tree.number("location"));
}

/// The innermost parentheses around a byte, by where they begin.
std::size_t parenthesesAround(std::size_t byte, const ParserText& text) {
    std::size_t found = std::string::npos;
    for (const auto& each : text.parentheses)
        if (each.begin < byte && byte < each.end) found = each.begin;
    return found;
}

void checkOperand(const Tree& tree, const Tree& operand, bool first, const ParserText& text) {
    const Rank own = rankOf(tree);
    const Rank other = rankOf(operand);
    // What stands before its operand is not mistaken for a part of what stands before it.
    if (other > own || (first && other == own) || (!first && other == Rank::inverse)) return;
    const std::size_t place = placeOfOperator(operand);
    if (parenthesesAround(place, text) != parenthesesAround(placeOfOperator(tree), text)) return;
    refuse<MessageCode::otherPrecedence>(place);
}

} // namespace

void checkPrecedence(const Tree& tree, const ParserText& text) {
    const Rank own = rankOf(tree);
    // What joins conditions is loosest everywhere.
    if (own <= Rank::inverse || own == Rank::operand) return;
    if (tree.is("A_Expr")) checkOperand(tree, tree.node("lexpr"), true, text);
    if (tree.has("arg")) checkOperand(tree, tree.node("arg"), true, text);
    if (!tree.has("rexpr")) return;
    const Tree right = tree.node("rexpr");
    const bool bounds = right.is("List") && tree.word("kind") != "AEXPR_IN";
    if (!right.is("List")) checkOperand(tree, right, false, text);
    if (bounds)
        for (const Tree& bound : right.list("items")) checkOperand(tree, bound, false, text);
}

} // namespace zandor::sql_reader
