#pragma once

#include <Zandor/sql/Dialect.h>

#include <QString>

#include <optional>

namespace zandor::designer {

/// A part of a statement as its engine parts it.
struct TypedToken {
    enum class Kind {
        word,
        text,      ///< in quotes, be it a name
        parameter, ///< with its sign: ":name", "?"
        end,       ///< ";"
        sign,      ///< any other
        notClosed, ///< a quote or comment without its end
        zero,      ///< U+0000
    };

    Kind kind;
    qsizetype begin;
    qsizetype end;
};

/// Parts a statement, of which nothing else is known than its dialect, SQLite, PostgreSQL or MySQL:
/// where the engine sees quotes, comments and ends, and what is asked for.
class TypedTokens {
public:
    TypedTokens(const QString& text, model::sql::Dialect dialect)
        : mText(text), mDialect(dialect) {}

    /// Nothing behind the last one; comments are none.
    std::optional<TypedToken> next();

private:
    using Kind = TypedToken::Kind;

    bool is(model::sql::Dialect dialect) const { return mDialect == dialect; }
    QChar at(qsizetype ahead = 0) const;
    bool skipBlanksAndComments();
    bool skipComment();
    Kind token();
    Kind quoted(QChar closing, bool backslashes);
    Kind escapes();
    std::optional<Kind> dollarQuoted();
    std::optional<Kind> parameter();
    bool isAssigned(QStringView variable) const;
    void word();

    const QString mText;
    const model::sql::Dialect mDialect;
    qsizetype mAt = 0;
    int mBrackets = 0; ///< that are open: a ":" in them is a slice
};

} // namespace zandor::designer
