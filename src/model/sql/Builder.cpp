#include <Zandor/sql/Builder.h>

#include "model/criteria/Output.h"
#include "model/criteria/QueryColumns.h"
#include "model/sql/JoinTrees.h"
#include "model/sql/NameCheck.h"
#include "model/sql/SavedQueries.h"
#include "model/sql/Simplify.h"
#include "model/sql/Totals.h"

#include <Zandor/model/Names.h>

#include <algorithm>
#include <map>

namespace zandor::model::sql {

namespace {

class Builder {
public:
    Builder(Query& query, SavedQueries& saved)
        : mQuery(query), mSaved(saved), mColumns(query.Tables()) {}

    Built build() {
        if (mQuery.Tables().Count() == 0) {
            mBuilt.findings.push_back({Finding::Kind::noTables, say<MessageCode::noTables>()});
            return std::move(mBuilt);
        }
        JoinTrees trees = joinTrees(mQuery, sources(), mBuilt.findings);
        mStatement.from = std::move(trees.trees);
        const auto definitions = each();
        mGrouped = std::any_of(definitions.begin(), definitions.end(), [](const auto& definition) {
            return aggregates(definition->total()) || definition->total() == Total::Group;
        });
        for (const auto& definition : definitions) add(*definition);
        if (mStatement.items.empty()) selectEverything();
        reportDuplicates();
        order();
        mStatement.where = allOf(std::move(trees.conditions));
        place(mRows, mStatement, mBuilt.findings);
        mStatement.where = simplified(mStatement.where);
        mStatement.having = simplified(mStatement.having);
        takeOptions();
        takeComments();
        mBuilt.statement = std::move(mStatement);
        return std::move(mBuilt);
    }

private:
    std::vector<SourceNode> sources() {
        std::vector<SourceNode> all;
        for (const auto& table : platform::Each<TalvikZandorLib::ZDTable>(mQuery.Tables()))
            all.push_back(mSaved.sourceOf(static_cast<const Table&>(*table), mBuilt.findings));
        return all;
    }

    std::vector<Ref<const ColumnDefinition>> each() const {
        std::vector<Ref<const ColumnDefinition>> all;
        for (const auto& item :
             platform::Each<TalvikZandorLib::ZDColumnDefinition>(mQuery.ColumnDefinitions()))
            all.emplace_back(std::static_pointer_cast<const ColumnDefinition>(item));
        return all;
    }

    void report(Finding::Kind kind, const ColumnDefinition& definition, Message message,
                std::int16_t row = 0, std::size_t position = 0) {
        Finding finding{kind, std::move(message)};
        finding.definition = definition.Key();
        finding.row = row;
        finding.position = position;
        mBuilt.findings.push_back(std::move(finding));
    }

    void add(const ColumnDefinition& definition) {
        criteria::Output output = criteria::outputOf(definition, mColumns);
        if (output.reading.error) {
            reportExpression(definition, *output.reading.error);
            return;
        }
        const Ref<Column> column = definition.place().column();
        if (!column && !output.value) {
            report(Finding::Kind::definitionWithoutColumn, definition,
                   say<MessageCode::definitionWithoutColumn>());
            return;
        }
        if (!output.subject.node) {
            addAll(definition, definition.place().table().table()->Name());
            return;
        }
        const Total total = definition.total();
        const auto refusal = output.value
                                 ? refusalOf(total, typeOf(*output.value), output.subject.name)
                                 : std::nullopt;
        if (refusal) {
            report(Finding::Kind::badTotal, definition, *refusal);
            return;
        }
        if (mGrouped && !aggregates(total) && total != Total::Condition) group(output.subject);
        if (definition.comesOut()) addItem(definition, output.subject);
        if (aggregates(total)) mTotals.push_back(output.subject.node);
        addSort(definition, output.subject);
        for (const auto& [row, criterium] : definition.criteria().rows())
            addCriterion(definition, output.subject, row, criterium->tied());
    }

    /// Rows are put together by it; what is said twice is one node.
    void group(criteria::Subject& subject) {
        for (const Node& known : mStatement.group) {
            if (!same(known, subject.node)) continue;
            subject.node = known;
            return;
        }
        mStatement.group.push_back(subject.node);
    }

    void addItem(const ColumnDefinition& definition, const criteria::Subject& subject) {
        String name = definition.Synonym();
        const auto* column = std::get_if<ColumnRef>(&subject.node->node);
        if (name.empty() && !column) name = nameOf(subject);
        mItems.emplace(definition.Key(), mStatement.items.size());
        mNames.emplace_back(&definition, name.empty() ? column->column : name);
        mStatement.items.push_back({subject.node, std::move(name)});
    }

    /// What the grid has, where every dialect can carry it as a name.
    String nameOf(const criteria::Subject& subject) const {
        for (const Dialect dialect : allDialects)
            if (cannotCarry(subject.name, dialect))
                return u"column " +
                       platform::decimal(static_cast<std::int64_t>(mStatement.items.size() + 1));
        return subject.name;
    }

    void addSort(const ColumnDefinition& definition, const criteria::Subject& subject) {
        // A constant is the same in every row, and engines take a number for that of a column.
        if (definition.SortOrder() == 0 || std::holds_alternative<Value>(subject.node->node))
            return;
        if (mGrouped && definition.total() == Total::Condition) {
            report(Finding::Kind::sortNotOutput, definition,
                   say<MessageCode::sortOfCondition>(subject.name));
            return;
        }
        if (mQuery.options().distinct && !definition.comesOut()) {
            report(Finding::Kind::sortNotOutput, definition,
                   say<MessageCode::sortNotOutput>(subject.name));
            return;
        }
        const std::int16_t priority = definition.sortPriority();
        mOrder[priority == 0 ? ColumnDefinition::greatestSortPriority + 1 : priority].push_back(
            {subject.node, definition.SortOrder() == 2});
    }

