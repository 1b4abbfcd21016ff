#include "model/sql_reader/TreeChecks.h"

#include <Zandor/model/Names.h>

#include <algorithm>

namespace zandor::sql_reader {

using model::sameName;

namespace {

String digitsOf(const Tree& number) { return number.part("fval").text("fval"); }

/// The parser has whole numbers beyond 32 bits among the others.
bool isFraction(const Tree& tree) {
    return isConstant(tree, "fval") && digitsOf(tree).find_first_of(u".eE") != String::npos;
}

} // namespace

bool isNamed(const Tree& type, std::initializer_list<StringView> names) {
    if (type.has("typmods") || type.has("arrayBounds")) return false;
    const auto all = type.names("names");
    return std::any_of(names.begin(), names.end(),
                       [&](StringView each) { return sameName(all.back(), each); });
}

bool isCastTo(const Tree& tree, std::initializer_list<StringView> types) {
    return tree.is("TypeCast") && isNamed(tree.part("typeName"), types);
}

String operatorOf(const Tree& tree) { return tree.names("name").back(); }

bool isOperation(const Tree& tree, StringView symbol) {
    return tree.is("A_Expr") && tree.word("kind") == "AEXPR_OP" && operatorOf(tree) == symbol;
}

bool isConstant(const Tree& tree, const char* kind) {
    return tree.is("A_Const") && tree.has(kind);
}

bool isScale(const Tree& tree) { return isFraction(tree) && sameName(digitsOf(tree), u"1e0"); }

bool isNotZero(const Tree& tree) {
    if (isConstant(tree, "ival")) return tree.part("ival").number("ival") != 0;
    if (!isConstant(tree, "fval")) return false;
    const String digits = digitsOf(tree);
    return digits.find_first_of(u"123456789") < digits.find_first_of(u"eE");
}

bool isReal(const Tree& tree) {
    if (isFraction(tree) || isCastTo(tree, {u"float4", u"float8", u"double", u"real"})) return true;
    for (const StringView symbol : {u"+", u"-", u"*", u"/"})
        if (isOperation(tree, symbol))
            return (tree.has("lexpr") && isReal(tree.node("lexpr"))) || isReal(tree.node("rexpr"));
    return false;
}

} // namespace zandor::sql_reader
