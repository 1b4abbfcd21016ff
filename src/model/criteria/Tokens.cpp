#include "model/criteria/Tokens.h"

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

/// A character that text cannot carry to any engine.
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

class Scanner {
public:
    explicit Scanner(StringView text) : mText(text) {}

    std::variant<std::vector<Token>, Error> scan() {
        while (skipSpaces(), mAt < mText.size()) {
            if (auto error = next()) return *error;
        }
        mTokens.push_back({TokenKind::end, mText.size(), mText.size(), {}});
        return std::move(mTokens);
    }

private:
    void skipSpaces() {
        while (mAt < mText.size() && isSpace(mText[mAt])) ++mAt;
    }

    std::optional<Error> next() {
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
            return word();
        default: return word();
        }
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

    /// Bare characters. An apostrophe within a word belongs to it (O'Brien); a dot before a
    /// bracket ends it.
    std::optional<Error> word() {
        const std::size_t begin = mAt++;
        while (mAt < mText.size() && !isSpace(mText[mAt]) &&
               (mText[mAt] == u'\'' || !isSpecial(mText[mAt])))
            ++mAt;
        const bool qualifies =
            mAt < mText.size() && mText[mAt] == u'[' && mAt - begin > 1 && mText[mAt - 1] == u'.';
        if (!qualifies)
            return add(TokenKind::word, begin, String(mText.substr(begin, mAt - begin)));
        --mAt;
        add(TokenKind::word, begin, String(mText.substr(begin, mAt - begin)));
        return single(TokenKind::dot);
    }

    StringView mText;
    std::size_t mAt = 0;
    std::vector<Token> mTokens;
};

} // namespace

std::variant<std::vector<Token>, Error> tokens(StringView text) {
    if (auto error = unusable(text)) return *error;
    return Scanner(text).scan();
}

bool isBlank(StringView text) { return std::all_of(text.begin(), text.end(), isSpace); }

bool isBareName(StringView text) {
    const auto starts = [](char16_t c) {
        return (c >= u'a' && c <= u'z') || (c >= u'A' && c <= u'Z') || c == u'_' ||
               (c >= 0x80 && !isSpace(c));
    };
    return !text.empty() && starts(text.front()) &&
           std::all_of(text.begin(), text.end(), [&](char16_t c) {
               return starts(c) || (c >= u'0' && c <= u'9') || c == u'$';
           });
}

bool isKeyword(const Token& token, StringView keyword) {
    return token.kind == TokenKind::word && sameName(token.text, keyword);
}

} // namespace zandor::model::criteria
