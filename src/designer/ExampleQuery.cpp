#include "designer/ExampleQuery.h"

#include <Zandor/model/Layout.h>

namespace zandor::designer {

namespace {

struct ExampleColumn {
    platform::StringView table;
    platform::StringView column;
    platform::StringView synonym = {};
    std::int16_t sortOrder = 0;
    bool visible = true;
    std::vector<platform::StringView> criteria = {}; ///< the rows "Criteria:" and "Or:"
};

constexpr std::int16_t ascending = 1;

const ExampleColumn columns[] = {
    {.table = u"customers",
     .column = u"country_code",
     .synonym = u"country",
     .criteria = {u"= 'DE'", u"= 'AT'"}},
    {.table = u"orders", .column = u"ordered_at", .sortOrder = ascending},
    {.table = u"order_lines", .column = u"quantity", .criteria = {u">= 10", u">= 20"}},
    {.table = u"order_lines", .column = u"unit_price"},
    {.table = u"products",
     .column = u"is_discontinued",
     .visible = false,
     .criteria = {u"= 0", u"= 0"}},
};

} // namespace

QStringList exampleTables() {
    return {QStringLiteral("customers"), QStringLiteral("orders"), QStringLiteral("order_lines"),
            QStringLiteral("products"), QStringLiteral("categories")};
}

void placeInARow(const std::vector<platform::Ref<model::Table>>& tables) {
    float left = model::layout::margin;
    for (const auto& table : tables) {
        table->Left(left);
        table->Top(model::layout::margin);
        left += static_cast<float>(table->Width() + model::layout::betweenColumns);
    }
}

void addExampleColumns(model::Query& query) {
    for (const ExampleColumn& example : columns) {
        const auto table = query.tableNamed(example.table);
        const auto column = table ? table->columnNamed(example.column) : nullptr;
        if (!column) continue;
        const auto definition = platform::makeRef<model::ColumnDefinition>();
        definition->Column(column);
        definition->Synonym(platform::String(example.synonym));
        definition->SortOrder(example.sortOrder);
        definition->Visible(example.visible);
        std::int32_t row = model::Criteria::firstRow;
        for (const platform::StringView criterium : example.criteria)
            definition->AddCriterium(platform::String(criterium), platform::decimal(row++));
        query.AddColumnDefinition(definition);
    }
}

} // namespace zandor::designer
