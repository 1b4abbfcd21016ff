#pragma once

#include "calls.h"

#include <model.h>

#include <initializer_list>

/// A table as a database would describe it, with its first column as the primary key; so many
/// twips from the left it stands.
inline ComPtr<_ZDTable> addTable(_ZDQuery* query, const wchar_t* name,
                                 std::initializer_list<const wchar_t*> columns, long left) {
    const auto description = create<_ZDTableDescription>(L"TalvikZandorLib.ZDTableDescription");
    check(description->put_Name(Text(name)), "Naming a table");
    VARIANT missing{};
    missing.vt = VT_ERROR;
    missing.scode = DISP_E_PARAMNOTFOUND;
    VARIANT_BOOL key = VARIANT_TRUE;
    for (const wchar_t* const column : columns) {
        check(description->AddColumn(Text(column), zdInteger, key, missing), "Adding a column");
        key = VARIANT_FALSE;
    }
    ComPtr<IDispatch> table;
    check(query->AddTable(description.Get(), &table), "Adding a table");
    const auto made = as<_ZDTable>(table.Get());
    check(made->put_Left(left), "Placing a table");
    check(made->put_Top(300), "Placing a table");
    check(made->put_Width(2100), "Placing a table");
    check(made->put_Height(1800), "Placing a table");
    return made;
}

/// Numbers begin at 1, which is the entry "*".
inline ComPtr<IDispatch> columnOf(_ZDTable* table, long number) {
    ComPtr<IDispatch> columns;
    check(table->get_Columns(&columns), "Asking for columns");
    VARIANT index{};
    index.vt = VT_I4;
    index.lVal = number;
    ComPtr<IDispatch> column;
    check(as<_ZDCollection>(columns.Get())->Item(index, &column), "Asking for a column");
    return column;
}

/// Customers and their orders, joined.
inline ComPtr<_ZDQuery> makeQuery() {
    const auto query = create<_ZDQuery>(L"TalvikZandorLib.Zandor");
    const auto customers = addTable(query.Get(), L"customers", {L"id", L"name", L"city"}, 300);
    const auto orders = addTable(query.Get(), L"orders", {L"id", L"customer_id", L"total"}, 4200);
    const auto join = create<_ZDJoin>(L"TalvikZandorLib.ZDJoin");
    check(join->putref_LeftColumn(columnOf(orders.Get(), 3).Get()), "Joining");
    check(join->putref_RightColumn(columnOf(customers.Get(), 2).Get()), "Joining");
    ComPtr<IDispatch> stored;
    check(query->AddJoin(join.Get(), &stored), "Joining");
    const auto output = create<_ZDColumnDefinition>(L"TalvikZandorLib.ZDColumnDefinition");
    check(output->putref_Column(columnOf(customers.Get(), 3).Get()), "Choosing a column");
    check(query->AddColumnDefinition(output.Get(), &stored), "Choosing a column");
    return query;
}
