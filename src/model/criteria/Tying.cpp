#include "model/criteria/Tying.h"

#include <Zandor/model/Functions.h>

#include <Zandor/model/Table.h>

namespace zandor::model::criteria {

namespace {

TiedText followed(TiedText tied) {
    auto& [text, references] = tied;
    // From behind, so that the places before stay where they are.
    for (std::size_t i = references.size(); i-- > 0;) {
        Reference& reference = references[i];
        const Ref<Table> table = reference.column.table().table();
        if (!reference.namesTable() || !table) continue;
        const std::size_t length = reference.tableEnd - reference.begin;
        const StringView now = StringView(text).substr(reference.begin, length);
        // In brackets where it had some.
        const String name =
            now.front() == u'[' ? inBrackets(table->Name()) : writtenName(table->Name());
        if (now == name) continue;
        text.replace(reference.begin, length, name);
        reference.tableEnd = reference.begin + name.size();
        for (std::size_t behind = i + 1; behind < references.size(); ++behind) {
            references[behind].begin += name.size() - length;
            references[behind].tableEnd += name.size() - length;
        }
    }
    return tied;
}

} // namespace

void tie(ColumnDefinition& definition, const Resolver& resolver) {
    const Output output = outputOf(definition, resolver);
    if (definition.isExpression())
        definition.tie({definition.expression().text, output.reading.references});
    if (!output.subject.node) return;
    for (const auto& [row, criterium] : definition.criteria().rows()) {
        const TiedText& tied = criterium->tied();
        criterium->tie(
            {tied.text, read(tied.text, output.subject, resolver, tied.references).references});
    }
}

void followNames(ColumnDefinition& definition) {
    if (definition.isExpression()) definition.tie(followed(definition.expression()));
    for (const auto& [row, criterium] : definition.criteria().rows())
        criterium->tie(followed(criterium->tied()));
}

} // namespace zandor::model::criteria
