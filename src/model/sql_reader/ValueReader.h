#pragma once

#include "model/sql_reader/Forms.h"
#include "model/sql_reader/Lexer.h"
#include "model/sql_reader/Selected.h"
#include "model/sql_reader/Tree.h"

#include <Zandor/model/Names.h>

#include <map>

namespace zandor::sql_reader {

/// Reads values and conditions. What a dialect writes becomes an expression of the language that
/// people type into the grid, and that language's own reader says what it is and whether it fits.
class ValueReader {
public:
    /// What is given must outlive it.
    ValueReader(const Scope& scope, const ParserText& text, Dialect dialect, Places& places)
        : mScope(scope), mText(text), mDialect(dialect), mPlaces(places) {}

    /// What comes out under a name, for those that no table has.
    void add(StringView alias, const Tree& tree) {
        mAliases.emplace(model::foldedName(alias), tree);
    }

    /// A value or a total of values; throws Refused.
    Node value(const Tree& tree) const;
    /// Conditions that hold together, each by itself; totals may stand in them.
    std::vector<Node> conditions(const Tree& tree) const;

private:
    class Pass;

    Node read(const Tree& tree, Pass& pass) const;
    Node condition(const Tree& tree) const;
    Node columnsCompared(const Tree& tree) const;
    Node total(const Tree& tree) const;
    std::size_t blame(const Tree& tree, Pass& pass) const;

    /// As it is typed into the grid, with all in parentheses that is no single word.
    String text(const Tree& tree, Pass& pass) const;
    String newText(const Tree& tree, Pass& pass) const;
    String constant(const Tree& tree) const;
    std::optional<ColumnRef> columnMeant(const Tree& tree) const;
    String column(const Tree& tree, Pass& pass) const;
    String parameter(const Tree& tree) const;
    std::optional<String> momentWritten(const Tree& tree, Pass& pass) const;
    String cast(const Tree& tree) const;
    String operation(const Tree& tree, Pass& pass) const;
    String comparison(const Tree& tree, StringView symbol, Pass& pass) const;
    String side(const Tree& tree, const Tree& other, Pass& pass) const;
    void noteConverted(const Tree& tree, const Tree& other, Pass& pass) const;
    String arithmetic(const Tree& tree, StringView symbol, Pass& pass) const;
    String division(const Tree& tree, Pass& pass) const;
    String like(const Tree& tree, Pass& pass) const;
    String joined(const Tree& tree, StringView word, Pass& pass) const;
    String truth(const Tree& tree, Pass& pass) const;
    std::optional<bool> numberOfTruth(const Tree& tree) const;
    String choice(const Tree& tree, Pass& pass) const;
    String call(const Tree& tree, Pass& pass) const;
    std::optional<String> byForm(const Tree& tree, Pass& pass) const;
    bool takesTruth(const Form& form, const std::map<int, Tree>& arguments, Pass& pass) const;
    String list(const Tree& tree, const char* name, Pass& pass) const;
    model::ColumnType typeOf(const Tree& tree, Pass& pass) const;

    const Scope& mScope;
    const ParserText& mText;
    const Dialect mDialect;
    Places& mPlaces; ///< of what was read
    std::map<String, Tree> mAliases;
};

/// The total that a call makes, nothing for any other.
std::optional<model::Total> totalOf(const Tree& call);

} // namespace zandor::sql_reader
