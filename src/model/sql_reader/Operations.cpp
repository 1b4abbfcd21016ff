#include "model/sql_reader/ValueReader.h"

#include "model/criteria/Writer.h"
#include "model/sql_reader/Forms.h"
#include "model/sql_reader/LikePattern.h"
#include "model/sql_reader/Refused.h"
#include "model/sql_reader/TreeChecks.h"
#include "model/sql_reader/ValuePass.h"

#include <Zandor/model/Names.h>

namespace zandor::sql_reader {

using model::ColumnType;
using model::sameName;

String ValueReader::operation(const Tree& tree, Pass& pass) const {
    tree.only({"kind", "name", "lexpr", "rexpr"});
    const std::string_view kind = tree.word("kind");
    const String symbol = operatorOf(tree);
    if (kind == "AEXPR_OP") {
        if (tree.node("rexpr").is("SubLink")) refusePart<MessageCode::aSubSelect>(tree.place());
        if (!tree.has("lexpr")) {
            if (symbol == u"-") return u"(-" + text(tree.node("rexpr"), pass) + u')';
            if (symbol == u"+") return text(tree.node("rexpr"), pass);
            refuse<MessageCode::unknownOperator>(tree.place(), symbol);
        }
        for (const StringView each : {u"=", u"<>", u"<", u">", u"<=", u">="})
            if (symbol == each) return comparison(tree, each, pass);
        if (symbol == u"/") return division(tree, pass);
        for (const StringView each : {u"+", u"-", u"*"})
            if (symbol == each) return arithmetic(tree, each, pass);
        // MySQL's || is an OR.
        if (symbol == u"||" && mDialect != Dialect::MySQL && mDialect != Dialect::SqlServer) {
            for (const char* side : {"lexpr", "rexpr"})
                if (typeOf(tree.node(side), pass) == ColumnType::Boolean)
                    refuse<MessageCode::unknownOperator>(tree.place(), symbol);
            return u'(' + text(tree.node("lexpr"), pass) + u" & " + text(tree.node("rexpr"), pass) +
                   u')';
        }
    }
    if (kind == "AEXPR_LIKE" || kind == "AEXPR_ILIKE") return like(tree, pass);
    if (kind == "AEXPR_IN") {
        const Tree of = tree.node("lexpr");
        const Tree choices = tree.node("rexpr");
        String items;
        for (const Tree& item : choices.list("items")) {
            if (!items.empty()) items += u", ";
            items += side(item, of, pass);
        }
        return u'(' + text(of, pass) + (symbol == u"=" ? u" In (" : u" Not In (") + items + u"))";
    }
    if (kind == "AEXPR_BETWEEN" || kind == "AEXPR_NOT_BETWEEN") {
        const Tree of = tree.node("lexpr");
        const auto bounds = tree.node("rexpr").list("items");
        return u'(' + text(of, pass) + (kind == "AEXPR_BETWEEN" ? u" Between " : u" Not Between ") +
               side(bounds[0], of, pass) + u" And " + side(bounds[1], of, pass) + u')';
    }
    if (kind == "AEXPR_OP_ANY" || kind == "AEXPR_OP_ALL")
        refuse<MessageCode::unknownOperator>(tree.place(), symbol + u" ANY");
    if (kind == "AEXPR_DISTINCT" || kind == "AEXPR_NOT_DISTINCT")
        refuse<MessageCode::unknownOperator>(tree.place(), u"IS DISTINCT FROM");
    if (kind == "AEXPR_NULLIF") refuse<MessageCode::unknownFunction>(tree.place(), u"NULLIF");
    refuse<MessageCode::unknownOperator>(tree.place(), symbol);
}

String ValueReader::comparison(const Tree& tree, StringView symbol, Pass& pass) const {
    const Tree left = tree.node("lexpr");
    const Tree right = tree.node("rexpr");
    return u'(' + side(left, right, pass) + u' ' + String(symbol) + u' ' + side(right, left, pass) +
           u')';
}

/// What is compared with another.
String ValueReader::side(const Tree& tree, const Tree& other, Pass& pass) const {
    noteConverted(tree, other, pass);
    // A date beside a moment is made one by itself.
    if (const auto moment = momentOf(mDialect).match(tree)) {
        const Tree& date = moment->at(1);
        if (!isConstant(date, "sval") && typeOf(date, pass) == ColumnType::Date &&
            typeOf(other, pass) == ColumnType::Timestamp) {
            pass.dates.push_back(model::criteria::readExpression(text(date, pass), pass).value);
            return text(date, pass);
        }
    }
    if (const auto number = numberOfTruth(tree))
        if (typeOf(other, pass) == ColumnType::Boolean) return *number ? u"True" : u"False";
    return text(tree, pass);
}

/// SQLite makes a number of a text only where a table's column is compared with it.
void ValueReader::noteConverted(const Tree& tree, const Tree& other, Pass& pass) const {
    if (!isConstant(tree, "sval") || !other.is("ColumnRef")) return;
    const auto column = columnMeant(other);
    const auto* from = column ? mScope.tableNamed(column->table) : nullptr;
    if (from && from->isStored) pass.others.push_back(tree.part("sval").text("sval"));
}

String ValueReader::arithmetic(const Tree& tree, StringView symbol, Pass& pass) const {
    Tree left = tree.node("lexpr");
    const Tree right = tree.node("rexpr");
    // What the printer adds so that a product has room.
    if (symbol == u"*" && isCastTo(left, {u"int8"}) &&
        typeOf(left.node("arg"), pass) == ColumnType::Integer &&
        typeOf(right, pass) == ColumnType::Integer)
        left = left.node("arg");
    const ColumnType one = typeOf(left, pass);
    const ColumnType two = typeOf(right, pass);
    StringView word = symbol;
    if (mDialect == Dialect::SqlServer && symbol == u"+" &&
        (one == ColumnType::Text || two == ColumnType::Text))
        word = u"&";
    const auto isMoment = [](ColumnType type) {
        return type == ColumnType::Date || type == ColumnType::Timestamp ||
               type == ColumnType::Time;
    };
    // Days are added to dates by an operator nowhere else.
    const bool dates = isMoment(one) || isMoment(two);
    const bool asWell = mDialect == Dialect::PostgreSQL && one != ColumnType::Timestamp &&
                        two != ColumnType::Timestamp;
    if (dates && !asWell) refuse<MessageCode::unknownOperator>(tree.place(), symbol);
    return u'(' + text(left, pass) + u' ' + String(word) + u' ' + text(right, pass) + u')';
}

String ValueReader::division(const Tree& tree, Pass& pass) const {
    const Tree left = tree.node("lexpr");
    const Tree right = tree.node("rexpr");
    const auto divided = [&](const Tree& by, const Tree& with) {
        return u'(' + text(by, pass) + u" / " + text(with, pass) + u')';
    };
    if (mDialect == Dialect::MySQL) {
        if (isOperation(left, u"*") && isScale(left.node("rexpr")))
            return divided(left.node("lexpr"), right);
        refuse<MessageCode::otherDivision>(tree.place(), u"x * 1e0 / y");
    }
    const bool cast = isCastTo(left, {u"float4", u"float8", u"double", u"real"});
    if (mDialect == Dialect::SQLite) {
        if (cast) return divided(left.node("arg"), right);
        if (isReal(left) || isReal(right)) return divided(left, right);
        refuse<MessageCode::otherDivision>(tree.place(), u"CAST(x AS REAL) / y");
    }
    const bool guarded = right.is("A_Expr") && right.word("kind") == "AEXPR_NULLIF" &&
                         isConstant(right.node("rexpr"), "ival") && !isNotZero(right.node("rexpr"));
    if (cast && !isCastTo(left, {u"float4"}) && (guarded || isNotZero(right)))
        return divided(left.node("arg"), guarded ? right.node("lexpr") : right);
    refuse<MessageCode::otherDivision>(tree.place(), mDialect == Dialect::SqlServer
                                                         ? u"CAST(x AS float) / NULLIF(y, 0)"
                                                         : u"CAST(x AS double precision) / "
                                                           u"NULLIF(y, 0)");
}

String ValueReader::like(const Tree& tree, Pass& pass) const {
    const bool negated = operatorOf(tree).front() == u'!';
    Tree pattern = tree.node("rexpr");
    const bool byDefault = mDialect == Dialect::PostgreSQL || mDialect == Dialect::MySQL;
    char16_t escape = byDefault ? u'\\' : u'\0';
    if (pattern.is("FuncCall") && sameName(pattern.names("funcname").back(), u"like_escape")) {
        const auto arguments = pattern.list("args");
        const String sign =
            isConstant(arguments[1], "sval") ? arguments[1].part("sval").text("sval") : String();
        if (sign.size() != 1) refuse<MessageCode::unknownOperator>(tree.place(), u"LIKE");
        escape = sign.front();
        pattern = arguments[0];
    }
    const bool tellsCase = mDialect == Dialect::PostgreSQL && tree.word("kind") == "AEXPR_LIKE";
    String right;
    if (isConstant(pattern, "sval")) {
        const String content = pattern.part("sval").text("sval");
        if (tellsCase && hasCase(content)) refuse<MessageCode::caseOfLike>(tree.place());
        right = quoted(
            model::criteria::typedPattern(likePattern(content, escape, mDialect, pattern.place())));
    } else if (pattern.is("ParamRef") && !tellsCase) {
        right = parameter(pattern);
    } else {
        refuse<MessageCode::unknownOperator>(pattern.place(), u"LIKE");
    }
    return u'(' + text(tree.node("lexpr"), pass) + (negated ? u" Not Like " : u" Like ") + right +
           u')';
}

} // namespace zandor::sql_reader