    void order() {
        for (auto& [priority, items] : mOrder)
            mStatement.order.insert(mStatement.order.end(), items.begin(), items.end());
    }

    void takeOptions() {
        const QueryOptions& options = mQuery.options();
        mStatement.distinct = options.distinct;
        if (options.first == 0) return;
        mStatement.limit = options.first;
        if (!mStatement.order.empty()) return;
        mBuilt.findings.push_back(
            {Finding::Kind::firstUnsorted, say<MessageCode::firstUnsorted>(options.first)});
    }

    void addAll(const ColumnDefinition& definition, const String& table) {
        if (mGrouped || definition.total() != Total::None) {
            report(Finding::Kind::badTotal, definition, say<MessageCode::totalOfAllColumns>(table));
            return;
        }
        if (definition.Visible()) {
            mItems.emplace(definition.Key(), mStatement.items.size());
            mStatement.items.push_back({AllColumns{table}, {}});
        }
        if (definition.SortOrder() != 0)
            report(Finding::Kind::sortOnAllColumns, definition,
                   say<MessageCode::sortOnAllColumns>(table));
        for (const auto& [row, criterium] : definition.criteria().rows())
            if (!criteria::isBlank(criterium->Criterium()))
                report(Finding::Kind::badCriterion, definition,
                       say<MessageCode::criterionOnAllColumns>(table), row);
    }

    void reportExpression(const ColumnDefinition& definition, criteria::Error& found) {
        const String& name =
            definition.Synonym().empty() ? definition.expression().text : definition.Synonym();
        report(Finding::Kind::badExpression, definition,
               say<MessageCode::badCriterion>(name, found.position + 1, std::move(found.message)),
               0, found.position);
    }

    void addCriterion(const ColumnDefinition& definition, const criteria::Subject& subject,
                      std::int16_t row, const criteria::TiedText& tied) {
        auto reading = criteria::read(tied.text, subject, mColumns, tied.references);
        const auto reportAt = [&](Finding::Kind kind, criteria::Error& found) {
            report(kind, definition,
                   say<MessageCode::badCriterion>(subject.name, found.position + 1,
                                                  std::move(found.message)),
                   row, found.position);
        };
        if (reading.error) reportAt(Finding::Kind::badCriterion, *reading.error);
        if (reading.warning) reportAt(Finding::Kind::patternWithoutLike, *reading.warning);
        if (!reading.condition) return;
        const Total total = definition.total();
        RowTerms& terms = mRows[row];
        auto& place = aggregates(total)                       ? terms.ofTotals
                      : mGrouped && total == Total::Condition ? terms.ofConditions
                                                              : terms.ofGroups;
        mConditions.emplace(std::pair(definition.Key(), row), reading.condition);
        place.push_back({std::move(reading.condition), &definition, row});
    }

    /// What a comment stands by is left out where it does not show.
    void takeComments() {
        for (const Comment& comment : mQuery.options().comments)
            if (auto by = standingBy(comment))
                mStatement.remarks.push_back({*std::move(by), comment.beside, comment.text});
    }

    std::optional<decltype(Remark::by)> standingBy(const Comment& comment) const {
        switch (comment.place) {
        case CommentPlace::table:
            for (const auto& table : platform::Each<TalvikZandorLib::ZDTable>(mQuery.Tables()))
                if (static_cast<const Table&>(*table).Key() == comment.key) return table->Name();
            return {};
        case CommentPlace::column: return ofColumn(comment.key);
        case CommentPlace::criterion: {
            const auto condition = mConditions.find({comment.key, comment.row});
            if (condition == mConditions.end()) return {};
            return condition->second;
        }
        default: return comment.place;
        }
    }

    /// One that does not come out shows by what else it does.
    std::optional<decltype(Remark::by)> ofColumn(const String& key) const {
        if (const auto item = mItems.find(key); item != mItems.end()) return item->second;
        for (const auto& definition : each()) {
            if (definition->Key() != key) continue;
            if (definition->SortOrder() != 0) return CommentPlace::order;
            const auto condition = mConditions.lower_bound({key, 0});
            if (condition != mConditions.end() && condition->first.first == key)
                return condition->second;
            return CommentPlace::groups;
        }
        return {};
    }

    void selectEverything() {
        // Where rows are put together, all of them is what they are put together by and into.
        for (const Node& node : mStatement.group) mStatement.items.push_back({node, {}});
        for (const Node& node : mTotals) mStatement.items.push_back({node, {}});
        if (mGrouped) return;
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
    SavedQueries& mSaved;
    const criteria::QueryColumns mColumns;
    Built mBuilt;
    Statement mStatement;
    std::vector<std::pair<const ColumnDefinition*, String>> mNames;
    std::map<std::int16_t, RowTerms> mRows;
    std::map<int, std::vector<OrderItem>> mOrder; ///< by priority
    std::map<String, std::size_t> mItems; ///< of definitions, by key
    std::map<std::pair<String, std::int16_t>, Node> mConditions; ///< by definition and row
    std::vector<Node> mTotals;
    bool mGrouped = false; ///< rows are put together
};

} // namespace

Built build(Query& query) {
    SavedQueries saved;
    return build(query, saved);
}

Built build(Query& query, SavedQueries& saved) { return Builder(query, saved).build(); }

Text statementText(Query& query, Dialect dialect, ValueForm form,
                   std::optional<std::int64_t> limit) {
    Built built = build(query);
    Text result{{}, {}, std::move(built.findings)};
    if (!built.statement) return result;
    if (limit) built.statement->limit = std::min(*limit, built.statement->limit.value_or(*limit));
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
