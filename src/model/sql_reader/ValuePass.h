#pragma once

#include "model/sql_reader/ValueReader.h"

#include "model/criteria/Parser.h"
#include "model/criteria/Tokens.h"

#include <map>

namespace zandor::sql_reader {

/// A text as people type it.
inline String quoted(const String& text) {
    String out = u"'";
    for (const char16_t c : text) {
        out += c;
        if (c == u'\'') out += c;
    }
    return out + u'\'';
}

/// One expression being read: the totals in it have names for as long.
class ValueReader::Pass final : public model::criteria::Resolver {
public:
    explicit Pass(const Scope& scope) : mScope(scope) {}

    String nameFor(Node total) {
        mTotals.push_back(std::move(total));
        return model::criteria::inBrackets(tableOfTotals) + u".[" +
               platform::decimal(static_cast<std::int64_t>(mTotals.size())) + u']';
    }

    /// With the totals in it instead of their names.
    Node filled(const Node& node) const {
        const auto* column = std::get_if<ColumnRef>(&node->node);
        if (column && column->table == tableOfTotals) return mTotals[numberOf(column->column)];
        auto parts = model::sql::partsOf(*node);
        if (parts.empty()) return node;
        for (Node& part : parts) part = filled(part);
        return model::sql::withParts(*node, std::move(parts));
    }

    std::vector<model::criteria::NamedColumn> columnsNamed(StringView table,
                                                           StringView column) const override {
        if (table != tableOfTotals) return mScope.columnsNamed(table, column);
        const Node& total = mTotals[numberOf(column)];
        return {{{String(table), String(column), model::sql::typeOf(*total), {}}, {}}};
    }
    std::vector<model::criteria::NamedColumn> columnsNamed(StringView column) const override {
        return mScope.columnsNamed(column);
    }

    /// What text and type have come out for nodes: each is asked for by several of those around it.
    std::map<const Tree::Json*, String> known;
    std::map<const Tree::Json*, model::ColumnType> types;

    int depth = 0;
    /// Texts of the statement, as they stand.
    std::vector<String> texts;
    /// Numbers and truths, and texts that become such.
    std::vector<String> others;
    /// What the statement makes a moment of.
    std::vector<Node> dates;

private:
    /// The table whose columns stand for totals.
    static constexpr StringView tableOfTotals = u"\uE002";

    static std::size_t numberOf(StringView name) {
        std::size_t number = 0;
        for (const char16_t c : name) number = number * 10 + static_cast<std::size_t>(c - u'0');
        return number - 1;
    }

    const Scope& mScope;
    std::vector<Node> mTotals;
};

} // namespace zandor::sql_reader
