#pragma once

#include "model/sql_reader/Lexer.h"
#include "model/sql_reader/Selected.h"
#include "model/sql_reader/Tree.h"
#include "model/sql_reader/ValueReader.h"

#include <functional>

namespace zandor::sql_reader {

/// Reads the parser's tree into a statement whose names are looked up. Throws Refused.
class StatementReader {
public:
    using IsWritten = std::function<bool(model::Query&)>;

    /// What is given must outlive it. A query within the statement that `isWritten` there as it
    /// comes out again is drawn as one that is whole.
    StatementReader(const Schema& schema, const ParserText& text, Dialect dialect,
                    const IsWritten& isWritten)
        : mSchema(schema), mText(text), mDialect(dialect), mIsWritten(isWritten) {}

    /// Of a SelectStmt.
    Selected select(const Tree& tree);

private:
    /// A query that others read from.
    struct Named {
        String name;
        std::shared_ptr<const model::sql::Statement> statement;
        model::SavedQuery query;
        std::vector<model::ColumnDescription> columns;
    };
    using Source = model::sql::SourceNode;

    Selected selectNamed(const Tree& tree);
    void takeComments(const Tree& tree, Selected& into) const;
    static void noteConditions(const Node& condition, Selected& in);

    // Sources.cpp
    /// What a comma has set before a join.
    struct Before {
        Source source;
        Scope scope;
    };
    void from(const Tree& tree, Selected& into);
    bool hasParentheses(const Tree& join, std::size_t outside) const;
    Source source(const Tree& tree, Scope& scope, Selected& into);
    Source table(const Tree& tree, Scope& scope, Selected& into);
    Source subSelect(const Tree& tree, Scope& scope, Selected& into);
    Source join(const Tree& tree, Scope& scope, Selected& into, const Before* before = nullptr);
    Source leftOf(const Tree& join, Scope& scope, Selected& into, const Before* before);
    Source queryAs(const Named& query, const String& alias, std::size_t place, Scope& scope,
                   Selected& into);
    std::vector<Node> shared(const Tree& tree, const Scope& left, const Scope& right, Scope& both);
    Named named(const Tree& select, String name);

    void with(const Tree& tree);
    std::optional<Tree> differsAround(const Tree& tree) const;
    Node behindGroups(std::vector<Node> terms, const model::sql::Statement& statement) const;
    void items(const Tree& tree, const ValueReader& values, Selected& into);
    void checkTruthAsName(const Tree& target) const;
    void item(const Tree& target, const ValueReader& values, Selected& into);
    void limits(const Tree& tree, Selected& into);
    void limit(const Tree& count, Selected& into) const;
    Node byNameOrPlace(const Tree& tree, const ValueReader& values, const Selected& in,
                       bool outputFirst) const;
    void order(const Tree& tree, const ValueReader& values, Selected& into) const;
    static void checkGroups(const Selected& selected);

    const Schema& mSchema;
    const ParserText& mText;
    const Dialect mDialect;
    const IsWritten& mIsWritten;
    std::vector<Named> mNamed;
    int mDepth = 0;
};

} // namespace zandor::sql_reader
