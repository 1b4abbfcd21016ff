#include "designer/run/TypedTokens.h"

#include <QRegularExpression>

namespace zandor::designer {

using model::sql::Dialect;

namespace {

bool startsWord(QChar c) { return c.isLetter() || c == u'_' || c.unicode() > 0x7F; }
bool isWordPart(QChar c) { return startsWord(c) || c.isDigit() || c == u'$' || c == u'#'; }
bool isOperator(QChar c) { return QStringView(u"+-*/<>=~!@#%^&|`").contains(c); }

} // namespace

QChar TypedTokens::at(qsizetype ahead) const {
    return mAt + ahead < mText.size() ? mText[mAt + ahead] : QChar();
}

std::optional<TypedToken> TypedTokens::next() {
    const qsizetype before = mAt;
    if (!skipBlanksAndComments()) return TypedToken{Kind::notClosed, before, mAt};
    if (mAt >= mText.size()) return {};
    const qsizetype begin = mAt;
    const Kind kind = token();
    return TypedToken{kind, begin, mAt};
}

/// False where a comment has no end.
bool TypedTokens::skipBlanksAndComments() {
    while (mAt < mText.size()) {
        if (at().isSpace())
            ++mAt;
        else if (!skipComment())
            return true;
        else if (mAt > mText.size())
            return mAt = mText.size(), false;
    }
    return true;
}

/// Behind the text where a comment has no end.
bool TypedTokens::skipComment() {
    // MySQL takes two signs before anything else for two signs.
    const bool dashes =
        at() == u'-' && at(1) == u'-' && (!is(Dialect::MySQL) || at(2).isNull() || at(2).isSpace());
    if (dashes || (at() == u'#' && is(Dialect::MySQL))) {
        while (mAt < mText.size() && at() != u'\n' && at() != u'\r') ++mAt;
        return true;
    }
    if (at() != u'/' || at(1) != u'*') return false;
    // What stands in these MySQL and MariaDB run.
    const bool isCode = is(Dialect::MySQL) && (at(2) == u'!' || (at(2) == u'M' && at(3) == u'!'));
    if (isCode) return false;
    int depth = 0;
    do {
        if (at() == u'/' && at(1) == u'*' && (depth == 0 || is(Dialect::PostgreSQL))) {
            ++depth;
            mAt += 2;
        } else if (at() == u'*' && at(1) == u'/') {
            --depth;
            mAt += 2;
        } else if (mAt >= mText.size()) {
            mAt = mText.size() + 1;
            return true;
        } else {
            ++mAt;
        }
    } while (depth > 0);
    return true;
}

TypedToken::Kind TypedTokens::token() {
    const QChar c = at();
    const bool mysql = is(Dialect::MySQL);
    const bool postgres = is(Dialect::PostgreSQL);
    if (postgres && (c == u'E' || c == u'e') && at(1) == u'\'') return ++mAt, escapes();
    if (c == u'\'' || c == u'"') return quoted(c, mysql);
    if (c == u'`' && !postgres) return quoted(c, false);
    if (c == u'[' && is(Dialect::SQLite)) return quoted(u']', false);
    if (postgres)
        if (const auto kind = dollarQuoted()) return *kind;
    if (const auto kind = parameter()) return *kind;
    if (startsWord(c) || c.isDigit()) return word(), Kind::word;
    ++mAt;
    if (c == u';') return Kind::end;
    if (c.isNull()) return Kind::zero;
    if (c == u'[') ++mBrackets;
    if (c == u']') --mBrackets;
    return Kind::sign;
}

void TypedTokens::word() {
    while (mAt < mText.size() && isWordPart(at())) ++mAt;
}

TypedToken::Kind TypedTokens::quoted(QChar closing, bool backslashes) {
    for (++mAt; mAt < mText.size(); ++mAt) {
        if (at() == u'\\' && backslashes)
            ++mAt;
        else if (at() == closing && at(1) == closing && closing != u']')
            ++mAt;
        else if (at() == closing)
            return ++mAt, Kind::text;
    }
    mAt = mText.size();
    return Kind::notClosed;
}

/// PostgreSQL's with backslashes, which go on on a further line.
TypedToken::Kind TypedTokens::escapes() {
    static const QRegularExpression further(QStringLiteral("\\G[ \\t\\f\\v]*[\\n\\r]\\s*'"));
    while (true) {
        if (quoted(u'\'', true) == Kind::notClosed) return Kind::notClosed;
        const auto match = further.match(mText, mAt);
        if (!match.hasMatch()) return Kind::text;
        mAt = match.capturedEnd() - 1;
    }
}

std::optional<TypedToken::Kind> TypedTokens::dollarQuoted() {
    if (at() != u'$' || at(1).isDigit()) return {};
    qsizetype end = mAt + 1;
    while (end < mText.size() && isWordPart(mText[end]) && mText[end] != u'$') ++end;
    if (end >= mText.size() || mText[end] != u'$') return {};
    const QStringView mark = QStringView(mText).sliced(mAt, end + 1 - mAt);
    const qsizetype closing = mText.indexOf(mark, end + 1);
    mAt = closing < 0 ? mText.size() : closing + mark.size();
    return closing < 0 ? Kind::notClosed : Kind::text;
}

/// As the reader of statements knows them, but for what an engine has these signs for itself.
std::optional<TypedToken::Kind> TypedTokens::parameter() {
    const QChar c = at();
    const QChar before = mAt > 0 ? mText[mAt - 1] : QChar();
    const bool postgres = is(Dialect::PostgreSQL);
    const qsizetype begin = mAt;
    if (c == u'?') {
        if (postgres) { // which has operators with it; a value comes behind them
            const bool known = at(1) == u'|' || at(1) == u'&';
            qsizetype behind = mAt + 1;
            while (behind < mText.size() && mText[behind].isSpace()) ++behind;
            const QChar value = behind < mText.size() ? mText[behind] : QChar();
            if (known || value == u'\'' || value == u'$' || (value == u':' && at(1) != u':'))
                return {};
        }
        for (++mAt; at().isDigit();) ++mAt;
        return Kind::parameter;
    }
    if (c != u':' && c != u'@' && c != u'$') return {};
    const bool slice = c == u':' && (before == u':' || (postgres && mBrackets > 0));
    const bool sign = c == u'@' && (before == u'@' || (postgres && isOperator(before)));
    if (slice || sign) return {};
    if (c == u':' && (at(1) == u'\'' || at(1) == u'"')) {
        ++mAt;
        return quoted(at(), false) == Kind::text ? Kind::parameter : Kind::notClosed;
    }
    if (!startsWord(at(1)) && !at(1).isDigit()) return {};
    ++mAt;
    word();
    if (c == u'@' && is(Dialect::MySQL) &&
        isAssigned(QStringView(mText).sliced(begin, mAt - begin)))
        return Kind::word;
    return Kind::parameter;
}

/// Whether the statement gives a variable of MySQL its value itself.
bool TypedTokens::isAssigned(QStringView variable) const {
    const QRegularExpression assigning(QRegularExpression::escape(variable.toString()) +
                                           QStringLiteral("\\s*:="),
                                       QRegularExpression::CaseInsensitiveOption);
    return assigning.match(mText).hasMatch();
}

} // namespace zandor::designer
