#pragma once

#include "model/Library.h"

#include <utility>

/// A query with two tables of two columns, and short ways to what the tests need of it.
struct SmallQuery {
    using TableRef = platform::Ref<model::Table>;

    model::Library library;
    platform::Ref<model::Query> query = platform::makeRef<model::Query>();
    TableRef orders = query->addTable(described(u"orders"));
    TableRef customers = query->addTable(described(u"customers"));

    static model::TableDescription described(platform::String name) {
        return {u"",
                std::move(name),
                {{u"id", model::ColumnType::Integer, u"INTEGER", true},
                 {u"name", model::ColumnType::Text, u"TEXT", false}}};
    }

    static platform::Ref<model::Column> id(const TableRef& table) {
        return table->columnNamed(u"id");
    }

    /// A filled join that stands in no query yet, made as the control makes it.
    platform::Ref<TalvikZandorLib::ZDJoin> newJoin(const TableRef& left, const TableRef& right) {
        auto join = library.NewZDJoin();
        join->LeftTable(left);
        join->LeftColumn(id(left));
        join->RightTable(right);
        join->RightColumn(id(right));
        join->JoinType(0);
        join->CompareOperator(0);
        return join;
    }

    platform::Ref<TalvikZandorLib::ZDColumnDefinition> newDefinition(const TableRef& table) {
        auto definition = library.NewZDColumnDefinition();
        definition->Column(id(table));
        return definition;
    }
};
