#include <Zandor/sql/Builder.h>

#include "model/criteria/QueryColumns.h"
#include "model/sql/JoinTrees.h"
#include "model/sql/NameCheck.h"

#include <Zandor/model/Names.h>

#include <algorithm>
#include <map>

namespace zandor::model::sql {

namespace {

class Builder {
public:
    explicit Builder(Query& query) : mQuery(query), mColumns(query.Tables()) {}

    Built build() {
        if (mQuery.Tables().Count() == 0) {
            mBuilt.findings.push_back({Finding::Kind::noTables, say<MessageCode::noTables>()});
            return std::move(mBuilt);
        }
        JoinTrees trees = joinTrees(mQuery, mBuilt.findings);
        mStatement.from = std::move(trees.trees);
        for (std::int32_t i = 1; i <= mQuery.ColumnDefinitions().Count(); ++i)
            add(dynamic_cast<ColumnDefinition&>(*mQuery.ColumnDefinitions().Item(i)));
        if (mStatement.items.empty()) selectEverything();
        reportDuplicates();

        std::vector<Node> rows;
        for (auto& [row, terms] : mRows) rows.push_back(allOf(std::move(terms)));
        std::vector<Node> where = std::move(trees.conditions);
        if (Node criteria = anyOf(std::move(rows))) where.push_back(std::move(criteria));
        mStatement.where = allOf(std::move(where));
        mBuilt.statement = std::move(mStatement);
        return std::move(mBuilt);
    }

private:
    void report(Finding::Kind kind, const ColumnDefinition& definition, Message message,
                std::int16_t row = 0, std::size_t position = 0) {
        Finding finding{kind, std::move(message)};
        finding.definition = definition.Key();
        finding.row = row;
        finding.position = position;
        mBuilt.findings.push_back(std::move(finding));
    }

    void add(const ColumnDefinition& definition) {
        const Ref<Column> column = definition.place().column();
        if (!column) {
            report(Finding::Kind::definitionWithoutColumn, definition,
                   say<MessageCode::definitionWithoutColumn>());
            return;
        }
        const Ref<Table> table = definition.place().table().table();
        if (table->isAllColumns(*column)) {
            addAll(definition, table->Name());
            return;
        }
        const ColumnRef reference = criteria::columnRef(*column, *table);
        if (definition.Visible()) {
            mStatement.items.push_back({reference, definition.Synonym()});
            mNames.push_back({&definition, definition.Synonym().empty() ? column->Name()
                                                                        : definition.Synonym()});
        }
        if (definition.SortOrder() != 0)
            mStatement.order.push_back({reference, definition.SortOrder() == 2});
        for (const auto& [row, criterium] : definition.criteria().rows())
            addCriterion(definition, reference, row, *criterium);
    }

    void addAll(const ColumnDefinition& definition, const String& table) {
        if (definition.Visible()) mStatement.items.push_back({AllColumns{table}, {}});
        if (definition.SortOrder() != 0)
            report(Finding::Kind::sortOnAllColumns, definition,
                   say<MessageCode::sortOnAllColumns>(table));
        for (const auto& [row, criterium] : definition.criteria().rows())
            if (!criteria::isBlank(criterium->Criterium()))
                report(Finding::Kind::badCriterion, definition,
                       say<MessageCode::criterionOnAllColumns>(table), row);
    }

    void addCriterion(const ColumnDefinition& definition, const ColumnRef& subject,
                      std::int16_t row, const RowCriterium& criterium) {
        auto reading =
            criteria::read(criterium.Criterium(), subject, mColumns, criterium.references());
        const auto reportAt = [&](Finding::Kind kind, criteria::Error& found) {
            report(kind, definition,
                   say<MessageCode::badCriterion>(subject.table + u"." + subject.column,
                                                  found.position + 1, std::move(found.message)),
                   row, found.position);
        };
        if (reading.error) reportAt(Finding::Kind::badCriterion, *reading.error);
        if (reading.warning) reportAt(Finding::Kind::patternWithoutLike, *reading.warning);
        if (reading.condition) mRows[row].push_back(std::move(reading.condition));
    }

    void selectEverything() {
        for (std::int32_t i = 1; i <= mQuery.Tables().Count(); ++i)
            mStatement.items.push_back({AllColumns{mQuery.Tables().Item(i)->Name()}, {}});
    }

    void reportDuplicates() {
        for (std::size_t i = 0; i < mNames.size(); ++i) {
            const bool seen = std::any_of(
                mNames.begin(), mNames.begin() + static_cast<long>(i),
                [&](const auto& other) { return sameName(other.second, mNames[i].second); });
            if (seen)
                report(Finding::Kind::duplicateOutputName, *mNames[i].first,
                       say<MessageCode::duplicateOutputName>(mNames[i].second));
        }
    }

    Query& mQuery;
    const criteria::QueryColumns mColumns;
    Built mBuilt;
    Statement mStatement;
    std::vector<std::pair<const ColumnDefinition*, String>> mNames;
    std::map<std::int16_t, std::vector<Node>> mRows;
};

} // namespace

Built build(Query& query) { return Builder(query).build(); }

Text statementText(Query& query, Dialect dialect, ValueForm form,
                   std::optional<std::int64_t> limit) {
    Built built = build(query);
    Text result{{}, {}, std::move(built.findings)};
    if (!built.statement) return result;
    built.statement->limit = limit;
    Findings names = uncarriedNames(query, dialect);
    if (!names.empty()) {
        result.findings.insert(result.findings.end(), names.begin(), names.end());
        return result;
    }
    auto printed = print(*built.statement, dialect, form);
    if (auto* refusal = std::get_if<Refusal>(&printed)) {
        Finding finding{refusal->reason == Refusal::Reason::name ? Finding::Kind::nameNotCarried
                                                                 : Finding::Kind::notInDialect,
                        std::move(refusal->message)};
        finding.join = std::move(refusal->join);
        result.findings.push_back(std::move(finding));
        return result;
    }
    result.text = std::move(std::get<Printed>(printed).text);
    result.bindings = std::move(std::get<Printed>(printed).bindings);
    return result;
}

Findings validate(Query& query, Dialect dialect) {
    return statementText(query, dialect, ValueForm::bound).findings;
}

bool Text::runnable() const {
    return !text.empty() && std::none_of(findings.begin(), findings.end(),
                                         [](const Finding& finding) { return finding.isError(); });
}

} // namespace zandor::model::sql
