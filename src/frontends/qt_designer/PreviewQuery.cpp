#include "frontends/qt_designer/PreviewQuery.h"

#include <Zandor/model/Layout.h>

#include <algorithm>

namespace zandor::platform::qt_designer {

namespace {

using model::ColumnType;

/// Columns beside each other, as wide as the widget is in a new form, in twips.
constexpr std::int32_t canvasWidth = 9000;

const model::TableDescription descriptions[] = {
    {.name = u"customers",
     .columns = {{.name = u"customer_id", .type = ColumnType::Integer, .primaryKey = true},
                 {.name = u"name", .type = ColumnType::Text},
                 {.name = u"town", .type = ColumnType::Text}}},
    {.name = u"orders",
     .columns = {{.name = u"order_id", .type = ColumnType::Integer, .primaryKey = true},
                 {.name = u"customer_id", .type = ColumnType::Integer},
                 {.name = u"ordered_on", .type = ColumnType::Date}}},
    {.name = u"order_lines",
     .columns = {{.name = u"order_id", .type = ColumnType::Integer, .primaryKey = true},
                 {.name = u"product", .type = ColumnType::Text},
                 {.name = u"quantity", .type = ColumnType::Integer}}},
};

void place(const std::vector<Ref<model::Table>>& tables) {
    std::vector<model::layout::Size> sizes;
    for (const auto& table : tables) {
        std::size_t longest = table->Name().size();
        for (std::int32_t n = 1; n <= table->Columns().Count(); ++n)
            longest = std::max(longest, table->Columns().Item(n)->Name().size());
        sizes.push_back(
            model::layout::fittedSize(static_cast<std::size_t>(table->Columns().Count()), longest));
    }
    const auto boxes = model::layout::arrange(sizes, {{0, 1}, {1, 2}}, {}, canvasWidth);
    for (std::size_t i = 0; i < boxes.size(); ++i) {
        tables[i]->Left(static_cast<float>(boxes[i].left));
        tables[i]->Top(static_cast<float>(boxes[i].top));
        tables[i]->Width(static_cast<float>(boxes[i].width));
        tables[i]->Height(static_cast<float>(boxes[i].height));
    }
}

void join(model::Query& query, const Ref<model::Table>& left, const Ref<model::Table>& right,
          StringView column) {
    const auto join = makeRef<model::Join>();
    join->LeftColumn(left->columnNamed(column));
    join->RightColumn(right->columnNamed(column));
    query.AddJoin(join);
}

Ref<model::ColumnDefinition> output(model::Query& query, const Ref<model::Table>& table,
                                    StringView column) {
    auto definition = makeRef<model::ColumnDefinition>();
    definition->Column(table->columnNamed(column));
    query.AddColumnDefinition(definition);
    return definition;
}

} // namespace

Ref<model::Query> makePreviewQuery() {
    auto query = makeRef<model::Query>();
    std::vector<Ref<model::Table>> tables;
    for (const auto& description : descriptions) tables.push_back(query->addTable(description));
    place(tables);
    join(*query, tables[0], tables[1], u"customer_id");
    join(*query, tables[1], tables[2], u"order_id");
    output(*query, tables[0], u"name");
    output(*query, tables[1], u"ordered_on")->SortOrder(1);
    output(*query, tables[2], u"quantity")->AddCriterium(u">= 10", u"4");
    return query;
}

} // namespace zandor::platform::qt_designer
