#pragma once

#include <Zandor/SqlReader.h>
#include <Zandor/model/Names.h>
#include <Zandor/sql/Builder.h>

#include <gtest/gtest.h>

/// Reads statements over a few tables, for tests that say what is drawn.
class Reading : public testing::Test {
protected:
    using Dialect = zandor::model::sql::Dialect;
    using String = zandor::platform::String;

    void read(zandor::platform::StringView text, Dialect dialect = Dialect::SQLite) {
        auto drawn = zandor::sql_reader::read(text, dialect, schema());
        ASSERT_TRUE(drawn) << zandor::platform::toUtf8(drawn.error());
        query = *drawn;
        record = query->record();
    }

    static std::string refusal(zandor::platform::StringView text,
                               Dialect dialect = Dialect::SQLite) {
        const auto drawn = zandor::sql_reader::read(text, dialect, schema());
        return drawn ? "drawn" : zandor::platform::toUtf8(drawn.error());
    }

    /// What an output column is: "sum(orders.total) as n", hidden ones in parentheses.
    std::string column(std::size_t number) const {
        const auto definition =
            std::static_pointer_cast<zandor::model::ColumnDefinition>(
                query->ColumnDefinitions().Item(static_cast<std::int32_t>(number)));
        std::string name = zandor::platform::toUtf8(definition->Column()->Name());
        if (!definition->Synonym().empty())
            name += " as " + zandor::platform::toUtf8(definition->Synonym());
        return definition->Visible() ? name : '(' + name + ')';
    }
    std::vector<std::string> columns() const {
        std::vector<std::string> all;
        for (std::size_t n = 1; n <= record.definitions.size(); ++n) all.push_back(column(n));
        return all;
    }

    /// "4: > 5", "5: < 2" of one output column.
    std::vector<std::string> criteria(std::size_t number) const {
        std::vector<std::string> all;
        for (const auto& each : record.definitions[number - 1].criteria)
            all.push_back(std::to_string(each.row) + ": " + zandor::platform::toUtf8(each.text));
        return all;
    }

    std::string text(Dialect dialect = Dialect::SQLite) const {
        return zandor::platform::toUtf8(
            zandor::model::sql::statementText(*query, dialect,
                                              zandor::model::sql::ValueForm::literal)
                .text);
    }

    zandor::platform::Ref<zandor::model::Query> query;
    zandor::model::QueryRecord record;

private:
    static zandor::sql_reader::Schema schema() {
        using zandor::model::ColumnType;
        using zandor::model::TableDescription;
        static const std::vector<TableDescription> tables = {
            {u"",
             u"customers",
             {{u"id", ColumnType::Integer},
              {u"name", ColumnType::Text},
              {u"city", ColumnType::Text},
              {u"active", ColumnType::Boolean},
              {u"since", ColumnType::Date}}},
            {u"",
             u"orders",
             {{u"id", ColumnType::Integer},
              {u"customer_id", ColumnType::Integer},
              {u"placed", ColumnType::Timestamp},
              {u"total", ColumnType::Decimal}}},
            {u"",
             u"Order Lines",
             {{u"order_id", ColumnType::Integer},
              {u"Quantity", ColumnType::Integer},
              {u"price", ColumnType::Decimal}}}};
        zandor::sql_reader::Schema schema;
        for (const auto& table : tables) schema.names.push_back(table.name);
        schema.table = [](zandor::platform::StringView, zandor::platform::StringView name)
            -> std::optional<TableDescription> {
            for (const auto& table : tables)
                if (zandor::model::sameName(table.name, name)) return table;
            return {};
        };
        return schema;
    }
};

using Texts = std::vector<std::string>;
