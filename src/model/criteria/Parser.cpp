#include "model/criteria/Parser.h"

#include "model/criteria/ExpressionReader.h"
#include "model/criteria/Literals.h"

#include <algorithm>

namespace zandor::model::criteria {

using sql::Node;

namespace {

/// Whether somebody may have meant a pattern: "100 %" is no such text.
bool looksLikePattern(StringView text) {
    const auto isWord = [&](std::size_t at) {
        if (at >= text.size()) return false;
        const char16_t c = text[at];
        return (c >= u'A' && c <= u'Z') || (c >= u'a' && c <= u'z') || c >= 0x80;
    };
    if (text.find(u'*') != StringView::npos) return true;
    for (std::size_t at = text.find(u'%'); at != StringView::npos; at = text.find(u'%', at + 1))
        if (isWord(at + 1) || (at > 0 && isWord(at - 1))) return true;
    return false;
}

class Parser {
public:
    Parser(StringView text, const Subject& subject, const Resolver& resolver,
           const References& known)
        : mCursor(text, Mode::criterion), mSubject(subject), mNames(mCursor, resolver, known),
          mExpressions(mCursor, mNames) {}

    Reading read() {
        try {
            if (mCursor.peek().kind != TokenKind::end) mReading.condition = disjunction();
            if (mCursor.error()) throw Error(*mCursor.error());
            if (mCursor.peek().kind != TokenKind::end) fail<MessageCode::jointMissing>();
            mReading.references = std::move(mNames.references);
        } catch (const Error& error) {
            mReading.condition = {};
            // What no token can be made of explains more than what was missed before it.
            mReading.error = mCursor.error() ? *mCursor.error() : error;
            mReading.warning.reset();
            mNames.keepKnown();
            mReading.references = std::move(mNames.references);
        }
        return std::move(mReading);
    }

private:
    template <MessageCode code, class... Arguments>
    [[noreturn]] void fail(const Arguments&... arguments) const {
        if (atDecimalComma()) mCursor.fail<MessageCode::decimalComma>();
        mCursor.fail<code>(arguments...);
    }

    /// For want of a value.
    [[noreturn]] void failMissing(const Token& token) const {
        throw Error{token.begin, missingOf(mSubject.type)};
    }

    /// For a value that is none of the column's.
    [[noreturn]] void failValue(const Token& token) const {
        const bool number = isNumber(mSubject.type);
        const std::size_t comma = token.text.find(u',');
        if (number && comma != String::npos) {
            String point = token.text;
            point[comma] = u'.';
            if (literal(point, ColumnType::Decimal))
                throw Error{token.begin, say<MessageCode::decimalComma>()};
        }
        throw Error{token.begin, refusalOf(mSubject.type)};
    }

    /// Whether digits stand on both sides of a comma that no list has, as in 1,5.
    bool atDecimalComma() const {
        if (mCursor.peek().kind != TokenKind::comma || mCursor.atBegin() ||
            mSubject.type == ColumnType::Text)
            return false;
        const Token& before = mCursor.before();
        const Token& behind = mCursor.peek(1);
        return before.kind == TokenKind::word && behind.kind == TokenKind::word &&
               before.end == mCursor.peek().begin && mCursor.peek().end == behind.begin &&
               literal(before.text, ColumnType::Decimal) &&
               literal(behind.text, ColumnType::Decimal);
    }

    Node disjunction() {
        std::vector<Node> terms{conjunction()};
        while (mCursor.takeKeyword(u"Or")) terms.push_back(conjunction());
        return sql::anyOf(std::move(terms));
    }

    Node conjunction() {
        std::vector<Node> terms{negation()};
        while (mCursor.takeKeyword(u"And")) terms.push_back(negation());
        return sql::allOf(std::move(terms));
    }

