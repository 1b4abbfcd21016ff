#pragma once

#include "model/criteria/Tokens.h"

namespace zandor::model::criteria {

/// Where reading a text has come to. What stands ahead is read in one of the two modes; a criterion
/// changes to the other where an expression begins, and back behind it.
class Cursor {
public:
    /// The text must outlive the cursor.
    Cursor(StringView text, Mode mode) : mText(text), mMode(mode), mTokens(tokens(text, mode)) {}

    const Token& peek(std::size_t ahead = 0) const {
        return mTokens.list[std::min(mAt + ahead, mTokens.list.size() - 1)];
    }
    /// The token before; there must be one.
    const Token& before() const { return mTokens.list[mAt - 1]; }
    bool atBegin() const { return mAt == 0; }

    Token take() {
        Token token = peek();
        if (mAt < mTokens.list.size() - 1) ++mAt;
        return token;
    }
    bool takeKind(TokenKind kind) {
        if (peek().kind != kind) return false;
        take();
        return true;
    }
    bool at(StringView keyword, std::size_t ahead = 0) const {
        return isKeyword(peek(ahead), keyword);
    }
    bool takeKeyword(StringView keyword) {
        if (!at(keyword)) return false;
        take();
        return true;
    }
    /// Whether a word stands before the opening parenthesis of its arguments.
    bool atCall() const {
        return peek().kind == TokenKind::word && peek(1).kind == TokenKind::open &&
               peek(1).begin == peek().end;
    }

    /// A place to come back to; only as long as the mode is not another for good.
    std::size_t place() const { return mAt; }
    void returnTo(std::size_t place) { mAt = place; }

    Mode mode() const { return mMode; }
    void setMode(Mode mode) {
        if (mode == mMode) return;
        mMode = mode;
        Tokens ahead = tokens(mText, mode, peek().begin);
        mTokens.list.resize(mAt);
        mTokens.list.insert(mTokens.list.end(), ahead.list.begin(), ahead.list.end());
        mTokens.error = std::move(ahead.error);
    }

    StringView text() const { return mText; }
    /// Why the tokens end before the text does.
    const std::optional<Error>& error() const { return mTokens.error; }

    template <MessageCode code, class... Arguments>
    [[noreturn]] void fail(const Arguments&... arguments) const {
        throw Error{peek().begin, say<code>(arguments...)};
    }

    /// One step down into parentheses, a call or a Not.
    class Nesting {
    public:
        explicit Nesting(Cursor& cursor) : mCursor(cursor) {
            constexpr int deepest = 100;
            if (++mCursor.mDepth <= deepest) return;
            --mCursor.mDepth;
            mCursor.fail<MessageCode::nestedTooDeep>();
        }
        Nesting(const Nesting&) = delete;
        Nesting& operator=(const Nesting&) = delete;
        ~Nesting() { --mCursor.mDepth; }

    private:
        Cursor& mCursor;
    };

private:
    StringView mText;
    Mode mMode;
    Tokens mTokens;
    std::size_t mAt = 0;
    int mDepth = 0;
};

} // namespace zandor::model::criteria
