#include "model/criteria/ExpressionReader.h"

#include "model/criteria/Literals.h"

#include <Zandor/model/Names.h>

namespace zandor::model::criteria {

using sql::Node;

namespace {

bool isMoment(ColumnType type) { return type == ColumnType::Date || type == ColumnType::Timestamp; }

bool isUnknown(ColumnType type) { return type == ColumnType::Unknown; }

Node made(sql::Function function, std::vector<Node> arguments, ColumnType type) {
    return sql::make(sql::Call{function, std::move(arguments), type});
}

/// Anything as text; true and false by their words.
Node asText(Node node) {
    node = typed(std::move(node), ColumnType::Text);
    const ColumnType type = typeOf(*node);
    if (type == ColumnType::Text) return node;
    if (type != ColumnType::Boolean) return made(sql::Function::text, {node}, ColumnType::Text);
    const auto text = [](StringView word) {
        return sql::make(sql::Value{ColumnType::Text, String(word)});
    };
    return sql::make(sql::Choice{
        node, text(u"true"),
        sql::make(sql::Choice{sql::make(sql::Not{node}), text(u"false"), {}, ColumnType::Text}),
        ColumnType::Text});
}

/// A number with the other sign; one that is written out has it.
Node negative(Node node) {
    if (const auto* value = std::get_if<sql::Value>(&node->node)) {
        const bool signedAlready = value->text.front() == u'-';
        return sql::make(
            sql::Value{value->type, signedAlready ? value->text.substr(1) : u'-' + value->text});
    }
    return sql::make(sql::Negative{std::move(node)});
}

Node asMoment(Node node) {
    return made(sql::Function::moment, {std::move(node)}, ColumnType::Timestamp);
}

/// The one kind of two values of which either may come out.
ColumnType common(ColumnType left, ColumnType right) {
    if (left == right || isUnknown(right)) return left;
    return isUnknown(left) ? right : ColumnType::Decimal;
}

} // namespace

Node typed(Node node, ColumnType type) {
    if (const auto* parameter = std::get_if<sql::Parameter>(&node->node)) {
        if (!isUnknown(parameter->type)) return node;
        sql::Parameter known = *parameter;
        known.type = type;
        return sql::make(std::move(known));
    }
    const auto* value = std::get_if<sql::Value>(&node->node);
    if (!value || value->type == type || isUnknown(type)) return node;
    if (value->type != ColumnType::Text && !isMoment(value->type)) return node;
    if (type == ColumnType::Text) return node;
    if (auto known = literal(value->text, type)) return sql::make(std::move(*known));
    return node;
}

void pair(Node& left, Node& right, const Token& at) {
    left = typed(std::move(left), typeOf(*right));
    right = typed(std::move(right), typeOf(*left));
    const ColumnType one = typeOf(*left);
    const ColumnType other = typeOf(*right);
    if (one == other || comparable(one, other)) return;
    if (!isMoment(one) || !isMoment(other))
        throw Error{at.begin, say<MessageCode::incomparableValue>(nameOf(one))};
    Node& date = one == ColumnType::Date ? left : right;
    date = asMoment(std::move(date));
}

sql::Comparison comparisonOf(StringView symbol) {
    if (symbol == u"<>") return sql::Comparison::notEqual;
    if (symbol == u"<") return sql::Comparison::less;
    if (symbol == u">") return sql::Comparison::greater;
    if (symbol == u"<=") return sql::Comparison::lessEqual;
    if (symbol == u">=") return sql::Comparison::greaterEqual;
    return sql::Comparison::equal;
}

Node ExpressionReader::expression() {
    std::vector<Node> terms{conjunction()};
    while (mCursor.at(u"Or")) {
        mCursor.take();
        terms.push_back(conjunction());
    }
    return terms.size() == 1 ? terms.front() : sql::anyOf(std::move(terms));
}

Node ExpressionReader::conjunction() {
    std::vector<Node> terms{negation()};
    while (mCursor.takeKeyword(u"And")) terms.push_back(negation());
    return terms.size() == 1 ? terms.front() : sql::allOf(std::move(terms));
}

Node ExpressionReader::negation() {
    if (!mCursor.at(u"Not")) return conditionFrom(value());
    const Cursor::Nesting nesting(mCursor);
    mCursor.take();
    return sql::make(sql::Not{negation()});
}

/// What must be true or false.
Node ExpressionReader::condition() {
    const Token first = mCursor.peek();
    Node node = typed(expression(), ColumnType::Boolean);
    const ColumnType type = typeOf(*node);
    if (type != ColumnType::Boolean && !isUnknown(type))
        throw Error{first.begin, say<MessageCode::conditionExpected>()};
    return node;
}

Node ExpressionReader::conditionFrom(Node left) {
    const Token at = mCursor.peek();
    if (at.kind == TokenKind::comparison) {
        mCursor.take();
        Node right = value();
        pair(left, right, at);
        return sql::make(sql::Compare{comparisonOf(at.text), std::move(left), std::move(right)});
    }
    if (mCursor.takeKeyword(u"Is")) {
        const bool negated = mCursor.takeKeyword(u"Not");
        if (!mCursor.takeKeyword(u"Null")) mCursor.fail<MessageCode::nullMissing>();
        return sql::make(sql::IsNull{negated, std::move(left)});
    }
    const bool negated = mCursor.at(u"Not") && (mCursor.at(u"Like", 1) ||
                                                mCursor.at(u"Between", 1) || mCursor.at(u"In", 1));
    if (negated) mCursor.take();
    if (mCursor.at(u"Like")) return like(std::move(left), negated);
    if (mCursor.takeKeyword(u"Between")) return between(std::move(left), negated);
    if (mCursor.takeKeyword(u"In")) return in(std::move(left), negated);
    return left;
}

Node ExpressionReader::like(Node left, bool negated) {
    const Token word = mCursor.take();
    left = typed(std::move(left), ColumnType::Text);
    const ColumnType type = typeOf(*left);
    if (type != ColumnType::Text && !isUnknown(type))
        throw Error{word.begin, say<MessageCode::likeOnNoText>()};
    const Token first = mCursor.peek();
    if (first.kind == TokenKind::quoted) {
        mCursor.take();
        return sql::make(
            sql::Like{negated, std::move(left),
                      sql::make(sql::Value{ColumnType::Text, likePattern(first.text)})});
    }
    const Node asked = first.kind == TokenKind::bracketed && mCursor.peek(1).kind != TokenKind::dot
                           ? mNames.takeBracketed()
                           : mNames.takeParameter(false);
    const auto* parameter = asked ? std::get_if<sql::Parameter>(&asked->node) : nullptr;
    if (!parameter) throw Error{first.begin, say<MessageCode::patternMissing>()};
    sql::Parameter pattern = *parameter;
    pattern.type = ColumnType::Text;
    pattern.pattern = true;
    return sql::make(sql::Like{negated, std::move(left), sql::make(std::move(pattern))});
}

Node ExpressionReader::between(Node left, bool negated) {
    const Token at = mCursor.peek();
    Node low = value();
    if (!mCursor.takeKeyword(u"And")) mCursor.fail<MessageCode::secondValueMissing>();
    const Token second = mCursor.peek();
    Node high = value();
    pair(left, low, at);
    pair(left, high, second);
    pair(left, low, at); // the second may have made a moment of the left side
    return sql::make(sql::Between{negated, std::move(left), std::move(low), std::move(high)});
}

Node ExpressionReader::in(Node left, bool negated) {
    if (!mCursor.takeKind(TokenKind::open)) mCursor.fail<MessageCode::listMissing>();
    std::vector<Node> list;
    do {
        const Token at = mCursor.peek();
        list.push_back(value());
        pair(left, list.back(), at);
    } while (mCursor.takeKind(TokenKind::comma));
    if (!mCursor.takeKind(TokenKind::close)) mCursor.fail<MessageCode::listNotClosed>();
    return sql::make(sql::In{negated, std::move(left), std::move(list)});
}

Node ExpressionReader::value() { return joinedFrom(sum()); }

Node ExpressionReader::valueFrom(Node first) {
    return joinedFrom(sumFrom(productFrom(std::move(first))));
}

Node ExpressionReader::joinedFrom(Node first) {
    while (mCursor.peek().kind == TokenKind::symbol && mCursor.peek().text == u"&") {
        mCursor.take();
        Node right = sum();
        first = sql::make(sql::Operation{sql::Operator::concatenate, asText(std::move(first)),
                                         asText(std::move(right)), ColumnType::Text});
    }
    return first;
}

Node ExpressionReader::sum() { return sumFrom(product()); }

Node ExpressionReader::sumFrom(Node first) {
    while (mCursor.peek().kind == TokenKind::symbol &&
           (mCursor.peek().text == u"+" || mCursor.peek().text == u"-")) {
        const Token at = mCursor.take();
        Node right = product();
        first = arithmetic(at.text == u"+" ? sql::Operator::add : sql::Operator::subtract,
                           std::move(first), at, std::move(right));
    }
    return first;
}

Node ExpressionReader::product() { return productFrom(factor()); }

Node ExpressionReader::productFrom(Node first) {
    while (mCursor.peek().kind == TokenKind::symbol &&
           (mCursor.peek().text == u"*" || mCursor.peek().text == u"/")) {
        const Token at = mCursor.take();
        Node right = factor();
        first = arithmetic(at.text == u"*" ? sql::Operator::multiply : sql::Operator::divide,
                           std::move(first), at, std::move(right));
    }
    return first;
}

/// Numbers by an operator; days can be added to a date and taken from it, and a date from another.
Node ExpressionReader::arithmetic(sql::Operator symbol, Node left, const Token& at, Node right) {
    const bool adds = symbol == sql::Operator::add;
    const bool subtracts = symbol == sql::Operator::subtract;
    if (subtracts && isMoment(typeOf(*left))) right = typed(std::move(right), ColumnType::Integer);
    if (adds && isMoment(typeOf(*right)) && !isMoment(typeOf(*left))) std::swap(left, right);
    const ColumnType one = typeOf(*left);
    if (subtracts && isMoment(one) && isMoment(typeOf(*right)))
        return made(sql::Function::dateDiff, {std::move(right), std::move(left)},
                    ColumnType::Integer);
    if ((adds || subtracts) && isMoment(one)) {
        right = typed(std::move(right), ColumnType::Integer);
        const ColumnType days = typeOf(*right);
        if (days != ColumnType::Integer && !isUnknown(days))
            throw Error{at.begin, say<MessageCode::wholeExpected>()};
        if (subtracts) right = negative(std::move(right));
        const auto function =
            one == ColumnType::Date ? sql::Function::addDays : sql::Function::addDaysLater;
        return made(function, {std::move(left), std::move(right)}, one);
    }
    left = typed(std::move(left), ColumnType::Decimal);
    right = typed(std::move(right), ColumnType::Decimal);
    for (const Node& side : {left, right}) {
        const ColumnType type = typeOf(*side);
        if (isNumber(type) || isUnknown(type)) continue;
        if (adds && type == ColumnType::Text)
            throw Error{at.begin, say<MessageCode::textsAreJoined>()};
        throw Error{at.begin, say<MessageCode::numberExpected>()};
    }
    const bool whole = symbol != sql::Operator::divide && typeOf(*left) == ColumnType::Integer &&
                       typeOf(*right) == ColumnType::Integer;
    return sql::make(sql::Operation{symbol, std::move(left), std::move(right),
                                    whole ? ColumnType::Integer : ColumnType::Decimal});
}

Node ExpressionReader::factor() {
    const Token at = mCursor.peek();
    const bool minus = at.kind == TokenKind::symbol && at.text == u"-";
    if (!minus && !(at.kind == TokenKind::symbol && at.text == u"+")) return primary();
    const Cursor::Nesting nesting(mCursor);
    mCursor.take();
    Node node = typed(factor(), ColumnType::Decimal);
    const ColumnType type = typeOf(*node);
    if (!isNumber(type) && !isUnknown(type))
        throw Error{at.begin, say<MessageCode::numberExpected>()};
    return minus ? negative(std::move(node)) : node;
}

Node ExpressionReader::primary() {
    const Token first = mCursor.peek();
    switch (first.kind) {
    case TokenKind::open: {
        const Cursor::Nesting nesting(mCursor);
        mCursor.take();
        Node inner = expression();
        close();
        return inner;
    }
    case TokenKind::quoted:
        mCursor.take();
        return sql::make(sql::Value{ColumnType::Text, first.text});
    case TokenKind::dated: {
        mCursor.take();
        const auto moment = momentLiteral(first.text, ColumnType::Unknown);
        if (!moment) throw Error{first.begin, refusalOf(ColumnType::Unknown)};
        return sql::make(*moment);
    }
    case TokenKind::bracketed:
        if (Node column = mNames.takeQualified(false)) return column;
        return mNames.takeBracketed();
    case TokenKind::word: return word();
    default: throw Error{first.begin, missingOf(ColumnType::Unknown)};
    }
}

Node ExpressionReader::word() {
    const Token first = mCursor.peek();
    if (auto number = literal(first.text, ColumnType::Decimal)) {
        mCursor.take();
        return sql::make(std::move(*number));
    }
    if (auto bytes = literal(first.text, ColumnType::Blob)) {
        mCursor.take();
        return sql::make(std::move(*bytes));
    }
    if (Node parameter = mNames.takeParameter(false)) return parameter;
    if (mCursor.atCall()) return call();
    if (mCursor.at(u"True") || mCursor.at(u"False"))
        return sql::make(*literal(mCursor.take().text, ColumnType::Boolean));
    if (mCursor.at(u"Null")) mCursor.fail<MessageCode::equalToNull>();
    if (Node column = mNames.takeQualified(false)) return column;
    if (Node column = mNames.takeBare()) return column;
    mCursor.fail<MessageCode::unknownName>(first.text);
}

Node ExpressionReader::call() {
    if (mCursor.at(u"If")) return choice();
    const Token name = mCursor.peek();
    const Signature* signature = signatureOf(name.text);
    if (!signature && isTotalName(name.text)) mCursor.fail<MessageCode::totalInExpression>();
    if (!signature) mCursor.fail<MessageCode::unknownFunction>(name.text);
    const Cursor::Nesting nesting(mCursor);
    mCursor.take();
    mCursor.take();
    std::vector<Node> arguments;
    const auto wrongCount = [&] {
        throw Error{name.begin, say<MessageCode::writtenSo>(signature->words.usage)};
    };
    if (mCursor.peek().kind != TokenKind::close) {
        do {
            if (arguments.size() == signature->most) wrongCount();
            arguments.push_back(argument(*signature, arguments.size()));
        } while (mCursor.takeKind(TokenKind::comma));
    }
    close();
    if (arguments.size() < signature->fewest) wrongCount();
    ColumnType type = ColumnType::Text;
    switch (signature->given) {
    case Given::text: break;
    case Given::whole: type = ColumnType::Integer; break;
    case Given::number: type = ColumnType::Decimal; break;
    case Given::date: type = ColumnType::Date; break;
    case Given::timestamp: type = ColumnType::Timestamp; break;
    case Given::sameNumber:
        type = typeOf(*arguments[0]);
        if (isUnknown(type)) type = ColumnType::Decimal;
        if (signature->function == sql::Function::round && arguments.size() == 1)
            type = ColumnType::Integer;
        break;
    case Given::first:
        type = typeOf(*arguments[0]);
        // From behind too, so that what is known of one is known of all.
        for (int round = 0; round < 2; ++round)
            for (std::size_t n = 1; n < arguments.size(); ++n) {
                pair(arguments[0], arguments[n], name);
                type = common(type, typeOf(*arguments[n]));
            }
        break;
    }
    if (signature->function == sql::Function::text) return arguments[0];
    return made(signature->function, std::move(arguments), type);
}

Node ExpressionReader::argument(const Signature& signature, std::size_t position) {
    const Argument kind = signature.arguments[std::min(position, signature.arguments.size() - 1)];
    const Token first = mCursor.peek();
    Node node = expression();
    const auto require = [&](bool fits, Message message) {
        if (!fits) throw Error{first.begin, std::move(message)};
    };
    switch (kind) {
    case Argument::any: return node;
    case Argument::text: return asText(std::move(node));
    case Argument::number: {
        node = typed(std::move(node), ColumnType::Decimal);
        const ColumnType type = typeOf(*node);
        require(isNumber(type) || isUnknown(type), say<MessageCode::numberExpected>());
        return node;
    }
    case Argument::whole: {
        node = typed(std::move(node), ColumnType::Integer);
        const ColumnType type = typeOf(*node);
        require(type == ColumnType::Integer || isUnknown(type), say<MessageCode::wholeExpected>());
        return node;
    }
    case Argument::digits: {
        const auto* value = std::get_if<sql::Value>(&node->node);
        const bool digits = value && value->type == ColumnType::Integer &&
                            value->text.size() <= 2 && value->text.front() != u'-' &&
                            (value->text.size() == 1 || value->text <= u"15");
        require(digits, say<MessageCode::decimalsExpected>());
        return node;
    }
    case Argument::date: break;
    }
    if (!isMoment(typeOf(*node))) node = typed(std::move(node), ColumnType::Date);
    const auto* value = std::get_if<sql::Value>(&node->node);
    if (value && value->type == ColumnType::Text)
        node = typed(std::move(node), ColumnType::Timestamp);
    const ColumnType type = typeOf(*node);
    require(isMoment(type) || isUnknown(type), say<MessageCode::dateExpected>());
    return node;
}

Node ExpressionReader::choice() {
    const Token name = mCursor.peek();
    const Cursor::Nesting nesting(mCursor);
    mCursor.take();
    mCursor.take();
    const auto comma = [&] {
        if (!mCursor.takeKind(TokenKind::comma))
            throw Error{name.begin, say<MessageCode::writtenSo>(functions().front().usage)};
    };
    Node test = condition();
    comma();
    Node then = expression();
    Node otherwise;
    ColumnType type = typeOf(*then);
    if (mCursor.takeKind(TokenKind::comma)) {
        const Token second = mCursor.peek();
        otherwise = expression();
        pair(then, otherwise, second);
        type = common(typeOf(*then), typeOf(*otherwise));
    }
    close();
    return sql::make(sql::Choice{std::move(test), std::move(then), std::move(otherwise), type});
}

void ExpressionReader::close() {
    if (mCursor.takeKind(TokenKind::close)) return;
    const TokenKind next = mCursor.peek().kind;
    if (next == TokenKind::end || next == TokenKind::comma)
        mCursor.fail<MessageCode::closingMissing>(u")");
    mCursor.fail<MessageCode::operatorMissing>();
}

} // namespace zandor::model::criteria
