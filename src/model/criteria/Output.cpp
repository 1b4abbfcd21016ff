#include "model/criteria/Output.h"

#include <Zandor/model/Table.h>

namespace zandor::model::criteria {

Output outputOf(const ColumnDefinition& definition, const Resolver& resolver) {
    Output output;
    bool rows = false;
    if (definition.isExpression()) {
        const TiedText& expression = definition.expression();
        output.reading = readExpression(expression.text, resolver, expression.references);
        output.value = output.reading.value;
    } else if (const auto column = definition.place().column()) {
        const auto table = definition.place().table().table();
        rows = table->isAllColumns(*column) && definition.total() == Total::Count;
        if (!table->isAllColumns(*column)) output.value = sql::make(columnRef(*column, *table));
    }
    if (!output.value && !rows) return output;
    sql::Node subject = output.value;
    if (aggregates(definition.total()))
        subject = sql::make(
            sql::Aggregate{definition.total(), output.value,
                           typeOf(definition.total(),
                                  output.value ? typeOf(*output.value) : ColumnType::Unknown)});
    output.subject = Subject(std::move(subject), definition.Column()->Name());
    return output;
}

} // namespace zandor::model::criteria
