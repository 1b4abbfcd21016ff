#include "model/criteria/Parser.h"

#include "model/criteria/Literals.h"

#include <Zandor/model/Table.h>

#include <algorithm>

namespace zandor::model::criteria {

using sql::Node;

namespace {

constexpr int deepestNesting = 100;

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
    Parser(StringView text, std::vector<Token> tokens, const sql::ColumnRef& subject,
           const Resolver& resolver, const References& known)
        : mText(text), mTokens(std::move(tokens)), mSubjectColumn(subject),
          mSubject(sql::make(subject)), mResolver(resolver), mKnown(known) {}

    Reading read() {
        try {
            if (peek().kind != TokenKind::end) mReading.condition = disjunction();
            if (peek().kind != TokenKind::end) fail<MessageCode::jointMissing>();
        } catch (Error& error) {
            mReading.condition = {};
            mReading.error = std::move(error);
            mReading.warning.reset();
            keepKnown();
        }
        return std::move(mReading);
    }

private:
    /// One step down into parentheses or a Not.
    class Nesting {
    public:
        explicit Nesting(Parser& parser) : mParser(parser) {
            if (++mParser.mDepth > deepestNesting) mParser.fail<MessageCode::nestedTooDeep>();
        }
        ~Nesting() { --mParser.mDepth; }

    private:
        Parser& mParser;
    };

    const Token& peek(std::size_t ahead = 0) const {
        return mTokens[std::min(mAt + ahead, mTokens.size() - 1)];
    }
    Token take() { return mTokens[mAt < mTokens.size() - 1 ? mAt++ : mAt]; }
    bool at(StringView keyword, std::size_t ahead = 0) const {
        return isKeyword(peek(ahead), keyword);
    }
    bool takeKeyword(StringView keyword) {
        if (!at(keyword)) return false;
        take();
        return true;
    }
    bool takeKind(TokenKind kind) {
        if (peek().kind != kind) return false;
        take();
        return true;
    }
    template <MessageCode code, class... Arguments>
    [[noreturn]] void fail(const Arguments&... arguments) const {
        if (atDecimalComma()) throw Error{peek().begin, say<MessageCode::decimalComma>()};
        throw Error{peek().begin, say<code>(arguments...)};
    }
    /// For want of a value.
    [[noreturn]] void failMissing(const Token& token) const {
        throw Error{token.begin, missingOf(mSubjectColumn.type)};
    }
    /// For a value that is none of the column's.
    [[noreturn]] void failValue(const Token& token) const {
        const bool number = isNumber(mSubjectColumn.type);
        const std::size_t comma = token.text.find(u',');
        if (number && comma != String::npos) {
            String point = token.text;
            point[comma] = u'.';
            if (literal(point, ColumnType::Decimal))
                throw Error{token.begin, say<MessageCode::decimalComma>()};
        }
        throw Error{token.begin, refusalOf(mSubjectColumn.type)};
    }
    /// Whether digits stand on both sides of a comma that no list has, as in 1,5.
    bool atDecimalComma() const {
        if (peek().kind != TokenKind::comma || mAt == 0 || mSubjectColumn.type == ColumnType::Text)
            return false;
        const Token& before = mTokens[mAt - 1];
        const Token& behind = peek(1);
        return before.kind == TokenKind::word && behind.kind == TokenKind::word &&
               before.end == peek().begin && peek().end == behind.begin &&
               literal(before.text, ColumnType::Decimal) &&
               literal(behind.text, ColumnType::Decimal);
    }

    Node disjunction() {
        std::vector<Node> terms{conjunction()};
        while (takeKeyword(u"Or")) terms.push_back(conjunction());
        return sql::anyOf(std::move(terms));
    }

    Node conjunction() {
        std::vector<Node> terms{negation()};
        while (takeKeyword(u"And")) terms.push_back(negation());
        return sql::allOf(std::move(terms));
    }

    Node negation() {
        if (!at(u"Not")) return predicate(false);
        if (at(u"Like", 1) || at(u"Between", 1) || at(u"In", 1)) {
            take();
            return predicate(true);
        }
        const Nesting nesting(*this);
        take();
        return sql::make(sql::Not{negation()});
    }

    Node predicate(bool negated) {
        if (peek().kind == TokenKind::open) {
            const Nesting nesting(*this);
            take();
            Node inner = disjunction();
            if (!takeKind(TokenKind::close)) fail<MessageCode::closingMissing>(u")");
            return inner;
        }
        if (at(u"Like")) return like(negated);
        if (takeKeyword(u"Between")) return between(negated);
        if (at(u"In") && peek(1).kind == TokenKind::open) return in(negated);
        if (negated) {
            take();
            fail<MessageCode::listMissing>();
        }
        if (at(u"Is")) return isNull();
        auto comparison = sql::Comparison::equal;
        if (peek().kind == TokenKind::comparison) comparison = operatorOf(take().text);
        return sql::make(sql::Compare{comparison, mSubject, operand()});
    }

