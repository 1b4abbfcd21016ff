#include "model/sql/NameCheck.h"

namespace zandor::model::sql {

namespace {

/// The finding on the first of some names that cannot be carried, or nothing.
std::optional<Finding> firstUncarried(std::initializer_list<StringView> names, Dialect dialect) {
    for (const StringView name : names)
        if (const auto why = cannotCarry(name, dialect))
            return Finding{Finding::Kind::nameNotCarried, *why};
    return {};
}

/// An empty schema or synonym is none; any other name takes its place, for that is looked at too.
StringView orElse(const String& name, StringView other) { return name.empty() ? other : name; }

} // namespace

Findings uncarriedNames(Query& query, Dialect dialect) {
    using namespace TalvikZandorLib;
    Findings findings;
    for (const auto& item : platform::Each<ZDTable>(query.Tables())) {
        const auto& table = static_cast<const Table&>(*item);
        const StringView schema = orElse(table.schema(), table.sourceName());
        if (auto finding = firstUncarried({table.sourceName(), schema, item->Name()}, dialect)) {
            finding->table = table.Key();
            findings.push_back(std::move(*finding));
        }
        if (!table.savedQuery()) continue;
        for (Finding& inner :
             uncarriedNames(*Query::restored(table.savedQuery()->record), dialect)) {
            Finding finding{inner.kind,
                            say<MessageCode::inSavedQuery>(table.Name(), std::move(inner.message))};
            finding.table = table.Key();
            findings.push_back(std::move(finding));
        }
    }
    for (const auto& join : platform::Each<ZDJoin>(query.Joins())) {
        const auto left = join->LeftColumn();
        const auto right = join->RightColumn();
        if (!left || !right) continue;
        if (auto finding = firstUncarried({left->Name(), right->Name()}, dialect)) {
            finding->join = join->Key();
            findings.push_back(std::move(*finding));
        }
    }
    for (const auto& definition : platform::Each<ZDColumnDefinition>(query.ColumnDefinitions())) {
        const auto column = static_cast<const ColumnDefinition&>(*definition).place().column();
        if (!column) continue;
        const String name = column->Name();
        const String synonym = definition->Synonym();
        if (auto finding = firstUncarried({name, orElse(synonym, name)}, dialect)) {
            finding->definition = definition->Key();
            findings.push_back(std::move(*finding));
        }
    }
    return findings;
}

} // namespace zandor::model::sql