    Node negation() {
        if (!mCursor.at(u"Not")) return predicate(false);
        if (mCursor.at(u"Like", 1) || mCursor.at(u"Between", 1) || mCursor.at(u"In", 1)) {
            mCursor.take();
            return predicate(true);
        }
        const Cursor::Nesting nesting(mCursor);
        mCursor.take();
        return sql::make(sql::Not{negation()});
    }

    Node predicate(bool negated) {
        if (mCursor.peek().kind == TokenKind::open && !atValueInParentheses()) {
            const Cursor::Nesting nesting(mCursor);
            mCursor.take();
            Node inner = disjunction();
            if (!mCursor.takeKind(TokenKind::close)) fail<MessageCode::closingMissing>(u")");
            return inner;
        }
        if (mCursor.at(u"Like")) return like(negated);
        if (mCursor.takeKeyword(u"Between")) return between(negated);
        if (mCursor.at(u"In") && mCursor.peek(1).kind == TokenKind::open) return in(negated);
        if (negated) {
            mCursor.take();
            fail<MessageCode::listMissing>();
        }
        if (mCursor.at(u"Is")) return isNull();
        if (mCursor.peek().kind == TokenKind::comparison) {
            const auto comparison = comparisonOf(mCursor.take().text);
            return compared(comparison, operand());
        }
        const Token first = mCursor.peek();
        Node left = plainOperand();
        const bool own = std::holds_alternative<sql::Value>(left->node);
        if (!own && atComparison()) {
            mCursor.setMode(Mode::expression);
            Node condition = mExpressions.conditionFrom(std::move(left));
            mCursor.setMode(Mode::criterion);
            return condition;
        }
        return compared(sql::Comparison::equal, fitted(std::move(left), first));
    }

    Node compared(sql::Comparison comparison, Node right) const {
        return sql::make(sql::Compare{comparison, mSubject.node, std::move(right)});
    }

    /// Whether what was read so far is the left side of a comparison of its own.
    bool atComparison() const {
        const std::size_t ahead = mCursor.at(u"Not") ? 1 : 0;
        return (ahead == 0 &&
                (mCursor.peek().kind == TokenKind::comparison || mCursor.at(u"Is"))) ||
               mCursor.at(u"Like", ahead) || mCursor.at(u"Between", ahead) ||
               mCursor.at(u"In", ahead);
    }

    /// Whether the parentheses ahead hold a value that goes on behind them, and no conditions.
    bool atValueInParentheses() const {
        std::size_t ahead = 0;
        int depth = 0;
        do {
            const TokenKind kind = mCursor.peek(ahead).kind;
            if (kind == TokenKind::end) return false;
            if (kind == TokenKind::open) ++depth;
            if (kind == TokenKind::close) --depth;
            ++ahead;
        } while (depth > 0);
        const Token& behind = mCursor.peek(ahead);
        if (behind.kind == TokenKind::comparison || atSymbol(behind)) return true;
        for (const StringView word : {u"Is", u"Like", u"Between", u"In", u"Not"})
            if (isKeyword(behind, word)) return true;
        return false;
    }

    static bool atSymbol(const Token& token) {
        return token.kind == TokenKind::word &&
               StringView(u"+-*/&").find(token.text.front()) != StringView::npos;
    }

    Node isNull() {
        mCursor.take();
        const bool negated = mCursor.takeKeyword(u"Not");
        if (!mCursor.takeKeyword(u"Null")) fail<MessageCode::nullMissing>();
        return sql::make(sql::IsNull{negated, mSubject.node});
    }

