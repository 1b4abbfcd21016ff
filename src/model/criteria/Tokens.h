#pragma once

#include <Zandor/model/Description.h>
#include <Zandor/model/Messages.h>
#include <Zandor/model/export.h>

#include <optional>
#include <vector>

namespace zandor::model::criteria {

/// Why a criterion is no criterion. Positions count UTF-16 code units from 0.
struct Error {
    std::size_t position = 0;
    Message message; ///< what was expected, as part of a sentence
};

enum class TokenKind {
    word,      ///< bare characters: a keyword, a number, a date, part of a text, table.column
    quoted,    ///< 'text' or "text"
    bracketed, ///< [name]
    dated,     ///< #2024-05-01#
    comparison,
    symbol, ///< + - * / &, where the text is an expression
    open,
    close,
    comma,
    dot, ///< between two names of which one at least is bracketed
    end,
};

struct Token {
    TokenKind kind = TokenKind::end;
    std::size_t begin = 0;
    std::size_t end = 0;
    String text; ///< without its quotes or brackets, doubled ones halved
};

/// What bare characters are: in a criterion they may be a text, in an expression they are names,
/// numbers and operators.
enum class Mode { criterion, expression };

/// The tokens of a text from a place on, with an `end` token behind them, or where the error is.
struct Tokens {
    std::vector<Token> list;
    std::optional<Error> error;
};
Tokens tokens(StringView text, Mode mode, std::size_t from = 0);

/// A character that text cannot carry to any engine, or too many of them.
ZANDOR_MODEL_EXPORT std::optional<Error> unusable(StringView text);

/// Whether there is nothing but blanks: no criterion.
bool isBlank(StringView text);

/// Whether a name can be written without brackets.
ZANDOR_MODEL_EXPORT bool isBareName(StringView text);

/// A name in its brackets, a closing one within doubled.
ZANDOR_MODEL_EXPORT String inBrackets(StringView name);

/// Whether a word is this keyword; letters count without regard to case.
bool isKeyword(const Token& token, StringView keyword);

} // namespace zandor::model::criteria
