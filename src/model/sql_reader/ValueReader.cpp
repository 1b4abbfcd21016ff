#include "model/sql_reader/ValueReader.h"

#include "model/criteria/Parser.h"
#include "model/criteria/Tokens.h"
#include "model/criteria/Writer.h"
#include "model/sql/Simplify.h"
#include "model/sql_reader/Conditions.h"
#include "model/sql_reader/Forms.h"
#include "model/sql_reader/Precedence.h"
#include "model/sql_reader/Refused.h"
#include "model/sql_reader/Terms.h"
#include "model/sql_reader/TreeChecks.h"
#include "model/sql_reader/ValuePass.h"

#include <Zandor/model/Functions.h>
#include <Zandor/model/Names.h>

#include <algorithm>
#include <array>

namespace zandor::sql_reader {

using model::ColumnType;
using model::sameName;
using model::Total;
using model::criteria::inBrackets;

std::optional<Total> totalOf(const Tree& call) {
    if (!call.is("FuncCall")) return {};
    const String name = call.names("funcname").back();
    const bool rows = call.flag("agg_star");
    if (call.list("args").size() != (rows ? 0U : 1U)) return {};
    if (sameName(name, u"count"))
        return call.flag("agg_distinct") ? Total::CountDifferent : Total::Count;
    if (sameName(name, u"sum")) return Total::Sum;
    if (sameName(name, u"avg")) return Total::Average;
    if (sameName(name, u"min")) return Total::Smallest;
    if (sameName(name, u"max")) return Total::Largest;
    return {};
}

Node ValueReader::value(const Tree& tree) const {
    if (totalOf(tree)) {
        Node node = total(tree);
        mPlaces.emplace(node, tree.place());
        return node;
    }
    Pass pass(mScope);
    Node node = read(tree, pass);
    if (model::sql::holds<model::sql::Aggregate>(*node))
        refusePart<MessageCode::totalWithin>(tree.place());
    mPlaces.emplace(node, tree.place());
    return node;
}

std::vector<Node> ValueReader::conditions(const Tree& tree) const {
    std::vector<Node> all;
    if (tree.is("BoolExpr") && tree.word("boolop") == "AND_EXPR") {
        for (const Tree& term : tree.list("args"))
            for (Node& node : conditions(term)) all.push_back(std::move(node));
        return all;
    }
    Node node = columnsCompared(tree);
    if (!node) node = condition(tree);
    mPlaces.emplace(node, tree.place());
    // One that joins others may come apart.
    auto terms = termsOf(model::sql::simplified(node));
    if (std::erase_if(terms, holdsAlways) == 0) return {std::move(node)};
    return terms;
}

/// Each part with its place, for what is said of it.
Node ValueReader::condition(const Tree& tree) const {
    const std::string_view joins = tree.is("BoolExpr") ? tree.word("boolop") : "";
    if (joins == "AND_EXPR" || joins == "OR_EXPR") {
        std::vector<Node> parts;
        for (const Tree& part : tree.list("args")) parts.push_back(condition(part));
        return joins == "AND_EXPR" ? model::sql::allOf(std::move(parts))
                                   : model::sql::anyOf(std::move(parts));
    }
    Pass pass(mScope);
    const Node node = read(tree, pass);
    if (!model::sql::isCondition(*node) && model::sql::typeOf(*node) != ColumnType::Boolean)
        refuse<MessageCode::criterionNotDrawn>(tree.place());
    Node asked = asCondition(node);
    mPlaces.emplace(asked, tree.place());
    return asked;
}

/// Two columns by an operator, whatever they hold: joins may compare what criteria may not.
Node ValueReader::columnsCompared(const Tree& tree) const {
    if (!tree.is("A_Expr") || tree.word("kind") != "AEXPR_OP" || !tree.has("lexpr")) return {};
    const auto column = [&](const char* side) -> Node {
        const Tree of = tree.node(side);
        if (!of.is("ColumnRef")) return {};
        const auto reading = [&]() -> Node {
            Pass pass(mScope);
            const Node value = model::criteria::readExpression(text(of, pass), pass).value;
            return value ? pass.filled(value) : value;
        }();
        const bool plain = reading && std::holds_alternative<ColumnRef>(reading->node);
        return plain ? reading : nullptr;
    };
    const String symbol = operatorOf(tree);
    constexpr std::array symbols =
        std::to_array<StringView>({u"=", u"<>", u"<", u">", u"<=", u">="});
    const auto at = std::find(symbols.begin(), symbols.end(), symbol);
    if (at == symbols.end()) return {};
    Node left = column("lexpr");
    Node right = column("rexpr");
    if (!left || !right) return {};
    return model::sql::make(model::sql::Compare{
        static_cast<model::sql::Comparison>(at - symbols.begin()), left, right});
}

Node ValueReader::read(const Tree& tree, Pass& pass) const {
    const String typed = text(tree, pass);
    auto reading = model::criteria::readExpression(typed, pass);
    if (reading.error)
        refuse<MessageCode::notUnderstood>(blame(tree, pass), std::move(reading.error->message));
    if (!asksForTruth(reading.value)) refuse<MessageCode::criterionNotDrawn>(tree.place());
    if (mDialect == Dialect::SQLite) {
        checkMoments(reading.value, pass.texts, pass.dates, tree.place());
        checkTexts(reading.value, pass.texts, pass.others, tree.place());
    }
    return pass.filled(reading.value);
}

/// Where the smallest part stands that is no expression.
std::size_t ValueReader::blame(const Tree& tree, Pass& pass) const {
    std::vector<Tree> below;
    for (const char* name : {"lexpr", "rexpr", "arg"})
        if (tree.has(name) && tree.node(name).kind() != "List") below.push_back(tree.node(name));
    for (const char* name : {"args"})
        for (const Tree& each : tree.list(name))
            if (!each.is("CaseWhen")) below.push_back(each);
    for (const Tree& each : below) {
        try {
            if (model::criteria::readExpression(text(each, pass), pass).error)
                return blame(each, pass);
        } catch (const Refused&) {
            continue; // it means something only where it stands
        }
    }
    return tree.place();
}

Node ValueReader::total(const Tree& tree) const {
    if (tree.has("over")) refusePart<MessageCode::aWindow>(tree.place());
    tree.only({"funcname", "args", "agg_star", "agg_distinct", "funcformat"});
    const Total total = *totalOf(tree);
    if (tree.flag("agg_distinct") && total != Total::CountDifferent)
        refusePart<MessageCode::totalWithin>(tree.place());
    Node operand;
    if (!tree.flag("agg_star")) {
        Tree of = tree.list("args").front();
        const bool average = total == Total::Average;
        // What the printer adds for an average that is a fraction.
        if (average && mDialect == Dialect::MySQL && isOperation(of, u"*") &&
            isScale(of.node("rexpr")))
            of = of.node("lexpr");
        const bool cast = average && isCastTo(of, {u"float8"});
        if (cast && mDialect == Dialect::SqlServer) of = of.node("arg");
        operand = value(of);
        if (average && mDialect == Dialect::SqlServer && !cast &&
            model::sql::typeOf(*operand) == ColumnType::Integer)
            refuse<MessageCode::otherDivision>(tree.place(), u"AVG(CAST(x AS float))");
        if (model::sql::holds<model::sql::Aggregate>(*operand))
            refusePart<MessageCode::totalWithin>(tree.place());
    }
    const ColumnType type = operand ? model::sql::typeOf(*operand) : ColumnType::Unknown;
    return model::sql::make(
        model::sql::Aggregate{total, std::move(operand), model::typeOf(total, type)});
}

String ValueReader::text(const Tree& tree, Pass& pass) const {
    const auto known = pass.known.find(&tree.json());
    if (known != pass.known.end()) return known->second;

    constexpr int deepest = 100;
    struct Deeper {
        explicit Deeper(int& depth) : depth(++depth) {}
        ~Deeper() { --depth; }
        int& depth;
    } const deeper(pass.depth);
    if (pass.depth > deepest) refuse<MessageCode::tooDeep>(tree.place());

    String text = newText(tree, pass);
    if (auto error = model::criteria::unusable(text))
        refuse<MessageCode::notUnderstood>(tree.place(), std::move(error->message));
    return pass.known.emplace(&tree.json(), std::move(text)).first->second;
}

String ValueReader::newText(const Tree& tree, Pass& pass) const {
    if (mDialect == Dialect::SQLite) checkPrecedence(tree, mText);
    if (tree.is("A_Const")) {
        String written = constant(tree);
        if (tree.has("sval"))
            pass.texts.push_back(tree.part("sval").text("sval"));
        else
            pass.others.push_back(written);
        return written;
    }
    if (tree.is("ColumnRef")) return column(tree, pass);
    if (tree.is("ParamRef")) return parameter(tree);
    if (tree.is("SubLink")) refusePart<MessageCode::aSubSelect>(tree.place());
    if (auto moment = momentWritten(tree, pass)) return *moment;
    if (auto known = byForm(tree, pass)) return *known;
    if (tree.is("TypeCast")) return cast(tree);
    if (tree.is("A_Expr")) return operation(tree, pass);
    if (tree.is("BoolExpr")) {
        tree.only({"boolop", "args"});
        if (tree.word("boolop") == "AND_EXPR") return joined(tree, u" And ", pass);
        if (tree.word("boolop") == "OR_EXPR") return joined(tree, u" Or ", pass);
        return u"(Not (" + truth(tree.list("args").front(), pass) + u"))";
    }
    if (tree.is("NullTest")) {
        tree.only({"arg", "nulltesttype", "argisrow"});
        return u'(' + text(tree.node("arg"), pass) +
               (tree.word("nulltesttype") == "IS_NULL" ? u" Is Null)" : u" Is Not Null)");
    }
    if (tree.is("CaseExpr")) return choice(tree, pass);
    if (tree.is("CoalesceExpr")) {
        tree.only({"args"});
        return u"Coalesce(" + list(tree, "args", pass) + u')';
    }
    if (tree.is("FuncCall")) return call(tree, pass);
    refuse<MessageCode::noPlaceFor>(tree.place(),
                                    model::say<MessageCode::thisPart>(tree.sqlName()));
}

String ValueReader::constant(const Tree& tree) const {
    tree.only({"ival", "fval", "sval", "boolval", "bsval", "isnull"});
    if (tree.has("isnull")) refuse<MessageCode::nullValue>(tree.place());
    if (tree.has("ival")) {
        const std::int64_t number = tree.part("ival").number("ival");
        const String digits = platform::decimal(number);
        return number < 0 ? u'(' + digits + u')' : digits;
    }
    if (tree.has("fval")) {
        const String digits = tree.part("fval").text("fval");
        return digits.front() == u'-' ? u'(' + digits + u')' : digits;
    }
    if (tree.has("boolval")) return tree.part("boolval").flag("boolval") ? u"True" : u"False";
    if (tree.has("bsval")) return u"x'" + tree.part("bsval").text("bsval").substr(1) + u'\'';
    return quoted(tree.part("sval").text("sval"));
}

/// Nothing where what comes out under that name is meant.
std::optional<ColumnRef> ValueReader::columnMeant(const Tree& tree) const {
    std::vector<String> names;
    for (const Tree& field : tree.list("fields")) {
        if (!field.is("String")) refuse<MessageCode::notUnderstood>(tree.place(), u"*");
        names.push_back(field.text("sval"));
    }
    String table;
    if (names.size() > 1)
        table = mScope.source({names.begin(), names.end() - 1}, tree.place()).alias;
    else if (mAliases.contains(model::foldedName(names.back())) &&
             !mScope.find(names.back(), tree.place()))
        return {};
    return mScope.column(table, names.back(), tree.place());
}

String ValueReader::column(const Tree& tree, Pass& pass) const {
    if (const auto found = columnMeant(tree))
        return inBrackets(found->table) + u'.' + inBrackets(found->column);
    return text(mAliases.at(model::foldedName(tree.list("fields").back().text("sval"))), pass);
}

String ValueReader::parameter(const Tree& tree) const {
    const std::int64_t number = tree.number("number");
    String name = number >= 1 && static_cast<std::size_t>(number) <= mText.parameters.size()
                      ? mText.parameters[static_cast<std::size_t>(number) - 1]
                      : platform::decimal(number);
    return model::criteria::isBareName(name) ? u':' + name : inBrackets(name);
}

/// A date, time or moment, or bytes, written out: a text by its type.
std::optional<String> ValueReader::momentWritten(const Tree& tree, Pass& pass) const {
    // SQLite has none, and makes a number by such a cast.
    if (mDialect == Dialect::SQLite) return {};
    if (!tree.is("TypeCast") || !isConstant(tree.node("arg"), "sval")) return {};
    if (mText.keepsCasts && mText.text.compare(tree.place(), 4, "CAST") == 0) return {};
    const Tree type = tree.part("typeName");
    const String content = tree.node("arg").part("sval").text("sval");
    if (isNamed(type, {u"date", u"time", u"timestamp", u"datetime", u"datetime2"})) {
        pass.texts.push_back(content);
        return u'#' + content + u'#';
    }
    if (isNamed(type, {u"bytea"}) && content.starts_with(u"\\x"))
        return u"x'" + content.substr(2) + u'\'';
    return {};
}

String ValueReader::cast(const Tree& tree) const {
    tree.only({"arg", "typeName"});
    // A parameter takes its type from what it stands beside.
    if (tree.node("arg").is("ParamRef")) return parameter(tree.node("arg"));
    refuse<MessageCode::unknownCast>(tree.place());
}

ColumnType ValueReader::typeOf(const Tree& tree, Pass& pass) const {
    const auto known = pass.types.find(&tree.json());
    if (known != pass.types.end()) return known->second;
    const auto reading = model::criteria::readExpression(text(tree, pass), pass);
    const auto type = reading.value ? model::sql::typeOf(*reading.value) : ColumnType::Unknown;
    return pass.types.emplace(&tree.json(), type).first->second;
}

String ValueReader::joined(const Tree& tree, StringView word, Pass& pass) const {
    String out = u"(";
    for (const Tree& term : tree.list("args")) {
        if (out.size() > 1) out += word;
        out += truth(term, pass);
    }
    return out + u')';
}

/// What is asked whether it holds.
String ValueReader::truth(const Tree& tree, Pass& pass) const {
    if (const auto number = numberOfTruth(tree)) return *number ? u"True" : u"False";
    return text(tree, pass);
}

/// Elsewhere than in PostgreSQL truth is a number.
std::optional<bool> ValueReader::numberOfTruth(const Tree& tree) const {
    if (mDialect == Dialect::PostgreSQL || !isConstant(tree, "ival")) return {};
    const std::int64_t number = tree.part("ival").number("ival");
    if (number != 0 && number != 1) return {};
    return number == 1;
}

String ValueReader::choice(const Tree& tree, Pass& pass) const {
    tree.only({"arg", "args", "defresult"});
    String out;
    String close;
    for (const Tree& when : tree.list("args")) {
        const Tree condition = when.node("expr");
        if (!out.empty()) out += u", ";
        out += u"If(";
        if (tree.has("arg"))
            out += text(tree.node("arg"), pass) + u" = " + side(condition, tree.node("arg"), pass);
        else
            out += truth(condition, pass);
        out += u", " + text(when.node("result"), pass);
        close += u')';
    }
    const bool otherwise = tree.has("defresult") && !tree.node("defresult").has("isnull");
    if (otherwise) out += u", " + text(tree.node("defresult"), pass);
    return out + close;
}

String ValueReader::list(const Tree& tree, const char* name, Pass& pass) const {
    String out;
    for (const Tree& each : tree.list(name)) {
        if (!out.empty()) out += u", ";
        out += text(each, pass);
    }
    return out;
}

String ValueReader::call(const Tree& tree, Pass& pass) const {
    if (tree.has("over")) refusePart<MessageCode::aWindow>(tree.place());
    if (totalOf(tree)) return pass.nameFor(total(tree));
    const String name = tree.names("funcname").back();
    const auto arguments = tree.list("args");
    const auto isTruth = [&](const Tree& each) {
        return typeOf(each, pass) == ColumnType::Boolean;
    };
    if (mDialect == Dialect::MySQL && sameName(name, u"concat") && arguments.size() > 1 &&
        std::none_of(arguments.begin(), arguments.end(), isTruth)) {
        tree.only({"funcname", "args", "funcformat"});
        String out = u"(";
        for (const Tree& each : arguments) {
            if (out.size() > 1) out += u" & ";
            out += text(each, pass);
        }
        return out + u')';
    }
    refuse<MessageCode::unknownFunction>(tree.place(), name);
}

/// Whether true or false stands where a function takes something else: its words are texts in a
/// drawing, and numbers in most engines.
bool ValueReader::takesTruth(const Form& form, const std::map<int, Tree>& arguments,
                             Pass& pass) const {
    using model::sql::Function;
    const bool worded = mDialect == Dialect::PostgreSQL && form.function == Function::text;
    if (!form.function || form.function == Function::coalesce || worded) return false;
    return std::any_of(arguments.begin(), arguments.end(), [&](const auto& argument) {
        return typeOf(argument.second, pass) == ColumnType::Boolean;
    });
}

/// What has one of the forms that stand for a function; the first that comes to it.
std::optional<String> ValueReader::byForm(const Tree& tree, Pass& pass) const {
    if (!tree.is("FuncCall") && !tree.is("TypeCast") && !tree.is("A_Expr") &&
        !tree.is("SQLValueFunction") && !tree.is("CaseExpr"))
        return {};
    for (const Form& form : formsOf(mDialect)) {
        const auto arguments = form.match(tree);
        if (!arguments || takesTruth(form, *arguments, pass)) continue;
        const bool addsDays = form.function == model::sql::Function::addDays ||
                              form.function == model::sql::Function::addDaysLater;
        String out;
        for (std::size_t at = 0; at < form.expression.size(); ++at) {
            if (form.expression[at] != u'{') {
                out += form.expression[at];
                continue;
            }
            const Tree& argument = arguments->at(form.expression[at + 1] - u'0');
            // SQLite writes a date as a text, which cannot be told from others elsewhere.
            const bool date = addsDays && isConstant(argument, "sval");
            const String typed = text(argument, pass);
            out += date ? u'#' + typed.substr(1, typed.size() - 2) + u'#' : typed;
            at += 2;
        }
        if (!form.function || *form.function == model::sql::Function::text) return out;
        const auto reading = model::criteria::readExpression(out, pass);
        const auto* call =
            reading.value ? std::get_if<model::sql::Call>(&reading.value->node) : nullptr;
        if (reading.error || (call && call->function == *form.function)) return out;
    }
    return {};
}

} // namespace zandor::sql_reader
