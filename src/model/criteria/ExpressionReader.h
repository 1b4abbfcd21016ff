#pragma once

#include "model/criteria/NameReader.h"
#include "model/criteria/Signatures.h"

namespace zandor::model::criteria {

/// Reads an expression: values, names and functions with operators between them, typed. The cursor
/// must be in the mode of expressions.
class ExpressionReader {
public:
    ExpressionReader(Cursor& cursor, NameReader& names) : mCursor(cursor), mNames(names) {}

    /// All of it, conditions among it.
    sql::Node expression();
    /// A value without comparisons.
    sql::Node value();
    /// The rest of a value that begins with one that was read already.
    sql::Node valueFrom(sql::Node first);
    /// The rest of a condition whose left side was read already; the left side itself where there
    /// is no more.
    sql::Node conditionFrom(sql::Node left);

private:
    sql::Node conjunction();
    sql::Node negation();
    sql::Node joinedFrom(sql::Node first);
    sql::Node sum();
    sql::Node sumFrom(sql::Node first);
    sql::Node product();
    sql::Node productFrom(sql::Node first);
    sql::Node factor();
    sql::Node primary();
    sql::Node word();
    sql::Node call();
    sql::Node choice();
    sql::Node argument(const Signature& signature, std::size_t position);
    sql::Node like(sql::Node left, bool negated);
    sql::Node between(sql::Node left, bool negated);
    sql::Node in(sql::Node left, bool negated);

    sql::Node arithmetic(sql::Operator symbol, sql::Node left, const Token& at, sql::Node right);
    sql::Node condition();
    void close();

    Cursor& mCursor;
    NameReader& mNames;
};

/// A value or parameter that takes the type of what it stands beside, where it can; all else as it
/// is.
sql::Node typed(sql::Node node, ColumnType type);

/// Two values of kinds that can be compared: each typed by the other, a date beside a moment made
/// one. Throws an Error at a token's place where they cannot.
void pair(sql::Node& left, sql::Node& right, const Token& at);

/// The operator of a comparison's token.
sql::Comparison comparisonOf(StringView symbol);

} // namespace zandor::model::criteria
