#include "model/criteria/Tying.h"

#include <Zandor/model/Table.h>

namespace zandor::model::criteria {

namespace {

/// A table's name as a criterion writes it, in brackets where it had some or needs them.
String written(StringView name, bool bracketed) {
    if (!bracketed && isBareName(name)) return String(name);
    String out = u"[";
    for (const char16_t c : name) {
        out += c;
        if (c == u']') out += c;
    }
    return out + u']';
}

void followNames(RowCriterium& criterium) {
    String text = criterium.Criterium();
    References references = criterium.references();
    // From behind, so that the places before stay where they are.
    for (std::size_t i = references.size(); i-- > 0;) {
        Reference& reference = references[i];
        const Ref<Table> table = reference.column.table().table();
        if (!reference.namesTable() || !table) continue;
        const std::size_t length = reference.tableEnd - reference.begin;
        const StringView now = StringView(text).substr(reference.begin, length);
        const String name = written(table->Name(), now.front() == u'[');
        if (now == name) continue;
        text.replace(reference.begin, length, name);
        reference.tableEnd = reference.begin + name.size();
        for (std::size_t behind = i + 1; behind < references.size(); ++behind) {
            references[behind].begin += name.size() - length;
            references[behind].tableEnd += name.size() - length;
        }
    }
    criterium.tie(std::move(text), std::move(references));
}

} // namespace

void tie(const ColumnDefinition& definition, const Resolver& resolver) {
    const Ref<Column> column = definition.place().column();
    if (!column) return;
    const sql::ColumnRef subject = columnRef(*column, *definition.place().table().table());
    for (const auto& [row, criterium] : definition.criteria().rows()) {
        const String text = criterium->Criterium();
        criterium->tie(text, read(text, subject, resolver, criterium->references()).references);
    }
}

void followNames(const ColumnDefinition& definition) {
    for (const auto& [row, criterium] : definition.criteria().rows()) followNames(*criterium);
}

} // namespace zandor::model::criteria
