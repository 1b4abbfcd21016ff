#include "model/sql/Totals.h"

#include <algorithm>
#include <optional>

namespace zandor::model::sql {

namespace {

Node allOf(const std::vector<Term>& terms) {
    std::vector<Node> nodes;
    nodes.reserve(terms.size());
    for (const Term& term : terms) nodes.push_back(term.condition);
    return sql::allOf(std::move(nodes));
}

void append(std::vector<Node>& nodes, Node node) {
    if (node) nodes.push_back(std::move(node));
}

/// A column in a condition on what was put together that rows are not put together by.
const ColumnRef* loose(const Node& node, const std::vector<Node>& groups) {
    const bool grouped = std::any_of(groups.begin(), groups.end(),
                                     [&](const Node& group) { return same(group, node); });
    if (grouped || std::holds_alternative<Aggregate>(node->node)) return nullptr;
    if (const auto* column = std::get_if<ColumnRef>(&node->node)) return column;
    for (const Node& part : partsOf(*node))
        if (const auto* found = loose(part, groups)) return found;
    return nullptr;
}

class Placing {
public:
    Placing(const std::map<std::int16_t, RowTerms>& rows, Statement& statement, Findings& findings)
        : mRows(rows), mStatement(statement), mFindings(findings) {}

    void run() {
        const bool totals = std::any_of(mRows.begin(), mRows.end(), [](const auto& row) {
            return !row.second.ofTotals.empty();
        });
        if (!totals) {
            before(allOfEach([](const RowTerms& row) {
                return std::vector<Node>{allOf(row.ofGroups), allOf(row.ofConditions)};
            }));
        } else if (mRows.size() == 1) {
            const RowTerms& row = mRows.begin()->second;
            before(sql::allOf(there({allOf(row.ofGroups), allOf(row.ofConditions)})));
            behind(row.ofTotals);
            mStatement.having = allOf(mKept);
        } else {
            mixed();
        }
    }

private:
    static std::vector<Node> there(std::vector<Node> nodes) {
        std::erase(nodes, nullptr);
        return nodes;
    }

    template <class Parts>
    Node allOfEach(Parts parts) const {
        std::vector<Node> rows;
        for (const auto& [number, row] : mRows) append(rows, sql::allOf(there(parts(row))));
        return anyOf(std::move(rows));
    }

    void before(Node condition) {
        std::vector<Node> where{mStatement.where, std::move(condition)};
        mStatement.where = sql::allOf(there(std::move(where)));
    }

    /// Keeps the terms that can be asked of what was put together.
    void behind(const std::vector<Term>& terms) {
        for (const Term& term : terms) {
            const ColumnRef* column = loose(term.condition, mStatement.group);
            if (!column) {
                mKept.push_back(term);
                continue;
            }
            report(term, say<MessageCode::looseColumn>(column->table + u"." + column->column));
        }
    }

    /// Of several rows one is enough, so that all of them are asked at one time: behind. What only
    /// chooses rows before can stay there where every row has the same of it.
    void mixed() {
        const Node first = allOf(mRows.begin()->second.ofConditions);
        for (const auto& [number, row] : mRows) {
            if (same(allOf(row.ofConditions), first)) continue;
            const auto other = std::find_if(mRows.begin(), mRows.end(), [](const auto& each) {
                return !each.second.ofConditions.empty();
            });
            report(other->second.ofConditions.front(), say<MessageCode::mixedRows>());
            return;
        }
        before(first);
        std::vector<Node> rows;
        for (const auto& [number, row] : mRows) {
            mKept.clear();
            behind(row.ofGroups);
            behind(row.ofTotals);
            append(rows, allOf(mKept));
        }
        mStatement.having = anyOf(std::move(rows));
    }

    void report(const Term& term, Message message) {
        Finding finding{Finding::Kind::criterionNotPlaced, std::move(message)};
        finding.definition = term.definition->Key();
        finding.row = term.row;
        mFindings.push_back(std::move(finding));
    }

    const std::map<std::int16_t, RowTerms>& mRows;
    Statement& mStatement;
    Findings& mFindings;
    std::vector<Term> mKept;
};

} // namespace

void place(const std::map<std::int16_t, RowTerms>& rows, Statement& statement, Findings& findings) {
    if (!rows.empty()) Placing(rows, statement, findings).run();
}

std::optional<Message> refusalOf(Total total, ColumnType type, const String& name) {
    if (suits(total, type)) return {};
    if (total == Total::Sum || total == Total::Average)
        return say<MessageCode::totalOfNoNumber>(name, wordOf(total));
    return say<MessageCode::totalOfNoOrder>(name, wordOf(total));
}

} // namespace zandor::model::sql
