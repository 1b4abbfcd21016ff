#pragma once

#include <Zandor/model/Description.h>
#include <Zandor/model/Messages.h>

#include <variant>
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

/// The tokens of a criterion with an `end` token behind them, or the error.
std::variant<std::vector<Token>, Error> tokens(StringView text);

/// Whether there is nothing but blanks: no criterion.
bool isBlank(StringView text);

/// Whether a name can be written without brackets.
bool isBareName(StringView text);

/// Whether a word is this keyword; letters count without regard to case.
bool isKeyword(const Token& token, StringView keyword);

} // namespace zandor::model::criteria