    Node like(bool negated) {
        const Token word = mCursor.take();
        if (!takesAnyText()) throw Error{word.begin, say<MessageCode::likeOnNoText>()};
        const Token first = mCursor.peek();
        const bool qualified =
            first.kind == TokenKind::bracketed && mCursor.peek(1).kind == TokenKind::dot;
        Node asked;
        if (!qualified)
            asked = first.kind == TokenKind::bracketed ? mNames.takeBracketed()
                                                       : mNames.takeParameter(true);
        const auto* parameter = asked ? std::get_if<sql::Parameter>(&asked->node) : nullptr;
        if (qualified || (asked && !parameter))
            throw Error{first.begin, say<MessageCode::columnForPattern>()};
        if (parameter) {
            sql::Parameter pattern = *parameter;
            pattern.type = mSubject.type;
            pattern.pattern = true;
            return sql::make(sql::Like{negated, mSubject.node, sql::make(std::move(pattern))});
        }
        const String typed = first.kind == TokenKind::quoted ? mCursor.take().text : barePattern();
        if (first.kind != TokenKind::quoted && typed.empty()) fail<MessageCode::patternMissing>();
        return sql::make(sql::Like{negated, mSubject.node,
                                   sql::make(sql::Value{ColumnType::Text, likePattern(typed)})});
    }

    Node between(bool negated) {
        Node low = operand();
        if (!mCursor.takeKeyword(u"And")) fail<MessageCode::secondValueMissing>();
        Node high = operand();
        return sql::make(sql::Between{negated, mSubject.node, std::move(low), std::move(high)});
    }

    Node in(bool negated) {
        mCursor.take();
        mCursor.take();
        std::vector<Node> list{operand()};
        while (mCursor.takeKind(TokenKind::comma)) list.push_back(operand());
        if (!mCursor.takeKind(TokenKind::close)) fail<MessageCode::listNotClosed>();
        return sql::make(sql::In{negated, mSubject.node, std::move(list)});
    }

    /// A value, a column, a parameter or an expression that the subject can be compared with.
    Node operand() {
        const Token first = mCursor.peek();
        return fitted(plainOperand(), first);
    }

    Node fitted(Node node, const Token& first) const {
        if (std::holds_alternative<sql::Value>(node->node)) return node;
        node = typed(std::move(node), mSubject.type);
        if (comparable(typeOf(*node), mSubject.type)) return node;
        if (mSubject.type == ColumnType::Timestamp && typeOf(*node) == ColumnType::Date)
            return sql::make(sql::Call{sql::Function::moment, {node}, ColumnType::Timestamp});
        if (std::holds_alternative<sql::ColumnRef>(node->node))
            throw Error{first.begin, say<MessageCode::incomparableColumn>(nameOf(mSubject.type))};
        throw Error{first.begin, say<MessageCode::incomparableValue>(nameOf(mSubject.type))};
    }

    /// The same whatever it holds.
    Node plainOperand() {
        const Token first = mCursor.peek();
        const bool calls = mCursor.atCall() && (signatureOf(first.text) || isKeyword(first, u"If"));
        if (calls || first.kind == TokenKind::open)
            return inExpression([&] { return mExpressions.value(); });
        if (Node parameter = mNames.takeParameter(takesAnyText())) return continued(parameter);
        if (Node column = mNames.takeQualified(takesAnyText())) return continued(column);
        switch (first.kind) {
        case TokenKind::quoted:
        case TokenKind::dated: return continued(delimitedValue(mCursor.take()));
        case TokenKind::word: return bareValue();
        case TokenKind::bracketed: return continued(mNames.takeBracketed());
        default: failMissing(first);
        }
    }

    template <class Read>
    Node inExpression(Read read) {
        mCursor.setMode(Mode::expression);
        Node node = read();
        mCursor.setMode(Mode::criterion);
        return node;
    }

    /// With the operators behind it, if there are any.
    Node continued(Node first) {
        if (!atSymbol(mCursor.peek())) return first;
        return inExpression([&] { return mExpressions.valueFrom(std::move(first)); });
    }

    Node delimitedValue(const Token& token) {
        ColumnType type = mSubject.type;
        if (token.kind == TokenKind::dated) {
            const auto moment = momentLiteral(token.text, type);
            if (!moment) failValue(token);
            return sql::make(*moment);
        }
        // Quotes around a value say that it is text wherever the column does not know better.
        if (type == ColumnType::Unknown) type = ColumnType::Text;
        const auto value = literal(token.text, type);
        if (!value) failValue(token);
        return sql::make(*value);
    }

