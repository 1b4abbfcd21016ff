#include "model/criteria/Tokens.h"

#include <Zandor/model/Functions.h>
#include <Zandor/model/Names.h>

#include <algorithm>
#include <optional>

namespace zandor::model::criteria {

namespace {

constexpr std::size_t longestText = 10000;

bool isSpace(char16_t c) {
    return c == u' ' || (c >= u'\t' && c <= u'\r') || c == 0x00A0 || c == 0x2003 || c == 0x3000;
}

bool isSpecial(char16_t c) { return StringView(u"'\"()[],=<>!").find(c) != StringView::npos; }

bool startsName(char16_t c) {
    return (c >= u'a' && c <= u'z') || (c >= u'A' && c <= u'Z') || c == u'_' ||
           (c >= 0x80 && !isSpace(c));
}

bool isNamePart(char16_t c) { return startsName(c) || (c >= u'0' && c <= u'9') || c == u'$'; }

class Scanner {
public:
    Scanner(StringView text, Mode mode, std::size_t from) : mText(text), mMode(mode), mAt(from) {}

    Tokens scan() {
        std::optional<Error> error;
        std::size_t end = mAt;
        while (skipSpaces(), mAt < mText.size()) {
            end = mAt;
            if ((error = next())) break;
        }
        if (!error) end = mText.size();
        mTokens.push_back({TokenKind::end, end, end, {}});
        return {std::move(mTokens), std::move(error)};
    }

private:
    void skipSpaces() {
        while (mAt < mText.size() && isSpace(mText[mAt])) ++mAt;
    }

    std::optional<Error> next() {
        if (mMode == Mode::expression && StringView(u"+-*/&").find(mText[mAt]) != StringView::npos)
            return single(TokenKind::symbol);
        switch (mText[mAt]) {
        case u'\'': return delimited(TokenKind::quoted, u'\'');
        case u'"': return delimited(TokenKind::quoted, u'"');
        case u'[': return bracketed();
        case u'#': return delimited(TokenKind::dated, u'#');
        case u'(': return single(TokenKind::open);
        case u')': return single(TokenKind::close);
        case u',': return single(TokenKind::comma);
        case u']': return Error{mAt, say<MessageCode::openingMissing>()};
        case u'!': return Error{mAt, say<MessageCode::foreignUnequal>()};
        case u'=':
        case u'<':
        case u'>': return comparison();
        case u'.':
            if (!mTokens.empty() && mTokens.back().kind == TokenKind::bracketed &&
                mTokens.back().end == mAt)
                return single(TokenKind::dot);
            return anyWord();
        default: return anyWord();
        }
    }

    std::optional<Error> anyWord() { return mMode == Mode::criterion ? word() : nameOrNumber(); }

    bool digitAt(std::size_t at) const {
        return at < mText.size() && mText[at] >= u'0' && mText[at] <= u'9';
    }

    /// Before bytes in hexadecimal digits.
    bool atBytes() const {
        const StringView two = mText.substr(mAt, 2);
        return two == u"x'" || two == u"X'" || two == u"0x" || two == u"0X";
    }

    void skipDigits() {
        while (digitAt(mAt)) ++mAt;
    }

    /// 12, 1.5, .5, 1e-3, x'0AFF', 0x0AFF; a name, or two with a dot between; or :name.
    std::optional<Error> nameOrNumber() {
        const std::size_t begin = mAt;
        if (atBytes()) {
            const bool quoted = mText[mAt + 1] == u'\'';
            mAt += 2;
            while (mAt < mText.size() && isNamePart(mText[mAt])) ++mAt;
            if (quoted && mAt < mText.size() && mText[mAt] == u'\'') ++mAt;
            return add(TokenKind::word, begin, String(mText.substr(begin, mAt - begin)));
        }
        if (digitAt(mAt) || (mText[mAt] == u'.' && digitAt(mAt + 1))) {
            skipDigits();
            if (mAt < mText.size() && mText[mAt] == u'.') ++mAt;
            skipDigits();
            const bool exponent = mAt < mText.size() && (mText[mAt] == u'e' || mText[mAt] == u'E');
            const bool sign =
                mAt + 1 < mText.size() && (mText[mAt + 1] == u'+' || mText[mAt + 1] == u'-');
            if (exponent && digitAt(mAt + (sign ? 2 : 1))) {
                mAt += sign ? 2 : 1;
                skipDigits();
            }
            return add(TokenKind::word, begin, String(mText.substr(begin, mAt - begin)));
        }
        if (mText[mAt] == u':') ++mAt;
        const std::size_t first = mAt;
        while (mAt < mText.size() && (isNamePart(mText[mAt]) || mText[mAt] == u'.')) ++mAt;
        if (mAt == first && first == begin)
            return Error{begin, say<MessageCode::signUnknown>(mText.substr(begin, 1))};
        return qualified(begin);
    }

