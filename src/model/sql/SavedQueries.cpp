#include "model/sql/SavedQueries.h"

#include "model/criteria/QueryColumns.h"

#include <Zandor/model/Names.h>

#include <algorithm>
#include <unordered_set>

namespace zandor::model::sql {

namespace {

/// `name`, or with the least number behind it that makes it none of those taken.
String unused(const String& name, std::unordered_set<String>& taken) {
    String own = name;
    for (std::int32_t n = 1; !taken.insert(foldedName(own)).second; ++n)
        own = name + u'_' + platform::decimal(n);
    return own;
}

String nameOf(const SelectItem& item, std::size_t position) {
    if (!item.name.empty()) return item.name;
    if (const auto* column = std::get_if<ColumnRef>(&std::get<Node>(item.what)->node))
        return column->column;
    return u"column " + platform::decimal(static_cast<std::int64_t>(position));
}

void give(SelectItem& item, const String& name) {
    const auto* column = std::get_if<ColumnRef>(&std::get<Node>(item.what)->node);
    item.name = column && column->column == name ? String() : name;
}

} // namespace

void writeColumnsOut(Statement& statement, Query& query) {
    std::vector<SelectItem> items;
    std::vector<std::size_t> places;
    for (SelectItem& item : statement.items) {
        places.push_back(items.size());
        const auto* all = std::get_if<AllColumns>(&item.what);
        if (!all) {
            items.push_back(std::move(item));
            continue;
        }
        const auto table = query.tableNamed(all->table);
        const auto& columns = table->contents()->columns;
        for (std::int32_t position = 2; position <= columns.Count(); ++position) {
            const auto column = std::static_pointer_cast<Column>(columns.Item(position));
            items.push_back({make(criteria::columnRef(*column, *table)), {}});
        }
    }
    std::unordered_set<String> taken;
    for (std::size_t n = 0; n < items.size(); ++n)
        give(items[n], unused(nameOf(items[n], n + 1), taken));
    statement.items = std::move(items);
    for (Remark& remark : statement.remarks)
        if (auto* item = std::get_if<std::size_t>(&remark.by)) *item = places[*item];
}

std::vector<String> namesOf(const Statement& statement) {
    std::vector<String> names;
    for (const SelectItem& item : statement.items) names.push_back(nameOf(item, names.size() + 1));
    return names;
}

std::vector<ColumnDescription> outputColumns(Query& query) {
    Built built = build(query);
    if (!built.statement) return {};
    writeColumnsOut(*built.statement, query);
    std::vector<ColumnDescription> columns;
    const auto names = namesOf(*built.statement);
    for (const SelectItem& item : built.statement->items) {
        const Node& value = std::get<Node>(item.what);
        ColumnDescription description{.name = names[columns.size()], .type = typeOf(*value)};
        // A column that comes out as it is is still what the database says of it.
        if (const auto* column = std::get_if<ColumnRef>(&value->node))
            if (const auto table = query.tableNamed(column->table))
                if (const auto own = table->columnNamed(column->column))
                    description.declaredType = own->description().declaredType;
        columns.push_back(std::move(description));
    }
    return columns;
}

SourceNode SavedQueries::sourceOf(const Table& table, Findings& findings) {
    const SavedQueryRef& query = table.savedQuery();
    auto plain = std::make_shared<const Source>(
        Source{TableRef{table.schema(), table.sourceName(), table.Name()}});
    if (!query) return plain;

    const auto report = [&](Finding::Kind kind, Message message) {
        Finding finding{kind, std::move(message)};
        finding.table = table.Key();
        findings.push_back(std::move(finding));
    };
    const Known& inner = known(query);
    bool whole = true;
    for (const Finding& finding : inner.built.findings) {
        whole = whole && !finding.isError();
        // Its names are made different here, whatever they are there.
        if (finding.kind == Finding::Kind::duplicateOutputName) continue;
        report(finding.kind, say<MessageCode::inSavedQuery>(table.Name(), finding.message));
    }
    if (inner.statement->items.empty()) {
        if (whole)
            report(
                Finding::Kind::otherColumnsGiven,
                say<MessageCode::inSavedQuery>(table.Name(), say<MessageCode::nothingComesOut>()));
        return plain;
    }
    const auto& columns = table.contents()->columns;
    std::vector<String> names;
    for (std::int32_t position = 2; position <= columns.Count(); ++position)
        names.push_back(columns.Item(position)->Name());
    if (whole && namesOf(*inner.statement) != names)
        report(Finding::Kind::otherColumnsGiven, say<MessageCode::otherColumnsGiven>(table.Name()));
    return std::make_shared<const Source>(Source{SubSelect{inner.statement, table.Name()}});
}

const SavedQueries::Known& SavedQueries::known(const SavedQueryRef& query) {
    const auto at = std::find_if(mKnown.begin(), mKnown.end(), [&](const Known& each) {
        return each.query->record == query->record;
    });
    if (at != mKnown.end()) return *at;
    const auto inner = Query::restored(query->record);
    Known made{.query = query, .built = build(*inner, *this)};
    auto statement = std::make_shared<Statement>();
    if (made.built.statement) {
        *statement = std::move(*made.built.statement);
        writeColumnsOut(*statement, *inner);
        // Only a limit makes the order of rows show in what they are read for.
        if (!statement->limit) statement->order.clear();
    }
    made.statement = std::move(statement);
    return mKnown.emplace_back(std::move(made));
}

} // namespace zandor::model::sql