    Node bareValue() {
        const Token first = mCursor.peek();
        if (mCursor.at(u"Null")) fail<MessageCode::equalToNull>();
        const std::size_t place = mCursor.place();
        const String typed = bareText();
        if (typed.empty()) failMissing(first);
        const auto value = literal(typed, mSubject.type);
        if (!value && isNumber(mSubject.type)) {
            mCursor.returnTo(place);
            if (Node calculated = calculation()) return calculated;
        }
        if (!value) failValue(first);
        if (value->type == ColumnType::Text && !mReading.warning && looksLikePattern(typed))
            mReading.warning = Error{first.begin, say<MessageCode::patternWithoutLike>()};
        return sql::make(*value);
    }

    /// A number with an operator behind it, or nothing.
    Node calculation() {
        mCursor.setMode(Mode::expression);
        const std::size_t signs = mCursor.peek().kind == TokenKind::symbol ? 1 : 0;
        Node node;
        if (mCursor.peek(signs + 1).kind == TokenKind::symbol &&
            literal(mCursor.peek(signs).text, ColumnType::Decimal))
            node = mExpressions.value();
        mCursor.setMode(Mode::criterion);
        return node;
    }

    bool atWord() const {
        return mCursor.peek().kind == TokenKind::word && !mCursor.at(u"And") && !mCursor.at(u"Or");
    }

    /// The bare words from here up to And, Or or another kind of token, with the blanks between
    /// them as typed.
    String bareText() {
        const std::size_t begin = mCursor.peek().begin;
        std::size_t end = begin;
        while (atWord()) end = mCursor.take().end;
        return String(mCursor.text().substr(begin, end - begin));
    }

    /// The same with brackets, which make a wildcard an ordinary character, as typed.
    String barePattern() {
        const std::size_t begin = mCursor.peek().begin;
        std::size_t end = begin;
        while (atWord() || mCursor.peek().kind == TokenKind::bracketed ||
               mCursor.peek().kind == TokenKind::dot)
            end = mCursor.take().end;
        return String(mCursor.text().substr(begin, end - begin));
    }

    /// Whether any text is a value for the column.
    bool takesAnyText() const {
        return mSubject.type == ColumnType::Text || mSubject.type == ColumnType::Unknown;
    }

    Cursor mCursor;
    const Subject& mSubject;
    NameReader mNames;
    ExpressionReader mExpressions;
    Reading mReading;
};

} // namespace

Subject::Subject(const sql::ColumnRef& column)
    : node(sql::make(column)), type(column.type), name(column.table + u"." + column.column) {}

Subject::Subject(Node node, String name)
    : node(std::move(node)), type(this->node ? typeOf(*this->node) : ColumnType::Unknown),
      name(std::move(name)) {}

Reading read(StringView text, const Subject& subject, const Resolver& resolver,
             const References& known) {
    if (auto error = unusable(text)) return {{}, std::move(error), {}, known};
    return Parser(text, subject, resolver, known).read();
}

ExpressionReading readExpression(StringView text, const Resolver& resolver,
                                 const References& known) {
    if (auto error = unusable(text)) return {{}, std::move(error), known};
    Cursor cursor(text, Mode::expression);
    NameReader names(cursor, resolver, known);
    ExpressionReading reading;
    try {
        reading.value = ExpressionReader(cursor, names).expression();
        if (cursor.error()) throw Error(*cursor.error());
        if (cursor.peek().kind != TokenKind::end) cursor.fail<MessageCode::operatorMissing>();
    } catch (const Error& error) {
        reading.value = {};
        reading.error = cursor.error() ? *cursor.error() : error;
        names.keepKnown();
    }
    reading.references = std::move(names.references);
    return reading;
}

} // namespace zandor::model::criteria