    /// What was read up to here is a word; a dot before a bracket ends it.
    std::optional<Error> qualified(std::size_t begin) {
        const bool qualifies =
            mAt < mText.size() && mText[mAt] == u'[' && mAt - begin > 1 && mText[mAt - 1] == u'.';
        if (!qualifies)
            return add(TokenKind::word, begin, String(mText.substr(begin, mAt - begin)));
        --mAt;
        add(TokenKind::word, begin, String(mText.substr(begin, mAt - begin)));
        return single(TokenKind::dot);
    }

    std::optional<Error> add(TokenKind kind, std::size_t begin, String text) {
        mTokens.push_back({kind, begin, mAt, std::move(text)});
        return {};
    }

    std::optional<Error> single(TokenKind kind) {
        const std::size_t begin = mAt++;
        return add(kind, begin, String(mText.substr(begin, 1)));
    }

    /// A text between two of the same character; two of them inside stand for one.
    std::optional<Error> delimited(TokenKind kind, char16_t close) {
        const std::size_t begin = mAt++;
        String text;
        for (; mAt < mText.size(); ++mAt) {
            if (mText[mAt] == close) {
                if (mAt + 1 >= mText.size() || mText[mAt + 1] != close) {
                    ++mAt;
                    return add(kind, begin, std::move(text));
                }
                ++mAt;
            }
            text.push_back(mText[mAt]);
        }
        return Error{mText.size(), say<MessageCode::closingMissing>(StringView(&close, 1))};
    }

    std::optional<Error> bracketed() {
        if (auto error = delimited(TokenKind::bracketed, u']')) return error;
        if (mTokens.back().text.empty())
            return Error{mTokens.back().begin + 1, say<MessageCode::nameMissing>()};
        return {};
    }

    std::optional<Error> comparison() {
        const std::size_t begin = mAt++;
        const StringView two = mText.substr(begin, 2);
        if (two == u"<>" || two == u"<=" || two == u">=") ++mAt;
        return add(TokenKind::comparison, begin, String(mText.substr(begin, mAt - begin)));
    }

    /// Bare characters. An apostrophe within a word belongs to it (O'Brien).
    std::optional<Error> word() {
        const std::size_t begin = mAt++;
        while (mAt < mText.size() && !isSpace(mText[mAt]) &&
               (mText[mAt] == u'\'' || !isSpecial(mText[mAt])))
            ++mAt;
        return qualified(begin);
    }

    StringView mText;
    const Mode mMode;
    std::size_t mAt;
    std::vector<Token> mTokens;
};

} // namespace

std::optional<Error> unusable(StringView text) {
    if (text.size() > longestText) return Error{longestText, say<MessageCode::criterionTooLong>()};
    for (std::size_t i = 0; i < text.size(); ++i) {
        const char16_t c = text[i];
        if (c == 0) return Error{i, say<MessageCode::zeroInCriterion>()};
        if (c < 0xD800 || c > 0xDFFF) continue;
        const bool paired =
            c < 0xDC00 && i + 1 < text.size() && text[i + 1] >= 0xDC00 && text[i + 1] <= 0xDFFF;
        if (!paired) return Error{i, say<MessageCode::halfCharacterInCriterion>()};
        ++i;
    }
    return {};
}

Tokens tokens(StringView text, Mode mode, std::size_t from) {
    return Scanner(text, mode, from).scan();
}

bool isBlank(StringView text) { return std::all_of(text.begin(), text.end(), isSpace); }

bool isBareName(StringView text) {
    return !text.empty() && startsName(text.front()) &&
           std::all_of(text.begin(), text.end(), isNamePart);
}

String inBrackets(StringView name) {
    String out = u"[";
    for (const char16_t c : name) {
        out += c;
        if (c == u']') out += c;
    }
    return out + u']';
}

String writtenName(StringView name) { return isBareName(name) ? String(name) : inBrackets(name); }

bool isKeyword(const Token& token, StringView keyword) {
    return token.kind == TokenKind::word && sameName(token.text, keyword);
}

} // namespace zandor::model::criteria