    static sql::Comparison operatorOf(StringView symbol) {
        if (symbol == u"<>") return sql::Comparison::notEqual;
        if (symbol == u"<") return sql::Comparison::less;
        if (symbol == u">") return sql::Comparison::greater;
        if (symbol == u"<=") return sql::Comparison::lessEqual;
        if (symbol == u">=") return sql::Comparison::greaterEqual;
        return sql::Comparison::equal;
    }

    Node isNull() {
        take();
        const bool negated = takeKeyword(u"Not");
        if (!takeKeyword(u"Null")) fail<MessageCode::nullMissing>();
        return sql::make(sql::IsNull{negated, mSubject});
    }

    Node like(bool negated) {
        const Token word = take();
        if (!takesAnyText()) throw Error{word.begin, say<MessageCode::likeOnNoText>()};
        const Token first = peek();
        const bool qualified = first.kind == TokenKind::bracketed && peek(1).kind == TokenKind::dot;
        Node asked;
        if (!qualified)
            asked = first.kind == TokenKind::bracketed ? bracketedName() : takeParameter();
        const auto* parameter = asked ? std::get_if<sql::Parameter>(&asked->node) : nullptr;
        if (qualified || (asked && !parameter))
            throw Error{first.begin, say<MessageCode::columnForPattern>()};
        if (parameter) {
            sql::Parameter pattern = *parameter;
            pattern.pattern = true;
            return sql::make(sql::Like{negated, mSubject, sql::make(std::move(pattern))});
        }
        const String typed = first.kind == TokenKind::quoted ? take().text : barePattern();
        if (first.kind != TokenKind::quoted && typed.empty()) fail<MessageCode::patternMissing>();
        return sql::make(sql::Like{negated, mSubject,
                                   sql::make(sql::Value{ColumnType::Text, likePattern(typed)})});
    }

    Node between(bool negated) {
        Node low = operand();
        if (!takeKeyword(u"And")) fail<MessageCode::secondValueMissing>();
        Node high = operand();
        return sql::make(sql::Between{negated, mSubject, std::move(low), std::move(high)});
    }

    Node in(bool negated) {
        take();
        take();
        std::vector<Node> list{operand()};
        while (takeKind(TokenKind::comma)) list.push_back(operand());
        if (!takeKind(TokenKind::close)) fail<MessageCode::listNotClosed>();
        return sql::make(sql::In{negated, mSubject, std::move(list)});
    }

    /// A value, a column or a parameter.
    Node operand() {
        if (Node parameter = takeParameter()) return parameter;
        if (Node column = takeColumn()) return column;
        const Token first = peek();
        switch (first.kind) {
        case TokenKind::quoted:
        case TokenKind::dated: return delimitedValue(take());
        case TokenKind::word: return bareValue();
        case TokenKind::bracketed: return bracketedName();
        default: failMissing(first);
        }
    }

    Node delimitedValue(const Token& token) {
        ColumnType type = mSubjectColumn.type;
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
        const Token first = peek();
        if (at(u"Null")) fail<MessageCode::equalToNull>();
        const String typed = bareText();
        if (typed.empty()) failMissing(first);
        const auto value = literal(typed, mSubjectColumn.type);
        if (!value) failValue(first);
        if (value->type == ColumnType::Text && !mReading.warning && looksLikePattern(typed))
            mReading.warning = Error{first.begin, say<MessageCode::patternWithoutLike>()};
        return sql::make(*value);
    }

    bool atWord() const { return peek().kind == TokenKind::word && !at(u"And") && !at(u"Or"); }

    /// The bare words from here up to And, Or or another kind of token, with the blanks between
    /// them as typed.
    String bareText() {
        const std::size_t begin = peek().begin;
        std::size_t end = begin;
        while (atWord()) end = take().end;
        return String(mText.substr(begin, end - begin));
    }

    /// The same with brackets, which make a wildcard an ordinary character, as typed.
    String barePattern() {
        const std::size_t begin = peek().begin;
        std::size_t end = begin;
        while (atWord() || peek().kind == TokenKind::bracketed || peek().kind == TokenKind::dot)
            end = take().end;
        return String(mText.substr(begin, end - begin));
    }

    /// Whether any text is a value for the column.
    bool takesAnyText() const {
        return mSubjectColumn.type == ColumnType::Text ||
               mSubjectColumn.type == ColumnType::Unknown;
    }

    Node takeParameter() {
        const Token& token = peek();
        if (token.kind != TokenKind::word || token.text.front() != u':') return {};
        String name = token.text.substr(1);
        if (!isBareName(name)) {
            // A text may begin with a colon; other values cannot.
            if (takesAnyText()) return {};
            throw Error{token.begin + 1, say<MessageCode::parameterNameMissing>()};
        }
        take();
        return sql::make(sql::Parameter{std::move(name), mSubjectColumn.type});
    }

