#pragma once

#include <Zandor/Library.h>

#include <utility>

/// A query with two tables of two columns, and short ways to what the tests need of it.
struct SmallQuery {
    using TableRef = zandor::platform::Ref<zandor::model::Table>;

    zandor::model::Library library;
    zandor::platform::Ref<zandor::model::Query> query =
        zandor::platform::makeRef<zandor::model::Query>();
    TableRef orders = query->addTable(described(u"orders"));
    TableRef customers = query->addTable(described(u"customers"));

    static zandor::model::TableDescription described(zandor::platform::String name) {
        return {u"",
                std::move(name),
                {{u"id", zandor::model::ColumnType::Integer, u"INTEGER", true},
                 {u"name", zandor::model::ColumnType::Text, u"TEXT", false}}};
    }

    static zandor::platform::Ref<zandor::model::Column> id(const TableRef& table) {
        return table->columnNamed(u"id");
    }

    /// A filled join that stands in no query yet, made as the control makes it.
    zandor::platform::Ref<TalvikZandorLib::ZDJoin> newJoin(const TableRef& left,
                                                           const TableRef& right) {
        auto join = library.NewZDJoin();
        join->LeftTable(left);
        join->LeftColumn(id(left));
        join->RightTable(right);
        join->RightColumn(id(right));
        join->JoinType(0);
        join->CompareOperator(0);
        return join;
    }

    zandor::platform::Ref<TalvikZandorLib::ZDColumnDefinition>
    newDefinition(const TableRef& table) {
        auto definition = library.NewZDColumnDefinition();
        definition->Column(id(table));
        return definition;
    }
};