    /// table.column in any mix of bare and bracketed names. A bare pair that names no column of the
    /// query is left alone: it may be a text.
    Node takeColumn() {
        const Token first = peek();
        if (first.kind != TokenKind::word && first.kind != TokenKind::bracketed) return {};
        if (peek(1).kind == TokenKind::dot) {
            take();
            take();
            const Token second = take();
            if (second.kind != TokenKind::bracketed && second.kind != TokenKind::word)
                throw Error{second.begin, say<MessageCode::columnNameMissing>()};
            const auto found = lookUp({first.begin, first.end}, first.text, second.text);
            if (!found)
                throw Error{first.begin,
                            say<MessageCode::noSuchColumn>(first.text + u"." + second.text)};
            return columnNode(first, *found);
        }
        if (first.kind != TokenKind::word) return {};
        const StringView whole = first.text;
        const std::size_t dot = whole.find(u'.');
        if (dot == StringView::npos || !isBareName(whole.substr(0, dot)) ||
            !isBareName(whole.substr(dot + 1)))
            return {};
        Reference reference{first.begin, first.begin + dot};
        const auto found = lookUp(reference, whole.substr(0, dot), whole.substr(dot + 1));
        if (!found) {
            // From now on it is the text that it looks like, whatever tables come later.
            if (takesAnyText()) mReading.references.push_back(std::move(reference));
            return {};
        }
        take();
        return columnNode(first, *found);
    }

    /// [name] is a column when just one table has it, and a parameter when none has.
    Node bracketedName() {
        const Token token = take();
        if (const Reference* known = knownAt(token.begin)) {
            mReading.references.push_back(*known);
            if (const auto column = columnOf(*known)) return columnNode(token, *column);
            return sql::make(sql::Parameter{token.text, mSubjectColumn.type});
        }
        const auto found = mResolver.columnsNamed(token.text);
        if (found.size() > 1)
            throw Error{token.begin,
                        say<MessageCode::ambiguousColumn>(u"[" + found.front().column.table +
                                                          u"].[" + token.text + u"]")};
        Reference reference{token.begin, token.begin};
        if (found.size() == 1) reference.column = found.front().place;
        mReading.references.push_back(std::move(reference));
        if (found.size() == 1) return columnNode(token, found.front().column);
        return sql::make(sql::Parameter{token.text, mSubjectColumn.type});
    }

    /// The column that a table's and a column's name stand for, or nothing.
    std::optional<sql::ColumnRef> lookUp(Reference reference, StringView table, StringView column) {
        if (const Reference* known = knownAt(reference.begin)) {
            // A settled text is entered by the caller.
            if (known->column.empty()) return {};
            mReading.references.push_back(*known);
            return columnOf(*known);
        }
        const auto found = mResolver.columnsNamed(table, column);
        if (found.size() != 1) return {};
        reference.column = found.front().place;
        mReading.references.push_back(std::move(reference));
        return found.front().column;
    }

    const Reference* knownAt(std::size_t begin) const {
        const auto at = std::find_if(mKnown.begin(), mKnown.end(),
                                     [&](const Reference& known) { return known.begin == begin; });
        return at == mKnown.end() ? nullptr : &*at;
    }

    static std::optional<sql::ColumnRef> columnOf(const Reference& known) {
        if (known.column.empty()) return {};
        const auto column = known.column.column();
        if (!column) throw Error{known.begin, say<MessageCode::tableOfColumnGone>()};
        return columnRef(*column, *known.column.table().table());
    }

    /// What was known behind the place where reading stopped stays known.
    void keepKnown() {
        auto& references = mReading.references;
        for (const Reference& known : mKnown)
            if (references.empty() || known.begin > references.back().begin)
                references.push_back(known);
    }

    Node columnNode(const Token& token, const sql::ColumnRef& column) {
        if (!comparable(column.type, mSubjectColumn.type))
            throw Error{token.begin,
                        say<MessageCode::incomparableColumn>(nameOf(mSubjectColumn.type))};
        return sql::make(column);
    }

    StringView mText;
    std::vector<Token> mTokens;
    const sql::ColumnRef& mSubjectColumn;
    Node mSubject;
    const Resolver& mResolver;
    const References& mKnown;
    Reading mReading;
    std::size_t mAt = 0;
    int mDepth = 0;
};

} // namespace

Reading read(StringView text, const sql::ColumnRef& subject, const Resolver& resolver,
             const References& known) {
    auto scanned = tokens(text);
    if (auto* error = std::get_if<Error>(&scanned)) return {{}, std::move(*error), {}, known};
    return Parser(text, std::move(std::get<std::vector<Token>>(scanned)), subject, resolver, known)
        .read();
}

} // namespace zandor::model::criteria
